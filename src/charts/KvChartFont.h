// SPDX-License-Identifier: MIT
#pragma once

#include <QFont>

/** The font of everything that is written in charts. */
namespace kvCharts::KvChartFont {

/**
 * "Segoe UI" without ligatures: a PDF stores the ligature of "f" and "l" as one character, and whoever then
 * looks for "flow" in the report does not find it. Any letter spacing switches them off; this one is the
 * smallest there is.
 */
inline QFont make(qreal pointSize, QFont::Weight weight = QFont::Normal)
{
    constexpr qreal kSmallestSpacing = 1.0 / 64; // pixels; the text layout's unit
    QFont font(QStringLiteral("Segoe UI"));
    // All of them: what a font leaves open, widgets take from the application, whose fonts go by its
    // language.
    font.setFamilies({font.family()});
    font.setStyleStrategy(QFont::PreferDefault);
    font.setPointSizeF(pointSize);
    font.setWeight(weight);
    font.setLetterSpacing(QFont::AbsoluteSpacing, kSmallestSpacing);
    return font;
}

} // namespace kvCharts::KvChartFont
