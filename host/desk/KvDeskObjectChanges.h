// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QTimer>

/**
 * Gathers everything that changes measured objects or how their values read, and announces it at most once
 * per interval. An announcement is never put off by later changes.
 */
class KvDeskObjectChanges : public QObject
{
    Q_OBJECT
public:
    static constexpr int intervalMs = 50;

    explicit KvDeskObjectChanges(QObject *parent = nullptr);

    /** Announces a change that is pending at once. */
    void flush();

signals:
    void signalChanged(); ///< objects came, went or changed, or their values read differently

private slots:
    void slotValuesModified(QStringList aKeys, QList<QVariant> aVals);
    void slotSchedule();

private:
    void connectSignals();

    QTimer m_timer;
};
