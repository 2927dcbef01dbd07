// SPDX-License-Identifier: MIT
#pragma once

#include <QLineF>
#include <QSizeF>
#include <QVector>
#include <Qt>

/**
 * Where the lines and labels of axes lie in the plot square: 0 to 1000 in x and y, y downwards, the x axis
 * along y = 1000 and the y axis along x = 0. An offset counts along an axis from the origin: to the right, or
 * upwards.
 */
namespace kvCharts::KvAxisGeometry {

/** Side of the plot square, in scene units. */
constexpr double PlotSize = 1000.0;

/** Scene coordinate of \a value on an axis from \a min to \a max. Equal limits divide by zero. */
inline double valueToScene(double value, double min, double max)
{
    return (value - min) * PlotSize / (max - min);
}

struct Tick
{
    double offset;
    double value;
};

/** The ticks of a value axis; offset and value are summed up, so that rounding errors add up in both. */
QVector<Tick> valueTicks(double min, double max, int count);

/** The far edges of the bands of a category axis, as offsets. */
QVector<double> bandEdges(Qt::Orientation orientation, int count);

QLineF axisLine(Qt::Orientation orientation);
QLineF tickMark(Qt::Orientation orientation, double offset);
/** The grid line at an offset; it leaves out the axis that it starts from. */
QLineF gridLine(Qt::Orientation orientation, double offset);
/** Whether a value axis has a grid line at its first tick: along x the y axis stands there. */
constexpr bool hasGridAtOrigin(Qt::Orientation orientation)
{
    return orientation == Qt::Vertical;
}

/** Top-left corner of a value's label: centred under its tick, or left of it. */
QPointF valueLabel(Qt::Orientation orientation, double offset, const QSizeF &size);
/** Top-left corner of a category's label: centred on its band. Along y the bands count from the top. */
QPointF categoryLabel(Qt::Orientation orientation, double bandStart, double bandEnd, const QSizeF &size);

} // namespace kvCharts::KvAxisGeometry
