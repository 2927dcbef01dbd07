// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvEditorAddImageExtWidget.h"

#include "blocks/textdocument/KvTextDocumentPicture.h"
#include "ui_KvEditorAddImageExtWidgetUi.h"

namespace {
constexpr int kSpacing = 8;
constexpr int kGroupSpacing = 16;
} // namespace

KvEditorAddImageExtWidget::KvEditorAddImageExtWidget(QWidget *parent)
    : QWidget(parent)
    , m_ui(std::make_unique<Ui::KvEditorAddImageExtWidgetUi>())
{
    m_ui->setupUi(this);
    // As all numbers of reports, whatever the language.
    m_ui->widthSpinBox->setLocale(QLocale::c());
    // The row itself has no spacing.
    m_ui->label->setContentsMargins(0, 0, kSpacing, 0);
    m_ui->label_2->setContentsMargins(kGroupSpacing, 0, kSpacing, 0);
}

KvEditorAddImageExtWidget::~KvEditorAddImageExtWidget() = default;

int KvEditorAddImageExtWidget::widthPercent() const
{
    return m_ui->widthSpinBox->value();
}

QString KvEditorAddImageExtWidget::placement() const
{
    switch (m_ui->floatComboBox->currentIndex()) {
    case 1:
        return QStringLiteral("style=\"float:left;\"");
    case 2:
        return QStringLiteral("style=\"float:right;\"");
    default:
        return QLatin1String(KvTextDocumentPicture::NotFloating);
    }
}
