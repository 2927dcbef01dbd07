// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/table/KvStatisticsBaseTableWidgetModel.h"
#include "blocks/table/KvTableContents.h"
#include "blocks/table/KvTableFonts.h"

#include <QAbstractItemModelTester>

namespace {

/** Two header rows, \a bodyRows body rows "b<row>"; the body is one column wider than the header. */
std::shared_ptr<KvTableContents> makeContents(int bodyRows)
{
    auto contents = std::make_shared<KvTableContents>();
    contents->headerFont = KvTableFonts::header();
    contents->bodyFont = KvTableFonts::body();
    contents->header.setCell(0, 0, QStringLiteral("top"), QColor(), 2);
    contents->header.setCell(1, 0, QStringLiteral("left"), QColor(), 1);
    contents->header.setCell(1, 1, QStringLiteral("right"), QColor(Qt::blue), 1);
    for (int row = 0; row < bodyRows; ++row) {
        contents->body.setCell(row, 0, QStringLiteral("b%1").arg(row), QColor(), 1);
        contents->body.setCell(row, 2, QStringLiteral("x"), QColor(QStringLiteral("#A90909")), 1);
    }
    return contents;
}

} // namespace

class KvStatisticsBaseTableWidgetModelTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsEmpty();
    void showsHeaderAndPartOfTheBody_data();
    void showsHeaderAndPartOfTheBody();
    void answersTheFiveRoles();
    void otherRolesHaveNoData_data();
    void otherRolesHaveNoData();
    void positionsWithoutCellHaveNoData();
    void indexesHaveNoChildren();
    void everyPartResetsTheModel();
    void clearResetsOnce();
    void knowsHeaderSpans();
    void keepsTheRulesOfModels();
};

void KvStatisticsBaseTableWidgetModelTest::startsEmpty()
{
    const KvStatisticsBaseTableWidgetModel model;
    QCOMPARE(model.rowCount(), 0);
    QCOMPARE(model.columnCount(), 0);
    QCOMPARE(model.headerRowCount(), 0);
    QVERIFY(!model.hasHeaderSpans());
    QVERIFY(!model.cell(0, 0));
    QVERIFY(!model.data(model.index(0, 0)).isValid());
}

void KvStatisticsBaseTableWidgetModelTest::showsHeaderAndPartOfTheBody_data()
{
    QTest::addColumn<int>("first");
    QTest::addColumn<int>("count");
    QTest::addColumn<QStringList>("firstColumn");
    const QStringList header{QStringLiteral("top"), QStringLiteral("left")};
    QTest::newRow("no body") << 0 << 0 << header;
    QTest::newRow("from the start") << 0 << 2 << (header + QStringList{"b0", "b1"});
    QTest::newRow("from the middle") << 3 << 2 << (header + QStringList{"b3", "b4"});
    QTest::newRow("the last row") << 4 << 1 << (header + QStringList{"b4"});
    QTest::newRow("all") << 0 << 5 << (header + QStringList{"b0", "b1", "b2", "b3", "b4"});
}

void KvStatisticsBaseTableWidgetModelTest::showsHeaderAndPartOfTheBody()
{
    QFETCH(int, first);
    QFETCH(int, count);
    KvStatisticsBaseTableWidgetModel model;
    model.setPart(makeContents(5), first, count);
    QCOMPARE(model.rowCount(), 2 + count);
    QCOMPARE(model.columnCount(), 3);
    QCOMPARE(model.headerRowCount(), 2);
    QStringList texts;
    for (int row = 0; row < model.rowCount(); ++row)
        texts.append(model.index(row, 0).data().toString());
    QTEST(texts, "firstColumn");
}

void KvStatisticsBaseTableWidgetModelTest::answersTheFiveRoles()
{
    KvStatisticsBaseTableWidgetModel model;
    model.setPart(makeContents(1), 0, 1);
    const QModelIndex header = model.index(1, 1);
    const QModelIndex plain = model.index(2, 0);
    const QModelIndex flagged = model.index(2, 2);

    QCOMPARE(model.data(header, 0), QVariant(QStringLiteral("right")));
    QCOMPARE(model.data(plain, 0), QVariant(QStringLiteral("b0")));
    QCOMPARE(qvariant_cast<QFont>(model.data(header, 6)), KvTableFonts::header());
    QCOMPARE(qvariant_cast<QFont>(model.data(plain, 6)), KvTableFonts::body());
    QVERIFY(KvTableFonts::header() != KvTableFonts::body());

    // A number, not an alignment: what compares the role's value with 129 must find it.
    QCOMPARE(model.data(header, 7).userType(), int(QMetaType::Int));
    QCOMPARE(model.data(header, 7).toInt(), 129);
    QCOMPARE(model.data(plain, 7).toInt(), 129);

    QCOMPARE(model.data(header, 8).userType(), int(QMetaType::QColor));
    QVERIFY(!qvariant_cast<QColor>(model.data(header, 8)).isValid());
    QVERIFY(!qvariant_cast<QColor>(model.data(flagged, 8)).isValid());
    QCOMPARE(qvariant_cast<QColor>(model.data(header, 9)), QColor(Qt::blue));
    QCOMPARE(model.data(plain, 9).userType(), int(QMetaType::QColor));
    QVERIFY(!qvariant_cast<QColor>(model.data(plain, 9)).isValid());
    QCOMPARE(qvariant_cast<QColor>(model.data(flagged, 9)).name(), QStringLiteral("#a90909"));
}

void KvStatisticsBaseTableWidgetModelTest::otherRolesHaveNoData_data()
{
    QTest::addColumn<int>("role");
    for (const int role : {1, 2, 3, 4, 5, 10, 11, 12, 13, 14, 32, 256})
        QTest::addRow("role %d", role) << role;
}

void KvStatisticsBaseTableWidgetModelTest::otherRolesHaveNoData()
{
    QFETCH(int, role);
    KvStatisticsBaseTableWidgetModel model;
    model.setPart(makeContents(1), 0, 1);
    QVERIFY(!model.data(model.index(0, 0), role).isValid());
    QVERIFY(!model.data(model.index(2, 0), role).isValid());
}

void KvStatisticsBaseTableWidgetModelTest::positionsWithoutCellHaveNoData()
{
    KvStatisticsBaseTableWidgetModel model;
    model.setPart(makeContents(1), 0, 1);
    for (const int role : {0, 6, 7, 8, 9}) {
        QVERIFY(!model.data(model.index(0, 1), role).isValid()); // covered by the span at its left
        QVERIFY(!model.data(model.index(1, 2), role).isValid());
        QVERIFY(!model.data(model.index(2, 1), role).isValid());
        QVERIFY(!model.data(QModelIndex(), role).isValid());
    }
}

void KvStatisticsBaseTableWidgetModelTest::indexesHaveNoChildren()
{
    KvStatisticsBaseTableWidgetModel model;
    model.setPart(makeContents(1), 0, 1);
    QCOMPARE(model.rowCount(model.index(0, 0)), 0);
    QCOMPARE(model.columnCount(model.index(0, 0)), 0);
}

void KvStatisticsBaseTableWidgetModelTest::everyPartResetsTheModel()
{
    KvStatisticsBaseTableWidgetModel model;
    QSignalSpy aboutToReset(&model, SIGNAL(modelAboutToBeReset()));
    QSignalSpy reset(&model, SIGNAL(modelReset()));
    const std::shared_ptr<KvTableContents> contents = makeContents(5);
    model.setPart(contents, 0, 2);
    model.setPart(contents, 2, 2);
    QCOMPARE(aboutToReset.count(), 2);
    QCOMPARE(reset.count(), 2);
}

void KvStatisticsBaseTableWidgetModelTest::clearResetsOnce()
{
    KvStatisticsBaseTableWidgetModel model;
    model.setPart(makeContents(5), 0, 5);
    QSignalSpy reset(&model, SIGNAL(modelReset()));
    model.clear();
    QCOMPARE(reset.count(), 1);
    QCOMPARE(model.rowCount(), 0);
    QCOMPARE(model.columnCount(), 0);
    QVERIFY(!model.hasHeaderSpans());
    model.clear();
    QCOMPARE(reset.count(), 1);
}

void KvStatisticsBaseTableWidgetModelTest::knowsHeaderSpans()
{
    KvStatisticsBaseTableWidgetModel model;
    model.setPart(makeContents(1), 0, 1);
    QVERIFY(model.hasHeaderSpans());

    auto contents = std::make_shared<KvTableContents>();
    contents->header.setCell(0, 0, QStringLiteral("h"), QColor(), 1);
    contents->body.setCell(0, 0, QStringLiteral("b"), QColor(), 2); // spans of the body do not count
    model.setPart(contents, 0, 1);
    QVERIFY(!model.hasHeaderSpans());
}

void KvStatisticsBaseTableWidgetModelTest::keepsTheRulesOfModels()
{
    KvStatisticsBaseTableWidgetModel model;
    QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    const std::shared_ptr<KvTableContents> contents = makeContents(12);
    model.setPart(contents, 0, 5);
    model.setPart(contents, 10, 2);
    // The grid may be emptied while the model still counts its rows: a moment between clearing and filling.
    contents->header.clear();
    contents->body.clear();
    QVERIFY(!model.index(2, 0).data().isValid());
    model.clear();
}

STATREPORT_TEST_MAIN(KvStatisticsBaseTableWidgetModelTest)
#include "KvStatisticsBaseTableWidgetModelTest.moc"
