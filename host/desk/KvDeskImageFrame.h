// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskHalvedImage.h"

#include <QImage>
#include <QRectF>

class QPainter;

/**
 * The picture behind the objects, drawn at any scale: averaged where it is reduced, smooth at about its own
 * size, in plain pixels where it is enlarged.
 */
class KvDeskImageFrame
{
public:
    /** \a sceneRect is where the picture lies in the scene. */
    void set(const QImage &image, const QRectF &sceneRect);
    void clear() { set(QImage(), QRectF()); }

    bool isNull() const { return m_image.isNull(); }
    const QImage &image() const { return m_image; }
    QRectF sceneRect() const { return m_sceneRect; }
    /** Whether these are the picture and the place that are set already. */
    bool isSame(const QImage &image, const QRectF &sceneRect) const;

    /**
     * Draws the part of the picture in \a exposed, in scene coordinates.
     * \param scale device pixels per scene unit
     */
    void draw(QPainter *painter, const QRectF &exposed, double scale) const;

private:
    const QImage &imageFor(int reduction) const;

    QImage m_image;
    QRectF m_sceneRect;
    mutable KvDeskHalvedImage m_halved;
    mutable QImage m_reduced; ///< of m_halved; made when drawn, and given up before the next one is made
    mutable int m_reduction = 0;
};
