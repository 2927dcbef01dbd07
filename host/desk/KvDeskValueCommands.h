// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskValueSelection.h"

#include <QObject>

class KvDeskObjectEditor;
class KvDeskTableView;
class QAction;

/** What can be done with selected rows of the table of values, by keys and from its context menu. Commands
 * that cannot be done now are disabled, and their tool tips say why. */
class KvDeskValueCommands : public QObject
{
    Q_OBJECT
public:
    /** All have to outlive this. */
    KvDeskValueCommands(KvDeskTableView *view, KvDeskValueSelection *selection, KvDeskObjectEditor *editor,
                        QObject *parent = nullptr);

    QAction *renameAction() const { return m_rename; }
    QAction *deleteAction() const { return m_delete; }
    QAction *hideAction() const { return m_hide; }
    QAction *showAction() const { return m_show; }

public slots:
    void slotRename(); ///< edits the name in the table
    void slotDelete();
    void slotHideValues();
    void slotShowValues(); ///< all of the selected objects
    void slotRenamed(int aType, int aId, const QString &aName);

private slots:
    void slotUpdate();

private:
    void connectSignals();
    QAction *addCommand(const QString &text, const QKeySequence &shortcut, const char *slot);
    void setPossible(QAction *action, bool isPossible, const QString &reason);
    bool hasHiddenValues() const;
    void setShown(QVector<KvDeskValueSelection::Value> values, bool isShown);

    KvDeskTableView *m_view;
    KvDeskValueSelection *m_selection;
    KvDeskObjectEditor *m_editor;
    QAction *m_rename;
    QAction *m_delete;
    QAction *m_hide;
    QAction *m_show;
};
