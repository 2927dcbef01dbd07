// SPDX-License-Identifier: MIT
#pragma once

#include <QStringList>
#include <QWidget>

class QButtonGroup;

/** Options row with a title and exclusive buttons: one choice out of a few, such as the colour theme. */
class KvChoiceOptionsRow : public QWidget
{
    Q_OBJECT
public:
    /** The choice made by a button is its index in \a choices. */
    KvChoiceOptionsRow(const QString &title, const QStringList &choices, QWidget *parent = nullptr);

    /** Index of the checked button, or -1. */
    int choice() const;
    /** Checks a button, or none for an index that has no button; emits nothing. */
    void setChoice(int index);

signals:
    void signalToggled(); ///< once for the button that goes off, once for the one that comes on

private:
    QButtonGroup *m_buttons;
};
