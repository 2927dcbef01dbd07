// SPDX-License-Identifier: MIT
#include "blocks/table/KvTextFit.h"

#include <algorithm>

namespace {

// Latin, Greek and what stands between them: texts of measurements. Others are measured whole.
constexpr int kTableSize = 0x400;
// Kerning moves letters apart by a few percent at most.
constexpr qreal kKerningReserve = 1.04;
// Longer texts never fit a cell; measuring all of a text of megabytes only to cut it would hang the report.
constexpr int kLongestMeasured = 2000;

bool isLineBreak(QChar c)
{
    return c == QLatin1Char('\n') || c == QLatin1Char('\r') || c == QChar::LineSeparator ||
           c == QChar::ParagraphSeparator;
}

QString singleLine(QString text)
{
    for (QChar &c : text) {
        if (isLineBreak(c))
            c = QLatin1Char(' ');
    }
    return text;
}

} // namespace

KvTextFit::KvTextFit(const QFont &font)
    : m_font(font)
    , m_metrics(font)
    , m_advances(kTableSize, -1.0f)
{}

QString KvTextFit::fitted(const QString &text, qreal width) const
{
    if (surelyFits(text, width))
        return text;
    const QString measured =
        text.size() > kLongestMeasured ? text.left(kLongestMeasured) + QChar(0x2026) : text;
    const QString line =
        std::any_of(measured.begin(), measured.end(), isLineBreak) ? singleLine(measured) : measured;
    return m_metrics.elidedText(line, Qt::ElideRight, width);
}

bool KvTextFit::surelyFits(const QString &text, qreal width) const
{
    qreal sum = 0.0;
    const qreal limit = width / kKerningReserve;
    for (const QChar c : text) {
        const ushort unit = c.unicode();
        if (unit < 0x20 || unit >= kTableSize)
            return false;
        float &advance = m_advances[unit];
        if (advance < 0.0f)
            advance = static_cast<float>(m_metrics.horizontalAdvance(c));
        sum += static_cast<qreal>(advance);
        if (sum > limit)
            return false;
    }
    return true;
}

qreal KvTextFit::widthFor(const QString &text, qreal width) const
{
    if (surelyFits(text, width))
        return width;
    // Rounding may make the letters a trace wider than their sum.
    return std::max(width, m_metrics.horizontalAdvance(singleLine(text.left(kLongestMeasured))) + 1);
}
