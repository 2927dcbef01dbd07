// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvCategoryList.h"
#include "charts/KvChart.h"

#include <QHash>

namespace kvCharts {

class KvLineSerie;

/** Series of values over categories, each a line of points in its own colour. */
class KvLineChart : public KvChart
{
    Q_OBJECT
public:
    explicit KvLineChart(const KvChartThemes *themes);
    ~KvLineChart() override;

    /** The series of this name, which the chart owns; a new one takes the next colour of the palette. */
    KvLineSerie *addSerie(const QString &name);
    /** Appends a category that the chart does not have yet; refreshes in any case. */
    void addCategory(const QString &text);
    /** Forgets the categories as well. */
    void clearSeries();

    const QVector<KvLineSerie *> &series() const { return m_series; }
    const QStringList &categories() const { return m_categories.texts(); }

protected:
    /** Without series, points or categories the axes keep what they show. */
    void rebuild() override;

private:
    struct Range
    {
        double least;
        double greatest;
    };

    Range valueRange() const;
    void addSeriesParts();

    QVector<KvLineSerie *> m_series;
    QHash<QString, KvLineSerie *> m_seriesByName;
    KvCategoryList m_categories;
};

} // namespace kvCharts
