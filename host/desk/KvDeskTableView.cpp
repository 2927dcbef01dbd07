// SPDX-License-Identifier: MIT
#include "KvDeskTableView.h"

#include "kernel/ZtLeftToRight.h"

#include <QAction>
#include <QClipboard>
#include <QGuiApplication>
#include <QHeaderView>
#include <QMimeData>

#include <algorithm>

namespace {

constexpr int tableRowHeight = 24;
constexpr int fontPixelSize = 12;

QString htmlRow(const QStringList &texts, const QString &tag)
{
    QString html = QStringLiteral("<tr>");
    for (const QString &text : texts)
        html += QLatin1Char('<') + tag + QLatin1Char('>') + text.toHtmlEscaped() + QStringLiteral("</") +
                tag + QLatin1Char('>');
    return html + QStringLiteral("</tr>\n");
}

// A tabulator or line end in a text would break the table.
QString textRow(const QStringList &texts)
{
    QStringList fields;
    for (const QString &text : texts)
        fields.append(text.simplified());
    return fields.join(QLatin1Char('\t')) + QLatin1Char('\n');
}

} // namespace

KvDeskTableView::KvDeskTableView(QWidget *parent)
    : QTableView(parent)
    , m_copy(new QAction(tr("Copy"), this))
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

    m_copy->setShortcut(QKeySequence::Copy);
    m_copy->setShortcutContext(Qt::WidgetShortcut);
    connect(m_copy, SIGNAL(triggered()), this, SLOT(slotCopy()));
    addAction(m_copy);
    setContextMenuPolicy(Qt::ActionsContextMenu);
}

// Asking the selection model for its rows would take time for every pair of selected ranges.
QVector<int> KvDeskTableView::selectedRows() const
{
    QVector<int> rows;
    if (!selectionModel())
        return rows;
    for (const QItemSelectionRange &range : selectionModel()->selection()) {
        for (int row = range.top(); row <= range.bottom(); ++row)
            rows.append(row);
    }
    std::sort(rows.begin(), rows.end());
    rows.erase(std::unique(rows.begin(), rows.end()), rows.end());
    return rows;
}

QString KvDeskTableView::selectedText() const
{
    QString text;
    for (const int row : selectedRows())
        text += textRow(rowTexts(row));
    return text;
}

std::unique_ptr<QMimeData> KvDeskTableView::selectedData() const
{
    const QVector<int> rows = selectedRows();
    if (rows.isEmpty())
        return nullptr;
    QString text;
    QString html = QStringLiteral("<table>\n");
    if (m_copiesHeadings) {
        text += textRow(headings());
        html += htmlRow(headings(), QStringLiteral("th"));
    }
    for (const int row : rows) {
        const QStringList texts = rowTexts(row);
        text += textRow(texts);
        html += htmlRow(texts, QStringLiteral("td"));
    }
    auto copied = std::make_unique<QMimeData>();
    copied->setText(text);
    copied->setHtml(html + QStringLiteral("</table>\n"));
    return copied;
}

QStringList KvDeskTableView::rowTexts(int row) const
{
    QStringList fields;
    for (int column = 0; column < model()->columnCount(); ++column) {
        const QModelIndex index = model()->index(row, column);
        const QVariant copied = index.data(CopyRole);
        fields.append(ZtLeftToRight::plain((copied.isValid() ? copied : index.data()).toString()));
    }
    return fields;
}

QStringList KvDeskTableView::headings() const
{
    QStringList fields;
    for (int column = 0; column < model()->columnCount(); ++column)
        fields.append(model()->headerData(column, Qt::Horizontal).toString());
    return fields;
}

void KvDeskTableView::slotCopy()
{
    if (std::unique_ptr<QMimeData> copied = selectedData())
        QGuiApplication::clipboard()->setMimeData(copied.release());
}
