// SPDX-License-Identifier: MIT
#pragma once

#include <QPointF>
#include <Qt>

class KvDeskImageView;
class QKeyEvent;
class QPainter;

/** Where the pointer is, and what the user holds down. */
struct KvDeskPointer
{
    QPointF scene; ///< in image pixels
    QPointF view;  ///< in pixels of the viewport
    Qt::MouseButton button = Qt::NoButton;
    Qt::KeyboardModifiers modifiers = Qt::NoModifier;
};

/** What mouse and keys do on the image; the image view hands on its events to one such tool. */
class KvDeskTool
{
public:
    /** \a view has to outlive the tool. */
    explicit KvDeskTool(KvDeskImageView *view)
        : m_view(view)
    {}
    virtual ~KvDeskTool();

    virtual void press(const KvDeskPointer &pointer) = 0;
    virtual void move(const KvDeskPointer &pointer) = 0;
    virtual void release(const KvDeskPointer &pointer) = 0;
    virtual void doubleClick(const KvDeskPointer &pointer) = 0;
    /** False for a key that the tool has no use for. */
    virtual bool key(QKeyEvent *event) = 0;
    /** Forgets what is half done. */
    virtual void cancel() = 0;
    /** Whether something is half done. */
    virtual bool isBusy() const = 0;
    /** Whether a part of what is half done can be taken back. Steps of the history wait for that. */
    virtual bool canTakeBack() const { return false; }
    /** Takes back the last part of what is half done; nothing is left of it with the first one. */
    virtual void takeBack() {}

    /** Draws above the objects; \a painter carries the transform from the scene. */
    virtual void draw(QPainter *painter) const = 0;
    virtual Qt::CursorShape cursor() const = 0;

protected:
    KvDeskImageView *view() const { return m_view; }
    /** Pixels that the pointer may move in the course of a click. */
    static constexpr double clickRoom = 4.0;
    static bool isClick(const QPointF &pressed, const QPointF &released);
    /** The step of an arrow key in image pixels; null for another key. */
    static QPointF arrowStep(const QKeyEvent &event);

private:
    Q_DISABLE_COPY(KvDeskTool)

    KvDeskImageView *m_view;
};
