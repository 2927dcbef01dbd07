// SPDX-License-Identifier: MIT
#include "measuring/ZtSession.h"

#include "measuring/ZtBoundedRead.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtSessionReader.h"
#include "measuring/ZtSessionWriter.h"

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>
#include <QJsonDocument>
#include <QSaveFile>

namespace {

/// Gives the functions of this file a tr() whose context can be seen by the tool that collects the texts.
class Text
{
    Q_DECLARE_TR_FUNCTIONS(ZtSession)
};

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

bool readBytes(const QString &path, QByteArray *bytes, ZtFault *fault)
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
    *bytes = ztReadAtMost(&file, ZtSession::maximumBytes + 1);
    if (bytes->size() > ZtSession::maximumBytes)
        return fail(Text::tr("The file is too large for a session"), fault);
    if (file.error() != QFileDevice::NoError)
        return fail(Text::tr("The file cannot be read (%1)").arg(file.errorString()), fault);
    return true;
}

} // namespace

bool ZtSession::load(const QString &path, ZtSession *session, ZtFault *fault)
{
    *fault = ZtFault();
    fault->file = path;
    QByteArray bytes;
    return readBytes(path, &bytes, fault) && parse(bytes, path, session, fault);
}

bool ZtSession::parse(const QByteArray &bytes, const QString &path, ZtSession *session, ZtFault *fault)
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
    ZtSessionReader reader(path);
    if (reader.read(document.object(), session))
        return true;
    *fault = reader.fault();
    fault->file = path;
    return false;
}

QByteArray ZtSession::toJson(const QString &path) const
{
    return QJsonDocument(ZtSessionWriter::toJson(*this, path)).toJson(QJsonDocument::Compact) + '\n';
}

bool ZtSession::save(const QString &path, ZtFault *fault) const
{
    *fault = ZtFault();
    fault->file = path;
    QSaveFile file(path);
    const QByteArray bytes = toJson(path);
    if (file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size() && file.commit())
        return true;
    return fail(Text::tr("The file cannot be written (%1)").arg(file.errorString()), fault);
}
