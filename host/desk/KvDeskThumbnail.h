// SPDX-License-Identifier: MIT
#pragma once

#include <QImage>
#include <QMetaType>
#include <QString>

/** A small picture of a picture file, or why there is none. */
struct KvDeskThumbnail
{
    QImage image;  ///< null when the file cannot be shown
    QSize size;    ///< of the file's picture, in pixels
    QString fault; ///< one sentence without a full stop; empty when all is well
};

Q_DECLARE_METATYPE(KvDeskThumbnail)
