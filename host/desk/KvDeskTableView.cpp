// SPDX-License-Identifier: MIT
#include "KvDeskTableView.h"

#include <QAction>
#include <QClipboard>
#include <QGuiApplication>
#include <QHeaderView>

#include <algorithm>

namespace {

constexpr int tableRowHeight = 24;
constexpr int fontPixelSize = 12;

} // namespace

KvDeskTableView::KvDeskTableView(QWidget *parent)
    : QTableView(parent)
{
    QFont small = font();
    small.setPixelSize(fontPixelSize);
    setFont(small);
    setProperty("panel", true);
    setFrameShape(QFrame::NoFrame);
    setShowGrid(false);
    setSelectionBehavior(SelectRows);
    setSelectionMode(ExtendedSelection);
    setEditTriggers(NoEditTriggers);
    setWordWrap(false);
    setTabKeyNavigation(false);
    setHorizontalScrollMode(ScrollPerPixel);
    setCornerButtonEnabled(false);
    verticalHeader()->hide();
    verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    verticalHeader()->setDefaultSectionSize(tableRowHeight);
    horizontalHeader()->setHighlightSections(false);
    horizontalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);

    auto *const copy = new QAction(tr("Copy"), this);
    copy->setShortcut(QKeySequence::Copy);
    copy->setShortcutContext(Qt::WidgetShortcut);
    connect(copy, SIGNAL(triggered()), this, SLOT(slotCopy()));
    addAction(copy);
    setContextMenuPolicy(Qt::ActionsContextMenu);
}

QString KvDeskTableView::selectedText() const
{
    if (!selectionModel())
        return QString();
    QVector<int> rows;
    for (const QModelIndex &index : selectionModel()->selectedRows())
        rows.append(index.row());
    std::sort(rows.begin(), rows.end());
    QString text;
    for (const int row : qAsConst(rows))
        text += rowText(row) + QLatin1Char('\n');
    return text;
}

QString KvDeskTableView::rowText(int row) const
{
    QStringList fields;
    for (int column = 0; column < model()->columnCount(); ++column)
        fields.append(model()->index(row, column).data().toString());
    return fields.join(QLatin1Char('\t'));
}

void KvDeskTableView::slotCopy()
{
    const QString text = selectedText();
    if (!text.isEmpty())
        QGuiApplication::clipboard()->setText(text);
}
