// SPDX-License-Identifier: MIT
#include "KvDeskOverlay.h"

#include "DeskView.h"
#include "gui/QtAdvancedStylesheet.h"
#include "image/ZtImage.h"
#include "kernel/ZtImageTools.h"
#include "measuring/ZtObjectsPainter.h"

#include <QPainter>
#include <QSignalSpy>

namespace {

constexpr QSize viewSize(400, 300);

} // namespace

class KvDeskOverlayTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void looksAsDrawnAtOnce();
    void oneChangeDrawsFewObjects();
    void movingTheViewDrawsWhatComesIntoSight();
    void draggedObjectIsDrawnAlone();
    void framesDrawNothingAgain();
    void burntPictureIsWhatTheScreenShows();
    void labelsAreHiddenWhereCrowded();
    void labelsCanBeHidden();
    void manySelectedObjectsAreRough();
    void noMoreTextsThanAnybodyReads();
    void zoomingStretchesManyObjects();
    void zoomingDrawsFewObjects();

private:
    static QImage draw(KvDeskOverlay *overlay, const QTransform &toView, double ratio = 1.0)
    {
        QImage image(viewSize * ratio, QImage::Format_ARGB32_Premultiplied);
        image.setDevicePixelRatio(ratio);
        image.fill(Qt::transparent);
        QPainter painter(&image);
        overlay->draw(&painter, toView, viewSize, ratio);
        return image;
    }
    static QImage drawAnew(const ZtObjectsPainter *painter, const QTransform &toView, double ratio = 1.0)
    {
        KvDeskOverlay overlay;
        overlay.setPainter(painter);
        return draw(&overlay, toView, ratio);
    }
    /// 20 x 15 lines, 20 pixels from each other.
    static void addGrid(ZtMeasuringDocument *document)
    {
        for (int row = 0; row < 15; ++row) {
            for (int column = 0; column < 20; ++column) {
                const QPointF start(column * 20 + 4, row * 20 + 4);
                document->addObject(ZtDrawnType::Line, polygon({start, start + QPointF(8, 5)}));
            }
        }
    }
};

void KvDeskOverlayTest::looksAsDrawnAtOnce()
{
    ZtMeasuringDocument document;
    KvDeskSession session(&document);
    KvDeskSelection selection;
    KvDeskObjectEditor editor(&session, &selection);
    addGrid(&document);
    for (const double ratio : {1.0, 2.0}) {
        KvDeskOverlay overlay;
        overlay.setPainter(document.objectsPainter());
        overlay.setSelection(&selection);
        const auto isSame = [&](const QTransform &toView) {
            return draw(&overlay, toView, ratio) == drawAnew(document.objectsPainter(), toView, ratio);
        };
        QTransform toView;
        QVERIFY(isSame(toView));
        editor.moveBy({{ZtDrawnType::Line, 5}}, QPointF(30, 30));
        QVERIFY(isSame(toView));
        editor.remove({{ZtDrawnType::Line, 25}});
        QVERIFY(isSame(toView));
        toView.translate(-37, 12);
        QVERIFY(isSame(toView));
        toView.translate(500, 0);
        QVERIFY(isSame(toView));
        toView = QTransform::fromScale(1.3, 1.3);
        QVERIFY(isSame(toView));
        editor.slotUndo();
        selection.clear();
        QVERIFY(isSame(toView));
        document.clear();
        QVERIFY(isSame(toView));
        addGrid(&document);
        QVERIFY(isSame(toView));
    }
}

void KvDeskOverlayTest::oneChangeDrawsFewObjects()
{
    DeskView desk;
    addGrid(&desk.document);
    KvDeskOverlay *const overlay = desk.view.overlay();
    desk.shown();
    const qint64 before = overlay->drawnObjects();
    QVERIFY(before >= 300);
    desk.editor.moveBy({{ZtDrawnType::Line, 150}}, QPointF(3, 3));
    desk.shown();
    QVERIFY(overlay->drawnObjects() - before < 30);
}

void KvDeskOverlayTest::movingTheViewDrawsWhatComesIntoSight()
{
    DeskView desk;
    addGrid(&desk.document);
    KvDeskOverlay overlay;
    draw(&overlay, QTransform());
    const qint64 before = overlay.drawnObjects();
    draw(&overlay, QTransform::fromTranslate(-5, 0));
    // One column of the twenty.
    QVERIFY(overlay.drawnObjects() - before <= 2 * 15);
}

void KvDeskOverlayTest::draggedObjectIsDrawnAlone()
{
    DeskView desk;
    addGrid(&desk.document);
    const KvDeskObjectId dragged{ZtDrawnType::Line, 150};
    desk.selection.select(dragged);
    desk.shown();
    desk.editor.moveBy({dragged}, QPointF(3, 3));
    desk.shown();
    const qint64 before = desk.view.overlay()->drawnObjects();
    for (int i = 0; i < 20; ++i) {
        desk.editor.moveBy({dragged}, QPointF(3, 0));
        desk.shown();
    }
    QCOMPARE(desk.view.overlay()->drawnObjects(), before);
    desk.selection.clear();
    desk.shown();
    QVERIFY(desk.view.overlay()->drawnObjects() > before);
    QVERIFY(desk.view.overlay()->drawnObjects() - before < 30);
}

void KvDeskOverlayTest::framesDrawNothingAgain()
{
    DeskView desk;
    addGrid(&desk.document);
    desk.shown();
    const qint64 before = desk.view.overlay()->drawnObjects();
    desk.view.refresh();
    desk.shown();
    QCOMPARE(desk.view.overlay()->drawnObjects(), before);
}

void KvDeskOverlayTest::burntPictureIsWhatTheScreenShows()
{
    ZtMeasuringDocument document;
    const QPolygonF three = polygon({{60, 200}, {160, 210}, {100, 270}});
    document.addObject(ZtDrawnType::Rectangle, polygon({{30, 40}, {120, 100}}));
    document.addObject(ZtDrawnType::Circle, polygon({{250, 100}, {280, 120}}));
    document.addObject(ZtDrawnType::Polygon, three);
    document.addObject(ZtDrawnType::Arc, three.translated(150, 0));
    document.addObject(ZtDrawnType::Counter, three.translated(20, -60));
    document.addObject(ZtDrawnType::TextNote, polygon({{320, 40}}), QString(), QStringLiteral("Note"));
    document.addObject(ZtDrawnType::ScaleBar, polygon({{300, 280}, {380, 280}}));
    QImage blank(viewSize, QImage::Format_RGB32);
    blank.fill(Qt::darkGreen);
    ZtImage burnt(blank);
    ZtImageTools::getInstance()->drawEditorObjectsOnImage(&burnt, QTransform());
    QImage screen = blank;
    QPainter painter(&screen);
    painter.drawImage(0, 0, drawAnew(document.objectsPainter(), QTransform()));
    painter.end();
    QVERIFY(burnt.getQImage() != blank);
    // Blending in two steps rounds twice.
    const QImage picture = burnt.getQImage();
    for (int y = 0; y < screen.height(); ++y) {
        for (int x = 0; x < screen.width(); ++x) {
            const QColor a = screen.pixelColor(x, y);
            const QColor b = picture.pixelColor(x, y);
            const int difference =
                qMax(qAbs(a.red() - b.red()), qMax(qAbs(a.green() - b.green()), qAbs(a.blue() - b.blue())));
            QVERIFY2(difference <= 3,
                     qPrintable(QStringLiteral("%1 at %2, %3").arg(difference).arg(x).arg(y)));
        }
    }
}

void KvDeskOverlayTest::labelsAreHiddenWhereCrowded()
{
    ZtMeasuringDocument document;
    const int count = ZtObjectsPainter::maximumLabels + 1;
    for (int i = 0; i < count; ++i) {
        const QPointF start(i % 20 * 20, i / 20 * 10);
        document.addObject(ZtDrawnType::Line, polygon({start, start + QPointF(1, 1)}));
    }
    const QImage crowded = drawAnew(document.objectsPainter(), QTransform());
    document.objectsPainter()->setLabelsShown(false);
    QVERIFY(crowded == drawAnew(document.objectsPainter(), QTransform()));
    document.objectsPainter()->setLabelsShown(true);
    // What is selected keeps its label.
    KvDeskSelection selection;
    selection.select({ZtDrawnType::Line, 210});
    KvDeskOverlay overlay;
    overlay.setPainter(document.objectsPainter());
    overlay.setSelection(&selection);
    const QImage withLabel = draw(&overlay, QTransform());
    document.objectsPainter()->setLabelsShown(false);
    overlay.slotLabelsChanged();
    QVERIFY(withLabel != draw(&overlay, QTransform()));
}

void KvDeskOverlayTest::labelsCanBeHidden()
{
    DeskView desk;
    desk.line({100, 100}, {200, 100});
    const QImage with = desk.shown();
    desk.view.slotSetLabelsVisible(false);
    QVERIFY(!desk.view.areLabelsVisible());
    const QImage without = desk.shown();
    QVERIFY(with != without);
    // Nothing but the line is left.
    QCOMPARE(without.pixelColor(desk.at(150, 90)), QColor(Qt::blue));
    desk.view.slotSetLabelsVisible(true);
    QVERIFY(desk.shown() == with);
}

void KvDeskOverlayTest::manySelectedObjectsAreRough()
{
    DeskView desk;
    desk.view.slotSetLabelsVisible(false);
    QSet<KvDeskObjectId> all;
    for (int i = 0; i <= KvDeskObjectLayer::mostInFull; ++i) {
        const QPointF start(4 + 8 * (i % 48), 4 + 8 * (i / 48));
        all.insert(desk.line(start, start + QPointF(4, 0)));
    }
    const QImage before = desk.shown();
    desk.selection.set(all, *all.begin());
    const QImage selected = desk.shown();
    const QColor accent = acss::QtAdvancedStylesheet::getInstance()->color(QStringLiteral("accent-hover"));
    for (int i = 0; i <= KvDeskObjectLayer::mostInFull; ++i) {
        const QPoint middle = desk.at(6 + 8 * (i % 48), 4 + 8 * (i / 48));
        QVERIFY(before.pixelColor(middle) != accent);
        QCOMPARE(selected.pixelColor(middle), accent);
    }
    desk.selection.clear();
    QCOMPARE(desk.shown(), before);
}

void KvDeskOverlayTest::noMoreTextsThanAnybodyReads()
{
    ZtMeasuringDocument document;
    for (int i = 0; i < 20 * ZtObjectsPainter::maximumLabels; ++i)
        document.addObject(ZtDrawnType::TextNote, polygon({{1.0 * (i % 400), 0.25 * (i % 1200)}}), QString(),
                           QStringLiteral("x"));
    KvDeskOverlay overlay;
    overlay.setPainter(document.objectsPainter());
    const QImage shown = draw(&overlay, QTransform());
    // Some are there, the first ones.
    QVERIFY(shown != drawAnew(nullptr, QTransform()));
    const QImage again = draw(&overlay, QTransform::fromTranslate(-1.0, 0.0));
    QVERIFY(again != shown);
}

void KvDeskOverlayTest::zoomingStretchesManyObjects()
{
    ZtMeasuringDocument document;
    for (int i = 0; i <= KvDeskObjectLayer::mostInFull; ++i) {
        const QPointF start(4 + 8 * (i % 48), 4 + 8 * (i / 48));
        document.addObject(ZtDrawnType::Line, polygon({start, start + QPointF(4, 0)}));
    }
    KvDeskOverlay overlay;
    overlay.setPainter(document.objectsPainter());
    draw(&overlay, QTransform());
    QSignalSpy updated(&overlay, SIGNAL(signalUpdated()));
    const qint64 before = overlay.drawnObjects();
    QTransform toView;
    for (int step = 0; step < 5; ++step) {
        toView.scale(1.1, 1.1);
        const QImage stretched = draw(&overlay, toView);
        // The first line, which has grown.
        QVERIFY(stretched.pixelColor(toView.map(QPoint(6, 4))).alpha() > 0);
    }
    QCOMPARE(overlay.drawnObjects(), before);

    // What changes meanwhile is seen as soon as the picture is sharp again.
    document.addObject(ZtDrawnType::Line, polygon({{4, 200}, {390, 200}}));
    updated.clear();
    QVERIFY(updated.wait(5000));
    QCOMPARE(updated.count(), 1);
    QVERIFY(draw(&overlay, toView) == drawAnew(document.objectsPainter(), toView));
    QVERIFY(overlay.drawnObjects() > before);
    QVERIFY(!updated.wait(500));
}

void KvDeskOverlayTest::zoomingDrawsFewObjects()
{
    ZtMeasuringDocument document;
    addGrid(&document);
    KvDeskOverlay overlay;
    overlay.setPainter(document.objectsPainter());
    draw(&overlay, QTransform());
    const QTransform toView = QTransform::fromScale(1.1, 1.1);
    QVERIFY(draw(&overlay, toView) == drawAnew(document.objectsPainter(), toView));
}

STATREPORT_TEST_MAIN(KvDeskOverlayTest)
#include "KvDeskOverlayTest.moc"
