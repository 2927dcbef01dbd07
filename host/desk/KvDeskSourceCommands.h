// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFrameSourceInfo.h"

#include <QObject>

#include <optional>

class KvDeskFileCommands;
class KvDeskSession;
class ZtFrameSource;

/** Shows live images for the user: of cameras, and of folders and videos that are played like one. */
class KvDeskSourceCommands : public QObject
{
    Q_OBJECT
public:
    /** Both have to outlive this. */
    KvDeskSourceCommands(KvDeskSession *session, KvDeskFileCommands *files, QObject *parent = nullptr);

    /** Shows a source and starts it; tells the user when that fails, and leaves the image as it is. */
    bool open(const ZtFrameSourceInfo &info);
    /** What open() opened and is still shown. */
    std::optional<ZtFrameSourceInfo> current() const;

public slots:
    void slotOpenImage();
    void slotOpenFolder();
    void slotOpenVideo();

private:
    KvDeskSession *m_session;
    KvDeskFileCommands *m_files;
    ZtFrameSourceInfo m_info;
    const ZtFrameSource *m_source = nullptr; ///< that m_info stands for; only compared
};
