// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/cameraimage/KvCameraImageNodeCfg.h"
#include "blocks/cameraimage/KvCameraOverlayHold.h"
#include "blocks/common/KvPictureWidget.h"

#include <QPixmap>
#include <QPointer>

class KvReportKernelData;

/**
 * Display widget of a block with the camera's picture, plain or with the measurements drawn on it.
 *
 * Shows the newest picture that the data adapter has, from the start: a report may be printed before another
 * frame arrives.
 */
class KvCameraImageWidget : public KvPictureWidget
{
    Q_OBJECT
public:
    /** \a cfg is not owned and outlives the widget. */
    KvCameraImageWidget(QWidget *parent, KvCameraImageNodeCfg *cfg);

    QString displayName() const override;
    QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) override;

public slots:
    void slotCameraImageChanged();
    void slotCameraImageWithDataChanged();
    void slotWidthChanged(int aWidth); ///< in percent
    void slotAlignmentChanged(const Qt::Alignment &aAlignment);
    void slotRotateAngleChanged(int aAngle);             ///< in degrees
    void slotRenderMeasurementsStateChanged(int aState); ///< a Qt::CheckState

protected:
    const KvPicturePlacement &placement() const override;
    QPixmap picture() const override { return m_picture; }

private:
    void connectSignals();
    /** Shows the adapter's picture of the kind that is wanted; keeps the old one while there is none. */
    void takePicture();
    void requestPicture();
    void applyOptions(const KvCameraImageNodeCfg::Options &options);

    KvCameraImageNodeCfg *m_cfg;
    QPointer<KvReportKernelData> m_kernelData;
    KvCameraOverlayHold m_overlayHold;
    QPixmap m_picture;
};
