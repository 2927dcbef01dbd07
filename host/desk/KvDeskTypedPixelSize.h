// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskCalibrationWay.h"

class KvDeskNumberBox;
class QToolButton;

/** Calibrates by numbers that the user types: width and height of a pixel, which at first are linked. */
class KvDeskTypedPixelSize : public KvDeskCalibrationWay
{
    Q_OBJECT
public:
    explicit KvDeskTypedPixelSize(QWidget *parent = nullptr);

    ZtCalibration calibration() const override;
    QString fault() const override;
    /** Shows a pixel size; linked when it is that of square pixels. */
    void setPixelSize(const ZtCalibration &calibration);

    KvDeskNumberBox *xBox() const { return m_x; }
    KvDeskNumberBox *yBox() const { return m_y; }
    QToolButton *linkButton() const { return m_link; }

private slots:
    void slotXChanged();
    void slotYChanged();
    void slotLinkToggled(bool aLinked);

private:
    KvDeskNumberBox *createBox(const QString &name);
    void connectSignals();
    void followX();

    KvDeskNumberBox *m_x = nullptr;
    KvDeskNumberBox *m_y = nullptr;
    QToolButton *m_link = nullptr;
};
