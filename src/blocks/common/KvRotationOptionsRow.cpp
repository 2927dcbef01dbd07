// SPDX-License-Identifier: MIT
#include "blocks/common/KvRotationOptionsRow.h"

#include "blocks/common/KvBaseOptionsWidget.h"
#include "gui/QtAdvancedStylesheet.h"
#include "gui/acss.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QSignalBlocker>

namespace {
constexpr int kIconMode = 6;
const QSize kIconSize(KvBaseOptionsWidget::LabelWidth, KvBaseOptionsWidget::LabelWidth);
} // namespace

KvRotationOptionsRow::KvRotationOptionsRow(QWidget *parent)
    : QWidget(parent)
    , m_icon(new QLabel(this))
    , m_comboBox(new QComboBox(this))
{
    m_icon->setFixedSize(kIconSize);
    m_icon->setBuddy(m_comboBox);
    for (const int degrees : {0, 90, 180, 270})
        m_comboBox->addItem(QString::number(degrees) + QChar(0x00B0), degrees);
    m_comboBox->setFixedWidth(KvBaseOptionsWidget::FieldWidth);
    m_comboBox->setAccessibleName(tr("Rotation"));
    m_comboBox->setToolTip(tr("Rotation of the picture, clockwise"));

    auto *row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(KvBaseOptionsWidget::ControlSpacing);
    row->addWidget(m_icon);
    row->addWidget(m_comboBox);
    row->addStretch(1);
    connect(m_comboBox, SIGNAL(currentIndexChanged(int)), this, SIGNAL(signalAngleIndexChanged()));
    connect(acss::QtAdvancedStylesheet::getInstance(), SIGNAL(currentThemeChanged(QString)), this,
                                                              SLOT(slotThemeChanged()));
    slotThemeChanged();
}

int KvRotationOptionsRow::angle() const
{
    return m_comboBox->currentData().toInt();
}

void KvRotationOptionsRow::setAngle(int degrees)
{
    const QSignalBlocker blocker(m_comboBox);
    m_comboBox->setCurrentIndex(qMax(0, m_comboBox->findData(degrees)));
}

void KvRotationOptionsRow::slotThemeChanged()
{
    m_icon->setPixmap(acss::createPixmap(kIconMode, QStringLiteral("Icons/IconRightAngle.svg"), kIconSize));
}
