// SPDX-License-Identifier: MIT
#pragma once

#include <QWidget>

class QPushButton;

/** Options row with three buttons for the block's horizontal place: left, centre, right. */
class KvAlignmentOptionsRow : public QWidget
{
    Q_OBJECT
public:
    explicit KvAlignmentOptionsRow(QWidget *parent = nullptr);

    /** Checks the button that stands for \a alignment; the centre one whenever the horizontal-centre bit is
     * set. */
    void setAlignment(Qt::Alignment alignment);

signals:
    void signalLeftClicked();
    void signalCenterClicked();
    void signalRightClicked();

private:
    QPushButton *addButton(const QString &iconPath, const QString &text, const char *clickedSignal);

    QPushButton *m_leftButton;
    QPushButton *m_centerButton;
    QPushButton *m_rightButton;
};
