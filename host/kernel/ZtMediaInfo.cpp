// SPDX-License-Identifier: MIT
#include "kernel/ZtMediaInfo.h"

namespace {

struct Suffix
{
    const char *suffix;
    const char *format;
    ZtMediaInfo::MediaType type;
};

constexpr Suffix knownSuffixes[] = {
    {"png", "png", ZtMediaInfo::Image},   {"jpg", "jpeg", ZtMediaInfo::Image},
    {"jpeg", "jpeg", ZtMediaInfo::Image}, {"tif", "tiff", ZtMediaInfo::Image},
    {"tiff", "tiff", ZtMediaInfo::Image}, {"bmp", "bmp", ZtMediaInfo::Image},
    {"gif", "gif", ZtMediaInfo::Image},   {"avi", "avi", ZtMediaInfo::Video},
    {"mp4", "mp4", ZtMediaInfo::Video},   {"mov", "mov", ZtMediaInfo::Video},
    {"mkv", "mkv", ZtMediaInfo::Video},   {"wmv", "wmv", ZtMediaInfo::Video},
};

} // namespace

QString ZtMediaInfo::findMediaFileFormat(const QString &suffix)
{
    for (const Suffix &known : knownSuffixes) {
        if (suffix.compare(QLatin1String(known.suffix), Qt::CaseInsensitive) == 0)
            return QLatin1String(known.format);
    }
    return QString();
}

int ZtMediaInfo::findMediaType(const QString &format)
{
    for (const Suffix &known : knownSuffixes) {
        if (format == QLatin1String(known.format))
            return known.type;
    }
    return UnknownMedia;
}

QStringList ZtMediaInfo::suffixes(MediaType type)
{
    QStringList found;
    for (const Suffix &known : knownSuffixes) {
        if (known.type == type)
            found.append(QLatin1String(known.suffix));
    }
    return found;
}
