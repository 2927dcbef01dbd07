// SPDX-License-Identifier: MIT
#pragma once

class QPainter;
class QPointF;
class QRectF;
class QString;

/** What tools draw above the image: of the same size at any zoom, to be seen on dark and light pictures.
 * Places are in pixels of the view. */
class KvDeskMarks
{
public:
    static constexpr double handleRadius = 4.5;

    /** \a painter carries no transform. */
    explicit KvDeskMarks(QPainter *painter)
        : m_painter(painter)
    {}

    void drawHandle(const QPointF &place) const;
    void
    drawSnapMark(const QPointF &place) const; ///< around the point that is taken instead of the pointer's
    void drawCrosshair(const QPointF &place) const;
    void drawBand(const QRectF &rect) const; ///< around what is being selected
    /** A text beside a point, kept inside \a page. */
    void drawText(const QPointF &place, const QString &text, const QRectF &page) const;

private:
    QPainter *m_painter;
};
