// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

/** How charts write numbers. */
namespace kvCharts::KvChartNumber {

/** Six significant digits, with an exponent from a million on. */
inline QString text(double value)
{
    return QString::number(value, 'g', 6);
}

} // namespace kvCharts::KvChartNumber
