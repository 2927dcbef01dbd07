// SPDX-License-Identifier: MIT
#pragma once

#include <QColor>

class QPainter;
class QRect;

/** What widgets that paint themselves have in common with those that the style sheet paints. */
namespace KvThemePainting {

constexpr int Radius = 4; ///< of the corners of controls, pixels

/** A colour of the current theme by its name, see acss::QtAdvancedStylesheet::color(). */
QColor color(const char *name);

/** The ring around a control that has the keyboard. */
void drawFocusRing(QPainter &painter, const QRect &control, const QColor &color);

} // namespace KvThemePainting
