// SPDX-License-Identifier: MIT
#include "support/RightToLeft.h"
#include "support/StatReportTest.h"

#include "measuring/ZtFault.h"

class ZtFaultTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void namesThePartsThatAreKnown_data();
    void namesThePartsThatAreKnown();
    void placesKeepTheirDirection();
};

void ZtFaultTest::namesThePartsThatAreKnown_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<int>("line");
    QTest::addColumn<int>("column");
    QTest::addColumn<QString>("place");
    QTest::addColumn<QString>("text");
    QTest::newRow("cell") << "t.csv" << 3 << 2 << ""
                          << "t.csv:3:2: It is wrong";
    QTest::newRow("line") << "t.csv" << 3 << 0 << ""
                          << "t.csv:3: It is wrong";
    QTest::newRow("file") << "t.csv" << 0 << 0 << ""
                          << "t.csv: It is wrong";
    QTest::newRow("column without a line") << "t.csv" << 0 << 4 << ""
                                           << "t.csv: It is wrong";
    QTest::newRow("place") << "s.json" << 0 << 0 << "objects[3].points"
                           << "s.json: objects[3].points: It is wrong";
    QTest::newRow("place alone") << "" << 0 << 0 << "image"
                                 << "image: It is wrong";
    QTest::newRow("message alone") << "" << 0 << 0 << ""
                                   << "It is wrong";
}

void ZtFaultTest::namesThePartsThatAreKnown()
{
    QFETCH(QString, file);
    QFETCH(int, line);
    QFETCH(int, column);
    QFETCH(QString, place);
    ZtFault fault{file, line, column, place, QString()};
    QVERIFY(fault.isNull());
    QCOMPARE(fault.text(), QString());
    fault.message = QStringLiteral("It is wrong");
    QVERIFY(!fault.isNull());
    QTEST(fault.text(), "text");
}

void ZtFaultTest::placesKeepTheirDirection()
{
    const RightToLeft arabic;
    const ZtFault fault{QStringLiteral("/a/t.csv"), 3, 2, QString(), QStringLiteral("It is wrong")};
    QCOMPARE(fault.text(),
             RightToLeft::isolated(QStringLiteral("/a/t.csv:3:2")) + QStringLiteral(": It is wrong"));
}

STATREPORT_TEST_MAIN(ZtFaultTest)
#include "ZtFaultTest.moc"
