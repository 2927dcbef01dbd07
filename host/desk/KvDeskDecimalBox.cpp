// SPDX-License-Identifier: MIT
#include "KvDeskDecimalBox.h"

namespace {

// One character for one, so that places in the text stay.
QString plainText(QString text)
{
    for (QChar &character : text) {
        if (character == QLatin1Char(',') || character == QChar(0x066B)) // the Arabic decimal mark
            character = QLatin1Char('.');
        else if (character.digitValue() >= 0)
            character = QLatin1Char(static_cast<char>('0' + character.digitValue()));
    }
    return text;
}

} // namespace

KvDeskDecimalBox::KvDeskDecimalBox(QWidget *parent)
    : QDoubleSpinBox(parent)
{
    setLocale(QLocale::c());
}

QValidator::State KvDeskDecimalBox::validate(QString &text, int &position) const
{
    // A suffix stays as it is.
    const int length = text.size() - (text.endsWith(suffix()) ? suffix().size() : 0);
    text = plainText(text.left(length)) + text.mid(length);
    return QDoubleSpinBox::validate(text, position);
}
