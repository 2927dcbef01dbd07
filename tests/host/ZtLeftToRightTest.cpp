// SPDX-License-Identifier: MIT
#include "kernel/ZtLeftToRight.h"

#include "support/RightToLeft.h"
#include "support/StatReportTest.h"

class ZtLeftToRightTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void isolatesInProgramsFromRightToLeft();
    void keepsEmptyTextsEmpty();
    void marksAreTakenOut();
};

void ZtLeftToRightTest::isolatesInProgramsFromRightToLeft()
{
    const QString path = QStringLiteral("/a/b (2)/");
    QCOMPARE(ZtLeftToRight::isolated(path), path);
    const RightToLeft arabic;
    QCOMPARE(ZtLeftToRight::isolated(path), QStringLiteral("\u2066/a/b (2)/\u2069"));
}

void ZtLeftToRightTest::keepsEmptyTextsEmpty()
{
    const RightToLeft arabic;
    QVERIFY(ZtLeftToRight::isolated(QString()).isEmpty());
}

void ZtLeftToRightTest::marksAreTakenOut()
{
    const RightToLeft arabic;
    const QString path = QStringLiteral("/a/b (2)/");
    QCOMPARE(ZtLeftToRight::plain(QStringLiteral("1: ") + ZtLeftToRight::isolated(path)),
             QStringLiteral("1: ") + path);
}

STATREPORT_TEST_MAIN(ZtLeftToRightTest)
#include "ZtLeftToRightTest.moc"
