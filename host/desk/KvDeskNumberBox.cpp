// SPDX-License-Identifier: MIT
#include "KvDeskNumberBox.h"

namespace {

constexpr int mostDecimals = 12;
constexpr int shownDigits = 10;

QString plainText(const QString &text)
{
    return QString(text).trimmed().replace(QLatin1Char(','), QLatin1Char('.'));
}

} // namespace

KvDeskNumberBox::KvDeskNumberBox(QWidget *parent)
    : QDoubleSpinBox(parent)
{
    setLocale(QLocale::c());
    setDecimals(mostDecimals);
    setRange(0.0, largest);
    setButtonSymbols(NoButtons);
    setStepType(AdaptiveDecimalStepType);
    // Numbers read from left to right in every language.
    setLayoutDirection(Qt::LeftToRight);
}

QString KvDeskNumberBox::textFromValue(double value) const
{
    return value > 0.0 ? QString::number(value, 'g', shownDigits) : QString();
}

double KvDeskNumberBox::valueFromText(const QString &text) const
{
    return plainText(text).toDouble();
}

QValidator::State KvDeskNumberBox::validate(QString &text, int &position) const
{
    Q_UNUSED(position)
    const QString plain = plainText(text);
    bool isNumber = false;
    const double number = plain.toDouble(&isNumber);
    if (plain.isEmpty() || (isNumber && number >= 0.0 && number <= largest))
        return QValidator::Acceptable;
    // Numbers that are not written to their end, such as ".", "1e" and "1e-".
    const bool isBeginning =
        QString(plain + QLatin1Char('0')).toDouble() >= 0.0 && !isNumber &&
        plain.indexOf(QLatin1Char('-')) != 0 &&
        (plain == QLatin1String(".") || plain.contains(QLatin1Char('e'), Qt::CaseInsensitive));
    return isBeginning ? QValidator::Intermediate : QValidator::Invalid;
}
