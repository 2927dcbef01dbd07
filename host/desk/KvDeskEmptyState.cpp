// SPDX-License-Identifier: MIT
#include "KvDeskEmptyState.h"

#include <QAction>
#include <QEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace {

constexpr int groupSpacing = 16;
constexpr int pageMargin = 24;

} // namespace

KvDeskEmptyState::KvDeskEmptyState(const QString &text, QWidget *parent)
    : QWidget(parent)
    , m_label(new QLabel(text, this))
{
    m_label->setProperty("emptyState", true);
    m_label->setAlignment(Qt::AlignCenter);
    m_label->setWordWrap(true);

    m_buttons = new QHBoxLayout;
    m_buttons->setSpacing(8);
    m_buttons->addStretch();
    m_buttons->addStretch();

    auto *const layout = new QVBoxLayout(this);
    layout->setContentsMargins(pageMargin, pageMargin, pageMargin, pageMargin);
    layout->setSpacing(groupSpacing);
    layout->addStretch();
    layout->addWidget(m_label);
    layout->addLayout(m_buttons);
    layout->addStretch();

    setGeometry(parent->rect());
    parent->installEventFilter(this);
}

void KvDeskEmptyState::setText(const QString &text)
{
    m_label->setText(text);
}

QString KvDeskEmptyState::text() const
{
    return m_label->text();
}

void KvDeskEmptyState::addAction(QAction *action, bool isPrimary)
{
    auto *const button = new QPushButton(action->iconText(), this);
    button->setToolTip(action->toolTip());
    button->setAccessibleName(button->text());
    button->setDefault(isPrimary);
    connect(button, SIGNAL(clicked()), action, SLOT(trigger()));
    m_buttons->insertWidget(m_buttons->count() - 1, button);
}

bool KvDeskEmptyState::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == parent() && event->type() == QEvent::Resize)
        setGeometry(parentWidget()->rect());
    return QWidget::eventFilter(watched, event);
}
