// SPDX-License-Identifier: MIT
#pragma once

#include <QFont>
#include <QFontMetricsF>
#include <QSizeF>
#include <QString>
#include <QTextLayout>

namespace kvCharts {

/** Room that a text takes. */
struct KvTextExtent
{
    QSizeF size;        ///< bounding rectangle of a text item, its margins included
    qreal ascent = 0.0; ///< of the line below the upper margin; 0 where a text document has to draw the text

    /** False when control or non-characters in the text need a whole text document. */
    bool isOneLine() const { return ascent > 0.0; }
};

/**
 * Measures texts as text items of the same font would be, without making the items: an axis may have many
 * thousand labels.
 */
class KvTextMeasure
{
public:
    /** Free space that a text item keeps on all four sides, in scene units. */
    static constexpr qreal Margin = 4.0;

    explicit KvTextMeasure(const QFont &font);

    KvTextExtent measure(const QString &text);

private:
    qreal overhang(const QString &text) const;
    KvTextExtent measureLayout(const QString &text);
    KvTextExtent measureDocument(const QString &text) const;

    QFont m_font;
    QFontMetricsF m_metrics;
    QTextLayout m_layout;
    KvTextExtent m_oneFontExtent; ///< of an empty text; only the width differs from text to text
};

} // namespace kvCharts
