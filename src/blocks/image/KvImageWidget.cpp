// SPDX-License-Identifier: MIT
#include "blocks/image/KvImageWidget.h"

#include "blocks/image/KvImageNodeCfg.h"
#include "blocks/image/KvImageNodeOptionsWidget.h"

KvImageWidget::KvImageWidget(QWidget *parent, KvImageNodeCfg *cfg)
    : KvPictureWidget(parent, cfg)
    , m_cfg(cfg)
{}

QString KvImageWidget::displayName() const
{
    return tr("Image View");
}

QWidget *KvImageWidget::createOptionsWidget(QWidget *parent, bool withPlacement)
{
    auto *options = new KvImageNodeOptionsWidget(m_cfg, parent, withPlacement);
    connect(options, SIGNAL(signalWidthChanged(int)), this, SLOT(slotWidthChanged(int)));
    connect(options, SIGNAL(signalAlignmentChanged(Qt::Alignment)), this,
                            SLOT(slotAlignmentChanged(Qt::Alignment)));
    connect(options, SIGNAL(signalImagePathChanged(QString,QPixmap)), this,
                            SLOT(slotImagePathChanged(QString,QPixmap)));
    connect(options, SIGNAL(signalRotateAngleChanged(int)), this, SLOT(slotRotateAngleChanged(int)));
    return options;
}

const KvPicturePlacement &KvImageWidget::placement() const
{
    return m_cfg->placement();
}

QPixmap KvImageWidget::picture() const
{
    return m_cfg->image();
}

void KvImageWidget::slotWidthChanged(int aWidth)
{
    KvPicturePlacement changed = placement();
    changed.widthPercent = aWidth;
    applyPlacement(changed);
}

void KvImageWidget::slotAlignmentChanged(const Qt::Alignment &aAlignment)
{
    KvPicturePlacement changed = placement();
    changed.alignment = aAlignment;
    applyPlacement(changed);
}

void KvImageWidget::slotImagePathChanged(const QString &aPath, const QPixmap &aPixmap)
{
    m_cfg->setImage(aPath, aPixmap);
    announceConfigChanged();
    announceChanged();
}

void KvImageWidget::slotRotateAngleChanged(int aAngle)
{
    KvPicturePlacement changed = placement();
    changed.rotation = aAngle;
    applyPlacement(changed);
}

void KvImageWidget::applyPlacement(const KvPicturePlacement &placement)
{
    m_cfg->setPlacement(placement);
    announceConfigChanged();
    announceChanged();
}
