// SPDX-License-Identifier: MIT
#include "blocks/cameraimage/KvCameraImageNodeOptionsWidget.h"

#include "blocks/cameraimage/KvCameraImageNodeCfg.h"

#include <QCheckBox>
#include <QSignalBlocker>

KvCameraImageNodeOptionsWidget::KvCameraImageNodeOptionsWidget(const KvCameraImageNodeCfg *cfg,
                                                               QWidget *parent, bool withPlacement)
    : KvPictureOptionsWidget(tr("Camera image view"), parent)
{
    addPictureRows(withPlacement);
    m_renderMeasurements = new QCheckBox(tr("Render measurements"), this);
    m_renderMeasurements->setToolTip(tr("Draw the measurement objects on the picture"));
    addRow(m_renderMeasurements);
    connect(m_renderMeasurements, SIGNAL(stateChanged(int)), this,
                                         SIGNAL(signalRenderMeasurementsStateChanged(int)));
    setFromConfig(cfg);
}

void KvCameraImageNodeOptionsWidget::setFromConfig(const KvBaseEditorNodeCfg *cfg)
{
    const auto *cameraCfg = qobject_cast<const KvCameraImageNodeCfg *>(cfg);
    if (!cameraCfg)
        return;
    showPlacement(cameraCfg->options().placement);
    const QSignalBlocker blocker(m_renderMeasurements);
    m_renderMeasurements->setChecked(cameraCfg->options().renderMeasurements);
}

void KvCameraImageNodeOptionsWidget::slotAngleIndexChanged()
{
    emit signalRotateAngleChanged(chosenAngle());
}

void KvCameraImageNodeOptionsWidget::selectAlignment(Qt::Alignment alignment)
{
    showAlignment(alignment);
    emit signalAlignmentChanged(alignment);
}

void KvCameraImageNodeOptionsWidget::slotAlignLeftClicked()
{
    selectAlignment(Qt::AlignLeft);
}

void KvCameraImageNodeOptionsWidget::slotAlignCenterClicked()
{
    // Only the centre value carries the vertical flag: part of the stored format.
    selectAlignment(Qt::AlignHCenter | Qt::AlignVCenter);
}

void KvCameraImageNodeOptionsWidget::slotAlignRightClicked()
{
    selectAlignment(Qt::AlignRight);
}
