// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>

class QHBoxLayout;
class QLabel;
class QToolButton;

/** Top row of a panel: title, a muted note, room for buttons, and a button that closes the panel. */
class KvDeskPanelHeader : public QFrame
{
    Q_OBJECT
public:
    /** \a closeTip is the tool tip of the closing button. */
    KvDeskPanelHeader(const QString &title, const QString &closeTip, QWidget *parent);

    void setNote(const QString &note);
    QString note() const;
    /** Adds something before the closing button. */
    void addWidget(QWidget *widget);
    /** The same for a button. */
    QToolButton *addButton(const QString &iconPath, const QString &toolTip);
    QToolButton *closeButton() const { return m_closeButton; }

signals:
    void signalCloseClicked();

private:
    QHBoxLayout *m_layout = nullptr;
    QLabel *m_note = nullptr;
    QToolButton *m_closeButton = nullptr;
};
