// SPDX-License-Identifier: MIT
#include "KvDeskValueSortModel.h"

#include "KvDeskValueTableModel.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtCalibration.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasuringDocument.h"
#include "support/StatReportTest.h"

#include <QAbstractItemModelTester>
#include <QRandomGenerator>

#include <algorithm>
#include <numeric>

namespace {

QPolygonF ofLength(double length)
{
    return polygon({QPointF(0, 0), QPointF(length, 0)});
}

void setLength(int line, double length)
{
    ZtKernelData *const kernel = ZtKernelData::getInstance();
    static_cast<ZtDrawnObjectData *>(kernel->object(ZtDrawnType::Line, line))->setPoints(ofLength(length));
    kernel->notifyObjectChanged(ZtDrawnType::Line, line);
}

void setName(int line, const QString &name)
{
    ZtKernelData *const kernel = ZtKernelData::getInstance();
    kernel->getGsManipulator(ZtDrawnType::Line)->setObjectName(line, name);
    kernel->notifyObjectChanged(ZtDrawnType::Line, line);
}

} // namespace

class KvDeskValueSortModelTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void sorts_data();
    void sorts();
    void sortsManyRows_data();
    void sortsManyRows();
    void filters_data();
    void filters();
    void unsortedIsTheOrderOfTheSource();
    void keepsPersistentIndexes();
    void changedRowMoves();
    void rowComesAndGoesWithItsName();
    void headersWithoutRows();
    void staysInStep_data();
    void staysInStep();

private:
    static QStringList column(const QAbstractItemModel &model, int column)
    {
        QStringList texts;
        for (int row = 0; row < model.rowCount(); ++row)
            texts.append(model.index(row, column).data().toString());
        return texts;
    }
};

void KvDeskValueSortModelTest::sorts_data()
{
    QTest::addColumn<int>("column");
    QTest::addColumn<Qt::SortOrder>("order");
    QTest::addColumn<QStringList>("expected");
    QTest::newRow("names as people count")
        << static_cast<int>(KvDeskValueTableModel::ObjectColumn) << Qt::AscendingOrder
        << QStringList({QStringLiteral("a 2"), QStringLiteral("A 10"), QStringLiteral("b 1")});
    QTest::newRow("descending") << static_cast<int>(KvDeskValueTableModel::ObjectColumn)
                                << Qt::DescendingOrder
                                << QStringList({QStringLiteral("b 1"), QStringLiteral("A 10"),
                                                QStringLiteral("a 2")});
    QTest::newRow("values in any unit")
        << static_cast<int>(KvDeskValueTableModel::ValueColumn) << Qt::AscendingOrder
        << QStringList({QStringLiteral("500.00 μm"), QStringLiteral("2.000 mm"), QStringLiteral("1.000 cm")});
}

void KvDeskValueSortModelTest::sorts()
{
    QFETCH(int, column);
    QFETCH(Qt::SortOrder, order);
    QFETCH(QStringList, expected);
    ZtMeasuringDocument document;
    document.setCalibration(ZtCalibration(1.0));
    document.addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(2000, 0)}), QStringLiteral("A 10"));
    document.addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(500, 0)}), QStringLiteral("b 1"));
    document.addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(10000, 0)}), QStringLiteral("a 2"));
    KvDeskValueTableModel source;
    KvDeskValueSortModel model(&source);
    model.sort(column, order);
    QCOMPARE(KvDeskValueSortModelTest::column(model, column), expected);
}

void KvDeskValueSortModelTest::sortsManyRows_data()
{
    QTest::addColumn<int>("column");
    QTest::addColumn<Qt::SortOrder>("order");
    for (int column = 0; column < KvDeskValueTableModel::ColumnCount; ++column) {
        QTest::addRow("column %d, ascending", column) << column << Qt::AscendingOrder;
        QTest::addRow("column %d, descending", column) << column << Qt::DescendingOrder;
    }
}

// As comparing rows one by one sorts them; those that are alike stay in the order of the source.
void KvDeskValueSortModelTest::sortsManyRows()
{
    QFETCH(int, column);
    QFETCH(Qt::SortOrder, order);
    ZtMeasuringDocument document;
    QRandomGenerator random(3);
    for (int i = 0; i < 200; ++i) {
        const int type = i % 2 == 0 ? ZtDrawnType::Line : ZtDrawnType::Rectangle;
        const double size = random.bounded(1, 20);
        document.addObject(type, polygon({QPointF(0, 0), QPointF(size, 4)}),
                           QString::number(random.bounded(40)));
    }
    KvDeskValueTableModel source;
    KvDeskValueSortModel model(&source);
    model.sort(column, order);
    const auto compare = [&](int a, int b) {
        if (column != KvDeskValueTableModel::ValueColumn)
            return source.compareTexts(a, b, column);
        const double left = source.row(a).value;
        const double right = source.row(b).value;
        return left < right ? -1 : left > right ? 1 : 0;
    };
    const auto isBefore = [&](int a, int b) {
        return order == Qt::AscendingOrder ? compare(a, b) < 0 : compare(b, a) < 0;
    };
    std::vector<int> expected(static_cast<std::size_t>(source.rowCount()));
    std::iota(expected.begin(), expected.end(), 0);
    std::stable_sort(expected.begin(), expected.end(), isBefore);
    for (int row = 0; row < model.rowCount(); ++row)
        QCOMPARE(model.sourceRow(row), expected[static_cast<std::size_t>(row)]);
}

void KvDeskValueSortModelTest::filters_data()
{
    QTest::addColumn<QString>("filter");
    QTest::addColumn<QStringList>("expected");
    const QStringList all{QStringLiteral("Width"), QStringLiteral("Height"), QStringLiteral("Area"),
                          QStringLiteral("Length")};
    QTest::newRow("nothing") << QString() << all;
    QTest::newRow("blanks") << QStringLiteral("  ") << all;
    QTest::newRow("type") << QStringLiteral("rectangle") << QStringList(all.mid(0, 3));
    QTest::newRow("object") << QStringLiteral("screw") << QStringList(all.mid(3));
    QTest::newRow("value name") << QStringLiteral("idt") << QStringList(all.mid(0, 1));
    QTest::newRow("words in any column") << QStringLiteral("AREA rect") << QStringList(all.mid(2, 1));
    QTest::newRow("all words have to match") << QStringLiteral("area line") << QStringList();
    QTest::newRow("values do not count") << QStringLiteral("px") << QStringList();
}

void KvDeskValueSortModelTest::filters()
{
    QFETCH(QString, filter);
    QFETCH(QStringList, expected);
    ZtMeasuringDocument document;
    document.addObject(ZtDrawnType::Rectangle, polygon({QPointF(0, 0), QPointF(3, 4)}));
    document.addObject(ZtDrawnType::Line, ofLength(5), QStringLiteral("Screw"));
    KvDeskValueTableModel source;
    KvDeskValueSortModel model(&source);
    const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    model.setFilter(filter);
    QCOMPARE(column(model, KvDeskValueTableModel::NameColumn), expected);
    QCOMPARE(model.isFiltered(), !filter.trimmed().isEmpty());
    model.setFilter(QString());
    QCOMPARE(model.rowCount(), 4);
}

void KvDeskValueSortModelTest::unsortedIsTheOrderOfTheSource()
{
    ZtMeasuringDocument document;
    for (const double length : {3.0, 1.0, 2.0})
        document.addObject(ZtDrawnType::Line, ofLength(length));
    KvDeskValueTableModel source;
    KvDeskValueSortModel model(&source);
    const QStringList unsorted = column(model, KvDeskValueTableModel::ObjectColumn);
    model.sort(KvDeskValueTableModel::ValueColumn);
    QVERIFY(column(model, KvDeskValueTableModel::ObjectColumn) != unsorted);
    model.sort(-1);
    QCOMPARE(column(model, KvDeskValueTableModel::ObjectColumn), unsorted);
}

void KvDeskValueSortModelTest::keepsPersistentIndexes()
{
    ZtMeasuringDocument document;
    for (const double length : {3.0, 1.0, 2.0})
        document.addObject(ZtDrawnType::Line, ofLength(length));
    KvDeskValueTableModel source;
    KvDeskValueSortModel model(&source);
    const QPersistentModelIndex first = model.index(0, 3);
    model.sort(KvDeskValueTableModel::ValueColumn);
    QCOMPARE(first.row(), 2);
    QCOMPARE(first.data().toString(), QStringLiteral("3.0 px"));
}

void KvDeskValueSortModelTest::changedRowMoves()
{
    ZtMeasuringDocument document;
    for (const double length : {3.0, 1.0, 2.0})
        document.addObject(ZtDrawnType::Line, ofLength(length));
    KvDeskValueTableModel source;
    KvDeskValueSortModel model(&source);
    model.sort(KvDeskValueTableModel::ValueColumn, Qt::DescendingOrder);
    const QSignalSpy resets(&model, SIGNAL(modelReset()));
    QSignalSpy changes(&model, SIGNAL(dataChanged(QModelIndex,QModelIndex,QVector<int>)));
    setLength(3, 9.0);
    source.flush();
    QCOMPARE(column(model, KvDeskValueTableModel::ObjectColumn),
             QStringList({QStringLiteral("Line 3"), QStringLiteral("Line 1"), QStringLiteral("Line 2")}));
    QCOMPARE(resets.count(), 0);
    QCOMPARE(changes.count(), 1);
    QCOMPARE(changes.first().first().toModelIndex().row(), 0);
}

void KvDeskValueSortModelTest::rowComesAndGoesWithItsName()
{
    ZtMeasuringDocument document;
    document.addObject(ZtDrawnType::Line, ofLength(1.0));
    document.addObject(ZtDrawnType::Line, ofLength(2.0), QStringLiteral("Screw"));
    KvDeskValueTableModel source;
    KvDeskValueSortModel model(&source);
    model.setFilter(QStringLiteral("screw"));
    setName(1, QStringLiteral("Screw 2"));
    source.flush();
    QCOMPARE(model.rowCount(), 2);
    setName(2, QString());
    source.flush();
    QCOMPARE(column(model, KvDeskValueTableModel::ObjectColumn), QStringList(QStringLiteral("Screw 2")));
}

void KvDeskValueSortModelTest::headersWithoutRows()
{
    const ZtMeasuringDocument document;
    KvDeskValueTableModel source;
    const KvDeskValueSortModel model(&source);
    QCOMPARE(model.rowCount(), 0);
    QCOMPARE(model.headerData(1, Qt::Horizontal).toString(), QStringLiteral("Object"));
}

void KvDeskValueSortModelTest::staysInStep_data()
{
    QTest::addColumn<int>("column");
    QTest::addColumn<Qt::SortOrder>("order");
    QTest::addColumn<QString>("filter");
    for (int column = -1; column < KvDeskValueTableModel::ColumnCount; ++column) {
        for (const Qt::SortOrder order : {Qt::AscendingOrder, Qt::DescendingOrder}) {
            for (const QString &filter : {QString(), QStringLiteral("2")})
                QTest::addRow("column %d, order %d, filter %s", column, order, qPrintable(filter))
                    << column << order << filter;
        }
    }
}

// Whatever happens, the rows are those that sorting and filtering everything gives.
void KvDeskValueSortModelTest::staysInStep()
{
    QFETCH(int, column);
    QFETCH(Qt::SortOrder, order);
    QFETCH(QString, filter);
    ZtMeasuringDocument document;
    KvDeskValueTableModel source;
    KvDeskValueSortModel model(&source);
    const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    model.sort(column, order);
    model.setFilter(filter);
    QRandomGenerator random(7);
    for (int round = 0; round < 60; ++round) {
        for (int i = random.bounded(1, 8); i > 0; --i) {
            const int id = random.bounded(1, 25);
            const int what = random.bounded(5);
            if (!ZtKernelData::getInstance()->object(ZtDrawnType::Line, id))
                document.addObject(ZtDrawnType::Line, ofLength(random.bounded(1, 9)), QString(), QString(),
                                   id);
            else if (what == 0)
                ZtKernelData::getInstance()->removeObject(ZtDrawnType::Line, id);
            else if (what == 1)
                setName(id, QString::number(random.bounded(30)));
            else
                setLength(id, random.bounded(1, 9));
        }
        source.flush();
        KvDeskValueSortModel expected(&source);
        expected.sort(column, order);
        expected.setFilter(filter);
        QCOMPARE(model.rowCount(), expected.rowCount());
        for (int row = 0; row < model.rowCount(); ++row) {
            QCOMPARE(model.sourceRow(row), expected.sourceRow(row));
            QCOMPARE(model.rowOf(model.sourceRow(row)), row);
        }
    }
}

STATREPORT_TEST_MAIN(KvDeskValueSortModelTest)
#include "KvDeskValueSortModelTest.moc"
