// SPDX-License-Identifier: MIT
#include "KvDeskObjectIndex.h"

#include "support/StatReportTest.h"

#include <algorithm>
#include <cmath>
#include <random>

namespace {

KvDeskObjectId object(int id)
{
    return {1, id};
}

QRectF randomRect(std::mt19937 *random)
{
    std::uniform_real_distribution<double> place(-500.0, 4000.0);
    std::uniform_real_distribution<double> exponent(-1.0, 11.0);
    return QRectF(place(*random), place(*random), std::exp2(exponent(*random)), std::exp2(exponent(*random)));
}

} // namespace

class KvDeskObjectIndexTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsEmpty();
    void findsTheSameAsLookingAtAll();
    void pointsAndLevelLines();
    void movesAndRemoves();
    void keepsTheDrawingOrder();
    void stopsAtALimit();
    void farAwayAndHuge();
};

void KvDeskObjectIndexTest::startsEmpty()
{
    KvDeskObjectIndex index;
    QCOMPARE(index.size(), 0);
    QVERIFY(index.bounds().isNull());
    QVERIFY(index.objectsIn(QRectF(-1e9, -1e9, 2e9, 2e9)).isEmpty());
    index.remove(object(1));
}

void KvDeskObjectIndexTest::findsTheSameAsLookingAtAll()
{
    std::mt19937 random(7);
    KvDeskObjectIndex index;
    QHash<int, QRectF> rects;
    for (int id = 1; id <= 2000; ++id) {
        rects.insert(id, randomRect(&random));
        index.set(object(id), rects.value(id));
    }
    for (int id = 1; id <= 2000; id += 3) {
        rects.insert(id, randomRect(&random));
        index.set(object(id), rects.value(id));
    }
    for (int id = 2; id <= 2000; id += 5) {
        rects.remove(id);
        index.remove(object(id));
    }
    QRectF bounds;
    for (const QRectF &rect : qAsConst(rects))
        bounds = KvDeskObjectIndex::united(bounds, rect);
    QCOMPARE(index.bounds(), bounds);
    QCOMPARE(index.size(), rects.size());
    for (int i = 0; i < 200; ++i) {
        const QRectF area = randomRect(&random);
        QVector<KvDeskObjectId> expected;
        for (auto it = rects.constBegin(); it != rects.constEnd(); ++it) {
            if (KvDeskObjectIndex::touch(it.value(), area))
                expected.append(object(it.key()));
        }
        std::sort(expected.begin(), expected.end());
        QVERIFY(index.objectsIn(area) == expected);
    }
}

void KvDeskObjectIndexTest::pointsAndLevelLines()
{
    KvDeskObjectIndex index;
    index.set(object(1), QRectF(10, 20, 0, 0));
    index.set(object(2), QRectF(0, 50, 100, 0));
    QCOMPARE(index.objectsIn(QRectF(9, 19, 2, 2)), QVector<KvDeskObjectId>{object(1)});
    QCOMPARE(index.objectsIn(QRectF(40, 50, 0, 0)), QVector<KvDeskObjectId>{object(2)});
    QCOMPARE(index.bounds(), QRectF(0, 20, 100, 30));
}

void KvDeskObjectIndexTest::movesAndRemoves()
{
    KvDeskObjectIndex index;
    index.set(object(1), QRectF(0, 0, 10, 10));
    index.set(object(1), QRectF(1000, 0, 500, 10));
    QVERIFY(index.objectsIn(QRectF(0, 0, 10, 10)).isEmpty());
    QCOMPARE(index.objectsIn(QRectF(1400, 0, 1, 1)).size(), 1);
    QCOMPARE(index.rect(object(1)), QRectF(1000, 0, 500, 10));
    // The bounds shrink again.
    QCOMPARE(index.bounds(), QRectF(1000, 0, 500, 10));
    index.remove(object(1));
    QVERIFY(!index.contains(object(1)));
    QVERIFY(index.bounds().isNull());
}

void KvDeskObjectIndexTest::keepsTheDrawingOrder()
{
    KvDeskObjectIndex index;
    index.set({2, 1}, QRectF(0, 0, 1000, 1000));
    index.set({1, 7}, QRectF(0, 0, 1, 1));
    index.set({1, 3}, QRectF(0, 0, 100, 100));
    const QVector<KvDeskObjectId> expected{{1, 3}, {1, 7}, {2, 1}};
    QVERIFY(index.objectsIn(QRectF(0, 0, 1, 1)) == expected);
}

void KvDeskObjectIndexTest::stopsAtALimit()
{
    KvDeskObjectIndex index;
    for (int id = 1; id <= 1000; ++id)
        index.set(object(id), QRectF(id * 20, 0, 5, 5));
    const int found = index.objectsIn(QRectF(0, 0, 30000, 10), 100).size();
    QVERIFY(found >= 100 && found < 200);
    QCOMPARE(index.objectsIn(QRectF(0, 0, 30000, 10), 2000).size(), 1000);
}

void KvDeskObjectIndexTest::farAwayAndHuge()
{
    KvDeskObjectIndex index;
    index.set(object(1), QRectF(-1e9, -1e9, 2e9, 2e9));
    index.set(object(2), QRectF(1e9, 1e9, 0, 0));
    QCOMPARE(index.objectsIn(QRectF(0, 0, 1, 1)), QVector<KvDeskObjectId>{object(1)});
    QCOMPARE(index.objectsIn(QRectF(1e9 - 1, 1e9 - 1, 2, 2)).size(), 2);
}

STATREPORT_TEST_MAIN(KvDeskObjectIndexTest)
#include "KvDeskObjectIndexTest.moc"
