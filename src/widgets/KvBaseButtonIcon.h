// SPDX-License-Identifier: MIT
#pragma once

#include <QColor>
#include <QImage>
#include <QPushButton>
#include <QString>

/**
 * Push button that paints an SVG icon in one of four colours: normal, hovered, pressed (or checked) and
 * disabled.
 *
 * With a text, which stands beside the icon, the button has a fixed size: the text's width + 82 by 50 pixels.
 */
class KvBaseButtonIcon : public QPushButton
{
    Q_OBJECT
public:
    /** \a iconPath as for acss::getPathSVG(). */
    explicit KvBaseButtonIcon(const QString &iconPath, QWidget *parent = nullptr);

    QString iconPath() const { return m_iconPath; }
    void setIconPath(const QString &iconPath);

    /** Without colours of its own the icon takes those of the theme. */
    void setIconColors(const QColor &normal, const QColor &hovered, const QColor &pressed,
                       const QColor &disabled);

    /** Hides the base's: the text determines the size. */
    void setText(const QString &text);

    /**
     * The icon in a colour, as large as the icon size (its larger side) at the screen's resolution: every
     * pixel's red, green and blue are multiplied by the colour's component / 255, and the alpha stays.
     *
     * Black stays black when it is multiplied, so an icon that is drawn in nothing but black counts as drawn
     * in white.
     */
    QImage tintedIcon(const QColor &color) const;

protected:
    /** Fixed size while there is no text; an empty one leaves the size to the layout. */
    void setPlainSize(const QSize &size);

    void paintEvent(QPaintEvent *event) override;
    void changeEvent(QEvent *event) override;

private:
    int iconExtent() const;
    const QImage &currentIcon();
    QColor iconColor() const;
    QColor themeColor() const;
    QRect iconRect() const;
    void drawText(QPainter &painter) const;
    void updateSize();

    QString m_iconPath;
    QColor m_normal;
    QColor m_hovered;
    QColor m_pressed;
    QColor m_disabled;
    QSize m_plainSize;
    QImage m_image; ///< the icon as it was painted last
    QColor m_imageColor;
};
