// SPDX-License-Identifier: MIT
#pragma once

#include <QWidget>

#include <memory>

namespace Ui {
class KvEditorAddImageExtWidgetUi;
}

/** What the picture dialog asks beside the file: the picture's width and its place in the text. */
class KvEditorAddImageExtWidget : public QWidget
{
    Q_OBJECT
public:
    explicit KvEditorAddImageExtWidget(QWidget *parent = nullptr);
    ~KvEditorAddImageExtWidget() override;

    /** Width in percent of the text's width, 1 to 100. */
    int widthPercent() const;
    /** The chosen place as the style attribute of an image element. */
    QString placement() const;

private:
    std::unique_ptr<Ui::KvEditorAddImageExtWidgetUi> m_ui;
};
