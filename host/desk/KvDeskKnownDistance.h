// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskCalibrationWay.h"
#include "KvDeskObjectId.h"

class KvDeskCalibrator;
class KvDeskNumberBox;
class QComboBox;
class QLabel;
class QPushButton;
class ZtKernelObjectData;

/**
 * Calibrates by a line that was drawn over a distance of known length.
 *
 * The line keeps being the reference until another one is used, also when it is moved meanwhile. One line
 * cannot tell both directions apart: the pixels keep the shape that they have.
 */
class KvDeskKnownDistance : public KvDeskCalibrationWay
{
    Q_OBJECT
public:
    /** \a calibrator has to outlive this. */
    explicit KvDeskKnownDistance(KvDeskCalibrator *calibrator, QWidget *parent = nullptr);

    ZtCalibration calibration() const override;
    QString fault() const override;
    void refresh() override;

    KvDeskObjectId reference() const { return m_reference; }
    QPushButton *useButton() const { return m_use; }
    KvDeskNumberBox *lengthBox() const { return m_length; }
    QComboBox *unitBox() const { return m_unit; }
    QString referenceText() const;

public slots:
    /** Takes the selected line as the reference. */
    void slotUseSelected();

private slots:
    void slotUpdate();
    void slotSelectionChanged();
    void slotObjectChanged(int aType, int aId, const ZtKernelObjectData *aObject);
    void slotObjectRemoved(int aType, int aId);

private:
    void createFields();
    void connectSignals();
    bool canUseSelected() const;
    double pixelSize() const;

    KvDeskCalibrator *m_calibrator;
    KvDeskObjectId m_reference;
    QLabel *m_text = nullptr;
    QPushButton *m_use = nullptr;
    KvDeskNumberBox *m_length = nullptr;
    QComboBox *m_unit = nullptr;
};
