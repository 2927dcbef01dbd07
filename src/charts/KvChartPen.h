// SPDX-License-Identifier: MIT
#pragma once

#include <QPen>

/** The pens of charts, whose width is in device pixels at any scale. */
namespace kvCharts::KvChartPen {

inline QPen make(const QColor &color, qreal width = 1.0)
{
    QPen pen(color, width);
    pen.setCosmetic(true);
    return pen;
}

} // namespace kvCharts::KvChartPen
