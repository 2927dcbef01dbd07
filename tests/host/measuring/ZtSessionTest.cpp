// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"
#include "support/UnprivilegedUser.h"

#include "host/measuring/Polygon.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtImportedTypeBuilder.h"
#include "measuring/ZtProgress.h"
#include "measuring/ZtSession.h"
#include "measuring/ZtTableImport.h"
#include "measuring/ZtWorkerThread.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <limits>
#include <thread>

namespace {

QString text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

/// A session file that holds the given members.
QByteArray file(const QByteArray &members)
{
    return "{\"format\":\"statreport-session\",\"version\":1," + members + "}";
}

QByteArray drawn(const QByteArray &object)
{
    return file("\"objects\":[{\"type\":\"line\",\"id\":1,\"points\":[[0,0],[1,1]]}," + object + "]");
}

QByteArray table(const QByteArray &members)
{
    return file(
        "\"tables\":[{\"name\":\"A\",\"values\":[{\"name\":\"a\",\"unit\":\"mm\"},{\"name\":\"b\"}]," +
        members + "}]");
}

ZtImportedTable imported(const QByteArray &bytes)
{
    ZtImportedTable result;
    ZtFault fault;
    if (!ZtTableImport::parse(bytes, text("t.csv"), ZtTableImportOptions(), &result, &fault))
        qCritical("%s", qPrintable(fault.text()));
    return result;
}

ZtSession withTable(const QByteArray &bytes)
{
    ZtSession session;
    for (const auto &type : imported(bytes).types) {
        ZtSessionTable sessionTable{type, {}};
        for (int row = 0; row < type->rowCount(); ++row)
            sessionTable.rows.append({row + 1, row, type->rowName(row), {}});
        session.tables.append(sessionTable);
    }
    return session;
}

QStringList cells(const ZtSession &session)
{
    QStringList result;
    for (const ZtSessionTable &sessionTable : session.tables) {
        const ZtImportedType &type = *sessionTable.type;
        for (const ZtSessionRow &row : sessionTable.rows) {
            for (const ZtImportedCell &cell : type.row(row.row))
                result.append(QStringLiteral("%1/%2/%3 %4=%5 (%6)")
                                  .arg(type.name(), QString::number(row.id), row.name,
                                       type.values().at(cell.valueIndex).name, type.text(cell),
                                       QString::number(cell.value, 'g', 17)));
        }
    }
    return result;
}

ZtSession parsed(const QByteArray &bytes)
{
    ZtSession session;
    ZtFault fault;
    if (!ZtSession::parse(bytes, text("/folder/s.json"), &session, &fault))
        qCritical("%s", qPrintable(fault.text()));
    return session;
}

ZtSession roundTrip(const ZtSession &session)
{
    return parsed(session.toJson(text("/folder/s.json")));
}

ZtFault loadFault(const QString &path)
{
    ZtSession session;
    ZtFault fault;
    ZtSession::load(path, &session, &fault);
    return fault;
}

QString write(const QString &name, const QByteArray &bytes)
{
    QFile target(StatReportTest::temporaryPath(name));
    if (!target.open(QIODevice::WriteOnly) || target.write(bytes) != bytes.size())
        qCritical("cannot write %s", qPrintable(target.fileName()));
    return target.fileName();
}

} // namespace

class ZtSessionTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void keepsDrawnObjects();
    void keepsTables_data();
    void keepsTables();
    void keepsUnitsThatDifferFromThatOfTheValue();
    void keepsWhatIsLeftOfATable();
    void keepsImagePaths_data();
    void keepsImagePaths();
    void readsTheLeast();
    void refuses_data();
    void refuses();
    void readsMembersInAnyOrder();
    void readsEscapedKeys();
    void lastOfEqualKeysCounts();
    void readsMixedKeysOfCells();
    void refusesWhatJsonForbids_data();
    void refusesWhatJsonForbids();
    void tellsTheLine();
    void cancelsWhileItReads();
    void writesTheNewestVersion();
    void readsTheFirstVersion();
    void refusesDeepNesting_data();
    void refusesDeepNesting();
    void refusesEveryBeginning();
    void refusesFiles();
    void refusesUnreadableFiles();
    void refusesHugeFiles();
    void savesAllOrNothing();
};

void ZtSessionTest::keepsDrawnObjects()
{
    ZtSession session;
    session.calibration = ZtCalibration(0.1234567890123456, 0.5);
    session.calibration.setObjective(text("10x"));
    session.calibration.setOrigin(ZtCalibration::Origin::KnownDistance);
    session.objects.append({ZtDrawnType::find(ZtDrawnType::Polygon),
                            7,
                            text("תא \"1\""),
                            QString(),
                            polygon({{0.1, -0.2}, {1e9, 1.0 / 3.0}, {5, 5}}),
                            {1}});
    session.objects.append({ZtDrawnType::find(ZtDrawnType::TextNote),
                            std::numeric_limits<int>::max(),
                            QString(),
                            text("two\nlines"),
                            polygon({{3, 4}}),
                            {}});
    session.objects.append(
        {ZtDrawnType::find(ZtDrawnType::Counter), 1, QString(), QString(), QPolygonF(), {}});
    const ZtSession again = roundTrip(session);
    QVERIFY(again.calibration == session.calibration);
    QCOMPARE(again.objects.size(), 3);
    for (int i = 0; i < again.objects.size(); ++i) {
        const ZtSessionObject &actual = again.objects.at(i);
        const ZtSessionObject &expected = session.objects.at(i);
        QVERIFY(actual.type == expected.type);
        QCOMPARE(actual.id, expected.id);
        QCOMPARE(actual.name, expected.name);
        QCOMPARE(actual.text, expected.text);
        QVERIFY(QVector<QPointF>(actual.points) == QVector<QPointF>(expected.points));
        QCOMPARE(actual.hiddenValues, expected.hiddenValues);
    }
    QCOMPARE(again.toJson(text("/folder/s.json")), session.toJson(text("/folder/s.json")));
}

void ZtSessionTest::keepsTables_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("wide") << QByteArray(
        "species,name,length_mm,mass_g\nA,,05.100,3750\nA,two,NA,1e3\nB,,+1,-2\n");
    QTest::newRow("results") << QByteArray(" ,Area,Angle,%Area\n1,2,3,4\n5,6,,8\n");
    QTest::newRow("class index") << QByteArray("2,2,a,b\n1,2,1\n3,4,0\n");
    QTest::newRow("sparse") << QByteArray("a,b,c,d,e\n1,,,,\n,,,,2\n,1,2,3,4\n1,2,3,4,5\n");
    QTest::newRow("units of all kinds")
        << QByteArray("a [um],b [cm2],c [deg],d [rad],e [pcs],f [%],g [px2],h [g/cm3]\n1,2,3,4,5,6,7,8\n");
}

void ZtSessionTest::keepsTables()
{
    QFETCH(QByteArray, bytes);
    ZtSession session = withTable(bytes);
    session.tables.first().rows.first().hiddenValues = {0};
    const ZtSession again = roundTrip(session);
    QCOMPARE(cells(again), cells(session));
    QCOMPARE(again.tables.first().type->valueNames(), session.tables.first().type->valueNames());
    QCOMPARE(again.tables.first().rows.first().hiddenValues, QVector<int>{0});
    QCOMPARE(again.toJson(text("/folder/s.json")), session.toJson(text("/folder/s.json")));
}

void ZtSessionTest::keepsUnitsThatDifferFromThatOfTheValue()
{
    const ZtSession session = withTable(
        "object,value_name,unit,value\nb,Width,cm,1\na,Length,mm,5\nb,Length,cm,2\nc,Length,mm,7\n");
    const ZtSession again = roundTrip(session);
    QCOMPARE(cells(again), cells(session));
    QCOMPARE(again.tables.first().type->values().at(1).unit.text(), text("mm"));
}

void ZtSessionTest::keepsWhatIsLeftOfATable()
{
    ZtSession session = withTable("a\n1\n2\n3\n");
    session.tables.first().rows.remove(1);
    const ZtSession again = roundTrip(session);
    QCOMPARE(cells(again), (QStringList{text("Object/1/ a=1 (1)"), text("Object/3/ a=3 (3)")}));
}

void ZtSessionTest::keepsImagePaths_data()
{
    QTest::addColumn<QString>("image");
    QTest::addColumn<QByteArray>("stored");
    QTest::newRow("beside") << "/folder/a.png" << QByteArray("\"a.png\"");
    QTest::newRow("below") << "/folder/pictures/a.png" << QByteArray("\"pictures/a.png\"");
    QTest::newRow("elsewhere") << "/pictures/a.png" << QByteArray("\"../pictures/a.png\"");
}

void ZtSessionTest::keepsImagePaths()
{
    QFETCH(QString, image);
    QFETCH(QByteArray, stored);
    ZtSession session;
    session.imagePath = image;
    const QByteArray json = session.toJson(text("/folder/s.json"));
    QVERIFY2(json.contains("\"image\":" + stored), json.constData());
    QCOMPARE(parsed(json).imagePath, image);
    ZtSession moved;
    ZtFault fault;
    QVERIFY(ZtSession::parse(json, text("/else/where/s.json"), &moved, &fault));
    QCOMPARE(moved.imagePath,
             QDir::cleanPath(text("/else/where/") + QString::fromUtf8(stored).remove(QLatin1Char('"'))));
}

void ZtSessionTest::readsTheLeast()
{
    const ZtSession session = parsed("{\"format\":\"statreport-session\",\"version\":1}");
    QCOMPARE(session.imagePath, QString());
    QVERIFY(!session.calibration.isCalibrated());
    QVERIFY(session.objects.isEmpty() && session.tables.isEmpty());
    QCOMPARE(parsed(file("\"image\":\"/else/a.png\"")).imagePath, text("/else/a.png"));
    QVERIFY(parsed("\xEF\xBB\xBF" + file("\"future\":{}")).objects.isEmpty());
}

void ZtSessionTest::readsMembersInAnyOrder()
{
    const ZtSession session =
        parsed("{\"tables\":[{\"rows\":[[3,\"r\",[\"1\",null]]],\"values\":[{\"unit\":\"mm\",\"name\":\"a\"},"
               "{\"name\":\"b\"}],\"future\":[1,{}],\"name\":\"A\"}],\"version\":1,"
               "\"objects\":[{\"points\":[[0,0],[1,1]],\"future\":{\"id\":9},\"id\":5,\"type\":\"line\"}],"
               "\"format\":\"statreport-session\"}");
    QCOMPARE(cells(session), QStringList(text("A/3/r a=1 mm (1000)")));
    QCOMPARE(session.objects.size(), 1);
    QCOMPARE(session.objects.first().id, 5);
}

void ZtSessionTest::readsEscapedKeys()
{
    const ZtSession session =
        parsed(table("\"r\\u006fws\":[[1,\"\\u00e4\\ud834\\udd1e\",{\"\\u0031\":\"\\u0032.5\"}]]"));
    QCOMPARE(cells(session), QStringList(text("A/1/\xC3\xA4\xF0\x9D\x84\x9E b=2.5 (2.5)")));
}

void ZtSessionTest::lastOfEqualKeysCounts()
{
    const ZtSession session =
        parsed(table("\"rows\":\"none\",\"rows\":[[1,null,{\"0\":\"x\",\"1\":\"7\",\"0\":\"2\"}]]"));
    QCOMPARE(cells(session), (QStringList{text("A/1/ a=2 mm (2000)"), text("A/1/ b=7 (7)")}));
    QCOMPARE(
        parsed(file("\"micrometresPerPixel\":0,\"micrometresPerPixel\":2")).calibration.micrometresPerPixel(),
        2.0);
}

void ZtSessionTest::readsMixedKeysOfCells()
{
    const ZtSession session = parsed(table("\"rows\":[[1,null,{\"1\":[\"7\",\"\"],\"0\":[\"2\",\"cm\"]}]]"));
    QCOMPARE(cells(session), (QStringList{text("A/1/ a=2 cm (20000)"), text("A/1/ b=7 (7)")}));
}

void ZtSessionTest::refusesWhatJsonForbids_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("garbage") << file("\"objects\":[]") + "x";
    QTest::newRow("two sessions") << file("\"objects\":[]") + file("\"objects\":[]");
    QTest::newRow("number alone") << QByteArray("1");
    QTest::newRow("too large") << file("\"micrometresPerPixel\":1e400");
    QTest::newRow("in what nobody reads") << file("\"future\":[1,]");
    QTest::newRow("control character") << file("\"image\":\"a\nb\"");
    QTest::newRow("no UTF-8") << file("\"image\":\"\xE4\"");
    QTest::newRow("half a pair") << file("\"image\":\"\\ud834\"");
    QTest::newRow("behind a newer version")
        << QByteArray("{\"format\":\"statreport-session\",\"version\":99,");
}

void ZtSessionTest::refusesWhatJsonForbids()
{
    QFETCH(QByteArray, bytes);
    ZtSession session;
    ZtFault fault;
    QVERIFY(!ZtSession::parse(bytes, text("s.json"), &session, &fault));
    QVERIFY2(fault.text().startsWith(text("s.json:")), qPrintable(fault.text()));
    QVERIFY2(fault.message.startsWith(text("The file is not valid JSON (")), qPrintable(fault.text()));
}

void ZtSessionTest::tellsTheLine()
{
    ZtSession session;
    ZtFault fault;
    QVERIFY(!ZtSession::parse("{\n\"format\": \"statreport-session\",\n\n\"version\": 1 2}", text("s.json"),
                              &session, &fault));
    QCOMPARE(fault.line, 4);
}

// Far from the end of what it does, in the middle of one list.
void ZtSessionTest::cancelsWhileItReads()
{
    QByteArray rows;
    for (int i = 1; i <= 200000; ++i)
        rows += (i > 1 ? "," : "") + QByteArray("[") + QByteArray::number(i) + ",null,[\"1.5\",\"2\"]]";
    const QByteArray bytes = table("\"rows\":[" + rows + "]");
    for (const double share : {0.1, 0.5}) {
        ZtProgress progress;
        double seen = 0.0;
        const auto canceller = ZtWorkerThread::begin([&progress, &seen, share]() {
            QElapsedTimer clock;
            clock.start();
            while (progress.fraction() < share && clock.elapsed() < 30000)
                std::this_thread::yield();
            seen = progress.fraction();
            progress.cancel();
        });
        ZtSession session;
        ZtFault fault;
        QVERIFY(!ZtSession::parse(bytes, text("s.json"), &session, &fault, &progress));
        QVERIFY(canceller->wait(30000));
        QVERIFY(fault.message == text("Reading was cancelled"));
        QVERIFY(seen < 0.8);
        QVERIFY(session.tables.isEmpty());
    }
}

void ZtSessionTest::writesTheNewestVersion()
{
    ZtSession session;
    QVERIFY(session.toJson(text("a.json")).contains("\"version\":2"));
    QVERIFY(!session.toJson(text("a.json")).contains("calibration"));
    session.calibration = ZtCalibration(0.5);
    const QByteArray bytes = session.toJson(text("a.json"));
    QVERIFY2(bytes.contains("\"calibration\":{\"micrometresPerPixelX\":0.5,\"micrometresPerPixelY\":0.5,"
                            "\"origin\":\"typed\"}"),
             bytes.constData());
    QVERIFY(!bytes.contains("\"micrometresPerPixel\""));
}

void ZtSessionTest::readsTheFirstVersion()
{
    QVERIFY(parsed(file("\"micrometresPerPixel\":0.25")).calibration == ZtCalibration(0.25));
    // Each version has its own key.
    QVERIFY(!parsed(file("\"calibration\":{}")).calibration.isCalibrated());
    QVERIFY(!parsed("{\"format\":\"statreport-session\",\"version\":2,\"micrometresPerPixel\":1}")
                 .calibration.isCalibrated());
}

void ZtSessionTest::refuses_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("fault");
    QTest::newRow("empty") << QByteArray() << "The file is empty";
    QTest::newRow("blank") << QByteArray(" \n ") << "The file is empty";
    QTest::newRow("no object") << QByteArray("[]") << "The file is not a session";
    QTest::newRow("another file") << QByteArray("{}") << "format: The file is not a session";
    QTest::newRow("no version") << QByteArray("{\"format\":\"statreport-session\"}")
                                << "version: This must be a number";
    const auto version = [](const char *number) {
        return QByteArray("{\"format\":\"statreport-session\",\"version\":") + number + "}";
    };
    QTest::newRow("newer")
        << version("3")
        << "version: The session is of the newer version 3; this program reads versions up to 2";
    QTest::newRow("a little newer")
        << version("2.5")
        << "version: The session is of the newer version 2.5; this program reads versions up to 2";
    QTest::newRow("version 0")
        << version("0") << "version: Sessions of version 0 are not known; this program reads versions 1 to 2";
    QTest::newRow("version of a fraction")
        << version("1.5")
        << "version: Sessions of version 1.5 are not known; this program reads versions 1 to 2";
    QTest::newRow("calibration, number")
        << version("2,\"calibration\":0.5") << "calibration: This must be an object";
    QTest::newRow("calibration without size")
        << version("2,\"calibration\":{\"micrometresPerPixelX\":1}")
        << "calibration.micrometresPerPixelY: This must be a number greater than 0";
    QTest::newRow("image") << file("\"image\":5") << "image: This must be a text";
    QTest::newRow("calibration") << file("\"micrometresPerPixel\":0")
                                 << "micrometresPerPixel: This must be a number greater than 0";
    QTest::newRow("calibration, text") << file("\"micrometresPerPixel\":\"1\"")
                                       << "micrometresPerPixel: This must be a number greater than 0";
    QTest::newRow("objects") << file("\"objects\":{}") << "objects: This must be a list";
    QTest::newRow("object") << drawn("5") << "objects[1]: This must be an object";
    QTest::newRow("type") << drawn("{\"type\":\"blob\"}")
                          << "objects[1].type: \"blob\" is not a type of objects";
    QTest::newRow("type, number") << drawn("{\"type\":5}")
                                  << "objects[1].type: \"\" is not a type of objects";
    QTest::newRow("no number") << drawn("{\"type\":\"line\"}")
                               << "objects[1].id: This must be a whole number from 1";
    QTest::newRow("number 0") << drawn("{\"type\":\"line\",\"id\":0}")
                              << "objects[1].id: This must be a whole number from 1";
    QTest::newRow("fraction") << drawn("{\"type\":\"line\",\"id\":1.5}")
                              << "objects[1].id: This must be a whole number from 1";
    QTest::newRow("huge number") << drawn("{\"type\":\"line\",\"id\":2147483648}")
                                 << "objects[1].id: This must be a whole number from 1";
    QTest::newRow("number twice") << drawn("{\"type\":\"line\",\"id\":1,\"points\":[[0,0],[1,1]]}")
                                  << "objects[1].id: Another object of this type has the same number";
    QTest::newRow("name") << drawn("{\"type\":\"line\",\"id\":2,\"name\":[]}")
                          << "objects[1].name: This must be a text";
    QTest::newRow("points") << drawn("{\"type\":\"line\",\"id\":2,\"points\":7}")
                            << "objects[1].points: This must be a list";
    QTest::newRow("no points")
        << drawn("{\"type\":\"line\",\"id\":2}")
        << "objects[1].points: An object of type \"line\" cannot have this number of points (0)";
    QTest::newRow("three points")
        << drawn("{\"type\":\"line\",\"id\":2,\"points\":[[0,0],[1,1],[2,2]]}")
        << "objects[1].points: An object of type \"line\" cannot have this number of points (3)";
    const char badPoint[] =
        "objects[1].points[1]: A point must be a list of two numbers between -1e9 and 1e9";
    QTest::newRow("point of one") << drawn("{\"type\":\"line\",\"id\":2,\"points\":[[0,0],[1]]}") << badPoint;
    QTest::newRow("point of text") << drawn("{\"type\":\"line\",\"id\":2,\"points\":[[0,0],[1,\"1\"]]}")
                                   << badPoint;
    QTest::newRow("point far away") << drawn("{\"type\":\"line\",\"id\":2,\"points\":[[0,0],[1,1.1e9]]}")
                                    << badPoint;
    QTest::newRow("hidden")
        << drawn("{\"type\":\"line\",\"id\":2,\"points\":[[0,0],[1,1]],\"hidden\":[\"Length\",\"Mass\"]}")
        << "objects[1].hidden[1]: This must be the name of a value";
    QTest::newRow("hidden, text")
        << drawn("{\"type\":\"line\",\"id\":2,\"points\":[[0,0],[1,1]],\"hidden\":\"Length\"}")
        << "objects[1].hidden: This must be a list";
    QTest::newRow("tables") << file("\"tables\":\"\"") << "tables: This must be a list";
    QTest::newRow("table") << file("\"tables\":[[]]") << "tables[0]: This must be an object";
    QTest::newRow("table without a name")
        << file("\"tables\":[{}]") << "tables[0].name: The type has no name";
    QTest::newRow("value without a name") << file("\"tables\":[{\"name\":\"A\",\"values\":[{}]}]")
                                          << "tables[0].values[0].name: A value must have a name of its own";
    QTest::newRow("value twice")
        << file("\"tables\":[{\"name\":\"A\",\"values\":[{\"name\":\"a\"},{\"name\":\"a\"}]}]")
        << "tables[0].values[1].name: A value must have a name of its own";
    QTest::newRow("unit") << file("\"tables\":[{\"name\":\"A\",\"values\":[{\"name\":\"a\",\"unit\":1}]}]")
                          << "tables[0].values[0].unit: This must be a text";
    QTest::newRow("rows") << table("\"rows\":{}") << "tables[0].rows: This must be a list";
    QTest::newRow("short row") << table("\"rows\":[[1,null]]")
                               << "tables[0].rows[0]: A row must be a list of number, name and values";
    QTest::newRow("row number") << table("\"rows\":[[null,null,[]]]")
                                << "tables[0].rows[0][0]: This must be a whole number from 1";
    QTest::newRow("row order") << table("\"rows\":[[2,null,[]],[2,null,[]]]")
                               << "tables[0].rows[1][0]: The numbers of the rows must rise";
    QTest::newRow("row name") << table("\"rows\":[[1,5,[]]]")
                              << "tables[0].rows[0][1]: This must be a text or null";
    QTest::newRow("cells") << table("\"rows\":[[1,null,\"1\"]]")
                           << "tables[0].rows[0][2]: This must be a list or an object";
    QTest::newRow("cell is a number")
        << table("\"rows\":[[1,null,[1]]]") << "tables[0].rows[0][2][0]: This must be the text of a number";
    QTest::newRow("cell is no number") << table("\"rows\":[[1,null,[null,\"x\"]]]")
                                       << "tables[0].rows[0][2][1]: This must be the text of a number";
    QTest::newRow("cell is too large") << table("\"rows\":[[1,null,[\"1e307\"]]]")
                                       << "tables[0].rows[0][2][0]: This must be the text of a number";
    QTest::newRow("cell without a unit") << table("\"rows\":[[1,null,[[\"1\"]]]]")
                                         << "tables[0].rows[0][2][0]: This must be the text of a number";
    QTest::newRow("cell of another unit")
        << table("\"rows\":[[1,null,[[\"1\",\"g\"]]]]")
        << "tables[0].rows[0][2][0]: The unit does not fit that of the value";
    QTest::newRow("too many cells") << table("\"rows\":[[1,null,[null,null,\"1\"]]]")
                                    << "tables[0].rows[0][2][2]: The table has no such value";
    QTest::newRow("unknown cell") << table("\"rows\":[[1,null,{\"2\":\"1\"}]]")
                                  << "tables[0].rows[0][2][2]: The table has no such value";
    QTest::newRow("cell of no number") << table("\"rows\":[[1,null,{\"a\":\"1\"}]]")
                                       << "tables[0].rows[0][2][a]: The table has no such value";
    QTest::newRow("cell written twice") << table("\"rows\":[[1,null,{\"1\":\"1\",\"01\":\"2\"}]]")
                                        << "tables[0].rows[0][2][01]: The table has no such value";
    QTest::newRow("hidden in a row") << table("\"rows\":[[1,null,[],[\"a\",\"c\"]]]")
                                     << "tables[0].rows[0][3][1]: This must be the name of a value";
}

void ZtSessionTest::refuses()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, fault);
    ZtSession session;
    session.imagePath = text("untouched");
    ZtFault found;
    QVERIFY(!ZtSession::parse(bytes, text("s.json"), &session, &found));
    QCOMPARE(found.text(), text("s.json: ") + fault);
    QCOMPARE(session.imagePath, text("untouched"));
    QVERIFY(session.objects.isEmpty() && session.tables.isEmpty());
}

void ZtSessionTest::refusesDeepNesting_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("lists") << QByteArray(5000, '[') + QByteArray(5000, ']');
    QTest::newRow("lists without an end") << QByteArray(5000, '[');
    QTest::newRow("objects") << QByteArray("{\"a\":").repeated(5000) + "1" + QByteArray(5000, '}');
    QTest::newRow("points") << drawn("{\"type\":\"line\",\"id\":2,\"points\":" + QByteArray(5000, '[') +
                                     QByteArray(5000, ']') + "}");
}

void ZtSessionTest::refusesDeepNesting()
{
    QFETCH(QByteArray, bytes);
    ZtSession session;
    ZtFault fault;
    QVERIFY(!ZtSession::parse(bytes, text("s.json"), &session, &fault));
    QCOMPARE(fault.text(), text("s.json:1: The file is nested too deeply"));
}

void ZtSessionTest::refusesEveryBeginning()
{
    ZtSession whole = withTable("type,length_mm\nA,1\nB,2\n");
    whole.objects.append(
        {ZtDrawnType::find(ZtDrawnType::Line), 1, text("n"), QString(), polygon({{0, 0}, {1, 2}}), {}});
    const QByteArray json = whole.toJson(text("/folder/s.json"));
    for (int size = 0; size < json.size() - 1; ++size) {
        ZtSession session;
        ZtFault fault;
        QVERIFY(!ZtSession::parse(json.left(size), text("s.json"), &session, &fault));
        QVERIFY(!fault.message.isEmpty());
        QVERIFY(session.objects.isEmpty() && session.tables.isEmpty());
    }
}

void ZtSessionTest::refusesFiles()
{
    const QString missing = temporaryPath(text("missing.json"));
    QCOMPARE(loadFault(missing).text(), missing + text(": The file does not exist"));
    const QString folder = QFileInfo(missing).path();
    QCOMPARE(loadFault(folder).text(), folder + text(": This is a folder, not a file"));
    const QString broken =
        write(text("broken.json"), "{\n\"format\": \"statreport-session\",\n\"version\"\n}");
    QVERIFY(loadFault(broken).text().startsWith(broken + text(":4: The file is not valid JSON")));
    const QString notText = write(text("binary.json"), QByteArray("\xFF\xFE\x00\x01", 4));
    QVERIFY(loadFault(notText).message.startsWith(text("The file is not valid JSON")));
}

void ZtSessionTest::refusesUnreadableFiles()
{
    const QString broken = text("/proc/self/mem");
    if (QFile::exists(broken))
        QVERIFY(loadFault(broken).message.startsWith(text("The file cannot be read")));
    const QString path = write(text("closed.json"), file("\"objects\":[]"));
    QFile::setPermissions(path, QFileDevice::Permissions());
    const UnprivilegedUser user;
    QVERIFY(user.isUnprivileged());
    QVERIFY(loadFault(path).message.startsWith(text("The file cannot be read")));
}

void ZtSessionTest::refusesHugeFiles()
{
    // A file with a hole: it takes no room on the disk.
    QFile huge(temporaryPath(text("huge.json")));
    QVERIFY(huge.open(QIODevice::WriteOnly));
    QVERIFY(huge.resize(ZtSession::maximumBytes + 1));
    huge.close();
    QCOMPARE(loadFault(huge.fileName()).message, text("The file is too large for a session"));
}

void ZtSessionTest::savesAllOrNothing()
{
    const QString path = write(text("saved.json"), "old");
    ZtSession session;
    session.calibration = ZtCalibration(2.0);
    ZtFault fault;
    QVERIFY2(session.save(path, &fault), qPrintable(fault.text()));
    ZtSession again;
    QVERIFY(ZtSession::load(path, &again, &fault));
    QVERIFY(again.calibration == session.calibration);

    const QString nowhere = temporaryPath(text("no such folder/s.json"));
    QVERIFY(!session.save(nowhere, &fault));
    QCOMPARE(fault.file, nowhere);
    QVERIFY(fault.message.startsWith(text("The file cannot be written")));
    QVERIFY(!QFile::exists(nowhere));
    QVERIFY(!session.save(QFileInfo(path).path(), &fault));
    QVERIFY(fault.message.startsWith(text("The file cannot be written")));
}

STATREPORT_TEST_MAIN(ZtSessionTest)
#include "ZtSessionTest.moc"
