// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvAxisRange.h"

#include <QColor>
#include <QFont>
#include <QLineF>
#include <QPointF>
#include <QStringList>
#include <QVector>

/**
 * What every drawing of the comparison shows: three series of values over categories.
 *
 * All of them place it alike: a square of PictureSide units with the plot, a square of PlotSide units, at
 * (PlotLeft, PlotTop).
 */
class ChartData
{
public:
    static constexpr int SeriesCount = 3;
    static constexpr int PictureSide = 1250;
    static constexpr int PlotSide = 1000;
    static constexpr int PlotLeft = 150;
    static constexpr int PlotTop = 100;
    static constexpr int MarkerSize = 5;
    static constexpr int TickLength = 5;

    /**
     * \a pointCount in all series together. \a categoryCount labels below them, to which the points of a
     * series belong in turn; as many as a series has points make its x ascend.
     */
    ChartData(int pointCount, int categoryCount);

    static QString seriesName(int series);
    static QColor seriesColor(int series);
    /** Pixels, as points would grow with the resolution of a PDF, which the painter's scale does already. */
    static QFont font(int pixelSize);

    const QStringList &categories() const { return m_categories; }
    const kvCharts::KvAxisRange &range() const { return m_range; }
    /** Category index and value of each point. */
    const QVector<QPointF> &points(int series) const { return m_points.at(series); }
    bool isAscending() const { return m_points.first().size() <= m_categories.size(); }

    /** Place of a category index and value, in units of the plot from its top left corner. */
    QPointF toScene(const QPointF &point) const;
    /** Where the ticks of the value axis stand. */
    QVector<double> valueTicks() const;
    /** Fitted anew at each call; reaches a twentieth of the plot beyond it to both sides. */
    QLineF regressionLine(int series) const;

private:
    QStringList m_categories;
    QVector<QVector<QPointF>> m_points;
    kvCharts::KvAxisRange m_range;
};
