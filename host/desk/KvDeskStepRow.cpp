// SPDX-License-Identifier: MIT
#include "KvDeskStepRow.h"

#include "KvDeskActionButton.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QMenu>
#include <QToolButton>
#include <QVBoxLayout>

namespace {

constexpr int controlSpacing = 8;
constexpr int groupSpacing = 16;
constexpr QSize buttonSize(32, 32);

QLabel *label(const QString &text, const char *look, QWidget *parent)
{
    auto *const label = new QLabel(text, parent);
    label->setProperty(look, true);
    label->setWordWrap(true);
    return label;
}

} // namespace

KvDeskStepRow::KvDeskStepRow(int number, const QString &title, const QString &text, QWidget *parent)
    : QFrame(parent)
    , m_layout(new QBoxLayout(QBoxLayout::LeftToRight, this))
    , m_head(new QHBoxLayout)
    , m_buttons(new QHBoxLayout)
{
    setProperty("card", true);
    auto *const badge = new QLabel(QString::number(number), this);
    badge->setProperty("stepNumber", true);
    badge->setAlignment(Qt::AlignCenter);
    auto *const texts = new QVBoxLayout;
    texts->setSpacing(4);
    texts->addWidget(label(title, "groupTitle", this));
    texts->addWidget(label(text, "caption", this));
    m_head->setSpacing(groupSpacing);
    m_head->addWidget(badge);
    m_head->addLayout(texts, 1);
    m_buttons->setSpacing(controlSpacing);
    // The buttons stand at the end of their line.
    m_buttons->addStretch();
    m_layout->addLayout(m_head, 1);
    m_layout->addLayout(m_buttons);
    setNarrow(false);
}

void KvDeskStepRow::addAction(QAction *action, bool isPrimary)
{
    auto *const button = new KvDeskActionButton(action, this);
    button->setDefault(isPrimary);
    m_buttons->addWidget(button);
}

void KvDeskStepRow::addMenu(QMenu *menu, const QString &toolTip)
{
    auto *const button = new QToolButton(this);
    button->setMenu(menu);
    button->setPopupMode(QToolButton::InstantPopup);
    button->setIcon(menu->icon());
    button->setIconSize(QSize(24, 24));
    button->setFixedSize(buttonSize);
    button->setFocusPolicy(Qt::StrongFocus);
    button->setToolTip(toolTip);
    button->setAccessibleName(toolTip);
    m_buttons->addWidget(button);
}

void KvDeskStepRow::setObstacle(const QString &reason)
{
    for (KvDeskActionButton *const button : findChildren<KvDeskActionButton *>())
        button->setObstacle(reason);
}

void KvDeskStepRow::setNarrow(bool isNarrow)
{
    m_layout->setDirection(isNarrow ? QBoxLayout::TopToBottom : QBoxLayout::LeftToRight);
    m_layout->setSpacing(isNarrow ? controlSpacing : groupSpacing);
    const int side = isNarrow ? controlSpacing : groupSpacing;
    m_layout->setContentsMargins(side, controlSpacing, side, controlSpacing);
}

QSize KvDeskStepRow::minimumSizeHint() const
{
    const int content = qMax(m_head->minimumSize().width(), m_buttons->minimumSize().width());
    const QMargins frame = contentsMargins();
    return QSize(content + 2 * controlSpacing + frame.left() + frame.right(),
                 QFrame::minimumSizeHint().height());
}
