// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvPictureOptionsWidget.h"

class KvCameraImageNodeCfg;
class QCheckBox;

/** Options panel of a block with the camera's picture. Announces what the user chooses and writes nothing. */
class KvCameraImageNodeOptionsWidget : public KvPictureOptionsWidget
{
    Q_OBJECT
public:
    /** Without \a withPlacement the rows for width and alignment are left out. */
    KvCameraImageNodeOptionsWidget(const KvCameraImageNodeCfg *cfg, QWidget *parent, bool withPlacement);

    void setFromConfig(const KvBaseEditorNodeCfg *cfg) override;

signals:
    void signalWidthChanged(int aWidth);
    void signalAlignmentChanged(const Qt::Alignment &aAlignment);
    void signalRotateAngleChanged(int aAngle);
    void signalRenderMeasurementsStateChanged(int aState); ///< a Qt::CheckState

public slots:
    void slotAngleIndexChanged();
    void slotAlignLeftClicked();
    void slotAlignCenterClicked();
    void slotAlignRightClicked();

private:
    void selectAlignment(Qt::Alignment alignment);

    QCheckBox *m_renderMeasurements = nullptr;
};
