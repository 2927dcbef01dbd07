// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QColor>
#include <QVector>

class QPainter;
class QPainterPath;
class QPointF;
class QPolygonF;
class QRectF;
class QSizeF;
class QString;

/**
 * Draws objects so that they can be seen on dark and on light pictures: a bright line on a dark one.
 *
 * Geometry comes in scene coordinates; lines, markers and texts keep their size on the device whatever the
 * zoom.
 */
class ZT_MEASURING_EXPORT ZtDrawnObjectPainter
{
public:
    /** \a painter carries the transform from the scene to its device; every call leaves its state as it was.
     */
    explicit ZtDrawnObjectPainter(QPainter *painter)
        : m_painter(painter)
    {}

    void drawOutline(const QPainterPath &path) const;
    /** A small cross at each point. */
    void drawMarkers(const QPolygonF &points, const QColor &color = lineColor()) const;
    /** A text in a dark box, its lower left corner near \a anchor; moved so that it stays on the device when
     * \a anchor is on it. */
    void drawLabel(const QPointF &anchor, const QString &text) const;

    /** The colours of an outline and of the dark line below it, as in full so where objects are drawn with
     * less care. */
    static QColor lineColor();
    static QColor haloColor();
    /** The colours by which counters are told apart, wherever one is shown: that of all objects, then others
     * that are seen on the dark line and differ for people who see few colours, too. */
    static const QVector<QColor> &counterColors();
    /** The place of a counter's colour among them. It depends on the id alone, so that a counter keeps its
     * colour whatever becomes of others; after the last colour comes the first one again. */
    static int counterColorIndex(int id);
    static QColor counterColor(int id) { return counterColors().at(counterColorIndex(id)); }

    /** What a painter can reach, in the coordinates that it has without a transform. */
    static QRectF page(const QPainter &painter);

    /** The size of a label's box on the device. */
    static QSizeF labelSize(const QString &text);
    /** A text in a dark box that lies at \a box on the device, whatever the transform. */
    void drawLabelBox(const QRectF &box, const QString &text) const;

private:
    void strokeOnDevice(const QPainterPath &path, const QColor &color = lineColor()) const;

    QPainter *m_painter;
};
