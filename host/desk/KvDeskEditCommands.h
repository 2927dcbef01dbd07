// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

class KvDeskActions;
class KvDeskImageView;
class KvDeskObjectEditor;

/** Does what the edit menu says to the selected objects; commands that cannot be done now are disabled, and
 * their tool tips say why. */
class KvDeskEditCommands : public QObject
{
    Q_OBJECT
public:
    /** All have to outlive this. */
    KvDeskEditCommands(KvDeskActions *actions, KvDeskImageView *view, KvDeskObjectEditor *editor,
                       QObject *parent = nullptr);

public slots:
    /** Takes back what is half done on the image, part by part, and steps of the history only then. */
    void slotUndo();
    void slotCut();
    void slotCopy();
    void slotPaste();
    void slotDelete();
    void slotSelectAll();
    void slotRename();

private slots:
    void slotUpdateHistory();
    void slotUpdateSelection();
    void slotUpdateClipboard();

private:
    void connectSignals();
    void setPossible(int id, bool isPossible, const QString &reason);

    KvDeskActions *m_actions;
    KvDeskImageView *m_view;
    KvDeskObjectEditor *m_editor;
};
