// SPDX-License-Identifier: MIT
#pragma once

#include <QGuiApplication>
#include <QString>

/**
 * Texts that run from left to right in any language: names and paths of files, numbers with units, keys.
 *
 * For what the user sees only. Nothing else may hold the marks: they are part of no name. All inline, so that
 * a plug-in asks nothing new of its host.
 */
class ZtLeftToRight
{
public:
    /** \a text for the middle of a translated one: between marks that keep its slashes, brackets and numbers
     * in their places where the program runs from right to left, else as it is. */
    static QString isolated(const QString &text)
    {
        if (text.isEmpty() || QGuiApplication::layoutDirection() != Qt::RightToLeft)
            return text;
        return marked(text);
    }

    /** The same whatever the program's direction is, for a text that has its own. */
    static QString marked(const QString &text) { return begin + text + end; }

    /** \a text without the marks, to be taken to somewhere else. */
    static QString plain(QString text) { return text.remove(begin).remove(end); }

private:
    static constexpr QChar begin{0x2066}; ///< LEFT-TO-RIGHT ISOLATE
    static constexpr QChar end{0x2069};   ///< POP DIRECTIONAL ISOLATE
};
