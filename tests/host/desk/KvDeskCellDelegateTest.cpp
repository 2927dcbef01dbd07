// SPDX-License-Identifier: MIT
#include "KvDeskCellDelegate.h"

#include "support/StatReportTest.h"

#include <QHelpEvent>
#include <QStandardItemModel>
#include <QTableView>
#include <QToolTip>

class KvDeskCellDelegateTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void shortens_data();
    void shortens();
    void endsOfNamesStayWhereWanted();
    void numbersStayApart();
    void toolTipHasTheWholeText();
};

void KvDeskCellDelegateTest::shortens_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("begin");
    QTest::addColumn<QString>("end");
    QTest::newRow("number at the end")
        << QStringLiteral("Rectangle 12") << QStringLiteral("R") << QStringLiteral("… 12");
    QTest::newRow("number without a blank")
        << QStringLiteral("Rectangle12") << QStringLiteral("R") << QStringLiteral("…12");
    QTest::newRow("no number") << QStringLiteral("Rectangular") << QStringLiteral("R") << QStringLiteral("…");
    QTest::newRow("number too long") << QStringLiteral("R 123456789012345") << QStringLiteral("R")
                                     << QStringLiteral("5");
    QTest::newRow("number alone") << QStringLiteral("123456789012345") << QStringLiteral("1")
                                  << QStringLiteral("5");
    QTest::newRow("number before") << QStringLiteral("12 Rectangles") << QStringLiteral("1")
                                   << QStringLiteral("…");
}

void KvDeskCellDelegateTest::shortens()
{
    QFETCH(QString, text);
    const QFontMetrics metrics(QApplication::font());
    QCOMPARE(KvDeskCellDelegate::shortened(text, metrics, metrics.horizontalAdvance(text)), text);
    const int width = metrics.horizontalAdvance(QStringLiteral("Rect… 12"));
    const QString shown = KvDeskCellDelegate::shortened(text, metrics, width);
    QVERIFY2(metrics.horizontalAdvance(shown) <= width, qPrintable(shown));
    QVERIFY(shown.contains(QChar(0x2026)));
    QFETCH(QString, begin);
    QFETCH(QString, end);
    QVERIFY2(shown.startsWith(begin) && shown.endsWith(end), qPrintable(shown));
}

void KvDeskCellDelegateTest::endsOfNamesStayWhereWanted()
{
    const QFontMetrics metrics(QApplication::font());
    const QString shown = KvDeskCellDelegate::shortened(
        QStringLiteral("Rectangle on the left"), metrics,
        metrics.horizontalAdvance(QStringLiteral("Rect…left")), Qt::ElideMiddle);
    QVERIFY2(shown.startsWith(QLatin1Char('R')) && shown.endsWith(QLatin1Char('t')), qPrintable(shown));
}

// What a narrow column of the table shows of numbered objects differs.
void KvDeskCellDelegateTest::numbersStayApart()
{
    const QFontMetrics metrics(QApplication::font());
    QSet<QString> shown;
    for (int i = 1; i <= 300; ++i)
        shown.insert(KvDeskCellDelegate::shortened(QStringLiteral("Rectangle %1").arg(i), metrics,
                                                   metrics.horizontalAdvance(QStringLiteral("R… 300"))));
    QCOMPARE(shown.size(), 300);
}

void KvDeskCellDelegateTest::toolTipHasTheWholeText()
{
    QStandardItemModel model(1, 2);
    model.setData(model.index(0, 0), QStringLiteral("A long name that is cut 1"));
    model.setData(model.index(0, 1), QStringLiteral("A"));
    QTableView view;
    view.setModel(&model);
    view.setItemDelegate(new KvDeskCellDelegate(&view));
    view.setColumnWidth(0, 60);
    view.setColumnWidth(1, 60);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    const auto hover = [&](int column) {
        const QPoint place = view.visualRect(model.index(0, column)).center();
        QHelpEvent event(QEvent::ToolTip, place, view.viewport()->mapToGlobal(place));
        QApplication::sendEvent(view.viewport(), &event);
    };
    expectWarning(QRegularExpression(QStringLiteral("does not support raise")));
    hover(0);
    QTRY_COMPARE(QToolTip::text(), QStringLiteral("A long name that is cut 1"));
    hover(1);
    QTRY_VERIFY(!QToolTip::isVisible());
    // It is the whole text that is asked for room.
    view.resizeColumnToContents(0);
    QVERIFY(view.columnWidth(0) >
            view.fontMetrics().horizontalAdvance(QStringLiteral("A long name that is cut 1")));
}

STATREPORT_TEST_MAIN(KvDeskCellDelegateTest)
#include "KvDeskCellDelegateTest.moc"
