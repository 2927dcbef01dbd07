// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

class KvDeskActions;
class QKeyEvent;
class QWidget;

/**
 * Keeps the shortcuts of the program alive while a field of its window has the keyboard.
 *
 * On some systems fields take keys such as Ctrl+E and Ctrl+K for moves and deletions that hardly anybody
 * knows. Keys for common editing, such as undo and copy, stay the field's.
 */
class KvDeskFieldKeys : public QObject
{
    Q_OBJECT
public:
    /** Both have to outlive this, which belongs to \a window. */
    KvDeskFieldKeys(const KvDeskActions *actions, QWidget *window);

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    bool isInField(const QObject *watched) const;
    bool isShortcut(const QKeyEvent &event) const;

    const KvDeskActions *m_actions;
    QWidget *m_window;
};
