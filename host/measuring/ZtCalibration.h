// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QDateTime>
#include <QPolygonF>
#include <QString>

/**
 * How large a pixel of the image is in both directions, and how that is known. Uncalibrated, lengths stay in
 * pixels.
 */
class ZT_MEASURING_EXPORT ZtCalibration
{
public:
    /** Where the pixel size comes from. */
    enum class Origin {
        KnownDistance, ///< a distance on the image whose length is known
        Metadata,      ///< the file that holds the image
        Typed          ///< the user
    };

    ZtCalibration() = default;

    /** Calibrated with square pixels; uncalibrated when isValidPixelSize() says no. Micrometres. */
    explicit ZtCalibration(double micrometresPerPixel);
    /** Calibrated with a pixel size in micrometres; uncalibrated unless both are valid. */
    ZtCalibration(double micrometresPerPixelX, double micrometresPerPixelY);

    /** A pixel size is finite and greater than 0. */
    static bool isValidPixelSize(double micrometres);

    bool isCalibrated() const { return m_pixelSizeX > 0.0; }

    /** Micrometres per pixel in the direction of the rows; 0 when uncalibrated. */
    double micrometresPerPixel() const { return m_pixelSizeX; }
    double micrometresPerPixelX() const { return m_pixelSizeX; }
    /** Micrometres per pixel in the direction of the columns; 0 when uncalibrated. */
    double micrometresPerPixelY() const { return m_pixelSizeY; }

    /** Micrometres per pixel in x; 1 (a length in pixels stays itself) when uncalibrated. */
    double factor() const { return isCalibrated() ? m_pixelSizeX : 1.0; }
    /** Height of a pixel per its width; 1 when uncalibrated. */
    double aspect() const { return isCalibrated() ? m_pixelSizeY / m_pixelSizeX : 1.0; }
    bool isSquare() const { return m_pixelSizeX == m_pixelSizeY; }

    /**
     * Image pixels in the shape they have in reality: a plane whose unit is a pixel's width in both
     * directions. Lengths there times factor() are micrometres, angles and circles are the real ones.
     */
    QPolygonF toPlane(const QPolygonF &points) const;

    QString name() const { return m_name; }
    void setName(const QString &name) { m_name = name; }
    QString objective() const { return m_objective; } ///< empty where there is only one, or none is known
    void setObjective(const QString &objective) { m_objective = objective; }
    QDateTime date() const { return m_date; } ///< UTC; invalid when unknown
    void setDate(const QDateTime &date) { m_date = date.toUTC(); }
    QString author() const { return m_author; }
    void setAuthor(const QString &author) { m_author = author; }
    QString note() const { return m_note; }
    void setNote(const QString &note) { m_note = note; }
    Origin origin() const { return m_origin; }
    void setOrigin(Origin origin) { m_origin = origin; }

    /** Whether both give the same measured values, whoever made them. */
    bool hasSamePixelSize(const ZtCalibration &other) const;
    /** As hasSamePixelSize(), but for what rounding in files makes of it: up to 0.1 % in each direction. */
    bool hasNearlySamePixelSize(const ZtCalibration &other) const;

    bool operator==(const ZtCalibration &other) const;
    bool operator!=(const ZtCalibration &other) const { return !(*this == other); }

private:
    double m_pixelSizeX = 0.0;
    double m_pixelSizeY = 0.0;
    QString m_name;
    QString m_objective;
    QDateTime m_date;
    QString m_author;
    QString m_note;
    Origin m_origin = Origin::Typed;
};
