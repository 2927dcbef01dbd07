// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/common/KvPictureOptionsWidget.h"

#include <QPixmap>

class KvImageNodeCfg;

/** Options panel of a block with a picture from a file. Announces what the user chooses and writes nothing.
 */
class KvImageNodeOptionsWidget : public KvPictureOptionsWidget
{
    Q_OBJECT
public:
    /** Without \a withPlacement the rows for width and alignment are left out. */
    KvImageNodeOptionsWidget(const KvImageNodeCfg *cfg, QWidget *parent, bool withPlacement);

    void setFromConfig(const KvBaseEditorNodeCfg *cfg) override;

signals:
    void signalWidthChanged(int aWidth);
    void signalAlignmentChanged(const Qt::Alignment &aAlignment);
    void signalImagePathChanged(const QString &aPath, const QPixmap &aPixmap); ///< null if not readable
    void signalRotateAngleChanged(int aAngle);

public slots:
    void slotAngleIndexChanged();
    void slotAlignLeftClicked();
    void slotAlignCenterClicked();
    void slotAlignRightClicked();
    void slotOnBrowseButtonClicked();

private:
    void addBrowseButton();
    void selectAlignment(Qt::Alignment alignment);
    QString askForImagePath();
};
