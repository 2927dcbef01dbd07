// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtCalibration.h"

#include <QWidget>

class KvDeskNumberBox;
class QLayout;

/** One way to find out how large a pixel is, with the fields that it needs. */
class KvDeskCalibrationWay : public QWidget
{
    Q_OBJECT
public:
    using QWidget::QWidget;

    /** Pixel size and origin by what the fields hold now; uncalibrated as long as anything is missing. */
    virtual ZtCalibration calibration() const = 0;
    /** Why what the fields hold cannot be used; empty otherwise, and as long as anything is missing. */
    virtual QString fault() const { return QString(); }
    /** Takes in what may have changed outside: image, calibration, objects. */
    virtual void refresh() {}

signals:
    void signalChanged(); ///< calibration()

protected:
    /** Puts a hint above a row of fields, which it takes over; called once. */
    void setContent(const QString &hint, QLayout *row);
    /** Why what is typed in a field cannot be used, which makes pixels of this size in micrometres; empty
     * when it can, or when nothing is typed. */
    static QString faultOf(const KvDeskNumberBox &box, double pixelSize);
};
