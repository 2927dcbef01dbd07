// SPDX-License-Identifier: MIT
#include "blocks/table/KvBaseTableItemDelegate.h"

#include "blocks/table/KvStatisticsBaseTableWidgetModel.h"
#include "blocks/table/KvTableGrid.h"
#include "blocks/table/KvTextFit.h"
#include "charts/KvChartThemes.h"

#include <QAbstractItemView>
#include <QHelpEvent>
#include <QPainter>
#include <QTextDocument>
#include <QToolTip>

#include <algorithm>
#include <cmath>

namespace {

using kvCharts::KvChartThemes;

constexpr int kTextPadding = 6; // pixels left and right of the text
constexpr std::size_t kMostFonts = 4;

QColor validOr(const QColor &color, const QColor &fallback)
{
    // An invalid colour is a valid QVariant, and painting with it gives black.
    return color.isValid() ? color : fallback;
}

} // namespace

QRect KvBaseTableItemDelegate::Geometry::cellRect(int row, int column, int columnSpan) const
{
    const int left = columnEdges.at(column);
    const int right = columnEdges.at(std::min(column + columnSpan, columnEdges.size() - 1));
    // Without the grid line at the right and at the bottom.
    return QRect(left, rowTop(row), right - left - 1, rowHeight - 1);
}

KvBaseTableItemDelegate::KvBaseTableItemDelegate(const KvChartThemes *themes, QObject *parent)
    : QStyledItemDelegate(parent)
    , m_themes(themes)
{}

KvBaseTableItemDelegate::~KvBaseTableItemDelegate() = default;

const KvTextFit &KvBaseTableItemDelegate::textFit(const QFont &font) const
{
    for (const std::unique_ptr<KvTextFit> &fit : m_fits) {
        if (fit->font() == font)
            return *fit;
    }
    // A table has two fonts. More come only when they are replaced, and then the old ones are of no use.
    if (m_fits.size() >= kMostFonts)
        m_fits.clear();
    m_fits.push_back(std::make_unique<KvTextFit>(font));
    return *m_fits.back();
}

void KvBaseTableItemDelegate::paintText(QPainter *painter, const KvTextFit &fit, const QRect &cell,
                                        const QString &text) const
{
    const qreal width = cell.width() - 2 * kTextPadding;
    if (text.isEmpty() || width <= 0)
        return;
    // A painter's own direction is the program's; figures would stand behind their units.
    painter->setLayoutDirection(Qt::LeftToRight);
    const qreal baseline = cell.top() + (cell.height() - fit.height()) / 2 + fit.ascent();
    painter->drawText(QPointF(cell.left() + kTextPadding, baseline), fit.fitted(text, width));
}

void KvBaseTableItemDelegate::paint(QPainter *painter, const QStyleOptionViewItem &option,
                                    const QModelIndex &index) const
{
    const QColor background = qvariant_cast<QColor>(index.data(Qt::BackgroundRole));
    const QColor foreground = qvariant_cast<QColor>(index.data(Qt::ForegroundRole));
    const QVariant fontData = index.data(Qt::FontRole);
    const QFont font = fontData.isValid() ? qvariant_cast<QFont>(fontData) : option.font;
    painter->save();
    painter->fillRect(option.rect, validOr(background, m_themes->color(KvChartThemes::TableBackground)));
    painter->setFont(font);
    painter->setPen(validOr(foreground, m_themes->color(KvChartThemes::TableText)));
    paintText(painter, textFit(font), option.rect, index.data(Qt::DisplayRole).toString());
    painter->restore();
}

void KvBaseTableItemDelegate::paintRows(QPainter *painter, const KvStatisticsBaseTableWidgetModel &model,
                                        const Geometry &geometry, int first, int last) const
{
    if (geometry.columnEdges.size() < 2 || last < first)
        return;
    paintGrid(painter, geometry, first, last);
    paintTexts(painter, model, geometry, first, last);
}

void KvBaseTableItemDelegate::paintGrid(QPainter *painter, const Geometry &geometry, int first,
                                        int last) const
{
    const int left = geometry.columnEdges.first();
    const int right = geometry.columnEdges.last();
    const int top = geometry.rowTop(first);
    const int bottom = geometry.rowTop(last + 1);
    painter->fillRect(left, top, right - left, bottom - top, m_themes->color(KvChartThemes::TableBackground));

    QVector<QLine> lines;
    lines.reserve(last - first + geometry.columnEdges.size());
    for (int row = first; row <= last; ++row) {
        const int y = geometry.rowTop(row + 1) - 1;
        lines.append(QLine(left, y, right - 1, y));
    }
    for (int column = 1; column < geometry.columnEdges.size(); ++column) {
        const int x = geometry.columnEdges.at(column) - 1;
        lines.append(QLine(x, top, x, bottom - 1));
    }
    painter->setPen(m_themes->color(KvChartThemes::TableGridLine));
    painter->drawLines(lines);
}

void KvBaseTableItemDelegate::paintTexts(QPainter *painter, const KvStatisticsBaseTableWidgetModel &model,
                                         const Geometry &geometry, int first, int last) const
{
    const QColor themeText = m_themes->color(KvChartThemes::TableText);
    QColor pen;
    const KvTextFit *fit = nullptr;
    for (int row = first; row <= last; ++row) {
        const QFont &font = model.rowFont(row);
        if (!fit || fit->font() != font) {
            fit = &textFit(font);
            painter->setFont(font);
        }
        for (int column = 0; column + 1 < geometry.columnEdges.size(); ++column) {
            const KvTableCell *cell = model.cell(row, column);
            if (!cell)
                continue;
            // Only header cells cover the columns at their right.
            const int columnSpan = row < model.headerRowCount() ? cell->columnSpan : 1;
            const QColor color = validOr(cell->color, themeText);
            if (color != pen) {
                pen = color;
                painter->setPen(pen);
            }
            const QRect rect = geometry.cellRect(row, column, columnSpan);
            // Over the grid lines between the columns that the cell covers.
            if (columnSpan > 1)
                painter->fillRect(rect, m_themes->color(KvChartThemes::TableBackground));
            paintText(painter, *fit, rect, cell->text);
            column += columnSpan - 1;
        }
    }
}

int KvBaseTableItemDelegate::widthFor(const QString &text, const QFont &font, int width) const
{
    // The cell gives one pixel to the grid line.
    const int around = 2 * kTextPadding + 1;
    const qreal room = std::max(0, width - around);
    return static_cast<int>(std::ceil(textFit(font).widthFor(text, room))) + around;
}

bool KvBaseTableItemDelegate::isShortened(const QString &text, const QFont &font, int cellWidth) const
{
    return textFit(font).fitted(text, cellWidth - 2 * kTextPadding) != text;
}

bool KvBaseTableItemDelegate::helpEvent(QHelpEvent *event, QAbstractItemView *view,
                                        const QStyleOptionViewItem &option, const QModelIndex &index)
{
    if (event->type() != QEvent::ToolTip || !index.isValid())
        return QStyledItemDelegate::helpEvent(event, view, option, index);
    const QString text = index.data(Qt::DisplayRole).toString();
    const QFont font = qvariant_cast<QFont>(index.data(Qt::FontRole));
    if (isShortened(text, font, option.rect.width())) {
        // Names may look like markup; the tip shows them as they are.
        const QString tip =
            Qt::mightBeRichText(text) ? Qt::convertFromPlainText(text, Qt::WhiteSpaceNormal) : text;
        QToolTip::showText(event->globalPos(), tip, view);
    } else {
        QToolTip::hideText();
    }
    return true;
}
