// SPDX-License-Identifier: MIT
#pragma once

#include <QPushButton>

class QAction;

/** A push button for an action: shows its text without dots and underlines, its tool tip and whether it is
 * possible. */
class KvDeskActionButton : public QPushButton
{
    Q_OBJECT
public:
    /** \a action has to outlive the button, or end with it. */
    explicit KvDeskActionButton(QAction *action, QWidget *parent = nullptr);

    /** The text of an action without dots and without the letter that is underlined in menus. */
    static QString plainText(QString text);

    /** Holds the button back for a reason of its own, which its tool tip adds; none with an empty one. */
    void setObstacle(const QString &reason);

private slots:
    void slotActionChanged();

private:
    QAction *m_action;
    QString m_obstacle;
};
