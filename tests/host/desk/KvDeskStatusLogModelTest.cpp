// SPDX-License-Identifier: MIT
#include "KvDeskStatusLogModel.h"

#include "KvDeskResources.h"
#include "KvDeskStatus.h"
#include "support/StatReportTest.h"

#include <QAbstractItemModelTester>

class KvDeskStatusLogModelTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void showsEntries();
    void keepsUpWithALogThatForgets();
    void clears();
    void headers();

private:
    static void log(const QString &message)
    {
        KvDeskStatus::log(ZtAppStatus::Warning, message, QStringLiteral("Class::method"));
    }
};

void KvDeskStatusLogModelTest::init()
{
    StatReportTest::init();
    KvDeskResources::ensure();
    ZtStatusLog::getInstance()->setCapacity(10000);
    ZtStatusLog::getInstance()->clear();
}

void KvDeskStatusLogModelTest::showsEntries()
{
    log(QStringLiteral("Before"));
    const KvDeskStatusLogModel model;
    log(QStringLiteral("After\nthat"));
    QCOMPARE(model.rowCount(), 2);
    QCOMPARE(model.index(0, 0).data().toString(), QStringLiteral("Warning"));
    QVERIFY(!model.index(0, 0).data(Qt::DecorationRole).value<QIcon>().isNull());
    QCOMPARE(model.index(0, 0).data(Qt::ForegroundRole).value<QColor>(), KvDeskStatus::color(2));
    QCOMPARE(model.index(0, 1).data().toString(),
             ZtStatusLog::getInstance()->entries().first().time.toString(QStringLiteral("HH:mm:ss")));
    QCOMPARE(model.index(0, 2).data().toString(), QStringLiteral("Before"));
    QCOMPARE(model.index(1, 2).data().toString(), QStringLiteral("After that"));
    QCOMPARE(model.index(1, 2).data(Qt::ToolTipRole).toString(),
             QStringLiteral("After\nthat\nReported by Class::method"));
}

void KvDeskStatusLogModelTest::keepsUpWithALogThatForgets()
{
    ZtStatusLog::getInstance()->setCapacity(3);
    KvDeskStatusLogModel model;
    const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    for (int i = 0; i < 5; ++i)
        log(QString::number(i));
    QCOMPARE(model.rowCount(), 3);
    QCOMPARE(model.index(0, 2).data().toString(), QStringLiteral("2"));
    QCOMPARE(model.index(2, 2).data().toString(), QStringLiteral("4"));
}

void KvDeskStatusLogModelTest::clears()
{
    const KvDeskStatusLogModel model;
    log(QStringLiteral("Gone"));
    ZtStatusLog::getInstance()->clear();
    QCOMPARE(model.rowCount(), 0);
}

void KvDeskStatusLogModelTest::headers()
{
    const KvDeskStatusLogModel model;
    QCOMPARE(model.headerData(0, Qt::Horizontal).toString(), QStringLiteral("Category"));
    QCOMPARE(model.headerData(1, Qt::Horizontal).toString(), QStringLiteral("Time"));
    QCOMPARE(model.headerData(2, Qt::Horizontal).toString(), QStringLiteral("Message"));
    QVERIFY(!model.headerData(3, Qt::Horizontal).isValid());
}

STATREPORT_TEST_MAIN(KvDeskStatusLogModelTest)
#include "KvDeskStatusLogModelTest.moc"
