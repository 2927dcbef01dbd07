// SPDX-License-Identifier: MIT
#pragma once

#include <QPainterPath>
#include <QSizeF>
#include <QTransform>
#include <QVector>

/** Where the slices of a pie and their labels lie. Angles are in degrees, clockwise from 3 o'clock. */
namespace kvCharts::KvPieGeometry {

struct Slice
{
    double start;
    double span;
};

/** The slices of these values; none when their sum is 0 or not a finite number. */
QVector<Slice> slices(const QVector<double> &values);

QPainterPath slicePath(const Slice &slice);

/** Puts the top-left corner of a label half-way out along the middle of its slice; the text stays level. */
QTransform labelTransform(const Slice &slice, const QSizeF &labelSize);

} // namespace kvCharts::KvPieGeometry
