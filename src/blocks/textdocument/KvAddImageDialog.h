// SPDX-License-Identifier: MIT
#pragma once

#include <QFileDialog>

class KvEditorAddImageExtWidget;

/** Asks for an image file, and for the width and place that the picture gets in a text. */
class KvAddImageDialog : public QFileDialog
{
    Q_OBJECT
public:
    explicit KvAddImageDialog(QWidget *parent = nullptr);

    /** The chosen file, or an empty text. */
    QString selectedFile() const;
    /** Width in percent of the text's width, 1 to 100. */
    int widthPercent() const;
    /** The chosen place as the style attribute of an image element. */
    QString placement() const;

private:
    KvEditorAddImageExtWidget *m_extension;
};
