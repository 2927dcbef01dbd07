// SPDX-License-Identifier: MIT
#include "KvDeskActionButton.h"

#include "support/StatReportTest.h"

#include <QAction>

class KvDeskActionButtonTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void followsItsAction();
    void showsNoLetterOfAShortcut_data();
    void showsNoLetterOfAShortcut();
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

void KvDeskActionButtonTest::showsNoLetterOfAShortcut_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("shown");
    QTest::newRow("none") << QStringLiteral("Line") << QStringLiteral("Line");
    QTest::newRow("inside") << QStringLiteral("Open &image...") << QStringLiteral("Open image");
    QTest::newRow("behind") << QString::fromUtf8("\u753b\u50cf\u3092\u958b\u304f(&I)...")
                            << QString::fromUtf8("\u753b\u50cf\u3092\u958b\u304f");
    QTest::newRow("behind a blank") << QStringLiteral("Text (&T)") << QStringLiteral("Text");
}

void KvDeskActionButtonTest::showsNoLetterOfAShortcut()
{
    QFETCH(QString, text);
    QFETCH(QString, shown);
    QAction action(text, nullptr);
    const KvDeskActionButton button(&action);
    QCOMPARE(button.text(), shown);
    QCOMPARE(button.accessibleName(), shown);
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
