// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QCoreApplication>

class QByteArray;
class QFile;
class ZtProgress;
struct ZtFault;

/**
 * Writes files so that whatever happens meanwhile, the end of the program or of the power, either the old
 * contents are there or the new ones.
 */
class ZT_MEASURING_EXPORT ZtSafeFile
{
    Q_DECLARE_TR_FUNCTIONS(ZtSession)
public:
    /**
     * Replaces the file as a whole or leaves it as it was. A file that the user may not write stays, even
     * where the folder would allow to replace it. What was left beside it by a program that was killed while
     * it wrote is removed.
     */
    static bool write(const QString &path, const QByteArray &bytes, ZtFault *fault,
                      ZtProgress *progress = nullptr);

private:
    static bool writeBytes(QFile *file, const QByteArray &bytes, ZtProgress *progress);
};
