// SPDX-License-Identifier: MIT
#include "KvDeskStatusLog.h"

#include "KvDeskEmptyState.h"
#include "KvDeskPanelHeader.h"
#include "KvDeskResources.h"
#include "KvDeskStatus.h"
#include "KvDeskStatusLogModel.h"
#include "KvDeskTableView.h"
#include "common/ZtAppStatus.h"
#include "support/RightToLeft.h"
#include "support/StatReportTest.h"

class KvDeskStatusLogTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void emptyState();
    void clearing();
    void followsTheEnd();
    void closing();
    void copiesNoMarks();

private:
    static void log(int count)
    {
        for (int i = 0; i < count; ++i)
            KvDeskStatus::log(ZtAppStatus::Information, QString::number(i), QString());
    }
};

void KvDeskStatusLogTest::init()
{
    StatReportTest::init();
    KvDeskResources::ensure();
    ZtStatusLog::getInstance()->clear();
}

void KvDeskStatusLogTest::emptyState()
{
    const KvDeskStatusLog panel;
    const auto *const state = panel.findChild<KvDeskEmptyState *>();
    QVERIFY(!state->isHidden());
    QVERIFY(!panel.clearButton()->isEnabled());
    log(1);
    QVERIFY(state->isHidden());
    QVERIFY(panel.clearButton()->isEnabled());
}

void KvDeskStatusLogTest::copiesNoMarks()
{
    const RightToLeft arabic;
    const KvDeskStatusLog panel;
    const QString path = QStringLiteral("/x/a.json");
    KvDeskStatus::log(ZtAppStatus::Information, RightToLeft::isolated(path), QString());
    auto *const view = panel.findChild<KvDeskTableView *>();
    view->selectAll();
    QVERIFY2(view->selectedText().endsWith(QLatin1Char('\t') + path + QLatin1Char('\n')),
             qPrintable(view->selectedText()));
}

void KvDeskStatusLogTest::clearing()
{
    const KvDeskStatusLog panel;
    log(3);
    QCOMPARE(panel.clearButton()->toolTip(), QStringLiteral("Clear the status log"));
    panel.clearButton()->click();
    QCOMPARE(panel.model()->rowCount(), 0);
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 0);
}

void KvDeskStatusLogTest::followsTheEnd()
{
    KvDeskStatusLog panel;
    panel.resize(500, 160);
    panel.show();
    QScrollBar *const bar = panel.view()->verticalScrollBar();
    log(50);
    QTRY_VERIFY(bar->maximum() > 0);
    QTRY_COMPARE(bar->value(), bar->maximum());
    // Who reads older entries is left alone.
    bar->setValue(3);
    log(10);
    QTRY_VERIFY(bar->maximum() > 50);
    QCOMPARE(bar->value(), 3);
}

void KvDeskStatusLogTest::closing()
{
    const KvDeskStatusLog panel;
    QSignalSpy spy(&panel, SIGNAL(signalCloseClicked()));
    panel.header()->closeButton()->click();
    QCOMPARE(spy.count(), 1);
}

STATREPORT_TEST_MAIN(KvDeskStatusLogTest)
#include "KvDeskStatusLogTest.moc"
