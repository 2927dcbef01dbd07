// SPDX-License-Identifier: MIT
#pragma once

#include <QLineEdit>

/**
 * Field for a number, which is shown with as many digits as it has. A comma is as good as a point.
 *
 * Whatever is typed or pasted stays as it is: no key is swallowed, as that would make another number of it.
 * What cannot be used is marked, and the tool tip says why.
 */
class KvDeskNumberBox : public QLineEdit
{
    Q_OBJECT
public:
    explicit KvDeskNumberBox(QWidget *parent = nullptr);

    /** 0 for an empty field and for what isNumber() is false for; infinite beyond all that can be told. */
    double value() const { return m_value; }
    /** Empties the field with 0. */
    void setValue(double value);
    /** False for text that is no number, or may be several, such as "1.234,5"; true for an empty field. */
    bool isNumber() const { return m_isNumber; }
    bool isEmpty() const { return text().trimmed().isEmpty(); }

    /** Why what is typed cannot be used; marks the field unless empty. */
    void setFault(const QString &reason);
    QString fault() const { return m_fault; }

signals:
    void valueChanged(double aValue); ///< also when only the text or isNumber() changes

private slots:
    void slotTextChanged(const QString &aText);

private:
    double m_value = 0.0;
    bool m_isNumber = true;
    QString m_fault;
    QString m_ownToolTip;
};
