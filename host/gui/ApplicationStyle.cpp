// SPDX-License-Identifier: MIT
#include "gui/ApplicationStyle.h"

#include "gui/ThemedIconEngine.h"

#include <QGuiApplication>
#include <QIcon>

#include <algorithm>

namespace acss {

namespace {

/// Strokes of the 24 pixel grid are not yet heavy at this size.
constexpr int messageIconSize = 40;

struct MessageIcon
{
    QStyle::StandardPixmap standardPixmap;
    const char *fileName;
    const char *colorToken;
};

constexpr MessageIcon messageIcons[] = {
    {QStyle::SP_MessageBoxQuestion, ":/acss/message-question.svg", "accent-hover"},
    {QStyle::SP_MessageBoxInformation, ":/acss/message-information.svg", "accent-hover"},
    {QStyle::SP_MessageBoxWarning, ":/acss/message-warning.svg", "warning"},
    {QStyle::SP_MessageBoxCritical, ":/acss/message-critical.svg", "error"},
};

} // namespace

ApplicationStyle::ApplicationStyle()
    : QProxyStyle(QStringLiteral("Fusion"))
{}

int ApplicationStyle::styleHint(StyleHint hint, const QStyleOption *option, const QWidget *widget,
                                QStyleHintReturn *returnData) const
{
    if (hint == SH_UnderlineShortcut && QGuiApplication::layoutDirection() == Qt::RightToLeft)
        return 0;
    return QProxyStyle::styleHint(hint, option, widget, returnData);
}

int ApplicationStyle::pixelMetric(PixelMetric metric, const QStyleOption *option, const QWidget *widget) const
{
    if (metric == PM_MessageBoxIconSize)
        return messageIconSize;
    return QProxyStyle::pixelMetric(metric, option, widget);
}

QIcon ApplicationStyle::standardIcon(StandardPixmap standardPixmap, const QStyleOption *option,
                                     const QWidget *widget) const
{
    const auto *const icon =
        std::find_if(std::begin(messageIcons), std::end(messageIcons),
                     [=](const MessageIcon &each) { return each.standardPixmap == standardPixmap; });
    if (icon == std::end(messageIcons))
        return QProxyStyle::standardIcon(standardPixmap, option, widget);
    // The icon owns its engine.
    return QIcon(new ThemedIconEngine(QLatin1String(icon->fileName), QSize(messageIconSize, messageIconSize),
                                      QLatin1String(icon->colorToken)));
}

} // namespace acss
