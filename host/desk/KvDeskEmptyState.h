// SPDX-License-Identifier: MIT
#pragma once

#include <QWidget>

class QAction;
class QHBoxLayout;
class QLabel;
class QScrollArea;

/** What a view shows while it has nothing to show: what to do next, and buttons that do it. Covers its
 * parent. */
class KvDeskEmptyState : public QWidget
{
    Q_OBJECT
public:
    KvDeskEmptyState(const QString &text, QWidget *parent);

    void setText(const QString &text);
    QString text() const;
    /** Adds a button for an action, which has to live on; \a isPrimary draws it in the accent colour. */
    void addAction(QAction *action, bool isPrimary);
    /** Shows a whole page in place of text and buttons, and scrolls it where there is too little room. */
    void setContent(QWidget *content);
    bool hasContent() const { return m_scrollArea != nullptr; }

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;
    void paintEvent(QPaintEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;

private:
    QLabel *m_label;
    QHBoxLayout *m_buttons = nullptr;
    QScrollArea *m_scrollArea = nullptr;
};
