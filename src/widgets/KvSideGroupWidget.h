// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>

class QHBoxLayout;

/** Row of widgets at the left of a side panel. */
class KvSideGroupWidget : public QFrame
{
    Q_OBJECT
public:
    explicit KvSideGroupWidget(QWidget *parent = nullptr);

    /** Appends \a widget to the row, which takes it over. */
    void addWidget(QWidget *widget);

private:
    QHBoxLayout *m_row;
};
