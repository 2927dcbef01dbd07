// SPDX-License-Identifier: MIT
#include "charts/KvLineChart.h"

#include "charts/KvAxisXCategories.h"
#include "charts/KvAxisYValues.h"
#include "charts/KvLegend.h"
#include "charts/KvLineParts.h"
#include "charts/KvLineSerie.h"
#include "charts/KvSeriesPalette.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace kvCharts {

KvLineChart::KvLineChart(const KvChartThemes *themes)
    : KvChart(themes)
{
    setAxisX(new KvAxisXCategories);
    setAxisY(new KvAxisYValues);
}

KvLineChart::~KvLineChart()
{
    removeAllParts();
    qDeleteAll(m_series);
}

KvLineSerie *KvLineChart::addSerie(const QString &name)
{
    if (KvLineSerie *existing = m_seriesByName.value(name))
        return existing;
    auto *serie = new KvLineSerie(name, seriesColor(m_series.size()));
    legend()->addItem(name, serie->color());
    m_series.append(serie);
    m_seriesByName.insert(name, serie);
    return serie;
}

void KvLineChart::addCategory(const QString &text)
{
    m_categories.add(text);
    refresh();
}

void KvLineChart::clearSeries()
{
    removeAllParts();
    qDeleteAll(m_series);
    m_series.clear();
    m_seriesByName.clear();
    m_categories.clear();
    legend()->clearItems();
}

void KvLineChart::rebuild()
{
    removeAllParts();
    auto *valueAxis = qobject_cast<KvBaseAxis *>(axisY());
    const Range range = valueRange();
    if (m_categories.size() == 0 || range.least > range.greatest || !valueAxis)
        return;
    if (auto *categoryAxis = qobject_cast<KvAxisXCategories *>(axisX()))
        categoryAxis->setCategories(m_categories.texts());
    valueAxis->autoRange(range.least, range.greatest);
    addSeriesParts();
}

// Values that are not finite have no place. Limits count only for series that have points.
KvLineChart::Range KvLineChart::valueRange() const
{
    constexpr double infinity = std::numeric_limits<double>::infinity();
    Range range{infinity, -infinity};
    const auto include = [&range](double least, double greatest) {
        if (std::isfinite(least))
            range.least = std::min(range.least, least);
        if (std::isfinite(greatest))
            range.greatest = std::max(range.greatest, greatest);
    };
    for (const KvLineSerie *serie : m_series) {
        for (const KvLineSerie::Point &point : serie->points())
            include(point.value, point.value);
        if (serie->showLimits() && !serie->points().isEmpty())
            include(serie->lowerLimit(), serie->upperLimit());
    }
    return range;
}

void KvLineChart::addSeriesParts()
{
    const auto *valueAxis = static_cast<KvBaseAxis *>(axisY());
    const KvLineGeometry::Scale scale =
        KvLineGeometry::scale(m_categories.size(), valueAxis->minimum(), valueAxis->maximum());
    for (const KvLineSerie *serie : qAsConst(m_series))
        addPart(new KvLineParts(serie, m_categories, scale));
}

} // namespace kvCharts
