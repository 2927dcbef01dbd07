// SPDX-License-Identifier: MIT
#include "blocks/common/KvChoiceOptionsRow.h"

#include <QAbstractButton>
#include <QButtonGroup>
#include <QHBoxLayout>
#include <QLabel>
#include <QRadioButton>
#include <QSignalBlocker>
#include <QVBoxLayout>

namespace {
constexpr int kRowSpacing = 4;
constexpr int kButtonSpacing = 12;
} // namespace

KvChoiceOptionsRow::KvChoiceOptionsRow(const QString &title, const QStringList &choices, QWidget *parent)
    : QWidget(parent)
    // A group of its own: all radio buttons of one parent would be exclusive together.
    , m_buttons(new QButtonGroup(this))
{
    auto *column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(kRowSpacing);
    column->addWidget(new QLabel(title, this));
    auto *row = new QHBoxLayout;
    row->setSpacing(kButtonSpacing);
    column->addLayout(row);
    for (int i = 0; i < choices.size(); ++i) {
        auto *button = new QRadioButton(choices.at(i), this);
        m_buttons->addButton(button, i);
        row->addWidget(button);
        connect(button, SIGNAL(toggled(bool)), this, SIGNAL(signalToggled()));
    }
    row->addStretch(1);
}

int KvChoiceOptionsRow::choice() const
{
    return m_buttons->checkedId();
}

void KvChoiceOptionsRow::setChoice(int index)
{
    const QSignalBlocker blocker(this);
    if (QAbstractButton *button = m_buttons->button(index)) {
        button->setChecked(true);
        return;
    }
    QAbstractButton *checked = m_buttons->checkedButton();
    if (!checked)
        return;
    m_buttons->setExclusive(false);
    checked->setChecked(false);
    m_buttons->setExclusive(true);
}
