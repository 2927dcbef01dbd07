// SPDX-License-Identifier: MIT
#include "report/KvPageFlow.h"

namespace {
constexpr int kGap = 1; // pixels between two pieces
}

KvPageFlow::KvPageFlow(PageProvider pages)
    : m_pages(std::move(pages))
{
    startPage(0);
}

void KvPageFlow::startPage(int page)
{
    m_page = page;
    m_content = m_pages(page);
    m_point = m_content.topLeft();
}

KvPlacedPiece KvPageFlow::place(int height)
{
    KvPlacedPiece placed{m_page, m_point};
    m_point.ry() += height + kGap;
    // QRect::bottom() is the last row inside.
    if (m_point.y() > m_content.bottom()) {
        startPage(m_page + 1);
        placed = {m_page, m_point};
        m_point.ry() += height + kGap;
    }
    return placed;
}

KvPlacedPiece KvPageFlow::placeMark(int height)
{
    const KvPlacedPiece placed{m_page, m_point};
    m_point.ry() += height;
    return placed;
}

QVector<KvPlacedPiece> KvPageFlow::place(const QVector<int> &heights, const PageProvider &pages)
{
    KvPageFlow flow(pages);
    QVector<KvPlacedPiece> placed;
    placed.reserve(heights.size());
    for (const int height : heights)
        placed.append(flow.place(height));
    return placed;
}
