// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvChartThemes.h"
#include "templates/KvBaseEditorNodeCfg.h"

/** Base of the configurations of all tables and charts: adds the colour theme. */
class KvStatisticsThemedNodeCfg : public KvBaseEditorNodeCfg
{
    Q_OBJECT
public:
    explicit KvStatisticsThemedNodeCfg(KvTemplateContext *context, QObject *parent = nullptr);

    /** Writes "theme": the name of the current theme. */
    bool toJson(QJsonObject &config) const override;
    /** Reads "theme" where it is a string. Always true. */
    bool fromJson(const QJsonObject &config) override;

    int themeIndex() const { return static_cast<int>(m_themes.theme()); }
    kvCharts::KvChartThemes *themes() { return &m_themes; }
    const kvCharts::KvChartThemes *themes() const { return &m_themes; }
    /** Selects a theme by its index; returns whether the selection changed. */
    bool setTheme(int index);

private:
    kvCharts::KvChartThemes m_themes;
};
