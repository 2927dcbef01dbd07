// SPDX-License-Identifier: MIT
#include "widgets/KvThemePainting.h"

#include "gui/QtAdvancedStylesheet.h"

#include <QPainter>

namespace {
constexpr qreal kRingWidth = 2;
}

QColor KvThemePainting::color(const char *name)
{
    return acss::QtAdvancedStylesheet::getInstance()->color(QLatin1String(name));
}

void KvThemePainting::drawFocusRing(QPainter &painter, const QRect &control, const QColor &color)
{
    constexpr qreal inset = kRingWidth / 2;
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(color, kRingWidth));
    painter.setBrush(Qt::NoBrush);
    painter.drawRoundedRect(QRectF(control).adjusted(inset, inset, -inset, -inset), Radius, Radius);
}
