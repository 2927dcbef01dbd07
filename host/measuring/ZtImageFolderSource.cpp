// SPDX-License-Identifier: MIT
#include "measuring/ZtImageFolderSource.h"

#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtFrameMailbox.h"
#include "measuring/ZtPicture.h"
#include "measuring/ZtPictureReader.h"
#include "measuring/ZtWorkerThread.h"

#include <QCollator>
#include <QDeadlineTimer>
#include <QDir>
#include <QFileInfo>
#include <QImageReader>
#include <QLocale>
#include <QSet>

#include <algorithm>
#include <filesystem>

namespace {

/// Decodes the pictures of a folder in a thread of its own.
class FolderPlayer
{
public:
    FolderPlayer(const QString &path, double framesPerSecond, std::shared_ptr<ZtFrameMailbox> mailbox)
        : m_path(path)
        , m_interval(static_cast<qint64>(1e6 / framesPerSecond))
        , m_mailbox(std::move(mailbox))
    {}

    void play()
    {
        m_due = QDeadlineTimer::current(Qt::PreciseTimer);
        while (playOnce()) {
        }
    }

private:
    // False when there is nothing more to play.
    bool playOnce()
    {
        bool isAnyShown = false;
        for (const QString &name : ZtImageFolderSource::pictureNames(m_path)) {
            if (m_mailbox->isClosed())
                return false;
            isAnyShown = show(m_path + QLatin1Char('/') + name) || isAnyShown;
        }
        if (!isAnyShown)
            m_mailbox->fail(ZtImageFolderSource::tr("%1: no picture of the folder can be shown")
                                .arg(ZtLeftToRight::isolated(m_path)));
        return isAnyShown;
    }

    bool show(const QString &file)
    {
        ZtPicture picture;
        ZtFault fault;
        if (!ZtPictureReader::read(file, ZtPictureReader::maximumPixels, &picture, &fault)) {
            reportOnce(file, fault);
            return false;
        }
        // What screens draw without converting it, prepared where it delays nobody.
        const QImage frame = std::move(picture.image).convertToFormat(QImage::Format_RGB32);
        if (!waitUntilDue())
            m_mailbox->put(frame);
        return true;
    }

    void reportOnce(const QString &file, const ZtFault &fault)
    {
        if (m_broken.contains(file))
            return;
        m_broken.insert(file);
        m_mailbox->report(fault.text());
    }

    // True when the mailbox was closed meanwhile.
    bool waitUntilDue()
    {
        const bool isClosed = m_mailbox->waitForClose(static_cast<int>(m_due.remainingTime()));
        // A picture that came late does not make those after it come faster.
        m_due = QDeadlineTimer::addNSecs(std::max(m_due, QDeadlineTimer::current(Qt::PreciseTimer)),
                                         m_interval * 1000);
        return isClosed;
    }

    QString m_path;
    qint64 m_interval; ///< microseconds
    std::shared_ptr<ZtFrameMailbox> m_mailbox;
    QDeadlineTimer m_due;
    QSet<QString> m_broken;
};

// Opened, not asked: permissions on paper say little about network folders and changed users.
bool canBeListed(const QString &path)
{
    std::error_code error;
    const std::filesystem::directory_iterator entries(QFile::encodeName(path).toStdString(), error);
    return !error;
}

QStringList nameFilters()
{
    QStringList filters;
    for (const QByteArray &format : QImageReader::supportedImageFormats())
        filters.append(QStringLiteral("*.") + QString::fromLatin1(format));
    filters.append({QStringLiteral("*.tif"), QStringLiteral("*.tiff")});
    return filters;
}

} // namespace

std::unique_ptr<ZtImageFolderSource> ZtImageFolderSource::load(const QString &path, ZtFault *fault,
                                                               double framesPerSecond)
{
    *fault = ZtFault();
    fault->file = path;
    const QFileInfo folder(path);
    // Not asked whether it is a folder: one that is closed to the user is said not to be.
    if (!folder.exists() || folder.isFile())
        fault->message = tr("The folder does not exist");
    else if (!canBeListed(path))
        fault->message = tr("The folder cannot be read");
    else if (pictureNames(path).isEmpty())
        fault->message = tr("The folder holds no pictures");
    if (!fault->isNull())
        return nullptr;
    const QString absolute = QDir::cleanPath(folder.absoluteFilePath());
    return std::unique_ptr<ZtImageFolderSource>(
        new ZtImageFolderSource(absolute, qBound(0.01, framesPerSecond, 1000.0)));
}

ZtImageFolderSource::ZtImageFolderSource(const QString &path, double framesPerSecond)
    // A slow folder is no broken device.
    : ZtLiveFrameSource(0)
    , m_path(path)
    , m_framesPerSecond(framesPerSecond)
{}

ZtImageFolderSource::~ZtImageFolderSource()
{
    closeMailbox();
    ZtImageFolderSource::endCapture();
}

QString ZtImageFolderSource::displayName() const
{
    return QFileInfo(m_path).fileName();
}

QStringList ZtImageFolderSource::pictureNames(const QString &path)
{
    QStringList names = QDir(path).entryList(nameFilters(), QDir::Files, QDir::Name);
    // Of a locale of its own: the one of plain C has no numeric mode.
    QCollator collator{QLocale(QLocale::English)};
    collator.setNumericMode(true);
    collator.setCaseSensitivity(Qt::CaseInsensitive);
    // Names that differ in their letter cases alone keep the order of the folder.
    std::stable_sort(names.begin(), names.end(), collator);
    return names;
}

void ZtImageFolderSource::beginCapture(const std::shared_ptr<ZtFrameMailbox> &mailbox)
{
    m_thread = ZtWorkerThread::begin(
        [player = FolderPlayer(m_path, m_framesPerSecond, mailbox)]() mutable { player.play(); });
}

void ZtImageFolderSource::endCapture()
{
    ZtWorkerThread::retire(std::move(m_thread));
}
