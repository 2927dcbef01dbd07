// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QStringList>

#include <functional>
#include <vector>

class KvDeskFileStamp;
class KvDeskObjectEditor;
class KvDeskProgress;
class KvDeskSession;
class QFileDialog;
class ZtProgress;
class ZtReadyObjects;
struct KvDeskRecoveryFile;
struct ZtFault;
struct ZtLoadedSession;

/**
 * Opens and saves files for the user: asks which, asks about unsaved changes, and says what went wrong. What
 * cannot be opened, or is cancelled, leaves everything as it was.
 *
 * Files are read and written by another thread; each call returns when all is done, and the interface goes on
 * drawing meanwhile.
 */
class KvDeskFileCommands : public QObject
{
    Q_OBJECT
public:
    /** \a window is the parent of the dialogs. Tables that are imported become steps of the history of
     * \a editor, if there is one. Session and editor have to outlive this. */
    KvDeskFileCommands(KvDeskSession *session, QWidget *window, KvDeskObjectEditor *editor = nullptr);

    /** Asks about unsaved changes, if any. False when the user wants to go on with the present session. */
    bool maybeSave();

    /** Each opens a file, and tells the user when that fails. */
    bool openFile(const QString &path); ///< a session, an image or a table
    /** Opens what was dropped: one session at most, then images, then tables. What the program does not know
     * is left out with a warning; all faults are told at once. */
    void openFiles(const QStringList &paths);
    bool openSession(const QString &path);
    /** Opens a session as one that has no file yet: the file is never written again. */
    bool openCopy(const QString &path);
    bool openImage(const QString &path);
    bool importTable(const QString &path);
    /** Asks before it overwrites what another program wrote; offers another place when saving fails. */
    bool saveSession(const QString &path);
    /** Opens a copy of unsaved work as a session with unsaved changes. */
    bool restoreSession(const QString &file, const KvDeskRecoveryFile &header);

    KvDeskProgress *progress() const { return m_progress; }

    /** Each asks for a path; empty when the user does not want any. \a patterns is such as "*.avi". */
    QString chooseFile(const QString &caption, const QString &name, const QStringList &patterns);
    QString chooseFolder(const QString &caption);
    /** Says in the status log and in a box that something did not work, and returns false: \a what is a
     * sentence, \a source is "Class::method". What the user cancelled is a line in the status log only. */
    bool tellFault(const QString &what, const ZtFault &fault, const QString &source);

public slots:
    void slotNewSession();
    void slotOpenSession();
    void slotOpenImage();
    void slotImportTable();
    bool slotSaveSession(); ///< asks for a file where there is none yet
    bool slotSaveSessionAs();

private:
    enum class OnConflict { Overwrite, SaveAs, Cancel };

    void addTable(const QString &path, std::vector<ZtReadyObjects> objects);
    QString chooseFile(const QString &caption, const QString &filter);
    bool choose(QFileDialog *dialog, QString *path);
    /** False, with a fault, when the work was cancelled or ended by itself. */
    bool readSession(const QString &path, ZtLoadedSession *loaded, KvDeskFileStamp *stamp);
    void logOpened(const QString &path);
    bool run(const QString &text, const std::function<void(ZtProgress *)> &work, ZtFault *fault);
    bool askToOpenWithoutImage(const ZtFault &fault);
    OnConflict askToOverwrite();
    bool write(const QString &path, ZtFault *fault);
    bool failSaving(const QString &path, const ZtFault &fault);
    void warnOfUnopened(const QString &path, bool isSession);
    void tellFaults();

    KvDeskSession *m_session;
    QWidget *m_window;
    KvDeskObjectEditor *m_editor;
    KvDeskProgress *m_progress;
    bool m_isCancelled = false;  ///< the work that run() did last
    bool m_isCollecting = false; ///< faults are told later, all together
    QStringList m_faults;
    QStringList m_reasons;
};
