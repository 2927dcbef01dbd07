// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ItemByItem.h"
#include "charts/KvTextMeasure.h"
#include <QGraphicsTextItem>

using kvCharts::KvTextExtent;
using kvCharts::KvTextMeasure;

class KvTextMeasureTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void measuresAsTextItems_data();
    void measuresAsTextItems();
    void everyLastLetter_data();
    void everyLastLetter();
};

void KvTextMeasureTest::measuresAsTextItems_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<qreal>("pointSize");
    QTest::addColumn<bool>("isOneLine");
    const QVector<QPair<QString, bool>> texts{
        {QStringLiteral("0"), true},
        {QStringLiteral("2.22045e-16"), true},
        {QStringLiteral("AVAVA To"), true},
        {QStringLiteral("flow of Office"), true},
        {QStringLiteral(" blanks "), true},
        {QString(), true},
        {QStringLiteral("a    b   "), true},
        {QString(300, QLatin1Char('W')), true},
        {QStringLiteral("<b>&amp;</b> %1"), true},
        {QStringLiteral("a\u00a0b"), true},
        {QStringLiteral("\U0001d465 \U0001f600"), true},
        {QStringLiteral("e\u0301"), true},
        {QStringLiteral("a\ufffcb"), true},
        {QStringLiteral("a\ufdd0b\ufdd1c"), false},
        {QStringLiteral("L\u00e4nge [\u03bcm]"), true},
        {QStringLiteral("\u6f22\u5b57"), true},
        {QStringLiteral("\u05e2\u05d1\u05e8\u05d9\u05ea 12"), true},
        {QStringLiteral("two\nlines"), false},
        {QStringLiteral("a\ttab"), false},
        {QStringLiteral("a\u2028line"), false},
        {QStringLiteral("soft\u00adhyphen"), false},
    };
    for (const qreal pointSize : {11.0, 12.0, 14.0, 7.5}) {
        for (const auto &text : texts)
            QTest::addRow("%s, %g", qPrintable(text.first), pointSize)
                << text.first << pointSize << text.second;
    }
}

void KvTextMeasureTest::measuresAsTextItems()
{
    QFETCH(QString, text);
    QFETCH(qreal, pointSize);
    QFETCH(bool, isOneLine);
    QGraphicsTextItem item(text);
    item.setFont(ItemByItem::font(pointSize));
    KvTextMeasure measure(ItemByItem::font(pointSize));
    measure.measure(QStringLiteral("another before")); // leaves nothing behind
    const KvTextExtent extent = measure.measure(text);
    QCOMPARE(extent.size, item.boundingRect().size());
    QCOMPARE(extent.isOneLine(), isOneLine);
}

void KvTextMeasureTest::everyLastLetter_data()
{
    QTest::addColumn<qreal>("pointSize");
    QTest::addColumn<bool>("isBold");
    for (const qreal pointSize : {7.5, 8.0, 11.0, 12.0, 13.0, 14.0, 40.0}) {
        QTest::addRow("%g", pointSize) << pointSize << false;
        QTest::addRow("%g bold", pointSize) << pointSize << true;
    }
}

void KvTextMeasureTest::everyLastLetter()
{
    QFETCH(qreal, pointSize);
    QFETCH(bool, isBold);
    QFont font = ItemByItem::font(pointSize);
    font.setBold(isBold);
    KvTextMeasure measure(font);
    for (char last = 0x20; last < 0x7f; ++last) {
        for (const QString &start : {QString(), QStringLiteral("Lea"), QStringLiteral("W ")}) {
            const QString text = start + QLatin1Char(last);
            QGraphicsTextItem item(text);
            item.setFont(font);
            const QSizeF size = item.boundingRect().size();
            QVERIFY2(measure.measure(text).size == size,
                     qPrintable(QStringLiteral("%1: %2, not %3")
                                    .arg(text)
                                    .arg(measure.measure(text).size.width())
                                    .arg(size.width())));
        }
    }
}

STATREPORT_TEST_MAIN(KvTextMeasureTest)
#include "KvTextMeasureTest.moc"
