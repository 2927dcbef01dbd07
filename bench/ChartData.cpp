// SPDX-License-Identifier: MIT
#include "ChartData.h"

#include "charts/KvSeriesPalette.h"
#include "data/KvStatisticsEngine.h"

#include <algorithm>
#include <cmath>

namespace {

double valueAt(int series, int index)
{
    return 50 + 15 * series + 20 * std::sin(index * 12.9898 + series) * std::cos(index * 0.37);
}

kvCharts::KvAxisRange rangeOf(const QVector<QVector<QPointF>> &series)
{
    double least = series.first().first().y();
    double greatest = least;
    for (const QVector<QPointF> &points : series) {
        for (const QPointF &point : points) {
            least = std::min(least, point.y());
            greatest = std::max(greatest, point.y());
        }
    }
    return kvCharts::KvAxisRange::around(least, greatest);
}

} // namespace

ChartData::ChartData(int pointCount, int categoryCount)
    : m_points(SeriesCount)
{
    for (int i = 0; i < categoryCount; ++i)
        m_categories.append(QString::number(i));
    for (int s = 0; s < SeriesCount; ++s) {
        for (int i = 0; i < pointCount / SeriesCount; ++i)
            m_points[s].append(QPointF(i % categoryCount, valueAt(s, i)));
    }
    m_range = rangeOf(m_points);
}

QString ChartData::seriesName(int series)
{
    return QStringLiteral("Series %1").arg(series);
}

QColor ChartData::seriesColor(int series)
{
    return kvCharts::seriesColor(series);
}

QFont ChartData::font(int pixelSize)
{
    QFont font(QStringLiteral("Segoe UI"));
    font.setPixelSize(pixelSize);
    return font;
}

QPointF ChartData::toScene(const QPointF &point) const
{
    return QPointF((point.x() + 0.5) * PlotSide / m_categories.size(),
                   PlotSide - (point.y() - m_range.minimum) * PlotSide / (m_range.maximum - m_range.minimum));
}

QVector<double> ChartData::valueTicks() const
{
    QVector<double> ticks;
    for (int i = 0; i < m_range.tickCount; ++i)
        ticks.append(m_range.minimum + i * (m_range.maximum - m_range.minimum) / (m_range.tickCount - 1));
    return ticks;
}

QLineF ChartData::regressionLine(int series) const
{
    const QPair<double, double> line = KvStatisticsEngine::regression(m_points.at(series));
    const double beyond = m_categories.size() / 20.0;
    const double left = -0.5 - beyond;
    const double right = m_categories.size() - 0.5 + beyond;
    return QLineF(left, line.first * left + line.second, right, line.first * right + line.second);
}
