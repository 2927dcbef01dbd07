// SPDX-License-Identifier: MIT
#pragma once

#include "gui/ZtGuiGlobal.h"

#include <QColor>
#include <QObject>
#include <QPalette>
#include <QString>
#include <QStringList>

class QApplication;
class QLocale;

namespace acss {

/**
 * The themes of the application: colours by name, and the style sheet made of them. Process-wide, GUI thread
 * only.
 *
 * Colours: "window", "panel", "raised" (fields and cards), "line", "text", "muted", "accent", "accent-hover",
 * "accent-pressed", "on-accent", "danger", "danger-hover", "danger-pressed", "on-danger-pressed", "error",
 * "ok", "warning"; made of these for the states of controls: "raised-hover", "raised-pressed",
 * "text-disabled", "accent-disabled", "on-accent-disabled".
 *
 * Widgets opt into a look of their own by dynamic properties set to true: "danger" (buttons that delete),
 * "iconOnly" (push buttons of 32 pixels), "link" (push buttons in lists), "groupTitle", "caption",
 * "emptyState" and "stepNumber" (labels), "panel" (frames, tables, status bars), "card" and "separator"
 * (frames); and a push button by the object name "accentButton".
 */
class ZT_GUI_EXPORT QtAdvancedStylesheet : public QObject
{
    Q_OBJECT
public:
    static QtAdvancedStylesheet *getInstance(); ///< made at the first call

    /** "Dark" and "Light". */
    QStringList themes() const;
    /** "Dark" at first. */
    QString currentTheme() const { return m_theme; }
    /**
     * Switches the theme; false when there is no theme of this name. The application calls applyTo() again.
     */
    bool setCurrentTheme(const QString &theme);

    /**
     * The language of the interface: texts in Chinese, Japanese or Korean are drawn in a font with its forms
     * of the characters these share. The application calls applyTo() again.
     */
    void setLanguage(const QLocale &language);

    /** A colour of the current theme; invalid for a name that is none. */
    QColor color(const QString &token) const;
    /** The application-wide style sheet in the current theme. */
    QString styleSheet() const;
    /** The palette that goes with the style sheet. */
    QPalette palette() const;

    /**
     * Gives the application the current theme: style, palette, font (13 pixels) and style sheet. Widgets that
     * draw on paper set palette and font themselves.
     */
    void applyTo(QApplication *application) const;

    /** Names free fonts to use where "Segoe UI" is not installed. */
    static void substituteFonts();

signals:
    void currentThemeChanged(const QString &aTheme); ///< icons and own drawings have other colours now

private:
    QtAdvancedStylesheet();

    QString placeholderText(const QString &name) const;

    QString m_theme;
    QStringList m_bodyFamilies;
};

} // namespace acss
