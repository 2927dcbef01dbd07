// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvBaseChartPart.h"
#include "charts/KvPieGeometry.h"

#include <QBrush>
#include <QPen>

namespace kvCharts {

/** One slice of a pie chart, with its label. */
class KvPie : public KvBaseChartPart
{
    Q_OBJECT
public:
    /** An invalid outline colour stands for white. */
    KvPie(const QString &text, const KvPieGeometry::Slice &slice, const QColor &outline, const QColor &fill);

    void draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes) override;

    QString text() const { return m_text; }
    double startAngle() const { return m_slice.start; }
    double spanAngle() const { return m_slice.span; }
    const QPen &pen() const { return m_pen; }
    const QBrush &brush() const { return m_brush; }

private:
    QString m_text;
    KvPieGeometry::Slice m_slice;
    QPen m_pen;
    QBrush m_brush;
};

} // namespace kvCharts
