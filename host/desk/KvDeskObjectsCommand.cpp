// SPDX-License-Identifier: MIT
#include "KvDeskObjectsCommand.h"

#include <algorithm>

namespace {

constexpr int commandId = 1;

void restore(const QVector<KvDeskObjectState> &states)
{
    for (const KvDeskObjectState &state : states)
        state.restore();
}

} // namespace

KvDeskObjectsCommand::KvDeskObjectsCommand(const QString &text, const QVector<KvDeskObjectState> &before,
                                           const QVector<KvDeskObjectState> &after, int gesture)
    : QUndoCommand(text)
    , m_before(before)
    , m_after(after)
    , m_gesture(gesture)
{}

void KvDeskObjectsCommand::undo()
{
    restore(m_before);
}

void KvDeskObjectsCommand::redo()
{
    restore(m_after);
}

int KvDeskObjectsCommand::id() const
{
    return m_gesture == 0 ? -1 : commandId;
}

bool KvDeskObjectsCommand::mergeWith(const QUndoCommand *other)
{
    const auto &later = static_cast<const KvDeskObjectsCommand &>(*other);
    if (later.m_gesture != m_gesture || later.text() != text() || !isOfSameObjects(later))
        return false;
    m_after = later.m_after;
    // Back where it began: nothing to undo.
    setObsolete(m_after == m_before);
    return true;
}

bool KvDeskObjectsCommand::isOfSameObjects(const KvDeskObjectsCommand &other) const
{
    const auto isSame = [](const KvDeskObjectState &a, const KvDeskObjectState &b) {
        return a.object == b.object;
    };
    return std::equal(m_after.begin(), m_after.end(), other.m_after.begin(), other.m_after.end(), isSame);
}
