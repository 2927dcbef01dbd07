// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

/** The theme of the program: the style service's, remembered in the settings. */
class KvDeskTheme
{
public:
    /** The remembered theme; "Dark" for none and for one that does not exist. */
    static QString stored();
    static void store(const QString &theme);

    /** Gives the application a theme; a name that is none changes nothing but refreshes the present one. */
    static void apply(const QString &theme);
    /** Changes between the two themes, and remembers the new one. */
    static void toggle();
};
