// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskCellDelegate.h"

/** Draws a measured value: the number right-aligned, and behind it its unit in the muted colour, aligned as
 * well. */
class KvDeskValueDelegate : public KvDeskCellDelegate
{
    Q_OBJECT
public:
    using KvDeskCellDelegate::KvDeskCellDelegate;

    /** Room for the unit, in pixels. */
    void setUnitWidth(int width) { m_unitWidth = width; }
    int unitWidth() const { return m_unitWidth; }
    /** Width of a cell whose number takes \a numberWidth pixels. */
    int widthFor(int numberWidth) const;

    void paint(QPainter *painter, const QStyleOptionViewItem &option,
               const QModelIndex &index) const override;
    QSize sizeHint(const QStyleOptionViewItem &option, const QModelIndex &index) const override;

protected:
    bool isCut(const QStyleOptionViewItem &option, const QModelIndex &index) const override;

private:
    QRect numberRect(const QRect &cell) const;
    QRect unitRect(const QRect &cell) const;
    void drawTexts(QPainter *painter, const QStyleOptionViewItem &option, const QString &text) const;

    int m_unitWidth = 0;
};
