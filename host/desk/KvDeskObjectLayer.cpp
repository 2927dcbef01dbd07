// SPDX-License-Identifier: MIT
#include "KvDeskObjectLayer.h"

#include "KvDeskObjectIndex.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtObjectsPainter.h"

#include <QPainter>

#include <cmath>

namespace {

constexpr int lineRoom = 9;        ///< pixels by which lines and markers reach beyond an object's bounds
constexpr double roughStays = 0.8; ///< of the most objects in full
constexpr int mostRectangles = 48; ///< beyond that it is quicker to draw everything between them, too

QSize devicePixels(const QSize &size, double pixelRatio)
{
    return QSize(qCeil(size.width() * pixelRatio), qCeil(size.height() * pixelRatio));
}

bool isWhole(double number)
{
    return std::abs(number - std::round(number)) < 1e-6;
}

int pointCount(const KvDeskObjectId &object)
{
    const auto *const data =
        dynamic_cast<const ZtDrawnObjectData *>(ZtKernelData::getInstance()->object(object.type, object.id));
    return data ? data->points().size() : 0;
}

} // namespace

void KvDeskObjectLayer::invalidate()
{
    m_isStale = true;
    m_dirty = QRegion();
}

void KvDeskObjectLayer::invalidate(const QRectF &sceneRect)
{
    if (m_isStale || sceneRect.isNull())
        return;
    // Computed in floating point first: far outside of the view there are no pixels.
    const QRectF onView = m_toView.mapRect(sceneRect).adjusted(-lineRoom, -lineRoom, lineRoom, lineRoom);
    const QRectF view(QPointF(), QSizeF(m_image.size()) / m_image.devicePixelRatio());
    m_dirty += (onView & view).toAlignedRect();
    if (m_dirty.rectCount() > mostRectangles)
        m_dirty = m_dirty.boundingRect();
}

void KvDeskObjectLayer::settle(const KvDeskObjectId &object, const QRectF &sceneRect)
{
    if (m_lifted.remove(object))
        invalidate(sceneRect);
}

void KvDeskObjectLayer::prepare(const QTransform &toView, const QSize &size, double pixelRatio)
{
    const QSize deviceSize = devicePixels(size, pixelRatio);
    if (m_image.size() != deviceSize || m_image.devicePixelRatio() != pixelRatio) {
        m_image = QImage(deviceSize, QImage::Format_ARGB32_Premultiplied);
        m_image.setDevicePixelRatio(pixelRatio);
        m_isStale = true;
    }
    const bool isSamePlace = toView == m_toView;
    if (!m_isStale && !isSamePlace && !scroll(toView))
        m_isStale = true;
    m_toView = toView;
    if (m_isStale)
        m_dirty = QRect(QPoint(), size);
    m_isStale = false;
}

void KvDeskObjectLayer::sharpen()
{
    if (m_isStretched)
        invalidate();
}

bool KvDeskObjectLayer::isStretchable(const QTransform &toView, const QSize &size, double pixelRatio) const
{
    const bool isOtherScale = toView.m11() != m_toView.m11() || toView.m22() != m_toView.m22();
    return m_isRough && !m_isStale && isOtherScale && m_image.devicePixelRatio() == pixelRatio &&
           m_image.size() == devicePixels(size, pixelRatio);
}

void KvDeskObjectLayer::drawStretched(QPainter *painter, const QTransform &toView) const
{
    painter->save();
    painter->setRenderHint(QPainter::SmoothPixmapTransform, false);
    painter->setWorldTransform(m_toView.inverted() * toView);
    painter->drawImage(QPointF(), m_image);
    painter->restore();
}

bool KvDeskObjectLayer::scroll(const QTransform &toView)
{
    const double ratio = m_image.devicePixelRatio();
    const double x = (toView.dx() - m_toView.dx()) * ratio;
    const double y = (toView.dy() - m_toView.dy()) * ratio;
    const bool isShift = toView.m11() == m_toView.m11() && toView.m22() == m_toView.m22();
    if (!isShift || !isWhole(x) || !isWhole(y) || !isWhole(x / ratio) || !isWhole(y / ratio) ||
        std::abs(x) >= m_image.width() || std::abs(y) >= m_image.height())
        return false;
    const QPoint shift(qRound(x / ratio), qRound(y / ratio));
    QImage moved(m_image.size(), m_image.format());
    moved.setDevicePixelRatio(ratio);
    QPainter painter(&moved);
    painter.setCompositionMode(QPainter::CompositionMode_Source);
    painter.drawImage(shift, m_image);
    painter.end();
    m_image = moved;
    const QRect view(QPoint(), QSizeF(QSizeF(m_image.size()) / ratio).toSize());
    m_dirty = m_dirty.translated(shift) & view;
    m_dirty += QRegion(view).subtracted(view.translated(shift));
    return true;
}

void KvDeskObjectLayer::draw(QPainter *painter, const KvDeskObjectIndex &index, const QTransform &toView,
                             const QSize &size, double pixelRatio)
{
    m_isStretched = isStretchable(toView, size, pixelRatio);
    if (m_isStretched) {
        drawStretched(painter, toView);
        return;
    }
    prepare(toView, size, pixelRatio);
    if (!m_dirty.isEmpty())
        chooseRoughness(index);
    for (const QRect &rect : m_dirty)
        redraw(index, rect);
    m_dirty = QRegion();
    painter->save();
    painter->setWorldTransform(QTransform());
    painter->drawImage(QPointF(), m_image);
    painter->restore();
}

// The part of the scene whose objects may be seen in a rectangle of the view.
QRectF KvDeskObjectLayer::areaOf(const QRectF &rect) const
{
    return m_toView.inverted().mapRect(rect.adjusted(-lineRoom, -lineRoom, lineRoom, lineRoom));
}

void KvDeskObjectLayer::chooseRoughness(const KvDeskObjectIndex &index)
{
    const QRectF view(QPointF(), QSizeF(m_image.size()) / m_image.devicePixelRatio());
    // What is drawn anew anyway is drawn in full where that is quick enough. Else a rough picture stays until
    // there is clearly less to see: one object that comes and goes would change all of it each time.
    const bool isAnew = m_dirty.boundingRect().contains(view.toRect()) && m_dirty.rectCount() == 1;
    const double share = m_isRough && !isAnew ? roughStays : 1.0;
    const int mostObjects = qRound(share * mostInFull);
    const int mostPoints = qRound(share * mostPointsInFull);
    int objects = 0;
    int points = 0;
    index.visit(areaOf(view), [&](const KvDeskObjectIndex::Entry &entry) {
        ++objects;
        points += pointCount(entry.object);
        return objects <= mostObjects && points <= mostPoints;
    });
    const bool isRough = objects > mostObjects || points > mostPoints;
    if (isRough != m_isRough)
        m_dirty = view.toAlignedRect();
    m_isRough = isRough;
}

void KvDeskObjectLayer::redraw(const KvDeskObjectIndex &index, const QRect &rect)
{
    QPainter painter(&m_image);
    painter.setClipRect(rect);
    painter.setCompositionMode(QPainter::CompositionMode_Source);
    painter.fillRect(rect, Qt::transparent);
    painter.setCompositionMode(QPainter::CompositionMode_SourceOver);
    painter.setWorldTransform(m_toView);
    if (m_isRough)
        drawRoughly(&painter, index, areaOf(rect));
    else
        drawInFull(&painter, index, areaOf(rect));
}

void KvDeskObjectLayer::drawInFull(QPainter *painter, const KvDeskObjectIndex &index, const QRectF &area)
{
    for (const KvDeskObjectId &object : index.objectsIn(area)) {
        if (m_lifted.contains(object))
            continue;
        ZtObjectsPainter::drawShape(painter, {object.type, object.id});
        ++m_drawnObjects;
    }
}

void KvDeskObjectLayer::drawRoughly(QPainter *painter, const KvDeskObjectIndex &index, const QRectF &area)
{
    m_rough.restart(m_toView);
    index.visit(area, [&](const KvDeskObjectIndex::Entry &entry) {
        if (m_lifted.isEmpty() || !m_lifted.contains(entry.object))
            m_rough.add(entry.object, entry.rect);
        ++m_drawnObjects;
        return true;
    });
    m_rough.draw(painter);
}
