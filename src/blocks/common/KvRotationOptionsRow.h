// SPDX-License-Identifier: MIT
#pragma once

#include <QWidget>

class QComboBox;
class QLabel;

/** Options row with a picture's rotation in quarter turns. */
class KvRotationOptionsRow : public QWidget
{
    Q_OBJECT
public:
    explicit KvRotationOptionsRow(QWidget *parent = nullptr);

    int angle() const; ///< clockwise, in degrees
    /** Shows an angle, or 0 for one that is not on offer; emits nothing. */
    void setAngle(int degrees);

signals:
    void signalAngleIndexChanged(); ///< the user chose another rotation

private slots:
    void slotThemeChanged();

private:
    QLabel *m_icon;
    QComboBox *m_comboBox;
};
