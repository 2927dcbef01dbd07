// SPDX-License-Identifier: MIT
#include "measuring/ZtLoadedSession.h"

#include <QCoreApplication>

bool ZtLoadedSession::read(const QString &path, ZtFault *fault, ZtProgress *progress)
{
    if (!ZtSession::load(path, &session, fault, progress))
        return false;
    readImage();
    return true;
}

void ZtLoadedSession::readImage()
{
    imageFault = ZtFault();
    image.reset();
    if (session.imagePath.isEmpty())
        return;
    image = ZtStillImageSource::load(session.imagePath, &imageFault);
    if (image && QCoreApplication::instance())
        image->moveToThread(QCoreApplication::instance()->thread());
}
