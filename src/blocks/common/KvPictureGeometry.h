// SPDX-License-Identifier: MIT
#pragma once

#include <QRect>
#include <QSize>

/**
 * Where and how large a picture stands in its block, in whole pixels.
 *
 * The room of a picture is the width between the page's margins and the height of a page's content. Damaged
 * files may ask for any width or rotation; no number leads out of the range of int.
 */
namespace KvPictureGeometry {

constexpr int PlaceholderPercent = 20; ///< width of what stands in for a missing picture
constexpr int MinimumHeight = 20;      ///< of a block, however flat its picture is

/** Size of a picture turned by \a degrees: width and height change places at 90 and 270. */
QSize turned(const QSize &picture, int degrees);

/** The largest size with the picture's proportions within a share of the room's width and all of its height;
 * small pictures are enlarged. Empty where there is no picture or no room. */
QSize fitted(const QSize &picture, const QSize &room, int widthPercent);

/** Size of the whole block. */
QSize blockSize(const QSize &picture, const QSize &room, int widthPercent);

/** The picture's place in its block: at the top; at the left, unless it is aligned otherwise. */
QRect placed(const QSize &picture, const QSize &room, int widthPercent, Qt::Alignment alignment);

} // namespace KvPictureGeometry
