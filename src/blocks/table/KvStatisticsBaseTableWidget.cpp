// SPDX-License-Identifier: MIT
#include "blocks/table/KvStatisticsBaseTableWidget.h"

#include "blocks/table/KvBaseTableItemDelegate.h"
#include "blocks/table/KvStatisticSubTable.h"
#include "blocks/table/KvStatisticsBaseTableWidgetModel.h"
#include "blocks/table/KvTableContents.h"
#include "data/KvStatisticsEngine.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvStatisticsThemedNodeCfg.h"
#include "templates/KvTemplateContext.h"

#include <algorithm>

namespace {

const QColor &warningColor()
{
    static const QColor color(QStringLiteral("#A90909"));
    return color;
}

} // namespace

KvStatisticsBaseTableWidget::KvStatisticsBaseTableWidget(QWidget *displayParent,
                                                         KvStatisticsThemedNodeCfg *cfg)
    : m_engine(KvStatisticsEngine::instance())
    , m_cfg(cfg)
    , m_announcedTheme(cfg->themeIndex())
    , m_displayParent(displayParent)
    , m_delegate(std::make_unique<KvBaseTableItemDelegate>(cfg->themes()))
    , m_contents(std::make_shared<KvTableContents>())
{}

KvStatisticsBaseTableWidget::~KvStatisticsBaseTableWidget()
{
    for (KvStatisticSubTable *subTable : qAsConst(m_subTables)) {
        subTable->disconnect(this);
        // It may be painted once more before it is deleted, when configuration and delegate are gone.
        subTable->hide();
        subTable->setParent(nullptr);
        subTable->deleteLater();
    }
}

int KvStatisticsBaseTableWidget::subWidgetCount()
{
    return m_split.pieceCount;
}

QWidget *KvStatisticsBaseTableWidget::subWidgetAt(int index)
{
    if (index < 0 || index >= m_split.pieceCount)
        return nullptr;
    while (m_subTables.size() <= index) {
        KvStatisticSubTable *subTable = addSubTable();
        fillSubTable(subTable, m_subTables.size() - 1);
    }
    KvStatisticSubTable *subTable = m_subTables.at(index);
    // Pieces behind one that was deleted have moved up.
    if (subTable->model()->firstBodyRow() != m_split.firstRow(index))
        fillSubTable(subTable, index);
    const KvTemplateContext *context = m_cfg->context();
    if (!context || !context->isPrinting())
        subTable->ensureView();
    // Display widgets outlive changes of the page width, which nothing announces.
    place(subTable);
    return subTable;
}

void KvStatisticsBaseTableWidget::setHeaderCell(int row, int column, const QString &text, int columnSpan)
{
    m_contents->header.setCell(row, column, text, QColor(), columnSpan);
}

void KvStatisticsBaseTableWidget::setCell(int row, int column, const QString &text, bool flagged,
                                          int columnSpan)
{
    m_contents->body.setCell(row, column, text, flagged ? warningColor() : QColor(), columnSpan);
}

void KvStatisticsBaseTableWidget::startUpdate()
{
    m_contents->header.clear();
    m_contents->body.clear();
    m_contents->wantedWidths.clear();
}

void KvStatisticsBaseTableWidget::clear()
{
    startUpdate();
    for (KvStatisticSubTable *subTable : qAsConst(m_subTables))
        subTable->clear();
}

KvStatisticSubTable *KvStatisticsBaseTableWidget::addSubTable()
{
    auto *subTable = new KvStatisticSubTable(m_cfg, m_delegate.get(), m_displayParent);
    subTable->setRowHeight(KvTablePageSplit::RowHeight);
    m_subTables.append(subTable);
    connect(subTable, SIGNAL(destroyed(QObject *)), this, SLOT(slotSubTableDestroyed(QObject *)));
    return subTable;
}

void KvStatisticsBaseTableWidget::slotSubTableDestroyed(QObject *aSubTable)
{
    // Compared as objects: what is being destroyed is no sub-table any more, and no cast may say so.
    const auto isDestroyed = [aSubTable](const QObject *subTable) { return subTable == aSubTable; };
    m_subTables.erase(std::remove_if(m_subTables.begin(), m_subTables.end(), isDestroyed), m_subTables.end());
}

void KvStatisticsBaseTableWidget::fillSubTable(KvStatisticSubTable *subTable, int page)
{
    const int bodyRows = m_contents->body.rowCount();
    subTable->fill(m_contents, m_split.firstRow(page), m_split.rowCount(page, bodyRows));
    place(subTable);
}

int KvStatisticsBaseTableWidget::bodyRowCount() const
{
    return m_contents->body.rowCount();
}

int KvStatisticsBaseTableWidget::columnCount() const
{
    return m_contents->columnCount();
}

void KvStatisticsBaseTableWidget::setFonts(const QFont &headerFont, const QFont &bodyFont)
{
    m_contents->headerFont = headerFont;
    m_contents->bodyFont = bodyFont;
}

void KvStatisticsBaseTableWidget::connectSources()
{
    connect(&m_engine, SIGNAL(signalMeasurementsListUpdated()), this, SLOT(slotUpdateTableContents()));
    connect(m_cfg->themes(), SIGNAL(signalThemeChanged()), this, SLOT(slotUpdateTableContents()));
    if (KvTemplateContext *context = m_cfg->context())
        connect(context, SIGNAL(signalContentHeightChanged()), this, SLOT(slotContentHeightChanged()));
}

void KvStatisticsBaseTableWidget::connectOptions(QWidget *options)
{
    connect(options, SIGNAL(signalWidthChanged(int)), this, SLOT(slotWidthChanged(int)));
    connect(options, SIGNAL(signalAlignmentChanged(Qt::Alignment)), this,
                            SLOT(slotAlignmentChanged(Qt::Alignment)));
    connect(options, SIGNAL(signalThemeChanged(kvCharts::KvChartThemes::ThemeType)), this,
                            SLOT(slotThemeChanged(kvCharts::KvChartThemes::ThemeType)));
    connect(options, SIGNAL(signalColumnsChanged(QSet<QString>)), this,
                            SLOT(slotColumnsChanged(QSet<QString>)));
}

void KvStatisticsBaseTableWidget::reserve(int bodyRows, int columns)
{
    m_contents->body.reserve(bodyRows, columns);
}

void KvStatisticsBaseTableWidget::fitColumnsToTexts(int yieldingColumns)
{
    m_contents->yieldingColumns = yieldingColumns;
    m_contents->wantedWidths.fill(0, m_contents->columnCount());
    widenColumns(m_contents->header, m_contents->headerFont);
    widenColumns(m_contents->body, m_contents->bodyFont);
}

void KvStatisticsBaseTableWidget::widenColumns(const KvTableGrid &grid, const QFont &font)
{
    for (int row = 0; row < grid.rowCount(); ++row) {
        for (int column = 0; column < grid.columnCount(); ++column) {
            const KvTableCell *cell = grid.cell(row, column);
            if (!cell || cell->columnSpan > 1)
                continue;
            int &wanted = m_contents->wantedWidths[column];
            wanted = m_delegate->widthFor(cell->text, font, wanted);
        }
    }
}

KvTablePageSplit KvStatisticsBaseTableWidget::computeSplit() const
{
    const KvTemplateContext *context = m_cfg->context();
    const int contentHeight = context ? context->contentHeight() : 0;
    return KvTablePageSplit::compute(contentHeight, m_contents->header.rowCount(),
                                     m_contents->body.rowCount());
}

void KvStatisticsBaseTableWidget::finishUpdate()
{
    applySplit(computeSplit());
}

void KvStatisticsBaseTableWidget::updatePageSplit()
{
    const KvTablePageSplit split = computeSplit();
    if (split.rowsPerPage != m_split.rowsPerPage || split.pieceCount != m_split.pieceCount)
        applySplit(split);
}

void KvStatisticsBaseTableWidget::applySplit(const KvTablePageSplit &split)
{
    const bool piecesChanged = split.pieceCount != m_split.pieceCount;
    m_split = split;
    dropSurplusSubTables();
    for (int page = 0; page < m_subTables.size(); ++page)
        fillSubTable(m_subTables.at(page), page);
    if (piecesChanged)
        emit displaySignals()->signalSubWidgetsChanged();
    else
        emit displaySignals()->signalWidgetChanged();
}

void KvStatisticsBaseTableWidget::dropSurplusSubTables()
{
    while (m_subTables.size() > m_split.pieceCount) {
        KvStatisticSubTable *surplus = m_subTables.takeLast();
        surplus->disconnect(this);
        surplus->clear();
        // Later: the page that still shows it is rebuilt only when control returns to the event loop.
        surplus->deleteLater();
    }
}

void KvStatisticsBaseTableWidget::updatePlacement()
{
    for (KvStatisticSubTable *subTable : qAsConst(m_subTables))
        place(subTable);
    emit displaySignals()->signalWidgetChanged();
}

void KvStatisticsBaseTableWidget::place(KvStatisticSubTable *subTable) const
{
    const KvTemplateContext *context = m_cfg->context();
    if (!context)
        return;
    const int usableWidth = context->usableWidth();
    const int percent = std::clamp(widthPercent(), 1, 100);
    const int tableWidth = static_cast<int>(static_cast<qint64>(usableWidth) * percent / 100);
    subTable->setPlacement(usableWidth, tableWidth, alignment());
}

void KvStatisticsBaseTableWidget::announceConfigChanged()
{
    emit displaySignals()->signalWidgetConfigChanged(m_cfg);
    if (KvTemplateContext *context = m_cfg->context())
        emit context->signalTemplateModified();
}

void KvStatisticsBaseTableWidget::changeTheme(int theme)
{
    m_cfg->setTheme(theme);
    announceChange(m_cfg->themeIndex(), m_announcedTheme);
}
