// SPDX-License-Identifier: MIT
#pragma once

#include "report/KvNodeWrapperWidget.h"
#include "report/KvReportPagedView.h"
#include "report/KvReportProxyWidgetItem.h"

#include <QCoreApplication>
#include <QMouseEvent>
#include <QPoint>
#include <QVector>
#include <QtTest>

/** What tests of the paged view need to look at it. */
namespace PagedViewTools {

inline QVector<QPoint> placesOf(const QList<KvReportProxyWidgetItem *> &items)
{
    QVector<QPoint> places;
    for (const KvReportProxyWidgetItem *item : items)
        places.append(item->scenePos().toPoint());
    return places;
}

inline QVector<QPoint> placesOf(const KvReportPagedView &view)
{
    return placesOf(view.pieceItems());
}

inline QWidget *pieceOf(const KvReportProxyWidgetItem *item)
{
    auto *wrapper = qobject_cast<KvNodeWrapperWidget *>(item->widget());
    return wrapper ? wrapper->piece() : nullptr;
}

/** Whether every item shows its piece. */
inline bool showsAllPieces(const KvReportPagedView &view)
{
    for (const KvReportProxyWidgetItem *item : view.pieceItems()) {
        const QWidget *piece = pieceOf(item);
        if (!piece || piece->parentWidget() != item->widget() || !piece->isVisible() || piece->height() == 0)
            return false;
    }
    return true;
}

inline void deliverQueuedCalls()
{
    QCoreApplication::sendPostedEvents();
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

inline void showView(KvReportPagedView &view, const QSize &size)
{
    view.resize(size);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    deliverQueuedCalls();
}

/** Moves the mouse over the view with the left button down; QTest's own moves have no button. */
inline void moveWithLeftButton(QGraphicsView &view, const QPoint &point)
{
    QMouseEvent event(QEvent::MouseMove, point, view.viewport()->mapToGlobal(point), Qt::NoButton,
                      Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(view.viewport(), &event);
}

/** Top of a page's content without sections, for pages of the default width. */
inline int contentTop(int page)
{
    return 40 + page * 1366;
}

} // namespace PagedViewTools
