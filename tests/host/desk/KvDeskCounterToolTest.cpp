// SPDX-License-Identifier: MIT
#include "KvDeskCounterTool.h"

#include "DeskView.h"
#include "KvDeskActions.h"
#include "KvDeskCounterBar.h"
#include "KvDeskResources.h"
#include "KvDeskToolBox.h"

#include <QAction>
#include <QComboBox>
#include <QToolButton>

namespace {

const KvDeskObjectId counter1{ZtDrawnType::Counter, 1};
const KvDeskObjectId counter2{ZtDrawnType::Counter, 2};

} // namespace

class KvDeskCounterToolTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase() { KvDeskResources::ensure(); }
    void init();
    void cleanup();

    void clicksCount();
    void placesAreOnTheImage_data();
    void placesAreOnTheImage();
    void crosshairBesideTheImageCountsNothing();
    void withoutAnImageEveryPlaceCounts();
    void everyClickIsOneStep();
    void quickClicksCountTwice();
    void rightClickTakesAway_data();
    void rightClickTakesAway();
    void classes();
    void digitsChooseAClass();
    void nextDigitBeginsAClass();
    void keyBeginsAClass();
    void countsByKeys();
    void barFollows();
    void barChooses();
    void barIsShownOnlyForCounting();

private:
    QAction *action(KvDeskActions::Id id) const { return m_actions->action(id); }

    std::unique_ptr<DeskView> m_desk;
    std::unique_ptr<KvDeskActions> m_actions;
    std::unique_ptr<KvDeskToolBox> m_toolBox;
    KvDeskCounterBar *m_bar = nullptr;
};

void KvDeskCounterToolTest::init()
{
    StatReportTest::init();
    m_desk = std::make_unique<DeskView>();
    m_actions = std::make_unique<KvDeskActions>();
    m_toolBox = std::make_unique<KvDeskToolBox>(m_actions.get(), &m_desk->view);
    m_bar = new KvDeskCounterBar(m_toolBox.get(), &m_desk->view);
    action(KvDeskActions::CounterTool)->trigger();
}

void KvDeskCounterToolTest::cleanup()
{
    m_desk->view.setTool(nullptr);
    delete m_bar;
    m_toolBox.reset();
    m_actions.reset();
    m_desk.reset();
    StatReportTest::cleanup();
}

void KvDeskCounterToolTest::clicksCount()
{
    QVERIFY(m_toolBox->counterTool()->counter().isNull());
    m_desk->click({100, 100});
    m_desk->click({120, 100});
    m_desk->click({140, 100});
    QCOMPARE(m_desk->count(ZtDrawnType::Counter), 1);
    QCOMPARE(m_desk->points(counter1).size(), 3);
    QVERIFY(isNear(m_desk->points(counter1).last(), {140, 100}));
    QCOMPARE(m_desk->selection.current(), counter1);
}

void KvDeskCounterToolTest::placesAreOnTheImage_data()
{
    QTest::addColumn<QPointF>("place");
    QTest::addColumn<bool>("counts");
    QTest::newRow("first corner") << QPointF(0, 0) << true;
    QTest::newRow("last corner") << QPointF(400, 300) << true;
    QTest::newRow("inside") << QPointF(399, 1) << true;
    QTest::newRow("left") << QPointF(-3, 100) << false;
    QTest::newRow("right") << QPointF(403, 100) << false;
    QTest::newRow("above") << QPointF(100, -3) << false;
    QTest::newRow("below") << QPointF(100, 303) << false;
}

void KvDeskCounterToolTest::placesAreOnTheImage()
{
    QFETCH(QPointF, place);
    QFETCH(bool, counts);
    m_desk->view.resize(641, 481); // so that the image's corner is at a whole pixel of the screen
    m_desk->view.slotZoomActual();
    m_desk->click(place);
    QCOMPARE(m_desk->count(ZtDrawnType::Counter), counts ? 1 : 0);
    m_desk->click({200, 150});
    m_desk->click(place);
    QCOMPARE(m_desk->points(counter1).size(), counts ? 3 : 1);
    QCOMPARE(m_desk->steps(), counts ? 3 : 1);
}

void KvDeskCounterToolTest::crosshairBesideTheImageCountsNothing()
{
    m_desk->move({-3, 100});
    m_desk->key(Qt::Key_Left);
    m_desk->key(Qt::Key_Space);
    QCOMPARE(m_desk->count(ZtDrawnType::Counter), 0);
    m_desk->key(Qt::Key_Right, Qt::ShiftModifier);
    m_desk->key(Qt::Key_Space);
    QCOMPARE(m_desk->points(counter1).size(), 1);
}

void KvDeskCounterToolTest::withoutAnImageEveryPlaceCounts()
{
    m_desk->line({0, 0}, {100, 100});
    m_desk->session.clear();
    m_desk->line({0, 0}, {100, 100});
    m_desk->view.flush();
    QVERIFY(m_desk->view.frame().isNull());
    m_desk->click({-10, 50});
    QCOMPARE(m_desk->points(counter1).size(), 1);
}

void KvDeskCounterToolTest::everyClickIsOneStep()
{
    m_desk->click({100, 100});
    m_desk->click({120, 100});
    QCOMPARE(m_desk->steps(), 2);
    m_desk->editor.slotUndo();
    QCOMPARE(m_desk->points(counter1).size(), 1);
    m_desk->editor.slotUndo();
    QCOMPARE(m_desk->count(ZtDrawnType::Counter), 0);
}

void KvDeskCounterToolTest::quickClicksCountTwice()
{
    m_desk->click({100, 100});
    m_desk->doubleClick({102, 100});
    QCOMPARE(m_desk->points(counter1).size(), 2);
}

void KvDeskCounterToolTest::rightClickTakesAway_data()
{
    QTest::addColumn<int>("button");
    QTest::addColumn<int>("modifiers");
    QTest::newRow("right click") << static_cast<int>(Qt::RightButton) << static_cast<int>(Qt::NoModifier);
    QTest::newRow("click with Alt") << static_cast<int>(Qt::LeftButton) << static_cast<int>(Qt::AltModifier);
}

void KvDeskCounterToolTest::rightClickTakesAway()
{
    QFETCH(int, button);
    QFETCH(int, modifiers);
    const auto clickAway = [&](const QPointF &place) {
        m_desk->click(place, static_cast<Qt::KeyboardModifier>(modifiers),
                      static_cast<Qt::MouseButton>(button));
    };
    m_desk->click({100, 100});
    m_desk->click({120, 100});
    clickAway({105, 102});
    QCOMPARE(m_desk->points(counter1).size(), 1);
    QVERIFY(isNear(m_desk->points(counter1).first(), {120, 100}));
    clickAway({200, 200});
    QCOMPARE(m_desk->points(counter1).size(), 1);
    m_desk->editor.slotUndo();
    QVERIFY(isNear(m_desk->points(counter1).first(), {100, 100}));
}

void KvDeskCounterToolTest::classes()
{
    m_desk->click({100, 100});
    m_bar->newClassButton()->click();
    QCOMPARE(m_toolBox->counterTool()->counter(), counter2);
    m_desk->click({120, 100});
    m_desk->click({140, 100});
    QCOMPARE(m_desk->points(counter1).size(), 1);
    QCOMPARE(m_desk->points(counter2).size(), 2);
    // Another object that is selected is no counter: the last one gets the clicks.
    m_desk->selection.select(m_desk->line({200, 200}, {300, 200}));
    m_desk->click({160, 100});
    QCOMPARE(m_desk->points(counter2).size(), 3);
}

void KvDeskCounterToolTest::digitsChooseAClass()
{
    m_desk->click({100, 100});
    m_bar->newClassButton()->click();
    m_desk->key(Qt::Key_1);
    QCOMPARE(m_toolBox->counterTool()->counter(), counter1);
    m_desk->key(Qt::Key_2);
    QCOMPARE(m_toolBox->counterTool()->counter(), counter2);
    m_desk->key(Qt::Key_4);
    QCOMPARE(m_toolBox->counterTool()->counter(), counter2);
    QCOMPARE(m_desk->count(ZtDrawnType::Counter), 2);
}

void KvDeskCounterToolTest::nextDigitBeginsAClass()
{
    m_desk->key(Qt::Key_2);
    QCOMPARE(m_desk->count(ZtDrawnType::Counter), 0);
    m_desk->key(Qt::Key_1);
    m_desk->click({100, 100});
    m_desk->key(Qt::Key_2);
    QCOMPARE(m_toolBox->counterTool()->counter(), counter2);
    m_desk->click({120, 100});
    QCOMPARE(m_desk->points(counter1).size(), 1);
    QCOMPARE(m_desk->points(counter2).size(), 1);
    m_desk->editor.slotUndo();
    m_desk->editor.slotUndo();
    QCOMPARE(m_desk->count(ZtDrawnType::Counter), 1);
}

void KvDeskCounterToolTest::keyBeginsAClass()
{
    m_desk->view.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&m_desk->view));
    QCOMPARE(m_bar->newClassButton()->toolTip(), QStringLiteral("Count another class (Shift+N)"));
    QCOMPARE(m_bar->newClassButton()->accessibleName(), QStringLiteral("Count another class"));
    m_desk->click({100, 100});
    m_desk->key(Qt::Key_N, Qt::ShiftModifier);
    QCOMPARE(m_toolBox->counterTool()->counter(), counter2);
    // It means nothing while nobody counts.
    action(KvDeskActions::LineTool)->trigger();
    m_desk->key(Qt::Key_N, Qt::ShiftModifier);
    QCOMPARE(m_desk->count(ZtDrawnType::Counter), 2);
}

void KvDeskCounterToolTest::countsByKeys()
{
    m_desk->key(Qt::Key_Right);
    m_desk->key(Qt::Key_Space);
    m_desk->key(Qt::Key_Right, Qt::ShiftModifier);
    m_desk->key(Qt::Key_Return);
    const QPolygonF places = m_desk->points(counter1);
    QCOMPARE(places.size(), 2);
    QCOMPARE(places.last() - places.first(), QPointF(10, 0));
    m_desk->key(Qt::Key_Backspace);
    QCOMPARE(m_desk->points(counter1).size(), 1);
}

void KvDeskCounterToolTest::barFollows()
{
    QVERIFY(m_bar->isVisible());
    QCOMPARE(m_bar->classes()->currentText(), QStringLiteral("A new counter"));
    m_desk->click({100, 100});
    m_desk->click({120, 100});
    m_desk->click({140, 100});
    QTRY_COMPARE(m_bar->classes()->currentText(), QStringLiteral("Counter 1  3 pcs  100.00 %"));
    m_bar->newClassButton()->click();
    m_desk->click({160, 100});
    QTRY_COMPARE(m_bar->classes()->currentText(), QStringLiteral("Counter 2  1 pcs  25.000 %"));
    QCOMPARE(m_bar->classes()->count(), 2);
    QCOMPARE(m_bar->classes()->itemText(0), QStringLiteral("Counter 1  3 pcs  75.000 %"));
    m_desk->editor.remove({counter1, counter2});
    QTRY_COMPARE(m_bar->classes()->currentText(), QStringLiteral("A new counter"));
    QCOMPARE(m_bar->classes()->count(), 1);
}

void KvDeskCounterToolTest::barChooses()
{
    m_desk->click({100, 100});
    m_bar->newClassButton()->click();
    QTRY_COMPARE(m_bar->classes()->count(), 2);
    m_bar->classes()->setFocus();
    QTest::keyClick(m_bar->classes(), Qt::Key_Up);
    QCOMPARE(m_toolBox->counterTool()->counter(), counter1);
    m_desk->click({120, 100});
    QCOMPARE(m_desk->points(counter1).size(), 2);
}

void KvDeskCounterToolTest::barIsShownOnlyForCounting()
{
    action(KvDeskActions::LineTool)->trigger();
    QVERIFY(!m_bar->isVisible());
    action(KvDeskActions::CounterTool)->trigger();
    QVERIFY(m_bar->isVisible());
}

STATREPORT_TEST_MAIN(KvDeskCounterToolTest)
#include "KvDeskCounterToolTest.moc"
