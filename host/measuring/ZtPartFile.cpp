// SPDX-License-Identifier: MIT
#include "measuring/ZtPartFile.h"

#include "measuring/ZtFileFault.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QDir>
#include <QFileInfo>
#include <QRandomGenerator>
#include <QRegularExpression>

#include <cerrno>
#include <filesystem>
#include <limits>

#ifndef Q_OS_WIN
#include <csignal>
#endif

namespace {

constexpr int letterCount = 6;
constexpr int mostTries = 16;
constexpr int mostLinks = 32;

const QString suffix = QStringLiteral(".part");

// Where a chain of links ends, whether there is a file or not.
QString targetOf(const QString &path)
{
    QFileInfo info(path);
    for (int i = 0; i < mostLinks && info.isSymLink(); ++i)
        info.setFile(info.symLinkTarget());
    return info.absoluteFilePath();
}

QString randomLetters()
{
    QString letters;
    for (int i = 0; i < letterCount; ++i)
        letters += QChar('a' + QRandomGenerator::global()->bounded(26));
    return letters;
}

QString partPath(const QString &target)
{
    return QStringLiteral("%1.%2-%3%4")
        .arg(target)
        .arg(QCoreApplication::applicationPid())
        .arg(randomLetters(), suffix);
}

// Where it cannot be found out, open files cannot be removed anyway.
bool isAlive(qint64 process)
{
#ifdef Q_OS_WIN
    Q_UNUSED(process)
    return false;
#else
    if (process > std::numeric_limits<pid_t>::max())
        return false;
    return kill(static_cast<pid_t>(process), 0) == 0 || errno == EPERM;
#endif
}

bool isStale(const QFileInfo &part, qint64 process)
{
    const qint64 age = part.lastModified().secsTo(QDateTime::currentDateTime());
    return age >= (isAlive(process) ? ZtPartFile::forgottenSeconds : ZtPartFile::staleSeconds);
}

std::filesystem::path toNative(const QString &path)
{
#ifdef Q_OS_WIN
    return std::filesystem::path(path.toStdWString());
#else
    return std::filesystem::path(QFile::encodeName(path).toStdString());
#endif
}

} // namespace

ZtPartFile::ZtPartFile(const QString &path)
    : m_target(targetOf(path))
{}

ZtPartFile::~ZtPartFile()
{
    if (!m_file.fileName().isEmpty())
        m_file.remove();
}

bool ZtPartFile::open()
{
    const QFileInfo target(m_target);
    if (target.isDir()) {
        m_error = ZtFileFault::text(EISDIR);
        return false;
    }
    for (int i = 0; i < mostTries; ++i) {
        QFile part(partPath(m_target));
        if (part.exists())
            continue;
        m_file.setFileName(part.fileName());
        if (m_file.open(QIODevice::WriteOnly | QIODevice::NewOnly)) {
            if (target.exists())
                m_file.setPermissions(target.permissions());
            return true;
        }
        m_error = ZtFileFault::text(m_file);
        m_file.setFileName(QString());
        if (!part.exists())
            return false;
    }
    return false;
}

QString ZtPartFile::errorString() const
{
    return m_error.isEmpty() ? ZtFileFault::text(m_file) : m_error;
}

bool ZtPartFile::commit()
{
    m_file.close();
    if (m_file.error() != QFileDevice::NoError)
        return false;
    std::error_code error;
    std::filesystem::rename(toNative(m_file.fileName()), toNative(m_target), error);
    if (error) {
        m_error = ZtFileFault::text(error.default_error_condition().value());
        return false;
    }
    m_file.setFileName(QString());
    return true;
}

void ZtPartFile::removeStale(const QString &path)
{
    const QFileInfo target(targetOf(path));
    const QRegularExpression pattern(QStringLiteral("^%1\\.([1-9][0-9]{0,9})-[a-z]{%2}%3$")
                                         .arg(QRegularExpression::escape(target.fileName()))
                                         .arg(letterCount)
                                         .arg(QRegularExpression::escape(suffix)));
    const auto filters = QDir::Files | QDir::Hidden | QDir::NoSymLinks;
    for (const QFileInfo &part : target.absoluteDir().entryInfoList({QLatin1Char('*') + suffix}, filters)) {
        const QRegularExpressionMatch match = pattern.match(part.fileName());
        if (match.hasMatch() && isStale(part, match.captured(1).toLongLong()))
            QFile::remove(part.filePath());
    }
}
