// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvCliArguments.h"
#include "KvCliHost.h"
#include "KvCliOutput.h"
#include "KvStatsReport.h"

#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <cmath>

namespace {

QString text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

/** Statistics of a table, or of objects that the test draws. */
class Measured
{
public:
    /** False when the table cannot be read. */
    bool readTable(const QByteArray &table)
    {
        QFile file(StatReportTest::temporaryPath(QStringLiteral("table.csv")));
        if (!file.open(QIODevice::WriteOnly) || file.write(table) != table.size())
            return false;
        file.close();
        KvCliArguments arguments;
        arguments.tablePath = file.fileName();
        KvCliOutput output;
        output.setQuiet(true);
        return m_host.loadData(arguments, output);
    }
    ZtMeasuringDocument &document() { return m_host.document(); }

    KvStatsReport report(bool byObject = true)
    {
        m_host.kernelData().setActive(true);
        const KvStatsReport made(KvStatisticsEngine::instance(), m_host.document(), byObject);
        m_host.kernelData().setActive(false);
        return made;
    }

private:
    KvCliHost m_host;
};

} // namespace

class KvStatsReportTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void keepsTheUnitsOfTheTable_data();
    void keepsTheUnitsOfTheTable();
    void findsOneUnitForSeveral_data();
    void findsOneUnitForSeveral();
    void suitsTheUnitToDrawnObjects();
    void computesOverTypes();
    void writesText_data();
    void writesText();
    void alignsText();
    void quotesCsv();
    void writesCsvExactly();
    void writesJson();
    void writesJsonByMeasurement();
    void writesNothingWithoutValues();
};

void KvStatsReportTest::keepsTheUnitsOfTheTable_data()
{
    QTest::addColumn<QByteArray>("heading");
    QTest::addColumn<QString>("unit");
    const auto add = [](const char *heading, const char *unit) {
        QTest::newRow(heading) << QByteArray(heading) << text(unit);
    };
    add("length_mm", "mm");
    add("length_cm", "cm");
    add("Length [nm]", "nm");
    add("Length (m)", "m");
    add("Area [cm\xC2\xB2]", "cm\xC2\xB2");
    add("angle_deg", "\xC2\xB0");
    add("Mass [g]", "g");
    add("Roundness", "");
}

void KvStatsReportTest::keepsTheUnitsOfTheTable()
{
    QFETCH(QByteArray, heading);
    QFETCH(QString, unit);
    Measured measured;
    // Mean 5, squared distances 9 1 1 1 0 0 4 16: population variance 4.
    QVERIFY(measured.readTable("name," + heading + "\na,2\nb,4\nc,4\nd,4\ne,5\nf,5\ng,7\nh,9\n"));
    const QVector<KvGroupStatistics> groups = measured.report().groups();
    QCOMPARE(groups.size(), 1);
    QCOMPARE(groups.first().unit, unit);
    QCOMPARE(groups.first().count, 8);
    QCOMPARE(groups.first().min, 2.0);
    QCOMPARE(groups.first().max, 9.0);
    QCOMPARE(groups.first().average, 5.0);
    QCOMPARE(groups.first().sigma, 2.0);
}

void KvStatsReportTest::findsOneUnitForSeveral_data()
{
    QTest::addColumn<QByteArray>("rows");
    QTest::addColumn<bool>("byObject");
    QTest::addColumn<QString>("csv");
    // All of one group: micrometres in the first row do not make it micrometres.
    QTest::newRow("in one type") << QByteArray("A,1,L,um,2000\nA,2,L,mm,4\n") << true
                                 << text("A,L,mm,2,2,4,3,1,3,6\n");
    QTest::newRow("types apart") << QByteArray("A,1,L,um,2000\nB,1,L,mm,4\n") << true
                                 << text("A,L,\xCE\xBCm,1,2000,2000,2000,0,0,0\nB,L,mm,1,4,4,4,0,0,0\n");
    QTest::newRow("types together") << QByteArray("A,1,L,um,2000\nB,1,L,mm,4\n") << false
                                    << text("L,mm,2,2,4,3,1,3,6\n");
    QTest::newRow("types of one unit") << QByteArray("A,1,L,um,2000\nB,1,L,um,4000\n") << false
                                       << text("L,\xCE\xBCm,2,2000,4000,3000,1000,3000,6000\n");
}

void KvStatsReportTest::findsOneUnitForSeveral()
{
    QFETCH(QByteArray, rows);
    QFETCH(bool, byObject);
    QFETCH(QString, csv);
    Measured measured;
    QVERIFY(measured.readTable("object_type,object_index,value_name,unit,value\n" + rows));
    QCOMPARE(measured.report(byObject).toCsv().section(QLatin1Char('\n'), 1), csv);
}

void KvStatsReportTest::suitsTheUnitToDrawnObjects()
{
    Measured measured;
    ZtMeasuringDocument &document = measured.document();
    document.setCalibration(ZtCalibration(1000.0));
    // 3 and 5 pixels of a millimetre each.
    QVERIFY(document.addObject(ZtDrawnType::Line, QPolygonF(QVector<QPointF>{{0, 0}, {3, 0}})) > 0);
    QVERIFY(document.addObject(ZtDrawnType::Line, QPolygonF(QVector<QPointF>{{0, 0}, {3, 4}})) > 0);
    QCOMPARE(measured.report().toCsv(),
             text("Object Type,Measurement Type,Unit,Count,Min,Max,Average,Sigma,3 Sigma,6 Sigma\n"
                  "Line,Length,mm,2,3,5,4,1,3,6\n"));
}

void KvStatsReportTest::computesOverTypes()
{
    Measured measured;
    QVERIFY(measured.readTable("type,name,length_mm\nNut,a,1\nBolt,b,3\nnut,c,8\n"));
    QCOMPARE(
        measured.report(true).toCsv().section(QLatin1Char('\n'), 1),
        text("Bolt,length,mm,1,3,3,3,0,0,0\nNut,length,mm,1,1,1,1,0,0,0\nnut,length,mm,1,8,8,8,0,0,0\n"));
    // Mean 4, squared distances 9 1 16: variance 26/3, its root 2.94392028877595.
    QCOMPARE(measured.report(false).toCsv(),
             text("Measurement Type,Unit,Count,Min,Max,Average,Sigma,3 Sigma,6 Sigma\n"
                  "length,mm,3,1,8,4,2.94392028878,8.83176086633,17.6635217327\n"));
}

void KvStatsReportTest::writesText_data()
{
    QTest::addColumn<QByteArray>("number");
    QTest::addColumn<QString>("shown");
    const auto add = [](const char *number, const char *shown) {
        QTest::newRow(number) << QByteArray(number) << text(shown);
    };
    add("0", "0");
    add("1", "1");
    add("100", "100");
    add("1200000", "1200000");
    add("123456.7", "123457");
    add("12345678.9", "12345679");
    add("1.25", "1.25");
    add("1.2345678", "1.23457");
    add("9.9999999", "10");
    add("-2.50", "-2.5");
    add("0.0000125", "0.0000125");
    add("0.00012345678", "0.000123457");
    add("123456789012345", "123456789012345");
    add("1e20", "1e+20");
    add("1.5e-12", "1.5e-12");
}

void KvStatsReportTest::writesText()
{
    QFETCH(QByteArray, number);
    QFETCH(QString, shown);
    Measured measured;
    QVERIFY(measured.readTable("name,Score\na," + number + '\n'));
    const QString row = measured.report(false).toText().section(QLatin1Char('\n'), 1, 1);
    const QStringList words = row.split(QLatin1Char(' '), Qt::SkipEmptyParts);
    // Name, count, least, greatest, average and three times sigma; there is no unit.
    QCOMPARE(words,
             QStringList({text("Score"), text("1"), shown, shown, shown, text("0"), text("0"), text("0")}));
}

void KvStatsReportTest::alignsText()
{
    Measured measured;
    QVERIFY(measured.readTable("name,a_mm,breadth_mm\nx,10,1\ny,30,3\n"));
    QCOMPARE(
        measured.report().toText(),
        text("Object Type  Measurement Type  Unit  Count  Min  Max  Average  Sigma  3 Sigma  6 Sigma\n"
             "Object       a                 mm        2   10   30       20     10       30       60\n"
             "Object       breadth           mm        2    1    3        2      1        3        6\n"));
}

void KvStatsReportTest::quotesCsv()
{
    Measured measured;
    QVERIFY(measured.readTable("object_type,object_index,value_name,unit,value\n"
                               "\"a, b\",1,\"say \"\"hi\"\"\",mm,1\n"
                               "plain; 'x',1,Length,mm,2\n"));
    const QString csv = measured.report().toCsv();
    QCOMPARE(csv.section(QLatin1Char('\n'), 1),
             text("\"a, b\",\"say \"\"hi\"\"\",mm,1,1,1,1,0,0,0\nplain; 'x',Length,mm,1,2,2,2,0,0,0\n"));
}

void KvStatsReportTest::writesCsvExactly()
{
    Measured measured;
    QVERIFY(measured.readTable("name,Score\na,0.123456789012345\nb,0.123456789012345\n"));
    // Twelve digits.
    QCOMPARE(measured.report(false).toCsv().section(QLatin1Char('\n'), 1),
             text("Score,,2,0.123456789012,0.123456789012,0.123456789012,0,0,0\n"));
}

void KvStatsReportTest::writesJson()
{
    Measured measured;
    QVERIFY(measured.readTable("type,name,length_mm\nNut,a,2\nNut,b,4\nNut,c,6\nNut,d,8\n"));
    QJsonParseError error;
    const QJsonObject root = QJsonDocument::fromJson(measured.report().toJson(), &error).object();
    QCOMPARE(error.error, QJsonParseError::NoError);
    QCOMPARE(root.keys(), QStringList({text("groupBy"), text("groups")}));
    QCOMPARE(root.value(text("groupBy")).toString(), text("object"));
    QCOMPARE(root.value(text("groups")).toArray().size(), 1);
    const QJsonObject group = root.value(text("groups")).toArray().first().toObject();
    QCOMPARE(group.keys(),
             text("average|count|lowerQuartile|max|measurementType|median|min|objectType|sigma|sigma3|"
                  "sigma6|texts|unit|upperQuartile")
                 .split(QLatin1Char('|')));
    QCOMPARE(group.value(text("objectType")).toString(), text("Nut"));
    QCOMPARE(group.value(text("measurementType")).toString(), text("length"));
    QCOMPARE(group.value(text("unit")).toString(), text("mm"));
    QCOMPARE(group.value(text("count")).toDouble(), 4.0);
    QCOMPARE(group.value(text("min")).toDouble(), 2.0);
    QCOMPARE(group.value(text("max")).toDouble(), 8.0);
    QCOMPARE(group.value(text("average")).toDouble(), 5.0);
    // Squared distances 9 1 1 9.
    QCOMPARE(group.value(text("sigma")).toDouble(), std::sqrt(5.0));
    QCOMPARE(group.value(text("sigma3")).toDouble(), 3.0 * std::sqrt(5.0));
    QCOMPARE(group.value(text("sigma6")).toDouble(), 6.0 * std::sqrt(5.0));
    const double median = group.value(text("median")).toDouble();
    QVERIFY(group.value(text("lowerQuartile")).toDouble() <= median);
    QVERIFY(median <= group.value(text("upperQuartile")).toDouble());
    const QJsonObject texts = group.value(text("texts")).toObject();
    QCOMPARE(texts.keys(), QStringList({text("Average"), text("Max"), text("Min"), text("Sigma")}));
    QCOMPARE(texts.value(text("Min")).toString(), text("2.000 mm"));
    QCOMPARE(texts.value(text("Max")).toString(), text("8.000 mm"));
    QCOMPARE(texts.value(text("Average")).toString(), text("5.000 mm"));
    QCOMPARE(texts.value(text("Sigma")).toString(), text("2.236 mm"));
}

void KvStatsReportTest::writesJsonByMeasurement()
{
    Measured measured;
    QVERIFY(measured.readTable("type,name,length_mm\nNut,a,2\nBolt,b,4\n"));
    const QJsonObject root = QJsonDocument::fromJson(measured.report(false).toJson()).object();
    QCOMPARE(root.value(text("groupBy")).toString(), text("measurement"));
    const QJsonArray groups = root.value(text("groups")).toArray();
    QCOMPARE(groups.size(), 1);
    QVERIFY(!groups.first().toObject().contains(text("objectType")));
    QCOMPARE(groups.first().toObject().value(text("count")).toInt(), 2);
}

void KvStatsReportTest::writesNothingWithoutValues()
{
    Measured measured;
    const KvStatsReport report = measured.report(false);
    QVERIFY(report.groups().isEmpty());
    QCOMPARE(report.toText(),
             text("Measurement Type  Unit  Count  Min  Max  Average  Sigma  3 Sigma  6 Sigma\n"));
    QCOMPARE(report.toCsv(), text("Measurement Type,Unit,Count,Min,Max,Average,Sigma,3 Sigma,6 Sigma\n"));
    const QJsonObject root = QJsonDocument::fromJson(report.toJson()).object();
    QVERIFY(root.value(text("groups")).isArray());
    QVERIFY(root.value(text("groups")).toArray().isEmpty());
}

STATREPORT_TEST_MAIN(KvStatsReportTest)
#include "KvStatsReportTest.moc"
