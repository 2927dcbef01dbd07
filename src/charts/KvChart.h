// SPDX-License-Identifier: MIT
#pragma once

#include <QAtomicInteger>
#include <QGraphicsScene>
#include <QPointer>
#include <QVector>

namespace kvCharts {

class KvBaseChartPart;
class KvChartThemes;
class KvLegend;

/**
 * A chart as a scene, drawn anew from its axes, legend and parts whenever one of them changes.
 *
 * The plot is a square of 1000 × 1000 units with y downwards; legend and title stand above it, at negative y.
 * Chart types derive from this class and turn their data into parts in rebuild().
 */
class KvChart : public QGraphicsScene
{
    Q_OBJECT
public:
    /** The themes are not owned and outlive the chart. */
    explicit KvChart(const KvChartThemes *themes);
    ~KvChart() override;

    /** The chart owns the axis; one that was set before is let go of only with the chart. */
    void setAxisX(kvCharts::KvBaseChartPart *axis);
    KvBaseChartPart *axisX() const;
    void setAxisY(kvCharts::KvBaseChartPart *axis);
    KvBaseChartPart *axisY() const;

    KvLegend *legend() const;
    void setLegendTitle(const QString &title);

    /** The chart owns the part, which is drawn over all earlier ones. */
    void addPart(kvCharts::KvBaseChartPart *part);
    /** Deletes all parts; what they drew stays until the next redraw. */
    void removeAllParts();
    const QVector<KvBaseChartPart *> &parts() const { return m_parts; }

    /** Between these calls, which nest, nothing is rebuilt; the last endUpdate() does it once. */
    void beginUpdate();
    void endUpdate();
    /** Rebuilds and redraws, unless an update is under way. */
    void refresh();

    /** Scene coordinate of \a value on an axis from \a min to \a max. */
    static double valueToScene(double value, double min, double max);

public slots:
    /** Redraws everything. */
    void partChanged();
    /** Takes the background of the new theme; the owner of the chart sees to the redraw. */
    void slotThemeChanged();

protected:
    /** Turns the data of a chart type into parts and axes. Changes of parts do not redraw meanwhile. */
    virtual void rebuild();

private:
    void connectPart(KvBaseChartPart *part);

    QPointer<KvBaseChartPart> m_axisX;
    QPointer<KvBaseChartPart> m_axisY;
    QPointer<KvLegend> m_legend;
    QVector<KvBaseChartPart *> m_parts;
    const KvChartThemes *m_themes;
    QAtomicInteger<qint32> m_updateLock;
    bool m_rebuilding = false;
};

} // namespace kvCharts
