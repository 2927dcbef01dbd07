// SPDX-License-Identifier: MIT
#include "blocks/common/KvWidthOptionsRow.h"

#include "blocks/common/KvBaseOptionsWidget.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QSignalBlocker>
#include <QSpinBox>

KvWidthOptionsRow::KvWidthOptionsRow(QWidget *parent)
    : QWidget(parent)
    , m_spinBox(new QSpinBox(this))
{
    auto *label = new QLabel(tr("W", "short for width"), this);
    label->setBuddy(m_spinBox);
    label->setMinimumWidth(KvBaseOptionsWidget::LabelWidth);
    label->setAlignment(Qt::AlignCenter);
    m_spinBox->setFixedWidth(KvBaseOptionsWidget::FieldWidth);
    // As all numbers of reports, whatever the language.
    m_spinBox->setLocale(QLocale::c());
    m_spinBox->setRange(1, 100);
    m_spinBox->setSuffix(QStringLiteral("%"));
    m_spinBox->setButtonSymbols(QAbstractSpinBox::NoButtons);
    m_spinBox->setAccessibleName(tr("Width in percent"));
    m_spinBox->setToolTip(tr("Width in percent of the page's content"));

    auto *row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(KvBaseOptionsWidget::ControlSpacing);
    row->addWidget(label);
    row->addWidget(m_spinBox);
    row->addStretch(1);
    connect(m_spinBox, SIGNAL(valueChanged(int)), this, SIGNAL(signalWidthChanged(int)));
}

int KvWidthOptionsRow::widthPercent() const
{
    return m_spinBox->value();
}

void KvWidthOptionsRow::setWidthPercent(int percent)
{
    const QSignalBlocker blocker(m_spinBox);
    m_spinBox->setValue(percent);
}
