// SPDX-License-Identifier: MIT
#pragma once

#include <QMenu>

class KvDeskActions;
class KvDeskImageView;

/** What can be done with the selected objects and the image; comes where the view asks for it. */
class KvDeskImageMenu : public QMenu
{
    Q_OBJECT
public:
    /** Belongs to \a view. */
    KvDeskImageMenu(KvDeskActions *actions, KvDeskImageView *view);

private:
    void addWithoutLetter(QAction *action);

private slots:
    void slotShow(const QPoint &aPosition);
};
