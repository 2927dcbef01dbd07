// SPDX-License-Identifier: MIT
#include "blocks/common/KvAlignmentOptionsRow.h"

#include "blocks/common/KvBaseOptionsWidget.h"
#include "gui/acss.h"

#include <QHBoxLayout>
#include <QPushButton>

namespace {
constexpr int kIconExtent = 24;
constexpr int kIconMode = 6;
} // namespace

KvAlignmentOptionsRow::KvAlignmentOptionsRow(QWidget *parent)
    : QWidget(parent)
{
    auto *row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(KvBaseOptionsWidget::ControlSpacing);
    m_leftButton =
        addButton(QStringLiteral("Icons/IconAlignLeft.svg"), tr("Align left"), SIGNAL(signalLeftClicked()));
    m_centerButton = addButton(QStringLiteral("Icons/IconAlignCenter.svg"), tr("Align center"),
                               SIGNAL(signalCenterClicked()));
    m_rightButton = addButton(QStringLiteral("Icons/IconAlignRight.svg"), tr("Align right"),
                              SIGNAL(signalRightClicked()));
    row->addStretch(1);
}

QPushButton *KvAlignmentOptionsRow::addButton(const QString &iconPath, const QString &text,
                                              const char *clickedSignal)
{
    auto *button = new QPushButton(this);
    button->setCheckable(true);
    button->setProperty("iconOnly", true);
    button->setFixedSize(KvBaseOptionsWidget::IconButtonExtent, KvBaseOptionsWidget::IconButtonExtent);
    button->setIconSize(QSize(kIconExtent, kIconExtent));
    button->setIcon(acss::createIcon(kIconMode, iconPath, QSize(kIconExtent, kIconExtent)));
    button->setToolTip(text);
    button->setAccessibleName(text);
    layout()->addWidget(button);
    connect(button, SIGNAL(clicked(bool)), this, clickedSignal);
    return button;
}

void KvAlignmentOptionsRow::setAlignment(Qt::Alignment alignment)
{
    const bool isCenter = alignment.testFlag(Qt::AlignHCenter);
    m_centerButton->setChecked(isCenter);
    m_leftButton->setChecked(!isCenter && alignment.testFlag(Qt::AlignLeft));
    m_rightButton->setChecked(!isCenter && alignment.testFlag(Qt::AlignRight));
}
