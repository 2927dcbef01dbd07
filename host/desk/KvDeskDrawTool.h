// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskTool.h"

#include <QPolygonF>

struct ZtDrawnType;

/**
 * Draws objects of one type point by point: by clicks, by dragging from one point to the next, or by keys.
 *
 * Shift keeps the direction straight, Ctrl takes the pointer's very place, Backspace and undo take back the
 * last point, Escape all of them; Enter or a double click ends objects of any number of points. Arrow keys
 * bring up a crosshair and move it; the space bar or Enter then sets a point.
 */
class KvDeskDrawTool : public KvDeskTool
{
public:
    KvDeskDrawTool(KvDeskImageView *view, int typeId);

    int typeId() const;
    /** The points that are set; the one at the pointer is not among them. */
    const QPolygonF &points() const { return m_points; }
    /** What is measured so far; empty as long as that is nothing. */
    QString valueText() const;

    void press(const KvDeskPointer &pointer) override;
    void move(const KvDeskPointer &pointer) override;
    void release(const KvDeskPointer &pointer) override;
    void doubleClick(const KvDeskPointer &pointer) override;
    bool key(QKeyEvent *event) override;
    void cancel() override;
    bool canTakeBack() const override { return !m_points.isEmpty(); }
    void takeBack() override;
    bool isBusy() const override { return !m_points.isEmpty() || m_isByKeys; }
    void draw(QPainter *painter) const override;
    Qt::CursorShape cursor() const override { return Qt::CrossCursor; }

private:
    bool isOpenEnded() const;
    void pointAt(const KvDeskPointer &pointer);
    void addPoint(const QPointF &point);
    void finish();
    bool moveCrosshair(const QKeyEvent &event);
    QPolygonF draft() const;

    const ZtDrawnType &m_type;
    QPolygonF m_points;
    QPointF m_target; ///< where the next point comes, in image pixels
    QPointF m_pressed;
    bool m_hasTarget = false;
    bool m_isSnapped = false;
    bool m_isDown = false;
    bool m_isByKeys = false;
};
