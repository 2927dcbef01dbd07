// SPDX-License-Identifier: MIT
#include "blocks/table/KvStatisticsTableView.h"

#include "blocks/table/KvStatisticsBaseTableWidgetModel.h"

#include <QHeaderView>
#include <QPaintEvent>
#include <QPainter>

#include <algorithm>

namespace {

void setUpHeader(QHeaderView *header)
{
    header->setVisible(false);
    header->setMinimumSectionSize(0);
    header->setSectionResizeMode(QHeaderView::Fixed);
    header->setHighlightSections(false);
}

} // namespace

KvStatisticsTableView::KvStatisticsTableView(KvStatisticsBaseTableWidgetModel *model,
                                             KvBaseTableItemDelegate *delegate, QWidget *parent)
    : QTableView(parent)
    , m_model(model)
    , m_delegate(delegate)
{
    setUpHeader(horizontalHeader());
    setUpHeader(verticalHeader());
    setItemDelegate(delegate);
    setCornerButtonEnabled(false);
    // The style sheet asks for no border, too, but Qt drops its rule while "{{Font}}" stands in it.
    setFrameShape(QFrame::NoFrame);
    setSelectionMode(QAbstractItemView::NoSelection);
    setEditTriggers(QAbstractItemView::NoEditTriggers);
    setFocusPolicy(Qt::NoFocus);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setModel(model);
}

void KvStatisticsTableView::shareWidth()
{
    const QVector<int> edges = m_model->columnEdges(0, viewport()->width());
    for (int column = 0; column + 1 < edges.size(); ++column)
        horizontalHeader()->resizeSection(column, edges.at(column + 1) - edges.at(column));
}

KvBaseTableItemDelegate::Geometry KvStatisticsTableView::cellGeometry() const
{
    KvBaseTableItemDelegate::Geometry geometry;
    geometry.rowHeight = verticalHeader()->defaultSectionSize();
    geometry.top = -verticalOffset();
    const int columns = m_model->columnCount();
    geometry.columnEdges.reserve(columns + 1);
    for (int column = 0; column < columns; ++column)
        geometry.columnEdges.append(columnViewportPosition(column));
    if (columns > 0)
        geometry.columnEdges.append(geometry.columnEdges.last() + columnWidth(columns - 1));
    return geometry;
}

void KvStatisticsTableView::paintEvent(QPaintEvent *event)
{
    const KvBaseTableItemDelegate::Geometry geometry = cellGeometry();
    if (geometry.rowHeight <= 0)
        return;
    const QRect exposed = event->rect();
    const int first = std::max(0, (exposed.top() - geometry.top) / geometry.rowHeight);
    const int last =
        std::min(m_model->rowCount() - 1, (exposed.bottom() - geometry.top) / geometry.rowHeight);
    QPainter painter(viewport());
    m_delegate->paintRows(&painter, *m_model, geometry, first, last);
}

void KvStatisticsTableView::resizeEvent(QResizeEvent *event)
{
    QTableView::resizeEvent(event);
    shareWidth();
}
