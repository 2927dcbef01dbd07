// SPDX-License-Identifier: MIT
#include "KvCliOutput.h"

#include "measuring/ZtFault.h"
#include "measuring/ZtFileFault.h"

#include <QJsonDocument>
#include <QJsonObject>

#include <cerrno>
#include <cstdio>

#include <unistd.h>

namespace {

bool write(FILE *stream, const QByteArray &bytes)
{
    const auto size = static_cast<std::size_t>(bytes.size());
    const bool isTaken = std::fwrite(bytes.constData(), 1, size, stream) == size;
    return std::fflush(stream) == 0 && isTaken;
}

// One line, whatever a file's name or content brought into it.
QByteArray singleLine(const QString &text)
{
    return text.simplified().toUtf8() + '\n';
}

} // namespace

bool KvCliOutput::result(const QString &text) const
{
    return result(text.toUtf8());
}

bool KvCliOutput::result(const QByteArray &bytes) const
{
    if (write(stdout, bytes))
        return true;
    ZtFault fault;
    fault.message = tr("cannot be written: %1").arg(ZtFileFault::text(errno));
    fault.file = standardOutputName();
    error(fault);
    return false;
}

void KvCliOutput::note(const QString &text) const
{
    if (!m_quiet)
        write(stderr, singleLine(QStringLiteral("statreport: ") + tr("note: %1").arg(text)));
}

void KvCliOutput::error(const QString &text) const
{
    ZtFault fault;
    fault.message = text;
    error(fault);
}

void KvCliOutput::error(const ZtFault &fault) const
{
    if (!m_jsonErrors) {
        write(stderr, singleLine(QStringLiteral("statreport: ") + fault.text()));
        return;
    }
    QJsonObject object{{QStringLiteral("message"), fault.message}};
    if (!fault.file.isEmpty())
        object.insert(QStringLiteral("file"), fault.file);
    if (!fault.place.isEmpty())
        object.insert(QStringLiteral("place"), fault.place);
    if (fault.line > 0)
        object.insert(QStringLiteral("line"), fault.line);
    if (fault.column > 0)
        object.insert(QStringLiteral("column"), fault.column);
    const QJsonObject root{{QStringLiteral("error"), object}};
    write(stderr, QJsonDocument(root).toJson(QJsonDocument::Compact) + '\n');
}

QString KvCliOutput::standardOutputName()
{
    return tr("<standard output>");
}

bool KvCliOutput::isTerminal()
{
    return isatty(STDERR_FILENO) != 0;
}

void KvCliOutput::progress(const QString &text)
{
    // Back to the line's start, then clear to its end.
    write(stderr, QByteArray("\r\033[K") + text.toUtf8());
}
