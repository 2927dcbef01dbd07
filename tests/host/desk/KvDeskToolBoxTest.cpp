// SPDX-License-Identifier: MIT
#include "KvDeskToolBox.h"

#include "DeskView.h"
#include "KvDeskActions.h"
#include "KvDeskDrawTool.h"
#include "KvDeskInlineEditor.h"
#include "KvDeskResources.h"
#include "KvDeskToolStrip.h"

#include <QAction>
#include <QToolButton>

class KvDeskToolBoxTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase() { KvDeskResources::ensure(); }
    void init();
    void cleanup();

    void hasAToolForEveryType();
    void oneToolAtATime();
    void keysChooseTools_data();
    void keysChooseTools();
    void keysAreLettersInFields();
    void escapeEndsTheTool();
    void stripHasAButtonForEachTool();

private:
    QAction *action(KvDeskActions::Id id) const { return m_actions->action(id); }

    std::unique_ptr<DeskView> m_desk;
    std::unique_ptr<KvDeskActions> m_actions;
    std::unique_ptr<KvDeskToolBox> m_toolBox;
};

void KvDeskToolBoxTest::init()
{
    StatReportTest::init();
    m_desk = std::make_unique<DeskView>();
    m_actions = std::make_unique<KvDeskActions>();
    m_toolBox = std::make_unique<KvDeskToolBox>(m_actions.get(), &m_desk->view);
    m_desk->view.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&m_desk->view));
}

void KvDeskToolBoxTest::cleanup()
{
    m_desk->view.setTool(nullptr);
    m_toolBox.reset();
    m_actions.reset();
    m_desk.reset();
    StatReportTest::cleanup();
}

void KvDeskToolBoxTest::hasAToolForEveryType()
{
    QSet<int> types;
    int others = 0;
    for (const QVector<QAction *> &group : m_toolBox->groups()) {
        for (QAction *const tool : group) {
            tool->trigger();
            QVERIFY(tool->isChecked());
            QVERIFY(!tool->icon().isNull());
            if (const auto *const draw = dynamic_cast<const KvDeskDrawTool *>(m_desk->view.tool()))
                types.insert(draw->typeId());
            else
                ++others;
        }
    }
    // Selecting and counting are tools of their own.
    QCOMPARE(others, 2);
    QCOMPARE(types.size(), static_cast<int>(ZtDrawnType::all().size()) - 1);
    QVERIFY(!types.contains(ZtDrawnType::Counter));
}

void KvDeskToolBoxTest::oneToolAtATime()
{
    QVERIFY(action(KvDeskActions::SelectTool)->isChecked());
    QSignalSpy changed(m_toolBox.get(), SIGNAL(signalToolChanged()));
    action(KvDeskActions::LineTool)->trigger();
    QVERIFY(!action(KvDeskActions::SelectTool)->isChecked());
    action(KvDeskActions::CircleTool)->trigger();
    QVERIFY(!action(KvDeskActions::LineTool)->isChecked());
    QCOMPARE(changed.count(), 2);
    QVERIFY(m_desk->view.hasFocus());
}

void KvDeskToolBoxTest::keysChooseTools_data()
{
    QTest::addColumn<int>("id");
    QTest::addColumn<int>("key");
    using A = KvDeskActions;
    const QVector<QPair<A::Id, Qt::Key>> keys{{A::LineTool, Qt::Key_L},     {A::PolylineTool, Qt::Key_P},
                                              {A::ParallelTool, Qt::Key_D}, {A::ArcTool, Qt::Key_A},
                                              {A::CircleTool, Qt::Key_C},   {A::RectangleTool, Qt::Key_R},
                                              {A::PolygonTool, Qt::Key_G},  {A::CounterTool, Qt::Key_N},
                                              {A::NoteTool, Qt::Key_T},     {A::ScaleBarTool, Qt::Key_B}};
    for (const auto &[id, key] : keys)
        QTest::newRow(qPrintable(QString(QChar(key)))) << static_cast<int>(id) << static_cast<int>(key);
}

void KvDeskToolBoxTest::keysChooseTools()
{
    QFETCH(int, id);
    QFETCH(int, key);
    QTest::keyClick(&m_desk->view, static_cast<Qt::Key>(key));
    QVERIFY(action(static_cast<KvDeskActions::Id>(id))->isChecked());
    QTest::keyClick(&m_desk->view, Qt::Key_V);
    QVERIFY(action(KvDeskActions::SelectTool)->isChecked());
}

void KvDeskToolBoxTest::keysAreLettersInFields()
{
    action(KvDeskActions::NoteTool)->trigger();
    m_desk->click({100, 100});
    QTest::keyClicks(m_desk->view.inlineEditor(), QStringLiteral("vlp"));
    QCOMPARE(m_desk->view.inlineEditor()->text(), QStringLiteral("vlp"));
    QVERIFY(action(KvDeskActions::NoteTool)->isChecked());
}

void KvDeskToolBoxTest::escapeEndsTheTool()
{
    action(KvDeskActions::LineTool)->trigger();
    m_desk->click({100, 100});
    m_desk->key(Qt::Key_Escape);
    QVERIFY(action(KvDeskActions::LineTool)->isChecked());
    m_desk->key(Qt::Key_Escape);
    QVERIFY(action(KvDeskActions::SelectTool)->isChecked());
}

void KvDeskToolBoxTest::stripHasAButtonForEachTool()
{
    const KvDeskToolStrip strip(m_toolBox.get());
    const QList<QToolButton *> buttons = strip.findChildren<QToolButton *>();
    QCOMPARE(buttons.size(), 11);
    for (QToolButton *const button : buttons) {
        QVERIFY(!button->accessibleName().isEmpty());
        QVERIFY(!button->accessibleName().contains(QLatin1Char('&')));
        button->click();
        QVERIFY(button->isChecked());
    }
    QCOMPARE(buttons.at(1)->toolTip(), QStringLiteral("Measure a length (L)"));
}

STATREPORT_TEST_MAIN(KvDeskToolBoxTest)
#include "KvDeskToolBoxTest.moc"
