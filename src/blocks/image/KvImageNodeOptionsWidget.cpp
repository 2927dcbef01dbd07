// SPDX-License-Identifier: MIT
#include "blocks/image/KvImageNodeOptionsWidget.h"

#include "blocks/image/KvImageFile.h"
#include "blocks/image/KvImageNodeCfg.h"
#include "kernel/ZtAppSettings.h"

#include <QFileDialog>
#include <QFileInfo>
#include <QPointer>
#include <QPushButton>

namespace {
const char kDirectoryKey[] = "ImageNodeDirectoryPath";
}

KvImageNodeOptionsWidget::KvImageNodeOptionsWidget(const KvImageNodeCfg *cfg, QWidget *parent,
                                                   bool withPlacement)
    : KvPictureOptionsWidget(tr("Image view"), parent)
{
    setObjectName(QStringLiteral("KvImageNodeOptionsWidget"));
    addPictureRows(withPlacement);
    addBrowseButton();
    setFromConfig(cfg);
}

void KvImageNodeOptionsWidget::addBrowseButton()
{
    auto *button = new QPushButton(tr("Browse"), this);
    button->setObjectName(QStringLiteral("accentButton"));
    button->setToolTip(tr("Choose an image file"));
    addRow(button);
    connect(button, SIGNAL(clicked(bool)), this, SLOT(slotOnBrowseButtonClicked()));
}

void KvImageNodeOptionsWidget::setFromConfig(const KvBaseEditorNodeCfg *cfg)
{
    if (const auto *imageCfg = qobject_cast<const KvImageNodeCfg *>(cfg))
        showPlacement(imageCfg->placement());
}

void KvImageNodeOptionsWidget::slotAngleIndexChanged()
{
    emit signalRotateAngleChanged(chosenAngle());
}

void KvImageNodeOptionsWidget::selectAlignment(Qt::Alignment alignment)
{
    showAlignment(alignment);
    emit signalAlignmentChanged(alignment);
}

void KvImageNodeOptionsWidget::slotAlignLeftClicked()
{
    selectAlignment(Qt::AlignLeft);
}

void KvImageNodeOptionsWidget::slotAlignCenterClicked()
{
    // Only the centre value carries the vertical flag: part of the stored format.
    selectAlignment(Qt::AlignHCenter | Qt::AlignVCenter);
}

void KvImageNodeOptionsWidget::slotAlignRightClicked()
{
    selectAlignment(Qt::AlignRight);
}

QString KvImageNodeOptionsWidget::askForImagePath()
{
    const QString directory = ZtAppSettings::value(QLatin1String(kDirectoryKey)).toString();
    // On the heap and watched: while the dialog is open the block may go, and its panel with it.
    const QPointer<QFileDialog> dialog = new QFileDialog(this, tr("Choose image file"), directory,
                                                         tr("Image file(*.png *.jpg *.gif *.tif *.bmp)"));
    dialog->setAcceptMode(QFileDialog::AcceptOpen);
    dialog->setFileMode(QFileDialog::ExistingFile);
    dialog->setOption(QFileDialog::DontUseNativeDialog);
    const bool isAccepted = dialog->exec() == QDialog::Accepted;
    const QString path = isAccepted && dialog ? dialog->selectedFiles().value(0) : QString();
    delete dialog;
    return path;
}

void KvImageNodeOptionsWidget::slotOnBrowseButtonClicked()
{
    const QPointer<KvImageNodeOptionsWidget> self(this);
    const QString path = askForImagePath();
    if (!self || path.isEmpty())
        return;
    ZtAppSettings::setValue(QLatin1String(kDirectoryKey), QFileInfo(path).absolutePath());
    emit signalImagePathChanged(path, KvImageFile::load(path));
}
