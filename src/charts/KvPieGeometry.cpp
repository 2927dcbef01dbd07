// SPDX-License-Identifier: MIT
#include "charts/KvPieGeometry.h"

#include <cmath>
#include <numeric>

namespace kvCharts::KvPieGeometry {

namespace {

constexpr double kCenter = 500.0;
constexpr double kRadius = 450.0;

} // namespace

QVector<Slice> slices(const QVector<double> &values)
{
    const double sum = std::accumulate(values.begin(), values.end(), 0.0);
    if (sum == 0.0 || !std::isfinite(sum))
        return {};
    QVector<Slice> result;
    result.reserve(values.size());
    double start = 0.0;
    for (const double value : values) {
        const double span = value / sum * 360.0;
        result.append({start, span});
        start += span;
    }
    return result;
}

QPainterPath slicePath(const Slice &slice)
{
    const QPointF center(kCenter, kCenter);
    const QRectF circle(kCenter - kRadius, kCenter - kRadius, 2 * kRadius, 2 * kRadius);
    QPainterPath path(center);
    path.arcTo(circle, -slice.start, -slice.span);
    path.lineTo(center);
    return path;
}

QTransform labelTransform(const Slice &slice, const QSizeF &labelSize)
{
    const double middle = slice.start + slice.span / 2;
    // A product, as chained calls on one transform would apply in reverse order.
    return QTransform().rotate(-middle) *
           QTransform::fromTranslate((kRadius - labelSize.width()) / 2, -labelSize.height() / 2) *
           QTransform().rotate(middle) * QTransform::fromTranslate(kCenter, kCenter);
}

} // namespace kvCharts::KvPieGeometry
