// SPDX-License-Identifier: MIT
#include "widgets/KvBaseButtonIcon.h"

#include "gui/QtAdvancedStylesheet.h"
#include "gui/acss.h"
#include "resources/KvReportResources.h"
#include "widgets/KvThemePainting.h"

#include <QEvent>
#include <QPainter>
#include <QStyleOptionButton>
#include <QSvgRenderer>

#include <algorithm>

namespace {

constexpr int kIconExtent = 24;
constexpr int kTextButtonHeight = 50;
constexpr int kTextButtonExtraWidth = 82; // icon, gap and margins
constexpr int kTextGap = 12;
constexpr int kTextMargin = (kTextButtonExtraWidth - kIconExtent - kTextGap) / 2;
constexpr int kDisabledPercent = 40;

int mixed(int front, int back)
{
    return (front * kDisabledPercent + back * (100 - kDisabledPercent)) / 100;
}

/// The colour at the opacity of disabled controls over the window; the tint itself knows no opacity.
QColor dimmed(const QColor &color)
{
    const QColor back = KvThemePainting::color("window");
    return QColor(mixed(color.red(), back.red()), mixed(color.green(), back.green()),
                  mixed(color.blue(), back.blue()));
}

bool isAllBlack(const QImage &image)
{
    for (int y = 0; y < image.height(); ++y) {
        const auto *line = reinterpret_cast<const QRgb *>(image.constScanLine(y));
        if (std::any_of(line, line + image.width(), [](QRgb pixel) { return (pixel & RGB_MASK) != 0; }))
            return false;
    }
    return true;
}

QImage renderSvg(const QString &svgPath, int extent)
{
    QImage image(extent, extent, QImage::Format_ARGB32);
    image.fill(Qt::transparent);
    if (svgPath.isEmpty())
        return image;
    QSvgRenderer renderer(svgPath);
    renderer.setAspectRatioMode(Qt::KeepAspectRatio);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    renderer.render(&painter);
    return image;
}

void multiply(QImage &image, const QColor &color)
{
    const bool asWhite = isAllBlack(image);
    const auto product = [asWhite](int component, int factor) {
        return (asWhite ? 255 : component) * factor / 255;
    };
    for (int y = 0; y < image.height(); ++y) {
        auto *line = reinterpret_cast<QRgb *>(image.scanLine(y));
        std::transform(line, line + image.width(), line, [&](QRgb pixel) {
            return qRgba(product(qRed(pixel), color.red()), product(qGreen(pixel), color.green()),
                         product(qBlue(pixel), color.blue()), qAlpha(pixel));
        });
    }
}

} // namespace

KvBaseButtonIcon::KvBaseButtonIcon(const QString &iconPath, QWidget *parent)
    : QPushButton(parent)
    , m_iconPath(iconPath)
{
    KvReportResources::ensure();
    setAttribute(Qt::WA_Hover);
    setIconSize(QSize(kIconExtent, kIconExtent));
    // Colours are looked up when they are painted.
    connect(acss::QtAdvancedStylesheet::getInstance(), SIGNAL(currentThemeChanged(QString)), this,
                                                              SLOT(update()));
}

void KvBaseButtonIcon::setIconPath(const QString &iconPath)
{
    if (iconPath == m_iconPath)
        return;
    m_iconPath = iconPath;
    m_image = QImage();
    update();
}

void KvBaseButtonIcon::setIconColors(const QColor &normal, const QColor &hovered, const QColor &pressed,
                                     const QColor &disabled)
{
    m_normal = normal;
    m_hovered = hovered;
    m_pressed = pressed;
    m_disabled = disabled;
    update();
}

void KvBaseButtonIcon::setText(const QString &text)
{
    QPushButton::setText(text);
    updateSize();
}

void KvBaseButtonIcon::setPlainSize(const QSize &size)
{
    m_plainSize = size;
    updateSize();
}

void KvBaseButtonIcon::updateSize()
{
    QSize size = m_plainSize;
    if (!text().isEmpty())
        size = QSize(fontMetrics().horizontalAdvance(text()) + kTextButtonExtraWidth, kTextButtonHeight);
    if (size.isEmpty())
        return;
    if (size == minimumSize() && size == maximumSize())
        return;
    setFixedSize(size);
    // The application's style sheet has sizes and borders for push buttons, which would come on top.
    setStyleSheet(QStringLiteral("KvBaseButtonIcon { border: none; padding: 0px; min-width: %1px; "
                                 "max-width: %1px; min-height: %2px; max-height: %2px; }")
                      .arg(size.width())
                      .arg(size.height()));
}

QImage KvBaseButtonIcon::tintedIcon(const QColor &color) const
{
    const qreal ratio = devicePixelRatioF();
    QImage image = renderSvg(acss::getPathSVG(m_iconPath), qRound(iconExtent() * ratio));
    multiply(image, color);
    image.setDevicePixelRatio(ratio);
    return image;
}

int KvBaseButtonIcon::iconExtent() const
{
    return std::max(iconSize().width(), iconSize().height());
}

const QImage &KvBaseButtonIcon::currentIcon()
{
    const QColor color = iconColor();
    const qreal ratio = devicePixelRatioF();
    const bool isCurrent = color == m_imageColor && m_image.devicePixelRatio() == ratio &&
                           m_image.width() == qRound(iconExtent() * ratio);
    if (!isCurrent) {
        m_image = tintedIcon(color);
        m_imageColor = color;
    }
    return m_image;
}

QColor KvBaseButtonIcon::iconColor() const
{
    if (!m_normal.isValid())
        return themeColor();
    if (!isEnabled())
        return m_disabled;
    if (isDown() || isChecked())
        return m_pressed;
    return underMouse() ? m_hovered : m_normal;
}

QColor KvBaseButtonIcon::themeColor() const
{
    const QColor color = KvThemePainting::color(isChecked() ? "on-accent" : "text");
    return isEnabled() ? color : dimmed(color);
}

QRect KvBaseButtonIcon::iconRect() const
{
    QRect rect(0, 0, iconExtent(), iconExtent());
    rect.moveCenter(this->rect().center());
    if (!text().isEmpty())
        rect.moveLeft(kTextMargin);
    return rect;
}

void KvBaseButtonIcon::paintEvent(QPaintEvent *event)
{
    Q_UNUSED(event)
    QPainter painter(this);
    if (!isFlat()) {
        QStyleOptionButton option;
        initStyleOption(&option);
        style()->drawControl(QStyle::CE_PushButtonBevel, &option, &painter, this);
    }
    painter.drawImage(iconRect(), currentIcon());
    if (!text().isEmpty())
        drawText(painter);
    if (hasFocus())
        KvThemePainting::drawFocusRing(painter, rect(),
                                       KvThemePainting::color(isChecked() ? "accent-hover" : "accent"));
}

void KvBaseButtonIcon::drawText(QPainter &painter) const
{
    QStyleOptionButton option;
    initStyleOption(&option);
    option.icon = QIcon();
    option.rect.setLeft(iconRect().right() + 1 + kTextGap);
    option.rect.setRight(rect().right() - kTextMargin);
    style()->drawControl(QStyle::CE_PushButtonLabel, &option, &painter, this);
}

void KvBaseButtonIcon::changeEvent(QEvent *event)
{
    QPushButton::changeEvent(event);
    if (event->type() == QEvent::FontChange)
        updateSize();
}
