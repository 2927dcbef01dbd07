// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtExposureRange.h"

#include <QWidget>

class QDoubleSpinBox;
class QLabel;
class QSlider;

/** A slider and a field for the exposure time of a camera. The slider is logarithmic: cameras reach from
 * microseconds to seconds. */
class KvDeskExposureControl : public QWidget
{
    Q_OBJECT
public:
    explicit KvDeskExposureControl(QWidget *parent = nullptr);

    QSlider *slider() const { return m_slider; }
    QDoubleSpinBox *field() const { return m_field; }

    /** The field alone, which needs little space; what it is for says its tool tip. */
    void setCompact(bool isCompact);
    /** The times to choose from, and the one the camera has; emits nothing. */
    void setExposure(const ZtExposureRange &range, double milliseconds);

signals:
    void signalExposureChosen(double aMilliseconds); ///< the user wants another exposure

private slots:
    void slotSliderMoved(int aPosition);
    void slotFieldChanged(double aMilliseconds);

private:
    double exposureAt(int position) const;
    int positionOf(double milliseconds) const;
    double lowest() const;

    QLabel *m_label;
    QSlider *m_slider;
    QDoubleSpinBox *m_field;
    ZtExposureRange m_range;
};
