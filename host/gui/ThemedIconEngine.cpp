// SPDX-License-Identifier: MIT
#include "gui/ThemedIconEngine.h"

#include "gui/QtAdvancedStylesheet.h"

#include <QPainter>
#include <QPixmapCache>
#include <QSvgRenderer>

namespace acss {

namespace {

constexpr qreal disabledOpacity = 0.4;

QPixmap renderTinted(const QString &svgPath, const QSize &size, const QColor &color)
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QSvgRenderer renderer(svgPath);
    renderer.setAspectRatioMode(Qt::KeepAspectRatio);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    renderer.render(&painter);
    painter.resetTransform();
    painter.setCompositionMode(QPainter::CompositionMode_SourceIn);
    painter.fillRect(image.rect(), color);
    painter.end();
    return QPixmap::fromImage(image);
}

QString cacheKey(const QString &svgPath, const QSize &size, const QColor &color)
{
    return QStringLiteral("acss|%1|%2x%3|%4")
        .arg(svgPath, QString::number(size.width()), QString::number(size.height()),
             color.name(QColor::HexArgb));
}

} // namespace

ThemedIconEngine::ThemedIconEngine(const QString &svgPath, const QSize &size, const QString &colorToken)
    : m_svgPath(svgPath)
    , m_size(size)
    , m_colorToken(colorToken)
{}

void ThemedIconEngine::paint(QPainter *painter, const QRect &rect, QIcon::Mode mode, QIcon::State state)
{
    const qreal ratio = painter->device()->devicePixelRatioF();
    painter->drawPixmap(rect, pixmap((QSizeF(rect.size()) * ratio).toSize(), mode, state));
}

QPixmap ThemedIconEngine::pixmap(const QSize &size, QIcon::Mode mode, QIcon::State state)
{
    if (size.isEmpty())
        return QPixmap();

    const QColor color = stateColor(mode, state);
    const QString key = cacheKey(m_svgPath, size, color);
    QPixmap pixmap;
    if (!QPixmapCache::find(key, &pixmap)) {
        pixmap = renderTinted(m_svgPath, size, color);
        QPixmapCache::insert(key, pixmap);
    }
    return pixmap;
}

QList<QSize> ThemedIconEngine::availableSizes(QIcon::Mode mode, QIcon::State state) const
{
    Q_UNUSED(mode)
    Q_UNUSED(state)
    return m_size.isEmpty() ? QList<QSize>() : QList<QSize>{m_size};
}

QString ThemedIconEngine::key() const
{
    return QStringLiteral("acss");
}

QIconEngine *ThemedIconEngine::clone() const
{
    return new ThemedIconEngine(*this);
}

/// With the opacity of the state as its alpha.
QColor ThemedIconEngine::stateColor(QIcon::Mode mode, QIcon::State state) const
{
    const bool onAccent = state == QIcon::On || mode == QIcon::Selected;
    const QString token = onAccent ? QStringLiteral("on-accent") : m_colorToken;
    QColor color = QtAdvancedStylesheet::getInstance()->color(token);
    if (mode == QIcon::Disabled)
        color.setAlphaF(disabledOpacity);
    return color;
}

} // namespace acss
