// SPDX-License-Identifier: MIT
#include "KvDeskToolStrip.h"

#include "KvDeskToolBox.h"

#include <QAction>
#include <QHBoxLayout>
#include <QToolButton>
#include <QVariant>

namespace {

constexpr int margin = 4;
constexpr QSize buttonSize(32, 32);
constexpr QSize iconSize(24, 24);

QFrame *separator(bool isLevel, QWidget *parent)
{
    auto *const line = new QFrame(parent);
    line->setProperty("separator", true);
    if (isLevel)
        line->setFixedHeight(1);
    else
        line->setFixedWidth(1);
    return line;
}

QToolButton *button(QAction *action, QWidget *parent)
{
    auto *const button = new QToolButton(parent);
    button->setDefaultAction(action);
    button->setAutoRaise(true);
    button->setFixedSize(buttonSize);
    button->setIconSize(iconSize);
    button->setAccessibleName(action->text().remove(QLatin1Char('&')));
    return button;
}

} // namespace

KvDeskToolStrip::KvDeskToolStrip(const KvDeskToolBox *toolBox, QWidget *parent)
    : QFrame(parent)
{
    setProperty("panel", true);
    setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Preferred);
    setAccessibleName(tr("Measuring tools"));
    auto *const buttons = new QVBoxLayout;
    buttons->setContentsMargins(margin, margin, margin, margin);
    buttons->setSpacing(margin);
    for (const QVector<QAction *> &group : toolBox->groups()) {
        if (buttons->count() > 0)
            buttons->addWidget(separator(true, this));
        for (QAction *const action : group)
            buttons->addWidget(button(action, this));
    }
    buttons->addStretch();
    auto *const layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addLayout(buttons);
    layout->addWidget(separator(false, this));
    toolBox->addKeysTo(this);
}
