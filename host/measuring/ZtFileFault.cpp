// SPDX-License-Identifier: MIT
#include "measuring/ZtFileFault.h"

#include <QFile>
#include <QFileInfo>

#include <cerrno>
#include <cstring>

namespace {

struct Cause
{
    int errorNumber;
    const char *text; ///< in English the system's own words
};

constexpr Cause causes[] = {
    {ENOENT, QT_TRANSLATE_NOOP("ZtFileFault", "No such file or directory")},
    {EACCES, QT_TRANSLATE_NOOP("ZtFileFault", "Permission denied")},
    {EISDIR, QT_TRANSLATE_NOOP("ZtFileFault", "Is a directory")},
    {ENOTDIR, QT_TRANSLATE_NOOP("ZtFileFault", "Not a directory")},
    {ENAMETOOLONG, QT_TRANSLATE_NOOP("ZtFileFault", "File name too long")},
    {ENOSPC, QT_TRANSLATE_NOOP("ZtFileFault", "No space left on device")},
    {EROFS, QT_TRANSLATE_NOOP("ZtFileFault", "Read-only file system")},
    {EIO, QT_TRANSLATE_NOOP("ZtFileFault", "Input/output error")},
};

// Two of the kinds of errors that files tell apart have a cause of their own; the rest is too coarse.
int errorNumberOf(QFileDevice::FileError error)
{
    const bool isDevice = error == QFileDevice::ReadError || error == QFileDevice::WriteError;
    return isDevice ? EIO : error == QFileDevice::PermissionsError ? EACCES : 0;
}

bool saysNothing(const QFileDevice &file)
{
    const QString text = file.errorString();
    return text.isEmpty() || text == QFile().errorString(); // what Qt says where nothing is known
}

} // namespace

QString ZtFileFault::text(int errorNumber)
{
    for (const Cause &cause : causes) {
        if (cause.errorNumber == errorNumber)
            return tr(cause.text);
    }
    return QString::fromLocal8Bit(std::strerror(errorNumber));
}

QString ZtFileFault::text(const QFileDevice &file)
{
    // Opening a folder is refused before the system could say why.
    if (QFileInfo(file.fileName()).isDir())
        return text(EISDIR);
    // A file keeps the words of its error, not the number. They are those that Qt has for a number.
    for (const Cause &cause : causes) {
        if (file.errorString() == qt_error_string(cause.errorNumber))
            return tr(cause.text);
    }
    const int errorNumber = saysNothing(file) ? errorNumberOf(file.error()) : 0;
    return errorNumber != 0 ? text(errorNumber) : file.errorString();
}
