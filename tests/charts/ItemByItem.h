// SPDX-License-Identifier: MIT
#pragma once

#include <QFont>
#include <QGraphicsScene>
#include <QImage>
#include <QPen>
#include <QPointF>
#include <QStringList>
#include <QVector>

/**
 * Charts drawn in the plain way, with an item of the graphics view for every mark, line and label: what the
 * library's combined items have to look like and to cover.
 */
namespace ItemByItem {

QFont font(qreal pointSize);
QPen cosmeticPen(const QColor &color, qreal width = 1.0);

void addText(QGraphicsScene *scene, const QString &text, const QPointF &topLeft, const QColor &color,
             qreal pointSize = 11.0);

struct AxisLook
{
    QPen axisPen;
    QPen gridPen;
    QColor textColor;
    bool grid;
};

void addValueAxisX(QGraphicsScene *scene, const AxisLook &look, double min, double max, int tickCount);
void addValueAxisY(QGraphicsScene *scene, const AxisLook &look, double min, double max, int tickCount);
void addCategoryAxisX(QGraphicsScene *scene, const AxisLook &look, const QStringList &categories);
void addCategoryAxisY(QGraphicsScene *scene, const AxisLook &look, const QStringList &categories);

/** Markers and the lines that join them. */
void addSeries(QGraphicsScene *scene, const QVector<QPointF> &points, const QColor &color);

struct LegendEntry
{
    QString text;
    QColor color;
};

/** The entries above the plot, and above these the title if there is one. */
void addLegend(QGraphicsScene *scene, const QVector<LegendEntry> &entries, const QString &title,
               const QColor &textColor);

/** A part of a scene, smoothly, in 900 × 900 pixels. */
QImage picture(QGraphicsScene *scene, const QRectF &source);

/**
 * Whether two pictures show the same, up to letters that stand less than a pixel beside: letters are drawn at
 * quarters of a pixel, and their places are rounded to 1/64 unit before in one way of drawing only. False for
 * pictures with hardly anything on them.
 */
bool alike(const QImage &first, const QImage &second);

/** The texts of a scene with place and size, whatever items show them, in the order of their texts. */
QStringList placedTexts(const QGraphicsScene *scene);

/** The straight lines of a scene with their pens, whatever items show them, in a fixed order. */
QStringList placedLines(const QGraphicsScene *scene);

/** Largest difference of two colour components at the same place; 255 when the sizes differ. */
int difference(const QImage &first, const QImage &second);

/** Number of pixels that are not the first one's colour, so that two empty pictures are not taken for alike.
 */
int inkedPixels(const QImage &image);

/** Whether all sides differ by less than a millionth. */
bool sameRect(const QRectF &first, const QRectF &second);

} // namespace ItemByItem
