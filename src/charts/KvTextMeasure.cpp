// SPDX-License-Identifier: MIT
#include "charts/KvTextMeasure.h"

#include <QGraphicsTextItem>

#include <algorithm>

namespace kvCharts {

namespace {

enum class TextKind { Ascii, OneLine, Document };

// Text documents take non-characters for the borders of their frames.
bool needsDocument(QChar c)
{
    return c.isNonCharacter() || c.category() == QChar::Other_Control ||
           c.category() == QChar::Other_Format || c.category() == QChar::Separator_Line ||
           c.category() == QChar::Separator_Paragraph;
}

TextKind kindOf(const QString &text)
{
    const auto isAscii = [](QChar c) { return c.unicode() >= 0x20 && c.unicode() < 0x7f; };
    if (std::all_of(text.begin(), text.end(), isAscii))
        return TextKind::Ascii;
    return std::any_of(text.begin(), text.end(), needsDocument) ? TextKind::Document : TextKind::OneLine;
}

QSizeF withMargins(qreal width, qreal height)
{
    return QSizeF(width + 2 * KvTextMeasure::Margin, height + 2 * KvTextMeasure::Margin);
}

} // namespace

KvTextMeasure::KvTextMeasure(const QFont &font)
    : m_font(font)
    , m_metrics(font)
{
    m_layout.setFont(font);
    // A letter, as an empty line may be laid out in another way.
    m_oneFontExtent = measureLayout(QStringLiteral("x"));
}

KvTextExtent KvTextMeasure::measure(const QString &text)
{
    const TextKind kind = kindOf(text);
    if (kind == TextKind::Document)
        return measureDocument(text);
    if (kind == TextKind::OneLine)
        return measureLayout(text);
    KvTextExtent extent = m_oneFontExtent;
    extent.size.setWidth(m_metrics.horizontalAdvance(text) + overhang(text) + 2 * Margin);
    return extent;
}

// By how much the last letter ("f" or "W", say) reaches over its advance; lines make room for it.
qreal KvTextMeasure::overhang(const QString &text) const
{
    return text.isEmpty() ? 0.0 : std::max(0.0, -m_metrics.rightBearing(text.back()));
}

// Letters outside ASCII may come from a substitute font, which makes the line higher.
KvTextExtent KvTextMeasure::measureLayout(const QString &text)
{
    m_layout.setText(text);
    m_layout.beginLayout();
    QTextLine line = m_layout.createLine();
    line.setLeadingIncluded(true);
    line.setNumColumns(text.size());
    m_layout.endLayout();
    return KvTextExtent{withMargins(line.naturalTextWidth(), line.height()), line.ascent()};
}

KvTextExtent KvTextMeasure::measureDocument(const QString &text) const
{
    QGraphicsTextItem item(text);
    item.setFont(m_font);
    return KvTextExtent{item.boundingRect().size(), 0.0};
}

} // namespace kvCharts
