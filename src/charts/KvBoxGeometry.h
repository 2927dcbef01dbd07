// SPDX-License-Identifier: MIT
#pragma once

#include <QLineF>
#include <QRectF>
#include <QVector>

#include <array>

/** Where the lines and labels of a horizontal box lie. */
namespace kvCharts::KvBoxGeometry {

/** Scene x of minimum, lower box value, median, upper box value, maximum. */
using Positions = std::array<double, 5>;

/** Scene y of a box. */
struct Extent
{
    double top;
    double bottom;
};

/** The middle halves of \a count bands, from the top. */
QVector<Extent> extents(int count);

QRectF boxRect(const Positions &x, const Extent &extent);
/** The marks at minimum, median and maximum, then the two whiskers. */
QVector<QLineF> lines(const Positions &x, const Extent &extent);

/** Top-left corner of a label: centred below the box. */
QPointF labelPosition(double x, const Extent &extent, double labelWidth);
/** Where a leader line to a label starts at the box. */
QPointF labelAnchor(double x, const Extent &extent);
/** The line that ties a label that was moved to its place at the box. */
QLineF leaderLine(const QRectF &label, const QPointF &anchor);

/**
 * Moves labels that come too close to the one before to the right, then all back by half of what the last
 * moved one went. Returns whether any was moved, which calls for leader lines.
 */
bool spreadLabels(QVector<QRectF> &labels);

} // namespace kvCharts::KvBoxGeometry
