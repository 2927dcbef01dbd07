// SPDX-License-Identifier: MIT
#include "charts/common/KvStatisticsChartWidget.h"

#include "charts/KvChart.h"
#include "charts/KvChartView.h"
#include "charts/KvLegend.h"
#include "data/KvStatisticsEngine.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvTemplateContext.h"

#include <QSignalBlocker>
#include <QVBoxLayout>

#include <algorithm>

namespace {
constexpr int kLeastHeight = 20; // in pixels; a lower block could not be selected
}

KvStatisticsChartWidget::KvStatisticsChartWidget(QWidget *parent, KvStatisticsChartNodeCfg *cfg)
    : QWidget(parent)
    , m_cfg(cfg)
    , m_view(new kvCharts::KvChartView(cfg->themes(), this))
{
    // Nothing in a chart can be clicked: mouse and keyboard belong to the page around it.
    m_view->setAttribute(Qt::WA_TransparentForMouseEvents);
    m_view->setFocusPolicy(Qt::NoFocus);
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(m_view);
}

void KvStatisticsChartWidget::start(kvCharts::KvChart *chart)
{
    m_view->setChart(chart);
    m_view->setAccessibleName(displayName());
    connectSignals();
    refreshChart();
}

KvStatisticsEngine &KvStatisticsChartWidget::engine()
{
    return KvStatisticsEngine::instance();
}

void KvStatisticsChartWidget::connectSignals()
{
    // The themes tell the chart first, which knows them longer: it has the new background when it is filled.
    connect(m_cfg->themes(), SIGNAL(signalThemeChanged()), this, SLOT(updateValues()));
    connect(&engine(), SIGNAL(signalMeasurementsListUpdated()), this, SLOT(updateValues()));
}

void KvStatisticsChartWidget::connectOptions(QObject *options)
{
    connect(options, SIGNAL(signalWidthChanged(int)), this, SLOT(slotWidthChanged(int)));
    connect(options, SIGNAL(signalAlignmentChanged(Qt::Alignment)), this,
                            SLOT(slotAlignmentChanged(Qt::Alignment)));
    connect(options, SIGNAL(signalThemeChanged(kvCharts::KvChartThemes::ThemeType)), this,
                            SLOT(slotThemeChanged(kvCharts::KvChartThemes::ThemeType)));
}

QWidget *KvStatisticsChartWidget::subWidgetAt(int index)
{
    if (index != 0)
        return nullptr;
    // Display widgets outlive changes of the page width, which nothing announces.
    place();
    return this;
}

int KvStatisticsChartWidget::chartWidth(const KvTemplateContext &context) const
{
    const float fraction = static_cast<float>(std::clamp(m_cfg->widthPercent(), 1, 100)) / 100.0f;
    return static_cast<int>(static_cast<float>(context.usableWidth()) * fraction);
}

QSize KvStatisticsChartWidget::sizeHint() const
{
    const KvTemplateContext *context = m_cfg->context();
    if (!context)
        return QWidget::sizeHint();
    const QRectF scene = m_view->chartRect();
    const int height =
        scene.width() > 0.0 ? static_cast<int>(scene.height() * chartWidth(*context) / scene.width()) : 0;
    return QSize(context->usableWidth(), std::max(kLeastHeight, height));
}

void KvStatisticsChartWidget::place()
{
    const KvTemplateContext *context = m_cfg->context();
    if (!context)
        return; // an alignment would keep the view from filling the window
    m_view->setFixedWidthKeepRatio(chartWidth(*context));
    layout()->setAlignment(m_view, m_cfg->alignment());
    // At once, which also tells what is around of the new size: a print does not wait for the event loop.
    layout()->activate();
}

void KvStatisticsChartWidget::refreshChart()
{
    kvCharts::KvChart *chart = m_view->chart();
    chart->beginUpdate();
    {
        // The update bracket holds rebuilding back; the legend would still draw the chart anew for each item.
        const QSignalBlocker quietLegend(chart->legend());
        fillChart();
    }
    chart->endUpdate();
    chart->update();
    // Other data has other proportions.
    place();
    announceChanged();
}

void KvStatisticsChartWidget::changeWidth(int percent)
{
    if (percent == m_cfg->widthPercent())
        return;
    m_cfg->setWidthPercent(percent);
    place();
    announceConfigChanged();
    announceChanged();
}

void KvStatisticsChartWidget::changeAlignment(Qt::Alignment alignment)
{
    const bool isOther = alignment != m_cfg->alignment();
    m_cfg->setAlignment(alignment);
    place();
    if (isOther)
        announceConfigChanged();
    // Also for the same alignment: whoever asks for it gets the page laid out.
    announceChanged();
}

void KvStatisticsChartWidget::changeTheme(kvCharts::KvChartThemes::ThemeType theme)
{
    // The themes object announces the change itself, which refreshes the chart.
    if (m_cfg->setTheme(static_cast<int>(theme)))
        announceConfigChanged();
}

void KvStatisticsChartWidget::announceConfigChanged()
{
    emit displaySignals()->signalWidgetConfigChanged(m_cfg);
    if (KvTemplateContext *context = m_cfg->context())
        emit context->signalTemplateModified();
}

void KvStatisticsChartWidget::announceChanged()
{
    emit displaySignals()->signalWidgetChanged();
}
