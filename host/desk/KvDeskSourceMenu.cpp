// SPDX-License-Identifier: MIT
#include "KvDeskSourceMenu.h"

#include "KvDeskSourceCommands.h"
#include "gui/acss.h"
#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtFrameSourceCatalogue.h"
#include "measuring/ZtFrameSourceScan.h"

Q_DECLARE_METATYPE(ZtFrameSourceInfo)

namespace {

constexpr QSize iconSize(24, 24);

QIcon iconOf(const char *name)
{
    return acss::createIcon(6, QStringLiteral("Icons/") + QLatin1String(name), iconSize);
}

} // namespace

KvDeskSourceMenu::KvDeskSourceMenu(KvDeskSourceCommands *commands, QWidget *parent)
    : QMenu(tr("Image &source"), parent)
    , m_commands(commands)
    , m_scan(new ZtFrameSourceScan(this))
{
    setIcon(iconOf("camera"));
    setToolTipsVisible(true);
    createFiles();
    addSeparator();
    slotListCameras();
    connect(this, SIGNAL(aboutToShow()), this, SLOT(slotAboutToShow()));
    connect(this, SIGNAL(triggered(QAction*)), this, SLOT(slotTriggered(QAction*)));
    connect(m_scan, SIGNAL(signalFinished()), this, SLOT(slotListCameras()));
}

KvDeskSourceMenu::~KvDeskSourceMenu() = default;

void KvDeskSourceMenu::createFiles()
{
    addAction(iconOf("open-image"), tr("Still &image..."), m_commands, SLOT(slotOpenImage()));
    addAction(tr("Image &folder..."), m_commands,
              SLOT(slotOpenFolder()))->setToolTip(tr("Play the images of a folder like a camera"));
    if (ZtFrameSourceCatalogue::isAvailable(ZtFrameSourceInfo::VideoFile))
        addAction(tr("&Video..."), m_commands,
                  SLOT(slotOpenVideo()))->setToolTip(tr("Play a video like a camera"));
}

void KvDeskSourceMenu::slotAboutToShow()
{
    m_scan->start();
    slotListCameras();
}

void KvDeskSourceMenu::clearCameras()
{
    qDeleteAll(m_cameras);
    m_cameras.clear();
}

void KvDeskSourceMenu::addRemark(const QString &text)
{
    m_cameras.append(addAction(text));
    m_cameras.last()->setEnabled(false);
}

void KvDeskSourceMenu::slotListCameras()
{
    clearCameras();
    const std::optional<ZtFrameSourceInfo> current = m_commands->current();
    for (const ZtFrameSourceInfo &camera : m_scan->sources()) {
        // An ampersand would underline the letter after it.
        QAction *const action =
            addAction(iconOf("camera"),
                      ZtLeftToRight::isolated(camera.title).replace(QLatin1Char('&'), QLatin1String("&&")));
        action->setData(QVariant::fromValue(camera));
        action->setCheckable(true);
        action->setChecked(current == camera);
        m_cameras.append(action);
    }
    if (m_scan->isRunning())
        addRemark(tr("Looking for cameras..."));
    else if (m_cameras.isEmpty())
        addRemark(tr("No camera is connected"));
}

void KvDeskSourceMenu::slotTriggered(QAction *aAction)
{
    if (m_cameras.contains(aAction) && aAction->data().isValid())
        m_commands->open(aAction->data().value<ZtFrameSourceInfo>());
}
