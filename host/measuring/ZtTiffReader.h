// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QtGlobal>

class QByteArray;
class QIODevice;
struct ZtFault;
struct ZtPicture;

/**
 * Reads the first picture of a TIFF file with the pixel size that it states.
 *
 * Grey pictures of sixteen bits are stretched by their significant bits: those that the file states, else
 * those that its values use. A header is believed only as far as the length of the file bears it out.
 */
class ZT_MEASURING_EXPORT ZtTiffReader
{
public:
    static constexpr int headerSize = 4;

    /** Whether a file that begins like this is a TIFF, of any size and byte order. */
    static bool isTiff(const QByteArray &header);

    /**
     * \param device open and not sequential
     * \return false with the message of the fault set when the picture cannot be used
     */
    static bool read(QIODevice *device, qint64 pixelLimit, ZtPicture *picture, ZtFault *fault);
};
