// SPDX-License-Identifier: MIT
#include "KvCliSource.h"

#include "measuring/ZtFault.h"

#include <QDir>
#include <QFileInfo>
#include <QTemporaryFile>

namespace {

constexpr qint64 kBlock = 1 << 16;
// Beyond what any reader accepts; an endless input is then refused for its size instead of filling the disk.
constexpr qint64 kMostBytes = 513LL * 1024 * 1024;

bool copyInto(QTemporaryFile &target, QFile &input)
{
    if (!target.open())
        return false;
    while (target.size() < kMostBytes) {
        const QByteArray block = input.read(kBlock);
        if (block.isEmpty())
            return input.error() == QFileDevice::NoError && target.flush();
        if (target.write(block) != block.size())
            return false;
    }
    return target.flush();
}

bool openInput(QFile &input, const QString &name)
{
    if (name == QLatin1String("-"))
        return input.open(stdin, QIODevice::ReadOnly);
    input.setFileName(name);
    return input.open(QIODevice::ReadOnly);
}

// Pipes and devices can be read only once, while a template is read twice: to be checked, and to be loaded.
bool needsCopy(const QString &name)
{
    const QFileInfo info(name);
    return name == QLatin1String("-") || (info.exists() && !info.isFile() && !info.isDir());
}

} // namespace

KvCliSource::KvCliSource() = default;
KvCliSource::~KvCliSource() = default;

bool KvCliSource::open(const QString &name, ZtFault *fault)
{
    m_path = name;
    m_displayName = name;
    if (!needsCopy(name))
        return true;
    if (name == QLatin1String("-"))
        m_displayName = tr("<standard input>");
    m_copy = std::make_unique<QTemporaryFile>(QDir::temp().filePath(QStringLiteral("statreport-XXXXXX")));
    QFile input;
    if (!openInput(input, name) || !copyInto(*m_copy, input)) {
        fault->file = m_displayName;
        fault->message = tr("cannot be read");
        return false;
    }
    m_path = m_copy->fileName();
    return true;
}
