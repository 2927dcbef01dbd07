// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvStatisticsThemedNodeCfg.h"

#include <QSet>
#include <QStringList>

/** What the user set for a statistics table: placement, grouping, shown statistics. */
class KvStatisticsStatsTableNodeCfg : public KvStatisticsThemedNodeCfg
{
    Q_OBJECT
public:
    /** How the measured values are grouped; one group is one row. The numbers are stored in files. */
    enum GroupBy : int {
        ByMeasurement = 0, ///< by the name of the value
        ByObject = 1       ///< by the type of the object, then by the name of the value
    };
    Q_ENUM(GroupBy)

    /** The settings beside the theme. */
    struct Options
    {
        /// Without the vertical flag that measurements tables have: both are what files hold.
        Qt::Alignment alignment = Qt::AlignHCenter;
        GroupBy groupBy = ByObject; ///< a number that a file gave is kept, whatever it is
        int widthPercent = 75;      ///< of the width between the page's margins
        QSet<QString> columns;      ///< may hold names that no statistic has; they show nothing and are kept

        bool operator==(const Options &other) const;
    };

    explicit KvStatisticsStatsTableNodeCfg(KvTemplateContext *context, QObject *parent = nullptr);

    /** The names of the statistics in their fixed display order, untranslated: they are keys in files. */
    static const QStringList &columnNames();
    /** Translated label of a statistic. */
    static QString columnLabel(const QString &name);

    bool toJson(QJsonObject &config) const override;
    /**
     * All or nothing: false, with everything left as it was, unless "alignment", "groupBy", "widthPercent"
     * and "columns" are there. One that is there with another type keeps its current value.
     */
    bool fromJson(const QJsonObject &config) override;

    const Options &options() const { return m_options; }
    Qt::Alignment alignment() const { return m_options.alignment; }
    GroupBy groupBy() const { return m_options.groupBy; }
    int widthPercent() const { return m_options.widthPercent; }
    QSet<QString> columns() const { return m_options.columns; }

    void setAlignment(Qt::Alignment alignment) { m_options.alignment = alignment; }
    void setGroupBy(GroupBy groupBy) { m_options.groupBy = groupBy; }
    void setWidthPercent(int percent) { m_options.widthPercent = percent; }
    void setColumns(const QSet<QString> &columns) { m_options.columns = columns; }

private:
    Options m_options;
};
