// SPDX-License-Identifier: MIT
#include "KvDeskCellDelegate.h"

#include <QAbstractItemView>
#include <QApplication>
#include <QHelpEvent>
#include <QTextDocument>
#include <QToolTip>

namespace {

// The last word if it has a digit, with the blank before it; else the digits at the end.
int beginOfNumber(const QString &text)
{
    const int blank = text.lastIndexOf(QLatin1Char(' '));
    int begin = text.size();
    while (begin > 0 && text.at(begin - 1).isDigit())
        --begin;
    return blank > 0 && begin < text.size() && blank < begin ? blank : begin;
}

} // namespace

QString KvDeskCellDelegate::shortened(const QString &text, const QFontMetrics &metrics, int width,
                                      Qt::TextElideMode mode)
{
    if (metrics.horizontalAdvance(text) <= width)
        return text;
    const int begin = beginOfNumber(text);
    const QString number = text.mid(begin);
    const int room = width - metrics.horizontalAdvance(number);
    // A number that leaves no room for what it numbers is shortened like any text.
    if (number.isEmpty() || room < metrics.horizontalAdvance(QChar(0x2026)))
        return metrics.elidedText(text, number.isEmpty() ? mode : Qt::ElideMiddle, width);
    return metrics.elidedText(text.left(begin), Qt::ElideRight, room) + number;
}

QString KvDeskCellDelegate::shownText(const QStyleOptionViewItem &option, const QModelIndex &index) const
{
    QStyleOptionViewItem cell = option;
    initStyleOption(&cell, index);
    return cell.text;
}

void KvDeskCellDelegate::initStyleOption(QStyleOptionViewItem *option, const QModelIndex &index) const
{
    QStyledItemDelegate::initStyleOption(option, index);
    // Without a place it is asked how much the whole text takes.
    if (!option->rect.isValid())
        return;
    const QStyle *const style = option->widget ? option->widget->style() : QApplication::style();
    const int margin = style->pixelMetric(QStyle::PM_FocusFrameHMargin, option, option->widget) + 1;
    const int width =
        style->subElementRect(QStyle::SE_ItemViewItemText, option, option->widget).width() - 2 * margin;
    option->text = shortened(option->text, option->fontMetrics, width, m_elideMode);
}

bool KvDeskCellDelegate::isCut(const QStyleOptionViewItem &option, const QModelIndex &index) const
{
    return shownText(option, index) != displayText(index.data(), option.locale);
}

bool KvDeskCellDelegate::helpEvent(QHelpEvent *event, QAbstractItemView *view,
                                   const QStyleOptionViewItem &option, const QModelIndex &index)
{
    if (!event || event->type() != QEvent::ToolTip || !index.isValid() || !isCut(option, index))
        return QStyledItemDelegate::helpEvent(event, view, option, index);
    // A name that looks like markup is shown as it is.
    const QString text = index.data().toString();
    QToolTip::showText(event->globalPos(), Qt::mightBeRichText(text) ? Qt::convertFromPlainText(text) : text,
                       view, option.rect);
    return true;
}
