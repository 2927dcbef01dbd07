// SPDX-License-Identifier: MIT
#pragma once

#include "DeskFiles.h"
#include "KvDeskImageView.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskObjectState.h"
#include "KvDeskSelection.h"
#include "KvDeskSession.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QMouseEvent>
#include <QUndoStack>

/**
 * An image view with everything that tools need, and hands to work it. The image is 400 x 300 pixels, shown
 * one to one; places are given in image pixels.
 */
class DeskView
{
public:
    DeskView()
        : session(&document)
        , editor(&session, &selection)
    {
        view.resize(640, 480);
        view.setDocument(&document);
        view.setEditor(&editor);
        view.show();
        ZtFault fault;
        document.loadImage(DeskFiles::image(QStringLiteral("desk view.png"), QSize(400, 300)), &fault);
        view.slotZoomActual();
        view.setFocus();
    }

    QPoint at(double x, double y) const { return view.viewportTransform().map(QPointF(x, y)).toPoint(); }
    QPoint at(const QPointF &point) const { return at(point.x(), point.y()); }

    void move(const QPointF &to, Qt::MouseButtons buttons = Qt::NoButton,
              Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        QMouseEvent event(QEvent::MouseMove, QPointF(at(to)), Qt::NoButton, buttons, modifiers);
        QApplication::sendEvent(view.viewport(), &event);
    }

    void press(const QPointF &place, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        QTest::mousePress(view.viewport(), Qt::LeftButton, modifiers, at(place));
    }

    void release(const QPointF &place, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        QTest::mouseRelease(view.viewport(), Qt::LeftButton, modifiers, at(place));
    }

    void click(const QPointF &place, Qt::KeyboardModifiers modifiers = Qt::NoModifier,
               Qt::MouseButton button = Qt::LeftButton)
    {
        QTest::mouseClick(view.viewport(), button, modifiers, at(place));
    }

    void doubleClick(const QPointF &place)
    {
        QTest::mouseDClick(view.viewport(), Qt::LeftButton, {}, at(place));
    }

    void drag(const QPointF &from, const QPointF &to, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        press(from, modifiers);
        move((from + to) / 2.0, Qt::LeftButton, modifiers);
        move(to, Qt::LeftButton, modifiers);
        release(to, modifiers);
    }

    void key(Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        QTest::keyClick(&view, key, modifiers);
    }

    KvDeskObjectId line(const QPointF &from, const QPointF &to)
    {
        return {ZtDrawnType::Line, document.addObject(ZtDrawnType::Line, polygon({from, to}))};
    }

    QPolygonF points(const KvDeskObjectId &object) const { return KvDeskObjectState::of(object).points; }
    QString name(const KvDeskObjectId &object) const { return KvDeskObjectEditor::describe({object}); }
    int count(int type) const { return ZtKernelData::getInstance()->objects().value(type).size(); }
    int steps() const { return editor.undoStack()->count(); }
    QImage shown() const { return view.viewport()->grab().toImage(); }

    ZtMeasuringDocument document;
    KvDeskSession session;
    KvDeskSelection selection;
    KvDeskObjectEditor editor;
    KvDeskImageView view;
};

/** Places of the mouse are whole pixels of the screen, which may lie half a pixel beside the image's. */
inline bool isNear(const QPointF &a, const QPointF &b, double distance = 1.0)
{
    return qAbs(a.x() - b.x()) <= distance && qAbs(a.y() - b.y()) <= distance;
}
