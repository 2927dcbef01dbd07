// SPDX-License-Identifier: MIT
#include "KvDeskActionButton.h"

#include <QAction>
#include <QRegularExpression>

// Languages without letters of their own put the shortcut's behind the text: "(&O)".
QString KvDeskActionButton::plainText(QString text)
{
    static const QRegularExpression letterBehind(QStringLiteral("\\s?\\(&\\w\\)"));
    text.remove(letterBehind);
    text.remove(QLatin1Char('&'));
    if (text.endsWith(QLatin1String("...")))
        text.chop(3);
    return text;
}

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
    const QString text = plainText(m_action->text());
    setText(text);
    setAccessibleName(text);
    setEnabled(m_action->isEnabled() && m_obstacle.isEmpty());
    setToolTip(m_obstacle.isEmpty() ? m_action->toolTip()
                                    : m_action->toolTip() + QLatin1Char('\n') + m_obstacle);
}
