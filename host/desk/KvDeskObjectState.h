// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"

#include <QPolygonF>
#include <QString>
#include <QVector>

/** Everything about one object at one time, or that it was not there: what a step of the history goes back
 * to.
 */
struct KvDeskObjectState
{
    KvDeskObjectId object;
    bool exists = false;
    int row = -1; ///< in the table that brought the object; -1 for an object drawn on the image
    QPolygonF points;
    QString text;
    QString name; ///< of its own; empty for the one that objects have by themselves
    QVector<int> hiddenValues;

    /** The object as it is now. */
    static KvDeskObjectState of(const KvDeskObjectId &object);
    static KvDeskObjectState missing(const KvDeskObjectId &object);

    bool operator==(const KvDeskObjectState &other) const;
    bool operator!=(const KvDeskObjectState &other) const { return !(*this == other); }

    /** Makes the object of the kernel what it was, and announces that once. */
    void restore() const;

private:
    void create() const;
    void change() const;
    void hideValues() const;
};
