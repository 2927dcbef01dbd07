// SPDX-License-Identifier: MIT
#include "KvDeskReason.h"

#include "support/StatReportTest.h"

class KvDeskReasonTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void addsTheReason();
    void isTheReason();
};

void KvDeskReasonTest::addsTheReason()
{
    QPushButton button;
    button.setToolTip(QStringLiteral("Clears the list"));
    const QString reason = QStringLiteral("It is empty");
    for (int i = 0; i < 2; ++i) {
        KvDeskReason::setPossible(&button, false, reason);
        QVERIFY(!button.isEnabled());
        QCOMPARE(button.toolTip(), QStringLiteral("Clears the list\nIt is empty"));
    }
    KvDeskReason::setPossible(&button, true, reason);
    QVERIFY(button.isEnabled());
    QCOMPARE(button.toolTip(), QStringLiteral("Clears the list"));
}

void KvDeskReasonTest::isTheReason()
{
    QPushButton button;
    KvDeskReason::setPossible(&button, false, QStringLiteral("It is empty"));
    QCOMPARE(button.toolTip(), QStringLiteral("It is empty"));
    KvDeskReason::setPossible(&button, true, QStringLiteral("It is empty"));
    QCOMPARE(button.toolTip(), QString());
}

STATREPORT_TEST_MAIN(KvDeskReasonTest)
#include "KvDeskReasonTest.moc"
