// SPDX-License-Identifier: MIT
#include "charts/KvBoxGeometry.h"

#include "charts/KvAxisGeometry.h"

namespace kvCharts::KvBoxGeometry {

namespace {

constexpr double kLabelDistance = 11.0;
constexpr double kAnchorDistance = 3.0;
constexpr double kLeaderGap = 2.0; // between leader line and label
constexpr double kLabelGap = 6.0;  // between neighbouring labels

} // namespace

QVector<Extent> extents(int count)
{
    QVector<Extent> result;
    const double band = KvAxisGeometry::PlotSize / count;
    Extent extent{band * 0.25, 3 * KvAxisGeometry::PlotSize / count * 0.25};
    for (int i = 0; i < count; ++i) {
        result.append(extent);
        extent.top += band;
        extent.bottom += band;
    }
    return result;
}

QRectF boxRect(const Positions &x, const Extent &extent)
{
    return QRectF(QPointF(x[1], extent.top), QPointF(x[3], extent.bottom));
}

QVector<QLineF> lines(const Positions &x, const Extent &extent)
{
    QVector<QLineF> result;
    for (const double markX : {x[0], x[2], x[4]})
        result.append(QLineF(markX, extent.top, markX, extent.bottom));
    const double middle = (extent.top + extent.bottom) / 2;
    result.append(QLineF(x[0], middle, x[1], middle));
    result.append(QLineF(x[3], middle, x[4], middle));
    return result;
}

QPointF labelPosition(double x, const Extent &extent, double labelWidth)
{
    return QPointF(x - labelWidth / 2, extent.bottom + kLabelDistance);
}

QPointF labelAnchor(double x, const Extent &extent)
{
    return QPointF(x, extent.bottom + kAnchorDistance);
}

QLineF leaderLine(const QRectF &label, const QPointF &anchor)
{
    return QLineF(QPointF(label.left() + label.width() / 2, label.top() - kLeaderGap), anchor);
}

bool spreadLabels(QVector<QRectF> &labels)
{
    double shift = 0.0; // of the last label that moved, even when later ones did not
    for (int i = 1; i < labels.size(); ++i) {
        const double least = labels.at(i - 1).right() + kLabelGap;
        if (least > labels.at(i).left()) {
            shift = least - labels.at(i).left();
            labels[i].moveLeft(least);
        }
    }
    if (shift > 0.0) {
        for (QRectF &label : labels)
            label.translate(-shift / 2, 0.0);
    }
    return shift > 0.0;
}

} // namespace kvCharts::KvBoxGeometry
