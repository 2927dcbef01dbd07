// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvBaseChartPart.h"
#include "charts/KvTextMeasure.h"

#include <QPen>
#include <QStringList>
#include <QVector>

namespace kvCharts {

struct KvAxisRange;

/** An axis of a chart. What does not apply to a kind of axis does nothing there. */
class KvBaseAxis : public KvBaseChartPart
{
    Q_OBJECT
public:
    KvBaseAxis();

    void draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes) override = 0;
    virtual void setGridVisible(bool visible);
    /** Any order of the limits is taken. */
    virtual void setRange(double minimum, double maximum);
    virtual void setTickCount(int count);
    /** The limits; 0.0 for axes without. */
    virtual double minimum() const;
    virtual double maximum() const;

    /** Takes a rounded range and tick count for values from \a least to \a greatest. */
    void autoRange(double least, double greatest);

protected:
    /** Takes the pens of the theme and adds the axis line: the beginning of every draw(). */
    void drawAxisLine(QGraphicsScene *scene, const KvChartThemes *themes, Qt::Orientation orientation);
    void drawValues(QGraphicsScene *scene, const KvChartThemes *themes, Qt::Orientation orientation,
                    const KvAxisRange &range, bool gridVisible);
    /** \a extents are those of the categories. */
    void drawCategories(QGraphicsScene *scene, const KvChartThemes *themes, Qt::Orientation orientation,
                        const QStringList &categories, const QVector<KvTextExtent> &extents,
                        bool gridVisible) const;
    QVector<KvTextExtent> measure(const QStringList &texts);

private:
    void drawMarks(QGraphicsScene *scene, const QVector<QLineF> &ticks, const QVector<QLineF> &grid) const;

    QPen m_axisPen;
    QPen m_gridPen;
    QFont m_labelFont;
    KvTextMeasure m_measure;
};

} // namespace kvCharts
