// SPDX-License-Identifier: MIT
#pragma once

namespace kvCharts {

/** Limits of a value axis, and how many ticks stand between them, both ends included. */
struct KvAxisRange
{
    double minimum = 0.0;
    double maximum = 10.0;
    int tickCount = 11;

    /**
     * A rounded range for values from \a least to \a greatest: ticks at multiples of a nice step, 5 to 14 of
     * them. Spans below 4 hold no such step and get the raw limits with 5 ticks; a span of none is widened by
     * a tenth of the value to both sides (so that the limits of a negative value come out swapped).
     */
    static KvAxisRange around(double least, double greatest);
};

} // namespace kvCharts
