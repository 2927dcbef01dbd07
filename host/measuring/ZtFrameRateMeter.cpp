// SPDX-License-Identifier: MIT
#include "measuring/ZtFrameRateMeter.h"

#include <algorithm>

namespace {

constexpr qint64 window = 1000; ///< milliseconds

} // namespace

void ZtFrameRateMeter::addFrame(qint64 time)
{
    m_times.erase(m_times.begin(), std::lower_bound(m_times.begin(), m_times.end(), time - window));
    m_times.append(time);
}

double ZtFrameRateMeter::rate(qint64 time) const
{
    const auto first = std::lower_bound(m_times.begin(), m_times.end(), time - window);
    const auto frames = m_times.end() - first;
    if (frames < 2 || m_times.last() == *first)
        return 0.0;
    return 1000.0 * static_cast<double>(frames - 1) / static_cast<double>(m_times.last() - *first);
}
