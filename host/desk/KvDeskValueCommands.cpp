// SPDX-License-Identifier: MIT
#include "KvDeskValueCommands.h"

#include "KvDeskObjectEditor.h"
#include "KvDeskSelection.h"
#include "KvDeskTableView.h"
#include "KvDeskValueSelection.h"
#include "KvDeskValueTableModel.h"

#include <QAction>
#include <QUndoStack>

#include <algorithm>

KvDeskValueCommands::KvDeskValueCommands(KvDeskTableView *view, KvDeskValueSelection *selection,
                                         KvDeskObjectEditor *editor, QObject *parent)
    : QObject(parent)
    , m_view(view)
    , m_selection(selection)
    , m_editor(editor)
    , m_rename(addCommand(tr("Rename"), QKeySequence(Qt::Key_F2), SLOT(slotRename())))
               , m_delete(addCommand(tr("Delete object"), QKeySequence::Delete, SLOT(slotDelete())))
                          , m_hide(addCommand(tr("Hide value"), QKeySequence(), SLOT(slotHideValues())))
                                   , m_show(addCommand(tr("Show all values of the object"), QKeySequence(),
                                                       SLOT(slotShowValues())))
{
    connectSignals();
    slotUpdate();
}

void KvDeskValueCommands::connectSignals()
{
    connect(m_selection, SIGNAL(signalValuesSelected()), this, SLOT(slotUpdate()));
    connect(m_editor->undoStack(), SIGNAL(indexChanged(int)), this, SLOT(slotUpdate()));
}

QAction *KvDeskValueCommands::addCommand(const QString &text, const QKeySequence &shortcut, const char *slot)
{
    auto *const action = new QAction(text, this);
    action->setShortcut(shortcut);
    action->setShortcutContext(Qt::WidgetShortcut);
    connect(action, SIGNAL(triggered()), this, slot);
    m_view->addAction(action);
    return action;
}

void KvDeskValueCommands::setPossible(QAction *action, bool isPossible, const QString &reason)
{
    action->setEnabled(isPossible);
    action->setToolTip(isPossible ? action->text() : action->text() + QLatin1Char('\n') + reason);
}

bool KvDeskValueCommands::hasHiddenValues() const
{
    // Of thousands of objects nobody wants to wait for the answer.
    constexpr int maximumObjects = 1000;
    const QSet<KvDeskObjectId> &objects = m_editor->selection()->objects();
    return objects.size() > maximumObjects ||
           std::any_of(objects.begin(), objects.end(), [](const KvDeskObjectId &object) {
               return !KvDeskObjectState::of(object).hiddenValues.isEmpty();
           });
}

void KvDeskValueCommands::slotUpdate()
{
    const int objects = m_editor->selection()->objects().size();
    setPossible(m_rename, objects == 1 && m_view->currentIndex().isValid(), tr("Select one object first"));
    setPossible(m_delete, objects > 0, tr("Select an object first"));
    setPossible(m_hide, !m_selection->values().isEmpty(), tr("Select a value first"));
    setPossible(m_show, hasHiddenValues(), tr("No value of the selected object is hidden"));
}

void KvDeskValueCommands::slotRename()
{
    const QModelIndex current = m_view->currentIndex();
    if (current.isValid())
        m_view->edit(current.siblingAtColumn(KvDeskValueTableModel::ObjectColumn));
}

void KvDeskValueCommands::slotRenamed(int aType, int aId, const QString &aName)
{
    m_editor->rename({aType, aId}, aName);
}

void KvDeskValueCommands::slotDelete()
{
    m_editor->remove(m_editor->selection()->objects());
}

void KvDeskValueCommands::slotHideValues()
{
    setShown(m_selection->values(), false);
}

void KvDeskValueCommands::slotShowValues()
{
    QVector<KvDeskValueSelection::Value> hidden;
    for (const KvDeskObjectId &object : m_editor->selection()->objects()) {
        for (const int position : KvDeskObjectState::of(object).hiddenValues)
            hidden.append({object, position});
    }
    setShown(hidden, true);
}

// By value: the selection becomes another one with the first step.
void KvDeskValueCommands::setShown(QVector<KvDeskValueSelection::Value> values, bool isShown)
{
    QUndoStack *const stack = m_editor->undoStack();
    const bool isMany = values.size() > 1;
    if (isMany)
        stack->beginMacro(isShown ? tr("showing of values") : tr("hiding of values"));
    for (const KvDeskValueSelection::Value &value : qAsConst(values))
        m_editor->setValueShown(value.object, value.position, isShown);
    if (isMany)
        stack->endMacro();
}
