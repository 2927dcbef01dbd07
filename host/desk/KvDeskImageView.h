// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskImageFrame.h"
#include "KvDeskObjectChanges.h"
#include "KvDeskObjectId.h"
#include "kernel/FrameData.h"

#include <QGraphicsView>

#include <memory>

class KvDeskEmptyState;
class KvDeskInlineEditor;
class KvDeskObjectEditor;
class KvDeskObjectPlaces;
class KvDeskOverlay;
class KvDeskRuler;
class KvDeskSelection;
class KvDeskTool;
class QLabel;
class ZtMeasuringDocument;
struct KvDeskPointer;

/**
 * The image with the measured objects on it. Objects are drawn anew for every view, so that they are sharp at
 * any zoom.
 *
 * The wheel zooms at the pointer; the middle button, or the left one while the space bar is down, moves the
 * image. Everything else that mouse and keys do is up to the tool. As long as the user does not zoom, the
 * whole image is kept in view.
 */
class KvDeskImageView : public QGraphicsView
{
    Q_OBJECT
public:
    explicit KvDeskImageView(QWidget *parent = nullptr);
    ~KvDeskImageView() override;

    /** A point that the user means who points nearly there. */
    struct Snap
    {
        QPointF point;
        bool isOnPoint = false; ///< of another object
    };

    /** \a document has to outlive the view. */
    void setDocument(ZtMeasuringDocument *document);
    /** Without an editor, objects can be looked at and selected only. It has to outlive the view. */
    void setEditor(KvDeskObjectEditor *editor);
    KvDeskObjectEditor *editor() const { return m_editor; }
    KvDeskSelection *selection() const { return m_selection; }
    const KvDeskObjectPlaces &places() const;
    KvDeskOverlay *overlay() const { return m_overlay; }
    KvDeskInlineEditor *inlineEditor() const { return m_inlineEditor; }

    /** Hands mouse and keys to another tool, which is not owned; null stands for selecting. What the one
     * before had half done is forgotten. */
    void setTool(KvDeskTool *tool);
    KvDeskTool *tool() const { return m_tool; }

    /** Whether an object, a drag or a text on the image is begun: steps of the history wait for its end. */
    bool isDrafting() const;
    /** Whether there is a part of it that takeBack() takes back. */
    bool canTakeBack() const;
    void takeBack();

    const KvDeskImageFrame &frame() const { return m_frame; }
    KvDeskEmptyState *emptyState() const { return m_emptyState; }
    bool isAnythingOpen() const;
    KvDeskObjectId selectedObject() const;

    /** Pixels of the screen per pixel of the image. */
    double zoom() const;
    static constexpr double minimumZoom = 0.02;
    static constexpr double maximumZoom = 64.0;
    /** Whether the whole image is kept in view. */
    bool isFitted() const { return m_isFitted; }

    /** The object drawn at a point of the viewport, the topmost where there are several; none elsewhere. */
    KvDeskObjectId objectAt(const QPoint &position) const;
    /** Shows pending changes of objects at once. */
    void flush() { m_changes.flush(); }

    /** Image pixels per pixel of the viewport. */
    double pixel() const;
    QRectF page() const { return QRectF(viewport()->rect()); }
    QPointF centre() const; ///< the point of the image in the middle of the view
    /**
     * Where a point is meant to be. With Ctrl that is the pointer's very place; with Shift it lies straight
     * from \a origin (unless null), or makes a square with it; else points of objects but \a except attract
     * it.
     */
    Snap snap(const KvDeskPointer &pointer, const QPointF *origin, bool isSquare,
              const KvDeskObjectId &except) const;
    /** Where a crosshair comes that steps over the image by keys: at whole pixels of the image, however small
     * they are shown. It is kept in view. */
    QPointF steppedPoint(const QPointF &point, const QPointF &step);
    void bringIntoView(const QRectF &rect);
    void refresh() { viewport()->update(); }
    void reportPosition(const QPointF &scenePoint);

    bool areRulersVisible() const { return m_areRulersVisible; }
    bool areLabelsVisible() const { return m_areLabelsVisible; }
    bool isScaleBarVisible() const { return m_isScaleBarVisible; }

public slots:
    void slotSetRulersVisible(bool aVisible);
    void slotSetLabelsVisible(bool aVisible);
    void slotSetScaleBarVisible(bool aVisible); ///< here and on pictures of reports
    /** Shows what an empty view shows over the image, until another is opened or slotHideStart(). */
    void slotShowStart();
    void slotHideStart();
    void slotZoomIn();
    void slotZoomOut();
    void slotZoomFit();
    void slotZoomActual(); ///< one pixel of the image on one of the screen

signals:
    void signalZoomChanged(double aZoom);
    void signalFrameChanged();
    void signalContentChanged(); ///< there is another image, or other objects are on it
    /** The pointer is over this point of the image, in its pixels. */
    void signalPointerMoved(QPointF aPosition);
    void signalPointerLeft();  ///< the pointer is not over the image
    void signalDraftChanged(); ///< isDrafting() or canTakeBack()
    void signalToolLeft();     ///< the user is done with the tool, by Escape
    /** The user wants the menu of what is selected, at this place of the screen. Drawing has none. */
    void signalMenuRequested(QPoint aPosition);

protected:
    void drawBackground(QPainter *painter, const QRectF &rect) override;
    void drawForeground(QPainter *painter, const QRectF &rect) override;
    void resizeEvent(QResizeEvent *event) override;
    void wheelEvent(QWheelEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void mouseDoubleClickEvent(QMouseEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void keyReleaseEvent(QKeyEvent *event) override;
    void focusOutEvent(QFocusEvent *event) override;
    void contextMenuEvent(QContextMenuEvent *event) override;
    bool viewportEvent(QEvent *event) override;
    bool event(QEvent *event) override;
    void scrollContentsBy(int dx, int dy) override;

private slots:
    void slotSelectionChanged();
    void slotUpdate();
    void slotUpdateDraft();
    void slotUpdateRulers();
    void slotImageChanged();
    void slotImageCompleted(FrameData aFrameData, bool &aHandled);
    void slotObjectsChanged();
    void slotThemeChanged();

private:
    void connectSignals();
    void setSelection(KvDeskSelection *selection);
    void refreshContent();
    void updateStart();
    void updateSceneRect();
    void placeRulers();
    void setRulerPointer(const QPointF *position);
    void drawScaleBar(QPainter *painter) const;
    bool hasMenu() const;
    void selectForMenu(const QPoint &position);
    QPoint menuPlace() const; ///< on the screen, where the pointer has no part in it
    KvDeskPointer pointerOf(const QMouseEvent &event) const;
    bool isPanPress(const QMouseEvent &event) const;
    /** Moves the image so that a point of the scene lies at \a position in the viewport. */
    void place(const QPointF &scenePoint, const QPointF &position);
    void fit();
    /** Zooms by a factor so that the point below \a anchor, in the viewport, stays there. */
    void zoomAt(double factor, const QPointF &anchor);
    void setScale(double scale);
    QPointF viewportCentre() const;
    QPointF toScene(const QPointF &position) const;
    void pan(const QPoint &to);
    void setPanning(bool on);
    void setSpaceDown(bool down);
    void updateCursor();

    ZtMeasuringDocument *m_document = nullptr;
    KvDeskImageFrame m_frame;
    KvDeskObjectChanges m_changes;
    KvDeskEmptyState *m_emptyState = nullptr;
    KvDeskOverlay *m_overlay = nullptr;
    KvDeskInlineEditor *m_inlineEditor = nullptr;
    KvDeskRuler *m_topRuler = nullptr;
    KvDeskRuler *m_leftRuler = nullptr;
    QLabel *m_rulerCorner = nullptr; ///< names the unit
    KvDeskObjectEditor *m_editor = nullptr;
    KvDeskSelection *m_selection = nullptr;
    std::unique_ptr<KvDeskTool> m_selectTool;
    KvDeskTool *m_tool = nullptr;
    QRectF m_content; ///< the image and all objects, in scene coordinates
    QPoint m_lastPan;
    bool m_isDrafting = false;    ///< when signalDraftChanged() was last sent
    bool m_canTakeBack = false;   ///< as above
    bool m_isStartWanted = false; ///< though something is open
    bool m_isFitted = true;
    bool m_isPanning = false;
    bool m_isSpaceDown = false;
    bool m_areRulersVisible = false;
    bool m_areLabelsVisible = true;
    bool m_isScaleBarVisible = false;
};
