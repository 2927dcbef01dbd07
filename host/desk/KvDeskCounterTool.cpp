// SPDX-License-Identifier: MIT
#include "KvDeskCounterTool.h"

#include "KvDeskImageView.h"
#include "KvDeskMarks.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskObjectState.h"
#include "KvDeskSelection.h"
#include "KvDeskSnapping.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"

#include <QKeyEvent>
#include <QPainter>

namespace {

constexpr double removalRoom = 12.0; ///< pixels within which a place is taken away

} // namespace

QVector<KvDeskObjectId> KvDeskCounterTool::counters()
{
    QVector<KvDeskObjectId> result;
    const ZtObjectMap objects = ZtKernelData::getInstance()->objects().value(ZtDrawnType::Counter);
    for (auto it = objects.constBegin(); it != objects.constEnd(); ++it)
        result.append({ZtDrawnType::Counter, it.key()});
    return result;
}

KvDeskObjectId KvDeskCounterTool::counter() const
{
    const KvDeskObjectId current = view()->selection()->current();
    if (current.type == ZtDrawnType::Counter)
        return current;
    const ZtObjectMap objects = ZtKernelData::getInstance()->objects().value(ZtDrawnType::Counter);
    return objects.isEmpty() ? KvDeskObjectId() : KvDeskObjectId{ZtDrawnType::Counter, objects.lastKey()};
}

void KvDeskCounterTool::choose(const KvDeskObjectId &counter)
{
    view()->selection()->select(counter);
}

void KvDeskCounterTool::addClass()
{
    if (view()->editor())
        view()->editor()->create(ZtDrawnType::Counter, QPolygonF());
}

void KvDeskCounterTool::press(const KvDeskPointer &pointer)
{
    m_target = pointer.scene;
    m_hasTarget = true;
    m_isByKeys = false;
    const bool isRemoval = pointer.button == Qt::RightButton ||
                           (pointer.button == Qt::LeftButton && pointer.modifiers.testFlag(Qt::AltModifier));
    if (isRemoval)
        removeNear(pointer.scene);
    else if (pointer.button == Qt::LeftButton)
        add(pointer.scene);
}

// What lies beside the image is nothing to count; without an image there are tables and objects only.
bool KvDeskCounterTool::isCountable(const QPointF &place) const
{
    const KvDeskImageFrame &frame = view()->frame();
    return frame.isNull() || frame.sceneRect().contains(place);
}

void KvDeskCounterTool::add(const QPointF &place)
{
    if (!view()->editor() || !isCountable(place))
        return;
    const KvDeskObjectId chosen = counter();
    if (chosen.isNull()) {
        view()->editor()->create(ZtDrawnType::Counter, QPolygonF(QVector<QPointF>{place}));
        return;
    }
    view()->editor()->addPlace(chosen, place);
    choose(chosen);
}

void KvDeskCounterTool::removeNear(const QPointF &place)
{
    const KvDeskObjectId chosen = counter();
    const QPolygonF places = KvDeskObjectState::of(chosen).points;
    const QPointF *const found = KvDeskSnapping::nearest(place, places, removalRoom * view()->pixel());
    if (found && view()->editor())
        view()->editor()->removePlace(chosen, static_cast<int>(found - places.constData()));
}

void KvDeskCounterTool::move(const KvDeskPointer &pointer)
{
    m_target = pointer.scene;
    m_hasTarget = true;
    if (m_isByKeys) {
        m_isByKeys = false;
        view()->refresh();
    }
}

void KvDeskCounterTool::release(const KvDeskPointer &pointer)
{
    Q_UNUSED(pointer)
}

void KvDeskCounterTool::doubleClick(const KvDeskPointer &pointer)
{
    // Who counts quickly means two clicks.
    press(pointer);
}

bool KvDeskCounterTool::key(QKeyEvent *event)
{
    const int digit = event->key() - Qt::Key_1;
    const bool isSetting =
        event->key() == Qt::Key_Space || event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
    if (digit >= 0 && digit <= 8)
        chooseByDigit(digit);
    else if (m_isByKeys && isSetting)
        add(m_target);
    else if (m_isByKeys && event->key() == Qt::Key_Backspace)
        removeNear(m_target);
    else if (m_isByKeys && event->key() == Qt::Key_Escape)
        cancel();
    else
        return moveCrosshair(*event);
    return true;
}

// The digit after the last counter's means one that is still to come.
void KvDeskCounterTool::chooseByDigit(int index)
{
    const QVector<KvDeskObjectId> all = counters();
    if (index < all.size())
        choose(all.at(index));
    else if (index == all.size())
        addClass();
}

bool KvDeskCounterTool::moveCrosshair(const QKeyEvent &event)
{
    if (arrowStep(event).isNull())
        return false;
    m_target = view()->steppedPoint(m_hasTarget ? m_target : view()->centre(), arrowStep(event));
    m_hasTarget = true;
    m_isByKeys = true;
    return true;
}

void KvDeskCounterTool::cancel()
{
    m_isByKeys = false;
    view()->refresh();
}

void KvDeskCounterTool::draw(QPainter *painter) const
{
    if (!m_isByKeys)
        return;
    const QPointF place = painter->worldTransform().map(m_target);
    painter->setWorldTransform(QTransform());
    KvDeskMarks(painter).drawCrosshair(place);
}
