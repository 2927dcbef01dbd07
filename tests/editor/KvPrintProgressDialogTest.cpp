// SPDX-License-Identifier: MIT
#include "editor/KvPrintProgressDialog.h"
#include "support/StatReportTest.h"

#include <QApplication>
#include <QLabel>
#include <QProgressBar>
#include <QPushButton>
#include <QTimer>

class KvPrintProgressDialogTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void shortPrintsAreNotShown();
    void longPrintsAreShown();
    void aFinishedPrintIsNotShown();
    void waitsHalfASecond();
    void cursorIsBusyUntilItIsShown();
    void cursorIsRestoredAtTheEnd();
    void cancels_data();
    void cancels();
    void staysUntilThePrinterHasNoticed();
    void blocksEverythingElse();
    void timersStandStill();
};

void KvPrintProgressDialogTest::cleanup()
{
    QVERIFY2(!QApplication::overrideCursor(), "a cursor was left behind");
    StatReportTest::cleanup();
}

void KvPrintProgressDialogTest::shortPrintsAreNotShown()
{
    KvPrintProgressDialog dialog;
    for (int page = 0; page <= 3; ++page)
        dialog.pageWritten(page, 3);
    QVERIFY(!dialog.isVisible());
    QVERIFY(!dialog.isCancelled());
}

void KvPrintProgressDialogTest::longPrintsAreShown()
{
    KvPrintProgressDialog dialog(nullptr, 0);
    dialog.pageWritten(2, 5);
    QVERIFY(dialog.isVisible());
    QCOMPARE(dialog.windowTitle(), QStringLiteral("Printing the report"));
    QCOMPARE(dialog.findChild<QLabel *>()->text(), QStringLiteral("Page 2 of 5"));
    const auto *bar = dialog.findChild<QProgressBar *>();
    QCOMPARE(bar->maximum(), 5);
    QCOMPARE(bar->value(), 2);
    dialog.pageWritten(5, 5);
    QCOMPARE(bar->value(), 5);
}

void KvPrintProgressDialogTest::aFinishedPrintIsNotShown()
{
    KvPrintProgressDialog dialog(nullptr, 0);
    dialog.pageWritten(5, 5);
    QVERIFY(!dialog.isVisible());
}

void KvPrintProgressDialogTest::waitsHalfASecond()
{
    QElapsedTimer elapsed;
    elapsed.start();
    KvPrintProgressDialog dialog;
    QTRY_VERIFY((dialog.pageWritten(1, 5), dialog.isVisible()));
    QVERIFY(elapsed.elapsed() >= 500);
}

void KvPrintProgressDialogTest::cursorIsBusyUntilItIsShown()
{
    KvPrintProgressDialog dialog(nullptr, 0);
    QVERIFY(QApplication::overrideCursor());
    QCOMPARE(QApplication::overrideCursor()->shape(), Qt::WaitCursor);
    dialog.pageWritten(0, 5);
    QVERIFY(!QApplication::overrideCursor());
}

void KvPrintProgressDialogTest::cursorIsRestoredAtTheEnd()
{
    {
        const KvPrintProgressDialog dialog;
        QVERIFY(QApplication::overrideCursor());
    }
    QVERIFY(!QApplication::overrideCursor());
}

void KvPrintProgressDialogTest::cancels_data()
{
    QTest::addColumn<QString>("way");
    QTest::newRow("button") << QStringLiteral("button");
    QTest::newRow("escape") << QStringLiteral("escape");
    QTest::newRow("closing") << QStringLiteral("closing");
}

void KvPrintProgressDialogTest::cancels()
{
    QFETCH(QString, way);
    KvPrintProgressDialog dialog(nullptr, 0);
    dialog.pageWritten(0, 5);
    QVERIFY(!dialog.isCancelled());
    if (way == QLatin1String("button"))
        QTest::mouseClick(dialog.findChild<QPushButton *>(), Qt::LeftButton);
    else if (way == QLatin1String("escape"))
        QTest::keyClick(&dialog, Qt::Key_Escape);
    else
        dialog.close();
    const KvPrintProgress *progress = &dialog;
    QVERIFY(progress->isCancelled());
}

void KvPrintProgressDialogTest::staysUntilThePrinterHasNoticed()
{
    KvPrintProgressDialog dialog(nullptr, 0);
    dialog.pageWritten(0, 5);
    dialog.reject();
    QVERIFY(dialog.isVisible());
    QVERIFY(!dialog.findChild<QPushButton *>()->isEnabled());
}

void KvPrintProgressDialogTest::blocksEverythingElse()
{
    QWidget other;
    other.show();
    KvPrintProgressDialog dialog(nullptr, 0);
    dialog.pageWritten(0, 5);
    QCOMPARE(QApplication::activeModalWidget(), &dialog);
    QCOMPARE(dialog.windowModality(), Qt::ApplicationModal);
}

void KvPrintProgressDialogTest::timersStandStill()
{
    int ticks = 0;
    QTimer timer;
    connect(&timer, &QTimer::timeout, &timer, [&ticks]() { ++ticks; });
    timer.start(0);
    KvPrintProgressDialog dialog(nullptr, 0);
    for (int page = 0; page < 20; ++page)
        dialog.pageWritten(page, 20);
    QCOMPARE(ticks, 0);
    QTRY_VERIFY(ticks > 0);
}

STATREPORT_TEST_MAIN(KvPrintProgressDialogTest)
#include "KvPrintProgressDialogTest.moc"
