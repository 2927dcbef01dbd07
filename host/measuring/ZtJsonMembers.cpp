// SPDX-License-Identifier: MIT
#include "measuring/ZtJsonMembers.h"

#include "measuring/ZtJsonReader.h"

#include <algorithm>

ZtJsonMembers::ZtJsonMembers(ZtJsonReader *reader, std::initializer_list<const QString *> keys)
    : m_reader(reader)
{
    Q_ASSERT(keys.size() <= mostKeys);
    std::transform(keys.begin(), keys.end(), m_members.begin(), [](const QString *key) {
        return Member{key, 0};
    });
    std::string_view key;
    std::string buffer;
    for (reader->enter(); reader->nextMember(&key, &buffer); reader->skip()) {
        const QLatin1String found(key.data(), static_cast<int>(key.size()));
        for (Member &member : m_members) {
            if (member.key && *member.key == found)
                member.position = reader->position();
        }
    }
    m_end = reader->position();
}

bool ZtJsonMembers::goTo(const QString &key) const
{
    for (const Member &member : m_members) {
        if (!member.key || *member.key != key || member.position == 0)
            continue;
        m_reader->seek(member.position);
        return true;
    }
    return false;
}

void ZtJsonMembers::leave() const
{
    m_reader->seek(m_end);
}
