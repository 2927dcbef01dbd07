// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ItemByItem.h"

/// The comparisons have to see what they are there for.
class ItemByItemTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void seesDifferences_data();
    void seesDifferences();
    void takesQuarterPixelsForAlike();
    void emptyPicturesAreNotAlike();
    void placesAndPens();
};

namespace {

const QRectF &source()
{
    static const QRectF rect(-150, -50, 1250, 1250);
    return rect;
}

ItemByItem::AxisLook darkLook()
{
    return {ItemByItem::cosmeticPen(QColor(0xdc, 0xdc, 0xdc)),
            ItemByItem::cosmeticPen(QColor(0x37, 0x37, 0x37)), Qt::white, true};
}

enum Change { NoTick, NoGridLine, OtherDigit, NoLabel, LabelBeside, LabelBelow, OtherColor };

// An axis with a line or a text over it that hides or replaces something of it.
void addChange(QGraphicsScene *scene, Change change)
{
    const QPen hidden = ItemByItem::cosmeticPen(Qt::black, 3.0);
    if (change == NoTick)
        scene->addLine(500, 1002, 500, 1006, hidden);
    else if (change == NoGridLine)
        scene->addLine(500, 0, 500, 998, hidden);
    else if (change == NoLabel)
        scene->addRect(470, 1006, 60, 40, QPen(Qt::NoPen), Qt::black);
    else if (change == OtherColor)
        scene->addLine(0, 1000, 1000, 1000, ItemByItem::cosmeticPen(Qt::yellow));
}

// Where a label that the axis does not have stands in one picture, in comparison to the other.
QPointF labelPlace(Change change)
{
    if (change == LabelBeside)
        return QPointF(504, 500);
    return change == LabelBelow ? QPointF(500, 504) : QPointF(500, 500);
}

QImage axisPicture(Change change, bool isChanged)
{
    QGraphicsScene scene;
    ItemByItem::addValueAxisX(&scene, darkLook(), 0, 100, 11);
    const QString label = isChanged && change == OtherDigit ? QStringLiteral("3") : QStringLiteral("8");
    ItemByItem::addText(&scene, label, isChanged ? labelPlace(change) : QPointF(500, 500), Qt::white);
    if (isChanged)
        addChange(&scene, change);
    return ItemByItem::picture(&scene, source());
}

} // namespace

void ItemByItemTest::seesDifferences_data()
{
    QTest::addColumn<int>("change");
    QTest::newRow("a tick") << int(NoTick);
    QTest::newRow("a grid line") << int(NoGridLine);
    QTest::newRow("a digit") << int(OtherDigit);
    QTest::newRow("a label") << int(NoLabel);
    QTest::newRow("a label beside") << int(LabelBeside);
    QTest::newRow("a label below") << int(LabelBelow);
    QTest::newRow("a colour") << int(OtherColor);
}

void ItemByItemTest::seesDifferences()
{
    QFETCH(int, change);
    const QImage plain = axisPicture(static_cast<Change>(change), false);
    const QImage changed = axisPicture(static_cast<Change>(change), true);
    QVERIFY(ItemByItem::alike(plain, plain));
    QVERIFY(!ItemByItem::alike(plain, changed));
    QVERIFY(!ItemByItem::alike(changed, plain));
    QVERIFY(ItemByItem::difference(plain, changed) > 0);
}

void ItemByItemTest::takesQuarterPixelsForAlike()
{
    const QString text(40, QLatin1Char('k'));
    QGraphicsScene here;
    QGraphicsScene beside;
    ItemByItem::addText(&here, text, QPointF(0, 0), Qt::white);
    ItemByItem::addText(&beside, text, QPointF(0.3, 0), Qt::white);
    const QImage first = ItemByItem::picture(&here, source());
    const QImage second = ItemByItem::picture(&beside, source());
    QVERIFY(ItemByItem::difference(first, second) > 0);
    QVERIFY(ItemByItem::alike(first, second));
}

void ItemByItemTest::emptyPicturesAreNotAlike()
{
    QGraphicsScene scene;
    const QImage picture = ItemByItem::picture(&scene, source());
    QCOMPARE(ItemByItem::inkedPixels(picture), 0);
    QVERIFY(!ItemByItem::alike(picture, picture));
    QVERIFY(!ItemByItem::alike(axisPicture(NoTick, false), picture.copy(0, 0, 10, 10)));
}

void ItemByItemTest::placesAndPens()
{
    QGraphicsScene scene;
    scene.addLine(1, 2, 3.5, 4, ItemByItem::cosmeticPen(Qt::red));
    QCOMPARE(ItemByItem::placedLines(&scene),
             QStringList(QStringLiteral("1.000000 2.000000 3.500000 4.000000 in #ff0000 1 1 1")));
    ItemByItem::addText(&scene, QStringLiteral("a"), QPointF(7, 8.25), Qt::red);
    QVERIFY(ItemByItem::placedTexts(&scene).join(QString()).startsWith(
        QStringLiteral("a at 7.000000 8.250000, ")));
}

STATREPORT_TEST_MAIN(ItemByItemTest)
#include "ItemByItemTest.moc"
