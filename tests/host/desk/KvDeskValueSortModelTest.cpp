// SPDX-License-Identifier: MIT
#include "KvDeskValueSortModel.h"

#include "KvDeskValueTableModel.h"
#include "host/measuring/Polygon.h"
#include "measuring/ZtCalibration.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasuringDocument.h"
#include "support/StatReportTest.h"

class KvDeskValueSortModelTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void sorts_data();
    void sorts();

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

STATREPORT_TEST_MAIN(KvDeskValueSortModelTest)
#include "KvDeskValueSortModelTest.moc"
