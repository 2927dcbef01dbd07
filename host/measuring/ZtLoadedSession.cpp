// SPDX-License-Identifier: MIT
#include "measuring/ZtLoadedSession.h"

#include "measuring/ZtProgress.h"

#include <QCoreApplication>

bool ZtLoadedSession::read(const QString &path, ZtFault *fault, ZtProgress *progress)
{
    if (!ZtSession::load(path, &session, fault, progress))
        return false;
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
