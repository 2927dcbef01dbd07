// SPDX-License-Identifier: MIT
#include "KvCliOutput.h"

#include "measuring/ZtFault.h"

#include <QJsonDocument>
#include <QJsonObject>

#include <cstdio>

#include <unistd.h>

namespace {

void write(FILE *stream, const QByteArray &bytes)
{
    std::fwrite(bytes.constData(), 1, static_cast<std::size_t>(bytes.size()), stream);
    std::fflush(stream);
}

// One line, whatever a file's name or content brought into it.
QByteArray singleLine(const QString &text)
{
    return text.simplified().toUtf8() + '\n';
}

} // namespace

void KvCliOutput::result(const QString &text) const
{
    write(stdout, text.toUtf8());
}

void KvCliOutput::result(const QByteArray &bytes) const
{
    write(stdout, bytes);
}

void KvCliOutput::note(const QString &text) const
{
    if (!m_quiet)
        write(stderr, singleLine(QStringLiteral("statreport: note: ") + text));
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

bool KvCliOutput::isTerminal()
{
    return isatty(STDERR_FILENO) != 0;
}

void KvCliOutput::progress(const QString &text)
{
    // Back to the line's start, then clear to its end.
    write(stderr, QByteArray("\r\033[K") + text.toUtf8());
}
