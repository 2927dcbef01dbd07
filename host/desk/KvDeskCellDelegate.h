// SPDX-License-Identifier: MIT
#pragma once

#include <QStyledItemDelegate>

/**
 * Draws texts of a table. One that is too long for its cell is shortened before the number at its end, which
 * tells it from others, or without one as setElideMode() says; the tool tip then has all of it.
 */
class KvDeskCellDelegate : public QStyledItemDelegate
{
    Q_OBJECT
public:
    using QStyledItemDelegate::QStyledItemDelegate;

    /** The text of a cell as it is shown in the place that \a option gives it. */
    QString shownText(const QStyleOptionViewItem &option, const QModelIndex &index) const;
    /** A text in so many pixels. */
    static QString shortened(const QString &text, const QFontMetrics &metrics, int width,
                             Qt::TextElideMode mode = Qt::ElideRight);
    /** Where texts without a number at their end are shortened; at first at the end. */
    void setElideMode(Qt::TextElideMode mode) { m_elideMode = mode; }

    bool helpEvent(QHelpEvent *event, QAbstractItemView *view, const QStyleOptionViewItem &option,
                   const QModelIndex &index) override;

protected:
    void initStyleOption(QStyleOptionViewItem *option, const QModelIndex &index) const override;
    /** Whether not all of the cell's text is shown. */
    virtual bool isCut(const QStyleOptionViewItem &option, const QModelIndex &index) const;

private:
    Qt::TextElideMode m_elideMode = Qt::ElideRight;
};
