// SPDX-License-Identifier: MIT
#include "KvDeskActionButton.h"

#include "support/StatReportTest.h"

#include <QAction>

class KvDeskActionButtonTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void followsItsAction();
    void heldBack();
};

void KvDeskActionButtonTest::followsItsAction()
{
    QAction action(QStringLiteral("Open &image..."), nullptr);
    action.setToolTip(QStringLiteral("Open image (Ctrl+O)"));
    KvDeskActionButton button(&action);
    QCOMPARE(button.text(), QStringLiteral("Open image"));
    QCOMPARE(button.accessibleName(), QStringLiteral("Open image"));
    QCOMPARE(button.toolTip(), QStringLiteral("Open image (Ctrl+O)"));
    QSignalSpy spy(&action, SIGNAL(triggered()));
    button.click();
    QCOMPARE(spy.count(), 1);
    action.setEnabled(false);
    action.setToolTip(QStringLiteral("Why not"));
    QVERIFY(!button.isEnabled());
    QCOMPARE(button.toolTip(), QStringLiteral("Why not"));
}

void KvDeskActionButtonTest::heldBack()
{
    QAction action(QStringLiteral("Line"), nullptr);
    KvDeskActionButton button(&action);
    button.setObstacle(QStringLiteral("Not now"));
    QVERIFY(!button.isEnabled());
    QCOMPARE(button.toolTip(), QStringLiteral("Line\nNot now"));
    button.setObstacle(QString());
    QVERIFY(button.isEnabled());
    QCOMPARE(button.toolTip(), QStringLiteral("Line"));
    action.setEnabled(false);
    QVERIFY(!button.isEnabled());
}

STATREPORT_TEST_MAIN(KvDeskActionButtonTest)
#include "KvDeskActionButtonTest.moc"
