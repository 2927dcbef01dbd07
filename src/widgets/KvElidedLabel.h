// SPDX-License-Identifier: MIT
#pragma once

#include <QLabel>

/** One line of text that leaves out its middle where it does not fit; never asks for more than its place. */
class KvElidedLabel : public QLabel
{
    Q_OBJECT
public:
    explicit KvElidedLabel(QWidget *parent = nullptr);

    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent *event) override;
};
