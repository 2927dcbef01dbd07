// SPDX-License-Identifier: MIT
#include "KvDeskToolStrip.h"

#include "DeskView.h"
#include "KvDeskActions.h"
#include "KvDeskResources.h"
#include "KvDeskToolBox.h"

#include <QAction>
#include <QToolButton>

class KvDeskToolStripTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase() { KvDeskResources::ensure(); }
    void init();
    void cleanup();

    void buttonsStandInOrder();
    void groupsAreSetApart();
    void buttonsSayWhatTheyDo();
    void buttonsChooseTools();
    void buttonsFollowTheTool();
    void keysWorkHereToo();
    void takesNoMoreRoomThanItNeeds();

private:
    QList<QAction *> tools() const
    {
        QList<QAction *> all;
        for (const QVector<QAction *> &group : m_toolBox->groups())
            all += group.toList();
        return all;
    }
    QList<QToolButton *> buttons() const
    {
        QList<QToolButton *> all = m_strip->findChildren<QToolButton *>();
        std::sort(all.begin(), all.end(),
                  [](const QToolButton *a, const QToolButton *b) { return a->y() < b->y(); });
        return all;
    }

    std::unique_ptr<DeskView> m_desk;
    std::unique_ptr<KvDeskActions> m_actions;
    std::unique_ptr<KvDeskToolBox> m_toolBox;
    std::unique_ptr<KvDeskToolStrip> m_strip;
};

void KvDeskToolStripTest::init()
{
    StatReportTest::init();
    m_desk = std::make_unique<DeskView>();
    m_actions = std::make_unique<KvDeskActions>();
    m_toolBox = std::make_unique<KvDeskToolBox>(m_actions.get(), &m_desk->view);
    m_strip = std::make_unique<KvDeskToolStrip>(m_toolBox.get());
    m_strip->resize(m_strip->sizeHint().width(), 600);
    m_strip->show();
}

void KvDeskToolStripTest::cleanup()
{
    m_desk->view.setTool(nullptr);
    m_strip.reset();
    m_toolBox.reset();
    m_actions.reset();
    m_desk.reset();
    StatReportTest::cleanup();
}

void KvDeskToolStripTest::buttonsStandInOrder()
{
    QList<QAction *> shown;
    for (const QToolButton *const button : buttons())
        shown.append(button->defaultAction());
    QCOMPARE(shown, tools());
    for (const QToolButton *const button : buttons()) {
        QCOMPARE(button->x(), buttons().first()->x());
        QCOMPARE(button->size(), buttons().first()->size());
    }
}

void KvDeskToolStripTest::groupsAreSetApart()
{
    int distance = 0;
    int next = 0;
    const QList<QToolButton *> all = buttons();
    for (const QVector<QAction *> &group : m_toolBox->groups()) {
        for (int i = 1; i < group.size(); ++i) {
            const int room = all.at(next + i)->y() - all.at(next + i - 1)->geometry().bottom();
            QVERIFY(distance == 0 || room == distance);
            distance = room;
        }
        next += group.size();
        if (next < all.size())
            QVERIFY(all.at(next)->y() - all.at(next - 1)->geometry().bottom() > distance);
    }
    QCOMPARE(next, all.size());
}

void KvDeskToolStripTest::buttonsSayWhatTheyDo()
{
    QVERIFY(!m_strip->accessibleName().isEmpty());
    QSet<QString> names;
    for (const QToolButton *const button : buttons()) {
        QVERIFY(!button->toolTip().isEmpty());
        QVERIFY(!button->icon().isNull());
        QVERIFY(!button->accessibleName().contains(QLatin1Char('&')));
        names.insert(button->accessibleName());
    }
    QCOMPARE(names.size(), buttons().size());
    QVERIFY(!names.contains(QString()));
}

void KvDeskToolStripTest::buttonsChooseTools()
{
    for (QToolButton *const button : buttons()) {
        QTest::mouseClick(button, Qt::LeftButton);
        QVERIFY(button->isChecked());
        KvDeskTool *const chosen = m_toolBox->tool(button->defaultAction());
        // The tool that selects is the view's own.
        QVERIFY(!chosen || m_desk->view.tool() == chosen);
    }
}

void KvDeskToolStripTest::buttonsFollowTheTool()
{
    for (QAction *const tool : tools()) {
        tool->trigger();
        int checked = 0;
        for (const QToolButton *const button : buttons()) {
            checked += button->isChecked() ? 1 : 0;
            QCOMPARE(button->isChecked(), button->defaultAction() == tool);
        }
        QCOMPARE(checked, 1);
    }
}

void KvDeskToolStripTest::keysWorkHereToo()
{
    m_strip->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_strip.get()));
    buttons().first()->setFocus();
    const QAction *const line = m_actions->action(KvDeskActions::LineTool);
    QTest::keySequence(m_strip.get(), line->shortcut());
    QVERIFY(line->isChecked());
}

void KvDeskToolStripTest::takesNoMoreRoomThanItNeeds()
{
    const int needed = m_strip->sizeHint().width();
    m_strip->resize(400, 600);
    QCOMPARE(m_strip->sizePolicy().horizontalPolicy(), QSizePolicy::Fixed);
    QVERIFY(needed < 60);
}

STATREPORT_TEST_MAIN(KvDeskToolStripTest)
#include "KvDeskToolStripTest.moc"
