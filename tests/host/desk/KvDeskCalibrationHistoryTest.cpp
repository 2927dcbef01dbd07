// SPDX-License-Identifier: MIT
#include "KvDeskCalibrationHistory.h"

#include "KvDeskCalibrationText.h"
#include "support/StatReportTest.h"

class KvDeskCalibrationHistoryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void showsWhatIsKnown();
    void headings();
    void sameHistoryKeepsTheRows();
};

void KvDeskCalibrationHistoryTest::showsWhatIsKnown()
{
    ZtCalibration first(0.5);
    first.setDate(QDateTime::currentDateTimeUtc());
    first.setAuthor(QStringLiteral("A. Smith"));
    first.setName(QStringLiteral("Stage"));
    first.setNote(QStringLiteral("Cold room"));
    first.setOrigin(ZtCalibration::Origin::KnownDistance);
    KvDeskCalibrationHistory model;
    QCOMPARE(model.rowCount(), 0);
    model.setHistory({first, ZtCalibration(1.0, 2.0)});
    QCOMPARE(model.rowCount(), 2);
    const auto texts = [&model](int row) {
        QStringList result;
        for (int column = 0; column < model.columnCount(); ++column)
            result.append(model.index(row, column).data().toString());
        return result;
    };
    QCOMPARE(texts(0), QStringList({KvDeskCalibrationText::date(first.date()), QStringLiteral("A. Smith"),
                                    QStringLiteral("0.5 μm"), QStringLiteral("Known distance"),
                                    QStringLiteral("Stage")}));
    QCOMPARE(texts(1), QStringList({QString(), QString(), QStringLiteral("1 × 2 μm"), QStringLiteral("Typed"),
                                    QString()}));
    QCOMPARE(model.index(0, KvDeskCalibrationHistory::NameColumn).data(Qt::ToolTipRole).toString(),
             QStringLiteral("Stage\nCold room"));
    QVERIFY(model.calibration(0) == first);
}

void KvDeskCalibrationHistoryTest::headings()
{
    const KvDeskCalibrationHistory model;
    QStringList titles;
    for (int i = 0; i < model.columnCount(); ++i)
        titles.append(model.headerData(i, Qt::Horizontal).toString());
    QCOMPARE(titles, QStringList({QStringLiteral("Date"), QStringLiteral("Who"), QStringLiteral("Pixel size"),
                                  QStringLiteral("Origin"), QStringLiteral("Name")}));
}

// The selection would be lost for nothing.
void KvDeskCalibrationHistoryTest::sameHistoryKeepsTheRows()
{
    KvDeskCalibrationHistory model;
    model.setHistory({ZtCalibration(1.0)});
    QSignalSpy reset(&model, SIGNAL(modelReset()));
    model.setHistory({ZtCalibration(1.0)});
    QCOMPARE(reset.count(), 0);
    model.setHistory({});
    QCOMPARE(reset.count(), 1);
}

STATREPORT_TEST_MAIN(KvDeskCalibrationHistoryTest)
#include "KvDeskCalibrationHistoryTest.moc"
