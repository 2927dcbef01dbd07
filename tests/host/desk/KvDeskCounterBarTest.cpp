// SPDX-License-Identifier: MIT
#include "KvDeskCounterBar.h"

#include "DeskView.h"
#include "KvDeskActions.h"
#include "KvDeskCounterTool.h"
#include "KvDeskResources.h"
#include "KvDeskToolBox.h"
#include "measuring/ZtDrawnObjectPainter.h"
#include "measuring/ZtMeasuringManipulator.h"

#include <QAction>
#include <QComboBox>
#include <QLabel>
#include <QToolButton>

class KvDeskCounterBarTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase() { KvDeskResources::ensure(); }
    void init();
    void cleanup();

    void isThereWhileTheUserCounts();
    void offersAFirstCounter();
    void classesHaveCountAndShare();
    void classesHaveTheColoursOfTheirMarkers();
    void sharesFollowTheClicks();
    void namesAreThoseOfTheCounters();
    void chosenClassGetsTheClicks();
    void newClassIsChosen();
    void removedClassesGo();
    void manyClassesAreQuick();
    void clicksGoOnAfterChoosing();
    void everythingIsNamed();
    void staysInTheMiddle();
    void fitsANarrowView_data();
    void fitsANarrowView();

private:
    KvDeskObjectId counter(int places)
    {
        QPolygonF points;
        for (int i = 0; i < places; ++i)
            points.append(QPointF(10 + 5 * i, 10));
        return {ZtDrawnType::Counter, m_desk->document.addObject(ZtDrawnType::Counter, points)};
    }
    QStringList texts()
    {
        m_desk->view.flush();
        flushBar();
        QStringList all;
        for (int i = 0; i < m_bar->classes()->count(); ++i)
            all.append(m_bar->classes()->itemText(i).simplified());
        return all;
    }
    /// Choosing the tool anew brings the bar up to date.
    void flushBar()
    {
        m_actions->action(KvDeskActions::SelectTool)->trigger();
        m_actions->action(KvDeskActions::CounterTool)->trigger();
    }

    std::unique_ptr<DeskView> m_desk;
    std::unique_ptr<KvDeskActions> m_actions;
    std::unique_ptr<KvDeskToolBox> m_toolBox;
    KvDeskCounterBar *m_bar = nullptr;
};

void KvDeskCounterBarTest::init()
{
    StatReportTest::init();
    m_desk = std::make_unique<DeskView>();
    m_actions = std::make_unique<KvDeskActions>();
    m_toolBox = std::make_unique<KvDeskToolBox>(m_actions.get(), &m_desk->view);
    m_bar = new KvDeskCounterBar(m_toolBox.get(), &m_desk->view);
    m_actions->action(KvDeskActions::CounterTool)->trigger();
}

void KvDeskCounterBarTest::cleanup()
{
    m_desk->view.setTool(nullptr);
    delete m_bar;
    m_toolBox.reset();
    m_actions.reset();
    m_desk.reset();
    StatReportTest::cleanup();
}

void KvDeskCounterBarTest::isThereWhileTheUserCounts()
{
    QVERIFY(m_bar->isVisible());
    m_actions->action(KvDeskActions::LineTool)->trigger();
    QVERIFY(!m_bar->isVisible());
    m_actions->action(KvDeskActions::CounterTool)->trigger();
    QVERIFY(m_bar->isVisible());
}

void KvDeskCounterBarTest::offersAFirstCounter()
{
    QCOMPARE(texts(), QStringList(QStringLiteral("A new counter")));
    m_bar->newClassButton()->click();
    QCOMPARE(m_desk->count(ZtDrawnType::Counter), 1);
}

void KvDeskCounterBarTest::classesHaveCountAndShare()
{
    counter(3);
    counter(1);
    counter(0);
    QCOMPARE(texts(), QStringList({QStringLiteral("Counter 1 3 pcs 75.000 %"),
                                   QStringLiteral("Counter 2 1 pcs 25.000 %"),
                                   QStringLiteral("Counter 3 0 pcs 0.000 %")}));
}

void KvDeskCounterBarTest::classesHaveTheColoursOfTheirMarkers()
{
    for (int i = 0; i < 12; ++i)
        counter(1);
    const auto colour = [this](int item) {
        return m_bar->classes()->itemIcon(item).pixmap(16, 16).toImage().pixelColor(8, 8);
    };
    QCOMPARE(texts().size(), 12);
    for (int i = 0; i < 12; ++i)
        QCOMPARE(colour(i), ZtDrawnObjectPainter::counterColor(i + 1));
    // A class keeps its colour when another one goes.
    m_desk->editor.remove({{ZtDrawnType::Counter, 1}});
    QCOMPARE(texts().size(), 11);
    QCOMPARE(colour(0), ZtDrawnObjectPainter::counterColor(2));
}

void KvDeskCounterBarTest::sharesFollowTheClicks()
{
    const KvDeskObjectId first = counter(1);
    counter(1);
    QCOMPARE(texts().first(), QStringLiteral("Counter 1 1 pcs 50.000 %"));
    m_toolBox->counterTool()->choose(first);
    m_desk->click({200, 200});
    m_desk->click({220, 200});
    // By itself, too, but not at every click.
    QTRY_COMPARE(m_bar->classes()->itemText(0).simplified(), QStringLiteral("Counter 1 3 pcs 75.000 %"));
    QCOMPARE(m_bar->classes()->itemText(1).simplified(), QStringLiteral("Counter 2 1 pcs 25.000 %"));
    m_desk->editor.slotUndo();
    m_desk->editor.slotUndo();
    QTRY_COMPARE(m_bar->classes()->itemText(0).simplified(), QStringLiteral("Counter 1 1 pcs 50.000 %"));
}

void KvDeskCounterBarTest::namesAreThoseOfTheCounters()
{
    const KvDeskObjectId first = counter(2);
    m_desk->editor.rename(first, QStringLiteral("Cells"));
    QCOMPARE(texts(), QStringList(QStringLiteral("Cells 2 pcs 100.00 %")));
}

void KvDeskCounterBarTest::chosenClassGetsTheClicks()
{
    const KvDeskObjectId first = counter(0);
    const KvDeskObjectId second = counter(0);
    QCOMPARE(texts().size(), 2);
    m_bar->classes()->setCurrentIndex(0);
    emit m_bar->classes()->activated(0);
    m_desk->click({200, 200});
    QCOMPARE(m_desk->points(first).size(), 1);
    m_bar->classes()->setCurrentIndex(1);
    emit m_bar->classes()->activated(1);
    m_desk->click({220, 200});
    QCOMPARE(m_desk->points(second).size(), 1);
    QCOMPARE(m_desk->points(first).size(), 1);
}

void KvDeskCounterBarTest::newClassIsChosen()
{
    counter(2);
    QCOMPARE(texts().size(), 1);
    m_bar->newClassButton()->click();
    QCOMPARE(texts().size(), 2);
    QCOMPARE(m_bar->classes()->currentIndex(), 1);
    // The user may want it back as it was.
    m_desk->editor.slotUndo();
    QCOMPARE(texts().size(), 1);
}

void KvDeskCounterBarTest::removedClassesGo()
{
    const KvDeskObjectId first = counter(1);
    counter(1);
    QCOMPARE(texts().size(), 2);
    m_desk->editor.remove({first});
    QCOMPARE(texts(), QStringList(QStringLiteral("Counter 2 1 pcs 100.00 %")));
}

void KvDeskCounterBarTest::manyClassesAreQuick()
{
    for (int i = 0; i < 4000; ++i)
        counter(1);
    QElapsedTimer timer;
    timer.start();
    QCOMPARE(texts().last(), QStringLiteral("Counter 4000 1 pcs 0.025 %"));
    // Counting all places anew for each of them takes many seconds in a debug build.
    QVERIFY2(timer.elapsed() < 4000, qPrintable(QString::number(timer.elapsed())));
}

void KvDeskCounterBarTest::clicksGoOnAfterChoosing()
{
    m_desk->view.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&m_desk->view));
    counter(0);
    QCOMPARE(texts().size(), 1);
    m_bar->classes()->setFocus();
    emit m_bar->classes()->activated(0);
    QVERIFY(m_desk->view.hasFocus());
    m_bar->newClassButton()->setFocus();
    m_bar->newClassButton()->click();
    QVERIFY(m_desk->view.hasFocus());
}

void KvDeskCounterBarTest::everythingIsNamed()
{
    QVERIFY(!m_bar->classes()->accessibleName().isEmpty());
    QVERIFY(!m_bar->classes()->toolTip().isEmpty());
    QVERIFY(!m_bar->newClassButton()->accessibleName().isEmpty());
    QVERIFY(!m_bar->newClassButton()->toolTip().isEmpty());
    QVERIFY(!m_bar->newClassButton()->icon().isNull());
}

void KvDeskCounterBarTest::staysInTheMiddle()
{
    for (const int width : {640, 900, 300}) {
        m_desk->view.resize(width, 480);
        const QWidget *const viewport = m_desk->view.viewport();
        QVERIFY(m_bar->x() >= 0);
        if (viewport->width() > m_bar->width())
            QVERIFY(qAbs(m_bar->geometry().center().x() - viewport->rect().center().x()) <= 1);
    }
}

void KvDeskCounterBarTest::fitsANarrowView_data()
{
    QTest::addColumn<int>("room"); ///< of the view, besides what all parts take
    QTest::addColumn<bool>("hasHint");
    QTest::addColumn<bool>("hasLabel");
    QTest::newRow("wide") << 300 << true << true;
    QTest::newRow("just wide enough") << 0 << true << true;
    QTest::newRow("a pixel too narrow") << -1 << false << true;
    QTest::newRow("with a narrow list") << -200 << false << true;
    QTest::newRow("without the label") << -1 << false << false;
}

void KvDeskCounterBarTest::fitsANarrowView()
{
    QFETCH(int, room);
    QFETCH(bool, hasHint);
    QFETCH(bool, hasLabel);
    const auto labelOf = [this](const QString &text) {
        for (QLabel *const label : m_bar->findChildren<QLabel *>()) {
            if (label->text() == text)
                return label;
        }
        return static_cast<QLabel *>(nullptr);
    };
    const QLabel *const label = labelOf(QStringLiteral("Clicks count for"));
    const QLabel *const hint = labelOf(QStringLiteral("A right click takes a place away"));
    QVERIFY(label && hint);
    const int all = label->sizeHint().width() + 240 + 32 + hint->sizeHint().width() + 5 * 8;
    const int withoutNames = label->sizeHint().width() + 96 + 32 + 4 * 8;
    m_desk->view.resize(hasLabel ? all + room : withoutNames + room, 240);
    flushBar();
    QCoreApplication::processEvents();
    QCOMPARE(hint->isVisible(), hasHint);
    QCOMPARE(label->isVisible(), hasLabel);
    QVERIFY(!hasLabel || label->width() >= label->sizeHint().width());
    QVERIFY(!hasHint || hint->width() >= hint->sizeHint().width());
    const QString toolTip = m_bar->classes()->toolTip();
    QVERIFY(toolTip.contains(QStringLiteral("The counter that gets the clicks")));
    QCOMPARE(toolTip.contains(hint->text()), !hasHint);
    QCOMPARE(toolTip.contains(label->text()), !hasLabel);
    QCOMPARE(m_bar->classes()->accessibleName(), label->text());
    QVERIFY(m_desk->view.viewport()->rect().contains(m_bar->geometry()));
    QVERIFY(m_bar->rect().contains(m_bar->newClassButton()->geometry()));
    QVERIFY(m_bar->classes()->geometry().right() < m_bar->newClassButton()->x());
    QVERIFY(m_bar->classes()->width() >= 96);
    QVERIFY(!hasHint || m_bar->classes()->width() == 240);
}

STATREPORT_TEST_MAIN(KvDeskCounterBarTest)
#include "KvDeskCounterBarTest.moc"
