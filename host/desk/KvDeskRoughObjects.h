// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"

#include <QLine>
#include <QTransform>
#include <QVector>

#include <vector>

class QColor;
class QPainter;
class QPainterPath;
class QPolygonF;
class QRectF;
struct ZtDrawnType;

/**
 * Draws many objects quickly: thin lines without smooth edges, all of a colour at once, and curves as
 * polygons with no more corners than are seen. All objects but counters have the same two colours, so their
 * order does not matter.
 *
 * For the screen only; pictures of reports show objects in full, however many there are.
 */
class KvDeskRoughObjects
{
public:
    /** \a toView from the scene to the view, without turning. */
    explicit KvDeskRoughObjects(const QTransform &toView = QTransform())
        : m_toView(toView)
        , m_lines(1)
    {}

    /** Forgets all objects but keeps their memory: asking for it again at every step takes longer. */
    void restart(const QTransform &toView);

    /** \a rect is the bounding rectangle of the object's outline, in scene coordinates. */
    void add(const KvDeskObjectId &object, const QRectF &rect);

    /** In the colours of objects. \a painter paints the view; its transform is left out of account. */
    void draw(QPainter *painter) const;
    /** In a bright colour, and a dark one beside it so that objects are seen on pictures of any brightness.
     */
    void draw(QPainter *painter, const QColor &bright, const QColor &dark) const;

    /** Everything that is drawn, in the coordinates of the view. */
    QVector<QLineF> lines() const;

private:
    QRectF onView(const QRectF &rect) const;
    QPointF onView(const QPointF &point) const;
    void addLine(const QPointF &from, const QPointF &to);
    void addOutline(const ZtDrawnType &type, const QPolygonF &points);
    void addSpeck(const QPointF &place);
    void addRectangle(const QRectF &place);
    void addEllipse(const QRectF &place);
    void addPath(const QPainterPath &path);
    void addMarkers(const QPolygonF &points);

    /** Of one colour. */
    struct Lines
    {
        QVector<QLine> level; ///< lines in whole pixels, nearer to level than to upright
        QVector<QLine> steep;
        QVector<QLineF> distant; ///< lines that end far outside of the view
    };
    static void drawHalo(QPainter *painter, const Lines &lines);
    static void drawLines(QPainter *painter, const Lines &lines);
    void drawHalos(QPainter *painter, const QColor &dark) const;

    QTransform m_toView;
    std::vector<Lines> m_lines; ///< by the place of their colour among those of counters
    std::size_t m_color = 0;    ///< of the object that is being added
};
