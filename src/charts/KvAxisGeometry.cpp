// SPDX-License-Identifier: MIT
#include "charts/KvAxisGeometry.h"

namespace kvCharts::KvAxisGeometry {

namespace {

constexpr double kTickLength = 5.0;
constexpr double kValueLabelGap = 2.0; // between tick and label of a y axis

// Of a line that leaves the axis at a right angle: from and to count from the axis into the plot.
QLineF crossLine(Qt::Orientation orientation, double offset, double from, double to)
{
    if (orientation == Qt::Horizontal)
        return QLineF(offset, PlotSize - to, offset, PlotSize - from);
    return QLineF(from, PlotSize - offset, to, PlotSize - offset);
}

} // namespace

QVector<Tick> valueTicks(double min, double max, int count)
{
    QVector<Tick> ticks;
    const int intervals = count - 1;
    Tick tick{0.0, min};
    for (int i = 0; i < count; ++i) {
        ticks.append(tick);
        if (intervals > 0) {
            tick.offset += PlotSize / intervals;
            tick.value += (max - min) / intervals;
        }
    }
    return ticks;
}

QVector<double> bandEdges(Qt::Orientation orientation, int count)
{
    QVector<double> edges;
    if (count < 1)
        return edges;
    edges.reserve(count);
    const double band = PlotSize / count;
    double edge = 0.0;
    for (int i = 0; i < count; ++i) {
        edge = orientation == Qt::Horizontal ? edge + band : (i + 1) * band;
        edges.append(edge);
    }
    return edges;
}

QLineF axisLine(Qt::Orientation orientation)
{
    return orientation == Qt::Horizontal ? QLineF(0.0, PlotSize, PlotSize, PlotSize)
                                         : QLineF(0.0, PlotSize, 0.0, 0.0);
}

QLineF tickMark(Qt::Orientation orientation, double offset)
{
    return crossLine(orientation, offset, -kTickLength, 0.0);
}

QLineF gridLine(Qt::Orientation orientation, double offset)
{
    return crossLine(orientation, offset, 1.0, PlotSize);
}

QPointF valueLabel(Qt::Orientation orientation, double offset, const QSizeF &size)
{
    if (orientation == Qt::Horizontal)
        return QPointF(offset - size.width() / 2, PlotSize + kTickLength);
    return QPointF(-kTickLength - size.width() - kValueLabelGap, PlotSize - offset - size.height() / 2);
}

QPointF categoryLabel(Qt::Orientation orientation, double bandStart, double bandEnd, const QSizeF &size)
{
    if (orientation == Qt::Horizontal)
        return QPointF((bandStart + bandEnd) / 2 - size.width() / 2, PlotSize + kTickLength);
    return QPointF(-kTickLength - size.width(), (bandStart + bandEnd - size.height()) / 2);
}

} // namespace kvCharts::KvAxisGeometry
