// SPDX-License-Identifier: MIT
#include "KvDeskActionButton.h"

#include <QAction>

KvDeskActionButton::KvDeskActionButton(QAction *action, QWidget *parent)
    : QPushButton(parent)
    , m_action(action)
{
    slotActionChanged();
    connect(action, SIGNAL(changed()), this, SLOT(slotActionChanged()));
    connect(this, SIGNAL(clicked()), action, SLOT(trigger()));
}

void KvDeskActionButton::setObstacle(const QString &reason)
{
    m_obstacle = reason;
    slotActionChanged();
}

void KvDeskActionButton::slotActionChanged()
{
    setText(m_action->iconText());
    setAccessibleName(m_action->iconText());
    setEnabled(m_action->isEnabled() && m_obstacle.isEmpty());
    setToolTip(m_obstacle.isEmpty() ? m_action->toolTip()
                                    : m_action->toolTip() + QLatin1Char('\n') + m_obstacle);
}
