// SPDX-License-Identifier: MIT
#include "KvDeskOverlay.h"

#include "KvDeskObjectShape.h"
#include "KvDeskRoughObjects.h"
#include "KvDeskSelection.h"
#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtObjectsPainter.h"

#include <QPainter>
#include <QtMath>

#include <algorithm>

namespace {

constexpr int mostLifted = 200;        ///< beyond that they are drawn with the others
constexpr int mostSelectedLabels = 50; ///< where there is no room for the labels of all objects
constexpr int zoomPause = 120;         ///< ms; the steps of a turning wheel follow each other faster
constexpr double lineRoom = 9.0;       ///< pixels by which lines and markers reach beyond an object's bounds

KvDeskObjectShape shapeOf(const KvDeskObjectId &object)
{
    return KvDeskObjectShape(object.type, ZtKernelData::getInstance()->object(object.type, object.id));
}

QVector<KvDeskObjectId> objectsOf(int type)
{
    QVector<KvDeskObjectId> result;
    const ZtObjectMap objects = ZtKernelData::getInstance()->objects().value(type);
    for (auto it = objects.constBegin(); it != objects.constEnd(); ++it)
        result.append({type, it.key()});
    return result;
}

} // namespace

KvDeskOverlay::KvDeskOverlay(QObject *parent)
    : QObject(parent)
{
    connect(&m_places, SIGNAL(signalChanged(int,int,QRectF,QRectF)), this,
                              SLOT(slotPlaceChanged(int,int,QRectF,QRectF)));
    connect(&m_places, SIGNAL(signalReset()), this, SLOT(slotReset()));
    m_sharpenTimer.setSingleShot(true);
    m_sharpenTimer.setInterval(zoomPause);
    connect(&m_sharpenTimer, SIGNAL(timeout()), this, SLOT(slotSharpen()));
}

void KvDeskOverlay::setPainter(const ZtObjectsPainter *painter)
{
    m_painter = painter;
    slotLabelsChanged();
}

void KvDeskOverlay::setSelection(KvDeskSelection *selection)
{
    if (m_selection)
        m_selection->disconnect(this);
    m_selection = selection;
    connect(selection, SIGNAL(signalSelectionChanged()), this, SLOT(slotSelectionChanged()));
    slotSelectionChanged();
}

void KvDeskOverlay::slotLabelsChanged()
{
    m_isTopStale = true;
    emit signalUpdated();
}

void KvDeskOverlay::slotReset()
{
    m_objects.invalidate();
    slotLabelsChanged();
}

// What the user changes right now is drawn above the picture of the others, which then stays as it is.
bool KvDeskOverlay::isLiftable(const KvDeskObjectId &object) const
{
    return m_selection && m_selection->objects().size() <= mostLifted && m_selection->contains(object);
}

void KvDeskOverlay::slotPlaceChanged(int aType, int aId, QRectF aBefore, QRectF aAfter)
{
    const KvDeskObjectId object{aType, aId};
    if (!m_objects.isLifted(object)) {
        m_objects.invalidate(aBefore);
        if (isLiftable(object) && !aAfter.isNull())
            m_objects.lift(object);
        else
            m_objects.invalidate(aAfter);
    } else if (aAfter.isNull()) {
        m_objects.settle(object, QRectF());
    }
    slotLabelsChanged();
}

void KvDeskOverlay::slotSelectionChanged()
{
    settle();
    slotLabelsChanged();
}

void KvDeskOverlay::slotSharpen()
{
    m_objects.sharpen();
    emit signalUpdated();
}

void KvDeskOverlay::settle()
{
    const QSet<KvDeskObjectId> lifted = m_objects.lifted();
    for (const KvDeskObjectId &object : lifted) {
        if (!isLiftable(object))
            m_objects.settle(object, m_places.index().rect(object));
    }
}

void KvDeskOverlay::draw(QPainter *painter, const QTransform &toView, const QSize &size, double pixelRatio)
{
    m_objects.draw(painter, m_places.index(), toView, size, pixelRatio);
    if (m_objects.isStretched() && (toView != m_topTransform || !m_sharpenTimer.isActive()))
        m_sharpenTimer.start();
    const QSize deviceSize(qCeil(size.width() * pixelRatio), qCeil(size.height() * pixelRatio));
    if (m_top.size() != deviceSize || m_top.devicePixelRatio() != pixelRatio) {
        m_top = QImage(deviceSize, QImage::Format_ARGB32_Premultiplied);
        m_top.setDevicePixelRatio(pixelRatio);
        m_isTopStale = true;
    }
    if (m_isTopStale || toView != m_topTransform)
        drawTop(toView, size);
    painter->save();
    painter->setWorldTransform(QTransform());
    painter->drawImage(QPointF(), m_top);
    painter->restore();
}

void KvDeskOverlay::drawTop(const QTransform &toView, const QSize &size)
{
    m_topTransform = toView;
    m_isTopStale = false;
    m_top.fill(Qt::transparent);
    QPainter painter(&m_top);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::TextAntialiasing);
    painter.setWorldTransform(toView);
    const QRectF page(QPointF(), size);
    const QRectF area = toView.inverted().mapRect(page.adjusted(-lineRoom, -lineRoom, lineRoom, lineRoom));
    const QVector<KvDeskObjectId> selected = selectedIn(area);
    if (selected.size() > KvDeskObjectLayer::mostInFull)
        drawSelectedRoughly(&painter, selected);
    else
        drawSelected(&painter, selected);
    if (!m_painter)
        return;
    QVector<ZtObjectsPainter::Object> labelled;
    for (const KvDeskObjectId &object : labelledIn(area, selected))
        labelled.append({object.type, object.id});
    ZtObjectsPainter::drawLabels(&painter, m_painter->labels(labelled, toView, page));
}

void KvDeskOverlay::drawSelected(QPainter *painter, const QVector<KvDeskObjectId> &selected) const
{
    for (const KvDeskObjectId &object : selected)
        shapeOf(object).drawHighlight(painter);
    for (const KvDeskObjectId &object : selected)
        ZtObjectsPainter::drawShape(painter, {object.type, object.id});
}

void KvDeskOverlay::drawSelectedRoughly(QPainter *painter, const QVector<KvDeskObjectId> &selected) const
{
    KvDeskRoughObjects objects(painter->worldTransform());
    for (const KvDeskObjectId &object : selected)
        objects.add(object, m_places.index().rect(object));
    const auto *const style = acss::QtAdvancedStylesheet::getInstance();
    objects.draw(painter, style->color(QStringLiteral("accent-hover")),
                 style->color(QStringLiteral("on-accent")));
}

QVector<KvDeskObjectId> KvDeskOverlay::selectedIn(const QRectF &area) const
{
    QVector<KvDeskObjectId> result;
    if (!m_selection)
        return result;
    const KvDeskObjectIndex &index = m_places.index();
    for (const KvDeskObjectId &object : m_selection->objects()) {
        if (index.contains(object) && KvDeskObjectIndex::touch(index.rect(object), area))
            result.append(object);
    }
    std::sort(result.begin(), result.end());
    return result;
}

QVector<KvDeskObjectId> KvDeskOverlay::labelledIn(const QRectF &area,
                                                  const QVector<KvDeskObjectId> &selected) const
{
    constexpr int most = ZtObjectsPainter::maximumLabels;
    QVector<KvDeskObjectId> others = m_places.index().objectsIn(area, most + 1);
    QVector<KvDeskObjectId> result = selected;
    if (others.size() > most) {
        result.resize(qMin(result.size(), mostSelectedLabels));
        others = textsIn(area);
    }
    for (const KvDeskObjectId &object : qAsConst(others)) {
        if (!m_selection || !m_selection->contains(object))
            result.append(object);
    }
    return result;
}

// Texts and scale bars, but no more than anybody reads.
QVector<KvDeskObjectId> KvDeskOverlay::textsIn(const QRectF &area) const
{
    const KvDeskObjectIndex &index = m_places.index();
    QVector<KvDeskObjectId> result;
    for (const KvDeskObjectId &object : objectsOf(ZtDrawnType::TextNote) + objectsOf(ZtDrawnType::ScaleBar)) {
        if (result.size() < ZtObjectsPainter::maximumLabels && index.contains(object) &&
            KvDeskObjectIndex::touch(index.rect(object), area))
            result.append(object);
    }
    return result;
}
