// SPDX-License-Identifier: MIT
#include "KvDeskEmptyState.h"

#include "support/StatReportTest.h"

class KvDeskEmptyStateTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void coversItsParent();
    void buttonsTriggerActions();
};

void KvDeskEmptyStateTest::coversItsParent()
{
    QWidget parent;
    parent.resize(300, 200);
    const KvDeskEmptyState state(QStringLiteral("Nothing here"), &parent);
    QCOMPARE(state.geometry(), QRect(0, 0, 300, 200));
    parent.show();
    parent.resize(500, 400);
    QTRY_COMPARE(state.geometry(), QRect(0, 0, 500, 400));
    QCOMPARE(state.findChild<QLabel *>()->text(), QStringLiteral("Nothing here"));
}

void KvDeskEmptyStateTest::buttonsTriggerActions()
{
    QWidget parent;
    KvDeskEmptyState state(QStringLiteral("Nothing here"), &parent);
    QAction first(QStringLiteral("Open &image..."), nullptr);
    first.setToolTip(QStringLiteral("Open image (Ctrl+O)"));
    QAction second(QStringLiteral("&Close"), nullptr);
    state.addAction(&first, true);
    state.addAction(&second, false);
    const QList<QPushButton *> buttons = state.findChildren<QPushButton *>();
    QCOMPARE(buttons.size(), 2);
    QCOMPARE(buttons.at(0)->text(), QStringLiteral("Open image"));
    QCOMPARE(buttons.at(0)->toolTip(), QStringLiteral("Open image (Ctrl+O)"));
    QVERIFY(buttons.at(0)->isDefault());
    QVERIFY(!buttons.at(1)->isDefault());
    QSignalSpy firstSpy(&first, SIGNAL(triggered()));
    QSignalSpy secondSpy(&second, SIGNAL(triggered()));
    buttons.at(1)->click();
    QCOMPARE(firstSpy.count(), 0);
    QCOMPARE(secondSpy.count(), 1);
}

STATREPORT_TEST_MAIN(KvDeskEmptyStateTest)
#include "KvDeskEmptyStateTest.moc"
