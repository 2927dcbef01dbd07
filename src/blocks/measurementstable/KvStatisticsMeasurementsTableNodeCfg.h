// SPDX-License-Identifier: MIT
#pragma once

#include "templates/KvStatisticsThemedNodeCfg.h"

#include <QSet>
#include <QStringList>

/** What the user set for a measurements table: placement, columns, order of the rows. */
class KvStatisticsMeasurementsTableNodeCfg : public KvStatisticsThemedNodeCfg
{
    Q_OBJECT
public:
    /** The settings beside the theme. */
    struct Options
    {
        Qt::Alignment alignment = Qt::AlignHCenter | Qt::AlignVCenter;
        int widthPercent = 75; ///< of the width between the page's margins
        QSet<QString> columns; ///< may hold names that no column has; they show nothing and are kept
        QString orderColumn;   ///< column that the rows are sorted by; empty keeps the order of measurement
        bool orderAscending = true;

        bool operator==(const Options &other) const;
    };

    explicit KvStatisticsMeasurementsTableNodeCfg(KvTemplateContext *context, QObject *parent = nullptr);

    /** The column names in their fixed display order, untranslated: they are keys in files. */
    static const QStringList &columnNames();
    /** Translated label of a column name. */
    static QString columnLabel(const QString &name);

    bool toJson(QJsonObject &config) const override;
    /** Each key is optional. Always true. */
    bool fromJson(const QJsonObject &config) override;

    const Options &options() const { return m_options; }
    Qt::Alignment alignment() const { return m_options.alignment; }
    int widthPercent() const { return m_options.widthPercent; }
    QSet<QString> columns() const { return m_options.columns; }
    QString orderColumn() const { return m_options.orderColumn; }
    bool isOrderAscending() const { return m_options.orderAscending; }

    void setAlignment(Qt::Alignment alignment) { m_options.alignment = alignment; }
    void setWidthPercent(int percent) { m_options.widthPercent = percent; }
    void setColumns(const QSet<QString> &columns) { m_options.columns = columns; }
    void setOrder(const QString &column, bool ascending);

private:
    Options m_options;
};
