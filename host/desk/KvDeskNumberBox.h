// SPDX-License-Identifier: MIT
#pragma once

#include <QDoubleSpinBox>

/**
 * Field for a number above 0 of any size, which is shown with as many digits as it has. A comma is as good as
 * a point. 0 stands for an empty field.
 */
class KvDeskNumberBox : public QDoubleSpinBox
{
    Q_OBJECT
public:
    static constexpr double largest = 1e9;

    explicit KvDeskNumberBox(QWidget *parent = nullptr);

    QString textFromValue(double value) const override;
    double valueFromText(const QString &text) const override;
    QValidator::State validate(QString &text, int &position) const override;
};
