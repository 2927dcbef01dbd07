// SPDX-License-Identifier: MIT
#pragma once

#include <QHash>

/** Names one measured object: its type and its id within the type. Made without arguments it names none. */
struct KvDeskObjectId
{
    int type = 0;
    int id = 0; ///< from 1; 0 for no object

    bool isNull() const { return id == 0; }
    bool operator==(const KvDeskObjectId &other) const { return type == other.type && id == other.id; }
    bool operator!=(const KvDeskObjectId &other) const { return !(*this == other); }
    /** The order in which objects are drawn, the topmost last. */
    bool operator<(const KvDeskObjectId &other) const
    {
        return type != other.type ? type < other.type : id < other.id;
    }
};

Q_DECLARE_TYPEINFO(KvDeskObjectId, Q_PRIMITIVE_TYPE);

inline uint qHash(const KvDeskObjectId &object, uint seed = 0)
{
    return qHash((static_cast<quint64>(static_cast<quint32>(object.type)) << 32) |
                     static_cast<quint32>(object.id),
                 seed);
}
