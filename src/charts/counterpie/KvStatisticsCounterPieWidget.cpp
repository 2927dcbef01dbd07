// SPDX-License-Identifier: MIT
#include "charts/counterpie/KvStatisticsCounterPieWidget.h"

#include "charts/KvPieChart.h"
#include "charts/common/KvCounterRecords.h"
#include "charts/counterpie/KvStatisticsCounterPieNodeCfg.h"
#include "charts/counterpie/KvStatisticsCounterPieOptionsWidget.h"
#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"

#include <QCoreApplication>

KvStatisticsCounterPieWidget::KvStatisticsCounterPieWidget(QWidget *parent,
                                                           KvStatisticsCounterPieNodeCfg *cfg)
    : KvStatisticsChartWidget(parent, cfg)
    , m_cfg(cfg)
    , m_chart(new kvCharts::KvPieChart(cfg->themes()))
{
    start(m_chart);
}

QString KvStatisticsCounterPieWidget::displayName() const
{
    return QCoreApplication::translate("KvBaseEditorNodeFactory", "Counters");
}

QWidget *KvStatisticsCounterPieWidget::createOptionsWidget(QWidget *parent, bool withPlacement)
{
    auto *options = new KvStatisticsCounterPieOptionsWidget(m_cfg, parent, withPlacement);
    connectOptions(options);
    return options;
}

void KvStatisticsCounterPieWidget::updateValues()
{
    refreshChart();
}

void KvStatisticsCounterPieWidget::fillChart()
{
    m_chart->clearSlices();
    const KvReportKernelData *kernelData = engine().kernelData();
    if (!kernelData)
        return;
    // In the order of the records, in which an object has its place whatever its name.
    const QVector<KvMeasuredValue> records = kernelData->measuredValues();
    for (const KvMeasuredValue &record : records) {
        if (KvCounterRecords::isCount(record))
            m_chart->addSlice(record.objectName, KvStatisticsEngine::numericValue(record.value), QColor(),
                              QColor());
    }
}

void KvStatisticsCounterPieWidget::slotWidthChanged(int aWidth)
{
    changeWidth(aWidth);
}

void KvStatisticsCounterPieWidget::slotAlignmentChanged(const Qt::Alignment &aAlignment)
{
    changeAlignment(aAlignment);
}

void KvStatisticsCounterPieWidget::slotThemeChanged(const kvCharts::KvChartThemes::ThemeType &aTheme)
{
    changeTheme(aTheme);
}
