// SPDX-License-Identifier: MIT
#include "charts/KvHorizontalBoxChart.h"

#include "charts/KvAxisXValues.h"
#include "charts/KvAxisYCategories.h"
#include "charts/KvChartNumber.h"
#include "charts/KvHorizontalBox.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace kvCharts {

KvHorizontalBoxChart::KvHorizontalBoxChart(const KvChartThemes *themes)
    : KvChart(themes)
{
    setAxisX(new KvAxisXValues);
    setAxisY(new KvAxisYCategories);
}

void KvHorizontalBoxChart::addBox(const QString &name, double minimum, double lower, double median,
                                  double upper, double maximum, const QColor &color)
{
    m_entries.append({name, {minimum, lower, median, upper, maximum}, color});
    refresh();
}

void KvHorizontalBoxChart::clearBoxes()
{
    removeAllParts();
    m_entries.clear();
}

void KvHorizontalBoxChart::rebuild()
{
    removeAllParts();
    const auto *valueAxis = qobject_cast<KvBaseAxis *>(axisX());
    if (m_entries.isEmpty() || !valueAxis)
        return;
    updateAxes();
    const QVector<KvBoxGeometry::Extent> extents = KvBoxGeometry::extents(m_entries.size());
    for (int i = 0; i < m_entries.size(); ++i) {
        if (!isDrawable(m_entries.at(i)))
            continue;
        KvHorizontalBox *box = makeBox(m_entries.at(i), valueAxis->minimum(), valueAxis->maximum());
        box->setExtent(extents.at(i));
        addPart(box);
    }
}

bool KvHorizontalBoxChart::isDrawable(const Entry &entry)
{
    return std::all_of(entry.values.begin(), entry.values.end(),
                       [](double value) { return std::isfinite(value); });
}

KvHorizontalBox *KvHorizontalBoxChart::makeBox(const Entry &entry, double low, double high)
{
    KvHorizontalBox::Points points;
    for (std::size_t i = 0; i < points.size(); ++i)
        points[i] = {valueToScene(entry.values[i], low, high), KvChartNumber::text(entry.values[i])};
    auto *box = new KvHorizontalBox;
    box->setPoints(points);
    box->setPenColor(Qt::white);
    box->setBrushColor(entry.color);
    return box;
}

void KvHorizontalBoxChart::updateAxes()
{
    QStringList names;
    double least = std::numeric_limits<double>::infinity();
    double greatest = -least;
    for (const Entry &entry : qAsConst(m_entries)) {
        names.append(entry.name);
        if (isDrawable(entry)) {
            least = std::min(least, entry.values.front());
            greatest = std::max(greatest, entry.values.back());
        }
    }
    if (auto *categoryAxis = qobject_cast<KvAxisYCategories *>(axisY()))
        categoryAxis->setCategories(names);
    if (least <= greatest)
        static_cast<KvBaseAxis *>(axisX())->autoRange(least, greatest);
}

} // namespace kvCharts
