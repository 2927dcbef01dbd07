// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/iZTObjectPainter.h"
#include "measuring/ZtMeasuringGlobal.h"

#include <QPair>
#include <QRectF>
#include <QString>
#include <QVector>

#include <memory>

class QTransform;
class ZtCalibration;

/** The label of an object and its box on the device. */
struct ZtDrawnLabel
{
    QRectF box;
    QString text;
};

/** Draws objects on the image and then, where they find room, their labels: the same on the screen and on
 * pictures of reports. */
class ZT_MEASURING_EXPORT ZtObjectsPainter : public iZTObjectPainter
{
public:
    /** Type and id. */
    using Object = QPair<int, int>;

    /** Nobody reads more labels; where more objects are seen, only texts and scale bars keep theirs. */
    static constexpr int maximumLabels = 500;

    /** Without a calibration there is no scale bar. It is shared with whoever changes it. */
    explicit ZtObjectsPainter(std::shared_ptr<const ZtCalibration> calibration = nullptr)
        : m_calibration(std::move(calibration))
    {}

    void drawObjects(QPainter *painter, const QList<int> &types) const override;

    /** Labels of texts and scale bars, which are nothing without them, are always drawn. */
    bool areLabelsShown() const { return m_areLabelsShown; }
    void setLabelsShown(bool shown) { m_areLabelsShown = shown; }

    /** A bar at the lower right that shows the scale; at first there is none. It is drawn where all types of
     * objects are. */
    bool isScaleBarShown() const { return m_isScaleBarShown; }
    void setScaleBarShown(bool shown) { m_isScaleBarShown = shown; }
    /** Draws the scale bar, if it is shown. \a page is what is seen of the image on the device. */
    void drawScaleBar(QPainter *painter, const QTransform &toDevice, const QRectF &page) const;

    /** Draws objects without their labels. */
    static void drawShape(QPainter *painter, const Object &object);

    /**
     * Places for the labels of objects.
     * \param objects the most important first
     * \param page    the part of the device that is seen
     */
    QVector<ZtDrawnLabel> labels(const QVector<Object> &objects, const QTransform &toDevice,
                                 const QRectF &page) const;
    static void drawLabels(QPainter *painter, const QVector<ZtDrawnLabel> &labels);

private:
    std::shared_ptr<const ZtCalibration> m_calibration;
    bool m_areLabelsShown = true;
    bool m_isScaleBarShown = false;
};
