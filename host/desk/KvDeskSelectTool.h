// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"
#include "KvDeskTool.h"

#include <QPolygonF>
#include <QRectF>

/**
 * Selects objects and changes them: a click selects, with Ctrl adds; a drag moves the selected ones, a drag
 * beside all objects selects what lies in the rectangle; the points of a single selected object can be
 * dragged. Arrow keys move by a pixel, with Shift by ten; Tab goes on to the next object.
 */
class KvDeskSelectTool : public KvDeskTool
{
public:
    using KvDeskTool::KvDeskTool;

    void press(const KvDeskPointer &pointer) override;
    void move(const KvDeskPointer &pointer) override;
    void release(const KvDeskPointer &pointer) override;
    void doubleClick(const KvDeskPointer &pointer) override;
    bool key(QKeyEvent *event) override;
    void cancel() override;
    bool isBusy() const override { return m_action != Nothing; }
    bool canTakeBack() const override { return m_action != Nothing && m_action != Click; }
    void takeBack() override { cancel(); }
    void draw(QPainter *painter) const override;
    Qt::CursorShape cursor() const override { return Qt::ArrowCursor; }

private:
    enum Action { Nothing, Click, Move, DragHandle, Band };

    QPolygonF handles() const;
    int handleAt(const QPointF &place) const;
    void pressObject(const KvDeskPointer &pointer, const KvDeskObjectId &object);
    void startDragging(const KvDeskPointer &pointer);
    void moveObjects(const KvDeskPointer &pointer);
    void moveHandle(const KvDeskPointer &pointer);
    void selectBand(const KvDeskPointer &pointer);
    bool nudge(const QKeyEvent &event);
    bool walk(bool isForward);
    QRectF band() const;

    Action m_action = Nothing;
    KvDeskPointer m_pressed;
    KvDeskPointer m_last;
    KvDeskObjectId m_object; ///< below the pointer when the button went down
    QPointF m_moved;         ///< image pixels that the objects were moved so far
    QPointF m_snapMark;
    int m_handle = -1;
    int m_stepsBefore = 0; ///< of the history when the drag began
    bool m_isSnapped = false;
};
