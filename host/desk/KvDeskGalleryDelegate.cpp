// SPDX-License-Identifier: MIT
#include "KvDeskGalleryDelegate.h"

#include "KvDeskGalleryModel.h"
#include "gui/QtAdvancedStylesheet.h"
#include "gui/acss.h"
#include "kernel/ZtLeftToRight.h"

#include <QFileInfo>
#include <QPainter>
#include <QPixmapCache>

namespace {

constexpr int gap = 4;      ///< between neighbours, half of it on either side
constexpr int padding = 4;  ///< between the border of the card and what is in it
constexpr int picture = 96; ///< height of the space for the thumbnail
constexpr int radius = 4;
constexpr int fontPixelSize = 12;
constexpr double ring = 2.0; ///< width of the ring around what has the keyboard
constexpr QSize signSize(32, 32);

QColor color(const char *token)
{
    return acss::QtAdvancedStylesheet::getInstance()->color(QLatin1String(token));
}

QRect cardRect(const QRect &cell)
{
    return cell.adjusted(gap / 2, gap / 2, -gap / 2, -gap / 2);
}

QRect pictureRect(const QRect &card)
{
    return QRect(card.left() + padding, card.top() + padding, card.width() - 2 * padding, picture);
}

void drawCard(QPainter *painter, const QRectF &card, const QStyle::State &state)
{
    const bool isSelected = state & QStyle::State_Selected;
    const bool isHovered = state & QStyle::State_MouseOver;
    if (isSelected || isHovered) {
        painter->setPen(Qt::NoPen);
        painter->setBrush(color(isSelected ? "accent" : "raised-hover"));
        painter->drawRoundedRect(card, radius, radius);
    }
    if (state & QStyle::State_HasFocus) {
        painter->setPen(QPen(color(isSelected ? "text" : "accent"), ring));
        painter->setBrush(Qt::NoBrush);
        painter->drawRoundedRect(card.adjusted(ring / 2, ring / 2, -ring / 2, -ring / 2), radius, radius);
    }
}

QRect centred(const QSize &size, const QRect &space)
{
    QRect rect(QPoint(), size);
    rect.moveCenter(space.center());
    return rect;
}

void drawSign(QPainter *painter, const QRect &space, const QModelIndex &index, bool isSelected)
{
    const bool isBroken = !index.data(KvDeskGalleryModel::FaultRole).toString().isEmpty();
    const QIcon icon = acss::createIcon(
        6, isBroken ? QStringLiteral("Icons/status-warning") : QStringLiteral("Icons/gallery"), signSize);
    // A picture that is still loaded is not there yet.
    const QIcon::Mode mode = isBroken ? QIcon::Normal : QIcon::Disabled;
    icon.paint(painter, centred(signSize, space), Qt::AlignCenter, mode, isSelected ? QIcon::On : QIcon::Off);
}

} // namespace

QPixmap KvDeskGalleryDelegate::fitted(const QImage &thumbnail, double ratio)
{
    // Painted over and over while the user scrolls.
    const QString key = QStringLiteral("KvDeskGallery %1 %2").arg(thumbnail.cacheKey()).arg(ratio);
    QPixmap pixmap;
    if (QPixmapCache::find(key, &pixmap))
        return pixmap;
    const QSize space = pictureRect(cardRect(QRect(QPoint(), cell))).size() * ratio;
    const bool isLarger = thumbnail.width() > space.width() || thumbnail.height() > space.height();
    pixmap = QPixmap::fromImage(
        isLarger ? thumbnail.scaled(space, Qt::KeepAspectRatio, Qt::SmoothTransformation) : thumbnail);
    pixmap.setDevicePixelRatio(ratio);
    QPixmapCache::insert(key, pixmap);
    return pixmap;
}

void KvDeskGalleryDelegate::paint(QPainter *painter, const QStyleOptionViewItem &option,
                                  const QModelIndex &index) const
{
    painter->save();
    painter->setRenderHint(QPainter::Antialiasing);
    const QRect card = cardRect(option.rect);
    const QRect space = pictureRect(card);
    const bool isSelected = option.state & QStyle::State_Selected;
    drawCard(painter, card, option.state);

    const auto image = index.data(KvDeskGalleryModel::ThumbnailRole).value<QImage>();
    if (image.isNull()) {
        drawSign(painter, space, index, isSelected);
    } else {
        const QPixmap pixmap = fitted(image, painter->device()->devicePixelRatioF());
        painter->drawPixmap(centred(pixmap.size() / pixmap.devicePixelRatio(), space), pixmap);
    }

    QFont font = option.font;
    font.setPixelSize(fontPixelSize);
    painter->setFont(font);
    const QRect text(space.left(), space.bottom() + 1 + padding, space.width(),
                     card.bottom() - space.bottom() - 2 * padding);
    painter->setPen(color(isSelected ? "on-accent" : image.isNull() ? "muted" : "text"));
    // Without the suffix there is room for the time that snapshots are named after.
    const QString name = QFileInfo(index.data().toString()).completeBaseName();
    painter->drawText(
        text, Qt::AlignCenter | Qt::TextSingleLine,
        ZtLeftToRight::isolated(QFontMetrics(font).elidedText(name, Qt::ElideMiddle, text.width())));
    painter->restore();
}

QSize KvDeskGalleryDelegate::sizeHint(const QStyleOptionViewItem &option, const QModelIndex &index) const
{
    Q_UNUSED(option)
    Q_UNUSED(index)
    return cell;
}
