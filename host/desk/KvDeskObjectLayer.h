// SPDX-License-Identifier: MIT
#pragma once

#include <QImage>
#include <QRegion>
#include <QSet>
#include <QTransform>

#include "KvDeskObjectId.h"
#include "KvDeskRoughObjects.h"

class KvDeskObjectIndex;
class QPainter;

/**
 * The picture of all objects as they lie in the view, kept from one frame to the next: only what changed is
 * drawn again, and when the view moves only what comes into sight.
 *
 * Where very many objects are in view they are drawn roughly, see KvDeskRoughObjects. They stay so while the
 * user pauses: drawing them in full would take seconds of this thread, and nobody could tell one line from
 * the other.
 *
 * Drawing them even roughly takes longer than a step of zooming may. While the scale changes their picture is
 * stretched, until it is sharpened.
 */
class KvDeskObjectLayer
{
public:
    void invalidate();
    /** What is drawn in a rectangle of the scene is out of date. */
    void invalidate(const QRectF &sceneRect);
    /** An object that changes all the time is left out, until it is settled. */
    void lift(const KvDeskObjectId &object) { m_lifted.insert(object); }
    bool isLifted(const KvDeskObjectId &object) const { return m_lifted.contains(object); }
    const QSet<KvDeskObjectId> &lifted() const { return m_lifted; }
    void settle(const KvDeskObjectId &object, const QRectF &sceneRect);

    /**
     * Brings the picture up to date and draws it.
     * \param toView from the scene to the view, without turning
     * \param size   of the view in device-independent pixels
     */
    void draw(QPainter *painter, const KvDeskObjectIndex &index, const QTransform &toView, const QSize &size,
              double pixelRatio);

    /** With more objects in view, or more points of them, they are drawn roughly. */
    static constexpr int mostInFull = 1000;
    static constexpr int mostPointsInFull = 10000;
    bool isRough() const { return m_isRough; }

    /** Whether a stretched picture of another scale was drawn last. */
    bool isStretched() const { return m_isStretched; }
    /** The next drawing shows the objects as they are, however long that takes. */
    void sharpen();

    /** Objects drawn since the layer was made, to count the work. */
    qint64 drawnObjects() const { return m_drawnObjects; }

private:
    void prepare(const QTransform &toView, const QSize &size, double pixelRatio);
    bool scroll(const QTransform &toView);
    bool isStretchable(const QTransform &toView, const QSize &size, double pixelRatio) const;
    void drawStretched(QPainter *painter, const QTransform &toView) const;
    void chooseRoughness(const KvDeskObjectIndex &index);
    QRectF areaOf(const QRectF &rect) const;
    void redraw(const KvDeskObjectIndex &index, const QRect &rect);
    void drawInFull(QPainter *painter, const KvDeskObjectIndex &index, const QRectF &area);
    void drawRoughly(QPainter *painter, const KvDeskObjectIndex &index, const QRectF &area);

    QImage m_image;
    QTransform m_toView;
    QRegion m_dirty; ///< in device-independent pixels of the view
    QSet<KvDeskObjectId> m_lifted;
    qint64 m_drawnObjects = 0;
    bool m_isStale = true; ///< all of it is out of date
    bool m_isRough = false;
    bool m_isStretched = false;
    KvDeskRoughObjects m_rough; ///< of the last part that was drawn roughly
};
