// SPDX-License-Identifier: MIT
#include "charts/KvPie.h"

#include "charts/KvChartFont.h"
#include "charts/KvChartPen.h"
#include "charts/KvChartThemes.h"

#include <QGraphicsScene>
#include <QGraphicsTextItem>

namespace kvCharts {

KvPie::KvPie(const QString &text, const KvPieGeometry::Slice &slice, const QColor &outline,
             const QColor &fill)
    : m_text(text)
    , m_slice(slice)
    , m_pen(KvChartPen::make(outline.isValid() ? outline : QColor(Qt::white), 2.0))
    , m_brush(fill, Qt::SolidPattern)
{}

void KvPie::draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes)
{
    scene->addPath(KvPieGeometry::slicePath(m_slice), m_pen, m_brush);
    QGraphicsTextItem *label = scene->addText(m_text, KvChartFont::make(12.0));
    label->setDefaultTextColor(themes->color(KvChartThemes::PartLabelText));
    label->setTransform(KvPieGeometry::labelTransform(m_slice, label->boundingRect().size()));
    label->setZValue(1.0); // above all slices
}

} // namespace kvCharts
