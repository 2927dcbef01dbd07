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
    ThemedIconEngine(const QString &svgPath, const QSize &size);

    void paint(QPainter *painter, const QRect &rect, QIcon::Mode mode, QIcon::State state) override;
    QPixmap pixmap(const QSize &size, QIcon::Mode mode, QIcon::State state) override;
    QList<QSize> availableSizes(QIcon::Mode mode, QIcon::State state) const override;
    QString key() const override;
    QIconEngine *clone() const override;

    /** The colour of an icon in a state, with the opacity of the state as its alpha. */
    static QColor stateColor(QIcon::Mode mode, QIcon::State state);

private:
    QString m_svgPath;
    QSize m_size;
};

} // namespace acss
