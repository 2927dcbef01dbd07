// SPDX-License-Identifier: MIT
#include "blocks/statisticstable/KvStatisticsStatsTableWidget.h"

#include "blocks/common/KvColumnsText.h"
#include "blocks/statisticstable/KvStatisticsStatsTableOptionsWidget.h"
#include "blocks/table/KvTableFonts.h"
#include "data/KvStatisticsUnitConverter.h"

namespace {

// All statistics of a group in the fixed order of their names. The group is not empty.
QVector<QVariant> statisticsOf(const KvValueGroup &group)
{
    // The range keeps the host's types: the least of some counts is a whole number, their average is none.
    const QPair<QVariant, QVariant> range = KvStatisticsEngine::range(group);
    const double average = KvStatisticsEngine::average(group);
    const double sigma = KvStatisticsEngine::sigma(average, group);
    return {range.first, range.second, average, sigma, 3.0 * sigma, 6.0 * sigma};
}

} // namespace

KvStatisticsStatsTableWidget::KvStatisticsStatsTableWidget(QWidget *displayParent,
                                                           KvStatisticsStatsTableNodeCfg *cfg)
    : KvStatisticsBaseTableWidget(displayParent, cfg)
    , m_cfg(cfg)
    , m_announcedOptions(cfg->options())
{
    setFonts(KvTableFonts::header(), KvTableFonts::body());
    connectSources();
    slotUpdateTableContents();
}

QString KvStatisticsStatsTableWidget::displayName() const
{
    return tr("Statistics Table");
}

QWidget *KvStatisticsStatsTableWidget::createOptionsWidget(QWidget *parent, bool withPlacement)
{
    auto *options = new KvStatisticsStatsTableOptionsWidget(m_cfg, parent, withPlacement);
    connectOptions(options);
    connect(options, SIGNAL(signalGroupByChanged(KvStatisticsStatsTableNodeCfg::GroupBy)), this,
                            SLOT(slotGroupByChanged(KvStatisticsStatsTableNodeCfg::GroupBy)));
    return options;
}

int KvStatisticsStatsTableWidget::widthPercent() const
{
    return m_cfg->widthPercent();
}

Qt::Alignment KvStatisticsStatsTableWidget::alignment() const
{
    return m_cfg->alignment();
}

void KvStatisticsStatsTableWidget::slotUpdateTableContents()
{
    startUpdate();
    const QVector<int> columns =
        KvColumnsText::indexes(KvStatisticsStatsTableNodeCfg::columnNames(), m_cfg->columns());
    fillHeader(columns);
    if (isByObject())
        fillBodyByObject(columns);
    else
        fillBodyByMeasurement(columns);
    fitColumnsToTexts(isByObject() ? 2 : 1);
    finishUpdate();
}

bool KvStatisticsStatsTableWidget::isByObject() const
{
    return m_cfg->groupBy() == KvStatisticsStatsTableNodeCfg::ByObject;
}

void KvStatisticsStatsTableWidget::fillHeader(const QVector<int> &columns)
{
    int next = 0;
    if (isByObject())
        setHeaderCell(0, next++, tr("Object Type"), 1);
    setHeaderCell(0, next++, tr("Measurement Type"), 1);
    for (const int column : columns) {
        const QString &name = KvStatisticsStatsTableNodeCfg::columnNames().at(column);
        setHeaderCell(0, next++, KvStatisticsStatsTableNodeCfg::columnLabel(name), 1);
    }
}

void KvStatisticsStatsTableWidget::fillBodyByMeasurement(const QVector<int> &columns)
{
    const QMap<QString, KvValueGroup> &groups = engine().byValueName();
    for (auto it = groups.cbegin(); it != groups.cend(); ++it)
        addRow({it.key()}, it.value(), columns);
}

void KvStatisticsStatsTableWidget::fillBodyByObject(const QVector<int> &columns)
{
    const auto &types = engine().byObjectType();
    for (auto type = types.cbegin(); type != types.cend(); ++type) {
        // The name of the type stands in every row, so that a page that starts amid a type can be read.
        for (auto it = type.value().cbegin(); it != type.value().cend(); ++it)
            addRow({type.key(), it.key()}, it.value(), columns);
    }
}

void KvStatisticsStatsTableWidget::addRow(const QStringList &names, const KvValueGroup &group,
                                          const QVector<int> &columns)
{
    const int row = bodyRowCount();
    int next = 0;
    for (const QString &name : names)
        setCell(row, next++, name, false, 1);
    // The first record stands for its group; each cell chooses its own unit.
    const int measureKind = group.first().measureKind;
    const QVector<QVariant> statistics = statisticsOf(group);
    for (const int column : columns) {
        const QString text = KvStatisticsUnitConverter::formatValue(statistics.at(column), measureKind,
                                                                    KvStatisticsUnitConverter::AutomaticUnit);
        setCell(row, next++, text, false, 1);
    }
}

bool KvStatisticsStatsTableWidget::takeOptionsChange()
{
    return announceChange(m_cfg->options(), m_announcedOptions);
}

void KvStatisticsStatsTableWidget::slotWidthChanged(int aWidth)
{
    m_cfg->setWidthPercent(aWidth);
    if (takeOptionsChange())
        updatePlacement();
}

void KvStatisticsStatsTableWidget::slotAlignmentChanged(Qt::Alignment aAlignment)
{
    m_cfg->setAlignment(aAlignment);
    if (takeOptionsChange())
        updatePlacement();
}

void KvStatisticsStatsTableWidget::slotGroupByChanged(KvStatisticsStatsTableNodeCfg::GroupBy aGroupBy)
{
    m_cfg->setGroupBy(aGroupBy);
    if (takeOptionsChange())
        slotUpdateTableContents();
}

void KvStatisticsStatsTableWidget::slotThemeChanged(kvCharts::KvChartThemes::ThemeType aTheme)
{
    changeTheme(static_cast<int>(aTheme));
}

void KvStatisticsStatsTableWidget::slotColumnsChanged(QSet<QString> aColumns)
{
    m_cfg->setColumns(aColumns);
    if (takeOptionsChange())
        slotUpdateTableContents();
}

void KvStatisticsStatsTableWidget::slotContentHeightChanged()
{
    updatePageSplit();
}
