// SPDX-License-Identifier: MIT
#pragma once

#include "gui/ZtGuiGlobal.h"

#include <QFont>
#include <QSet>
#include <QString>
#include <QStringList>

/**
 * Finds the characters that no installed font can draw. Such characters vanish from a page without a word, so
 * whoever makes a report asks first. Texts are collected, then checked at once.
 */
class ZT_GUI_EXPORT ZtFontCoverage
{
public:
    explicit ZtFontCoverage(const QFont &font); ///< the font that the texts are drawn with

    void addText(const QString &text); ///< remembers the characters, each once
    /** The characters of all texts that neither the font nor any substitute has, by code point. */
    QString missingCharacters() const;
    /** The packages of Debian and its kin with fonts for these characters; none for those that no font has.
     */
    static QStringList packagesWith(const QString &characters);

private:
    QFont m_font;
    QString m_lastText;
    QSet<uint> m_codePoints;
};
