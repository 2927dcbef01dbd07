// SPDX-License-Identifier: MIT
#include "blocks/measurementstable/KvStatisticsMeasurementsTableWidget.h"

#include "blocks/measurementstable/KvMeasurementsOrder.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableOptionsWidget.h"
#include "blocks/table/KvTableFonts.h"
#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"
#include "templates/KvTemplateContext.h"

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
    , m_announcedTheme(cfg->themeIndex())
{
    setFonts(KvTableFonts::header(), KvTableFonts::body());
    connect(&engine(), SIGNAL(signalMeasurementsListUpdated()), this, SLOT(slotUpdateTableContents()));
    connect(cfg->themes(), SIGNAL(signalThemeChanged()), this, SLOT(slotUpdateTableContents()));
    if (KvTemplateContext *context = cfg->context())
        connect(context, SIGNAL(signalContentHeightChanged()), this, SLOT(slotContentHeightChanged()));
    slotUpdateTableContents();
}

QString KvStatisticsMeasurementsTableWidget::displayName() const
{
    return tr("Measurements Table");
}

QWidget *KvStatisticsMeasurementsTableWidget::createOptionsWidget(QWidget *parent, bool withPlacement)
{
    auto *options = new KvStatisticsMeasurementsTableOptionsWidget(m_cfg, parent, withPlacement);
    connect(options, SIGNAL(signalWidthChanged(int)), this, SLOT(slotWidthChanged(int)));
    connect(options, SIGNAL(signalAlignmentChanged(Qt::Alignment)), this,
                            SLOT(slotAlignmentChanged(Qt::Alignment)));
    connect(options, SIGNAL(signalThemeChanged(kvCharts::KvChartThemes::ThemeType)), this,
                            SLOT(slotThemeChanged(kvCharts::KvChartThemes::ThemeType)));
    connect(options, SIGNAL(signalColumnsChanged(QSet<QString>)), this,
                            SLOT(slotColumnsChanged(QSet<QString>)));
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
    const QVector<int> columns = shownColumns();
    fillHeader(columns);
    if (!columns.isEmpty())
        fillBody(columns);
    finishUpdate();
}

QVector<int> KvStatisticsMeasurementsTableWidget::shownColumns() const
{
    const QStringList &names = KvStatisticsMeasurementsTableNodeCfg::columnNames();
    const QSet<QString> selected = m_cfg->columns();
    QVector<int> columns;
    for (int i = 0; i < names.size(); ++i) {
        if (selected.contains(names.at(i)))
            columns.append(i);
    }
    return columns;
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
    // The options panel has written the configuration already, so the configuration cannot tell what changed.
    if (m_cfg->options() == m_announcedOptions)
        return false;
    m_announcedOptions = m_cfg->options();
    announceConfigChanged();
    return true;
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
    // The themes object announces the change itself, which refills the table.
    m_cfg->setTheme(static_cast<int>(aTheme));
    if (m_cfg->themeIndex() == m_announcedTheme)
        return;
    m_announcedTheme = m_cfg->themeIndex();
    announceConfigChanged();
}

void KvStatisticsMeasurementsTableWidget::slotContentHeightChanged()
{
    updatePageSplit();
}
