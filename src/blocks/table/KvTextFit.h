// SPDX-License-Identifier: MIT
#pragma once

#include <QFont>
#include <QFontMetricsF>
#include <QString>
#include <QVector>

/**
 * Finds out whether texts fit a width, and shortens those that do not.
 *
 * Measuring a text costs as much as drawing it, and nearly every cell of a table fits: the widths of single
 * characters, measured once, settle those cells.
 */
class KvTextFit
{
public:
    explicit KvTextFit(const QFont &font);

    const QFont &font() const { return m_font; }
    /** From the top of a line's box to its baseline, and the height of that box. */
    qreal ascent() const { return m_metrics.ascent(); }
    qreal height() const { return m_metrics.height(); }

    /** \a text, or what of it fits \a width with an ellipsis at its end. Line breaks become blanks. */
    QString fitted(const QString &text, qreal width) const;

    /** \a width, or as much more as fitted() needs to leave \a text whole. */
    qreal widthFor(const QString &text, qreal width) const;

private:
    bool surelyFits(const QString &text, qreal width) const;

    QFont m_font;
    QFontMetricsF m_metrics;
    mutable QVector<float> m_advances; ///< by UTF-16 unit; negative where not measured yet
};
