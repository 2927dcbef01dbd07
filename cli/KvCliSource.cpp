// SPDX-License-Identifier: MIT
#include "KvCliSource.h"

#include "measuring/ZtFault.h"

#include <QDir>
#include <QTemporaryFile>

namespace {

constexpr qint64 kBlock = 1 << 16;

bool copyStandardInput(QTemporaryFile &target)
{
    QFile input;
    if (!target.open() || !input.open(stdin, QIODevice::ReadOnly))
        return false;
    for (;;) {
        const QByteArray block = input.read(kBlock);
        if (block.isEmpty())
            return input.error() == QFileDevice::NoError && target.flush();
        if (target.write(block) != block.size())
            return false;
    }
}

} // namespace

KvCliSource::KvCliSource() = default;
KvCliSource::~KvCliSource() = default;

bool KvCliSource::open(const QString &name, ZtFault *fault)
{
    m_path = name;
    m_displayName = name;
    if (name != QLatin1String("-"))
        return true;
    m_displayName = QStringLiteral("<standard input>");
    m_copy = std::make_unique<QTemporaryFile>(QDir::temp().filePath(QStringLiteral("statreport-XXXXXX")));
    if (!copyStandardInput(*m_copy)) {
        fault->file = m_displayName;
        fault->message = QStringLiteral("cannot be read");
        return false;
    }
    m_path = m_copy->fileName();
    return true;
}
