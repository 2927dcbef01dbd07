// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>

class KvDeskSession;
class QFileDialog;
struct ZtFault;

/**
 * Opens and saves files for the user: asks which, asks about unsaved changes, and says what went wrong. What
 * cannot be opened leaves everything as it was.
 */
class KvDeskFileCommands : public QObject
{
    Q_OBJECT
public:
    /** \a window is the parent of the dialogs, \a session has to outlive this. */
    KvDeskFileCommands(KvDeskSession *session, QWidget *window);

    /** Asks about unsaved changes, if any. False when the user wants to go on with the present session. */
    bool maybeSave();

    /** Each opens a file, and tells the user when that fails. */
    bool openFile(const QString &path); ///< a session, an image or a table
    bool openSession(const QString &path);
    bool openImage(const QString &path);
    bool importTable(const QString &path);
    bool saveSession(const QString &path);

public slots:
    void slotNewSession();
    void slotOpenSession();
    void slotOpenImage();
    void slotImportTable();
    bool slotSaveSession(); ///< asks for a file where there is none yet
    bool slotSaveSessionAs();

private:
    QString chooseFile(const QString &caption, const QString &filter);
    bool choose(QFileDialog *dialog, QString *path);
    bool isOnlyImageMissing(const QString &path, const ZtFault &fault) const;
    bool askToOpenWithoutImage(const ZtFault &fault);
    void tellFault(const QString &what, const ZtFault &fault, const QString &source);

    KvDeskSession *m_session;
    QWidget *m_window;
};
