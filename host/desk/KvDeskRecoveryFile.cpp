// SPDX-License-Identifier: MIT
#include "KvDeskRecoveryFile.h"

#include "measuring/ZtFault.h"
#include "measuring/ZtFileFault.h"
#include "measuring/ZtLoadedSession.h"
#include "measuring/ZtSafeFile.h"
#include "measuring/ZtSession.h"

#include <QCoreApplication>
#include <QFile>
#include <QJsonDocument>
#include <QJsonObject>
#include <QStandardPaths>

namespace {

const char folderVariable[] = "STATREPORT_RECOVERY_DIR";
constexpr qint64 longestHeader = 64 * 1024;

const QString formatKey = QStringLiteral("format");
const QString formatName = QStringLiteral("statreport-recovery");
const QString sessionKey = QStringLiteral("session");
const QString sizeKey = QStringLiteral("sessionBytes");
const QString modifiedKey = QStringLiteral("sessionModified");
const QString timeKey = QStringLiteral("time");
const QString objectsKey = QStringLiteral("objects");

QString toText(const QDateTime &time)
{
    return time.toString(Qt::ISODateWithMs);
}

QDateTime toTime(const QJsonValue &text)
{
    return QDateTime::fromString(text.toString(), Qt::ISODateWithMs);
}

} // namespace

QString KvDeskRecoveryFile::standardFolder()
{
    const QString chosen = qEnvironmentVariable(folderVariable);
    return chosen.isEmpty() ? QStandardPaths::writableLocation(QStandardPaths::AppLocalDataLocation) +
                                  QStringLiteral("/Recovery")
                            : chosen;
}

QByteArray KvDeskRecoveryFile::header() const
{
    QJsonObject json{{formatKey, formatName}, {timeKey, toText(time)}, {objectsKey, objectCount}};
    if (!sessionPath.isEmpty())
        json.insert(sessionKey, sessionPath);
    if (sessionStamp.exists()) {
        json.insert(sizeKey, static_cast<double>(sessionStamp.size));
        json.insert(modifiedKey, toText(sessionStamp.modified));
    }
    return QJsonDocument(json).toJson(QJsonDocument::Compact) + '\n';
}

bool KvDeskRecoveryFile::write(const QString &file, const ZtSession &session, ZtFault *fault,
                               ZtProgress *progress) const
{
    return ZtSafeFile::write(file, header() + session.toJson(file), fault, progress);
}

bool KvDeskRecoveryFile::readHeader(const QString &file)
{
    QFile source(file);
    if (!source.open(QIODevice::ReadOnly))
        return false;
    const QJsonObject json = QJsonDocument::fromJson(source.readLine(longestHeader)).object();
    if (json.value(formatKey).toString() != formatName)
        return false;
    sessionPath = json.value(sessionKey).toString();
    time = toTime(json.value(timeKey));
    objectCount = json.value(objectsKey).toInt();
    sessionStamp = {static_cast<qint64>(json.value(sizeKey).toDouble(-1.0)), toTime(json.value(modifiedKey))};
    return time.isValid();
}

bool KvDeskRecoveryFile::read(const QString &file, ZtLoadedSession *loaded, ZtFault *fault,
                              ZtProgress *progress)
{
    QFile source(file);
    *fault = ZtFault();
    fault->file = file;
    if (!source.open(QIODevice::ReadOnly)) {
        fault->message = ZtFileFault::text(source);
        return false;
    }
    source.readLine(longestHeader);
    return loaded->parse(source.readAll(), file, fault, progress);
}
