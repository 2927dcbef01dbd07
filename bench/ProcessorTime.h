// SPDX-License-Identifier: MIT
#pragma once

#include <ctime>

/** Processor time, which other programs on the machine disturb less than the clock on the wall. */
namespace ProcessorTime {

template <class Work>
double seconds(Work work)
{
    const std::clock_t start = std::clock();
    work();
    return static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC;
}

} // namespace ProcessorTime
