// SPDX-License-Identifier: MIT
#include "KvDeskEditCommands.h"

#include "KvDeskActions.h"
#include "KvDeskImageView.h"
#include "KvDeskInlineEditor.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskObjectPlaces.h"
#include "KvDeskSelection.h"

#include <QAction>
#include <QClipboard>
#include <QGuiApplication>
#include <QUndoStack>

namespace {

using A = KvDeskActions;

constexpr double pasteOffset = 16.0; ///< pixels of the view

// An ampersand in a name would underline the letter after it.
QString inMenu(QString text)
{
    return text.replace(QLatin1Char('&'), QLatin1String("&&"));
}

} // namespace

KvDeskEditCommands::KvDeskEditCommands(KvDeskActions *actions, KvDeskImageView *view,
                                       KvDeskObjectEditor *editor, QObject *parent)
    : QObject(parent)
    , m_actions(actions)
    , m_view(view)
    , m_editor(editor)
{
    // Tables and fields have commands of their own with these keys.
    for (const A::Id id : {A::Cut, A::Copy, A::Paste, A::Delete, A::SelectAll, A::Rename}) {
        actions->action(id)->setShortcutContext(Qt::WidgetWithChildrenShortcut);
        view->addAction(actions->action(id));
    }
    connectSignals();
    slotUpdateHistory();
    slotUpdateSelection();
    slotUpdateClipboard();
}

void KvDeskEditCommands::connectSignals()
{
    const auto onTrigger = [this](A::Id id, QObject *receiver, const char *slot) {
        connect(m_actions->action(id), SIGNAL(triggered()), receiver, slot);
    };
    onTrigger(A::Undo, this, SLOT(slotUndo()));
    onTrigger(A::Redo, m_editor, SLOT(slotRedo()));
    onTrigger(A::Cut, this, SLOT(slotCut()));
    onTrigger(A::Copy, this, SLOT(slotCopy()));
    onTrigger(A::Paste, this, SLOT(slotPaste()));
    onTrigger(A::Delete, this, SLOT(slotDelete()));
    onTrigger(A::SelectAll, this, SLOT(slotSelectAll()));
    onTrigger(A::Rename, this, SLOT(slotRename()));
    connect(m_editor->undoStack(), SIGNAL(indexChanged(int)), this, SLOT(slotUpdateHistory()));
    connect(m_view, SIGNAL(signalDraftChanged()), this, SLOT(slotUpdateHistory()));
    connect(m_editor->selection(), SIGNAL(signalSelectionChanged()), this, SLOT(slotUpdateSelection()));
    connect(QGuiApplication::clipboard(), SIGNAL(dataChanged()), this, SLOT(slotUpdateClipboard()));
}

void KvDeskEditCommands::setPossible(int id, bool isPossible, const QString &reason)
{
    m_actions->setPossible(static_cast<A::Id>(id), isPossible, reason);
}

void KvDeskEditCommands::slotUpdateHistory()
{
    const QUndoStack *const stack = m_editor->undoStack();
    const bool isDrafting = m_view->isDrafting();
    const bool isStep = stack->canUndo() && !isDrafting;
    //: %1 is what is undone or redone, such as "move of Line 3"
    m_actions->action(A::Undo)->setText(isStep ? tr("&Undo %1").arg(inMenu(stack->undoText())) : tr("&Undo"));
    m_actions->action(A::Redo)->setText(stack->canRedo() ? tr("&Redo %1").arg(inMenu(stack->redoText()))
                                                         : tr("&Redo"));
    setPossible(A::Undo, isStep || m_view->canTakeBack(), tr("Nothing was done yet"));
    setPossible(A::Redo, stack->canRedo() && !isDrafting,
                stack->canRedo() ? tr("Finish or cancel what you have begun first")
                                 : tr("Nothing was undone"));
}

void KvDeskEditCommands::slotUndo()
{
    if (m_view->isDrafting())
        m_view->takeBack();
    else
        m_editor->slotUndo();
}

void KvDeskEditCommands::slotUpdateSelection()
{
    const KvDeskSelection *const selection = m_editor->selection();
    for (const A::Id id : {A::Cut, A::Copy, A::Delete})
        setPossible(id, !selection->isEmpty(), tr("Select an object first"));
    setPossible(A::Rename, selection->objects().size() == 1, tr("Select one object first"));
}

void KvDeskEditCommands::slotUpdateClipboard()
{
    setPossible(A::Paste, m_editor->canPaste(), tr("No measured objects were copied"));
}

void KvDeskEditCommands::slotCut()
{
    m_editor->cut(m_editor->selection()->objects());
}

void KvDeskEditCommands::slotCopy()
{
    m_editor->copy(m_editor->selection()->objects());
}

void KvDeskEditCommands::slotPaste()
{
    const double offset = pasteOffset * m_view->pixel();
    m_editor->paste(QPointF(offset, offset));
}

void KvDeskEditCommands::slotDelete()
{
    m_editor->remove(m_editor->selection()->objects());
}

void KvDeskEditCommands::slotSelectAll()
{
    const KvDeskObjectIndex &index = m_view->places().index();
    const QVector<KvDeskObjectId> all = index.objectsIn(index.bounds());
    if (!all.isEmpty())
        m_editor->selection()->set(QSet<KvDeskObjectId>(all.begin(), all.end()), all.last());
}

void KvDeskEditCommands::slotRename()
{
    m_view->inlineEditor()->rename(m_editor->selection()->current());
}
