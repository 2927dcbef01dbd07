// SPDX-License-Identifier: MIT
#include "KvDeskDrawTool.h"

#include "KvDeskImageView.h"
#include "KvDeskInlineEditor.h"
#include "KvDeskMarks.h"
#include "KvDeskObjectEditor.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnManipulator.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnObjectPainter.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasureFormat.h"

#include <QKeyEvent>
#include <QPainter>

KvDeskDrawTool::KvDeskDrawTool(KvDeskImageView *view, int typeId)
    : KvDeskTool(view)
    , m_type(*ZtDrawnType::find(typeId))
{}

int KvDeskDrawTool::typeId() const
{
    return m_type.id;
}

bool KvDeskDrawTool::isOpenEnded() const
{
    return m_type.maximumPoints == ZtDrawnType::unlimitedPoints;
}

void KvDeskDrawTool::pointAt(const KvDeskPointer &pointer)
{
    const KvDeskImageView::Snap snap = view()->snap(pointer, m_points.isEmpty() ? nullptr : &m_points.last(),
                                                    m_type.id == ZtDrawnType::Rectangle, KvDeskObjectId());
    m_target = snap.point;
    m_isSnapped = snap.isOnPoint;
    m_hasTarget = true;
    m_isByKeys = false;
}

void KvDeskDrawTool::press(const KvDeskPointer &pointer)
{
    if (pointer.button != Qt::LeftButton)
        return;
    pointAt(pointer);
    m_isDown = true;
    m_pressed = pointer.view;
    addPoint(m_target);
}

void KvDeskDrawTool::move(const KvDeskPointer &pointer)
{
    pointAt(pointer);
    view()->refresh();
}

void KvDeskDrawTool::release(const KvDeskPointer &pointer)
{
    if (pointer.button != Qt::LeftButton)
        return;
    const bool isDrag = m_isDown && !m_points.isEmpty() && !isClick(m_pressed, pointer.view);
    m_isDown = false;
    if (!isDrag)
        return;
    pointAt(pointer);
    addPoint(m_target);
}

void KvDeskDrawTool::doubleClick(const KvDeskPointer &pointer)
{
    // The first of both clicks has set the last point already.
    if (isOpenEnded() && !m_points.isEmpty())
        finish();
    else
        press(pointer);
}

void KvDeskDrawTool::addPoint(const QPointF &point)
{
    if (!view()->editor() || (!m_points.isEmpty() && m_points.last() == point))
        return;
    m_points.append(point);
    if (m_points.size() >= m_type.maximumPoints)
        finish();
    view()->refresh();
}

void KvDeskDrawTool::finish()
{
    if (!m_type.acceptsPoints(m_points))
        return;
    const QPolygonF points = m_points;
    m_points.clear();
    m_isDown = false;
    if (m_type.id == ZtDrawnType::TextNote)
        view()->inlineEditor()->writeNote(points.first());
    else
        view()->editor()->create(m_type.id, points);
    view()->refresh();
}

void KvDeskDrawTool::takeBack()
{
    if (!m_points.isEmpty())
        m_points.removeLast();
    // The end of a drag from the point that is gone sets none.
    m_isDown = false;
    view()->refresh();
}

void KvDeskDrawTool::cancel()
{
    m_points.clear();
    m_isDown = false;
    m_isByKeys = false;
    m_isSnapped = false;
    view()->refresh();
}

bool KvDeskDrawTool::key(QKeyEvent *event)
{
    const bool isEnter = event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
    if (event->key() == Qt::Key_Escape && isBusy())
        cancel();
    else if (event->key() == Qt::Key_Backspace && !m_points.isEmpty())
        takeBack();
    else if (m_isByKeys && event->key() == Qt::Key_Space)
        addPoint(m_target);
    else if (isEnter && isOpenEnded() && !m_points.isEmpty() && (!m_isByKeys || m_points.last() == m_target))
        finish();
    else if (isEnter && m_isByKeys)
        addPoint(m_target);
    else
        return moveCrosshair(*event);
    return true;
}

bool KvDeskDrawTool::moveCrosshair(const QKeyEvent &event)
{
    const QPointF step = arrowStep(event);
    if (step.isNull())
        return false;
    m_target = view()->steppedPoint(m_hasTarget ? m_target : view()->centre(), step);
    m_hasTarget = true;
    m_isByKeys = true;
    m_isSnapped = false;
    return true;
}

QPolygonF KvDeskDrawTool::draft() const
{
    QPolygonF points = m_points;
    if (m_hasTarget && (points.isEmpty() || points.last() != m_target) &&
        points.size() < m_type.maximumPoints)
        points.append(m_target);
    return points;
}

QString KvDeskDrawTool::valueText() const
{
    const auto *const manipulator = ZtKernelData::getInstance()->getGsManipulator(m_type.id);
    const QPolygonF points = draft();
    if (!manipulator || m_points.isEmpty() || !m_type.acceptsPoints(points))
        return QString();
    const ZtDrawnObjectData object(points);
    QStringList lines;
    const QStringList names = manipulator->getValueNames();
    for (const QString &name : names) {
        const QString value = manipulator->valueText(name, &object);
        lines.append(names.size() == 1 ? value : ZtMeasureFormat::named(name, value));
    }
    if (m_type.id == ZtDrawnType::ScaleBar)
        lines.append(static_cast<const ZtDrawnManipulator *>(manipulator)->labelText(0, &object));
    return lines.join(QLatin1Char('\n'));
}

void KvDeskDrawTool::draw(QPainter *painter) const
{
    const QPolygonF points = draft();
    const QTransform toView = painter->worldTransform();
    if (!m_points.isEmpty()) {
        QPainterPath path;
        if (m_type.outline && m_type.acceptsPoints(points))
            path = ZtDrawnManipulator::outlineOf(m_type, points);
        else
            path.addPolygon(points);
        ZtDrawnObjectPainter(painter).drawOutline(path);
    }
    painter->setWorldTransform(QTransform());
    const KvDeskMarks marks(painter);
    for (const QPointF &point : m_points)
        marks.drawHandle(toView.map(point));
    if (m_isSnapped)
        marks.drawSnapMark(toView.map(m_target));
    if (m_isByKeys)
        marks.drawCrosshair(toView.map(m_target));
    marks.drawText(toView.map(m_target), valueText(), view()->page());
}
