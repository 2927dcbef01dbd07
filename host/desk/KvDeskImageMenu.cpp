// SPDX-License-Identifier: MIT
#include "KvDeskImageMenu.h"

#include "KvDeskActionButton.h"
#include "KvDeskActions.h"
#include "KvDeskImageView.h"

#include <QAction>
#include <QGuiApplication>

KvDeskImageMenu::KvDeskImageMenu(KvDeskActions *actions, KvDeskImageView *view)
    : QMenu(view)
{
    using A = KvDeskActions;
    const auto add = [this, actions](std::initializer_list<A::Id> ids) {
        for (const A::Id id : ids)
            addAction(actions->action(id));
    };
    // The view lies from left to right for the image's sake.
    setLayoutDirection(QGuiApplication::layoutDirection());
    setToolTipsVisible(true);
    add({A::Rename});
    addSeparator();
    add({A::Cut, A::Copy, A::Paste, A::Delete});
    addSeparator();
    add({A::SelectAll});
    addSeparator();
    addWithoutLetter(actions->action(A::ZoomFit));
    addWithoutLetter(actions->action(A::ZoomActual));
    connect(view, SIGNAL(signalMenuRequested(QPoint)), this, SLOT(slotShow(QPoint)));
}

// In the menus of the window it stands among others: here its letter may be another command's.
void KvDeskImageMenu::addWithoutLetter(QAction *action)
{
    const QString keys = action->shortcut().toString(QKeySequence::NativeText);
    QAction *const shown =
        addAction(action->icon(), KvDeskActionButton::plainText(action->text()) + QLatin1Char('\t') + keys,
                  action, SLOT(trigger()));
    shown->setToolTip(action->toolTip());
}

void KvDeskImageMenu::slotShow(const QPoint &aPosition)
{
    // Some systems report the same key twice, as a key and as a wish for the menu.
    if (!isVisible())
        popup(aPosition);
}
