// SPDX-License-Identifier: MIT
#include "blocks/cameraimage/KvCameraImageWidget.h"

#include "blocks/cameraimage/KvCameraImageNodeOptionsWidget.h"
#include "data/KvReportKernelData.h"
#include "templates/KvTemplateContext.h"

namespace {

KvReportKernelData *kernelDataOf(const KvBaseEditorNodeCfg &cfg)
{
    const KvTemplateContext *context = cfg.context();
    return context ? context->kernelData() : nullptr;
}

} // namespace

KvCameraImageWidget::KvCameraImageWidget(QWidget *parent, KvCameraImageNodeCfg *cfg)
    : KvPictureWidget(parent, cfg)
    , m_cfg(cfg)
    , m_kernelData(kernelDataOf(*cfg))
    , m_overlayHold(m_kernelData)
{
    if (!m_kernelData)
        return;
    m_overlayHold.setHeld(cfg->options().renderMeasurements);
    connectSignals();
    takePicture();
    requestPicture();
}

void KvCameraImageWidget::connectSignals()
{
    connect(m_kernelData, SIGNAL(signalCameraImageChanged()), this, SLOT(slotCameraImageChanged()));
    connect(m_kernelData, SIGNAL(signalCameraImageWithDataChanged()), this,
                                 SLOT(slotCameraImageWithDataChanged()));
}

QString KvCameraImageWidget::displayName() const
{
    return tr("Camera Image View");
}

QWidget *KvCameraImageWidget::createOptionsWidget(QWidget *parent, bool withPlacement)
{
    auto *options = new KvCameraImageNodeOptionsWidget(m_cfg, parent, withPlacement);
    connect(options, SIGNAL(signalWidthChanged(int)), this, SLOT(slotWidthChanged(int)));
    connect(options, SIGNAL(signalAlignmentChanged(Qt::Alignment)), this,
                            SLOT(slotAlignmentChanged(Qt::Alignment)));
    connect(options, SIGNAL(signalRotateAngleChanged(int)), this, SLOT(slotRotateAngleChanged(int)));
    connect(options, SIGNAL(signalRenderMeasurementsStateChanged(int)), this,
                            SLOT(slotRenderMeasurementsStateChanged(int)));
    return options;
}

const KvPicturePlacement &KvCameraImageWidget::placement() const
{
    return m_cfg->options().placement;
}

void KvCameraImageWidget::takePicture()
{
    if (!m_kernelData)
        return;
    const QPixmap newest = m_cfg->options().renderMeasurements ? m_kernelData->cameraImageWithData()
                                                               : m_kernelData->cameraImage();
    if (!newest.isNull())
        m_picture = newest;
}

void KvCameraImageWidget::requestPicture()
{
    if (m_kernelData)
        m_kernelData->slotDelayedPrepareCameraImage();
}

void KvCameraImageWidget::slotCameraImageChanged()
{
    if (m_cfg->options().renderMeasurements)
        return;
    takePicture();
    announceChanged();
}

void KvCameraImageWidget::slotCameraImageWithDataChanged()
{
    if (!m_cfg->options().renderMeasurements)
        return;
    takePicture();
    announceChanged();
}

void KvCameraImageWidget::slotWidthChanged(int aWidth)
{
    KvCameraImageNodeCfg::Options options = m_cfg->options();
    options.placement.widthPercent = aWidth;
    applyOptions(options);
}

void KvCameraImageWidget::slotAlignmentChanged(const Qt::Alignment &aAlignment)
{
    KvCameraImageNodeCfg::Options options = m_cfg->options();
    options.placement.alignment = aAlignment;
    applyOptions(options);
}

void KvCameraImageWidget::slotRotateAngleChanged(int aAngle)
{
    KvCameraImageNodeCfg::Options options = m_cfg->options();
    options.placement.rotation = aAngle;
    applyOptions(options);
}

void KvCameraImageWidget::slotRenderMeasurementsStateChanged(int aState)
{
    KvCameraImageNodeCfg::Options options = m_cfg->options();
    const bool isOn = aState != Qt::Unchecked;
    const bool isOther = isOn != options.renderMeasurements;
    options.renderMeasurements = isOn;
    m_overlayHold.setHeld(isOn);
    applyOptions(options);
    // The picture at hand may be as old as the last block that wanted it.
    if (isOther)
        requestPicture();
}

void KvCameraImageWidget::applyOptions(const KvCameraImageNodeCfg::Options &options)
{
    if (!(options == m_cfg->options())) {
        m_cfg->setOptions(options);
        announceConfigChanged();
    }
    takePicture();
    announceChanged();
}
