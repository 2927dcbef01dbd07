// SPDX-License-Identifier: MIT
#include "charts/KvLineSerie.h"

namespace kvCharts {

KvLineSerie::KvLineSerie(const QString &name, const QColor &color)
    : m_name(name)
    , m_color(color)
{}

void KvLineSerie::addPoint(const QString &category, double value)
{
    m_points.append({category, value});
}

void KvLineSerie::setLimits(double lower, double upper)
{
    m_lowerLimit = lower;
    m_upperLimit = upper;
}

} // namespace kvCharts
