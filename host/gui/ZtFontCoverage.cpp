// SPDX-License-Identifier: MIT
#include "gui/ZtFontCoverage.h"

#include <QFontMetrics>
#include <QVector>

#include <algorithm>

namespace {

// Every font has these.
constexpr uint kFirstChecked = 0x80;

bool isDrawn(uint codePoint)
{
    switch (QChar::category(codePoint)) {
    case QChar::Other_Control:
    case QChar::Other_Format:
    case QChar::Other_Surrogate:
    case QChar::Other_NotAssigned:
    case QChar::Separator_Line:
    case QChar::Separator_Paragraph:
    case QChar::Separator_Space:
        return false;
    default:
        return true;
    }
}

bool isEmoji(uint codePoint)
{
    return codePoint >= 0x1F000 && codePoint < 0x1FB00;
}

QString packageWith(uint codePoint)
{
    if (QChar::category(codePoint) == QChar::Other_PrivateUse)
        return QString();
    if (isEmoji(codePoint))
        return QStringLiteral("fonts-symbola");
    switch (QChar::script(codePoint)) {
    case QChar::Script_Han:
    case QChar::Script_Hiragana:
    case QChar::Script_Katakana:
    case QChar::Script_Hangul:
    case QChar::Script_Bopomofo:
        return QStringLiteral("fonts-noto-cjk");
    default:
        return QStringLiteral("fonts-noto-core");
    }
}

} // namespace

ZtFontCoverage::ZtFontCoverage(const QFont &font)
    : m_font(font)
{}

void ZtFontCoverage::addText(const QString &text)
{
    // Measurements repeat their texts, usually right after one another.
    if (text == m_lastText)
        return;
    m_lastText = text;
    const bool isPlain =
        std::all_of(text.begin(), text.end(), [](QChar c) { return c.unicode() < kFirstChecked; });
    if (isPlain)
        return;
    for (const uint codePoint : text.toUcs4()) {
        if (codePoint >= kFirstChecked)
            m_codePoints.insert(codePoint);
    }
}

QString ZtFontCoverage::missingCharacters() const
{
    const QFontMetrics metrics(m_font);
    QVector<uint> missing;
    for (const uint codePoint : m_codePoints) {
        if (isDrawn(codePoint) && !metrics.inFontUcs4(codePoint))
            missing.append(codePoint);
    }
    std::sort(missing.begin(), missing.end());
    return QString::fromUcs4(missing.constData(), missing.size());
}

QStringList ZtFontCoverage::packagesWith(const QString &characters)
{
    QStringList packages;
    for (const uint codePoint : characters.toUcs4()) {
        const QString package = packageWith(codePoint);
        if (!package.isEmpty() && !packages.contains(package))
            packages.append(package);
    }
    packages.sort();
    return packages;
}
