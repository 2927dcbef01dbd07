// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <string_view>

class ZtCsvReader;

/** Finds out how a table is written. */
class ZT_MEASURING_EXPORT ZtTableDialect
{
public:
    /**
     * The separator - comma, semicolon or tab - that cuts the first rows into as many fields as the header
     * has most consistently. \a decimalComma says that commas are known to be decimal marks, so the others
     * come first. Among equals the comma loses, as it may as well be a decimal mark.
     */
    static char findSeparator(std::string_view text, bool decimalComma);

    /** Whether numbers are written with a decimal comma; where commas separate the fields, they are not. */
    static bool hasDecimalComma(ZtCsvReader *reader);
};
