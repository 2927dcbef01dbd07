// SPDX-License-Identifier: MIT
#include "blocks/table/KvStatisticSubTable.h"

#include "blocks/table/KvBaseTableItemDelegate.h"
#include "blocks/table/KvStatisticsBaseTableWidgetModel.h"
#include "blocks/table/KvStatisticsTableView.h"
#include "blocks/table/KvTableContents.h"
#include "blocks/table/KvTablePageSplit.h"
#include "templates/KvStatisticsThemedNodeCfg.h"

#include <QHeaderView>
#include <QPainter>
#include <QStyle>

#include <algorithm>

KvStatisticSubTable::KvStatisticSubTable(KvStatisticsThemedNodeCfg *cfg, KvBaseTableItemDelegate *delegate,
                                         QWidget *parent)
    : QWidget(parent)
    , m_cfg(cfg)
    , m_model(new KvStatisticsBaseTableWidgetModel(this))
    , m_delegate(delegate)
{
    // A report page reads from left to right whatever the language of the program around it.
    setLayoutDirection(Qt::LeftToRight);
    // Until there is a view, all of the piece is painted here.
    setAttribute(Qt::WA_OpaquePaintEvent);
}

void KvStatisticSubTable::ensureView()
{
    if (m_view)
        return;
    setAttribute(Qt::WA_OpaquePaintEvent, false);
    m_view = new KvStatisticsTableView(m_model, m_delegate, this);
    // A page grants a piece all of its height; a window without pages does not.
    if (!m_cfg->context())
        m_view->setVerticalScrollBarPolicy(Qt::ScrollBarAsNeeded);
    const int rowHeight = std::exchange(m_rowHeight, 0);
    setRowHeight(rowHeight);
    applyStyle();
    applySpans();
    placeView();
    m_view->show();
}

KvStatisticSubTable::~KvStatisticSubTable() = default;

QTableView *KvStatisticSubTable::tableView() const
{
    return m_view;
}

void KvStatisticSubTable::fill(const std::shared_ptr<const KvTableContents> &contents, int firstBodyRow,
                               int bodyRows)
{
    setRowHeight(KvTablePageSplit::RowHeight);
    if (m_view)
        m_view->clearSpans();
    m_model->setPart(contents, firstBodyRow, bodyRows);
    applySpans();
    if (m_view)
        m_view->shareWidth();
    applyStyle();
}

void KvStatisticSubTable::applySpans()
{
    for (int row = 0; m_model->hasHeaderSpans() && row < m_model->headerRowCount(); ++row) {
        for (int column = 0; column < m_model->columnCount(); ++column) {
            if (const KvTableCell *cell = m_model->cell(row, column))
                setSpan(row, column, 1, cell->columnSpan);
        }
    }
}

void KvStatisticSubTable::clear()
{
    if (m_view)
        m_view->clearSpans();
    m_model->clear();
}

void KvStatisticSubTable::setRowHeight(int height)
{
    if (height == m_rowHeight)
        return;
    m_rowHeight = height;
    if (!m_view)
        return;
    QHeaderView *header = m_view->verticalHeader();
    header->setVisible(false);
    header->setSectionResizeMode(QHeaderView::Fixed);
    header->setDefaultSectionSize(height);
}

void KvStatisticSubTable::setSpan(int row, int column, int rowSpan, int columnSpan)
{
    if (m_view && (rowSpan > 1 || columnSpan >= 2))
        m_view->setSpan(row, column, rowSpan, columnSpan);
}

void KvStatisticSubTable::applyStyle()
{
    if (!m_view)
        return;
    // "{{Font}}" is for the host's style engine to replace; Qt drops the rule while it stands.
    const QString sheet =
        QStringLiteral("QTableView { border: none; background: transparent; gridline-color: %1; "
                       "font: 12px {{Font}}; }")
            .arg(m_cfg->themes()->color(kvCharts::KvChartThemes::TableGridLine).name());
    if (m_view->styleSheet() == sheet)
        return;
    m_view->setStyleSheet(sheet);
    m_view->style()->polish(m_view);
}

void KvStatisticSubTable::setPlacement(int pageWidth, int tableWidth, Qt::Alignment alignment)
{
    m_tableWidth = tableWidth;
    m_alignment = alignment;
    const QSize size(std::max(pageWidth, 0), contentsHeight());
    if (minimumSize() != size || maximumSize() != size)
        setFixedSize(size);
    placeView();
}

int KvStatisticSubTable::contentsHeight() const
{
    return m_model->rowCount() * KvTablePageSplit::RowHeight + KvTablePageSplit::Padding;
}

QSize KvStatisticSubTable::sizeHint() const
{
    return QSize(width(), contentsHeight());
}

QSize KvStatisticSubTable::minimumSizeHint() const
{
    return QSize(0, 0);
}

void KvStatisticSubTable::resizeEvent(QResizeEvent *event)
{
    QWidget::resizeEvent(event);
    placeView();
}

QRect KvStatisticSubTable::tableRect() const
{
    const int tableWidth = m_tableWidth < 0 ? width() : std::min(m_tableWidth, width());
    int left = 0;
    if (m_alignment & Qt::AlignHCenter)
        left = (width() - tableWidth) / 2;
    else if (m_alignment & Qt::AlignRight)
        left = width() - tableWidth;
    const int padding = KvTablePageSplit::Padding / 2;
    return QRect(left, padding, tableWidth, std::max(height() - 2 * padding, 0));
}

void KvStatisticSubTable::placeView()
{
    if (m_view)
        m_view->setGeometry(tableRect());
}

void KvStatisticSubTable::paintEvent(QPaintEvent *event)
{
    if (m_view)
        return;
    Q_UNUSED(event)
    QPainter painter(this);
    // On a PDF the clip of the widget painted before this one (a header's text, say) would go on hiding this
    // one.
    painter.setClipRect(rect());
    painter.fillRect(rect(), Qt::white);
    const QRect table = tableRect();
    KvBaseTableItemDelegate::Geometry geometry;
    geometry.top = table.top();
    geometry.rowHeight = m_rowHeight;
    geometry.columnEdges = m_model->columnEdges(table.left(), table.width());
    m_delegate->paintRows(&painter, *m_model, geometry, 0, m_model->rowCount() - 1);
}
