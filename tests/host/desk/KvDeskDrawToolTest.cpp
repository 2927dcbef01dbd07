// SPDX-License-Identifier: MIT
#include "KvDeskDrawTool.h"

#include "DeskView.h"
#include "KvDeskInlineEditor.h"

class KvDeskDrawToolTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void clicksDraw_data();
    void clicksDraw();
    void dragDraws_data();
    void dragDraws();
    void doubleClickEnds_data();
    void doubleClickEnds();
    void enterEnds();
    void enterWaitsForEnoughPoints();
    void backspaceTakesPointsBack();
    void escapeCancels();
    void otherToolCancels();
    void doubleClickIsNoLineOfNoLength();
    void shiftKeepsDirections();
    void shiftMakesSquares();
    void pointsAttract();
    void controlSuspendsSnapping();
    void valuesAreShownWhileDrawing();
    void shapeIsDrawnWhileDrawing();
    void noteIsWrittenInPlace();
    void everythingByKeys();
    void polygonByKeys();
    void arrowsStepOverPixelsAtAnyZoom_data();
    void arrowsStepOverPixelsAtAnyZoom();

private:
    KvDeskDrawTool *use(int type);

    std::unique_ptr<DeskView> m_desk;
    std::unique_ptr<KvDeskDrawTool> m_tool;
};

void KvDeskDrawToolTest::init()
{
    StatReportTest::init();
    m_desk = std::make_unique<DeskView>();
}

void KvDeskDrawToolTest::cleanup()
{
    m_desk->view.setTool(nullptr);
    m_tool.reset();
    m_desk.reset();
    StatReportTest::cleanup();
}

KvDeskDrawTool *KvDeskDrawToolTest::use(int type)
{
    m_desk->view.setTool(nullptr);
    m_tool = std::make_unique<KvDeskDrawTool>(&m_desk->view, type);
    m_desk->view.setTool(m_tool.get());
    return m_tool.get();
}

void KvDeskDrawToolTest::clicksDraw_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QPolygonF>("places");
    const QPolygonF two = polygon({{50, 60}, {150, 90}});
    const QPolygonF three = polygon({{50, 60}, {150, 90}, {60, 130}});
    QTest::newRow("line") << static_cast<int>(ZtDrawnType::Line) << two;
    QTest::newRow("rectangle") << static_cast<int>(ZtDrawnType::Rectangle) << two;
    QTest::newRow("circle") << static_cast<int>(ZtDrawnType::Circle) << two;
    QTest::newRow("scale bar") << static_cast<int>(ZtDrawnType::ScaleBar) << two;
    QTest::newRow("arc") << static_cast<int>(ZtDrawnType::Arc) << three;
    QTest::newRow("parallel distance") << static_cast<int>(ZtDrawnType::ParallelDistance) << three;
}

void KvDeskDrawToolTest::clicksDraw()
{
    QFETCH(int, type);
    QFETCH(QPolygonF, places);
    use(type);
    QCOMPARE(m_desk->view.viewport()->cursor().shape(), Qt::CrossCursor);
    for (const QPointF &place : places) {
        QCOMPARE(m_desk->count(type), 0);
        m_desk->click(place);
    }
    QCOMPARE(m_desk->count(type), 1);
    const QPolygonF points = m_desk->points({type, 1});
    QCOMPARE(points.size(), places.size());
    for (int i = 0; i < points.size(); ++i)
        QVERIFY(isNear(points.at(i), places.at(i)));
    QCOMPARE(m_desk->selection.current(), (KvDeskObjectId{type, 1}));
    QCOMPARE(m_desk->steps(), 1);
    // The tool stays for the next one.
    QVERIFY(m_tool->points().isEmpty());
    m_desk->editor.slotUndo();
    QCOMPARE(m_desk->count(type), 0);
}

void KvDeskDrawToolTest::dragDraws_data()
{
    QTest::addColumn<int>("type");
    for (const int type :
         {ZtDrawnType::Line, ZtDrawnType::Rectangle, ZtDrawnType::Circle, ZtDrawnType::ScaleBar})
        QTest::newRow(ZtDrawnType::find(type)->key) << type;
}

void KvDeskDrawToolTest::dragDraws()
{
    QFETCH(int, type);
    use(type);
    m_desk->drag({50, 60}, {150, 90});
    QCOMPARE(m_desk->count(type), 1);
    QVERIFY(isNear(m_desk->points({type, 1}).last(), {150, 90}));
}

void KvDeskDrawToolTest::doubleClickEnds_data()
{
    QTest::addColumn<int>("type");
    QTest::newRow("polyline") << static_cast<int>(ZtDrawnType::Polyline);
    QTest::newRow("polygon") << static_cast<int>(ZtDrawnType::Polygon);
}

void KvDeskDrawToolTest::doubleClickEnds()
{
    QFETCH(int, type);
    use(type);
    m_desk->click({50, 60});
    m_desk->drag({150, 60}, {150, 120});
    // As Qt reports it: a click, then a double click.
    m_desk->click({60, 150});
    m_desk->doubleClick({60, 150});
    QCOMPARE(m_desk->count(type), 1);
    QCOMPARE(m_desk->points({type, 1}).size(), 4);
    QVERIFY(m_tool->points().isEmpty());
}

void KvDeskDrawToolTest::enterEnds()
{
    use(ZtDrawnType::Polyline);
    m_desk->click({50, 60});
    m_desk->click({150, 60});
    m_desk->click({150, 160});
    m_desk->key(Qt::Key_Return);
    QCOMPARE(m_desk->points({ZtDrawnType::Polyline, 1}).size(), 3);
}

void KvDeskDrawToolTest::enterWaitsForEnoughPoints()
{
    use(ZtDrawnType::Polygon);
    m_desk->click({50, 60});
    m_desk->click({150, 60});
    m_desk->key(Qt::Key_Enter);
    QCOMPARE(m_desk->count(ZtDrawnType::Polygon), 0);
    QCOMPARE(m_tool->points().size(), 2);
    m_desk->click({150, 160});
    m_desk->key(Qt::Key_Enter);
    QCOMPARE(m_desk->count(ZtDrawnType::Polygon), 1);
}

void KvDeskDrawToolTest::backspaceTakesPointsBack()
{
    use(ZtDrawnType::Polyline);
    m_desk->click({50, 60});
    m_desk->click({150, 60});
    m_desk->click({300, 60});
    m_desk->key(Qt::Key_Backspace);
    m_desk->click({150, 160});
    m_desk->key(Qt::Key_Return);
    const QPolygonF points = m_desk->points({ZtDrawnType::Polyline, 1});
    QCOMPARE(points.size(), 3);
    QVERIFY(isNear(points.last(), {150, 160}));
}

void KvDeskDrawToolTest::escapeCancels()
{
    use(ZtDrawnType::Line);
    QSignalSpy left(&m_desk->view, SIGNAL(signalToolLeft()));
    m_desk->click({50, 60});
    m_desk->key(Qt::Key_Escape);
    QVERIFY(m_tool->points().isEmpty());
    QCOMPARE(left.count(), 0);
    m_desk->key(Qt::Key_Escape);
    QCOMPARE(left.count(), 1);
    QCOMPARE(m_desk->steps(), 0);
}

void KvDeskDrawToolTest::otherToolCancels()
{
    use(ZtDrawnType::Line);
    m_desk->click({50, 60});
    m_desk->view.setTool(nullptr);
    QVERIFY(m_tool->points().isEmpty());
    QCOMPARE(m_desk->view.viewport()->cursor().shape(), Qt::ArrowCursor);
}

void KvDeskDrawToolTest::doubleClickIsNoLineOfNoLength()
{
    use(ZtDrawnType::Line);
    m_desk->click({50, 60});
    m_desk->doubleClick({50, 60});
    QCOMPARE(m_desk->count(ZtDrawnType::Line), 0);
    m_desk->click({90, 60});
    QCOMPARE(m_desk->count(ZtDrawnType::Line), 1);
}

void KvDeskDrawToolTest::shiftKeepsDirections()
{
    use(ZtDrawnType::Line);
    m_desk->click({50, 60});
    m_desk->click({150, 67}, Qt::ShiftModifier);
    const QPolygonF level = m_desk->points({ZtDrawnType::Line, 1});
    QCOMPARE(level.first().y(), level.last().y());
    QVERIFY(level.last().x() > 140.0);
    m_desk->click({50, 100});
    m_desk->click({120, 165}, Qt::ShiftModifier);
    const QPointF way =
        m_desk->points({ZtDrawnType::Line, 2}).last() - m_desk->points({ZtDrawnType::Line, 2}).first();
    QVERIFY(qAbs(way.x() - way.y()) < 1e-9);
}

void KvDeskDrawToolTest::shiftMakesSquares()
{
    use(ZtDrawnType::Rectangle);
    m_desk->drag({50, 60}, {150, 90}, Qt::ShiftModifier);
    const QPolygonF corners = m_desk->points({ZtDrawnType::Rectangle, 1});
    const QPointF size = corners.last() - corners.first();
    QCOMPARE(size.x(), size.y());
    QVERIFY(isNear(size, {100, 100}));
}

void KvDeskDrawToolTest::pointsAttract()
{
    m_desk->line({50, 50}, {150, 50});
    use(ZtDrawnType::Line);
    m_desk->click({153, 54});
    m_desk->click({54, 47});
    QCOMPARE(m_desk->points({ZtDrawnType::Line, 2}), polygon({{150, 50}, {50, 50}}));
}

void KvDeskDrawToolTest::controlSuspendsSnapping()
{
    m_desk->line({50, 50}, {150, 50});
    use(ZtDrawnType::Line);
    m_desk->click({153, 54}, Qt::ControlModifier);
    m_desk->click({250, 60}, Qt::ControlModifier | Qt::ShiftModifier);
    const QPolygonF points = m_desk->points({ZtDrawnType::Line, 2});
    QVERIFY(points.first() != QPointF(150, 50));
    QVERIFY(isNear(points.first(), {153, 54}));
    QVERIFY(isNear(points.last(), {250, 60}));
}

void KvDeskDrawToolTest::valuesAreShownWhileDrawing()
{
    use(ZtDrawnType::Line);
    QCOMPARE(m_tool->valueText(), QString());
    m_desk->key(Qt::Key_Right);
    m_desk->key(Qt::Key_Space);
    for (int i = 0; i < 3; ++i)
        m_desk->key(Qt::Key_Right, Qt::ShiftModifier);
    QCOMPARE(m_tool->valueText(), QStringLiteral("30.0 px"));
    use(ZtDrawnType::Rectangle);
    m_desk->key(Qt::Key_Right);
    m_desk->key(Qt::Key_Space);
    m_desk->key(Qt::Key_Right, Qt::ShiftModifier);
    m_desk->key(Qt::Key_Down, Qt::ShiftModifier);
    QCOMPARE(m_tool->valueText(), QStringLiteral("Width  10.0 px\nHeight  10.0 px\nArea  100.0 px\u00B2"));
}

void KvDeskDrawToolTest::shapeIsDrawnWhileDrawing()
{
    use(ZtDrawnType::Line);
    m_desk->click({50, 100});
    const QImage before = m_desk->shown();
    QCOMPARE(before.pixelColor(m_desk->at(150, 100)), QColor(Qt::blue));
    m_desk->move({250, 100});
    QVERIFY(m_desk->shown().pixelColor(m_desk->at(150, 100)) != QColor(Qt::blue));
    m_desk->key(Qt::Key_Escape);
    QCOMPARE(m_desk->shown().pixelColor(m_desk->at(150, 100)), QColor(Qt::blue));
}

void KvDeskDrawToolTest::noteIsWrittenInPlace()
{
    use(ZtDrawnType::TextNote);
    m_desk->click({100, 100});
    KvDeskInlineEditor *const field = m_desk->view.inlineEditor();
    QVERIFY(field->isVisible());
    QCOMPARE(m_desk->count(ZtDrawnType::TextNote), 0);
    QTest::keyClicks(field, QStringLiteral("Vent L"));
    QTest::keyClick(field, Qt::Key_Return);
    QCOMPARE(KvDeskObjectState::of({ZtDrawnType::TextNote, 1}).text, QStringLiteral("Vent L"));
    QVERIFY(isNear(m_desk->points({ZtDrawnType::TextNote, 1}).first(), {100, 100}));
    // Without a text there is no note.
    m_desk->click({200, 100});
    QTest::keyClick(field, Qt::Key_Return);
    m_desk->click({200, 200});
    QTest::keyClicks(field, QStringLiteral("No"));
    QTest::keyClick(field, Qt::Key_Escape);
    QCOMPARE(m_desk->count(ZtDrawnType::TextNote), 1);
}

void KvDeskDrawToolTest::everythingByKeys()
{
    use(ZtDrawnType::Line);
    QSignalSpy moved(&m_desk->view, SIGNAL(signalPointerMoved(QPointF)));
    m_desk->key(Qt::Key_Left);
    QCOMPARE(moved.count(), 1);
    m_desk->key(Qt::Key_Space);
    m_desk->key(Qt::Key_Down, Qt::ShiftModifier);
    m_desk->key(Qt::Key_Right);
    m_desk->key(Qt::Key_Return);
    const QPolygonF points = m_desk->points({ZtDrawnType::Line, 1});
    QCOMPARE(points.size(), 2);
    QCOMPARE(points.last() - points.first(), QPointF(1, 10));
    // The space bar does not move the image meanwhile.
    QCOMPARE(m_desk->view.viewport()->cursor().shape(), Qt::CrossCursor);
}

void KvDeskDrawToolTest::polygonByKeys()
{
    use(ZtDrawnType::Polygon);
    for (const Qt::Key key : {Qt::Key_Left, Qt::Key_Down, Qt::Key_Right}) {
        m_desk->key(key, Qt::ShiftModifier);
        m_desk->key(Qt::Key_Return);
    }
    QCOMPARE(m_desk->count(ZtDrawnType::Polygon), 0);
    // Where the last point is already, Enter ends.
    m_desk->key(Qt::Key_Return);
    QCOMPARE(m_desk->points({ZtDrawnType::Polygon, 1}).size(), 3);
}

void KvDeskDrawToolTest::arrowsStepOverPixelsAtAnyZoom_data()
{
    QTest::addColumn<int>("zoomSteps");
    QTest::newRow("actual size") << 0;
    QTest::newRow("61 percent and less") << -3;
    QTest::newRow("tiny") << -12;
    QTest::newRow("large") << 6;
}

void KvDeskDrawToolTest::arrowsStepOverPixelsAtAnyZoom()
{
    QFETCH(int, zoomSteps);
    for (int i = 0; i < qAbs(zoomSteps); ++i) {
        if (zoomSteps < 0)
            m_desk->view.slotZoomOut();
        else
            m_desk->view.slotZoomIn();
    }
    use(ZtDrawnType::Polyline);
    m_desk->key(Qt::Key_Right);
    m_desk->key(Qt::Key_Space);
    m_desk->key(Qt::Key_Right);
    m_desk->key(Qt::Key_Space);
    for (int i = 0; i < 3; ++i)
        m_desk->key(Qt::Key_Down, Qt::ShiftModifier);
    m_desk->key(Qt::Key_Space);
    const QPolygonF points = m_tool->points();
    QCOMPARE(points.size(), 3);
    QCOMPARE(points.at(0), QPointF(points.at(0).toPoint()));
    QCOMPARE(points.at(1) - points.at(0), QPointF(1, 0));
    QCOMPARE(points.at(2) - points.at(1), QPointF(0, 30));
}

STATREPORT_TEST_MAIN(KvDeskDrawToolTest)
#include "KvDeskDrawToolTest.moc"
