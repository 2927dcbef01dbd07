// SPDX-License-Identifier: MIT
#include "blocks/measurementstable/KvStatisticsMeasurementsTableWidget.h"

#include "blocks/common/KvColumnsText.h"
#include "blocks/measurementstable/KvMeasurementsOrder.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableOptionsWidget.h"
#include "blocks/table/KvTableFonts.h"
#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"

namespace {

// What each column shows, in the fixed order of the column names.
QString KvMeasuredValue::*const kColumnMembers[] = {&KvMeasuredValue::objectName,
                                                    &KvMeasuredValue::objectTypeName,
                                                    &KvMeasuredValue::valueName, &KvMeasuredValue::valueText};

QString arrowText(bool ascending)
{
    return QLatin1Char(' ') + QString(QChar(ascending ? 0x02C4 : 0x02C5));
}

} // namespace

KvStatisticsMeasurementsTableWidget::KvStatisticsMeasurementsTableWidget(
    QWidget *displayParent, KvStatisticsMeasurementsTableNodeCfg *cfg)
    : KvStatisticsBaseTableWidget(displayParent, cfg)
    , m_cfg(cfg)
    , m_announcedOptions(cfg->options())
{
    setFonts(KvTableFonts::header(), KvTableFonts::body());
    connectSources();
    slotUpdateTableContents();
}

QString KvStatisticsMeasurementsTableWidget::displayName() const
{
    return tr("Measurements Table");
}

QWidget *KvStatisticsMeasurementsTableWidget::createOptionsWidget(QWidget *parent, bool withPlacement)
{
    auto *options = new KvStatisticsMeasurementsTableOptionsWidget(m_cfg, parent, withPlacement);
    connectOptions(options);
    connect(options, SIGNAL(signalOrderByChanged(QString, bool)), this,
                            SLOT(slotOrderBySelected(QString, bool)));
    return options;
}

int KvStatisticsMeasurementsTableWidget::widthPercent() const
{
    return m_cfg->widthPercent();
}

Qt::Alignment KvStatisticsMeasurementsTableWidget::alignment() const
{
    return m_cfg->alignment();
}

void KvStatisticsMeasurementsTableWidget::slotUpdateTableContents()
{
    startUpdate();
    const QVector<int> columns =
        KvColumnsText::indexes(KvStatisticsMeasurementsTableNodeCfg::columnNames(), m_cfg->columns());
    fillHeader(columns);
    if (!columns.isEmpty())
        fillBody(columns);
    finishUpdate();
}

void KvStatisticsMeasurementsTableWidget::fillHeader(const QVector<int> &columns)
{
    const QStringList &names = KvStatisticsMeasurementsTableNodeCfg::columnNames();
    for (int i = 0; i < columns.size(); ++i) {
        const QString &name = names.at(columns.at(i));
        QString label = KvStatisticsMeasurementsTableNodeCfg::columnLabel(name);
        if (name == m_cfg->orderColumn())
            label += arrowText(m_cfg->isOrderAscending());
        setHeaderCell(0, i, label, 1);
    }
}

void KvStatisticsMeasurementsTableWidget::fillBody(const QVector<int> &columns)
{
    const KvReportKernelData *kernelData = engine().kernelData();
    if (!kernelData)
        return;
    const QVector<KvMeasuredValue> records = kernelData->measuredValues();
    const bool isSorted = KvStatisticsMeasurementsTableNodeCfg::columnNames().contains(m_cfg->orderColumn());
    const QVector<int> order =
        isSorted ? KvMeasurementsOrder::sorted(records, m_cfg->orderColumn(), m_cfg->isOrderAscending())
                 : QVector<int>();
    reserve(records.size(), columns.size());
    for (int row = 0; row < records.size(); ++row) {
        const KvMeasuredValue &record = records.at(isSorted ? order.at(row) : row);
        for (int i = 0; i < columns.size(); ++i)
            setCell(row, i, record.*kColumnMembers[columns.at(i)], false, 1);
    }
}

bool KvStatisticsMeasurementsTableWidget::takeOptionsChange()
{
    return announceChange(m_cfg->options(), m_announcedOptions);
}

void KvStatisticsMeasurementsTableWidget::slotWidthChanged(int aWidth)
{
    m_cfg->setWidthPercent(aWidth);
    if (takeOptionsChange())
        updatePlacement();
}

void KvStatisticsMeasurementsTableWidget::slotAlignmentChanged(Qt::Alignment aAlignment)
{
    m_cfg->setAlignment(aAlignment);
    if (takeOptionsChange())
        updatePlacement();
}

void KvStatisticsMeasurementsTableWidget::slotColumnsChanged(QSet<QString> aColumns)
{
    m_cfg->setColumns(aColumns);
    if (takeOptionsChange())
        slotUpdateTableContents();
}

void KvStatisticsMeasurementsTableWidget::slotOrderBySelected(QString aColumnName, bool aAscending)
{
    m_cfg->setOrder(aColumnName, aAscending);
    if (takeOptionsChange())
        slotUpdateTableContents();
}

void KvStatisticsMeasurementsTableWidget::slotThemeChanged(kvCharts::KvChartThemes::ThemeType aTheme)
{
    changeTheme(static_cast<int>(aTheme));
}

void KvStatisticsMeasurementsTableWidget::slotContentHeightChanged()
{
    updatePageSplit();
}
