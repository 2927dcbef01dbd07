// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ItemByItem.h"
#include "SceneItems.h"
#include "charts/KvLineRunItem.h"

using kvCharts::KvLineRunItem;

class KvLineRunItemTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void rectIsThatOfALineItem_data();
    void rectIsThatOfALineItem();
    void looksLikeLineItems();
};

void KvLineRunItemTest::rectIsThatOfALineItem_data()
{
    QTest::addColumn<QLineF>("line");
    QTest::newRow("level") << QLineF(0, 1000, 1000, 1000);
    QTest::newRow("level, backwards") << QLineF(10, 5, -3, 5);
    QTest::newRow("upright") << QLineF(0, 1000, 0, 0);
    QTest::newRow("no length") << QLineF(20, 30, 20, 30);
    for (int degrees = 5; degrees < 360; degrees += 25)
        QTest::addRow("%d degrees", degrees) << QLineF::fromPolar(70.0, degrees).translated(300.1, 12.7);
}

void KvLineRunItemTest::rectIsThatOfALineItem()
{
    QFETCH(QLineF, line);
    for (const qreal width : {1.0, 3.0}) {
        QGraphicsLineItem item(line);
        item.setPen(ItemByItem::cosmeticPen(Qt::red, width));
        QVERIFY(ItemByItem::sameRect(KvLineRunItem::lineRect(line, width), item.boundingRect()));
    }
}

void KvLineRunItemTest::looksLikeLineItems()
{
    QVector<QLineF> lines;
    for (int i = 0; i < 40; ++i)
        lines.append(QLineF(20 + i * 3.3, 30, 400 - i * 7.1, 400 + i));
    QPen pen = ItemByItem::cosmeticPen(Qt::red);
    for (const bool dashed : {false, true}) {
        if (dashed)
            pen.setDashPattern({6, 8});
        QGraphicsScene combined;
        QGraphicsScene single;
        combined.addItem(new KvLineRunItem(lines, pen));
        for (const QLineF &line : qAsConst(lines))
            single.addLine(line, pen);
        QVERIFY(ItemByItem::sameRect(combined.itemsBoundingRect(), single.itemsBoundingRect()));
        const QImage picture = ItemByItem::picture(&combined, QRectF(0, 0, 500, 500));
        QVERIFY(ItemByItem::inkedPixels(picture) > 1000);
        QCOMPARE(ItemByItem::difference(picture, ItemByItem::picture(&single, QRectF(0, 0, 500, 500))), 0);
    }
    QCOMPARE(KvLineRunItem(lines, pen).lines(), lines);
    QCOMPARE(KvLineRunItem(lines, pen).pen(), pen);
}

STATREPORT_TEST_MAIN(KvLineRunItemTest)
#include "KvLineRunItemTest.moc"
