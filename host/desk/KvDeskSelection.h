// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskObjectId.h"

#include <QObject>
#include <QSet>

/**
 * The objects that the user selected, on the image or in the table, and the one among them that the user
 * touched last. Objects that are removed are forgotten.
 */
class KvDeskSelection : public QObject
{
    Q_OBJECT
public:
    explicit KvDeskSelection(QObject *parent = nullptr);

    const QSet<KvDeskObjectId> &objects() const { return m_objects; }
    /** One of objects(); none exactly when there are none. */
    KvDeskObjectId current() const { return m_current; }
    bool contains(const KvDeskObjectId &object) const { return m_objects.contains(object); }
    bool isEmpty() const { return m_objects.isEmpty(); }

    /** A \a current that is not among \a objects is replaced by one that is. */
    void set(const QSet<KvDeskObjectId> &objects, KvDeskObjectId current);
    /** Selects one object alone; one that is null, none. */
    void select(KvDeskObjectId object);
    void toggle(KvDeskObjectId object);
    void clear();

signals:
    void signalSelectionChanged();

private slots:
    void slotObjectRemoved(int aType, int aId);

private:
    void forgetType(int type);

    QSet<KvDeskObjectId> m_objects;
    KvDeskObjectId m_current;
};
