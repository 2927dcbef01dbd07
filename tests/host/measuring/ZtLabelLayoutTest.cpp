// SPDX-License-Identifier: MIT
#include "measuring/ZtLabelLayout.h"

#include "host/measuring/Polygon.h"
#include "support/StatReportTest.h"

#include <random>

namespace {

const QRectF page(0, 0, 800, 600);

ZtLabelRequest line(const QPointF &from, const QPointF &to, const QSizeF &size = QSizeF(100, 20))
{
    const QRectF bounds = QRectF(from, to).normalized();
    return {size, bounds, polygon({from, to}), polygon({from, to})};
}

bool coversHandle(const QRectF &box, const QPolygonF &handles)
{
    for (const QPointF &handle : handles) {
        if (box.adjusted(-4, -4, 4, 4).contains(handle))
            return true;
    }
    return false;
}

} // namespace

class ZtLabelLayoutTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void liesBesideTheFirstPoint();
    void keepsClearOfHandles_data();
    void keepsClearOfHandles();
    void keepsClearOfTheLineWherePossible();
    void staysOnThePage();
    void labelsNeverOverlap();
    void firstComesFirst();
    void hidesWhatHasNoRoom();
    void objectsOutsideHaveNone();
    void emptyTextsHaveNone();
};

void ZtLabelLayoutTest::liesBesideTheFirstPoint()
{
    const QRectF box = ZtLabelLayout::place({line({100, 100}, {100, 300})}, page).first();
    QCOMPARE(box, QRectF(106, 74, 100, 20));
}

void ZtLabelLayoutTest::keepsClearOfHandles_data()
{
    QTest::addColumn<QPointF>("other");
    // The other point lies where the label would be.
    QTest::newRow("above right") << QPointF(160, 85);
    QTest::newRow("above left") << QPointF(40, 85);
    QTest::newRow("below right") << QPointF(160, 115);
    QTest::newRow("very near") << QPointF(102, 99);
    QTest::newRow("the same") << QPointF(100, 100);
}

void ZtLabelLayoutTest::keepsClearOfHandles()
{
    QFETCH(QPointF, other);
    const ZtLabelRequest request = line({100, 100}, other);
    const QRectF box = ZtLabelLayout::place({request}, page).first();
    QVERIFY(!box.isNull());
    QVERIFY(!coversHandle(box, request.handles));
}

void ZtLabelLayoutTest::keepsClearOfTheLineWherePossible()
{
    // A line to the upper right goes through the first place.
    const QRectF box = ZtLabelLayout::place({line({100, 100}, {300, 50})}, page).first();
    QVERIFY(!box.isNull());
    QVERIFY(!box.contains(QPointF(150, 87.5)));
    // A zigzag all around is crossed rather than left without a label.
    ZtLabelRequest request = line({100, 100}, {100, 100});
    for (int i = 0; i < 60; ++i)
        request.outline << QPointF(i % 2 ? 0 : 800, i * 10);
    request.object = page;
    QVERIFY(!ZtLabelLayout::place({request}, page).first().isNull());
}

void ZtLabelLayoutTest::staysOnThePage()
{
    for (const QPointF &corner : {QPointF(0, 0), QPointF(800, 0), QPointF(0, 600), QPointF(800, 600)}) {
        const QRectF box = ZtLabelLayout::place({line(corner, QPointF(400, 300))}, page).first();
        QVERIFY(!box.isNull());
        QVERIFY(page.contains(box));
    }
}

void ZtLabelLayoutTest::labelsNeverOverlap()
{
    std::mt19937 random(3);
    std::uniform_real_distribution<double> x(0, 800);
    std::uniform_real_distribution<double> y(0, 600);
    QVector<ZtLabelRequest> requests;
    for (int i = 0; i < 300; ++i)
        requests.append(line({x(random), y(random)}, {x(random), y(random)}));
    const QVector<QRectF> boxes = ZtLabelLayout::place(requests, page);
    QCOMPARE(boxes.size(), requests.size());
    int shown = 0;
    for (int i = 0; i < boxes.size(); ++i) {
        if (boxes.at(i).isNull())
            continue;
        ++shown;
        QVERIFY(!coversHandle(boxes.at(i), requests.at(i).handles));
        for (int j = 0; j < i; ++j)
            QVERIFY(!boxes.at(i).intersects(boxes.at(j)));
    }
    // 240 would fill the page.
    QVERIFY(shown > 60 && shown < 240);
}

void ZtLabelLayoutTest::firstComesFirst()
{
    const ZtLabelRequest a = line({100, 100}, {100, 300});
    const ZtLabelRequest b = line({110, 100}, {110, 300});
    const QVector<QRectF> boxes = ZtLabelLayout::place({b, a}, page);
    QCOMPARE(boxes.at(0), QRectF(116, 74, 100, 20));
    QVERIFY(boxes.at(1) != QRectF(106, 74, 100, 20));
}

void ZtLabelLayoutTest::hidesWhatHasNoRoom()
{
    const QVector<ZtLabelRequest> requests(40, line({100, 100}, {101, 101}));
    const QVector<QRectF> boxes = ZtLabelLayout::place(requests, page);
    QVERIFY(!boxes.first().isNull());
    QVERIFY(boxes.last().isNull());
}

void ZtLabelLayoutTest::objectsOutsideHaveNone()
{
    QVERIFY(ZtLabelLayout::place({line({-50, 100}, {-10, 100})}, page).first().isNull());
    QVERIFY(!ZtLabelLayout::place({line({-50, 100}, {10, 100})}, page).first().isNull());
}

void ZtLabelLayoutTest::emptyTextsHaveNone()
{
    QVERIFY(ZtLabelLayout::place({line({50, 100}, {90, 100}, QSizeF())}, page).first().isNull());
    QVERIFY(ZtLabelLayout::place({}, page).isEmpty());
}

STATREPORT_TEST_MAIN(ZtLabelLayoutTest)
#include "ZtLabelLayoutTest.moc"
