// SPDX-License-Identifier: MIT
#include "measuring/ZtSession.h"

#include "measuring/ZtBoundedRead.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtFileFault.h"
#include "measuring/ZtJsonReader.h"
#include "measuring/ZtProgress.h"
#include "measuring/ZtSafeFile.h"
#include "measuring/ZtSessionReader.h"
#include "measuring/ZtSessionWriter.h"

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>

#include <algorithm>
#include <string_view>

namespace {

/// Gives the functions of this file a tr() whose context can be seen by the tool that collects the texts.
class Text
{
    Q_DECLARE_TR_FUNCTIONS(ZtSession)
};

// How much of the time passes until the bytes are there, and until it is known that they are JSON.
constexpr double readShare = 0.05;
constexpr double checkShare = 0.3;
constexpr double sessionShare = 0.85; // the rest is for who makes objects of it

// How much of the time passes until what is to be written is JSON.
constexpr double jsonShare = 0.4;

bool fail(const QString &message, ZtFault *fault)
{
    fault->message = message;
    return false;
}

bool isBlank(std::string_view bytes)
{
    return bytes.find_first_not_of(" \t\n\v\f\r") == std::string_view::npos;
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
        return fail(Text::tr("The file cannot be read (%1)").arg(ZtFileFault::text(file)), fault);
    if (file.size() > ZtSession::maximumBytes)
        return fail(Text::tr("The file is too large for a session"), fault);
    *bytes = ztReadAtMost(&file, ZtSession::maximumBytes + 1, progress);
    if (ZtProgress::isCancelled(progress))
        return failCancelled(fault);
    if (bytes->size() > ZtSession::maximumBytes)
        return fail(Text::tr("The file is too large for a session"), fault);
    if (file.error() != QFileDevice::NoError)
        return fail(Text::tr("The file cannot be read (%1)").arg(ZtFileFault::text(file)), fault);
    return true;
}

} // namespace

ZtSessionTable ZtSessionTable::ofType(const std::shared_ptr<const ZtImportedType> &type)
{
    ZtSessionTable table{type, {}};
    table.rows.reserve(type->rowCount());
    for (int row = 0; row < type->rowCount(); ++row)
        table.rows.append({row + 1, row, type->rowName(row), {}});
    return table;
}

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
    const std::string_view text(bytes.constData(), static_cast<std::size_t>(bytes.size()));
    if (isBlank(text))
        return fail(Text::tr("The file is empty"), fault);
    ZtJsonReader json(text);
    ZtProgress::setPart(progress, readShare, checkShare);
    const bool isJson = json.check(progress);
    if (ZtProgress::isCancelled(progress))
        return failCancelled(fault);
    if (!isJson) {
        *fault = json.fault();
        fault->file = path;
        return false;
    }
    if (json.kind() != ZtJsonReader::Object)
        return fail(Text::tr("The file is not a session"), fault);
    ZtProgress::setPart(progress, checkShare, sessionShare);
    ZtSessionReader reader(&json, path, progress);
    if (reader.read(session))
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
