// SPDX-License-Identifier: MIT
#pragma once

#include <QWidget>

class QSpinBox;

/** Options row with the block's width; shared by every block that can be sized. */
class KvWidthOptionsRow : public QWidget
{
    Q_OBJECT
public:
    explicit KvWidthOptionsRow(QWidget *parent = nullptr);

    int widthPercent() const;
    void setWidthPercent(int percent); ///< 1..100; emits nothing

signals:
    void signalWidthChanged(
        int aWidth); ///< the user chose another width, in percent of the width between the margins

private:
    QSpinBox *m_spinBox;
};
