// SPDX-License-Identifier: MIT
#include "blocks/common/KvAlignmentOptionsRow.h"

#include "blocks/common/KvBaseOptionsWidget.h"
#include "gui/acss.h"

#include <QHBoxLayout>
#include <QPushButton>

namespace {
constexpr int kButtonExtent = 24; // the icon's own room around its strokes is enough
constexpr int kIconMode = 6;
// Without the border of one pixel; the application's style sheet would hold the buttons open at 32.
const char kButtonStyle[] = "QPushButton { min-width: 22px; min-height: 22px; }";
} // namespace

KvAlignmentOptionsRow::KvAlignmentOptionsRow(QWidget *parent)
    : QWidget(parent)
{
    setStyleSheet(QLatin1String(kButtonStyle));
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
    const QSize size(kButtonExtent, kButtonExtent);
    auto *button = new QPushButton(this);
    button->setCheckable(true);
    button->setProperty("iconOnly", true);
    button->setFixedSize(size);
    button->setIconSize(size);
    button->setIcon(acss::createIcon(kIconMode, iconPath, size));
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
