// SPDX-License-Identifier: MIT
#include "KvDeskSelectTool.h"

#include "DeskView.h"
#include "KvDeskInlineEditor.h"

class KvDeskSelectToolTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void clickSelects();
    void controlClickToggles();
    void dragMovesTheSelection();
    void dragOfAnotherObjectSelectsIt();
    void shiftKeepsDragsStraight();
    void clickThinsTheSelectionOut();
    void bandSelects();
    void handlesChangePoints();
    void handlesSnap();
    void handlesOfCounters();
    void escapeTakesADragBack();
    void escapeClearsTheSelection();
    void arrowKeysNudge();
    void tabWalks();
    void tabGoesOnWithoutObjects();
    void doubleClickRenames();
    void handlesAreDrawn();
    void nothingIsChangedWithoutAnEditor();

private:
    std::unique_ptr<DeskView> m_desk;
    KvDeskObjectId m_first;
    KvDeskObjectId m_second;
};

void KvDeskSelectToolTest::init()
{
    StatReportTest::init();
    m_desk = std::make_unique<DeskView>();
    m_first = m_desk->line({50, 50}, {150, 50});
    m_second = m_desk->line({50, 150}, {150, 150});
}

void KvDeskSelectToolTest::cleanup()
{
    m_desk.reset();
    StatReportTest::cleanup();
}

void KvDeskSelectToolTest::clickSelects()
{
    m_desk->click({100, 50});
    QCOMPARE(m_desk->selection.objects(), QSet<KvDeskObjectId>{m_first});
    m_desk->click({300, 250});
    QVERIFY(m_desk->selection.isEmpty());
    QCOMPARE(m_desk->steps(), 0);
}

void KvDeskSelectToolTest::controlClickToggles()
{
    m_desk->click({100, 50});
    m_desk->click({100, 150}, Qt::ControlModifier);
    QCOMPARE(m_desk->selection.objects(), (QSet<KvDeskObjectId>{m_first, m_second}));
    m_desk->click({300, 250}, Qt::ControlModifier);
    QCOMPARE(m_desk->selection.objects().size(), 2);
    m_desk->click({100, 50}, Qt::ControlModifier);
    QCOMPARE(m_desk->selection.objects(), QSet<KvDeskObjectId>{m_second});
}

void KvDeskSelectToolTest::dragMovesTheSelection()
{
    m_desk->selection.set({m_first, m_second}, m_first);
    m_desk->drag({100, 50}, {130, 70});
    QVERIFY(isNear(m_desk->points(m_first).first(), {80, 70}));
    QVERIFY(isNear(m_desk->points(m_second).first(), {80, 170}));
    // However many moves of the mouse it took.
    QCOMPARE(m_desk->steps(), 1);
    m_desk->drag({130, 70}, {140, 70});
    QCOMPARE(m_desk->steps(), 2);
    m_desk->editor.slotUndo();
    m_desk->editor.slotUndo();
    QCOMPARE(m_desk->points(m_first), polygon({{50, 50}, {150, 50}}));
    QCOMPARE(m_desk->points(m_second), polygon({{50, 150}, {150, 150}}));
}

void KvDeskSelectToolTest::dragOfAnotherObjectSelectsIt()
{
    m_desk->selection.select(m_first);
    m_desk->drag({100, 150}, {110, 160});
    QCOMPARE(m_desk->selection.objects(), QSet<KvDeskObjectId>{m_second});
    QCOMPARE(m_desk->points(m_first), polygon({{50, 50}, {150, 50}}));
    QVERIFY(isNear(m_desk->points(m_second).first(), {60, 160}));
}

void KvDeskSelectToolTest::shiftKeepsDragsStraight()
{
    m_desk->drag({100, 50}, {140, 55}, Qt::ShiftModifier);
    QVERIFY(isNear(m_desk->points(m_first).first(), {90, 50}));
    QCOMPARE(m_desk->points(m_first).first().y(), 50.0);
}

void KvDeskSelectToolTest::clickThinsTheSelectionOut()
{
    m_desk->selection.set({m_first, m_second}, m_second);
    m_desk->click({100, 50});
    QCOMPARE(m_desk->selection.objects(), QSet<KvDeskObjectId>{m_first});
}

void KvDeskSelectToolTest::bandSelects()
{
    m_desk->drag({200, 200}, {30, 120});
    QCOMPARE(m_desk->selection.objects(), QSet<KvDeskObjectId>{m_second});
    // With Ctrl others are added; what lies inside in part only is not meant.
    m_desk->drag({200, 80}, {30, 30}, Qt::ControlModifier);
    QCOMPARE(m_desk->selection.objects(), (QSet<KvDeskObjectId>{m_first, m_second}));
    m_desk->drag({100, 80}, {30, 30});
    QVERIFY(m_desk->selection.isEmpty());
    QCOMPARE(m_desk->steps(), 0);
}

void KvDeskSelectToolTest::handlesChangePoints()
{
    m_desk->selection.select(m_first);
    m_desk->drag({150, 50}, {170, 90});
    QCOMPARE(m_desk->points(m_first).first(), QPointF(50, 50));
    QVERIFY(isNear(m_desk->points(m_first).last(), {170, 90}));
    QCOMPARE(m_desk->steps(), 1);
    QCOMPARE(m_desk->editor.undoStack()->undoText(), QStringLiteral("change of Line 1"));
    // Straight from the point before, in steps of 15 degrees.
    m_desk->drag({170, 90}, {160, 54}, Qt::ShiftModifier);
    QCOMPARE(m_desk->points(m_first).last().y(), 50.0);
}

void KvDeskSelectToolTest::handlesSnap()
{
    m_desk->selection.select(m_first);
    m_desk->drag({150, 50}, {147, 146});
    QCOMPARE(m_desk->points(m_first).last(), QPointF(150, 150));
    m_desk->selection.select(m_first);
    m_desk->drag({50, 50}, {53, 153});
    QCOMPARE(m_desk->points(m_first).first(), QPointF(50, 150));
}

void KvDeskSelectToolTest::handlesOfCounters()
{
    const KvDeskObjectId counter{
        ZtDrawnType::Counter,
        m_desk->document.addObject(ZtDrawnType::Counter, polygon({{300, 100}, {320, 100}}))};
    m_desk->selection.select(counter);
    m_desk->drag({320, 100}, {340, 120});
    QCOMPARE(m_desk->points(counter).first(), QPointF(300, 100));
    QVERIFY(isNear(m_desk->points(counter).last(), {340, 120}));
}

void KvDeskSelectToolTest::escapeTakesADragBack()
{
    m_desk->press({100, 50});
    m_desk->move({130, 80}, Qt::LeftButton);
    QVERIFY(isNear(m_desk->points(m_first).first(), {80, 80}));
    m_desk->key(Qt::Key_Escape);
    QCOMPARE(m_desk->points(m_first), polygon({{50, 50}, {150, 50}}));
    m_desk->move({140, 90}, Qt::LeftButton);
    m_desk->release({140, 90});
    QCOMPARE(m_desk->points(m_first), polygon({{50, 50}, {150, 50}}));
    QVERIFY(!m_desk->editor.undoStack()->canUndo());
}

void KvDeskSelectToolTest::escapeClearsTheSelection()
{
    m_desk->selection.select(m_first);
    m_desk->key(Qt::Key_Escape);
    QVERIFY(m_desk->selection.isEmpty());
}

void KvDeskSelectToolTest::arrowKeysNudge()
{
    m_desk->selection.set({m_first, m_second}, m_first);
    m_desk->key(Qt::Key_Right);
    m_desk->key(Qt::Key_Right);
    m_desk->key(Qt::Key_Down, Qt::ShiftModifier);
    m_desk->key(Qt::Key_Left, Qt::ShiftModifier);
    m_desk->key(Qt::Key_Up);
    QCOMPARE(m_desk->points(m_first), polygon({{42, 59}, {142, 59}}));
    QCOMPARE(m_desk->points(m_second), polygon({{42, 159}, {142, 159}}));
    QCOMPARE(m_desk->steps(), 1);
    m_desk->editor.slotUndo();
    QCOMPARE(m_desk->points(m_first), polygon({{50, 50}, {150, 50}}));
}

void KvDeskSelectToolTest::tabWalks()
{
    const KvDeskObjectId circle{ZtDrawnType::Circle,
                                m_desk->document.addObject(ZtDrawnType::Circle, polygon({{9, 9}, {12, 12}}))};
    for (const KvDeskObjectId &object : {m_first, m_second, circle, m_first}) {
        m_desk->key(Qt::Key_Tab);
        QCOMPARE(m_desk->selection.current(), object);
    }
    for (const KvDeskObjectId &object : {circle, m_second}) {
        m_desk->key(Qt::Key_Backtab, Qt::ShiftModifier);
        QCOMPARE(m_desk->selection.current(), object);
    }
    QCOMPARE(m_desk->selection.objects().size(), 1);
}

void KvDeskSelectToolTest::tabGoesOnWithoutObjects()
{
    m_desk->document.clear();
    QKeyEvent event(QEvent::KeyPress, Qt::Key_Tab, Qt::NoModifier);
    KvDeskSelectTool tool(&m_desk->view);
    QVERIFY(!tool.key(&event));
}

void KvDeskSelectToolTest::doubleClickRenames()
{
    m_desk->doubleClick({100, 50});
    QVERIFY(m_desk->view.inlineEditor()->isVisible());
    QCOMPARE(m_desk->view.inlineEditor()->text(), QStringLiteral("Line 1"));
}

void KvDeskSelectToolTest::handlesAreDrawn()
{
    const QColor before = m_desk->shown().pixelColor(m_desk->at(150, 50));
    m_desk->selection.select(m_first);
    const QColor handle = m_desk->shown().pixelColor(m_desk->at(150, 50));
    QVERIFY(handle != before);
    // Two selected objects can be moved only.
    m_desk->selection.set({m_first, m_second}, m_first);
    QVERIFY(m_desk->shown().pixelColor(m_desk->at(150, 50)) != handle);
}

void KvDeskSelectToolTest::nothingIsChangedWithoutAnEditor()
{
    KvDeskImageView view;
    view.resize(640, 480);
    view.setDocument(&m_desk->document);
    view.show();
    view.selection()->select(m_first);
    QTest::keyClick(&view, Qt::Key_Right);
    QTest::keyClick(&view, Qt::Key_Escape);
    QCOMPARE(m_desk->points(m_first), polygon({{50, 50}, {150, 50}}));
    QVERIFY(view.selectedObject().isNull());
}

STATREPORT_TEST_MAIN(KvDeskSelectToolTest)
#include "KvDeskSelectToolTest.moc"
