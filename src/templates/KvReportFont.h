// SPDX-License-Identifier: MIT
#pragma once

#include <QFont>

/** The font of everything that stands on report pages. */
namespace KvReportFont {

/**
 * "Segoe UI" (or what the host puts in its place) in pixels, so that lines break alike on every screen and in
 * the PDF.
 *
 * Without ligatures: a PDF stores the ligature of "f" and "l" as one character, and whoever then looks for
 * "flow" in the report does not find it. Any letter spacing switches them off; this one is the smallest there
 * is.
 */
inline QFont make(int pixelSize, QFont::Weight weight = QFont::Normal)
{
    constexpr qreal kSmallestSpacing = 1.0 / 64; // pixels; the text layout's unit
    QFont font(QStringLiteral("Segoe UI"));
    // All of them: what a font leaves open, widgets take from the application, whose fonts go by its
    // language.
    font.setFamilies({font.family()});
    font.setStyleStrategy(QFont::PreferDefault);
    font.setPixelSize(pixelSize);
    font.setWeight(weight);
    font.setLetterSpacing(QFont::AbsoluteSpacing, kSmallestSpacing);
    return font;
}

/** Size of body text and table cells, in pixels. */
constexpr int BodyPixelSize = 12;

} // namespace KvReportFont
