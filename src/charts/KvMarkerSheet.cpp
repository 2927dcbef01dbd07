// SPDX-License-Identifier: MIT
#include "charts/KvMarkerSheet.h"

#include <QPaintEngine>
#include <QPainter>

#include <cmath>

namespace kvCharts {

namespace {

constexpr int kSteps = 32; // in a pixel, to each side
constexpr int kPicturesRepaid = 2 * kSteps * kSteps;
constexpr int kLargestCell = 32;          // pixels; larger markers are too few to matter
constexpr double kLargestPlace = 1 << 20; // pixels; farther than any device reaches

} // namespace

KvMarkerSheet::KvMarkerSheet(const QPainter &painter, const QRectF &marker)
    : m_transform(painter.deviceTransform())
    , m_cell(cellAround(painter, marker))
    , m_sheet(m_cell.size() * kSteps, QImage::Format_ARGB32_Premultiplied)
{
    m_sheet.fill(Qt::transparent);
    QPainter sheetPainter(&m_sheet);
    sheetPainter.setRenderHints(painter.renderHints());
    sheetPainter.setPen(painter.pen());
    sheetPainter.setBrush(painter.brush());
    paintCells(&sheetPainter, marker);
}

bool KvMarkerSheet::isWorthwhile(const QPainter &painter, const QRectF &marker, int count)
{
    if (count < kPicturesRepaid || painter.paintEngine()->type() != QPaintEngine::Raster)
        return false;
    if (painter.opacity() < 1.0 || painter.compositionMode() != QPainter::CompositionMode_SourceOver)
        return false;
    if (painter.deviceTransform().type() > QTransform::TxScale || !painter.deviceTransform().isInvertible())
        return false;
    // A brush that is not plain would start anew in each picture.
    if (painter.brush().style() != Qt::SolidPattern || !painter.pen().isCosmetic())
        return false;
    const QRectF device = painter.deviceTransform().mapRect(marker);
    if (device.width() > kLargestCell || device.height() > kLargestCell)
        return false;
    const QSize cell = cellAround(painter, marker).size();
    return cell.width() <= kLargestCell && cell.height() <= kLargestCell;
}

void KvMarkerSheet::draw(QPainter *painter, const QVector<QPointF> &points) const
{
    painter->save();
    // To device pixels, also where the device has a scale or an offset of its own.
    painter->setTransform(m_transform.inverted() * painter->transform());
    for (const QPointF &point : points) {
        const QPointF place = m_transform.map(point);
        if (std::abs(place.x()) > kLargestPlace || std::abs(place.y()) > kLargestPlace)
            continue;
        const int x = static_cast<int>(std::lround(place.x() * kSteps));
        const int y = static_cast<int>(std::lround(place.y() * kSteps));
        const QPoint pixel(x >= 0 ? x / kSteps : (x + 1) / kSteps - 1,
                           y >= 0 ? y / kSteps : (y + 1) / kSteps - 1);
        const QPoint step = QPoint(x, y) - pixel * kSteps;
        const QPoint cell(step.x() * m_cell.width(), step.y() * m_cell.height());
        painter->drawImage(pixel + m_cell.topLeft(), m_sheet, QRect(cell, m_cell.size()));
    }
    painter->restore();
}

// With half a pen to all sides, a pixel for the smooth edge and one for the steps within the pixel.
QRect KvMarkerSheet::cellAround(const QPainter &painter, const QRectF &marker)
{
    const QTransform &transform = painter.deviceTransform();
    const qreal reach = painter.pen().widthF() / 2 + 1;
    const QRectF device = transform.mapRect(marker).translated(-transform.dx(), -transform.dy());
    return device.adjusted(-reach, -reach, reach + 1, reach + 1).toAlignedRect();
}

void KvMarkerSheet::paintCells(QPainter *painter, const QRectF &marker)
{
    const QPointF origin = -m_cell.topLeft();
    for (int y = 0; y < kSteps; ++y) {
        for (int x = 0; x < kSteps; ++x) {
            const QPointF cell(x * m_cell.width(), y * m_cell.height());
            const QPointF place = cell + origin + QPointF(x, y) / kSteps;
            painter->setTransform(
                QTransform(m_transform.m11(), 0, 0, m_transform.m22(), place.x(), place.y()));
            painter->drawEllipse(marker);
        }
    }
}

} // namespace kvCharts
