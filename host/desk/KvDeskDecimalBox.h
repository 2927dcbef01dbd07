// SPDX-License-Identifier: MIT
#pragma once

#include <QDoubleSpinBox>

/**
 * Field for a number, which it shows as the program shows all of them: with a decimal point, whatever the
 * language. The decimal marks and digits of other languages may be typed as well.
 */
class KvDeskDecimalBox : public QDoubleSpinBox
{
    Q_OBJECT
public:
    explicit KvDeskDecimalBox(QWidget *parent = nullptr);

    QValidator::State validate(QString &text, int &position) const override;
};
