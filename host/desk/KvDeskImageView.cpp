// SPDX-License-Identifier: MIT
#include "KvDeskImageView.h"

#include "KvDeskEmptyState.h"
#include "KvDeskInlineEditor.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskOverlay.h"
#include "KvDeskRuler.h"
#include "KvDeskSelectTool.h"
#include "KvDeskSelection.h"
#include "KvDeskSnapping.h"
#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtKernelImage.h"
#include "measuring/ZtMeasureFormat.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtObjectsPainter.h"
#include "measuring/ZtUnit.h"
#include "measuring/ZtUnitSettings.h"

#include <QGraphicsScene>
#include <QGuiApplication>
#include <QLabel>
#include <QMouseEvent>
#include <QScrollBar>

#include <cmath>

namespace {

constexpr double zoomStep = 1.25;      ///< of one notch of the wheel and of one command
constexpr double wheelNotch = 120.0;   ///< what a wheel reports for one notch
constexpr double fitMargin = 16.0;     ///< pixels around an image that is fitted
constexpr double largestFitZoom = 8.0; ///< tiny images are not blown up further
constexpr double clickTolerance = 6.0; ///< pixels beside an object that still hit it
constexpr double snapDistance = 8.0;   ///< pixels beside a point that still mean it
constexpr double straightStep = 15.0;  ///< degrees between directions that Shift keeps

// The user's unit, or the one in which so many micrometres read best.
ZtUnit rulerUnit(double extent)
{
    const ZtUnit chosen = ZtUnitSettings::getInstance()->chosenUnit(ZtGsManipulator::Length);
    return chosen.isEmpty() ? ZtMeasureFormat::readableUnit(extent, ZtGsManipulator::Length) : chosen;
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
    m_overlay = new KvDeskOverlay(this);
    m_topRuler = new KvDeskRuler(Qt::Horizontal, this);
    m_leftRuler = new KvDeskRuler(Qt::Vertical, this);
    m_rulerCorner = new QLabel(this);
    m_rulerCorner->setProperty("panel", true);
    m_rulerCorner->setProperty("caption", true);
    m_rulerCorner->setAlignment(Qt::AlignCenter);
    m_selectTool = std::make_unique<KvDeskSelectTool>(this);
    m_tool = m_selectTool.get();
    m_inlineEditor = new KvDeskInlineEditor(this);
    setSelection(new KvDeskSelection(this));
    placeRulers();
    connectSignals();
}

KvDeskImageView::~KvDeskImageView() = default;

void KvDeskImageView::connectSignals()
{
    connect(&m_changes, SIGNAL(signalChanged()), this, SLOT(slotObjectsChanged()));
    connect(acss::QtAdvancedStylesheet::getInstance(), SIGNAL(currentThemeChanged(QString)), this,
                                                              SLOT(slotThemeChanged()));
    connect(m_overlay, SIGNAL(signalUpdated()), this, SLOT(slotUpdate()));
    connect(m_inlineEditor, SIGNAL(signalEditingChanged()), this, SLOT(slotUpdateDraft()));
    connect(m_inlineEditor, SIGNAL(textChanged(QString)), this, SLOT(slotUpdateDraft()));
    connect(this, SIGNAL(signalZoomChanged(double)), this, SLOT(slotUpdateRulers()));
    const ZtSignalCenter *const center = ZtSignalCenter::getInstance();
    connect(center, SIGNAL(signalLengthUnitChanged()), this, SLOT(slotUpdateRulers()));
}

void KvDeskImageView::setEditor(KvDeskObjectEditor *editor)
{
    m_editor = editor;
    setSelection(editor->selection());
}

void KvDeskImageView::setSelection(KvDeskSelection *selection)
{
    if (m_selection)
        m_selection->disconnect(this);
    m_selection = selection;
    m_overlay->setSelection(selection);
    connect(selection, SIGNAL(signalSelectionChanged()), this, SLOT(slotSelectionChanged()));
}

KvDeskObjectId KvDeskImageView::selectedObject() const
{
    return m_selection->current();
}

const KvDeskObjectPlaces &KvDeskImageView::places() const
{
    return m_overlay->places();
}

void KvDeskImageView::setTool(KvDeskTool *tool)
{
    KvDeskTool *const next = tool ? tool : m_selectTool.get();
    if (next == m_tool)
        return;
    m_tool->cancel();
    m_tool = next;
    updateCursor();
    refresh();
    slotUpdateDraft();
}

bool KvDeskImageView::isDrafting() const
{
    return m_inlineEditor->isEditing() || m_tool->canTakeBack();
}

bool KvDeskImageView::canTakeBack() const
{
    return m_inlineEditor->isEditing() ? m_inlineEditor->isUndoAvailable() : m_tool->canTakeBack();
}

void KvDeskImageView::takeBack()
{
    if (m_inlineEditor->isEditing())
        m_inlineEditor->undo();
    else
        m_tool->takeBack();
    slotUpdateDraft();
}

// After everything that mouse and keys do.
void KvDeskImageView::slotUpdateDraft()
{
    if (isDrafting() == m_isDrafting && canTakeBack() == m_canTakeBack)
        return;
    m_isDrafting = isDrafting();
    m_canTakeBack = canTakeBack();
    emit signalDraftChanged();
}

void KvDeskImageView::slotSelectionChanged()
{
    if (m_selection->objects().size() == 1 && places().index().contains(m_selection->current()))
        bringIntoView(places().index().rect(m_selection->current()));
}

void KvDeskImageView::slotUpdate()
{
    refresh();
}

void KvDeskImageView::setDocument(ZtMeasuringDocument *document)
{
    m_document = document;
    m_overlay->setPainter(document->objectsPainter());
    connect(document, SIGNAL(signalCalibrationChanged()), this, SLOT(slotUpdateRulers()));
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
    refresh();
    emit signalFrameChanged();
}

void KvDeskImageView::slotObjectsChanged()
{
    refreshContent();
    // Units may read differently now.
    m_overlay->slotLabelsChanged();
}

void KvDeskImageView::slotThemeChanged()
{
    m_overlay->slotLabelsChanged();
}

bool KvDeskImageView::isAnythingOpen() const
{
    return !m_frame.isNull() || places().index().size() > 0;
}

void KvDeskImageView::updateStart()
{
    const bool isShown = m_isStartWanted || !isAnythingOpen();
    // Whoever loses the keyboard with the page gets it back here.
    if (!isShown && m_emptyState->isAncestorOf(window()->focusWidget()))
        setFocus();
    m_emptyState->setVisible(isShown);
    placeRulers();
}

void KvDeskImageView::slotShowStart()
{
    m_isStartWanted = true;
    updateStart();
    m_emptyState->setFocus();
}

void KvDeskImageView::slotHideStart()
{
    m_isStartWanted = false;
    updateStart();
}

void KvDeskImageView::refreshContent()
{
    const QRectF objects = places().index().bounds();
    updateStart();
    const QRectF content =
        m_frame.isNull() ? objects : KvDeskObjectIndex::united(m_frame.sceneRect(), objects);
    emit signalContentChanged();
    if (content == m_content && !m_isFitted)
        return;
    m_content = content;
    if (m_isFitted)
        fit();
    else
        updateSceneRect();
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

double KvDeskImageView::pixel() const
{
    return 1.0 / transform().m11();
}

QPointF KvDeskImageView::centre() const
{
    return toScene(viewportCentre());
}

KvDeskObjectId KvDeskImageView::objectAt(const QPoint &position) const
{
    return places().objectAt(toScene(position), clickTolerance * pixel());
}

KvDeskImageView::Snap KvDeskImageView::snap(const KvDeskPointer &pointer, const QPointF *origin,
                                            bool isSquare, const KvDeskObjectId &except) const
{
    if (pointer.modifiers & Qt::ControlModifier)
        return {pointer.scene, false};
    if (origin && pointer.modifiers & Qt::ShiftModifier)
        return {isSquare ? KvDeskSnapping::toSquare(*origin, pointer.scene)
                         : KvDeskSnapping::alongDirection(*origin, pointer.scene, straightStep),
                false};
    const double distance = snapDistance * pixel();
    const QVector<QPointF> points = places().pointsNear(pointer.scene, distance, except);
    const QPointF *const found = KvDeskSnapping::nearest(pointer.scene, points, distance);
    return {found ? *found : pointer.scene, found != nullptr};
}

QPointF KvDeskImageView::steppedPoint(const QPointF &point, const QPointF &step)
{
    const QPointF moved = point + step;
    const QPointF result(std::round(moved.x()), std::round(moved.y()));
    bringIntoView(QRectF(result, QSizeF()));
    reportPosition(result);
    refresh();
    return result;
}

// What is seen in part stays where it is.
void KvDeskImageView::bringIntoView(const QRectF &rect)
{
    const QRectF visible(toScene(viewport()->rect().topLeft()), toScene(viewport()->rect().bottomRight()));
    if (!KvDeskObjectIndex::touch(rect, visible))
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
    m_overlay->draw(painter, viewportTransform(), viewport()->size(), devicePixelRatioF());
    drawScaleBar(painter);
    painter->setRenderHint(QPainter::Antialiasing);
    painter->setWorldTransform(viewportTransform());
    m_tool->draw(painter);
    painter->restore();
}

void KvDeskImageView::resizeEvent(QResizeEvent *event)
{
    QGraphicsView::resizeEvent(event);
    placeRulers();
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

KvDeskPointer KvDeskImageView::pointerOf(const QMouseEvent &event) const
{
    return {toScene(event.localPos()), event.localPos(), event.button(), event.modifiers()};
}

bool KvDeskImageView::isPanPress(const QMouseEvent &event) const
{
    return event.button() == Qt::MiddleButton || (event.button() == Qt::LeftButton && m_isSpaceDown);
}

void KvDeskImageView::mousePressEvent(QMouseEvent *event)
{
    event->accept();
    if (isPanPress(*event)) {
        m_lastPan = event->pos();
        setPanning(true);
        return;
    }
    m_tool->press(pointerOf(*event));
    slotUpdateDraft();
    refresh();
}

void KvDeskImageView::mouseMoveEvent(QMouseEvent *event)
{
    event->accept();
    if (m_isPanning)
        pan(event->pos());
    else
        m_tool->move(pointerOf(*event));
    slotUpdateDraft();
    const QPointF position = event->localPos();
    setRulerPointer(&position);
    reportPosition(toScene(position));
}

void KvDeskImageView::mouseReleaseEvent(QMouseEvent *event)
{
    event->accept();
    if (!m_isPanning)
        m_tool->release(pointerOf(*event));
    else if (!(event->buttons() & (Qt::LeftButton | Qt::MiddleButton)))
        setPanning(false);
    slotUpdateDraft();
}

void KvDeskImageView::mouseDoubleClickEvent(QMouseEvent *event)
{
    if (isPanPress(*event) || event->button() != Qt::LeftButton) {
        mousePressEvent(event);
        return;
    }
    event->accept();
    m_tool->doubleClick(pointerOf(*event));
    slotUpdateDraft();
    refresh();
}

// Tab goes on from object to object, as long as there are objects.
bool KvDeskImageView::event(QEvent *event)
{
    if (event->type() == QEvent::KeyPress) {
        auto *const keyEvent = static_cast<QKeyEvent *>(event);
        const bool isTab = keyEvent->key() == Qt::Key_Tab || keyEvent->key() == Qt::Key_Backtab;
        if (isTab && m_tool->key(keyEvent)) {
            event->accept();
            return true;
        }
    }
    return QGraphicsView::event(event);
}

void KvDeskImageView::keyPressEvent(QKeyEvent *event)
{
    event->accept();
    if (m_tool->key(event)) {
        slotUpdateDraft();
        refresh();
        return;
    }
    const bool isMenuKey = event->key() == Qt::Key_F10 && event->modifiers() == Qt::ShiftModifier;
    if (event->key() == Qt::Key_Escape) {
        emit signalToolLeft();
    } else if (isMenuKey) {
        if (hasMenu())
            emit signalMenuRequested(menuPlace());
    } else if (event->key() == Qt::Key_Space) {
        if (!event->isAutoRepeat())
            setSpaceDown(true);
    } else {
        QGraphicsView::keyPressEvent(event);
    }
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

bool KvDeskImageView::hasMenu() const
{
    const bool isSelecting = m_tool == m_selectTool.get() && !m_tool->isBusy() && !m_isPanning;
    return isSelecting && m_emptyState->isHidden();
}

void KvDeskImageView::contextMenuEvent(QContextMenuEvent *event)
{
    event->accept();
    if (!hasMenu())
        return;
    const bool isByMouse = event->reason() == QContextMenuEvent::Mouse;
    if (isByMouse)
        selectForMenu(event->pos());
    emit signalMenuRequested(isByMouse ? event->globalPos() : menuPlace());
}

// Beside all objects it is the menu of those that are selected: lines are easily missed.
void KvDeskImageView::selectForMenu(const QPoint &position)
{
    const KvDeskObjectId object = objectAt(position);
    if (!object.isNull() && !m_selection->contains(object))
        m_selection->select(object);
}

QPoint KvDeskImageView::menuPlace() const
{
    const QRect visible = viewport()->rect();
    QPoint place = visible.center();
    if (places().index().contains(m_selection->current())) {
        const QPoint object = mapFromScene(places().index().rect(m_selection->current()).center());
        place = QPoint(qBound(visible.left(), object.x(), visible.right()),
                       qBound(visible.top(), object.y(), visible.bottom()));
    }
    return viewport()->mapToGlobal(place);
}

bool KvDeskImageView::viewportEvent(QEvent *event)
{
    if (event->type() == QEvent::Leave) {
        setRulerPointer(nullptr);
        emit signalPointerLeft();
    }
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
    else if (m_tool->cursor() != Qt::ArrowCursor)
        viewport()->setCursor(m_tool->cursor());
    else
        viewport()->unsetCursor();
}

void KvDeskImageView::reportPosition(const QPointF &scenePoint)
{
    if (m_frame.sceneRect().contains(scenePoint))
        emit signalPointerMoved(scenePoint);
    else
        emit signalPointerLeft();
}

void KvDeskImageView::scrollContentsBy(int dx, int dy)
{
    QGraphicsView::scrollContentsBy(dx, dy);
    slotUpdateRulers();
}

void KvDeskImageView::slotSetRulersVisible(bool aVisible)
{
    m_areRulersVisible = aVisible;
    const int margin = aVisible ? KvDeskRuler::thickness : 0;
    setViewportMargins(margin, margin, 0, 0);
    placeRulers();
}

void KvDeskImageView::slotSetLabelsVisible(bool aVisible)
{
    m_areLabelsVisible = aVisible;
    if (m_document)
        m_document->objectsPainter()->setLabelsShown(aVisible);
    m_overlay->slotLabelsChanged();
}

void KvDeskImageView::slotSetScaleBarVisible(bool aVisible)
{
    m_isScaleBarVisible = aVisible;
    if (m_document)
        m_document->objectsPainter()->setScaleBarShown(aVisible);
    refresh();
}

// At the corner of the image, as far as that is in view.
void KvDeskImageView::drawScaleBar(QPainter *painter) const
{
    if (m_document && !m_frame.isNull())
        m_document->objectsPainter()->drawScaleBar(painter, viewportTransform(),
                                                   page() & viewportTransform().mapRect(m_frame.sceneRect()));
}

void KvDeskImageView::placeRulers()
{
    constexpr int side = KvDeskRuler::thickness;
    m_topRuler->setGeometry(side, 0, qMax(0, width() - side), side);
    m_leftRuler->setGeometry(0, side, side, qMax(0, height() - side));
    m_rulerCorner->setGeometry(0, 0, side, side);
    const bool isPageShown = m_emptyState->hasContent() && !m_emptyState->isHidden();
    const QList<QWidget *> rulers{m_topRuler, m_leftRuler, m_rulerCorner};
    for (QWidget *const ruler : rulers)
        ruler->setVisible(m_areRulersVisible && !isPageShown);
    slotUpdateRulers();
}

void KvDeskImageView::slotUpdateRulers()
{
    if (!m_areRulersVisible)
        return;
    const ZtCalibration calibration = m_document ? m_document->calibration() : ZtCalibration();
    const QPointF origin = viewportTransform().map(QPointF());
    const double pixelWidth = calibration.micrometresPerPixelX();
    const double pixelHeight = calibration.micrometresPerPixelY();
    // One unit for both, which the corner names.
    const ZtUnit unit = rulerUnit(qMax(m_topRuler->extent(transform().m11(), pixelWidth),
                                       m_leftRuler->extent(transform().m22(), pixelHeight)));
    m_topRuler->setScale(origin.x(), transform().m11(), pixelWidth, unit);
    m_leftRuler->setScale(origin.y(), transform().m22(), pixelHeight, unit);
    m_rulerCorner->setText(m_topRuler->unitText());
    m_rulerCorner->setToolTip(m_topRuler->toolTip());
}

void KvDeskImageView::setRulerPointer(const QPointF *position)
{
    m_topRuler->setPointer(position ? std::optional<double>(position->x()) : std::nullopt);
    m_leftRuler->setPointer(position ? std::optional<double>(position->y()) : std::nullopt);
}
