// SPDX-License-Identifier: MIT
#include "measuring/ZtTableExport.h"

#include "Polygon.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtCalibration.h"
#include "measuring/ZtDrawnManipulator.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtTableImportOptions.h"
#include "support/StatReportTest.h"

#include <QBuffer>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace {

using Options = ZtTableExport::Options;

const QPolygonF diagonal = polygon({QPointF(0, 0), QPointF(3, 4)});

Options withLayout(ZtTableExport::Layout layout)
{
    Options options;
    options.layout = layout;
    return options;
}

/** One value of one object: type, object, value name, value in base units and kind. Values come in an order
 * of their own, as tables need not keep that of the host. */
using Value = std::tuple<QString, QString, QString, double, int>;

QVector<Value> valuesOf(const QVector<int> &types)
{
    QVector<Value> values;
    const ZtKernelData *const kernel = ZtKernelData::getInstance();
    for (const int type : types) {
        const ZtGsManipulator *const manipulator = kernel->getGsManipulator(type);
        const ZtObjectMap objects = kernel->objects().value(type);
        for (auto it = objects.constBegin(); it != objects.constEnd(); ++it) {
            for (const QString &name : manipulator->getValueNames()) {
                int kind = 0;
                const QVariant value = manipulator->value(name, it.value(), kind);
                if (value.isValid())
                    values.append({manipulator->objectTypeName(it.key()),
                                   manipulator->getObjectName(it.key()), name, value.toDouble(), kind});
            }
        }
    }
    std::sort(values.begin(), values.end());
    return values;
}

} // namespace

class ZtTableExportTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void nothingIsAHeader();
    void tidy();
    void wide();
    void wideSharesColumns();
    void json();
    void importedNumbersStayAsWritten();
    void wideColumnHasOneUnit();
    void units();
    void hiddenValuesAreLeftOut();
    void spreadsheetLocale();
    void pointLocale();
    void byteOrderMark();
    void quotes();
    void formulas();
    void selectionOnly();
    void portions();
    void objectsThatGoMeanwhile();
    void roundTrip_data();
    void roundTrip();
    void roundTripOfImported_data();
    void roundTripOfImported();
    void roundTripOfEqualObjects();
    void roundTripOfAWideTable();
    void writesTheFile();
    void fileThatCannotBeWritten();

private:
    void import(const QByteArray &table, const ZtTableImportOptions &options = ZtTableImportOptions());
    QList<QByteArray> lines(const Options &options = Options()) const
    {
        return ZtTableExport::toBytes(options).split('\n');
    }

    std::unique_ptr<ZtMeasuringDocument> m_document;
};

void ZtTableExportTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    m_document = std::make_unique<ZtMeasuringDocument>();
}

void ZtTableExportTest::cleanup()
{
    m_document.reset();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    StatReportTest::cleanup();
}

void ZtTableExportTest::import(const QByteArray &table, const ZtTableImportOptions &options)
{
    QBuffer buffer;
    buffer.setData(table);
    QVERIFY(buffer.open(QIODevice::ReadOnly));
    ZtFault fault;
    QStringList notes;
    QVERIFY2(m_document->importTable(&buffer, QStringLiteral("table"), options, &fault, &notes),
             qPrintable(fault.text()));
    QCOMPARE(notes, QStringList());
}

void ZtTableExportTest::nothingIsAHeader()
{
    QCOMPARE(ZtTableExport::toBytes(withLayout(ZtTableExport::TidyCsv)),
             QByteArray("object_type,object_index,object_name,value_name,unit,value\n"));
    QCOMPARE(ZtTableExport::toBytes(withLayout(ZtTableExport::WideCsv)),
             QByteArray("object_type,object_index,object_name\n"));
    const QByteArray json = ZtTableExport::toBytes(withLayout(ZtTableExport::Json));
    QVERIFY(QJsonDocument::fromJson(json).object().value(QStringLiteral("objects")).isArray());
}

void ZtTableExportTest::tidy()
{
    m_document->setCalibration(ZtCalibration(0.1));
    m_document->addObject(ZtDrawnType::Line, diagonal, QStringLiteral("Screw"));
    m_document->addObject(ZtDrawnType::Circle, polygon({QPointF(0, 0), QPointF(1, 0)}));
    m_document->addObject(ZtDrawnType::TextNote, polygon({QPointF(0, 0)}), QString(), QStringLiteral("Note"));
    const QByteArray table = ZtTableExport::toBytes(Options());
    QVERIFY(table.startsWith("object_type,object_index,object_name,value_name,unit,value\n"
                             "Line,1,Screw,Length,μm,0.5\n"
                             "Circle,1,Circle 1,Diameter,μm,0.2\n"
                             "Circle,1,Circle 1,Area,μm²,0.0314159"));
    QCOMPARE(table.count('\n'), 4);
}

void ZtTableExportTest::wide()
{
    m_document->setCalibration(ZtCalibration(2.0));
    m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    m_document->addObject(ZtDrawnType::Line, diagonal, QStringLiteral("Screw"));
    m_document->addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(0, 1)}));
    QCOMPARE(ZtTableExport::toBytes(withLayout(ZtTableExport::WideCsv)),
             QByteArray("object_type,object_index,object_name,Width [μm],Height [μm],Area [μm²],Length [μm]\n"
                        "Rectangle,1,Rectangle 1,6,8,48,\n"
                        "Line,1,Screw,,,,10\n"
                        "Line,2,Line 2,,,,2\n"));
}

void ZtTableExportTest::wideSharesColumns()
{
    import("type,name,Mass [g],Length [mm]\nBolt,B1,1,2\nBolt,B2,3,4\n");
    import("type,name,Length [mm],Mass [kg],Mass [g]\nNut,N1,5,6,7\nNut,N2,8,9,10\n");
    QCOMPARE(ZtTableExport::toBytes(withLayout(ZtTableExport::WideCsv)),
             QByteArray("object_type,object_index,object_name,Mass [g],Length [mm],Mass [kg],Mass (2) [g]\n"
                        "Bolt,1,B1,1,2,,\n"
                        "Bolt,2,B2,3,4,,\n"
                        "Nut,1,N1,,5,6,7\n"
                        "Nut,2,N2,,8,9,10\n"));
}

void ZtTableExportTest::json()
{
    m_document->addObject(ZtDrawnType::Line, diagonal,
                          QStringLiteral("A \"quoted\" \\ name\twith\x01control"));
    m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    QJsonParseError error;
    const QByteArray bytes = ZtTableExport::toBytes(withLayout(ZtTableExport::Json));
    const QJsonObject json = QJsonDocument::fromJson(bytes, &error).object();
    QCOMPARE(error.errorString(), QStringLiteral("no error occurred"));
    QCOMPARE(json.value(QStringLiteral("format")).toString(), QStringLiteral("statreport-values"));
    QCOMPARE(json.value(QStringLiteral("version")).toInt(), 1);
    const QJsonArray objects = json.value(QStringLiteral("objects")).toArray();
    QCOMPARE(objects.size(), 2);
    const QJsonObject line = objects.at(1).toObject();
    QCOMPARE(line.value(QStringLiteral("type")).toString(), QStringLiteral("Line"));
    QCOMPARE(line.value(QStringLiteral("index")).toInt(), 1);
    QCOMPARE(line.value(QStringLiteral("name")).toString(),
             QStringLiteral("A \"quoted\" \\ name\twith\x01control"));
    const QJsonArray values = objects.at(0).toObject().value(QStringLiteral("values")).toArray();
    QCOMPARE(values.size(), 3);
    QCOMPARE(values.at(2).toObject(), QJsonObject({{QStringLiteral("name"), QStringLiteral("Area")},
                                                   {QStringLiteral("unit"), QStringLiteral("px²")},
                                                   {QStringLiteral("value"), 12.0}}));
}

void ZtTableExportTest::importedNumbersStayAsWritten()
{
    import("name,Mass [g]\nA,1.50\nB,+2\nC,.5\nD,1e-7\nE,007\nF,3.\nG,0.1234567890123456789\n");
    QStringList numbers;
    const QList<QByteArray> rows = lines();
    for (int i = 1; i < rows.size() - 1; ++i)
        numbers.append(QString::fromLatin1(rows.at(i).mid(rows.at(i).lastIndexOf(',') + 1)));
    QCOMPARE(numbers, QStringList({QStringLiteral("1.50"), QStringLiteral("2"), QStringLiteral("0.5"),
                                   QStringLiteral("1e-7"), QStringLiteral("7"), QStringLiteral("3"),
                                   QStringLiteral("0.1234567890123456789")}));
    QJsonParseError error;
    QJsonDocument::fromJson(ZtTableExport::toBytes(withLayout(ZtTableExport::Json)), &error);
    QCOMPARE(error.error, QJsonParseError::NoError);
}

void ZtTableExportTest::wideColumnHasOneUnit()
{
    import("object,value_name,unit,value\nA,Length,mm,5\nB,Length,cm,5\n");
    QCOMPARE(lines(withLayout(ZtTableExport::WideCsv)).mid(0, 3),
             QList<QByteArray>(
                 {"object_type,object_index,object_name,Length [mm]", "Object,1,A,5", "Object,2,B,50"}));
    QCOMPARE(lines().mid(1, 2), QList<QByteArray>({"Object,1,A,Length,mm,5", "Object,2,B,Length,cm,5"}));
}

void ZtTableExportTest::units()
{
    m_document->setCalibration(ZtCalibration(100.0));
    m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    m_document->addObject(ZtDrawnType::Counter, diagonal);
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(QStringLiteral("LengthUnit"), QStringLiteral("mm"));
    ZtAppSettings::endGroup();
    QCOMPARE(
        lines().mid(1, 5),
        QList<QByteArray>({"Rectangle,1,Rectangle 1,Width,mm,0.3", "Rectangle,1,Rectangle 1,Height,mm,0.4",
                           "Rectangle,1,Rectangle 1,Area,mm²,0.12", "Counter,1,Counter 1,Count,pcs,2",
                           "Counter,1,Counter 1,Share,%,100"}));
}

void ZtTableExportTest::hiddenValuesAreLeftOut()
{
    const int id = m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    auto *const manipulator = static_cast<ZtDrawnManipulator *>(
        ZtKernelData::getInstance()->getGsManipulator(ZtDrawnType::Rectangle));
    auto *const object =
        static_cast<ZtDrawnObjectData *>(ZtKernelData::getInstance()->object(ZtDrawnType::Rectangle, id));
    manipulator->setValueShown(object, 1, false);
    QCOMPARE(lines().size(), 4);
    QCOMPARE(lines(withLayout(ZtTableExport::WideCsv)).at(1), QByteArray("Rectangle,1,Rectangle 1,3,,12"));
}

void ZtTableExportTest::spreadsheetLocale()
{
    m_document->setCalibration(ZtCalibration(0.1));
    m_document->addObject(ZtDrawnType::Line, diagonal, QStringLiteral("one; two, three"));
    import("name,Mass [g]\nA,1.50\n");
    Options options;
    options.locale = QLocale(QLocale::German, QLocale::Germany);
    QCOMPARE(ZtTableExport::toBytes(options),
             QByteArray("object_type;object_index;object_name;value_name;unit;value\n"
                        "Line;1;\"one; two, three\";Length;μm;0,5\n"
                        "Object;1;A;Mass;g;1,50\n"));
    options.layout = ZtTableExport::Json;
    QVERIFY(ZtTableExport::toBytes(options).contains("\"value\":0.5}"));
}

// Neither group separators nor digits of another script: no reader would take them.
void ZtTableExportTest::pointLocale()
{
    m_document->setCalibration(ZtCalibration(1000.5));
    m_document->addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(1000, 0)}));
    Options options;
    for (const QLocale &locale : {QLocale(QLocale::English, QLocale::UnitedStates),
                                  QLocale(QLocale::Arabic, QLocale::Egypt), QLocale::c()}) {
        options.locale = locale;
        QCOMPARE(lines(options).at(1), QByteArray("Line,1,Line 1,Length,μm,1000500"));
    }
}

void ZtTableExportTest::byteOrderMark()
{
    Options options;
    QVERIFY(!ZtTableExport::toBytes(options).startsWith("\xEF\xBB\xBF"));
    options.hasByteOrderMark = true;
    QVERIFY(ZtTableExport::toBytes(options).startsWith("\xEF\xBB\xBFobject_type,"));
    options.layout = ZtTableExport::Json;
    QVERIFY(ZtTableExport::toBytes(options).startsWith("{"));
}

void ZtTableExportTest::quotes()
{
    m_document->addObject(ZtDrawnType::Line, diagonal, QStringLiteral("5\" bolt, long"));
    m_document->addObject(ZtDrawnType::Line, diagonal, QStringLiteral("two\nlines"));
    m_document->addObject(ZtDrawnType::Line, diagonal, QStringLiteral(" blank"));
    const QByteArray table = ZtTableExport::toBytes(Options());
    QVERIFY(table.contains("Line,1,\"5\"\" bolt, long\",Length,px,5\n"));
    QVERIFY(table.contains("Line,2,\"two\nlines\",Length,px,5\n"));
    QVERIFY(table.contains("Line,3,\" blank\",Length,px,5\n"));
}

void ZtTableExportTest::formulas()
{
    for (const char *name : {"=1+1", "+x", "-x", "@x", "a=b"})
        m_document->addObject(ZtDrawnType::Line, diagonal, QString::fromLatin1(name));
    import("name,Mass [g]\nA,-3\n");
    Options options;
    QCOMPARE(lines(options).at(1), QByteArray("Line,1,=1+1,Length,px,5"));
    options.guardsFormulas = true;
    const QList<QByteArray> rows = lines(options);
    QCOMPARE(rows.at(1), QByteArray("Line,1,'=1+1,Length,px,5"));
    QCOMPARE(rows.at(2), QByteArray("Line,2,'+x,Length,px,5"));
    QCOMPARE(rows.at(3), QByteArray("Line,3,'-x,Length,px,5"));
    QCOMPARE(rows.at(4), QByteArray("Line,4,'@x,Length,px,5"));
    QCOMPARE(rows.at(5), QByteArray("Line,5,a=b,Length,px,5"));
    // A number is a number.
    QCOMPARE(rows.at(6), QByteArray("Object,1,A,Mass,g,-3"));
}

void ZtTableExportTest::selectionOnly()
{
    for (int i = 0; i < 3; ++i)
        m_document->addObject(ZtDrawnType::Line, diagonal);
    m_document->addObject(ZtDrawnType::TextNote, polygon({QPointF(0, 0)}), QString(), QStringLiteral("Note"));
    Options options;
    options.isSelectionOnly = true;
    QCOMPARE(lines(options).size(), 2);
    options.selection = {{ZtDrawnType::Line, 3},  {ZtDrawnType::Line, 1},     {ZtDrawnType::Line, 3},
                         {ZtDrawnType::Line, 99}, {ZtDrawnType::TextNote, 1}, {12345, 1}};
    QCOMPARE(lines(options).mid(1),
             QList<QByteArray>({"Line,1,Line 1,Length,px,5", "Line,3,Line 3,Length,px,5", ""}));
}

void ZtTableExportTest::portions()
{
    for (int i = 0; i < 7; ++i)
        m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    for (const auto layout : {ZtTableExport::TidyCsv, ZtTableExport::WideCsv, ZtTableExport::Json}) {
        ZtTableExport table(withLayout(layout));
        QCOMPARE(table.objectCount(), 7);
        int rounds = 0;
        for (; !table.isFinished(); ++rounds) {
            QCOMPARE(table.doneCount(), 3 * rounds);
            table.advance(3);
        }
        QCOMPARE(rounds, 3);
        QCOMPARE(table.bytes(), ZtTableExport::toBytes(withLayout(layout)));
    }
}

void ZtTableExportTest::objectsThatGoMeanwhile()
{
    for (int i = 0; i < 3; ++i)
        m_document->addObject(ZtDrawnType::Line, diagonal);
    ZtTableExport table{Options()};
    table.advance(1);
    ZtKernelData::getInstance()->removeObject(ZtDrawnType::Line, 2);
    table.advance(2);
    QVERIFY(table.isFinished());
    QCOMPARE(table.bytes().count('\n'), 3);
}

void ZtTableExportTest::roundTrip_data()
{
    QTest::addColumn<int>("layout");
    QTest::addColumn<QLocale>("locale");
    QTest::addColumn<bool>("hasMark");
    const int tidy = ZtTableExport::TidyCsv;
    QTest::newRow("C") << tidy << QLocale::c() << false;
    QTest::newRow("spreadsheet") << tidy << QLocale(QLocale::German, QLocale::Germany) << false;
    QTest::newRow("spreadsheet with mark") << tidy << QLocale(QLocale::German, QLocale::Germany) << true;
    QTest::newRow("JSON") << static_cast<int>(ZtTableExport::Json) << QLocale::c() << false;
}

void ZtTableExportTest::roundTrip()
{
    QFETCH(int, layout);
    QFETCH(QLocale, locale);
    QFETCH(bool, hasMark);
    ZtFault fault;
    QVERIFY(m_document->loadSession(sourcePath(QStringLiteral("examples/sessions/demo.json")), &fault));
    m_document->addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(1.0 / 3.0, 1e-5)}),
                          QStringLiteral("α; \"β\", γ"));
    const QList<int> measured = ZtKernelData::getInstance()->objects().keys();
    QVector<int> types(measured.begin(), measured.end());
    types.removeAll(ZtDrawnType::TextNote);
    types.removeAll(ZtDrawnType::ScaleBar);
    const QVector<Value> before = valuesOf(types);
    Options options = withLayout(static_cast<ZtTableExport::Layout>(layout));
    options.locale = locale;
    options.hasByteOrderMark = hasMark;
    import(ZtTableExport::toBytes(options));
    QCOMPARE(valuesOf(m_document->importedTypes()), before);
    QVERIFY(before.size() > 60);
}

void ZtTableExportTest::roundTripOfImported_data()
{
    QTest::addColumn<int>("layout");
    QTest::newRow("tidy") << static_cast<int>(ZtTableExport::TidyCsv);
    QTest::newRow("JSON") << static_cast<int>(ZtTableExport::Json);
}

void ZtTableExportTest::roundTripOfImported()
{
    QFETCH(int, layout);
    const Options options = withLayout(static_cast<ZtTableExport::Layout>(layout));
    import("type,name,Length [mm],Mass [g],Area [cm2]\nBolt,B1,1.10,2,\nBolt,B2,3.3333333333333335,4,1e-3\n"
           "Nut,N1,0.1,1,7\nNut,N1 b,0.2,NA,8\n");
    const QVector<int> types = m_document->importedTypes();
    const QVector<Value> before = valuesOf(types);
    const QByteArray written = ZtTableExport::toBytes(options);
    import(written);
    QCOMPARE(valuesOf(m_document->importedTypes().mid(types.size())), before);
    m_document->clear();
    import(written);
    QCOMPARE(ZtTableExport::toBytes(options), written);
}

// Two tables may have brought the same type, with the same numbers and names; some objects have no values.
void ZtTableExportTest::roundTripOfEqualObjects()
{
    const Options options = withLayout(ZtTableExport::Json);
    import("type,name,Length [mm]\nBolt,B1,1\nBolt,B2,NA\nBolt,,3\n");
    import("type,name,Length [mm]\nBolt,B1,4\nBolt,,5\n");
    QVector<Value> before = valuesOf(m_document->importedTypes());
    const QByteArray written = ZtTableExport::toBytes(options);
    m_document->clear();
    import(written);
    QCOMPARE(valuesOf(m_document->importedTypes()), before);
    QCOMPARE(m_document->importedTypes().size(), 1);
    QCOMPARE(ZtKernelData::getInstance()->objects().first().size(), 5);
}

void ZtTableExportTest::roundTripOfAWideTable()
{
    import("type,name,Length [mm],Mass [g]\nBolt,B1,1.10,2\nBolt,B2,3.3333333333333335,4\n");
    const QVector<int> types = m_document->importedTypes();
    const QVector<Value> before = valuesOf(types);
    import(ZtTableExport::toBytes(withLayout(ZtTableExport::WideCsv)));
    QCOMPARE(valuesOf(m_document->importedTypes().mid(types.size())), before);
}

void ZtTableExportTest::writesTheFile()
{
    m_document->addObject(ZtDrawnType::Line, diagonal);
    const QString path = temporaryPath(QStringLiteral("values.csv"));
    ZtFault fault;
    QVERIFY(ZtTableExport::writeFile(path, Options(), &fault));
    QVERIFY(fault.isNull());
    QFile file(path);
    QVERIFY(file.open(QIODevice::ReadOnly));
    QCOMPARE(file.readAll(), ZtTableExport::toBytes(Options()));
}

void ZtTableExportTest::fileThatCannotBeWritten()
{
    ZtFault fault;
    const QString path = temporaryPath(QStringLiteral("no such folder/values.csv"));
    QVERIFY(!ZtTableExport::writeFile(path, Options(), &fault));
    QCOMPARE(fault.file, path);
    QVERIFY(!fault.isNull());
}

STATREPORT_TEST_MAIN(ZtTableExportTest)
#include "ZtTableExportTest.moc"
