// SPDX-License-Identifier: MIT
#pragma once

/** Names one measured object: its type and its id within the type. Made without arguments it names none. */
struct KvDeskObjectId
{
    int type = 0;
    int id = 0; ///< from 1; 0 for no object

    bool isNull() const { return id == 0; }
    bool operator==(const KvDeskObjectId &other) const { return type == other.type && id == other.id; }
    bool operator!=(const KvDeskObjectId &other) const { return !(*this == other); }
};
