// SPDX-License-Identifier: MIT
#include "charts/KvChart.h"

#include "charts/KvAxisGeometry.h"
#include "charts/KvChartThemes.h"
#include "charts/KvLegend.h"

#include <QScopedValueRollback>

namespace kvCharts {

namespace {

constexpr qreal kSceneMargin = 50.0;

} // namespace

KvChart::KvChart(const KvChartThemes *themes)
    : m_legend(new KvLegend)
    , m_themes(themes)
{
    slotThemeChanged();
    connectPart(m_legend);
    connect(m_themes, SIGNAL(signalThemeChanged()), this, SLOT(slotThemeChanged()));
}

KvChart::~KvChart()
{
    delete m_axisX;
    delete m_axisY;
    delete m_legend;
}

void KvChart::setAxisX(kvCharts::KvBaseChartPart *axis)
{
    m_axisX = axis;
    partChanged();
    connectPart(axis);
}

KvBaseChartPart *KvChart::axisX() const
{
    return m_axisX;
}

void KvChart::setAxisY(kvCharts::KvBaseChartPart *axis)
{
    m_axisY = axis;
    partChanged();
    connectPart(axis);
}

KvBaseChartPart *KvChart::axisY() const
{
    return m_axisY;
}

KvLegend *KvChart::legend() const
{
    return m_legend;
}

void KvChart::setLegendTitle(const QString &title)
{
    m_legend->setTitle(title);
}

void KvChart::addPart(kvCharts::KvBaseChartPart *part)
{
    m_parts.append(part);
    partChanged();
    connectPart(part);
}

void KvChart::removeAllParts()
{
    qDeleteAll(m_parts);
    m_parts.clear();
}

void KvChart::beginUpdate()
{
    m_updateLock.ref();
}

void KvChart::endUpdate()
{
    if (!m_updateLock.deref())
        refresh();
}

void KvChart::refresh()
{
    if (m_updateLock.loadAcquire() != 0)
        return;
    {
        const QScopedValueRollback<bool> rebuilding(m_rebuilding, true);
        rebuild();
    }
    partChanged();
}

double KvChart::valueToScene(double value, double min, double max)
{
    return KvAxisGeometry::valueToScene(value, min, max);
}

void KvChart::partChanged()
{
    if (m_rebuilding)
        return;
    clear();
    for (KvBaseChartPart *part : {m_axisX.data(), m_axisY.data(), static_cast<KvBaseChartPart *>(m_legend)}) {
        if (part)
            part->draw(this, m_themes);
    }
    for (KvBaseChartPart *part : qAsConst(m_parts))
        part->draw(this, m_themes);
    // Set even when it is empty: a scene keeps its rectangle when it is cleared.
    setSceneRect(itemsBoundingRect().adjusted(-kSceneMargin, -kSceneMargin, kSceneMargin, kSceneMargin));
}

void KvChart::slotThemeChanged()
{
    setBackgroundBrush(QBrush(m_themes->color(KvChartThemes::ChartBackground), Qt::SolidPattern));
}

void KvChart::rebuild() {}

// As its parent the chart deletes also what nothing else does: replaced axes and parts that were not removed.
void KvChart::connectPart(KvBaseChartPart *part)
{
    if (!part)
        return;
    part->setParent(this);
    connect(part, SIGNAL(changed()), this, SLOT(partChanged()), Qt::UniqueConnection);
}

} // namespace kvCharts
