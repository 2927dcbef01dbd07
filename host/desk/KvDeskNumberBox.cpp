// SPDX-License-Identifier: MIT
#include "KvDeskNumberBox.h"

#include <QRegularExpression>
#include <QSignalBlocker>
#include <QStyle>
#include <QVariant>

#include <limits>

namespace {

constexpr int shownDigits = 10;
const char invalidProperty[] = "invalid";

// 0 for an empty text. There are no separators of thousands: nobody can tell which of both "1.234,5" has.
bool toNumber(const QString &text, double *number)
{
    static const QRegularExpression pattern(
        QStringLiteral("^[+-]?([0-9]+[.,]?[0-9]*|[.,][0-9]+)([eE][+-]?[0-9]+)?$"));
    QString plain = text.trimmed();
    *number = 0.0;
    if (plain.isEmpty())
        return true;
    if (!pattern.match(plain).hasMatch())
        return false;
    bool isInRange = false;
    *number = plain.replace(QLatin1Char(','), QLatin1Char('.')).toDouble(&isInRange);
    if (!isInRange)
        *number = std::numeric_limits<double>::infinity();
    return true;
}

} // namespace

KvDeskNumberBox::KvDeskNumberBox(QWidget *parent)
    : QLineEdit(parent)
{
    // Numbers read from left to right in every language.
    setLayoutDirection(Qt::LeftToRight);
    connect(this, SIGNAL(textChanged(QString)), this, SLOT(slotTextChanged(QString)));
}

void KvDeskNumberBox::setValue(double value)
{
    {
        const QSignalBlocker blocker(this);
        setText(value > 0.0 ? QString::number(value, 'g', shownDigits) : QString());
    }
    // All of its digits, of which not all are shown.
    m_value = value;
    m_isNumber = true;
    emit valueChanged(m_value);
}

void KvDeskNumberBox::slotTextChanged(const QString &aText)
{
    m_isNumber = toNumber(aText, &m_value);
    emit valueChanged(m_value);
}

void KvDeskNumberBox::setFault(const QString &reason)
{
    if (reason == m_fault)
        return;
    if (m_fault.isEmpty())
        m_ownToolTip = toolTip();
    m_fault = reason;
    setToolTip(reason.isEmpty() ? m_ownToolTip : reason);
    setAccessibleDescription(reason);
    setProperty(invalidProperty, !reason.isEmpty());
    // The style sheet looks at the property only now.
    style()->unpolish(this);
    style()->polish(this);
}
