// SPDX-License-Identifier: MIT
#include "KvDeskImageView.h"

#include "KvDeskEmptyState.h"
#include "KvDeskObjectShape.h"
#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtKernelImage.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QGraphicsScene>
#include <QGuiApplication>
#include <QMouseEvent>
#include <QScrollBar>

#include <cmath>

namespace {

constexpr double zoomStep = 1.25;      ///< of one notch of the wheel and of one command
constexpr double wheelNotch = 120.0;   ///< what a wheel reports for one notch
constexpr double fitMargin = 16.0;     ///< pixels around an image that is fitted
constexpr double largestFitZoom = 8.0; ///< tiny images are not blown up further
constexpr double clickTolerance = 6.0; ///< pixels beside an object that still hit it

QRectF united(const QRectF &a, const QRectF &b)
{
    // Bounds of points and level lines are empty for QRectF, yet there is something.
    if (a.isNull())
        return b;
    if (b.isNull())
        return a;
    return QRectF(QPointF(qMin(a.left(), b.left()), qMin(a.top(), b.top())),
                  QPointF(qMax(a.right(), b.right()), qMax(a.bottom(), b.bottom())));
}

} // namespace

KvDeskImageView::KvDeskImageView(QWidget *parent)
    : QGraphicsView(parent)
{
    setScene(new QGraphicsScene(this));
    // An image is never mirrored.
    setLayoutDirection(Qt::LeftToRight);
    setFrameShape(QFrame::NoFrame);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setTransformationAnchor(NoAnchor);
    setResizeAnchor(AnchorViewCenter);
    // Labels move with the borders of the view.
    setViewportUpdateMode(FullViewportUpdate);
    setMouseTracking(true);
    setFocusPolicy(Qt::StrongFocus);
    // Files are dropped on the window.
    setAcceptDrops(false);
    viewport()->setAcceptDrops(false);
    setAccessibleName(tr("Image"));

    m_emptyState = new KvDeskEmptyState(tr("Open an image or a session to start"), viewport());
    m_emptyState->setLayoutDirection(QGuiApplication::layoutDirection());
    connectSignals();
}

KvDeskImageView::~KvDeskImageView() = default;

void KvDeskImageView::connectSignals()
{
    connect(&m_changes, SIGNAL(signalChanged()), this, SLOT(slotObjectsChanged()));
    connect(acss::QtAdvancedStylesheet::getInstance(), SIGNAL(currentThemeChanged(QString)), this,
                                                              SLOT(slotThemeChanged()));
}

void KvDeskImageView::setDocument(ZtMeasuringDocument *document)
{
    m_document = document;
    connect(document, SIGNAL(signalImageChanged()), this, SLOT(slotImageChanged()));
    // Direct: aHandled is a reference that the host reads when the emission returns.
    connect(document->kernelImage(), SIGNAL(signalImageCompleted(FrameData,bool&)), this,
                                            SLOT(slotImageCompleted(FrameData,bool&)), Qt::DirectConnection);
    slotImageChanged();
    document->kernelImage()->requestImage();
    refreshContent();
}

void KvDeskImageView::slotImageChanged()
{
    m_isFitted = true;
    if (m_document->frameSource())
        return; // its first frame follows
    m_frame.clear();
    refreshContent();
    emit signalFrameChanged();
}

void KvDeskImageView::slotImageCompleted(FrameData aFrameData, bool &aHandled)
{
    aHandled = true;
    if (!aFrameData.image || aFrameData.image->isNull() || aFrameData.scale <= 0.0)
        return;
    const QImage image = aFrameData.image->getQImage();
    const QRectF place(QPointF(aFrameData.rect.topLeft()) / aFrameData.scale,
                       QSizeF(image.size()) / aFrameData.scale);
    // Others may ask for the frame that is shown already.
    if (m_frame.isSame(image, place))
        return;
    const bool isOtherSize = place != m_frame.sceneRect();
    m_frame.set(image, place);
    if (isOtherSize)
        refreshContent();
    viewport()->update();
    emit signalFrameChanged();
}

void KvDeskImageView::slotObjectsChanged()
{
    refreshContent();
    viewport()->update();
}

void KvDeskImageView::slotThemeChanged()
{
    viewport()->update();
}

void KvDeskImageView::refreshContent()
{
    const QRectF objects = objectsRect();
    m_emptyState->setVisible(m_frame.isNull() && objects.isNull());
    const QRectF content = m_frame.isNull() ? objects : united(m_frame.sceneRect(), objects);
    if (content == m_content && !m_isFitted)
        return;
    m_content = content;
    if (m_isFitted)
        fit();
    else
        updateSceneRect();
}

QRectF KvDeskImageView::objectsRect() const
{
    QRectF bounds;
    const QMap<int, ZtObjectMap> &all = ZtKernelData::getInstance()->objects();
    for (const ZtDrawnType &type : ZtDrawnType::all()) {
        const ZtObjectMap objects = all.value(type.id);
        for (const ZtKernelObjectData *object : objects)
            bounds = united(bounds, KvDeskObjectShape(type.id, object).boundingRect());
    }
    return bounds;
}

double KvDeskImageView::zoom() const
{
    return transform().m11() * devicePixelRatioF();
}

void KvDeskImageView::slotZoomIn()
{
    zoomAt(zoomStep, viewportCentre());
}

void KvDeskImageView::slotZoomOut()
{
    zoomAt(1.0 / zoomStep, viewportCentre());
}

void KvDeskImageView::slotZoomFit()
{
    m_isFitted = true;
    fit();
}

void KvDeskImageView::slotZoomActual()
{
    zoomAt(1.0 / zoom(), viewportCentre());
}

void KvDeskImageView::zoomAt(double factor, const QPointF &anchor)
{
    if (m_content.isNull())
        return;
    m_isFitted = false;
    const QPointF before = toScene(anchor);
    setScale(qBound(minimumZoom, zoom() * factor, maximumZoom) / devicePixelRatioF());
    place(before, anchor);
}

void KvDeskImageView::setScale(double scale)
{
    const bool isChange = !qFuzzyCompare(scale, transform().m11());
    if (isChange)
        setTransform(QTransform::fromScale(scale, scale));
    updateSceneRect();
    if (isChange)
        emit signalZoomChanged(zoom());
}

void KvDeskImageView::fit()
{
    const double width = qMax(1.0, viewport()->width() - 2.0 * fitMargin);
    const double height = qMax(1.0, viewport()->height() - 2.0 * fitMargin);
    // Objects that lie outside of the image do not make it smaller.
    const QRectF target = m_frame.isNull() ? m_content : m_frame.sceneRect();
    const double scale =
        target.isNull() ? 1.0 : qMin(width / qMax(1.0, target.width()), height / qMax(1.0, target.height()));
    const double ratio = devicePixelRatioF();
    setScale(qBound(minimumZoom, scale * ratio, largestFitZoom) / ratio);
    place(target.center(), viewportCentre());
}

// The image can be moved until its border is in the middle of the view, so that the wheel keeps every point
// in place.
void KvDeskImageView::updateSceneRect()
{
    const double scale = transform().m11();
    const double x = 0.5 * viewport()->width() / scale;
    const double y = 0.5 * viewport()->height() / scale;
    setSceneRect(m_content.adjusted(-x, -y, x, y));
}

// Unlike centerOn(), which always rounds down: a few steps of the wheel would move the image visibly.
void KvDeskImageView::place(const QPointF &scenePoint, const QPointF &position)
{
    const QPointF scrolled = transform().map(scenePoint) - position;
    horizontalScrollBar()->setValue(qRound(scrolled.x()));
    verticalScrollBar()->setValue(qRound(scrolled.y()));
}

QPointF KvDeskImageView::viewportCentre() const
{
    return QRectF(viewport()->rect()).center();
}

QPointF KvDeskImageView::toScene(const QPointF &position) const
{
    return viewportTransform().inverted().map(position);
}

KvDeskObjectId KvDeskImageView::objectAt(const QPoint &position) const
{
    const QPointF point = toScene(position);
    const double tolerance = clickTolerance / transform().m11();
    const QMap<int, ZtObjectMap> &all = ZtKernelData::getInstance()->objects();
    KvDeskObjectId found;
    for (const ZtDrawnType &type : ZtDrawnType::all()) {
        const ZtObjectMap objects = all.value(type.id);
        for (auto it = objects.constBegin(); it != objects.constEnd(); ++it) {
            if (KvDeskObjectShape(type.id, it.value()).isAt(point, tolerance))
                found = {type.id, it.key()};
        }
    }
    return found;
}

void KvDeskImageView::slotSelectObject(int aType, int aId)
{
    m_selected = {aType, aId};
    viewport()->update();
    const KvDeskObjectShape shape(aType, ZtKernelData::getInstance()->object(aType, aId));
    if (!shape.isEmpty())
        bringIntoView(shape.boundingRect());
}

// What is seen in part stays where it is.
void KvDeskImageView::bringIntoView(const QRectF &rect)
{
    const QRectF visible(toScene(viewport()->rect().topLeft()), toScene(viewport()->rect().bottomRight()));
    const bool isSeen = rect.right() >= visible.left() && rect.left() <= visible.right() &&
                        rect.bottom() >= visible.top() && rect.top() <= visible.bottom();
    if (!isSeen)
        place(rect.center(), viewportCentre());
}

void KvDeskImageView::drawBackground(QPainter *painter, const QRectF &rect)
{
    painter->fillRect(rect, acss::QtAdvancedStylesheet::getInstance()->color(QStringLiteral("window")));
    m_frame.draw(painter, rect, zoom());
}

void KvDeskImageView::drawForeground(QPainter *painter, const QRectF &rect)
{
    Q_UNUSED(rect)
    painter->save();
    // The painter may belong to the whole window, but labels are to stay inside this view.
    painter->setWindow(viewport()->rect());
    painter->setViewport(viewport()->rect());
    const ZtKernelObjectData *const selected =
        ZtKernelData::getInstance()->object(m_selected.type, m_selected.id);
    if (selected)
        KvDeskObjectShape(m_selected.type, selected).drawHighlight(painter);
    drawObjects(painter);
    painter->restore();
}

void KvDeskImageView::drawObjects(QPainter *painter) const
{
    const ZtKernelData *const kernel = ZtKernelData::getInstance();
    const QMap<int, ZtObjectMap> &all = kernel->objects();
    for (auto type = all.constBegin(); type != all.constEnd(); ++type) {
        const ZtGsManipulator *const manipulator = kernel->getGsManipulator(type.key());
        if (!manipulator)
            continue;
        for (auto object = type->constBegin(); object != type->constEnd(); ++object) {
            painter->save();
            manipulator->draw(painter, object.key(), object.value());
            painter->restore();
        }
    }
}

void KvDeskImageView::resizeEvent(QResizeEvent *event)
{
    QGraphicsView::resizeEvent(event);
    if (m_isFitted)
        fit();
    else
        updateSceneRect();
}

void KvDeskImageView::wheelEvent(QWheelEvent *event)
{
    if (event->angleDelta().y() != 0)
        zoomAt(std::pow(zoomStep, event->angleDelta().y() / wheelNotch), event->position());
    event->accept();
}

void KvDeskImageView::mousePressEvent(QMouseEvent *event)
{
    event->accept();
    const bool isLeft = event->button() == Qt::LeftButton;
    if (event->button() == Qt::MiddleButton || (isLeft && m_isSpaceDown)) {
        m_lastPan = event->pos();
        setPanning(true);
    } else if (isLeft) {
        const KvDeskObjectId object = objectAt(event->pos());
        slotSelectObject(object.type, object.id);
        emit signalObjectClicked(object.type, object.id);
    }
}

void KvDeskImageView::mouseMoveEvent(QMouseEvent *event)
{
    event->accept();
    if (m_isPanning)
        pan(event->pos());
    reportPointer(event->localPos());
}

void KvDeskImageView::mouseReleaseEvent(QMouseEvent *event)
{
    event->accept();
    if (m_isPanning && !(event->buttons() & (Qt::LeftButton | Qt::MiddleButton)))
        setPanning(false);
}

void KvDeskImageView::mouseDoubleClickEvent(QMouseEvent *event)
{
    mousePressEvent(event);
}

void KvDeskImageView::keyPressEvent(QKeyEvent *event)
{
    if (event->key() != Qt::Key_Space) {
        QGraphicsView::keyPressEvent(event);
        return;
    }
    event->accept();
    if (!event->isAutoRepeat())
        setSpaceDown(true);
}

void KvDeskImageView::keyReleaseEvent(QKeyEvent *event)
{
    if (event->key() != Qt::Key_Space) {
        QGraphicsView::keyReleaseEvent(event);
        return;
    }
    event->accept();
    if (!event->isAutoRepeat())
        setSpaceDown(false);
}

void KvDeskImageView::focusOutEvent(QFocusEvent *event)
{
    // The release of the key goes to somebody else.
    setSpaceDown(false);
    QGraphicsView::focusOutEvent(event);
}

bool KvDeskImageView::viewportEvent(QEvent *event)
{
    if (event->type() == QEvent::Leave)
        emit signalPointerLeft();
    return QGraphicsView::viewportEvent(event);
}

void KvDeskImageView::pan(const QPoint &to)
{
    const QPoint moved = to - m_lastPan;
    m_lastPan = to;
    if (moved.isNull())
        return;
    m_isFitted = false;
    horizontalScrollBar()->setValue(horizontalScrollBar()->value() - moved.x());
    verticalScrollBar()->setValue(verticalScrollBar()->value() - moved.y());
}

void KvDeskImageView::setPanning(bool on)
{
    m_isPanning = on;
    updateCursor();
}

void KvDeskImageView::setSpaceDown(bool down)
{
    m_isSpaceDown = down;
    updateCursor();
}

void KvDeskImageView::updateCursor()
{
    if (m_isPanning)
        viewport()->setCursor(Qt::ClosedHandCursor);
    else if (m_isSpaceDown)
        viewport()->setCursor(Qt::OpenHandCursor);
    else
        viewport()->unsetCursor();
}

void KvDeskImageView::reportPointer(const QPointF &position)
{
    const QPointF point = toScene(position);
    if (m_frame.sceneRect().contains(point))
        emit signalPointerMoved(point);
    else
        emit signalPointerLeft();
}
