// SPDX-License-Identifier: MIT
#include "charts/KvAxisRange.h"

#include "data/KvStatisticsEngine.h"

#include <cmath>

namespace kvCharts {

namespace {

constexpr int kFallbackTickCount = 5;

KvAxisRange unrounded(double least, double greatest)
{
    if (least != greatest)
        return {least, greatest, kFallbackTickCount};
    if (least == 0.0)
        return {-1.0, 1.0, kFallbackTickCount};
    return {least * 0.9, greatest * 1.1, kFallbackTickCount};
}

} // namespace

KvAxisRange KvAxisRange::around(double least, double greatest)
{
    const double span = greatest - least;
    const int step = KvStatisticsEngine::niceStep(span / 12.0, span * 0.25);
    if (step == 0)
        return unrounded(least, greatest);
    const double start = std::floor(least / step) * step;
    const int count = static_cast<int>(std::ceil((greatest - start) / step));
    return {start, start + static_cast<double>(count) * step, count + 1};
}

} // namespace kvCharts
