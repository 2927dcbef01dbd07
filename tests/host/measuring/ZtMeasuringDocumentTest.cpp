// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "host/measuring/Polygon.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectData.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtImportedObjectData.h"
#include "measuring/ZtImportedTable.h"
#include "measuring/ZtKernelImage.h"
#include "measuring/ZtLoadedSession.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtMeasuringManipulator.h"
#include "measuring/ZtStillImageSource.h"
#include "measuring/ZtTableImport.h"

#include <QBuffer>
#include <QDir>
#include <QFile>
#include <QImage>
#include <QSignalSpy>

#include <limits>

namespace {

QString text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

QString tablePath(const char *name)
{
    return StatReportTest::sourcePath(text("tests/host/measuring/tables/") + text(name));
}

QString writePicture(const QString &name, int dotsPerMetre = 1000000)
{
    QImage image(20, 10, QImage::Format_RGB32);
    image.fill(Qt::green);
    image.setDotsPerMeterX(dotsPerMetre);
    image.setDotsPerMeterY(dotsPerMetre);
    const QString path = StatReportTest::temporaryPath(name);
    if (!image.save(path))
        qCritical("cannot save %s", qPrintable(path));
    return path;
}

/// Everything the kernel knows: one line per shown value, or per object without values.
QStringList contents()
{
    const ZtKernelData *kernel = ZtKernelData::getInstance();
    QStringList lines;
    const QMap<int, ZtObjectMap> &all = kernel->objects();
    for (auto type = all.constBegin(); type != all.constEnd(); ++type) {
        const ZtGsManipulator *manipulator = kernel->getGsManipulator(type.key());
        for (auto it = type->constBegin(); it != type->constEnd(); ++it) {
            const QString object = manipulator->objectTypeName(it.key()) + QLatin1Char('/') +
                                   manipulator->getObjectName(it.key());
            const QStringList names = manipulator->valueSet(it.key());
            if (names.isEmpty())
                lines.append(object);
            for (const QString &name : names) {
                int kind = 0;
                const QVariant value = manipulator->value(name, it.value(), kind);
                lines.append(QStringLiteral("%1: %2=%3 [%4, %5]")
                                 .arg(object, name, manipulator->valueText(name, it.value()),
                                      value.toString(), QString::number(kind)));
            }
        }
    }
    return lines;
}

QByteArray readAll(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

} // namespace

class ZtMeasuringDocumentTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void initTestCase();
    void init();
    void livesFromRegistrationToRemoval();
    void addsObjects();
    void refusesObjects();
    void announcesAnObjectThatGivesWay();
    void changesTheCalibration();
    void loadsImages();
    void keepsTheImageWhenLoadingFails();
    void importsTables();
    void importsFromDevices();
    void importsNothingByHalves();
    void tellsUnitsOfTables();
    void clears();
    void savesAndLoads();
    void remembersTheRowsOfTables();
    void largeTablesComeAndGoAtOnce();
    void loadsAMissingImage();
    void changesNothingWhenLoadingFails_data();
    void changesNothingWhenLoadingFails();
    void movesWithItsImage();
    void retranslates();
};

void ZtMeasuringDocumentTest::initTestCase()
{
    // What spies of created objects have to know.
    qRegisterMetaType<const ZtKernelObjectData *>("const ZtKernelObjectData*");
}

void ZtMeasuringDocumentTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
}

void ZtMeasuringDocumentTest::livesFromRegistrationToRemoval()
{
    const ZtKernelData *kernel = ZtKernelData::getInstance();
    {
        ZtMeasuringDocument document;
        for (const ZtDrawnType &type : ZtDrawnType::all()) {
            QVERIFY(kernel->getGsManipulator(type.id));
            QVERIFY(kernel->getDataDescriptor(type.id));
        }
        QVERIFY(kernel->kernelImage() == document.kernelImage());
        QVERIFY(!document.frameSource());
        ZtFault fault;
        QVERIFY(document.importTable(tablePath("wide.csv"), ZtTableImportOptions(), &fault));
        QVERIFY(document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {1, 1}})) == 1);
    }
    QVERIFY(!kernel->kernelImage());
    QVERIFY(kernel->objects().isEmpty());
    QVERIFY(!kernel->getGsManipulator(ZtDrawnType::Line));
    QVERIFY(!kernel->getGsManipulator(ZtTableImport::firstTypeId));
}

void ZtMeasuringDocumentTest::addsObjects()
{
    ZtMeasuringDocument document;
    QSignalSpy created(ZtSignalCenter::getInstance(),
                       SIGNAL(signalObjectCreated(int, int, const ZtKernelObjectData *)));
    QCOMPARE(document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}})), 1);
    QCOMPARE(document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {6, 8}}), text("long")), 2);
    QCOMPARE(document.addObject(ZtDrawnType::TextNote, polygon({{0, 0}}), QString(), text("hello"), 9), 9);
    QCOMPARE(created.size(), 3);
    QCOMPARE(contents(),
             (QStringList{text("Line/Line 1: Length=5.0 px [5, 0]"),
                          text("Line/long: Length=10.0 px [10, 0]"), text("Text note/Text note 9")}));
}

void ZtMeasuringDocumentTest::refusesObjects()
{
    ZtMeasuringDocument document;
    const double nan = std::numeric_limits<double>::quiet_NaN();
    QCOMPARE(document.addObject(1, polygon({{0, 0}, {1, 1}})), 0);
    QCOMPARE(document.addObject(ZtDrawnType::Line, polygon({{0, 0}})), 0);
    QCOMPARE(document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {nan, 0}})), 0);
    QCOMPARE(document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {2e9, 0}})), 0);
    QCOMPARE(document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {1, 1}}), QString(), QString(), -1), 0);
    QVERIFY(ZtKernelData::getInstance()->objects().isEmpty());
}

void ZtMeasuringDocumentTest::announcesAnObjectThatGivesWay()
{
    ZtMeasuringDocument document;
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}}), text("old"));
    QSignalSpy removed(ZtSignalCenter::getInstance(), SIGNAL(signalObjectRemoved(int, int)));
    QSignalSpy created(ZtSignalCenter::getInstance(),
                       SIGNAL(signalObjectCreated(int, int, const ZtKernelObjectData *)));
    QCOMPARE(document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {6, 8}}), QString(), QString(), 1), 1);
    QCOMPARE(removed.size(), 1);
    QCOMPARE(created.size(), 1);
    QCOMPARE(contents(), QStringList(text("Line/Line 1: Length=10.0 px [10, 0]")));
}

void ZtMeasuringDocumentTest::changesTheCalibration()
{
    ZtMeasuringDocument document;
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}}));
    QSignalSpy units(ZtSignalCenter::getInstance(), SIGNAL(signalLengthUnitChanged()));
    QSignalSpy calibrations(&document, SIGNAL(signalCalibrationChanged()));
    document.setCalibration(ZtCalibration(2.0));
    document.setCalibration(ZtCalibration(2.0));
    QCOMPARE(units.size(), 1);
    QCOMPARE(calibrations.size(), 1);
    QCOMPARE(contents(), QStringList(text("Line/Line 1: Length=10.000 μm [10, 1]")));
    // Who calibrated changes no value.
    ZtCalibration renamed(2.0);
    renamed.setAuthor(text("somebody"));
    document.setCalibration(renamed);
    QCOMPARE(units.size(), 1);
    QCOMPARE(calibrations.size(), 2);
    QCOMPARE(document.calibration().author(), text("somebody"));
    document.setCalibration(ZtCalibration(2.0, 3.0));
    QCOMPARE(units.size(), 2);
}

void ZtMeasuringDocumentTest::loadsImages()
{
    ZtMeasuringDocument document;
    QSignalSpy changed(&document, SIGNAL(signalImageChanged()));
    const QString path = writePicture(text("loaded.png"));
    ZtFault fault;
    QVERIFY2(document.loadImage(path, &fault), qPrintable(fault.text()));
    QCOMPARE(changed.size(), 1);
    QCOMPARE(document.imagePath(), path);
    QCOMPARE(document.offeredCalibration().micrometresPerPixel(), 1.0);
    QVERIFY(!document.calibration().isCalibrated());
    QCOMPARE(document.frameSource()->frame().size(), QSize(20, 10));
    QVERIFY(document.kernelImage()->source() == document.frameSource());
    document.setFrameSource(nullptr);
    QCOMPARE(changed.size(), 2);
    QCOMPARE(document.imagePath(), QString());
    QVERIFY(!document.offeredCalibration().isCalibrated());
    QVERIFY(!document.kernelImage()->source());
}

void ZtMeasuringDocumentTest::keepsTheImageWhenLoadingFails()
{
    ZtMeasuringDocument document;
    ZtFault fault;
    const QString path = writePicture(text("kept.png"));
    QVERIFY(document.loadImage(path, &fault));
    QVERIFY(!document.loadImage(temporaryPath(text("missing.png")), &fault));
    QVERIFY(!fault.isNull());
    QCOMPARE(document.imagePath(), path);
    QVERIFY(document.frameSource());
}

void ZtMeasuringDocumentTest::importsTables()
{
    ZtMeasuringDocument document;
    ZtFault fault;
    QStringList notes;
    QVERIFY2(document.importTable(tablePath("wide.csv"), ZtTableImportOptions(), &fault, &notes),
             qPrintable(fault.text()));
    QCOMPARE(notes.size(), 1);
    QCOMPARE(document.importedTypes(),
             (QVector<int>{ZtTableImport::firstTypeId, ZtTableImport::firstTypeId + 1}));
    QVERIFY(document.importTable(tablePath("results.csv"), ZtTableImportOptions(), &fault));
    QCOMPARE(document.importedTypes().size(), 3);
    QCOMPARE(contents().first(), text("Tern/Tern 1: wing length=39.1 mm [39100, 1]"));
}

void ZtMeasuringDocumentTest::importsFromDevices()
{
    ZtMeasuringDocument document;
    QByteArray bytes = "size [mm]\n1\n";
    QBuffer buffer(&bytes);
    QVERIFY(buffer.open(QIODevice::ReadOnly));
    ZtFault fault;
    QVERIFY(document.importTable(&buffer, text("-"), ZtTableImportOptions(), &fault));
    QCOMPARE(contents(), QStringList(text("Object/Object 1: size=1 mm [1000, 1]")));
}

void ZtMeasuringDocumentTest::importsNothingByHalves()
{
    ZtMeasuringDocument document;
    QByteArray bytes = "type,size\nA,1\nB,2\nC,x\nC,3\n";
    QBuffer buffer(&bytes);
    QVERIFY(buffer.open(QIODevice::ReadOnly));
    ZtFault fault;
    QStringList notes = {text("untouched")};
    QVERIFY(!document.importTable(&buffer, text("t.csv"), ZtTableImportOptions(), &fault, &notes));
    QCOMPARE(fault.text(), text("t.csv:4:2: \"x\" is not a number"));
    QCOMPARE(notes, QStringList(text("untouched")));
    QVERIFY(document.importedTypes().isEmpty());
    QVERIFY(ZtKernelData::getInstance()->objects().isEmpty());
    QVERIFY(!ZtKernelData::getInstance()->getGsManipulator(ZtTableImport::firstTypeId));
}

void ZtMeasuringDocumentTest::tellsUnitsOfTables()
{
    ZtMeasuringDocument document;
    ZtFault fault;
    QVERIFY(document.importTable(tablePath("wide.csv"), ZtTableImportOptions(), &fault));
    const auto length = document.importedUnit(text("Gull"), text("wing length"));
    QVERIFY(length);
    QCOMPARE(length->text(), text("mm"));
    QCOMPARE(length->factor(), 1000.0);
    QCOMPARE(document.importedUnit(QString(), text("body mass"))->text(), text("g"));
    QCOMPARE(document.importedUnit(QString(), text("body mass"))->factor(), 1.0);
    QVERIFY(document.importedUnit(text("Tern"), text("year"))->isEmpty());
    QVERIFY(!document.importedUnit(text("Tern"), text("weight")));
    QVERIFY(!document.importedUnit(text("Swan"), text("year")));
    QVERIFY(!document.importedUnit(text("Line"), text("Length")));
}

void ZtMeasuringDocumentTest::clears()
{
    ZtMeasuringDocument document;
    ZtFault fault;
    QVERIFY(document.loadImage(writePicture(text("cleared.png")), &fault));
    QVERIFY(document.importTable(tablePath("wide.csv"), ZtTableImportOptions(), &fault));
    document.setCalibration(ZtCalibration(2.0));
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}}), text("named"));
    QSignalSpy removed(ZtSignalCenter::getInstance(), SIGNAL(signalObjectRemoved(int, int)));
    document.clear();
    QCOMPARE(removed.size(), 3);
    QVERIFY(ZtKernelData::getInstance()->objects().isEmpty());
    QVERIFY(!ZtKernelData::getInstance()->getGsManipulator(ZtTableImport::firstTypeId));
    QVERIFY(ZtKernelData::getInstance()->getGsManipulator(ZtDrawnType::Line));
    QVERIFY(document.importedTypes().isEmpty());
    QVERIFY(!document.calibration().isCalibrated());
    QVERIFY(!document.frameSource());
    QCOMPARE(document.imagePath(), QString());
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}}));
    QCOMPARE(contents(), QStringList(text("Line/Line 1: Length=5.0 px [5, 0]")));
}

void ZtMeasuringDocumentTest::savesAndLoads()
{
    const QString path = temporaryPath(text("whole.json"));
    ZtFault fault;
    QStringList before;
    {
        ZtMeasuringDocument document;
        QVERIFY(document.loadImage(writePicture(text("whole.png")), &fault));
        document.setCalibration(ZtCalibration(0.5));
        for (const ZtDrawnType &type : ZtDrawnType::all()) {
            const QPolygonF points = polygon({{10, 1}, {4, 8}, {1, 0.5}});
            QVERIFY(document.addObject(type.id, points.mid(0, qMin(3, type.maximumPoints)), text("name"),
                                       text("note")));
        }
        document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {1, 1}}), QString(), QString(), 5);
        QVERIFY(document.importTable(tablePath("wide.csv"), ZtTableImportOptions(), &fault));
        QVERIFY(document.importTable(tablePath("tidy.csv"), ZtTableImportOptions(), &fault));
        QVERIFY(document.importTable(tablePath("scripts.tsv"), ZtTableImportOptions(), &fault));
        ZtKernelData *kernel = ZtKernelData::getInstance();
        auto *rectangles =
            static_cast<ZtMeasuringManipulator *>(kernel->getGsManipulator(ZtDrawnType::Rectangle));
        rectangles->setValueShown(
            static_cast<ZtMeasuredObjectData *>(kernel->object(ZtDrawnType::Rectangle, 1)), 2, false);
        const int imported = document.importedTypes().first();
        kernel->getGsManipulator(imported)->setObjectName(2, text("renamed"));
        kernel->removeObject(imported, 1);
        QVERIFY2(document.saveSession(path, &fault), qPrintable(fault.text()));
        before = contents();
    }
    ZtMeasuringDocument document;
    document.addObject(ZtDrawnType::Circle, polygon({{0, 0}, {1, 1}}), QString(), QString(), 77);
    QSignalSpy created(ZtSignalCenter::getInstance(),
                       SIGNAL(signalObjectCreated(int, int, const ZtKernelObjectData *)));
    QVERIFY2(document.loadSession(path, &fault), qPrintable(fault.text()));
    QCOMPARE(contents(), before);
    QCOMPARE(created.size(), ZtKernelData::getInstance()->objects().size());
    QCOMPARE(document.calibration().micrometresPerPixel(), 0.5);
    QCOMPARE(document.imagePath(), temporaryPath(text("whole.png")));
    QVERIFY(document.frameSource());
    const QString again = temporaryPath(text("again.json"));
    QVERIFY(document.saveSession(again, &fault));
    QCOMPARE(readAll(again), readAll(path));
}

void ZtMeasuringDocumentTest::remembersTheRowsOfTables()
{
    ZtMeasuringDocument document;
    ZtFault fault;
    QByteArray bytes = "size\n1\n2\n3\n4\n";
    QBuffer buffer(&bytes);
    QVERIFY(buffer.open(QIODevice::ReadOnly));
    QVERIFY(document.importTable(&buffer, text("t.csv"), ZtTableImportOptions(), &fault));
    const int type = document.importedTypes().first();
    const auto rows = [&document]() {
        QStringList result;
        const ZtSession session = document.toSession();
        for (const ZtSessionRow &row : session.tables.first().rows)
            result.append(QStringLiteral("%1/%2/%3/%4")
                              .arg(row.id)
                              .arg(row.row)
                              .arg(row.name)
                              .arg(row.hiddenValues.size()));
        return result;
    };
    QCOMPARE(rows(), (QStringList{text("1/0//0"), text("2/1//0"), text("3/2//0"), text("4/3//0")}));
    ZtKernelData *const kernel = ZtKernelData::getInstance();
    auto *const manipulator = static_cast<ZtMeasuringManipulator *>(kernel->getGsManipulator(type));
    // One that was taken before stays as it was.
    const ZtSession before = document.toSession();
    manipulator->setObjectName(2, text("nut"));
    manipulator->setValueShown(static_cast<ZtMeasuredObjectData *>(kernel->object(type, 3)), 0, false);
    kernel->notifyObjectChanged(type, 2);
    kernel->notifyObjectChanged(type, 3);
    QCOMPARE(rows(), (QStringList{text("1/0//0"), text("2/1/nut/0"), text("3/2//1"), text("4/3//0")}));
    QCOMPARE(before.tables.first().rows.at(1).name, QString());
    kernel->removeObject(type, 1);
    QCOMPARE(rows(), (QStringList{text("2/1/nut/0"), text("3/2//1"), text("4/3//0")}));
    kernel->addObject(type, std::make_unique<ZtImportedObjectData>(0), 1);
    QCOMPARE(rows(), (QStringList{text("1/0//0"), text("2/1/nut/0"), text("3/2//1"), text("4/3//0")}));
    kernel->removeObject(type, 4);
    kernel->removeObject(type, 3);
    kernel->removeObject(type, 2);
    kernel->removeObject(type, 1);
    QCOMPARE(rows(), QStringList());
    document.clear();
    QVERIFY(document.toSession().tables.isEmpty());
}

void ZtMeasuringDocumentTest::largeTablesComeAndGoAtOnce()
{
    constexpr int rows = 300000;
    ZtMeasuringDocument document;
    ZtImportedTable table;
    ZtFault fault;
    QVERIFY(ZtTableImport::parse("size\n" + QByteArray("1\n").repeated(rows), text("t.csv"),
                                 ZtTableImportOptions(), &table, &fault));
    std::vector<ZtReadyObjects> ready = ZtReadyObjects::ofTable(table);
    ZtSession session;
    session.tables.append(ZtSessionTable::ofType(table.types.first()));
    ZtLoadedSession loaded;
    QVERIFY(loaded.parse(session.toJson(text("/s.json")), text("/s.json"), &fault));
    QElapsedTimer clock;
    const auto isQuick = [&clock]() { return clock.restart() < 100; };
    clock.start();
    document.addTable(&ready);
    QVERIFY(isQuick());
    const ZtSession saved = document.toSession();
    QVERIFY(isQuick());
    document.setSession(&loaded);
    QVERIFY(isQuick());
    QCOMPARE(saved.tables.first().rows.size(), rows);
    QCOMPARE(document.importedTypes().size(), 1);
    QCOMPARE(ZtKernelData::getInstance()->objects().value(document.importedTypes().first()).size(), rows);
    clock.restart();
    document.clear();
    QVERIFY(isQuick());
    QVERIFY(ZtKernelData::getInstance()->objects().isEmpty());
}

void ZtMeasuringDocumentTest::loadsAMissingImage()
{
    const QString path = temporaryPath(text("imageless.json"));
    const QString picture = writePicture(text("gone.png"));
    ZtMeasuringDocument document;
    ZtFault fault;
    QVERIFY(document.loadImage(picture, &fault));
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}}));
    QVERIFY(document.saveSession(path, &fault));
    QVERIFY(QFile::remove(picture));
    document.clear();
    QVERIFY(!document.loadSession(path, &fault));
    QCOMPARE(fault.text(), QStringLiteral("%1: image: %2: The picture does not exist").arg(path, picture));
    QVERIFY(ZtKernelData::getInstance()->objects().isEmpty());
    QVERIFY(document.loadSession(path, &fault, ZtMeasuringDocument::MissingImage::IsIgnored));
    QCOMPARE(document.imagePath(), picture);
    QVERIFY(!document.frameSource());
    QCOMPARE(contents().size(), 1);
}

void ZtMeasuringDocumentTest::changesNothingWhenLoadingFails_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("cut off") << QByteArray("{\"format\":\"statreport-session\",\"version\":1,\"objects\":[");
    QTest::newRow("fault at the end") << QByteArray(
        "{\"format\":\"statreport-session\",\"version\":1,\"micrometresPerPixel\":7,"
        "\"objects\":[{\"type\":\"line\",\"id\":1,\"points\":[[0,0],[1,1]]},{\"type\":\"line\"}]}");
    QTest::newRow("image") << QByteArray(
        "{\"format\":\"statreport-session\",\"version\":1,\"image\":\"none.png\"}");
    QTest::newRow("nested") << QByteArray(5000, '[');
    QTest::newRow("empty") << QByteArray();
}

void ZtMeasuringDocumentTest::changesNothingWhenLoadingFails()
{
    QFETCH(QByteArray, bytes);
    const QString path = temporaryPath(text("bad.json"));
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size());
    file.close();
    ZtMeasuringDocument document;
    ZtFault fault;
    const QString picture = writePicture(text("unchanged.png"));
    QVERIFY(document.loadImage(picture, &fault));
    QVERIFY(document.importTable(tablePath("tidy.csv"), ZtTableImportOptions(), &fault));
    document.setCalibration(ZtCalibration(3.0));
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}}), text("named"));
    const QStringList before = contents();
    QSignalSpy removed(ZtSignalCenter::getInstance(), SIGNAL(signalObjectRemoved(int, int)));
    QSignalSpy created(ZtSignalCenter::getInstance(),
                       SIGNAL(signalObjectCreated(int, int, const ZtKernelObjectData *)));
    QVERIFY(!document.loadSession(path, &fault));
    QCOMPARE(fault.file, path);
    QVERIFY(!fault.message.isEmpty());
    QCOMPARE(contents(), before);
    QCOMPARE(document.imagePath(), picture);
    QCOMPARE(document.calibration().micrometresPerPixel(), 3.0);
    QCOMPARE(removed.size() + created.size(), 0);
}

void ZtMeasuringDocumentTest::movesWithItsImage()
{
    const QDir folder(QFileInfo(temporaryPath(text("x"))).path());
    QVERIFY(folder.mkpath(text("from")));
    const QString session = folder.filePath(text("from/s.json"));
    ZtFault fault;
    {
        ZtMeasuringDocument document;
        QVERIFY(document.loadImage(writePicture(text("from/p.png")), &fault));
        QVERIFY(document.saveSession(session, &fault));
    }
    QVERIFY(QDir(folder).rename(text("from"), text("to")));
    ZtMeasuringDocument document;
    QVERIFY2(document.loadSession(folder.filePath(text("to/s.json")), &fault), qPrintable(fault.text()));
    QCOMPARE(document.imagePath(), folder.filePath(text("to/p.png")));
}

void ZtMeasuringDocumentTest::retranslates()
{
    ZtMeasuringDocument document;
    document.addObject(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}}));
    document.retranslate();
    QCOMPARE(contents(), QStringList(text("Line/Line 1: Length=5.0 px [5, 0]")));
}

STATREPORT_TEST_MAIN(ZtMeasuringDocumentTest)
#include "ZtMeasuringDocumentTest.moc"
