// SPDX-License-Identifier: MIT
#include "KvDeskSourceCommands.h"

#include "KvDeskFileCommands.h"
#include "KvDeskSession.h"
#include "KvDeskStatus.h"
#include "common/ZtAppStatus.h"
#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtFrameSourceCatalogue.h"
#include "measuring/ZtMeasuringDocument.h"

KvDeskSourceCommands::KvDeskSourceCommands(KvDeskSession *session, KvDeskFileCommands *files, QObject *parent)
    : QObject(parent)
    , m_session(session)
    , m_files(files)
{}

bool KvDeskSourceCommands::open(const ZtFrameSourceInfo &info)
{
    const std::optional<ZtFrameSourceInfo> shown = current();
    if (shown == info) {
        // Opened a second time, a camera would be in the way of itself.
        m_session->document()->frameSource()->start();
        return true;
    }
    const QString source = QStringLiteral("KvDeskSourceCommands::open");
    ZtFault fault;
    std::unique_ptr<ZtFrameSource> opened = ZtFrameSourceCatalogue::open(info, &fault);
    if (!opened) {
        m_files->tellFault(
            tr("The image source \"%1\" was not opened.").arg(ZtLeftToRight::isolated(info.title)), fault,
            source);
        return false;
    }
    m_info = info;
    m_source = opened.get();
    m_session->showSource(std::move(opened));
    KvDeskStatus::log(ZtAppStatus::Information,
                      tr("Image source: %1").arg(ZtLeftToRight::isolated(info.title)), source);
    // Now the status log hears of what goes wrong.
    m_session->document()->frameSource()->start();
    return true;
}

std::optional<ZtFrameSourceInfo> KvDeskSourceCommands::current() const
{
    const bool isShown = m_source && m_source == m_session->document()->frameSource();
    return isShown ? std::optional<ZtFrameSourceInfo>(m_info) : std::nullopt;
}

void KvDeskSourceCommands::slotOpenImage()
{
    m_files->slotOpenImage();
}

void KvDeskSourceCommands::slotOpenFolder()
{
    const QString path = m_files->chooseFolder(tr("Open image folder"));
    if (!path.isEmpty())
        open(ZtFrameSourceCatalogue::infoOfPath(path));
}

void KvDeskSourceCommands::slotOpenVideo()
{
    QStringList patterns;
    for (const QString &suffix : ZtFrameSourceCatalogue::videoSuffixes())
        patterns.append(QStringLiteral("*.") + suffix);
    const QString path = m_files->chooseFile(tr("Open video"), tr("Videos"), patterns);
    if (path.isEmpty())
        return;
    // The user says that it is a video, whatever its name is.
    ZtFrameSourceInfo info = ZtFrameSourceCatalogue::infoOfPath(path);
    info.kind = ZtFrameSourceInfo::VideoFile;
    open(info);
}
