// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvAddLinkDialog.h"

#include "gui/QtAdvancedStylesheet.h"
#include "ui_KvAddLinkDialogUi.h"

KvAddLinkDialog::KvAddLinkDialog(qreal fontSize, QWidget *parent)
    : QDialog(parent)
    , m_ui(std::make_unique<Ui::KvAddLinkDialogUi>())
    , m_fontSize(fontSize)
{
    m_ui->setupUi(this);
    setWindowFlag(Qt::WindowContextHelpButtonHint, false);
    QPalette linePalette = palette();
    linePalette.setColor(QPalette::WindowText,
                         acss::QtAdvancedStylesheet::getInstance()->color(QStringLiteral("line")));
    m_ui->line->setPalette(linePalette);
}

KvAddLinkDialog::~KvAddLinkDialog() = default;

void KvAddLinkDialog::setTitle(const QString &title)
{
    m_ui->titleInput->setText(title);
    // What is left to enter.
    if (!title.isEmpty())
        m_ui->urlInput->setFocus();
}

void KvAddLinkDialog::accept()
{
    m_html = m_ui->titleInput->text().isEmpty() ? QString() : linkHtml();
    m_ui->titleInput->clear();
    m_ui->urlInput->clear();
    QDialog::accept();
}

QString KvAddLinkDialog::linkHtml() const
{
    // Title and URL go in as they are, so that a title may hold markup. The blank after the link keeps the
    // text that is typed behind it out of the link's format.
    return QStringLiteral("<a href=\"%1\" style=\"font-size:%2pt;\" >%3</a>"
                          "<span style=\"font-size:%2pt;\"> </span>")
        .arg(m_ui->urlInput->text(), QString::number(m_fontSize), m_ui->titleInput->text());
}
