// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtLiveFrameSource.h"

#include <memory>

class ZtWorkerThread;
struct ZtFault;

/**
 * The pictures of a folder, played as a camera would deliver them: over and over, in the natural order of
 * their names (picture 2 before picture 10).
 *
 * Files that cannot be read are skipped with a fault each. The folder is looked at anew in each round, so it
 * may still be filled.
 */
class ZT_MEASURING_EXPORT ZtImageFolderSource : public ZtLiveFrameSource
{
    Q_OBJECT
public:
    static constexpr double defaultFramesPerSecond = 25.0;

    /** Opens a folder, stopped; null with a fault when it cannot be read or holds no pictures. */
    static std::unique_ptr<ZtImageFolderSource> load(const QString &path, ZtFault *fault,
                                                     double framesPerSecond = defaultFramesPerSecond);
    ~ZtImageFolderSource() override;

    QString displayName() const override;

    /** Absolute path of the folder. */
    QString path() const { return m_path; }

    /** The speed of playing; where decoding takes longer, it is slower. */
    double framesPerSecond() const { return m_framesPerSecond; }

    /** Names of the picture files of a folder, judged by their suffixes, in natural order. */
    static QStringList pictureNames(const QString &path);

protected:
    void beginCapture(const std::shared_ptr<ZtFrameMailbox> &mailbox) override;
    void endCapture() override;

private:
    ZtImageFolderSource(const QString &path, double framesPerSecond);

    QString m_path;
    double m_framesPerSecond;
    std::unique_ptr<ZtWorkerThread> m_thread;
};
