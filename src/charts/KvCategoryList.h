// SPDX-License-Identifier: MIT
#pragma once

#include <QHash>
#include <QStringList>

namespace kvCharts {

/** Category texts in the order of their first use, each once, found again in constant time. */
class KvCategoryList
{
public:
    /** Appends a text that the list does not hold yet. */
    void add(const QString &text);
    void clear();

    /** Place of a text, told apart by case; -1 when the list does not hold it. */
    int indexOf(const QString &text) const { return m_indexes.value(text, -1); }
    int size() const { return m_texts.size(); }
    const QStringList &texts() const { return m_texts; }

private:
    QStringList m_texts;
    QHash<QString, int> m_indexes;
};

} // namespace kvCharts
