// SPDX-License-Identifier: MIT
#pragma once

#include <QComboBox>

/**
 * Combo box of file names: shortens the name that it shows with dots in the middle, where style sheets would
 * cut it, so that both ends can be read.
 *
 * Without a meta-object of its own it is a QComboBox to style sheets and to whoever looks for one.
 */
class KvTemplateComboBox : public QComboBox
{
public:
    explicit KvTemplateComboBox(QWidget *parent = nullptr);

protected:
    void paintEvent(QPaintEvent *event) override;
};
