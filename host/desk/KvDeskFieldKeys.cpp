// SPDX-License-Identifier: MIT
#include "KvDeskFieldKeys.h"

#include "KvDeskActions.h"

#include <QAbstractSpinBox>
#include <QAction>
#include <QCoreApplication>
#include <QKeyEvent>
#include <QLineEdit>

#include <algorithm>

namespace {

constexpr QKeySequence::StandardKey commonKeys[] = {QKeySequence::Undo,  QKeySequence::Redo,
                                                    QKeySequence::Cut,   QKeySequence::Copy,
                                                    QKeySequence::Paste, QKeySequence::SelectAll};

bool isCommon(const QKeySequence &key)
{
    return std::any_of(
        std::begin(commonKeys), std::end(commonKeys),
        [&key](QKeySequence::StandardKey common) { return QKeySequence::keyBindings(common).contains(key); });
}

} // namespace

KvDeskFieldKeys::KvDeskFieldKeys(const KvDeskActions *actions, QWidget *window)
    : QObject(window)
    , m_actions(actions)
    , m_window(window)
{
    QCoreApplication::instance()->installEventFilter(this);
}

bool KvDeskFieldKeys::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() != QEvent::ShortcutOverride || !isInField(watched) ||
        !isShortcut(*static_cast<QKeyEvent *>(event)))
        return QObject::eventFilter(watched, event);
    // Without a claim of the field the shortcut is next.
    event->ignore();
    return true;
}

// Dialogs do not have the window's shortcuts.
bool KvDeskFieldKeys::isInField(const QObject *watched) const
{
    const bool isField =
        qobject_cast<const QLineEdit *>(watched) || qobject_cast<const QAbstractSpinBox *>(watched);
    return isField && static_cast<const QWidget *>(watched)->window() == m_window;
}

// What has no Ctrl is typed into the field.
bool KvDeskFieldKeys::isShortcut(const QKeyEvent &event) const
{
    if (!event.modifiers().testFlag(Qt::ControlModifier))
        return false;
    const QKeySequence key(event.key() | static_cast<int>(event.modifiers() & ~Qt::KeypadModifier));
    for (int id = 0; id < KvDeskActions::Count; ++id) {
        const QAction *const action = m_actions->action(static_cast<KvDeskActions::Id>(id));
        if (action->shortcutContext() == Qt::WindowShortcut && action->shortcuts().contains(key))
            return !isCommon(key);
    }
    return false;
}
