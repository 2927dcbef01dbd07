// SPDX-License-Identifier: MIT
#pragma once

#include "DeskFiles.h"
#include "KvDeskRecoveryFile.h"
#include "host/measuring/Polygon.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtSession.h"

/** Copies as a program leaves them that did not end in order. */
class RecoveryCopies
{
public:
    /** A session of some lines; \a minutes is the age. */
    static QString add(const QString &folder, const QString &name, int lines, int minutes,
                       const QString &sessionPath = QString())
    {
        ZtSession session;
        for (int id = 1; id <= lines; ++id)
            session.objects.append({ZtDrawnType::find(ZtDrawnType::Line),
                                    id,
                                    QString(),
                                    QString(),
                                    polygon({QPointF(0, 0), QPointF(id, id)}),
                                    {}});
        KvDeskRecoveryFile header;
        header.sessionPath = sessionPath;
        header.sessionStamp = KvDeskFileStamp::of(sessionPath);
        header.time = QDateTime::currentDateTimeUtc().addSecs(-60 * minutes);
        header.objectCount = lines;
        QDir().mkpath(folder);
        const QString file = QDir(folder).filePath(name + KvDeskRecoveryFile::suffix());
        ZtFault fault;
        header.write(file, session, &fault, nullptr);
        return file;
    }
};
