// SPDX-License-Identifier: MIT
#pragma once

#include <QCoreApplication>
#include <QString>
#include <QVector>

class KvStatisticsEngine;
class ZtMeasuringDocument;

/** Statistics of one group of measured values. */
struct KvGroupStatistics
{
    QString objectType; ///< empty when grouped by measurement only
    QString valueName;
    QString unit; ///< unit of the numbers below; empty for values without
    int count = 0;
    double min = 0.0;
    double q1 = 0.0;
    double median = 0.0;
    double q3 = 0.0;
    double max = 0.0;
    double average = 0.0;
    double sigma = 0.0; ///< population standard deviation
    QString minText;    ///< as reports show them, each in its own automatic unit
    QString maxText;
    QString averageText;
    QString sigmaText;
};

/** Computes the statistics of all groups, and writes them as text, CSV or JSON. */
class KvStatsReport
{
    Q_DECLARE_TR_FUNCTIONS(KvStatsReport)

public:
    /**
     * The numbers are in the unit in which a table gave the values. Values that were drawn, or that a table
     * gave in several units, are in one unit that suits the whole group.
     */
    KvStatsReport(const KvStatisticsEngine &engine, const ZtMeasuringDocument &document, bool groupByObject);

    const QVector<KvGroupStatistics> &groups() const { return m_groups; }

    QString toText() const;
    QString toCsv() const;
    QByteArray toJson() const;

private:
    void addGroup(const KvStatisticsEngine &engine, const ZtMeasuringDocument &document,
                  const QString &objectType, const QString &valueName);

    bool m_groupByObject;
    QVector<KvGroupStatistics> m_groups;
};
