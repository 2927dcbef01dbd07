// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectIndex.h"

#include <QObject>

class ZtKernelObjectData;

/** Where all drawn objects lie on the image, kept in step with the kernel: one change costs the same however
 * many objects there are. */
class KvDeskObjectPlaces : public QObject
{
    Q_OBJECT
public:
    explicit KvDeskObjectPlaces(QObject *parent = nullptr);

    const KvDeskObjectIndex &index() const;

    /** The object drawn at a point, the topmost where there are several; none elsewhere. */
    KvDeskObjectId objectAt(const QPointF &point, double tolerance) const;
    /** Points of objects near a point, but for those of \a except. */
    QVector<QPointF> pointsNear(const QPointF &point, double distance, const KvDeskObjectId &except) const;
    /** The object that comes after another in the order of types and ids, or before it; from the last to the
     * first. */
    static KvDeskObjectId next(const KvDeskObjectId &object, bool isForward);

signals:
    /** An object came, went or changed: what is drawn there is out of date. */
    void signalChanged(int aType, int aId, QRectF aBefore, QRectF aAfter);
    void signalReset(); ///< many objects came or went, or take up another place

private slots:
    void slotObjectChanged(int aType, int aId, const ZtKernelObjectData *aObject);
    void slotObjectRemoved(int aType, int aId);
    void slotReset();

private:
    bool isInStep(int type) const;
    void rebuild() const;

    mutable KvDeskObjectIndex m_index;
    mutable QHash<int, int> m_counts; ///< objects of a type that were seen, with or without a place
    mutable bool m_isStale = true;
};
