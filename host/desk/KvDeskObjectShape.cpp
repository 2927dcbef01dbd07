// SPDX-License-Identifier: MIT
#include "KvDeskObjectShape.h"

#include "gui/QtAdvancedStylesheet.h"
#include "measuring/ZtDrawnManipulator.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnType.h"

#include <QPainter>
#include <QPainterPathStroker>

#include <algorithm>

namespace {

// Widths and radii in pixels of the view, whatever the zoom.
constexpr double borderWidth = 11.0;
constexpr double highlightWidth = 8.0;
constexpr double markerRadius = 9.0;

void stroke(QPainter *painter, const QPainterPath &path, const QColor &color, double width)
{
    painter->strokePath(path, QPen(color, width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
}

} // namespace

KvDeskObjectShape::KvDeskObjectShape(int type, const ZtKernelObjectData *data)
{
    const ZtDrawnType *const drawnType = ZtDrawnType::find(type);
    const auto *const drawn = dynamic_cast<const ZtDrawnObjectData *>(data);
    if (!drawnType || !drawn || !drawnType->acceptsPoints(drawn->points()))
        return;
    if (drawnType->outline)
        m_outline = ZtDrawnManipulator::outlineOf(*drawnType, drawn->points());
    else
        m_markers = drawn->points();
}

QRectF KvDeskObjectShape::boundingRect() const
{
    // Not united with one that is empty, as the bounds of a level line are.
    return m_markers.isEmpty() ? m_outline.boundingRect() : m_markers.boundingRect();
}

bool KvDeskObjectShape::isAt(const QPointF &point, double tolerance) const
{
    const QRectF near = boundingRect().adjusted(-tolerance, -tolerance, tolerance, tolerance);
    if (isEmpty() || !near.contains(point))
        return false;
    if (!m_markers.isEmpty())
        return isMarkerAt(point, tolerance);
    QPainterPathStroker stroker;
    stroker.setWidth(2.0 * tolerance);
    return stroker.createStroke(m_outline).contains(point);
}

bool KvDeskObjectShape::isMarkerAt(const QPointF &point, double tolerance) const
{
    return std::any_of(m_markers.begin(), m_markers.end(), [&](const QPointF &marker) {
        return (marker - point).manhattanLength() <= 2.0 * tolerance;
    });
}

void KvDeskObjectShape::drawHighlight(QPainter *painter) const
{
    QPainterPath path = painter->worldTransform().map(m_outline);
    const QPolygonF markers = painter->worldTransform().map(m_markers);
    for (const QPointF &marker : markers)
        path.addEllipse(marker, markerRadius, markerRadius);
    painter->save();
    painter->setWorldTransform(QTransform());
    painter->setRenderHint(QPainter::Antialiasing);
    const auto *const style = acss::QtAdvancedStylesheet::getInstance();
    stroke(painter, path, style->color(QStringLiteral("on-accent")), m_markers.isEmpty() ? borderWidth : 5.0);
    stroke(painter, path, style->color(QStringLiteral("accent-hover")),
           m_markers.isEmpty() ? highlightWidth : 3.0);
    painter->restore();
}
