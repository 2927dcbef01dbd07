// SPDX-License-Identifier: MIT
#include "measuring/ZtVideoFileSource.h"

#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtVideoSurface.h"

#include <QDir>
#include <QFileInfo>
#include <QMediaContent>
#include <QMediaPlayer>
#include <QUrl>

namespace {

// Muted, the player would still connect to the sound system, and complain where there is none.
void playWithoutSoundSystem()
{
    const char *const variable = "QT_GSTREAMER_PLAYBIN_AUDIOSINK";
    if (!qEnvironmentVariableIsSet(variable))
        qputenv(variable, "fakesink");
}

} // namespace

std::unique_ptr<ZtVideoFileSource> ZtVideoFileSource::load(const QString &path, ZtFault *fault)
{
    *fault = ZtFault();
    fault->file = path;
    const QFileInfo file(path);
    if (!file.exists())
        fault->message = tr("The video does not exist");
    else if (!file.isFile() || !QFile(path).open(QIODevice::ReadOnly))
        fault->message = tr("The video cannot be read");
    else if (file.size() == 0)
        fault->message = tr("The video is empty");
    if (!fault->isNull())
        return nullptr;
    return std::unique_ptr<ZtVideoFileSource>(
        new ZtVideoFileSource(QDir::cleanPath(file.absoluteFilePath())));
}

ZtVideoFileSource::ZtVideoFileSource(const QString &path)
    // A film with few pictures is no broken device.
    : ZtLiveFrameSource(0)
    , m_path(path)
    , m_surface(std::make_unique<ZtVideoSurface>())
{}

ZtVideoFileSource::~ZtVideoFileSource()
{
    closeMailbox();
    ZtVideoFileSource::endCapture();
}

QString ZtVideoFileSource::displayName() const
{
    return QFileInfo(m_path).fileName();
}

void ZtVideoFileSource::beginCapture(const std::shared_ptr<ZtFrameMailbox> &mailbox)
{
    m_surface->setMailbox(mailbox);
    playWithoutSoundSystem();
    m_player = std::make_unique<QMediaPlayer>(nullptr, QMediaPlayer::VideoSurface);
    connectSignals();
    m_player->setMuted(true);
    m_player->setVideoOutput(m_surface.get());
    m_player->setMedia(QMediaContent(QUrl::fromLocalFile(m_path)));
}

void ZtVideoFileSource::connectSignals()
{
    // Queued, as the player is deleted in answer to some of them.
    connect(m_player.get(), SIGNAL(mediaStatusChanged(QMediaPlayer::MediaStatus)), this,
                                   SLOT(slotMediaStatusChanged()), Qt::QueuedConnection);
    connect(m_player.get(), SIGNAL(error(QMediaPlayer::Error)), this,
                                   SLOT(slotError()), Qt::QueuedConnection);
}

void ZtVideoFileSource::endCapture()
{
    m_surface->setMailbox(nullptr);
    if (!m_player)
        return;
    m_player->disconnect(this);
    m_player.reset();
}

void ZtVideoFileSource::slotMediaStatusChanged()
{
    if (!m_player)
        return;
    switch (m_player->mediaStatus()) {
    case QMediaPlayer::EndOfMedia:
        m_player->setPosition(0);
        m_player->play();
        break;
    case QMediaPlayer::InvalidMedia:
        loseVideo(m_player->errorString());
        break;
    case QMediaPlayer::LoadedMedia:
        m_player->play();
        break;
    case QMediaPlayer::BufferedMedia:
        if (!m_player->isVideoAvailable() && m_player->isAudioAvailable())
            loseVideo(tr("there is only sound in it"));
        break;
    default:
        break;
    }
}

void ZtVideoFileSource::slotError()
{
    if (m_player && m_player->error() != QMediaPlayer::NoError)
        loseVideo(m_player->errorString());
}

void ZtVideoFileSource::loseVideo(const QString &reason)
{
    lose(tr("The video %1 cannot be played (%2)")
             .arg(ZtLeftToRight::isolated(displayName()),
                  reason.isEmpty() ? tr("the file is damaged") : reason));
}
