// SPDX-License-Identifier: MIT
#include "report/KvPageCountWidget.h"
#include "support/StatReportTest.h"

class KvPageCountWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void showsTheIndexAtFirst();
    void showsTheTotal_data();
    void showsTheTotal();
    void isOnePieceWithoutOptions();
    void staysLeftToRight();
};

void KvPageCountWidgetTest::showsTheIndexAtFirst()
{
    QWidget parent;
    const KvPageCountWidget widget(&parent, 0);
    QCOMPARE(widget.parentWidget(), &parent);
    QCOMPARE(widget.objectName(), QStringLiteral("pageCount"));
    QCOMPARE(widget.styleSheet(), QStringLiteral("QLabel{color: black;}"));
    QCOMPARE(widget.text(), QStringLiteral("1"));
    QCOMPARE(widget.size(), widget.sizeHint());
}

void KvPageCountWidgetTest::showsTheTotal_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<int>("total");
    QTest::addColumn<QString>("text");
    QTest::newRow("only page") << 0 << 1 << QStringLiteral("1/1");
    QTest::newRow("no padding") << 4 << 10 << QStringLiteral("5/10");
    QTest::newRow("no grouping") << 1233 << 12345 << QStringLiteral("1234/12345");
}

void KvPageCountWidgetTest::showsTheTotal()
{
    QFETCH(int, index);
    QFETCH(int, total);
    // A locale that writes numbers otherwise.
    const QLocale before;
    QLocale::setDefault(QLocale(QLocale::Arabic, QLocale::Egypt));
    KvPageCountWidget widget(nullptr, index);
    widget.setTotal(total);
    QLocale::setDefault(before);
    QTEST(widget.text(), "text");
    widget.setTotal(total + 1);
    QCOMPARE(widget.text(), QStringLiteral("%1/%2").arg(index + 1).arg(total + 1));
}

void KvPageCountWidgetTest::isOnePieceWithoutOptions()
{
    KvPageCountWidget widget(nullptr, 2);
    QCOMPARE(widget.displayName(), QStringLiteral("Page count"));
    QCOMPARE(widget.subWidgetCount(), 1);
    QCOMPARE(widget.subWidgetAt(0), &widget);
    QVERIFY(!widget.createOptionsWidget(&widget, true));
    QVERIFY(!widget.createOptionsWidget(nullptr, false));
    QCOMPARE(widget.children().size(), 0);
}

void KvPageCountWidgetTest::staysLeftToRight()
{
    QApplication::setLayoutDirection(Qt::RightToLeft);
    const KvPageCountWidget widget(nullptr, 0);
    const Qt::LayoutDirection direction = widget.layoutDirection();
    QApplication::setLayoutDirection(Qt::LeftToRight);
    QCOMPARE(direction, Qt::LeftToRight);
}

STATREPORT_TEST_MAIN(KvPageCountWidgetTest)
#include "KvPageCountWidgetTest.moc"
