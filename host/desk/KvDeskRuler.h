// SPDX-License-Identifier: MIT
#pragma once

#include <QVector>
#include <QWidget>

#include <optional>

class ZtUnit;

/** A ruler along an edge of the image: in pixels, or in a unit of length once the image is calibrated. */
class KvDeskRuler : public QWidget
{
    Q_OBJECT
public:
    struct Tick
    {
        double position; ///< in pixels of the ruler
        double value;    ///< in the ruler's unit
        bool isLabelled;
    };

    static constexpr int thickness = 24;

    explicit KvDeskRuler(Qt::Orientation orientation, QWidget *parent = nullptr);

    /**
     * \param origin    where the image begins, in pixels of the ruler
     * \param scale     pixels of the ruler per pixel of the image
     * \param pixelSize micrometres per pixel of the image; 0 for none
     * \param unit      of length, in which the ruler counts where there is a pixel size; not empty then
     */
    void setScale(double origin, double scale, double pixelSize, const ZtUnit &unit);
    /** How many micrometres the ruler shows at a scale and a pixel size as those of setScale(). */
    double extent(double scale, double pixelSize) const;
    /** The place of the pointer in pixels of the ruler, or none. */
    void setPointer(std::optional<double> position);

    QString unitText() const { return m_unitText; }

    /**
     * Marks at round numbers (1, 2 or 5 times a power of ten), the labelled ones far enough apart for their
     * texts.
     * \param origin       position of 0
     * \param pixelsPerUnit from value to position
     * \param length       of the ruler in pixels
     */
    static QVector<Tick> ticks(double origin, double pixelsPerUnit, double length);

    /**
     * Where the text of a label begins, from its mark in the direction of reading: behind the mark, or before
     * it where it would be cut off; nowhere when it has no room there either.
     * \param textWidth in pixels
     * \param room      from the mark to the end of the ruler in that direction
     * \param distance  of two labels
     */
    static std::optional<double> textStart(double textWidth, double room, double distance);

protected:
    void paintEvent(QPaintEvent *event) override;

private:
    double length() const;
    double labelDistance() const;
    void drawTick(QPainter *painter, const Tick &tick) const;
    void drawPointer(QPainter *painter) const;

    Qt::Orientation m_orientation;
    double m_origin = 0.0;
    double m_pixelsPerUnit = 1.0;
    QString m_unitText;
    std::optional<double> m_pointer;
};
