// SPDX-License-Identifier: MIT
#pragma once

#include "editor/KvTemplatesEditorWindow.h"

/** The editor of report templates, with all block types. Remembers its folders in the settings. */
class KvReportTemplatesEditor : public KvTemplatesEditorWindow
{
    Q_OBJECT
public:
    explicit KvReportTemplatesEditor(KvReportKernelData *kernelData, QWidget *parent = nullptr);

    /** The folder "Templates" beside the program unless another one was chosen. */
    QString templatesDirectory() const override;
    void setTemplatesDirectory(const QString &directory) override;
    /** The user's documents unless another folder was chosen. */
    QString printDirectory() const override;
    void setPrintDirectory(const QString &directory) override;
    QString templateFileSuffix() const override;
    QString templateFileFilter() const override;

protected:
    void changeEvent(QEvent *event) override;
};
