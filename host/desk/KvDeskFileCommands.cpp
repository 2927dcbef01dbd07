// SPDX-License-Identifier: MIT
#include "KvDeskFileCommands.h"

#include "KvDeskFileKind.h"
#include "KvDeskRecentFiles.h"
#include "KvDeskSession.h"
#include "KvDeskStatus.h"
#include "KvDeskWaitCursor.h"
#include "common/ZtAppStatus.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtSession.h"

#include <QFileDialog>
#include <QMessageBox>
#include <QPushButton>

namespace {

const char groupName[] = "Desk";
const char folderKey[] = "Folder";

QString lastFolder()
{
    ZtAppSettings::beginGroup(QLatin1String(groupName));
    const QString folder = ZtAppSettings::value(QLatin1String(folderKey)).toString();
    ZtAppSettings::endGroup();
    return QDir(folder).exists() ? folder : QString();
}

void rememberFolder(const QString &path)
{
    ZtAppSettings::beginGroup(QLatin1String(groupName));
    ZtAppSettings::setValue(QLatin1String(folderKey), QFileInfo(path).absolutePath());
    ZtAppSettings::endGroup();
}

QString fileName(const QString &path)
{
    return QFileInfo(path).fileName();
}

QString filterOf(const QString &name, const QStringList &patterns)
{
    return QStringLiteral("%1 (%2)").arg(name, patterns.join(QLatin1Char(' ')));
}

QString sessionFilter()
{
    return filterOf(KvDeskFileCommands::tr("Sessions"), {QStringLiteral("*.json")});
}

QString withAllFiles(const QString &filter)
{
    return filter + QStringLiteral(";;") +
           filterOf(KvDeskFileCommands::tr("All files"), {QStringLiteral("*")});
}

} // namespace

KvDeskFileCommands::KvDeskFileCommands(KvDeskSession *session, QWidget *window)
    : QObject(window)
    , m_session(session)
    , m_window(window)
{}

bool KvDeskFileCommands::maybeSave()
{
    if (!m_session->isModified())
        return true;
    const auto answer = QMessageBox::question(
        m_window, tr("Unsaved changes"), tr("Save the changes to \"%1\"?").arg(m_session->displayName()),
        QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel, QMessageBox::Save);
    if (answer == QMessageBox::Save)
        return slotSaveSession();
    return answer == QMessageBox::Discard;
}

bool KvDeskFileCommands::openFile(const QString &path)
{
    switch (KvDeskFileKind::of(path)) {
    case KvDeskFileKind::Session:
        return openSession(path);
    case KvDeskFileKind::Image:
        return openImage(path);
    default:
        return importTable(path);
    }
}

bool KvDeskFileCommands::openSession(const QString &path)
{
    if (!maybeSave())
        return false;
    const auto open = [this, &path](bool withoutImage, ZtFault *fault) {
        const KvDeskWaitCursor wait;
        return m_session->open(path, withoutImage, fault);
    };
    ZtFault fault;
    const bool isOpen = open(false, &fault) || (isOnlyImageMissing(path, fault) &&
                                                askToOpenWithoutImage(fault) && open(true, &fault));
    if (!isOpen) {
        tellFault(tr("The session \"%1\" was not opened.").arg(fileName(path)), fault,
                  QStringLiteral("KvDeskFileCommands::openSession"));
        return false;
    }
    KvDeskRecentFiles::add(path);
    KvDeskStatus::log(
        ZtAppStatus::Information,
        tr("Session opened: %1 (objects: %2)").arg(fileName(path)).arg(m_session->objectCount()),
        QStringLiteral("KvDeskFileCommands::openSession"));
    return true;
}

bool KvDeskFileCommands::isOnlyImageMissing(const QString &path, const ZtFault &fault) const
{
    ZtSession session;
    ZtFault sessionFault;
    return fault.place == QLatin1String("image") && ZtSession::load(path, &session, &sessionFault);
}

bool KvDeskFileCommands::askToOpenWithoutImage(const ZtFault &fault)
{
    QMessageBox box(QMessageBox::Question, tr("Image missing"), tr("Open the session without its image?"),
                    QMessageBox::Open | QMessageBox::Cancel, m_window);
    box.setInformativeText(fault.text());
    return box.exec() == QMessageBox::Open;
}

bool KvDeskFileCommands::openImage(const QString &path)
{
    ZtFault fault;
    bool isOpen = false;
    {
        const KvDeskWaitCursor wait;
        isOpen = m_session->openImage(path, &fault);
    }
    const QString source = QStringLiteral("KvDeskFileCommands::openImage");
    if (!isOpen)
        tellFault(tr("The image \"%1\" was not opened.").arg(fileName(path)), fault, source);
    else
        KvDeskStatus::log(ZtAppStatus::Information, tr("Image opened: %1").arg(fileName(path)), source);
    return isOpen;
}

bool KvDeskFileCommands::importTable(const QString &path)
{
    ZtFault fault;
    QStringList notes;
    const int before = m_session->objectCount();
    bool isImported = false;
    {
        const KvDeskWaitCursor wait;
        isImported = m_session->importTable(path, &fault, &notes);
    }
    const QString source = QStringLiteral("KvDeskFileCommands::importTable");
    if (!isImported) {
        tellFault(tr("The table \"%1\" was not imported.").arg(fileName(path)), fault, source);
        return false;
    }
    for (const QString &note : qAsConst(notes))
        KvDeskStatus::log(ZtAppStatus::Warning, tr("%1: %2", "file, remark").arg(fileName(path), note),
                          source);
    const int added = m_session->objectCount() - before;
    KvDeskStatus::log(ZtAppStatus::Information,
                      tr("Table imported: %1 (objects: %2)").arg(fileName(path)).arg(added), source);
    return true;
}

bool KvDeskFileCommands::saveSession(const QString &path)
{
    ZtFault fault;
    bool isSaved = false;
    {
        const KvDeskWaitCursor wait;
        isSaved = m_session->save(path, &fault);
    }
    const QString source = QStringLiteral("KvDeskFileCommands::saveSession");
    if (!isSaved) {
        tellFault(tr("The session \"%1\" was not saved.").arg(fileName(path)), fault, source);
        return false;
    }
    KvDeskRecentFiles::add(path);
    KvDeskStatus::log(ZtAppStatus::Information, tr("Session saved: %1").arg(fileName(path)), source);
    return true;
}

void KvDeskFileCommands::slotNewSession()
{
    if (maybeSave())
        m_session->clear();
}

void KvDeskFileCommands::slotOpenSession()
{
    const QString path = chooseFile(tr("Open session"), withAllFiles(sessionFilter()));
    if (!path.isEmpty())
        openSession(path);
}

void KvDeskFileCommands::slotOpenImage()
{
    const QString path =
        chooseFile(tr("Open image"), withAllFiles(filterOf(tr("Images"), KvDeskFileKind::imagePatterns())));
    if (!path.isEmpty())
        openImage(path);
}

void KvDeskFileCommands::slotImportTable()
{
    const QString path =
        chooseFile(tr("Import table"), withAllFiles(filterOf(tr("Tables"), KvDeskFileKind::tablePatterns())));
    if (!path.isEmpty())
        importTable(path);
}

bool KvDeskFileCommands::slotSaveSession()
{
    return m_session->path().isEmpty() ? slotSaveSessionAs() : saveSession(m_session->path());
}

bool KvDeskFileCommands::slotSaveSessionAs()
{
    QFileDialog dialog(m_window, tr("Save session"), lastFolder(), sessionFilter());
    dialog.setAcceptMode(QFileDialog::AcceptSave);
    dialog.setFileMode(QFileDialog::AnyFile);
    dialog.setDefaultSuffix(QStringLiteral("json"));
    if (!m_session->path().isEmpty())
        dialog.selectFile(m_session->path());
    QString path;
    return choose(&dialog, &path) && saveSession(path);
}

QString KvDeskFileCommands::chooseFile(const QString &caption, const QString &filter)
{
    QFileDialog dialog(m_window, caption, lastFolder(), filter);
    dialog.setFileMode(QFileDialog::ExistingFile);
    QString path;
    choose(&dialog, &path);
    return path;
}

bool KvDeskFileCommands::choose(QFileDialog *dialog, QString *path)
{
    if (dialog->exec() != QDialog::Accepted || dialog->selectedFiles().isEmpty())
        return false;
    *path = dialog->selectedFiles().first();
    rememberFolder(*path);
    return true;
}

void KvDeskFileCommands::tellFault(const QString &what, const ZtFault &fault, const QString &source)
{
    KvDeskStatus::log(ZtAppStatus::Error, what + QLatin1Char(' ') + fault.text(), source);
    QMessageBox box(QMessageBox::Warning, tr("Measuring Desk"), what, QMessageBox::Ok, m_window);
    box.setInformativeText(fault.text());
    box.exec();
}
