// SPDX-License-Identifier: MIT
#pragma once

#include <QApplication>
#include <QDragEnterEvent>
#include <QDragLeaveEvent>
#include <QDragMoveEvent>
#include <QDropEvent>
#include <QGraphicsView>
#include <QMimeData>

#include <memory>

/**
 * A drag over a view, told to it as the window system would: entered, moved, dropped or left. Places are in
 * the view's scene, where they are when the event is sent.
 */
class PagedViewDrag
{
public:
    /** Takes \a data over. */
    PagedViewDrag(QGraphicsView *view, QMimeData *data, Qt::DropAction action = Qt::CopyAction)
        : m_view(view)
        , m_data(data)
        , m_action(action)
    {}

    /** Whether the drag would be dropped here; so for the others, too. */
    bool enter(const QPointF &scenePoint) { return enterAt(m_view->mapFromScene(scenePoint)); }
    bool enterAt(const QPoint &point)
    {
        QDragEnterEvent event(point, m_action, m_data.get(), Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(m_view->viewport(), &event);
        m_isAccepted = event.isAccepted();
        return m_isAccepted;
    }

    bool move(const QPointF &scenePoint) { return moveAt(m_view->mapFromScene(scenePoint)); }
    bool moveAt(const QPoint &point)
    {
        QDragMoveEvent event(point, m_action, m_data.get(), Qt::LeftButton, Qt::NoModifier);
        event.setAccepted(m_isAccepted);
        QApplication::sendEvent(m_view->viewport(), &event);
        m_isAccepted = event.isAccepted();
        return m_isAccepted;
    }

    bool drop(const QPointF &scenePoint) { return dropAt(m_view->mapFromScene(scenePoint)); }
    bool dropAt(const QPoint &point)
    {
        QDropEvent event(point, m_action, m_data.get(), Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(m_view->viewport(), &event);
        return event.isAccepted();
    }

    void leave()
    {
        QDragLeaveEvent event;
        QApplication::sendEvent(m_view->viewport(), &event);
    }

    /** All of it at one place. */
    bool run(const QPointF &scenePoint) { return enter(scenePoint) && move(scenePoint) && drop(scenePoint); }

private:
    QGraphicsView *m_view;
    std::unique_ptr<QMimeData> m_data;
    Qt::DropAction m_action;
    bool m_isAccepted = false;
};
