// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvBaseChartPart.h"
#include "charts/KvCategoryList.h"
#include "charts/KvLineGeometry.h"

#include <QBrush>
#include <QPen>

namespace kvCharts {

class KvLineSerie;

/** Draws a series: its points, the lines between them, its limits and its trend line. */
class KvLineParts : public KvBaseChartPart
{
    Q_OBJECT
public:
    /** The series is not owned and lives as long as the part. */
    KvLineParts(const KvLineSerie *serie, const KvCategoryList &categories,
                const KvLineGeometry::Scale &scale);

    void draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes) override;

    const KvLineSerie *serie() const { return m_serie; }

private:
    void takeColor();
    QVector<QPointF> scenePoints() const;
    void drawLimits(QGraphicsScene *scene) const;
    void drawTrend(QGraphicsScene *scene, const QVector<QPointF> &points) const;

    const KvLineSerie *m_serie;
    KvCategoryList m_categories;
    KvLineGeometry::Scale m_scale;
    QPen m_pointPen;
    QBrush m_pointBrush;
    QPen m_limitPen;
    QPen m_trendPen;
};

} // namespace kvCharts
