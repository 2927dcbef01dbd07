// SPDX-License-Identifier: MIT
#pragma once

#include <ctime>

/** Processor time of the calling thread alone. */
namespace ThreadTime {

inline double seconds()
{
    timespec time{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
    return static_cast<double>(time.tv_sec) + 1e-9 * static_cast<double>(time.tv_nsec);
}

} // namespace ThreadTime
