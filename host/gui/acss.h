// SPDX-License-Identifier: MIT
#pragma once

#include "gui/ZtGuiGlobal.h"

#include <QIcon>
#include <QPixmap>
#include <QSize>
#include <QString>

/**
 * The application's style: icons here, themes in acss::QtAdvancedStylesheet. GUI thread only.
 *
 * Icons are SVG resources drawn in one colour, which is replaced by those of the theme. Only the coverage of
 * the drawing counts; its own colours do not show.
 *
 * Style mode 6 is that of tool icons: the theme's text colour; the colour "on-accent" where the icon is
 * checked (on) or selected; either at 40 % where it is disabled. Every other number is treated like 6.
 */
namespace acss {

/**
 * An icon in the current theme's colours, sharp at any size; null when there is no such icon, which is
 * reported to the status log once per icon. \param path as for getPathSVG() \param size the size that the
 * icon announces, in device-independent pixels
 */
ZT_GUI_EXPORT QIcon createIcon(int styleMode, const QString &path, const QSize &size);

/**
 * The icon's normal state as a pixmap of \a size device-independent pixels, centred with its proportions
 * kept.
 */
ZT_GUI_EXPORT QPixmap createPixmap(int styleMode, const QString &path, const QSize &size);

/**
 * The SVG file of an icon or an empty text. \a path is relative to an icon search path ("Icons/open" or
 * "Icons/open.svg"), or absolute.
 */
ZT_GUI_EXPORT QString getPathSVG(const QString &path);

/**
 * Adds a folder, usually of resources, that getPathSVG() searches after those it has; the first one is ":/".
 */
ZT_GUI_EXPORT void addIconSearchPath(const QString &folder);

} // namespace acss
