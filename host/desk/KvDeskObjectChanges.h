// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"

#include <QObject>
#include <QSet>
#include <QTimer>

class ZtKernelObjectData;

/**
 * Gathers everything that changes measured objects or how their values read, and announces it at most once
 * per interval. An announcement is never put off by later changes.
 */
class KvDeskObjectChanges : public QObject
{
    Q_OBJECT
public:
    static constexpr int intervalMs = 50;

    /** What one announcement stands for. */
    struct Batch
    {
        QSet<KvDeskObjectId> objects;  ///< came, went or changed; one may stand for all that came of its type
        QSet<int> emptiedTypes;        ///< had no objects left for a while
        bool isReadingChanged = false; ///< all values read differently
    };

    explicit KvDeskObjectChanges(QObject *parent = nullptr);

    /** What signalChanged() announces, for as long as it does. */
    const Batch &batch() const { return m_announced; }

    /** Announces a change that is pending at once. */
    void flush();

signals:
    void signalChanged(); ///< objects came, went or changed, or their values read differently

private slots:
    void slotObjectTouched(int aType, int aId, const ZtKernelObjectData *aObject);
    void slotObjectRemoved(int aType, int aId);
    void slotReadingChanged();
    void slotValuesModified(QStringList aKeys, QList<QVariant> aVals);
    void slotAnnounce();

private:
    void connectSignals();
    void schedule();

    QTimer m_timer;
    Batch m_pending;
    Batch m_announced;
};
