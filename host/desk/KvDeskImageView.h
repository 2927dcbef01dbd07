// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskImageFrame.h"
#include "KvDeskObjectChanges.h"
#include "KvDeskObjectId.h"
#include "kernel/FrameData.h"

#include <QGraphicsView>

class KvDeskEmptyState;
class ZtMeasuringDocument;

/**
 * The image with the measured objects on it. Objects are drawn anew for every view, so that they are sharp at
 * any zoom.
 *
 * The wheel zooms at the pointer; the middle button, or the left one while the space bar is down, moves the
 * image; a click selects the object below it. As long as the user does not zoom, the whole image is kept in
 * view.
 */
class KvDeskImageView : public QGraphicsView
{
    Q_OBJECT
public:
    explicit KvDeskImageView(QWidget *parent = nullptr);
    ~KvDeskImageView() override;

    /** \a document has to outlive the view. */
    void setDocument(ZtMeasuringDocument *document);

    const KvDeskImageFrame &frame() const { return m_frame; }
    KvDeskEmptyState *emptyState() const { return m_emptyState; }
    KvDeskObjectId selectedObject() const { return m_selected; }

    /** Pixels of the screen per pixel of the image. */
    double zoom() const;
    static constexpr double minimumZoom = 0.02;
    static constexpr double maximumZoom = 64.0;
    /** Whether the whole image is kept in view. */
    bool isFitted() const { return m_isFitted; }

    /** The object drawn at a point of the viewport, the topmost where there are several; none elsewhere. */
    KvDeskObjectId objectAt(const QPoint &position) const;
    /** Shows pending changes of objects at once. */
    void flush() { m_changes.flush(); }

public slots:
    void slotZoomIn();
    void slotZoomOut();
    void slotZoomFit();
    void slotZoomActual(); ///< one pixel of the image on one of the screen
    /** Marks an object and brings it into view; an \a aId of 0 marks none. Emits nothing. */
    void slotSelectObject(int aType, int aId);

signals:
    void signalZoomChanged(double aZoom);
    void signalFrameChanged();
    /** The user clicked at an object, or with \a aId 0 beside all of them. */
    void signalObjectClicked(int aType, int aId);
    /** The pointer is over this point of the image, in its pixels. */
    void signalPointerMoved(QPointF aPosition);
    void signalPointerLeft(); ///< the pointer is not over the image

protected:
    void drawBackground(QPainter *painter, const QRectF &rect) override;
    void drawForeground(QPainter *painter, const QRectF &rect) override;
    void resizeEvent(QResizeEvent *event) override;
    void wheelEvent(QWheelEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void mouseDoubleClickEvent(QMouseEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void keyReleaseEvent(QKeyEvent *event) override;
    void focusOutEvent(QFocusEvent *event) override;
    bool viewportEvent(QEvent *event) override;

private slots:
    void slotImageChanged();
    void slotImageCompleted(FrameData aFrameData, bool &aHandled);
    void slotObjectsChanged();
    void slotThemeChanged();

private:
    void connectSignals();
    void refreshContent();
    QRectF objectsRect() const;
    void updateSceneRect();
    void bringIntoView(const QRectF &rect);
    /** Moves the image so that a point of the scene lies at \a position in the viewport. */
    void place(const QPointF &scenePoint, const QPointF &position);
    void fit();
    /** Zooms by a factor so that the point below \a anchor, in the viewport, stays there. */
    void zoomAt(double factor, const QPointF &anchor);
    void setScale(double scale);
    QPointF viewportCentre() const;
    QPointF toScene(const QPointF &position) const;
    void pan(const QPoint &to);
    void setPanning(bool on);
    void setSpaceDown(bool down);
    void updateCursor();
    void reportPointer(const QPointF &position);
    void drawObjects(QPainter *painter) const;

    ZtMeasuringDocument *m_document = nullptr;
    KvDeskImageFrame m_frame;
    KvDeskObjectChanges m_changes;
    KvDeskEmptyState *m_emptyState = nullptr;
    KvDeskObjectId m_selected;
    QRectF m_content; ///< the image and all objects, in scene coordinates
    QPoint m_lastPan;
    bool m_isFitted = true;
    bool m_isPanning = false;
    bool m_isSpaceDown = false;
};
