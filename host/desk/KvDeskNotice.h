// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>

class KvDeskElidedLabel;
class QAction;
class QLabel;
class QPushButton;
class QToolButton;

/** A message line over the upper edge of a widget, with one thing that can be done about it. It covers
 * nothing else and moves nothing, and stays until it is answered or closed. */
class KvDeskNotice : public QFrame
{
    Q_OBJECT
public:
    /** \a action is what the button of the notice does; it has to outlive this. */
    KvDeskNotice(QAction *action, QWidget *parent);

    QString text() const;
    QPushButton *actionButton() const { return m_button; }
    QToolButton *closeButton() const { return m_close; }

public slots:
    void slotShow(const QString &aText);
    void slotHide();

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void place();

    QLabel *m_icon;
    KvDeskElidedLabel *m_text;
    QPushButton *m_button;
    QToolButton *m_close;
};
