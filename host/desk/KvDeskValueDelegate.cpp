// SPDX-License-Identifier: MIT
#include "KvDeskValueDelegate.h"

#include "KvDeskValueTableModel.h"
#include "gui/QtAdvancedStylesheet.h"

#include <QApplication>
#include <QPainter>

namespace {

constexpr int padding = 8;     ///< pixels at both ends of the cell
constexpr int unitSpacing = 4; ///< pixels between number and unit

} // namespace

void KvDeskValueDelegate::paint(QPainter *painter, const QStyleOptionViewItem &option,
                                const QModelIndex &index) const
{
    QStyleOptionViewItem cell = option;
    initStyleOption(&cell, index);
    const QString text = index.data().toString();
    cell.text.clear();
    const QStyle *const style = cell.widget ? cell.widget->style() : QApplication::style();
    style->drawControl(QStyle::CE_ItemViewItem, &cell, painter, cell.widget);
    drawTexts(painter, cell, text);
}

QRect KvDeskValueDelegate::unitRect(const QRect &cell) const
{
    QRect unit = cell.adjusted(padding, 0, -padding, 0);
    unit.setLeft(unit.right() + 1 - m_unitWidth);
    return unit;
}

QRect KvDeskValueDelegate::numberRect(const QRect &cell) const
{
    QRect number = cell.adjusted(padding, 0, -padding, 0);
    number.setRight(unitRect(cell).left() - 1 - (m_unitWidth > 0 ? unitSpacing : 0));
    return number;
}

bool KvDeskValueDelegate::isCut(const QStyleOptionViewItem &option, const QModelIndex &index) const
{
    const QString text = index.data().toString();
    const QFontMetrics metrics(option.font);
    const auto isWider = [&metrics](const QString &part, const QRect &place) {
        return metrics.horizontalAdvance(part) > place.width();
    };
    return isWider(KvDeskValueTableModel::numberOf(text), numberRect(option.rect)) ||
           isWider(KvDeskValueTableModel::unitOf(text), unitRect(option.rect));
}

void KvDeskValueDelegate::drawTexts(QPainter *painter, const QStyleOptionViewItem &option,
                                    const QString &text) const
{
    const bool isSelected = option.state & QStyle::State_Selected;
    const QColor normal = option.palette.color(isSelected ? QPalette::HighlightedText : QPalette::Text);
    const QColor muted = acss::QtAdvancedStylesheet::getInstance()->color(QStringLiteral("muted"));
    // Number and unit read from left to right in every language.
    const QRect unit = unitRect(option.rect);
    const QRect number = numberRect(option.rect);
    const QFontMetrics metrics(option.font);
    painter->save();
    painter->setFont(option.font);
    painter->setLayoutDirection(Qt::LeftToRight);
    painter->setPen(normal);
    painter->drawText(
        number, Qt::AlignRight | Qt::AlignVCenter,
        metrics.elidedText(KvDeskValueTableModel::numberOf(text), Qt::ElideRight, number.width()));
    painter->setPen(isSelected ? normal : muted);
    painter->drawText(unit, Qt::AlignLeft | Qt::AlignVCenter,
                      metrics.elidedText(KvDeskValueTableModel::unitOf(text), Qt::ElideRight, unit.width()));
    painter->restore();
}

int KvDeskValueDelegate::widthFor(int numberWidth) const
{
    return numberWidth + (m_unitWidth > 0 ? unitSpacing + m_unitWidth : 0) + 2 * padding;
}

QSize KvDeskValueDelegate::sizeHint(const QStyleOptionViewItem &option, const QModelIndex &index) const
{
    const QString number = KvDeskValueTableModel::numberOf(index.data().toString());
    return QSize(widthFor(QFontMetrics(option.font).horizontalAdvance(number)),
                 QStyledItemDelegate::sizeHint(option, index).height());
}
