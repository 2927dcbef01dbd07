// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectChanges.h"
#include "measuring/ZtTableExport.h"

#include <QObject>

class KvDeskFileCommands;
class KvDeskSelection;
class KvDeskSession;
class QAction;

/** Exports measured values for the user: asks how and where to, shows progress when it takes long, and says
 * what went wrong. A file that is not written completely is left as it was. */
class KvDeskExportCommand : public QObject
{
    Q_OBJECT
public:
    /** \a window is the parent of the dialogs; all have to outlive this. The action is disabled as long as
     * there is nothing to export. */
    KvDeskExportCommand(QAction *action, KvDeskFileCommands *files, KvDeskSession *session,
                        KvDeskSelection *selection, QWidget *window);

    /** Writes a file without asking; tells the user when that fails. False then and when the user cancels. */
    bool exportTo(const QString &path, const ZtTableExport::Options &options);

    /** Time after which progress is shown, in milliseconds. */
    void setProgressDelay(int ms) { m_progressDelayMs = ms; }

public slots:
    void slotExport();

private slots:
    void slotUpdate();

private:
    QString choosePath(ZtTableExport::Layout layout);
    QString suggestedName(ZtTableExport::Layout layout) const;
    bool collect(const ZtTableExport::Options &options, QByteArray *bytes);

    QAction *m_action;
    QString m_toolTip; ///< of the action while it is enabled
    KvDeskFileCommands *m_files;
    KvDeskSession *m_session;
    KvDeskSelection *m_selection;
    QWidget *m_window;
    KvDeskObjectChanges m_changes;
    int m_progressDelayMs = 500;
};
