// SPDX-License-Identifier: MIT
#include "gui/acss.h"

#include "common/ZtAppStatus.h"
#include "gui/ThemedIconEngine.h"
#include "kernel/ZtLeftToRight.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QGuiApplication>
#include <QSet>
#include <QStringList>

#include <memory>
#include <utility>

namespace acss {

namespace {

constexpr int missingIconStatusCode = 1;

QStringList &searchPaths()
{
    static QStringList paths{QStringLiteral(":/")};
    return paths;
}

/// An icon is asked for again at every change of the theme; saying once that it is missing is enough.
void reportMissing(const QString &path)
{
    static QSet<QString> reported;
    if (reported.contains(path))
        return;
    reported.insert(path);
    const QString message =
        QCoreApplication::translate("acss", "The icon %1 is missing.").arg(ZtLeftToRight::isolated(path));
    ZtAppStatus().setAndLogStatus(ZtAppStatus::Warning, missingIconStatusCode, message,
                                  QStringLiteral("acss::createIcon"));
}

std::unique_ptr<ThemedIconEngine> createEngine(const QString &path, const QSize &size)
{
    const QString svgPath = getPathSVG(path);
    if (!svgPath.isEmpty())
        return std::make_unique<ThemedIconEngine>(svgPath, size);
    reportMissing(path);
    return nullptr;
}

} // namespace

QIcon createIcon(int styleMode, const QString &path, const QSize &size)
{
    Q_UNUSED(styleMode)
    std::unique_ptr<ThemedIconEngine> engine = createEngine(path, size);
    return engine ? QIcon(engine.release()) : QIcon();
}

QPixmap createPixmap(int styleMode, const QString &path, const QSize &size)
{
    Q_UNUSED(styleMode)
    const std::unique_ptr<ThemedIconEngine> engine = createEngine(path, size);
    if (!engine)
        return QPixmap();

    const qreal ratio = qGuiApp->devicePixelRatio();
    QPixmap pixmap = engine->pixmap((QSizeF(size) * ratio).toSize(), QIcon::Normal, QIcon::Off);
    pixmap.setDevicePixelRatio(ratio);
    return pixmap;
}

QString getPathSVG(const QString &path)
{
    if (path.isEmpty())
        return QString();

    const QString suffix = QStringLiteral(".svg");
    const QString fileName = path.endsWith(suffix, Qt::CaseInsensitive) ? path : path + suffix;
    if (QDir::isAbsolutePath(fileName))
        return QFile::exists(fileName) ? fileName : QString();
    for (const QString &folder : std::as_const(searchPaths())) {
        QString candidate = folder + fileName;
        if (QFile::exists(candidate))
            return candidate;
    }
    return QString();
}

void addIconSearchPath(const QString &folder)
{
    if (folder.isEmpty())
        return;

    const QString prefix = folder.endsWith(QLatin1Char('/')) ? folder : folder + QLatin1Char('/');
    if (!searchPaths().contains(prefix))
        searchPaths().append(prefix);
}

} // namespace acss
