// SPDX-License-Identifier: MIT
#pragma once

#include <QStyledItemDelegate>

/** Draws a picture of the gallery: the thumbnail with its name below, or a sign when it cannot be shown. */
class KvDeskGalleryDelegate : public QStyledItemDelegate
{
    Q_OBJECT
public:
    /** Space for one picture, margins included. */
    static constexpr QSize cell = QSize(144, 136);

    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter *painter, const QStyleOptionViewItem &option,
               const QModelIndex &index) const override;
    QSize sizeHint(const QStyleOptionViewItem &option, const QModelIndex &index) const override;

    /** A thumbnail in the size it is drawn in, sharp on screens of a device pixel ratio. */
    static QPixmap fitted(const QImage &thumbnail, double ratio);
};
