// SPDX-License-Identifier: MIT
#pragma once

#include <QColor>
#include <QObject>
#include <QVector>

namespace kvCharts {

/** The data of one line of a line chart. Created without a parent; changes show at the next refresh. */
class KvLineSerie : public QObject
{
    Q_OBJECT
public:
    struct Point
    {
        QString category;
        double value;
    };

    KvLineSerie(const QString &name, const QColor &color);

    QString name() const { return m_name; }
    QColor color() const { return m_color; }

    void addPoint(const QString &category, double value);
    const QVector<Point> &points() const { return m_points; }

    /** Values at which horizontal lines are drawn when they are shown. */
    void setLimits(double lower, double upper);
    double lowerLimit() const { return m_lowerLimit; }
    double upperLimit() const { return m_upperLimit; }
    void setShowLimits(bool show) { m_showLimits = show; }
    bool showLimits() const { return m_showLimits; }

    /** Whether the regression line is drawn. */
    void setShowTrend(bool show) { m_showTrend = show; }
    bool showTrend() const { return m_showTrend; }

private:
    QString m_name;
    QVector<Point> m_points;
    bool m_showLimits = false;
    double m_lowerLimit = 0.0;
    double m_upperLimit = 0.0;
    bool m_showTrend = false;
    QColor m_color;
};

} // namespace kvCharts
