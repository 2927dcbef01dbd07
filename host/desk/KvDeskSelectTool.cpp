// SPDX-License-Identifier: MIT
#include "KvDeskSelectTool.h"

#include "KvDeskImageView.h"
#include "KvDeskInlineEditor.h"
#include "KvDeskMarks.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskObjectPlaces.h"
#include "KvDeskObjectState.h"
#include "KvDeskSelection.h"
#include "KvDeskSnapping.h"
#include "measuring/ZtDrawnType.h"

#include <QKeyEvent>
#include <QPainter>
#include <QUndoStack>

namespace {

constexpr double handleRoom = 7.0; ///< pixels around a handle that belong to it
constexpr int mostHandles = 500;   ///< objects of more points show none
constexpr double straightStep = 90.0;

} // namespace

QPolygonF KvDeskSelectTool::handles() const
{
    if (view()->selection()->objects().size() != 1 || !view()->editor())
        return {};
    const QPolygonF points = KvDeskObjectState::of(view()->selection()->current()).points;
    return points.size() <= mostHandles ? points : QPolygonF();
}

int KvDeskSelectTool::handleAt(const QPointF &place) const
{
    const QPolygonF onView = view()->viewportTransform().map(handles());
    const QPointF *const found = KvDeskSnapping::nearest(place, onView, handleRoom);
    return found ? static_cast<int>(found - onView.constData()) : -1;
}

void KvDeskSelectTool::press(const KvDeskPointer &pointer)
{
    if (pointer.button != Qt::LeftButton)
        return;
    m_pressed = m_last = pointer;
    m_moved = QPointF();
    m_handle = pointer.modifiers & Qt::ControlModifier ? -1 : handleAt(pointer.view);
    m_action = Click;
    m_object = m_handle >= 0 ? view()->selection()->current() : view()->objectAt(pointer.view.toPoint());
    if (m_handle < 0)
        pressObject(pointer, m_object);
}

void KvDeskSelectTool::pressObject(const KvDeskPointer &pointer, const KvDeskObjectId &object)
{
    if (object.isNull())
        return;
    if (pointer.modifiers & Qt::ControlModifier)
        view()->selection()->toggle(object);
    else if (!view()->selection()->contains(object))
        view()->selection()->select(object);
}

void KvDeskSelectTool::startDragging(const KvDeskPointer &pointer)
{
    if (isClick(m_pressed.view, pointer.view))
        return;
    if (view()->editor()) {
        view()->editor()->slotFinishGesture();
        m_stepsBefore = view()->editor()->undoStack()->index();
    }
    if (m_handle >= 0)
        m_action = DragHandle;
    else
        m_action = m_object.isNull() ? Band : Move;
}

void KvDeskSelectTool::move(const KvDeskPointer &pointer)
{
    m_last = pointer;
    if (m_action == Click)
        startDragging(pointer);
    if (m_action == Move)
        moveObjects(pointer);
    else if (m_action == DragHandle)
        moveHandle(pointer);
    if (m_action != Nothing)
        view()->refresh();
}

void KvDeskSelectTool::moveObjects(const KvDeskPointer &pointer)
{
    if (!view()->editor() || !view()->selection()->contains(m_object))
        return;
    QPointF target = pointer.scene;
    if (pointer.modifiers & Qt::ShiftModifier)
        target = KvDeskSnapping::alongDirection(m_pressed.scene, target, straightStep);
    const QPointF moved = target - m_pressed.scene;
    view()->editor()->moveBy(view()->selection()->objects(), moved - m_moved);
    m_moved = moved;
}

void KvDeskSelectTool::moveHandle(const KvDeskPointer &pointer)
{
    QPolygonF points = KvDeskObjectState::of(m_object).points;
    if (m_handle >= points.size())
        return;
    const bool isLine = points.size() > 1;
    const QPointF origin = points.at(m_handle > 0 ? m_handle - 1 : qMin(1, points.size() - 1));
    const KvDeskImageView::Snap snap =
        view()->snap(pointer, isLine ? &origin : nullptr, m_object.type == ZtDrawnType::Rectangle, m_object);
    m_isSnapped = snap.isOnPoint;
    m_snapMark = snap.point;
    points[m_handle] = snap.point;
    view()->editor()->setPoints(m_object, points);
}

void KvDeskSelectTool::release(const KvDeskPointer &pointer)
{
    if (pointer.button != Qt::LeftButton || m_action == Nothing)
        return;
    const Action action = m_action;
    m_action = Nothing;
    m_isSnapped = false;
    if (action == Band) {
        selectBand(pointer);
    } else if (action == Click && !(pointer.modifiers & Qt::ControlModifier)) {
        view()->selection()->select(m_object);
    } else if (view()->editor()) {
        view()->editor()->slotFinishGesture();
    }
    view()->refresh();
}

QRectF KvDeskSelectTool::band() const
{
    return QRectF(m_pressed.scene, m_last.scene).normalized();
}

void KvDeskSelectTool::selectBand(const KvDeskPointer &pointer)
{
    const QRectF area = band();
    QSet<KvDeskObjectId> objects;
    if (pointer.modifiers & Qt::ControlModifier)
        objects = view()->selection()->objects();
    const KvDeskObjectIndex &index = view()->places().index();
    KvDeskObjectId current;
    for (const KvDeskObjectId &object : index.objectsIn(area)) {
        const QRectF rect = index.rect(object);
        if (!area.contains(rect.topLeft()) || !area.contains(rect.bottomRight()))
            continue;
        objects.insert(object);
        current = object;
    }
    view()->selection()->set(objects, current);
}

void KvDeskSelectTool::doubleClick(const KvDeskPointer &pointer)
{
    press(pointer);
    if (m_object.isNull() || !view()->editor())
        return;
    m_action = Nothing;
    view()->inlineEditor()->edit(m_object);
}

bool KvDeskSelectTool::key(QKeyEvent *event)
{
    switch (event->key()) {
    case Qt::Key_Tab:
        return walk(true);
    case Qt::Key_Backtab:
        return walk(false);
    case Qt::Key_Escape:
        if (isBusy())
            cancel();
        else
            view()->selection()->clear();
        return true;
    default:
        return nudge(*event);
    }
}

bool KvDeskSelectTool::nudge(const QKeyEvent &event)
{
    const QPointF step = arrowStep(event);
    if (step.isNull() || view()->selection()->isEmpty() || !view()->editor() || isBusy())
        return false;
    view()->editor()->moveBy(view()->selection()->objects(), step);
    return true;
}

bool KvDeskSelectTool::walk(bool isForward)
{
    const KvDeskObjectId next = KvDeskObjectPlaces::next(view()->selection()->current(), isForward);
    // Without objects the key goes on to the next widget.
    if (next.isNull())
        return false;
    view()->selection()->select(next);
    return true;
}

void KvDeskSelectTool::cancel()
{
    const bool isChanging = m_action == Move || m_action == DragHandle;
    m_action = Nothing;
    m_isSnapped = false;
    if (isChanging && view()->editor()->undoStack()->index() > m_stepsBefore)
        view()->editor()->slotUndo();
    view()->refresh();
}

void KvDeskSelectTool::draw(QPainter *painter) const
{
    const QTransform toView = painter->worldTransform();
    painter->setWorldTransform(QTransform());
    const KvDeskMarks marks(painter);
    const QPolygonF onView = toView.map(handles());
    for (const QPointF &handle : onView)
        marks.drawHandle(handle);
    if (m_isSnapped)
        marks.drawSnapMark(toView.map(m_snapMark));
    if (m_action == Band)
        marks.drawBand(toView.mapRect(band()));
}
