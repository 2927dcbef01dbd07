// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtLiveFrameSource.h"

#include <memory>

class QMediaPlayer;
class ZtVideoSurface;
struct ZtFault;

/** A video file, played without sound over and over as a camera would deliver it, through Qt Multimedia. */
class ZT_MEASURING_EXPORT ZtVideoFileSource : public ZtLiveFrameSource
{
    Q_OBJECT
public:
    /** Opens a file, stopped; null with a fault when it cannot be read. Whether it is a video shows when it
     * is played. */
    static std::unique_ptr<ZtVideoFileSource> load(const QString &path, ZtFault *fault);
    ~ZtVideoFileSource() override;

    QString displayName() const override;

    /** Absolute path of the file. */
    QString path() const { return m_path; }

protected:
    void beginCapture(const std::shared_ptr<ZtFrameMailbox> &mailbox) override;
    void endCapture() override;

private slots:
    void slotMediaStatusChanged();
    void slotError();

private:
    explicit ZtVideoFileSource(const QString &path);
    void connectSignals();
    void loseVideo(const QString &reason);

    QString m_path;
    std::unique_ptr<ZtVideoSurface> m_surface;
    std::unique_ptr<QMediaPlayer> m_player; ///< null while not running
};
