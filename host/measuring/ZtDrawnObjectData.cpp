// SPDX-License-Identifier: MIT
#include "measuring/ZtDrawnObjectData.h"

ZtDrawnObjectData::ZtDrawnObjectData(const QPolygonF &points, const QString &text)
    : m_points(points)
    , m_text(text)
{}
