// SPDX-License-Identifier: MIT
#pragma once

#include <QDialog>

#include <memory>

namespace Ui {
class KvAddLinkDialogUi;
}

/** Asks for the title and the URL of a link and makes the HTML that inserts it into a text. */
class KvAddLinkDialog : public QDialog
{
    Q_OBJECT
public:
    /** \param fontSize size of the link's text in points */
    explicit KvAddLinkDialog(qreal fontSize, QWidget *parent = nullptr);
    ~KvAddLinkDialog() override;

    /** Suggests a title. */
    void setTitle(const QString &title);

    /** What the user accepted last; empty where the title was. */
    QString html() const { return m_html; }

public slots:
    void accept() override;

private:
    QString linkHtml() const;

    std::unique_ptr<Ui::KvAddLinkDialogUi> m_ui;
    qreal m_fontSize;
    QString m_html;
};
