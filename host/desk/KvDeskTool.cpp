// SPDX-License-Identifier: MIT
#include "KvDeskTool.h"

#include <QKeyEvent>

namespace {

constexpr double largeStep = 10.0; ///< with Shift

} // namespace

KvDeskTool::~KvDeskTool() = default;

bool KvDeskTool::isClick(const QPointF &pressed, const QPointF &released)
{
    return (released - pressed).manhattanLength() < clickRoom;
}

QPointF KvDeskTool::arrowStep(const QKeyEvent &event)
{
    const double step = event.modifiers() & Qt::ShiftModifier ? largeStep : 1.0;
    switch (event.key()) {
    case Qt::Key_Left:
        return QPointF(-step, 0.0);
    case Qt::Key_Right:
        return QPointF(step, 0.0);
    case Qt::Key_Up:
        return QPointF(0.0, -step);
    case Qt::Key_Down:
        return QPointF(0.0, step);
    default:
        return QPointF();
    }
}
