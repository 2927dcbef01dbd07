// SPDX-License-Identifier: MIT
#include "KvDeskGuideCommand.h"

#include "KvDeskActions.h"
#include "KvDeskDataFolder.h"
#include "KvDeskGuideWindow.h"

#include <QAction>

namespace {

QString fileOf(const QString &language)
{
    return language.isEmpty() ? QStringLiteral("user-guide.md")
                              : QStringLiteral("user-guide.%1.md").arg(language);
}

QString find(const QString &fileName, const QString &programFolder)
{
    const QString folder = KvDeskDataFolder::find(QStringLiteral("measuringdesk/guide"),
                                                  QStringLiteral("docs"), fileName, programFolder);
    return folder.isEmpty() ? folder : folder + QLatin1Char('/') + fileName;
}

} // namespace

QString KvDeskGuideCommand::guide(const QString &language, const QString &programFolder)
{
    const QString translated = find(fileOf(language), programFolder);
    return translated.isEmpty() ? find(fileOf(QString()), programFolder) : translated;
}

KvDeskGuideCommand::KvDeskGuideCommand(KvDeskActions *actions, const QString &path, QObject *parent)
    : QObject(parent)
    , m_path(path)
{
    actions->setPossible(KvDeskActions::Guide, !m_path.isEmpty(), tr("The user guide is not installed"));
    connect(actions->action(KvDeskActions::Guide), SIGNAL(triggered()), this, SLOT(slotShow()));
}

KvDeskGuideCommand::~KvDeskGuideCommand() = default;

void KvDeskGuideCommand::slotShow()
{
    if (!m_window)
        m_window = std::make_unique<KvDeskGuideWindow>(m_path);
    if (m_window->isVisible())
        bringToFront();
    m_window->show();
    m_window->activateWindow();
}

void KvDeskGuideCommand::bringToFront()
{
    m_window->setWindowState(m_window->windowState() & ~Qt::WindowMinimized);
    m_window->raise();
}
