// SPDX-License-Identifier: MIT
#pragma once

#include <QColor>
#include <QIconEngine>
#include <QSize>
#include <QString>

namespace acss {

/** Draws an SVG file in the colours that the theme has at the time of drawing. */
class ThemedIconEngine final : public QIconEngine
{
public:
    /** \a colorToken names the colour of the theme in which the icon is drawn while it is neither on nor
     * selected. */
    ThemedIconEngine(const QString &svgPath, const QSize &size,
                     const QString &colorToken = QStringLiteral("text"));

    void paint(QPainter *painter, const QRect &rect, QIcon::Mode mode, QIcon::State state) override;
    QPixmap pixmap(const QSize &size, QIcon::Mode mode, QIcon::State state) override;
    QList<QSize> availableSizes(QIcon::Mode mode, QIcon::State state) const override;
    QString key() const override;
    QIconEngine *clone() const override;

private:
    QColor stateColor(QIcon::Mode mode, QIcon::State state) const;

    QString m_svgPath;
    QSize m_size;
    QString m_colorToken;
};

} // namespace acss
