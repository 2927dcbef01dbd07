// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>

class QAction;
class QBoxLayout;
class QHBoxLayout;
class QMenu;

/**
 * One of several steps to follow: its number, what it is about, and buttons that do it. The buttons stand
 * beside the text, and below it where the row is narrow.
 */
class KvDeskStepRow : public QFrame
{
    Q_OBJECT
public:
    KvDeskStepRow(int number, const QString &title, const QString &text, QWidget *parent = nullptr);

    /** Adds a button for an action, which has to live on; \a isPrimary draws it in the accent colour. */
    void addAction(QAction *action, bool isPrimary);
    /** Adds a button that opens a menu, which has to live on. */
    void addMenu(QMenu *menu, const QString &toolTip);
    /** The reason why the step cannot be taken now; empty when it can. Concerns actions only. */
    void setObstacle(const QString &reason);
    /** Puts the buttons below the text, or beside it. */
    void setNarrow(bool isNarrow);

    QSize minimumSizeHint() const override; ///< of a narrow row

private:
    QBoxLayout *m_layout;
    QHBoxLayout *m_head;
    QHBoxLayout *m_buttons;
};
