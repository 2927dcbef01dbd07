// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"
#include "measuring/ZtOfferedPixelSize.h"

/** Finds pixel sizes in what picture files say about themselves. All results are unknown where nothing is
 * said that can be used. */
class ZT_MEASURING_EXPORT ZtPixelSizeReader
{
public:
    /** Resolutions that programs write without meaning them are no pixel sizes: 72, 96, 120, 144 and 192 dots
     *  per inch in both directions. */
    static ZtOfferedPixelSize fromResolution(double dotsPerMetreX, double dotsPerMetreY,
                                             const QString &origin);

    /** Whether an image description is OME-XML. */
    static bool isOme(const QString &description);
    /** PhysicalSizeX and PhysicalSizeY of the first picture; micrometres where no unit is stated, and a
     * missing direction is like the other one. */
    static ZtOfferedPixelSize fromOme(const QString &description);
    /** SignificantBits of the first picture in OME-XML; 0 when it is not stated. */
    static int significantBitsOfOme(const QString &description);

    /** Whether an image description was written by ImageJ or a relative. */
    static bool isImageJ(const QString &description);
    /** ImageJ's resolutions are pixels per unit, which its description names. */
    static ZtOfferedPixelSize fromImageJ(const QString &description, double pixelsPerUnitX,
                                         double pixelsPerUnitY);

    /** How long a unit of length is, in micrometres; 0 for a text that is none, such as "pixel". Knows the
     *  spellings of OME and of ImageJ, such as "\u00B5m" written out, "micron" and "inch". */
    static double micrometresOf(const QString &unit);
};
