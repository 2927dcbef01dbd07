// SPDX-License-Identifier: MIT
#pragma once

#include "data/KvMeasuredValue.h"

#include <QMap>
#include <QObject>
#include <QPair>
#include <QPointF>
#include <QPointer>
#include <QStringList>
#include <QVector>

class KvReportKernelData;

/** Records of one kind, in measurement order. */
using KvValueGroup = QVector<KvMeasuredValue>;

/**
 * Groups the measured records and computes statistics over groups. One engine per process; its maps are empty
 * until the data source first reports its records, and are rebuilt whole with every report.
 *
 * Groups are ordered by plain string comparison of their names (UTF-16 units, case-sensitive).
 */
class KvStatisticsEngine : public QObject
{
    Q_OBJECT
public:
    static KvStatisticsEngine &instance();

    /** The source of the records, not owned; replaces (and disconnects) the one before. Null is allowed. */
    void setKernelData(KvReportKernelData *kernelData);
    KvReportKernelData *kernelData() const;

    QStringList valueNames() const { return m_byValueName.keys(); }
    /** All records of a value name; a shared empty group for an unknown name. */
    const KvValueGroup &values(const QString &valueName) const;

    QStringList objectTypeNames() const { return m_byObjectType.keys(); }
    /** The value names of one object type. */
    QStringList valueNames(const QString &objectTypeName) const;
    /** The records of a value name of one object type; a shared empty group when there are none. */
    const KvValueGroup &values(const QString &objectTypeName, const QString &valueName) const;

    const QMap<QString, KvValueGroup> &byValueName() const { return m_byValueName; }
    const QMap<QString, QMap<QString, KvValueGroup>> &byObjectType() const { return m_byObjectType; }

    /** A record's value as a number; 0 for what is not numeric by its type (texts and booleans included). */
    static double numericValue(const QVariant &value);

    /** Mean of the group, each term divided by n before it is added; 0 for an empty group. */
    static double average(const KvValueGroup &group);
    /** Population standard deviation (divisor n) about \a mean; 0 for an empty group. */
    static double sigma(double mean, const KvValueGroup &group);
    /** Minimum, lower quartile, median, upper quartile, maximum; false (outputs untouched) for an empty
     * group. */
    static bool fiveNumbers(const KvValueGroup &group, double &min, double &q1, double &median, double &q3,
                            double &max);
    /** Least and greatest value by QVariant's ordering; the host's value types are kept. The group is not
     * empty. */
    static QPair<QVariant, QVariant> range(const KvValueGroup &group);
    /**
     * Least-squares line through (x, y) points as (slope, intercept); (0, 0) for fewer than two points.
     * Points of equal x divide by zero: the result is then not finite, which callers that draw have to look
     * at.
     */
    static QPair<double, double> regression(const QVector<QPointF> &points);
    /** Smallest of 1, 2, 5, 10, 25, 50, 100, 250, 500, ... that lies in low..high; 0 when none does. */
    static int niceStep(double low, double high);

signals:
    void signalMeasurementsListUpdating();
    void signalMeasurementsListUpdated();

public slots:
    void slotMeasurementsListUpdated();

private:
    KvStatisticsEngine() = default;
    Q_DISABLE_COPY(KvStatisticsEngine)

    QPointer<KvReportKernelData> m_kernelData;
    QMap<QString, KvValueGroup> m_byValueName;
    QMap<QString, QMap<QString, KvValueGroup>> m_byObjectType;
};
