// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

class QImage;

/**
 * Shows grey pictures of more than eight bits.
 *
 * Cameras of ten or twelve bits store their values in sixteen; shown by their upper eight they would be
 * nearly black. So the values are stretched by the bits that they use. Lengths and areas do not depend on it;
 * who needs the values themselves has to go back to the file.
 */
class ZT_MEASURING_EXPORT ZtDeepGrey
{
public:
    /** The bits that the largest value of a picture of Format_Grayscale16 takes: 8..16. */
    static int significantBits(const QImage &deep);

    /** The picture in Format_Grayscale8: 2^bits - 1 and all above become white. */
    static QImage toEightBits(const QImage &deep, int bits);
};
