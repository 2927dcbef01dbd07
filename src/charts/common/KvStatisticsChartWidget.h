// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvChartThemes.h"
#include "charts/common/KvStatisticsChartNodeCfg.h"
#include "report/KvBaseDisplayWidget.h"

#include <QWidget>

class KvStatisticsEngine;

namespace kvCharts {
class KvChart;
class KvChartView;
} // namespace kvCharts

/**
 * Base of the display widgets of all charts: the chart's view, its place, and its way from the measured
 * values to the page.
 *
 * On a page the chart has a fixed width and the height that its proportions then need; off a page (a
 * configuration without context) it is scaled to the room that its window gives it. Derived classes declare
 * the slots that are connected by name here, make and fill the chart.
 */
class KvStatisticsChartWidget
    : public QWidget
    , public KvBaseDisplayWidget
{
    Q_OBJECT
public:
    /** The widget itself, as wide as the page wants it now. */
    QWidget *subWidgetAt(int index) override;
    QSize sizeHint() const override;

    kvCharts::KvChartView *chartView() const { return m_view; }

protected:
    /** \a cfg is not owned and outlives the widget. */
    KvStatisticsChartWidget(QWidget *parent, KvStatisticsChartNodeCfg *cfg);

    /**
     * Shows \a chart, which the widget takes over, with the current data; updateValues(), a slot of the
     * derived class, is called on new data and on another theme. The last step of a derived class's
     * constructor.
     */
    void start(kvCharts::KvChart *chart);
    /** Has the slots of the derived class for width, alignment and theme called by an options panel. */
    void connectOptions(QObject *options);

    /** Puts the current data into the chart, which is empty or holds what it showed before. */
    virtual void fillChart() = 0;
    /** Shows the current data: one rebuild of the chart, then its place on the page. */
    void refreshChart();

    void changeWidth(int percent);
    void changeAlignment(Qt::Alignment alignment);
    void changeTheme(kvCharts::KvChartThemes::ThemeType theme);

    /** After the user changed an option: tells the window, which may save it, and marks the template
     * modified. */
    void announceConfigChanged();

    static KvStatisticsEngine &engine();

private:
    void connectSignals();
    /** Width of the chart in pixels on the page of \a context. */
    int chartWidth(const KvTemplateContext &context) const;
    void place();
    /** Tells that the block looks different now and may have another size. */
    void announceChanged();

    KvStatisticsChartNodeCfg *m_cfg;
    kvCharts::KvChartView *m_view;
};
