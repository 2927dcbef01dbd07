// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

/** How large a pixel is by the file that holds the picture. */
struct ZtOfferedPixelSize
{
    double x = 0.0; ///< micrometres; 0 when unknown
    double y = 0.0; ///< micrometres; 0 when unknown
    QString origin; ///< who says so, a name that is not translated: "OME", "ImageJ", "TIFF", "PNG"

    bool isKnown() const { return x > 0.0 && y > 0.0; }
};
