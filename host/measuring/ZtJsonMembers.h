// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QString>

#include <array>
#include <cstddef>
#include <initializer_list>

class ZtJsonReader;

/** Where an object has the members that somebody wants to know, in whatever order they come. */
class ZT_MEASURING_EXPORT ZtJsonMembers
{
public:
    static constexpr std::size_t mostKeys = 8;

    /** Looks through the object that \a reader stands at, and moves it behind. The \a keys, which are ASCII,
     * have to outlive this, as has the reader. */
    ZtJsonMembers(ZtJsonReader *reader, std::initializer_list<const QString *> keys);

    /** Moves the reader to the value of a member; false when there is none. */
    bool goTo(const QString &key) const;
    /** Moves the reader behind the object. */
    void leave() const;

private:
    struct Member
    {
        const QString *key = nullptr;
        std::size_t position = 0; ///< 0 for one that is missing
    };

    ZtJsonReader *m_reader;
    std::array<Member, mostKeys> m_members;
    std::size_t m_end = 0;
};
