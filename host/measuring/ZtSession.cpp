// SPDX-License-Identifier: MIT
#include "measuring/ZtSession.h"

#include "measuring/ZtBoundedRead.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtProgress.h"
#include "measuring/ZtSafeFile.h"
#include "measuring/ZtSessionReader.h"
#include "measuring/ZtSessionWriter.h"

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>
#include <QJsonDocument>

namespace {

/// Gives the functions of this file a tr() whose context can be seen by the tool that collects the texts.
class Text
{
    Q_DECLARE_TR_FUNCTIONS(ZtSession)
};

// How much of the time passes until the bytes are there, and until they are JSON.
constexpr double readShare = 0.05;
constexpr double jsonShare = 0.4;

bool fail(const QString &message, ZtFault *fault)
{
    fault->message = message;
    return false;
}

bool failParse(const QByteArray &bytes, const QJsonParseError &error, ZtFault *fault)
{
    fault->line = static_cast<int>(bytes.left(error.offset).count('\n')) + 1;
    if (error.error == QJsonParseError::DeepNesting)
        return fail(Text::tr("The file is nested too deeply"), fault);
    return fail(Text::tr("The file is not valid JSON (%1)").arg(error.errorString()), fault);
}

bool failCancelled(ZtFault *fault)
{
    return fail(Text::tr("Reading was cancelled"), fault);
}

bool readBytes(const QString &path, QByteArray *bytes, ZtFault *fault, ZtProgress *progress)
{
    QFile file(path);
    if (!QFileInfo::exists(path))
        return fail(Text::tr("The file does not exist"), fault);
    if (QFileInfo(path).isDir())
        return fail(Text::tr("This is a folder, not a file"), fault);
    if (!file.open(QIODevice::ReadOnly))
        return fail(Text::tr("The file cannot be read (%1)").arg(file.errorString()), fault);
    if (file.size() > ZtSession::maximumBytes)
        return fail(Text::tr("The file is too large for a session"), fault);
    *bytes = ztReadAtMost(&file, ZtSession::maximumBytes + 1, progress);
    if (ZtProgress::isCancelled(progress))
        return failCancelled(fault);
    if (bytes->size() > ZtSession::maximumBytes)
        return fail(Text::tr("The file is too large for a session"), fault);
    if (file.error() != QFileDevice::NoError)
        return fail(Text::tr("The file cannot be read (%1)").arg(file.errorString()), fault);
    return true;
}

} // namespace

bool ZtSession::load(const QString &path, ZtSession *session, ZtFault *fault, ZtProgress *progress)
{
    *fault = ZtFault();
    fault->file = path;
    QByteArray bytes;
    ZtProgress::setPart(progress, 0.0, readShare);
    return readBytes(path, &bytes, fault, progress) && parse(bytes, path, session, fault, progress);
}

bool ZtSession::parse(const QByteArray &bytes, const QString &path, ZtSession *session, ZtFault *fault,
                      ZtProgress *progress)
{
    *fault = ZtFault();
    fault->file = path;
    if (bytes.trimmed().isEmpty())
        return fail(Text::tr("The file is empty"), fault);
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(bytes, &error);
    if (error.error != QJsonParseError::NoError)
        return failParse(bytes, error, fault);
    if (!document.isObject())
        return fail(Text::tr("The file is not a session"), fault);
    if (ZtProgress::isCancelled(progress))
        return failCancelled(fault);
    ZtProgress::setPart(progress, jsonShare, 1.0);
    ZtSessionReader reader(path, progress);
    if (reader.read(document.object(), session))
        return true;
    *fault = reader.fault();
    fault->file = path;
    return false;
}

QByteArray ZtSession::toJson(const QString &path) const
{
    return ZtSessionWriter::toJson(*this, path) + '\n';
}

bool ZtSession::save(const QString &path, ZtFault *fault, ZtProgress *progress) const
{
    ZtProgress::setPart(progress, 0.0, jsonShare);
    const QByteArray bytes = toJson(path);
    ZtProgress::setPart(progress, jsonShare, 1.0);
    return ZtSafeFile::write(path, bytes, fault, progress);
}
