// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/common/KvPicturePlacement.h"

#include <QJsonArray>
#include <QJsonObject>

class KvPicturePlacementTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void isCentredAtFirst();
    void writesNumbersAsTexts();
    void requiresTwoKeys_data();
    void requiresTwoKeys();
    void readsTextsOfNumbers_data();
    void readsTextsOfNumbers();
    void comparesAllMembers();
};

void KvPicturePlacementTest::isCentredAtFirst()
{
    const KvPicturePlacement placement;
    QCOMPARE(int(placement.alignment), 132);
    QCOMPARE(placement.widthPercent, 75);
    QCOMPARE(placement.rotation, 0);
}

void KvPicturePlacementTest::writesNumbersAsTexts()
{
    QJsonObject config{{"other", 5}};
    KvPicturePlacement{Qt::AlignRight, 59, 270}.toJson(config);
    QCOMPARE(config, QJsonObject({{"other", 5},
                                  {"alignment", QStringLiteral("2")},
                                  {"widthPercent", QStringLiteral("59")},
                                  {"rotationAngles", QStringLiteral("270")}}));
}

void KvPicturePlacementTest::requiresTwoKeys_data()
{
    QTest::addColumn<QJsonObject>("config");
    QTest::addColumn<bool>("isIn");
    QTest::newRow("both") << QJsonObject{{"alignment", "1"}, {"widthPercent", "5"}} << true;
    QTest::newRow("both, of other types")
        << QJsonObject{{"alignment", 1}, {"widthPercent", QJsonValue::Null}} << true;
    QTest::newRow("no alignment") << QJsonObject{{"widthPercent", "5"}} << false;
    QTest::newRow("no width") << QJsonObject{{"alignment", "1"}, {"rotationAngles", "0"}} << false;
    QTest::newRow("other letters") << QJsonObject{{"Alignment", "1"}, {"widthpercent", "5"}} << false;
    QTest::newRow("empty") << QJsonObject() << false;
}

void KvPicturePlacementTest::requiresTwoKeys()
{
    QFETCH(QJsonObject, config);
    QTEST(KvPicturePlacement::isIn(config), "isIn");
}

void KvPicturePlacementTest::readsTextsOfNumbers_data()
{
    QTest::addColumn<QJsonObject>("config");
    QTest::addColumn<bool>("isRead");
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("width");
    QTest::addColumn<int>("rotation");
    // Before, each is at 2, 40 and 180.
    const auto add = [](const char *name, const QJsonValue &alignment, const QJsonValue &width,
                        const QJsonValue &rotation) -> QTestData & {
        return QTest::newRow(name) << QJsonObject{
                   {"alignment", alignment}, {"widthPercent", width}, {"rotationAngles", rotation}};
    };
    const QJsonValue absent(QJsonValue::Undefined);
    add("all", "1", "100", "90") << true << 1 << 100 << 90;
    add("no rotation", "132", "75", absent) << true << 132 << 75 << 0;
    add("alignment as number", 1, "75", "90") << true << 2 << 75 << 90;
    add("alignment is true", true, "75", "90") << true << 2 << 75 << 90;
    add("alignment is null", QJsonValue::Null, "75", "90") << true << 2 << 75 << 90;
    add("alignment is a list", QJsonArray{"1"}, "75", "90") << true << 2 << 75 << 90;
    add("width as number", "1", 75, "90") << true << 1 << 40 << 90;
    add("width is an object", "1", QJsonObject(), "90") << true << 1 << 40 << 90;
    add("rotation as number", "1", "75", 90) << true << 1 << 75 << 0;
    add("rotation is null", "1", "75", QJsonValue::Null) << true << 1 << 75 << 0;
    add("rotation is a word", "1", "75", "quarter") << true << 1 << 75 << 0;
    add("rotation is empty", "1", "75", "") << true << 1 << 75 << 0;
    add("rotation of an eighth", "1", "75", "45") << true << 1 << 75 << 45;
    add("alignment is a word", "left", "75", "90") << false << 0 << 40 << 180;
    add("alignment is empty", "", "75", "90") << false << 0 << 40 << 180;
    add("alignment with a fraction", "132.0", "75", "90") << false << 0 << 40 << 180;
    add("alignment with another base", "0x84", "75", "90") << false << 0 << 40 << 180;
    add("alignment out of range", "4294967296", "75", "90") << false << 0 << 40 << 180;
    add("alignment in blanks", " 132 ", "75", "90") << true << 132 << 75 << 90;
    add("alignment with a sign", "+2", "75", "90") << true << 2 << 75 << 90;
    add("width is a word", "1", "wide", "90") << false << 1 << 0 << 180;
    add("width is empty", "1", "", "90") << false << 1 << 0 << 180;
    add("width with a unit", "1", "75%", "90") << false << 1 << 0 << 180;
    add("width below its range", "1", "-5", "90") << true << 1 << -5 << 90;
    add("width above its range", "1", "500", "90") << true << 1 << 500 << 90;
    add("both malformed", "x", "y", "90") << false << 0 << 40 << 180;
}

void KvPicturePlacementTest::readsTextsOfNumbers()
{
    QFETCH(QJsonObject, config);
    KvPicturePlacement placement{Qt::AlignRight, 40, 180};
    QTEST(placement.readFrom(config), "isRead");
    QTEST(int(placement.alignment), "alignment");
    QTEST(placement.widthPercent, "width");
    QTEST(placement.rotation, "rotation");
}

void KvPicturePlacementTest::comparesAllMembers()
{
    const KvPicturePlacement placement{Qt::AlignLeft, 50, 90};
    QVERIFY(placement == (KvPicturePlacement{Qt::AlignLeft, 50, 90}));
    QVERIFY(placement != (KvPicturePlacement{Qt::AlignRight, 50, 90}));
    QVERIFY(placement != (KvPicturePlacement{Qt::AlignLeft, 51, 90}));
    QVERIFY(placement != (KvPicturePlacement{Qt::AlignLeft, 50, 180}));
}

STATREPORT_TEST_MAIN(KvPicturePlacementTest)
#include "KvPicturePlacementTest.moc"
