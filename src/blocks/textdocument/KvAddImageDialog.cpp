// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvAddImageDialog.h"

#include "blocks/textdocument/KvEditorAddImageExtWidget.h"

#include <QGridLayout>

KvAddImageDialog::KvAddImageDialog(QWidget *parent)
    : QFileDialog(parent, tr("Choose image file"), QString(), tr("Image file(*.png *.jpg *.gif *.tif *.bmp)"))
    , m_extension(nullptr)
{
    // Only Qt's own dialog has a layout that takes more controls.
    setOption(QFileDialog::DontUseNativeDialog);
    setFileMode(QFileDialog::ExistingFile);
    m_extension = new KvEditorAddImageExtWidget(this);
    if (auto *grid = qobject_cast<QGridLayout *>(layout()))
        grid->addWidget(m_extension, grid->rowCount(), 0, 1, grid->columnCount());
}

QString KvAddImageDialog::selectedFile() const
{
    return selectedFiles().value(0);
}

int KvAddImageDialog::widthPercent() const
{
    return m_extension->widthPercent();
}

QString KvAddImageDialog::placement() const
{
    return m_extension->placement();
}
