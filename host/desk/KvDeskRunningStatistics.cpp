// SPDX-License-Identifier: MIT
#include "KvDeskRunningStatistics.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace {

constexpr double none = std::numeric_limits<double>::quiet_NaN();

} // namespace

void KvDeskRunningStatistics::add(double number)
{
    if (!std::isfinite(number)) {
        ++m_leftOut;
        return;
    }
    ++m_count;
    const double distance = number - m_mean;
    m_mean += distance / m_count;
    m_squares += distance * (number - m_mean);
    m_minimum = m_count == 1 ? number : std::min(m_minimum, number);
    m_maximum = m_count == 1 ? number : std::max(m_maximum, number);
}

void KvDeskRunningStatistics::add(const KvDeskRunningStatistics &other)
{
    m_leftOut += other.m_leftOut;
    if (other.m_count == 0)
        return;
    if (m_count == 0) {
        const int leftOut = m_leftOut;
        *this = other;
        m_leftOut = leftOut;
        return;
    }
    const double count = static_cast<double>(m_count) + other.m_count;
    const double distance = other.m_mean - m_mean;
    m_squares += other.m_squares + distance * distance * m_count * (other.m_count / count);
    m_mean += distance * (other.m_count / count);
    m_count += other.m_count;
    m_minimum = std::min(m_minimum, other.m_minimum);
    m_maximum = std::max(m_maximum, other.m_maximum);
}

double KvDeskRunningStatistics::mean() const
{
    return m_count > 0 ? m_mean : none;
}

double KvDeskRunningStatistics::minimum() const
{
    return m_count > 0 ? m_minimum : none;
}

double KvDeskRunningStatistics::maximum() const
{
    return m_count > 0 ? m_maximum : none;
}

double KvDeskRunningStatistics::standardDeviation() const
{
    return m_count > 1 ? std::sqrt(m_squares / m_count) : none;
}
