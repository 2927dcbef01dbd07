// SPDX-License-Identifier: MIT
#include "measuring/ZtLoadedSession.h"

#include "measuring/ZtProgress.h"

#include <QCoreApplication>

namespace {

// How much of the time passes until the session is there, and all objects of its tables have to be made.
constexpr double sessionShare = 0.85;

} // namespace

bool ZtLoadedSession::read(const QString &path, ZtFault *fault, ZtProgress *progress)
{
    return ZtSession::load(path, &session, fault, progress) && finish(fault, progress);
}

bool ZtLoadedSession::parse(const QByteArray &bytes, const QString &path, ZtFault *fault,
                            ZtProgress *progress)
{
    return ZtSession::parse(bytes, path, &session, fault, progress) && finish(fault, progress);
}

bool ZtLoadedSession::finish(ZtFault *fault, ZtProgress *progress)
{
    ZtProgress::setPart(progress, sessionShare, 1.0);
    tableObjects = ZtReadyObjects::ofSession(session, progress);
    if (ZtProgress::isCancelled(progress)) {
        fault->message = QCoreApplication::translate("ZtSession", "Reading was cancelled");
        return false;
    }
    // One list of rows for both: the other goes here, where nobody waits for it.
    for (int i = 0; i < session.tables.size(); ++i)
        session.tables[i] = tableObjects[static_cast<std::size_t>(i)].table();
    // The image belongs to no share of its own; a bar that went back would tell less than one that is full.
    ZtProgress::setPart(progress, 1.0, 1.0);
    readImage(progress);
    return true;
}

void ZtLoadedSession::readImage(ZtProgress *progress)
{
    imageFault = ZtFault();
    image.reset();
    if (session.imagePath.isEmpty())
        return;
    image =
        ZtStillImageSource::load(session.imagePath, &imageFault, ZtStillImageSource::maximumPixels, progress);
    if (image && QCoreApplication::instance())
        image->moveToThread(QCoreApplication::instance()->thread());
}
