// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtGsManipulator.h"
#include "measuring/ZtMeasuringGlobal.h"

#include <QPainterPath>
#include <QPolygonF>
#include <QString>

#include <vector>

/** One value that objects of a drawn type measure. */
struct ZtDrawnValue
{
    const char *name; ///< English name, also the key in files
    ZtGsManipulator::MeasureKind kind;
    /** The value in pixels, square pixels, degrees or pieces, of points in a plane with the same scale in
     * both directions; null for a share, which depends on other objects. */
    double (*measure)(const QPolygonF &points);
};

/**
 * A type of objects that are drawn on the image: one row of the table of built-in types.
 *
 * Points of an object: rectangle: two opposite corners; line, scale bar: both ends; arc: start, a point on
 * the way, end; polygon, polyline: the corners; parallel distance: two points of the base line, one of its
 * parallel; circle: centre and a point on the rim; counter: every counted place; text note: the place of the
 * text.
 */
struct ZT_MEASURING_EXPORT ZtDrawnType
{
    enum Id {
        Rectangle = 66651,
        Line = 66653,
        Arc = 66655,
        Polygon = 66656,
        Polyline = 66658,
        ParallelDistance = 66659,
        TextNote = 66670,
        ScaleBar = 66671,
        Counter = 66741,
        Circle = 66755
    };

    int id;
    const char *key;  ///< name in files
    const char *name; ///< English display name
    int minimumPoints;
    int maximumPoints; ///< unlimitedPoints for as many as the user draws
    std::vector<ZtDrawnValue> values;
    /** The lines of an object in the plane of its points; null for types without lines. On the image it is
     * ZtDrawnManipulator::outline(). */
    QPainterPath (*outline)(const QPolygonF &points);

    static constexpr int unlimitedPoints = 1000000;
    /** Coordinates beyond this are no image pixels, and their products would lose all digits. */
    static constexpr double largestCoordinate = 1e9;

    bool isMeasurement() const { return !values.empty(); }
    bool acceptsPointCount(int count) const { return count >= minimumPoints && count <= maximumPoints; }
    /** Whether an object can have these points: their number fits, and each isCoordinatePair(). */
    bool acceptsPoints(const QPolygonF &points) const;
    /** Both coordinates are finite and not beyond largestCoordinate. */
    static bool isCoordinatePair(const QPointF &point);

    QString displayName() const;                         ///< translated
    QStringList valueNames() const;                      ///< translated
    int valuePosition(const QString &englishName) const; ///< -1 for an unknown name

    /** All built-in types in the order of their ids. */
    static const std::vector<ZtDrawnType> &all();
    /** The type with an id or a key, or null. */
    static const ZtDrawnType *find(int id);
    static const ZtDrawnType *findKey(const QString &key);
};
