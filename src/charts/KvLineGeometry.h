// SPDX-License-Identifier: MIT
#pragma once

#include <QLineF>
#include <QVector>

#include <optional>

/** Where the points and lines of a series lie. */
namespace kvCharts::KvLineGeometry {

/** How category indexes and values become scene coordinates. */
struct Scale
{
    double offset; ///< scene x of category 0
    double step;   ///< between categories
    double minimum;
    double maximum;

    QPointF toScene(int categoryIndex, double value) const;
    double yToScene(double value) const;
};

/** Scale for \a categoryCount categories: each stands in the middle of its band. */
Scale scale(int categoryCount, double minimum, double maximum);

/**
 * The lines between the points, as runs of points that are joined. A line ends at a point that lies exactly
 * at (0, 0), and at one that is not finite, which is in no run.
 */
QVector<QVector<QPointF>> joinedRuns(const QVector<QPointF> &points);

/**
 * The line y = slope * x + intercept from 50 units left of the plot to 50 right of it, cut where it leaves
 * the band of 50 units above to 50 below. None when it has no finite ends.
 */
std::optional<QLineF> trendLine(double slope, double intercept);

} // namespace kvCharts::KvLineGeometry
