// SPDX-License-Identifier: MIT
#include "charts/KvLineGeometry.h"

#include "charts/KvAxisGeometry.h"

#include <cmath>

namespace kvCharts::KvLineGeometry {

namespace {

constexpr double kLow = -50.0;
constexpr double kHigh = KvAxisGeometry::PlotSize + 50.0;

bool isFinite(const QPointF &point)
{
    return std::isfinite(point.x()) && std::isfinite(point.y());
}

QPointF clampedEnd(double x, double slope, double intercept)
{
    const double y = slope * x + intercept;
    if (y < kLow)
        return QPointF((kLow - intercept) / slope, kLow);
    if (y > kHigh)
        return QPointF((kHigh - intercept) / slope, kHigh);
    return QPointF(x, y);
}

bool endsLine(const QPointF &point)
{
    return point.isNull() || !isFinite(point);
}

} // namespace

QPointF Scale::toScene(int categoryIndex, double value) const
{
    return QPointF(categoryIndex * step + offset, yToScene(value));
}

double Scale::yToScene(double value) const
{
    return KvAxisGeometry::PlotSize - KvAxisGeometry::valueToScene(value, minimum, maximum);
}

Scale scale(int categoryCount, double minimum, double maximum)
{
    const double step = KvAxisGeometry::PlotSize / categoryCount;
    const double offset = 2 * KvAxisGeometry::PlotSize / categoryCount * 0.25;
    return {offset, step, minimum, maximum};
}

// The point at the origin is the start value of "no point yet", so that no line leaves it; kept, although a
// line does reach it.
QVector<QVector<QPointF>> joinedRuns(const QVector<QPointF> &points)
{
    QVector<QVector<QPointF>> runs;
    int start = 0;
    for (int i = 0; i < points.size(); ++i) {
        if (!endsLine(points.at(i)))
            continue;
        const int end = isFinite(points.at(i)) ? i + 1 : i;
        if (end - start > 1)
            runs.append(points.mid(start, end - start));
        start = i + 1;
    }
    if (points.size() - start > 1)
        runs.append(points.mid(start));
    return runs;
}

std::optional<QLineF> trendLine(double slope, double intercept)
{
    const QPointF left = clampedEnd(kLow, slope, intercept);
    const QPointF right = clampedEnd(kHigh, slope, intercept);
    if (!isFinite(left) || !isFinite(right))
        return std::nullopt;
    return QLineF(left, right);
}

} // namespace kvCharts::KvLineGeometry
