// SPDX-License-Identifier: MIT
#include "charts/KvCategoryList.h"

namespace kvCharts {

void KvCategoryList::add(const QString &text)
{
    int &index = m_indexes[text];
    if (m_indexes.size() == m_texts.size())
        return;
    index = m_texts.size();
    m_texts.append(text);
}

void KvCategoryList::clear()
{
    m_texts.clear();
    m_indexes.clear();
}

} // namespace kvCharts
