// SPDX-License-Identifier: MIT
#pragma once

#include <QColor>
#include <QObject>
#include <QString>
#include <QVector>

namespace kvCharts {

/** The two colour themes of charts and tables, and which of them is current. Owned by a block's
 * configuration. */
class KvChartThemes : public QObject
{
    Q_OBJECT
public:
    enum ThemeType : int { Dark = 0, Light = 1 };
    Q_ENUM(ThemeType)

    /** Index of a colour in colors(). */
    enum ColorRole {
        ChartBackground = 0,
        PartLabelText = 1,
        LegendText = 2, ///< legend and chart title
        TickLabelText = 3,
        RedAccent = 4,
        GreenAccent = 5,
        AxisLine = 6, ///< also the outline of boxes
        GridLine = 7,
        TableGridLine = 8,
        TableBackground = 9, ///< cells without a background of their own
        TableText = 10,      ///< cells without a text colour of their own
        ColorRoleCount = 11
    };

    explicit KvChartThemes(QObject *parent = nullptr);

    /** The current theme; -1 after an unknown theme name. */
    ThemeType theme() const { return m_theme; }
    /** The colours of the current theme by ColorRole; the Dark ones for anything but Light. */
    const QVector<QColor> &colors() const;
    QColor color(ColorRole role) const { return colors().at(role); }

    /** Selects a theme; returns whether it changed. */
    bool setTheme(kvCharts::KvChartThemes::ThemeType theme);
    /** Selects a theme by its name ("Dark", "Light"). Any other text stores -1, which shows the Dark colours.
     */
    void setTheme(const QString &name);
    /** The name of the current theme; empty for an unknown one. */
    QString themeName() const;

signals:
    void signalThemeChanged();

private:
    ThemeType m_theme = Dark;
    QVector<QColor> m_darkColors;
    QVector<QColor> m_lightColors;
};

} // namespace kvCharts
