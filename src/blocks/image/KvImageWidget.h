// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvPictureWidget.h"

class KvImageNodeCfg;

/** Display widget of a block with a picture from a file. Every call of its slots counts as an edit. */
class KvImageWidget : public KvPictureWidget
{
    Q_OBJECT
public:
    /** \a cfg is not owned and outlives the widget. */
    KvImageWidget(QWidget *parent, KvImageNodeCfg *cfg);

    QString displayName() const override;
    QWidget *createOptionsWidget(QWidget *parent, bool withPlacement) override;

public slots:
    void slotWidthChanged(int aWidth); ///< in percent
    void slotAlignmentChanged(const Qt::Alignment &aAlignment);
    void slotImagePathChanged(const QString &aPath, const QPixmap &aPixmap);
    void slotRotateAngleChanged(int aAngle); ///< in degrees

protected:
    const KvPicturePlacement &placement() const override;
    QPixmap picture() const override;

private:
    void applyPlacement(const KvPicturePlacement &placement);

    KvImageNodeCfg *m_cfg;
};
