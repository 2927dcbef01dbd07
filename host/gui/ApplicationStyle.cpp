// SPDX-License-Identifier: MIT
#include "gui/ApplicationStyle.h"

#include "gui/ThemedIconEngine.h"

#include <QGuiApplication>
#include <QIcon>
#include <QStyleOption>
#include <QWidget>

#include <algorithm>

namespace acss {

namespace {

/// Strokes of the 24 pixel grid are not yet heavy at this size.
constexpr int messageIconSize = 40;

constexpr int fileIconSize = 24;

struct StandardIcon
{
    QStyle::StandardPixmap standardPixmap;
    const char *name; ///< of the file
    const char *colorToken;
    int size;
};

constexpr StandardIcon standardIcons[] = {
    {QStyle::SP_MessageBoxQuestion, "message-question", "accent-hover", messageIconSize},
    {QStyle::SP_MessageBoxInformation, "message-information", "accent-hover", messageIconSize},
    {QStyle::SP_MessageBoxWarning, "message-warning", "warning", messageIconSize},
    {QStyle::SP_MessageBoxCritical, "message-critical", "error", messageIconSize},
    {QStyle::SP_ArrowBack, "file-back", "text", fileIconSize},
    {QStyle::SP_ArrowForward, "file-forward", "text", fileIconSize},
    {QStyle::SP_FileDialogBack, "file-back", "text", fileIconSize},
    {QStyle::SP_FileDialogToParent, "file-to-parent", "text", fileIconSize},
    {QStyle::SP_FileDialogNewFolder, "file-new-folder", "text", fileIconSize},
    {QStyle::SP_FileDialogListView, "file-list", "text", fileIconSize},
    {QStyle::SP_FileDialogDetailedView, "file-details", "text", fileIconSize},
    {QStyle::SP_DirIcon, "folder", "text", fileIconSize},
    {QStyle::SP_DirOpenIcon, "folder", "text", fileIconSize},
    {QStyle::SP_DirClosedIcon, "folder", "text", fileIconSize},
    {QStyle::SP_DirLinkIcon, "folder-link", "text", fileIconSize},
    {QStyle::SP_DirLinkOpenIcon, "folder-link", "text", fileIconSize},
    {QStyle::SP_DirHomeIcon, "home", "text", fileIconSize},
    {QStyle::SP_FileIcon, "file", "text", fileIconSize},
    {QStyle::SP_FileLinkIcon, "file-link", "text", fileIconSize},
    {QStyle::SP_ComputerIcon, "computer", "text", fileIconSize},
    {QStyle::SP_DesktopIcon, "computer", "text", fileIconSize},
    {QStyle::SP_DriveHDIcon, "drive", "text", fileIconSize},
    {QStyle::SP_DriveFDIcon, "drive", "text", fileIconSize},
    {QStyle::SP_DriveNetIcon, "drive", "text", fileIconSize},
    {QStyle::SP_DriveCDIcon, "disc", "text", fileIconSize},
    {QStyle::SP_DriveDVDIcon, "disc", "text", fileIconSize},
    {QStyle::SP_TrashIcon, "trash", "text", fileIconSize},
};

// Back is where reading comes from.
QStyle::StandardPixmap inReadingDirection(QStyle::StandardPixmap pixmap, Qt::LayoutDirection direction)
{
    if (direction != Qt::RightToLeft)
        return pixmap;
    switch (pixmap) {
    case QStyle::SP_ArrowBack:
    case QStyle::SP_FileDialogBack:
        return QStyle::SP_ArrowForward;
    case QStyle::SP_ArrowForward:
        return QStyle::SP_ArrowBack;
    default:
        return pixmap;
    }
}

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
    const Qt::LayoutDirection direction = option   ? option->direction
                                          : widget ? widget->layoutDirection()
                                                   : QGuiApplication::layoutDirection();
    const StandardPixmap directed = inReadingDirection(standardPixmap, direction);
    const auto *const icon =
        std::find_if(std::begin(standardIcons), std::end(standardIcons),
                     [=](const StandardIcon &each) { return each.standardPixmap == directed; });
    if (icon == std::end(standardIcons))
        return QProxyStyle::standardIcon(standardPixmap, option, widget);
    // The icon owns its engine.
    return QIcon(new ThemedIconEngine(QStringLiteral(":/acss/%1.svg").arg(QLatin1String(icon->name)),
                                      QSize(icon->size, icon->size), QLatin1String(icon->colorToken)));
}

} // namespace acss
