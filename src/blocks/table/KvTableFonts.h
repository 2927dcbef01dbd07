// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvReportFont.h"

/** The fonts of report tables. */
namespace KvTableFonts {

inline QFont body()
{
    return KvReportFont::make(KvReportFont::BodyPixelSize);
}

inline QFont header()
{
    return KvReportFont::make(KvReportFont::BodyPixelSize, QFont::DemiBold);
}

} // namespace KvTableFonts
