// SPDX-License-Identifier: MIT
#include "KvDeskImageView.h"

#include "DeskFiles.h"
#include "KvDeskEmptyState.h"
#include "KvDeskRuler.h"
#include "KvDeskSelection.h"
#include "gui/QtAdvancedStylesheet.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtKernelImage.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QLabel>

Q_DECLARE_METATYPE(ZtCalibration)

namespace {

/// A camera whose picture the test sets.
class FakeCamera : public ZtFrameSource
{
public:
    QImage frame() const override { return m_frame; }
    QString displayName() const override { return QStringLiteral("Camera"); }
    void deliver(const QImage &frame)
    {
        m_frame = frame;
        emit signalFrameReady();
    }

private:
    QImage m_frame;
};

QImage filled(const QSize &size, const QColor &color)
{
    QImage image(size, QImage::Format_RGB32);
    image.fill(color);
    return image;
}

// The line may lie a pixel beside the place, as pixels are whole.
bool isYellowAt(const QImage &image, const QPoint &place)
{
    for (int y = place.y() - 1; y <= place.y() + 1; ++y) {
        const QColor color = image.pixelColor(place.x(), y);
        if (color.red() > 200 && color.green() > 150 && color.blue() < 120)
            return true;
    }
    return false;
}

} // namespace

class KvDeskImageViewTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void emptyState();
    void fitsTheImage();
    void fitsAgainWhenResized();
    void drawsImageAndObjects();
    void linesKeepTheirWidthAtAnyZoom();
    void showsCameraFrames();
    void showsFramesOfPartsAtOtherScales();
    void sameFrameIsShownOnce();
    void wheelZoomsAtThePointer();
    void zoomHasLimits();
    void zoomCommands();
    void zoomIsKeptForNewFrames();
    void pansWithTheMiddleButton();
    void pansWithTheSpaceBar();
    void clickSelects();
    void selectionIsHighlighted();
    void selectionIsBroughtIntoView();
    void pointerIsReported();
    void rulersTakeRoom();
    void rulersHaveOneUnit_data();
    void rulersHaveOneUnit();
    void isNeverMirrored();
    void removedImageLeavesNothing();

private:
    void showImage(const QSize &size = QSize(400, 300));
    QPoint toView(const QPointF &scene) const { return m_view->mapFromScene(scene); }
    QImage shown() const { return m_view->viewport()->grab().toImage(); }
    void wheel(const QPoint &position, int delta)
    {
        QWheelEvent event(position, m_view->viewport()->mapToGlobal(position), QPoint(), QPoint(0, delta),
                          Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase, false);
        QApplication::sendEvent(m_view->viewport(), &event);
    }

    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskImageView> m_view;
    ZtFault m_fault;
};

void KvDeskImageViewTest::init()
{
    StatReportTest::init();
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_view = std::make_unique<KvDeskImageView>();
    m_view->resize(640, 480);
    m_view->setDocument(m_document.get());
    m_view->show();
}

void KvDeskImageViewTest::cleanup()
{
    m_view.reset();
    m_document.reset();
    StatReportTest::cleanup();
}

void KvDeskImageViewTest::showImage(const QSize &size)
{
    QVERIFY(m_document->loadImage(DeskFiles::image(QStringLiteral("view.png"), size), &m_fault));
}

void KvDeskImageViewTest::emptyState()
{
    QVERIFY(m_view->emptyState()->isVisible());
    QCOMPARE(m_view->emptyState()->findChild<QLabel *>()->text(),
             QStringLiteral("Open an image or a session to start"));
    m_document->addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(10, 0)}));
    m_view->flush();
    QVERIFY(!m_view->emptyState()->isVisible());
    m_document->clear();
    m_view->flush();
    QVERIFY(m_view->emptyState()->isVisible());
    showImage();
    QVERIFY(!m_view->emptyState()->isVisible());
}

void KvDeskImageViewTest::fitsTheImage()
{
    QSignalSpy zoom(m_view.get(), SIGNAL(signalZoomChanged(double)));
    showImage();
    QVERIFY(m_view->isFitted());
    // 480 pixels less 16 at both borders, for 300.
    QCOMPARE(m_view->zoom(), 448.0 / 300.0);
    QCOMPARE(zoom.last().first().toDouble(), m_view->zoom());
    QCOMPARE(toView(QPointF(200, 150)), QPoint(320, 240));
    // A tiny image is not blown up without end.
    showImage(QSize(4, 4));
    QCOMPARE(m_view->zoom(), 8.0);
}

void KvDeskImageViewTest::fitsAgainWhenResized()
{
    showImage();
    m_view->resize(320, 1000);
    QTRY_COMPARE(m_view->zoom(), (320.0 - 32.0) / 400.0);
    m_view->slotZoomActual();
    m_view->resize(640, 480);
    QCoreApplication::processEvents();
    QCOMPARE(m_view->zoom(), 1.0);
}

void KvDeskImageViewTest::drawsImageAndObjects()
{
    showImage();
    m_document->addObject(ZtDrawnType::Rectangle, polygon({QPointF(100, 100), QPointF(300, 200)}));
    m_view->flush();
    const QImage image = shown();
    QCOMPARE(image.pixelColor(toView(QPointF(200, 150))), QColor(Qt::blue));
    QCOMPARE(image.pixelColor(1, 1),
             acss::QtAdvancedStylesheet::getInstance()->color(QStringLiteral("window")));
    QVERIFY(isYellowAt(image, toView(QPointF(200, 200))));
    QVERIFY(isYellowAt(image, toView(QPointF(250, 200))));
    m_document->clear();
    QVERIFY(!isYellowAt(shown(), toView(QPointF(250, 200))));
}

void KvDeskImageViewTest::linesKeepTheirWidthAtAnyZoom()
{
    showImage();
    m_document->addObject(ZtDrawnType::Line, polygon({QPointF(50, 150), QPointF(390, 150)}));
    const auto width = [this]() {
        const QImage image = shown();
        int count = 0;
        const int x = toView(QPointF(200, 150)).x();
        for (int y = 0; y < image.height(); ++y)
            count += image.pixelColor(x, y) != QColor(Qt::blue) ? 1 : 0;
        return count;
    };
    m_view->slotZoomActual();
    const QImage image = shown();
    int outside = 0;
    for (int y = 0; y < image.height(); ++y)
        outside += image.pixelColor(320, y) ==
                   acss::QtAdvancedStylesheet::getInstance()->color(QStringLiteral("window"));
    const int small = width() - outside;
    QVERIFY(small >= 3 && small <= 7);
    for (int i = 0; i < 8; ++i)
        m_view->slotZoomIn();
    QVERIFY(m_view->zoom() > 4.0);
    QVERIFY(qAbs(width() - small) <= 1);
}

void KvDeskImageViewTest::showsCameraFrames()
{
    auto camera = std::make_unique<FakeCamera>();
    FakeCamera *const source = camera.get();
    m_document->setFrameSource(std::move(camera));
    QVERIFY(m_view->emptyState()->isVisible());
    source->deliver(filled(QSize(100, 100), Qt::red));
    QVERIFY(!m_view->emptyState()->isVisible());
    QCOMPARE(shown().pixelColor(320, 240), QColor(Qt::red));
    source->deliver(filled(QSize(100, 100), Qt::green));
    QCOMPARE(shown().pixelColor(320, 240), QColor(Qt::green));
}

void KvDeskImageViewTest::showsFramesOfPartsAtOtherScales()
{
    FrameData frame;
    frame.image = QSharedPointer<ZtImage>::create(filled(QSize(20, 10), Qt::red));
    frame.scale = 2.0;
    frame.rect = QRect(40, 60, 20, 10);
    bool handled = false;
    emit m_document->kernelImage()->signalImageCompleted(frame, handled);
    QVERIFY(handled);
    QCOMPARE(m_view->frame().sceneRect(), QRectF(20, 30, 10, 5));
    // A frame without a picture changes nothing.
    emit m_document->kernelImage()->signalImageCompleted(FrameData(), handled);
    QCOMPARE(m_view->frame().sceneRect(), QRectF(20, 30, 10, 5));
}

void KvDeskImageViewTest::sameFrameIsShownOnce()
{
    showImage();
    QSignalSpy spy(m_view.get(), SIGNAL(signalFrameChanged()));
    m_document->kernelImage()->requestImage();
    QCOMPARE(spy.count(), 0);
}

void KvDeskImageViewTest::wheelZoomsAtThePointer()
{
    showImage();
    const QPoint pointer(500, 120);
    const QPointF before = m_view->viewportTransform().inverted().map(QPointF(pointer));
    const double zoom = m_view->zoom();
    wheel(pointer, 120);
    QCOMPARE(m_view->zoom(), zoom * 1.25);
    QVERIFY(!m_view->isFitted());
    for (int i = 0; i < 5; ++i)
        wheel(pointer, 120);
    QPointF after = m_view->viewportTransform().inverted().map(QPointF(pointer));
    QVERIFY(QLineF(before, after).length() * m_view->zoom() < 6.0);
    // Back out again, with the halves of a notch that touch pads report.
    for (int i = 0; i < 12; ++i)
        wheel(pointer, -60);
    QVERIFY(qAbs(m_view->zoom() - zoom) < 1e-6);
}

void KvDeskImageViewTest::zoomHasLimits()
{
    showImage();
    for (int i = 0; i < 60; ++i)
        wheel(QPoint(320, 240), 120);
    QCOMPARE(m_view->zoom(), KvDeskImageView::maximumZoom);
    for (int i = 0; i < 120; ++i)
        wheel(QPoint(320, 240), -120);
    QCOMPARE(m_view->zoom(), KvDeskImageView::minimumZoom);
}

void KvDeskImageViewTest::zoomCommands()
{
    // Without anything to see there is nothing to zoom.
    m_view->slotZoomIn();
    QVERIFY(m_view->isFitted());
    showImage();
    m_view->slotZoomActual();
    QCOMPARE(m_view->zoom(), 1.0);
    m_view->slotZoomIn();
    QCOMPARE(m_view->zoom(), 1.25);
    m_view->slotZoomOut();
    QCOMPARE(m_view->zoom(), 1.0);
    QCOMPARE(toView(QPointF(200, 150)), QPoint(320, 240));
    m_view->slotZoomFit();
    QVERIFY(m_view->isFitted());
    QCOMPARE(m_view->zoom(), 448.0 / 300.0);
}

void KvDeskImageViewTest::zoomIsKeptForNewFrames()
{
    auto camera = std::make_unique<FakeCamera>();
    FakeCamera *const source = camera.get();
    m_document->setFrameSource(std::move(camera));
    source->deliver(filled(QSize(100, 100), Qt::red));
    m_view->slotZoomActual();
    source->deliver(filled(QSize(100, 100), Qt::green));
    QCOMPARE(m_view->zoom(), 1.0);
    // Another image is another thing to look at.
    showImage();
    QVERIFY(m_view->isFitted());
}

void KvDeskImageViewTest::pansWithTheMiddleButton()
{
    showImage();
    m_view->slotZoomActual();
    const QPoint before = toView(QPointF(200, 150));
    QTest::mousePress(m_view->viewport(), Qt::MiddleButton, Qt::NoModifier, QPoint(300, 200));
    QCOMPARE(m_view->viewport()->cursor().shape(), Qt::ClosedHandCursor);
    QMouseEvent move(QEvent::MouseMove, QPointF(350, 170), Qt::NoButton, Qt::MiddleButton, Qt::NoModifier);
    QApplication::sendEvent(m_view->viewport(), &move);
    QTest::mouseRelease(m_view->viewport(), Qt::MiddleButton, Qt::NoModifier, QPoint(350, 170));
    QCOMPARE(toView(QPointF(200, 150)), before + QPoint(50, -30));
    QCOMPARE(m_view->viewport()->cursor().shape(), Qt::ArrowCursor);
}

void KvDeskImageViewTest::pansWithTheSpaceBar()
{
    showImage();
    m_view->slotZoomActual();
    const QPoint before = toView(QPointF(200, 150));
    // A click beside all objects would clear the selection.
    m_view->selection()->select({ZtDrawnType::Line, 1});
    QSignalSpy selected(m_view->selection(), SIGNAL(signalSelectionChanged()));
    QTest::keyPress(m_view.get(), Qt::Key_Space);
    QCOMPARE(m_view->viewport()->cursor().shape(), Qt::OpenHandCursor);
    QTest::mousePress(m_view->viewport(), Qt::LeftButton, Qt::NoModifier, QPoint(300, 200));
    QMouseEvent move(QEvent::MouseMove, QPointF(280, 220), Qt::NoButton, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(m_view->viewport(), &move);
    QTest::mouseRelease(m_view->viewport(), Qt::LeftButton, Qt::NoModifier, QPoint(280, 220));
    QTest::keyRelease(m_view.get(), Qt::Key_Space);
    QCOMPARE(toView(QPointF(200, 150)), before + QPoint(-20, 20));
    QCOMPARE(selected.count(), 0);
    QCOMPARE(m_view->viewport()->cursor().shape(), Qt::ArrowCursor);
}

void KvDeskImageViewTest::clickSelects()
{
    showImage();
    m_document->addObject(ZtDrawnType::Rectangle, polygon({QPointF(100, 100), QPointF(300, 200)}));
    m_document->addObject(ZtDrawnType::Line, polygon({QPointF(50, 200), QPointF(350, 200)}));
    QSignalSpy selected(m_view->selection(), SIGNAL(signalSelectionChanged()));
    QTest::mouseClick(m_view->viewport(), Qt::LeftButton, Qt::NoModifier, toView(QPointF(200, 100)));
    QCOMPARE(m_view->selectedObject(), (KvDeskObjectId{ZtDrawnType::Rectangle, 1}));
    // Where both are, the line lies on top.
    QTest::mouseClick(m_view->viewport(), Qt::LeftButton, Qt::NoModifier, toView(QPointF(200, 200)));
    QCOMPARE(m_view->selectedObject(), (KvDeskObjectId{ZtDrawnType::Line, 1}));
    QTest::mouseClick(m_view->viewport(), Qt::LeftButton, Qt::NoModifier, toView(QPointF(200, 150)));
    QCOMPARE(selected.count(), 3);
    QVERIFY(m_view->selectedObject().isNull());
}

void KvDeskImageViewTest::selectionIsHighlighted()
{
    showImage();
    m_document->addObject(ZtDrawnType::Line, polygon({QPointF(50, 250), QPointF(350, 250)}));
    const QPoint beside = toView(QPointF(200, 250)) + QPoint(0, 5);
    QCOMPARE(shown().pixelColor(beside), QColor(Qt::blue));
    m_view->selection()->select({ZtDrawnType::Line, 1});
    QVERIFY(shown().pixelColor(beside) != QColor(Qt::blue));
    m_view->selection()->select({0, 0});
    QCOMPARE(shown().pixelColor(beside), QColor(Qt::blue));
    // An object that is gone by now draws nothing.
    m_view->selection()->select({ZtDrawnType::Line, 7});
    QCOMPARE(shown().pixelColor(beside), QColor(Qt::blue));
}

void KvDeskImageViewTest::selectionIsBroughtIntoView()
{
    showImage();
    m_document->addObject(ZtDrawnType::Line, polygon({QPointF(10, 10), QPointF(20, 10)}));
    m_document->addObject(ZtDrawnType::Line, polygon({QPointF(200, 150), QPointF(210, 150)}));
    for (int i = 0; i < 10; ++i)
        m_view->slotZoomIn();
    QVERIFY(!m_view->viewport()->rect().contains(toView(QPointF(15, 10))));
    m_view->selection()->select({ZtDrawnType::Line, 1});
    QVERIFY(m_view->viewport()->rect().contains(toView(QPointF(15, 10))));
    // What is seen already does not move.
    const QPoint before = toView(QPointF(15, 10));
    m_view->selection()->select({ZtDrawnType::Line, 1});
    QCOMPARE(toView(QPointF(15, 10)), before);
}

void KvDeskImageViewTest::pointerIsReported()
{
    showImage();
    m_view->slotZoomActual();
    QSignalSpy moved(m_view.get(), SIGNAL(signalPointerMoved(QPointF)));
    QSignalSpy left(m_view.get(), SIGNAL(signalPointerLeft()));
    QMouseEvent move(QEvent::MouseMove, QPointF(toView(QPointF(30, 40))), Qt::NoButton, Qt::NoButton,
                     Qt::NoModifier);
    QApplication::sendEvent(m_view->viewport(), &move);
    QCOMPARE(moved.count(), 1);
    const QPointF point = moved.first().first().toPointF();
    QVERIFY(QLineF(point, QPointF(30, 40)).length() < 1.0);
    QMouseEvent beside(QEvent::MouseMove, QPointF(2, 2), Qt::NoButton, Qt::NoButton, Qt::NoModifier);
    QApplication::sendEvent(m_view->viewport(), &beside);
    QCOMPARE(left.count(), 1);
}

void KvDeskImageViewTest::rulersTakeRoom()
{
    showImage();
    m_view->slotSetRulersVisible(true);
    QCOMPARE(m_view->viewport()->size(), QSize(640 - 24, 480 - 24));
    const QList<KvDeskRuler *> rulers = m_view->findChildren<KvDeskRuler *>();
    QCOMPARE(rulers.size(), 2);
    for (const KvDeskRuler *const ruler : rulers) {
        QVERIFY(ruler->isVisible());
        QCOMPARE(ruler->unitText(), QStringLiteral("px"));
    }
    m_document->setCalibration(ZtCalibration(10.0));
    QCOMPARE(rulers.first()->unitText(), QStringLiteral("mm"));
    m_view->slotSetRulersVisible(false);
    QCOMPARE(m_view->viewport()->size(), QSize(640, 480));
    QVERIFY(!rulers.first()->isVisible());
}

// Views and pixels that are not square, where one direction alone would read in another unit.
void KvDeskImageViewTest::rulersHaveOneUnit_data()
{
    QTest::addColumn<QSize>("view");
    QTest::addColumn<ZtCalibration>("calibration");
    QTest::addColumn<QString>("unit");
    const QString micrometres = QStringLiteral("\u03BCm");
    QTest::newRow("small") << QSize(640, 480) << ZtCalibration(0.5) << micrometres;
    QTest::newRow("wide") << QSize(900, 240) << ZtCalibration(2.35) << QStringLiteral("mm");
    QTest::newRow("high") << QSize(240, 900) << ZtCalibration(2.35) << QStringLiteral("mm");
    QTest::newRow("high pixels") << QSize(640, 480) << ZtCalibration(0.5, 4.0) << QStringLiteral("mm");
    QTest::newRow("broad pixels") << QSize(640, 480) << ZtCalibration(4.0, 0.5) << QStringLiteral("mm");
    QTest::newRow("2 by 4") << QSize(440, 440) << ZtCalibration(2.0, 4.0) << QStringLiteral("mm");
}

void KvDeskImageViewTest::rulersHaveOneUnit()
{
    QFETCH(QSize, view);
    QFETCH(ZtCalibration, calibration);
    showImage();
    m_view->resize(view);
    m_view->slotSetRulersVisible(true);
    m_document->setCalibration(calibration);
    m_view->slotZoomActual();
    const QList<KvDeskRuler *> rulers = m_view->findChildren<KvDeskRuler *>();
    QCOMPARE(rulers.size(), 2);
    for (const KvDeskRuler *const ruler : rulers)
        QTEST(ruler->unitText(), "unit");
    bool isNamed = false;
    for (const QLabel *const label : m_view->findChildren<QLabel *>())
        isNamed = isNamed || label->text() == rulers.first()->unitText();
    QVERIFY(isNamed);
}

void KvDeskImageViewTest::isNeverMirrored()
{
    QGuiApplication::setLayoutDirection(Qt::RightToLeft);
    const KvDeskImageView view;
    QGuiApplication::setLayoutDirection(Qt::LeftToRight);
    QCOMPARE(view.layoutDirection(), Qt::LeftToRight);
    QCOMPARE(view.emptyState()->layoutDirection(), Qt::RightToLeft);
}

void KvDeskImageViewTest::removedImageLeavesNothing()
{
    showImage();
    QSignalSpy spy(m_view.get(), SIGNAL(signalFrameChanged()));
    m_document->clear();
    QCOMPARE(spy.count(), 1);
    QVERIFY(m_view->frame().isNull());
    QVERIFY(m_view->emptyState()->isVisible());
}

STATREPORT_TEST_MAIN(KvDeskImageViewTest)
#include "KvDeskImageViewTest.moc"
