// SPDX-License-Identifier: MIT
#pragma once

#include <QPointF>
#include <QSizeF>
#include <QVector>

/** Where the entries and the title of a legend stand. */
namespace kvCharts::KvLegendLayout {

/** Side of the square in front of an entry's text, in scene units. */
constexpr double MarkerSize = 7.0;

struct Entry
{
    QPointF marker; ///< top-left corner
    QPointF text;   ///< top-left corner of the text's bounding rectangle
};

/** Places entries with texts of these sizes in rows, the first at (0, 0); rows end beyond 800 units. */
QVector<Entry> entries(const QVector<QSizeF> &textSizes);

/** Position of the group of all entries: centred over the plot, standing on its upper edge. */
QPointF groupPosition(const QSizeF &groupSize);

/** Top-left corner of the title, centred above the entries; the group of no entries has height 0. */
QPointF titlePosition(const QSizeF &titleSize, bool hasEntries, double groupHeight);

} // namespace kvCharts::KvLegendLayout
