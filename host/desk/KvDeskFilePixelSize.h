// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskCalibrationWay.h"

class KvDeskCalibrator;
class QLabel;

/** Calibrates by what the image's file states. */
class KvDeskFilePixelSize : public KvDeskCalibrationWay
{
    Q_OBJECT
public:
    /** \a calibrator has to outlive this. */
    explicit KvDeskFilePixelSize(KvDeskCalibrator *calibrator, QWidget *parent = nullptr);

    ZtCalibration calibration() const override;
    void refresh() override;
    QString text() const;

private:
    KvDeskCalibrator *m_calibrator;
    QLabel *m_text;
};
