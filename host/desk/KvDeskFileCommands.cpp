// SPDX-License-Identifier: MIT
#include "KvDeskFileCommands.h"

#include "KvDeskFileKind.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskProgress.h"
#include "KvDeskRecentFiles.h"
#include "KvDeskRecoveryFile.h"
#include "KvDeskSession.h"
#include "KvDeskStatus.h"
#include "KvDeskWaitCursor.h"
#include "common/ZtAppStatus.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtImportedTable.h"
#include "measuring/ZtLoadedSession.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtProgress.h"
#include "measuring/ZtReadyObjects.h"
#include "measuring/ZtTableImport.h"

#include <QDir>
#include <QFileDialog>
#include <QMap>
#include <QMessageBox>
#include <QPushButton>
#include <QScopedValueRollback>

#include <memory>
#include <utility>

namespace {

constexpr int mostFaultsTold = 10;

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
    return ZtLeftToRight::isolated(QFileInfo(path).fileName());
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

// What a thread makes of a file, and why not.
template <typename Result>
struct Reading
{
    Result result;
    ZtFault fault;
    bool isRead = false;
};

// A table with all of its objects.
struct LoadedTable
{
    ZtImportedTable table;
    std::vector<ZtReadyObjects> objects;

    bool read(const QString &path, ZtFault *fault, ZtProgress *progress)
    {
        if (!ZtTableImport::readFile(path, ZtTableImportOptions(), &table, fault, progress))
            return false;
        objects = ZtReadyObjects::ofTable(table, progress);
        return true;
    }
};

} // namespace

KvDeskFileCommands::KvDeskFileCommands(KvDeskSession *session, QWidget *window, KvDeskObjectEditor *editor)
    : QObject(window)
    , m_session(session)
    , m_window(window)
    , m_editor(editor)
    , m_progress(new KvDeskProgress(window))
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

void KvDeskFileCommands::openFiles(const QStringList &paths)
{
    QMap<int, QStringList> byKind;
    for (const QString &path : paths) {
        // Opening one that is not there says so.
        const bool isTried = KvDeskFileKind::isKnown(path) || !QFileInfo::exists(path);
        byKind[isTried ? KvDeskFileKind::of(path) : -1].append(path);
    }
    QStringList sessions = byKind.take(KvDeskFileKind::Session);
    QStringList others = byKind.take(-1);
    {
        const QScopedValueRollback<bool> collecting(m_isCollecting, true);
        // Another session would take the place of the first.
        if (!sessions.isEmpty() && !openSession(sessions.takeFirst()) && m_faults.isEmpty())
            return;
        for (const QString &path : byKind.take(KvDeskFileKind::Image))
            openImage(path);
        for (const QString &path : byKind.take(KvDeskFileKind::Table))
            importTable(path);
    }
    for (const QString &path : others + sessions)
        warnOfUnopened(path, sessions.contains(path));
    tellFaults();
}

void KvDeskFileCommands::warnOfUnopened(const QString &path, bool isSession)
{
    const QString text = isSession ? tr("Only one session can be open; not opened: %1")
                                   : tr("Neither a session, an image nor a table: %1");
    KvDeskStatus::log(ZtAppStatus::Warning, text.arg(fileName(path)),
                      QStringLiteral("KvDeskFileCommands::openFiles"));
}

bool KvDeskFileCommands::run(const QString &text, const std::function<void(ZtProgress *)> &work,
                             ZtFault *fault)
{
    const KvDeskProgress::Outcome outcome = m_progress->run(text, work);
    m_isCancelled = outcome == KvDeskProgress::Cancelled;
    if (outcome == KvDeskProgress::OutOfMemory)
        fault->message = tr("There is not enough memory");
    return outcome == KvDeskProgress::Done;
}

bool KvDeskFileCommands::openSession(const QString &path)
{
    ZtLoadedSession loaded;
    KvDeskFileStamp stamp;
    if (!maybeSave() || !readSession(path, &loaded, &stamp))
        return false;
    {
        const KvDeskWaitCursor wait;
        m_session->setSession(&loaded, path, stamp);
    }
    KvDeskRecentFiles::add(path);
    logOpened(path);
    return true;
}

bool KvDeskFileCommands::openCopy(const QString &path)
{
    ZtLoadedSession loaded;
    KvDeskFileStamp stamp;
    if (!maybeSave() || !readSession(path, &loaded, &stamp))
        return false;
    {
        const KvDeskWaitCursor wait;
        m_session->setCopy(&loaded);
    }
    logOpened(path);
    return true;
}

bool KvDeskFileCommands::readSession(const QString &path, ZtLoadedSession *loaded, KvDeskFileStamp *stamp)
{
    const QString source = QStringLiteral("KvDeskFileCommands::openSession");
    const QString failure = tr("The session \"%1\" was not opened.").arg(fileName(path));
    *stamp = KvDeskFileStamp::of(path);
    const auto reading = std::make_shared<Reading<ZtLoadedSession>>();
    ZtFault fault;
    const auto work = [reading, path](ZtProgress *progress) {
        reading->isRead = reading->result.read(path, &reading->fault, progress);
    };
    if (!run(tr("Opening \"%1\"").arg(fileName(path)), work, &fault))
        return tellFault(failure, fault, source);
    if (!reading->isRead)
        return tellFault(failure, reading->fault, source);
    const ZtFault missing{path, 0, 0, QStringLiteral("image"), reading->result.imageFault.text()};
    if (!missing.isNull() && !askToOpenWithoutImage(missing))
        return tellFault(failure, missing, source);
    *loaded = std::move(reading->result);
    return true;
}

void KvDeskFileCommands::logOpened(const QString &path)
{
    KvDeskStatus::log(
        ZtAppStatus::Information,
        tr("Session opened: %1 (%n object(s))", "", m_session->objectCount()).arg(fileName(path)),
        QStringLiteral("KvDeskFileCommands::openSession"));
}

bool KvDeskFileCommands::askToOpenWithoutImage(const ZtFault &fault)
{
    QMessageBox box(QMessageBox::Question, tr("Image missing"), tr("Open the session without its image?"),
                    QMessageBox::Open | QMessageBox::Cancel, m_window);
    box.setInformativeText(fault.text());
    return box.exec() == QMessageBox::Open;
}

bool KvDeskFileCommands::restoreSession(const QString &file, const KvDeskRecoveryFile &header)
{
    if (!maybeSave())
        return false;
    const QString source = QStringLiteral("KvDeskFileCommands::restoreSession");
    const QString failure = tr("The measurements were not restored.");
    const auto reading = std::make_shared<Reading<ZtLoadedSession>>();
    ZtFault fault;
    const auto work = [reading, file](ZtProgress *progress) {
        reading->isRead = KvDeskRecoveryFile::read(file, &reading->result, &reading->fault, progress);
    };
    if (!run(tr("Restoring measurements"), work, &fault))
        return tellFault(failure, fault, source);
    if (!reading->isRead)
        return tellFault(failure, reading->fault, source);
    // Measurements are worth more than the image below them: no reason to leave them in the copy.
    const ZtFault missing = reading->result.imageFault;
    {
        const KvDeskWaitCursor wait;
        m_session->restore(&reading->result, header.sessionPath, header.sessionStamp);
    }
    if (!missing.isNull())
        KvDeskStatus::log(ZtAppStatus::Warning, missing.text(), source);
    KvDeskStatus::log(ZtAppStatus::Information,
                      tr("Measurements restored: %1 (%n object(s))", "", m_session->objectCount())
                          .arg(m_session->displayName()),
                      source);
    return true;
}

bool KvDeskFileCommands::openImage(const QString &path)
{
    const QString source = QStringLiteral("KvDeskFileCommands::openImage");
    const QString failure = tr("The image \"%1\" was not opened.").arg(fileName(path));
    const auto reading = std::make_shared<Reading<ZtLoadedSession>>();
    reading->result.session.imagePath = path;
    ZtFault fault;
    const auto work = [reading](ZtProgress *progress) { reading->result.readImage(progress); };
    if (!run(tr("Opening \"%1\"").arg(fileName(path)), work, &fault))
        return tellFault(failure, fault, source);
    if (!reading->result.image)
        return tellFault(failure, reading->result.imageFault, source);
    {
        const KvDeskWaitCursor wait;
        m_session->showImage(std::move(reading->result.image));
    }
    KvDeskStatus::log(ZtAppStatus::Information, tr("Image opened: %1").arg(fileName(path)), source);
    return true;
}

bool KvDeskFileCommands::importTable(const QString &path)
{
    const QString source = QStringLiteral("KvDeskFileCommands::importTable");
    const QString failure = tr("The table \"%1\" was not imported.").arg(fileName(path));
    const auto reading = std::make_shared<Reading<LoadedTable>>();
    ZtFault fault;
    const auto work = [reading, path](ZtProgress *progress) {
        reading->isRead = reading->result.read(path, &reading->fault, progress);
    };
    if (!run(tr("Importing \"%1\"").arg(fileName(path)), work, &fault))
        return tellFault(failure, fault, source);
    if (!reading->isRead)
        return tellFault(failure, reading->fault, source);
    addTable(path, std::move(reading->result.objects));
    const ZtImportedTable &table = reading->result.table;
    for (const QString &note : table.notes)
        KvDeskStatus::log(ZtAppStatus::Warning, tr("%1: %2", "file, remark").arg(fileName(path), note),
                          source);
    KvDeskStatus::log(ZtAppStatus::Information,
                      tr("Table imported: %1 (%n object(s))", "", table.objectCount()).arg(fileName(path)),
                      source);
    return true;
}

void KvDeskFileCommands::addTable(const QString &path, std::vector<ZtReadyObjects> objects)
{
    const KvDeskWaitCursor wait;
    if (m_editor)
        m_editor->importTable(fileName(path), std::move(objects));
    else
        m_session->addTable(&objects);
}

bool KvDeskFileCommands::saveSession(const QString &path)
{
    const bool isOwnFile = QFileInfo(path).absoluteFilePath() == m_session->path();
    if (isOwnFile && m_session->isChangedOnDisk()) {
        const OnConflict answer = askToOverwrite();
        if (answer != OnConflict::Overwrite)
            return answer == OnConflict::SaveAs && slotSaveSessionAs();
    }
    ZtFault fault;
    if (!write(path, &fault))
        return failSaving(path, fault);
    KvDeskRecentFiles::add(path);
    KvDeskStatus::log(ZtAppStatus::Information, tr("Session saved: %1").arg(fileName(path)),
                      QStringLiteral("KvDeskFileCommands::saveSession"));
    return true;
}

bool KvDeskFileCommands::write(const QString &path, ZtFault *fault)
{
    struct Writing
    {
        ZtSession session;
        ZtFault fault;
        bool isWritten = false;
    };
    const auto writing = std::make_shared<Writing>();
    const quint64 change = m_session->changeCount();
    {
        const KvDeskWaitCursor wait;
        writing->session = m_session->document()->toSession();
    }
    const auto work = [writing, path](ZtProgress *progress) {
        writing->isWritten = writing->session.save(path, &writing->fault, progress);
    };
    if (!run(tr("Saving \"%1\"").arg(fileName(path)), work, fault))
        return false;
    *fault = writing->fault;
    if (writing->isWritten)
        m_session->setSaved(path, change);
    return writing->isWritten;
}

KvDeskFileCommands::OnConflict KvDeskFileCommands::askToOverwrite()
{
    QMessageBox box(
        QMessageBox::Question, tr("Session changed by another program"),
        tr("\"%1\" was changed by another program. Overwrite its changes?").arg(m_session->displayName()),
        QMessageBox::Cancel, m_window);
    const QAbstractButton *const overwrite = box.addButton(tr("Overwrite"), QMessageBox::DestructiveRole);
    QPushButton *const saveAs = box.addButton(tr("Save as..."), QMessageBox::AcceptRole);
    box.setDefaultButton(saveAs);
    box.exec();
    if (box.clickedButton() == overwrite)
        return OnConflict::Overwrite;
    return box.clickedButton() == saveAs ? OnConflict::SaveAs : OnConflict::Cancel;
}

bool KvDeskFileCommands::failSaving(const QString &path, const ZtFault &fault)
{
    const QString source = QStringLiteral("KvDeskFileCommands::saveSession");
    const QString failure = tr("The session \"%1\" was not saved.").arg(fileName(path));
    if (m_isCancelled)
        return tellFault(failure, fault, source);
    KvDeskStatus::log(ZtAppStatus::Error, failure + QLatin1Char(' ') + fault.text(), source);
    QMessageBox box(QMessageBox::Warning, tr("Measuring Desk"), failure, QMessageBox::Cancel, m_window);
    box.setInformativeText(fault.text());
    QPushButton *const saveAs = box.addButton(tr("Save as..."), QMessageBox::AcceptRole);
    box.setDefaultButton(saveAs);
    box.exec();
    return box.clickedButton() == saveAs && slotSaveSessionAs();
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
    const QString path = chooseFile(tr("Open image"), tr("Images"), KvDeskFileKind::imagePatterns());
    if (!path.isEmpty())
        openImage(path);
}

void KvDeskFileCommands::slotImportTable()
{
    const QString path = chooseFile(tr("Import table"), tr("Tables"), KvDeskFileKind::tablePatterns());
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
    const QString image = m_session->document()->imagePath();
    if (!m_session->path().isEmpty())
        dialog.selectFile(m_session->path());
    else if (!image.isEmpty())
        dialog.selectFile(QFileInfo(image).completeBaseName() + QStringLiteral(".json"));
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

QString KvDeskFileCommands::chooseFile(const QString &caption, const QString &name,
                                       const QStringList &patterns)
{
    return chooseFile(caption, withAllFiles(filterOf(name, patterns)));
}

QString KvDeskFileCommands::chooseFolder(const QString &caption)
{
    QFileDialog dialog(m_window, caption, lastFolder());
    dialog.setFileMode(QFileDialog::Directory);
    dialog.setOption(QFileDialog::ShowDirsOnly);
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

bool KvDeskFileCommands::tellFault(const QString &what, const ZtFault &fault, const QString &source)
{
    if (m_isCancelled) {
        m_isCancelled = false;
        KvDeskStatus::log(ZtAppStatus::Information, what, source);
        return false;
    }
    KvDeskStatus::log(ZtAppStatus::Error, what + QLatin1Char(' ') + fault.text(), source);
    m_faults.append(what);
    m_reasons.append(fault.text());
    if (!m_isCollecting)
        tellFaults();
    return false;
}

void KvDeskFileCommands::tellFaults()
{
    const QStringList faults = std::exchange(m_faults, {});
    QStringList reasons = std::exchange(m_reasons, {});
    if (faults.isEmpty())
        return;
    if (reasons.size() > mostFaultsTold)
        reasons = reasons.mid(0, mostFaultsTold) + QStringList(QString(QChar(0x2026)));
    //: %n is 2 at least
    const QString what =
        faults.size() == 1 ? faults.first() : tr("%n files were not opened.", "", faults.size());
    QMessageBox box(QMessageBox::Warning, tr("Measuring Desk"), what, QMessageBox::Ok, m_window);
    box.setInformativeText(reasons.join(QLatin1Char('\n')));
    box.exec();
}
