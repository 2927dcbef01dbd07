// SPDX-License-Identifier: MIT
#include "measuring/ZtProgress.h"

#include "support/StatReportTest.h"

class ZtProgressTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void startsAtTheBeginning();
    void countsPartsOfTheWhole();
    void keepsSharesInRange();
    void cancels();
    void cannotBeCancelledBehindThePointOfNoReturn();
    void cannotPassThePointOfNoReturnOnceCancelled();
    void looksNowAndThen();
    void takesNoProgressForOneThatGoesOn();
};

void ZtProgressTest::startsAtTheBeginning()
{
    const ZtProgress progress;
    QCOMPARE(progress.fraction(), 0.0);
    QVERIFY(!progress.isCancelled());
}

void ZtProgressTest::countsPartsOfTheWhole()
{
    ZtProgress progress;
    progress.setDone(0.5);
    QCOMPARE(progress.fraction(), 0.5);
    progress.setPart(0.6, 0.8);
    QCOMPARE(progress.fraction(), 0.6);
    progress.setDone(0.5);
    QCOMPARE(progress.fraction(), 0.7);
    progress.setDone(1.0);
    QCOMPARE(progress.fraction(), 0.8);
}

void ZtProgressTest::keepsSharesInRange()
{
    ZtProgress progress;
    progress.setDone(7.0);
    QCOMPARE(progress.fraction(), 1.0);
    progress.setDone(-1.0);
    QCOMPARE(progress.fraction(), 0.0);
}

void ZtProgressTest::cancels()
{
    ZtProgress progress;
    QVERIFY(progress.cancel());
    QVERIFY(progress.isCancelled());
    QVERIFY(progress.cancel());
}

void ZtProgressTest::cannotBeCancelledBehindThePointOfNoReturn()
{
    ZtProgress progress;
    QVERIFY(progress.commit());
    QVERIFY(!progress.cancel());
    QVERIFY(!progress.isCancelled());
    QVERIFY(progress.commit());
}

void ZtProgressTest::cannotPassThePointOfNoReturnOnceCancelled()
{
    ZtProgress progress;
    progress.cancel();
    QVERIFY(!progress.commit());
    QVERIFY(progress.isCancelled());
}

void ZtProgressTest::looksNowAndThen()
{
    ZtProgress progress;
    const qint64 count = 4 * ZtProgress::stride;
    QVERIFY(ZtProgress::look(&progress, ZtProgress::stride, count));
    QCOMPARE(progress.fraction(), 0.25);
    QVERIFY(ZtProgress::look(&progress, ZtProgress::stride + 1, count));
    QCOMPARE(progress.fraction(), 0.25);
    progress.cancel();
    QVERIFY(ZtProgress::look(&progress, 2 * ZtProgress::stride - 1, count));
    QVERIFY(!ZtProgress::look(&progress, 2 * ZtProgress::stride, count));
    QVERIFY(!ZtProgress::look(&progress, 0, 0));
}

void ZtProgressTest::takesNoProgressForOneThatGoesOn()
{
    QVERIFY(ZtProgress::look(nullptr, 0, 1));
    QVERIFY(!ZtProgress::isCancelled(nullptr));
    ZtProgress::setPart(nullptr, 0.0, 1.0);
}

STATREPORT_TEST_MAIN(ZtProgressTest)
#include "ZtProgressTest.moc"
