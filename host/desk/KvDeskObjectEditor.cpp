// SPDX-License-Identifier: MIT
#include "KvDeskObjectEditor.h"

#include "KvDeskCalibrationCommand.h"
#include "KvDeskObjectClipboard.h"
#include "KvDeskObjectsCommand.h"
#include "KvDeskPlaceCommand.h"
#include "KvDeskSelection.h"
#include "KvDeskSession.h"
#include "KvDeskTableCommand.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtReadyObjects.h"
#include "measuring/ZtSession.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QMimeData>
#include <QScopedValueRollback>
#include <QUndoStack>

#include <limits>
#include <utility>

namespace {

// The first of some ids in a row that no object of the type has; 0 when there are not that many.
int freeIds(int type, int count)
{
    const ZtObjectMap objects = ZtKernelData::getInstance()->objects().value(type);
    const int largest = objects.isEmpty() ? 0 : qMax(0, objects.lastKey());
    return largest > std::numeric_limits<int>::max() - count ? 0 : largest + 1;
}

KvDeskObjectState newObject(const KvDeskObjectId &object, const QPolygonF &points)
{
    KvDeskObjectState state = KvDeskObjectState::missing(object);
    state.exists = true;
    state.points = points;
    return state;
}

QVector<KvDeskObjectState> missing(const QVector<KvDeskObjectState> &states)
{
    QVector<KvDeskObjectState> result;
    result.reserve(states.size());
    for (const KvDeskObjectState &state : states)
        result.append(KvDeskObjectState::missing(state.object));
    return result;
}

bool isDrawable(const KvDeskObjectState &state)
{
    const ZtDrawnType *const type = ZtDrawnType::find(state.object.type);
    return state.exists && type && type->acceptsPoints(state.points);
}

} // namespace

KvDeskObjectEditor::KvDeskObjectEditor(KvDeskSession *session, KvDeskSelection *selection, QObject *parent)
    : QObject(parent)
    , m_session(session)
    , m_selection(selection)
    , m_stack(new QUndoStack(this))
{
    m_stack->setUndoLimit(maximumSteps);
    connectSignals();
}

KvDeskObjectEditor::~KvDeskObjectEditor()
{
    // The stack reports a change while it is deleted, when those who listen may be gone already.
    m_stack->disconnect();
}

void KvDeskObjectEditor::connectSignals()
{
    connect(m_session, SIGNAL(signalReplaced()), this, SLOT(slotSessionReplaced()));
    connect(m_session, SIGNAL(signalStateChanged()), this, SLOT(slotSessionStateChanged()));
    connect(m_session->document(), SIGNAL(signalCalibrationChanged()), this, SLOT(slotOtherChange()));
    connect(m_session->document(), SIGNAL(signalImageChanged()), this, SLOT(slotOtherChange()));
    connect(m_stack, SIGNAL(cleanChanged(bool)), this, SLOT(slotCleanChanged(bool)));
    connect(m_selection, SIGNAL(signalSelectionChanged()), this, SLOT(slotFinishGesture()));
    const ZtSignalCenter *const center = ZtSignalCenter::getInstance();
    connect(center, SIGNAL(signalObjectCreated(int,int,const ZtKernelObjectData*)), this,
                           SLOT(slotObjectCreated(int,int,const ZtKernelObjectData*)));
    connect(center, SIGNAL(signalObjectChanged(int,int,const ZtKernelObjectData*)), this,
                           SLOT(slotObjectChanged(int,int,const ZtKernelObjectData*)));
    connect(center, SIGNAL(signalObjectRemoved(int,int)), this, SLOT(slotObjectRemoved(int,int)));
}

QString KvDeskObjectEditor::describe(const QSet<KvDeskObjectId> &objects)
{
    if (objects.size() != 1)
        //: %n is 2 at least
        return tr("%n objects", "several measured objects", objects.size());
    const KvDeskObjectId object = *objects.begin();
    const ZtGsManipulator *const manipulator = ZtKernelData::getInstance()->getGsManipulator(object.type);
    return manipulator ? manipulator->getObjectName(object.id) : QString();
}

void KvDeskObjectEditor::push(QUndoCommand *command)
{
    const QScopedValueRollback<bool> applying(m_isApplying, true);
    m_stack->push(command);
}

void KvDeskObjectEditor::change(const QString &text, const QVector<KvDeskObjectState> &after, int gesture)
{
    QVector<KvDeskObjectState> before;
    before.reserve(after.size());
    for (const KvDeskObjectState &state : after)
        before.append(KvDeskObjectState::of(state.object));
    if (before != after)
        push(new KvDeskObjectsCommand(text, before, after, gesture));
}

KvDeskObjectId KvDeskObjectEditor::create(int typeId, const QPolygonF &points, const QString &name,
                                          const QString &text)
{
    KvDeskObjectState state = newObject({typeId, freeIds(typeId, 1)}, points);
    state.name = name.trimmed();
    state.text = text;
    if (!isDrawable(state) || state.object.isNull())
        return {};
    const QString described = state.name.isEmpty() ? describe({state.object}) : state.name;
    change(tr("drawing of %1").arg(described), {state});
    m_selection->select(state.object);
    return state.object;
}

void KvDeskObjectEditor::setPoints(KvDeskObjectId object, const QPolygonF &points)
{
    KvDeskObjectState state = KvDeskObjectState::of(object);
    state.points = points;
    if (isDrawable(state))
        change(tr("change of %1").arg(describe({object})), {state}, m_gesture);
}

void KvDeskObjectEditor::moveBy(const QSet<KvDeskObjectId> &objects, const QPointF &offset)
{
    QVector<KvDeskObjectState> after;
    QSet<KvDeskObjectId> moved;
    for (const KvDeskObjectId &object : objects) {
        KvDeskObjectState state = KvDeskObjectState::of(object);
        state.points.translate(offset);
        if (!isDrawable(state) || state.points.isEmpty())
            continue;
        after.append(state);
        moved.insert(object);
    }
    if (!moved.isEmpty())
        change(tr("move of %1").arg(describe(moved)), after, m_gesture);
}

void KvDeskObjectEditor::rename(KvDeskObjectId object, const QString &name)
{
    KvDeskObjectState state = KvDeskObjectState::of(object);
    const QString before = describe({object});
    state.name = name.trimmed();
    const bool isNoChange = state.name == before;
    if (state.exists && !isNoChange)
        change(tr("renaming of %1").arg(before), {state});
}

void KvDeskObjectEditor::setText(KvDeskObjectId object, const QString &text)
{
    KvDeskObjectState state = KvDeskObjectState::of(object);
    state.text = text;
    if (isDrawable(state))
        change(tr("text of %1").arg(describe({object})), {state});
}

void KvDeskObjectEditor::setValueShown(KvDeskObjectId object, int position, bool isShown)
{
    KvDeskObjectState state = KvDeskObjectState::of(object);
    const ZtGsManipulator *const manipulator = ZtKernelData::getInstance()->getGsManipulator(object.type);
    const bool isValue = state.exists && position >= 0 && position < manipulator->getValueNames().size();
    if (!isValue || isShown != state.hiddenValues.contains(position))
        return;
    if (isShown)
        state.hiddenValues.removeAll(position);
    else
        state.hiddenValues.append(position);
    const QString name = manipulator->getValueNames().at(position);
    const QString described = describe({object});
    //: %1 is a value, %2 an object
    change((isShown ? tr("showing of %1 of %2") : tr("hiding of %1 of %2")).arg(name, described), {state});
}

void KvDeskObjectEditor::remove(const QSet<KvDeskObjectId> &objects)
{
    QVector<KvDeskObjectState> before;
    for (const KvDeskObjectId &object : objects) {
        const KvDeskObjectState state = KvDeskObjectState::of(object);
        if (state.exists)
            before.append(state);
    }
    if (before.isEmpty())
        return;
    QSet<KvDeskObjectId> removed;
    for (const KvDeskObjectState &state : qAsConst(before))
        removed.insert(state.object);
    const QString described = describe(removed);
    // At once, not with one change of the selection for each of them.
    QSet<KvDeskObjectId> selected = m_selection->objects();
    m_selection->set(selected.subtract(removed), m_selection->current());
    push(new KvDeskObjectsCommand(tr("deletion of %1").arg(described), before, missing(before)));
}

void KvDeskObjectEditor::setCalibration(const ZtCalibration &calibration)
{
    if (calibration != m_session->document()->calibration())
        push(new KvDeskCalibrationCommand(tr("change of the calibration"), m_session->document(),
                                          calibration));
}

void KvDeskObjectEditor::addPlace(KvDeskObjectId counter, const QPointF &place)
{
    const KvDeskObjectState state = KvDeskObjectState::of(counter);
    const bool isPossible = counter.type == ZtDrawnType::Counter && state.exists &&
                            ZtDrawnType::isCoordinatePair(place) &&
                            state.points.size() < ZtDrawnType::unlimitedPoints;
    if (isPossible)
        push(new KvDeskPlaceCommand(tr("place of %1").arg(describe({counter})), KvDeskPlaceCommand::Add,
                                    counter, state.points.size(), place));
}

void KvDeskObjectEditor::removePlace(KvDeskObjectId counter, int index)
{
    const KvDeskObjectState state = KvDeskObjectState::of(counter);
    if (counter.type != ZtDrawnType::Counter || index < 0 || index >= state.points.size())
        return;
    push(new KvDeskPlaceCommand(tr("deletion of a place of %1").arg(describe({counter})),
                                KvDeskPlaceCommand::Remove, counter, index, state.points.at(index)));
}

void KvDeskObjectEditor::importTable(const QString &name, std::vector<ZtReadyObjects> objects)
{
    if (!objects.empty())
        push(new KvDeskTableCommand(tr("import of %1").arg(name), m_session->document(), std::move(objects)));
}

void KvDeskObjectEditor::copy(const QSet<KvDeskObjectId> &objects)
{
    if (objects.isEmpty())
        return;
    QGuiApplication::clipboard()->setMimeData(KvDeskObjectClipboard::toMimeData(objects).release());
    m_pasteCount = 0;
}

void KvDeskObjectEditor::cut(const QSet<KvDeskObjectId> &objects)
{
    copy(objects);
    remove(objects);
}

bool KvDeskObjectEditor::canPaste() const
{
    return KvDeskObjectClipboard::hasObjects(QGuiApplication::clipboard()->mimeData());
}

QSet<KvDeskObjectId> KvDeskObjectEditor::paste(const QPointF &offset)
{
    const QPointF shift = offset * (m_pasteCount + 1);
    QVector<KvDeskObjectState> after;
    QSet<KvDeskObjectId> added;
    QHash<int, int> count;
    for (const ZtSessionObject &source :
         KvDeskObjectClipboard::objects(QGuiApplication::clipboard()->mimeData())) {
        const int type = source.type->id;
        const int first = freeIds(type, ++count[type]);
        KvDeskObjectState state = newObject({type, first + count.value(type) - 1}, source.points);
        state.points.translate(shift);
        state.name = source.name;
        state.text = source.text;
        state.hiddenValues = source.hiddenValues;
        if (first == 0 || !isDrawable(state))
            continue;
        after.append(state);
        added.insert(state.object);
    }
    if (added.isEmpty())
        return added;
    ++m_pasteCount;
    change(tr("pasting of %1").arg(describe(added)), after);
    m_selection->set(added, after.last().object);
    return added;
}

void KvDeskObjectEditor::slotUndo()
{
    walkHistory(&QUndoStack::undo);
    selectTouched();
}

void KvDeskObjectEditor::slotRedo()
{
    // One object would be announced for all of the table, which is not worth to be selected.
    const bool isTable = dynamic_cast<const KvDeskTableCommand *>(m_stack->command(m_stack->index()));
    walkHistory(&QUndoStack::redo);
    if (isTable)
        m_touched.clear();
    selectTouched();
}

void KvDeskObjectEditor::walkHistory(void (QUndoStack::*way)())
{
    m_touched.clear();
    const ZtCalibration before = m_session->document()->calibration();
    {
        const QScopedValueRollback<bool> applying(m_isApplying, true);
        (m_stack->*way)();
    }
    if (m_session->document()->calibration() != before)
        emit signalCalibrationRestored();
}

void KvDeskObjectEditor::selectTouched()
{
    slotFinishGesture();
    if (!m_touched.isEmpty())
        m_selection->set(m_touched, m_selection->current());
    m_touched.clear();
}

void KvDeskObjectEditor::slotFinishGesture()
{
    ++m_gesture;
}

void KvDeskObjectEditor::slotSessionReplaced()
{
    m_stack->clear();
    m_selection->clear();
}

void KvDeskObjectEditor::slotSessionStateChanged()
{
    if (!m_session->isModified())
        m_stack->setClean();
    else if (!m_isApplying && m_stack->isClean())
        m_stack->resetClean(); // what was changed is no step, so undoing every step does not undo it
}

void KvDeskObjectEditor::slotCleanChanged(bool aIsClean)
{
    if (aIsClean)
        m_session->setUnmodified();
}

// Undoing everything does not undo this.
void KvDeskObjectEditor::slotOtherChange()
{
    if (m_session->isModified() && !m_isApplying)
        m_stack->resetClean();
}

void KvDeskObjectEditor::slotObjectCreated(int aType, int aId, const ZtKernelObjectData *aObject)
{
    Q_UNUSED(aObject)
    if (m_isApplying)
        m_touched.insert({aType, aId});
    else
        objectCameOrWent(aType);
}

void KvDeskObjectEditor::slotObjectChanged(int aType, int aId, const ZtKernelObjectData *aObject)
{
    Q_UNUSED(aObject)
    if (m_isApplying)
        m_touched.insert({aType, aId});
    else
        slotOtherChange();
}

void KvDeskObjectEditor::slotObjectRemoved(int aType, int aId)
{
    if (m_isApplying)
        m_touched.remove({aType, aId});
    else
        objectCameOrWent(aType);
}

// Tables bring types of their own, whose objects cannot be meant by any step that was done; but a type that
// was taken out may get back its number.
void KvDeskObjectEditor::objectCameOrWent(int type)
{
    if (ZtDrawnType::find(type) || m_stack->canRedo())
        m_stack->clear();
    slotOtherChange();
}
