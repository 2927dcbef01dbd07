// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"

#include <QCoreApplication>
#include <QSet>
#include <QVector>

#include <memory>

class QMimeData;
struct ZtSessionObject;

/** Objects on the clipboard: those that are drawn on the image in the format of session files, and the values
 * of all as a table for other programs. */
class KvDeskObjectClipboard
{
    Q_DECLARE_TR_FUNCTIONS(KvDeskObjectClipboard)
public:
    static QString mimeType();

    static std::unique_ptr<QMimeData> toMimeData(const QSet<KvDeskObjectId> &objects);
    static bool hasObjects(const QMimeData *data);
    /** The objects to draw; none when the data are damaged or of a newer program. */
    static QVector<ZtSessionObject> objects(const QMimeData *data);

private:
    static QByteArray toSession(const QVector<KvDeskObjectId> &objects);
    static QString toTable(const QVector<KvDeskObjectId> &objects);
};
