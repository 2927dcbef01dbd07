// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <string>
#include <string_view>

/** What a field of a table holds. */
struct ZT_MEASURING_EXPORT ZtTableNumber
{
    enum Kind {
        Missing, ///< empty, or a word or sign that stands for "no value"
        Number,
        Infinite, ///< a number, but not a finite one
        Text
    };

    Kind kind = Missing;
    double value = 0.0; ///< of a Number

    /**
     * Reads a field. Numbers are written in ASCII digits with an optional sign and exponent, without group
     * separators. \param decimalComma the decimal mark is a comma; otherwise it is a point
     */
    static ZtTableNumber read(std::string_view field, bool decimalComma);

    /** The field of a Number as written, with a decimal point; where that is another text, in \a buffer. */
    static std::string_view textOf(std::string_view field, bool decimalComma, std::string *buffer);

    /** \a text without blanks at its ends. */
    static std::string_view trimmed(std::string_view text);
};
