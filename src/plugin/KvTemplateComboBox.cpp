// SPDX-License-Identifier: MIT
#include "plugin/KvTemplateComboBox.h"

#include "kernel/ZtLeftToRight.h"

#include <QAbstractItemView>
#include <QStyleOptionComboBox>
#include <QStylePainter>

KvTemplateComboBox::KvTemplateComboBox(QWidget *parent)
    : QComboBox(parent)
{
    view()->setTextElideMode(Qt::ElideMiddle);
}

void KvTemplateComboBox::paintEvent(QPaintEvent *event)
{
    Q_UNUSED(event)
    QStyleOptionComboBox option;
    initStyleOption(&option);
    const QRect field =
        style()->subControlRect(QStyle::CC_ComboBox, &option, QStyle::SC_ComboBoxEditField, this);
    constexpr int inset = 1; // styles leave a pixel at either side of the text
    option.currentText = ZtLeftToRight::isolated(
        fontMetrics().elidedText(option.currentText, Qt::ElideMiddle, field.width() - 2 * inset));
    QStylePainter painter(this);
    painter.drawComplexControl(QStyle::CC_ComboBox, option);
    painter.drawControl(QStyle::CE_ComboBoxLabel, option);
}
