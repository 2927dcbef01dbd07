// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "host/measuring/Polygon.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectDataDescr.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtCalibration.h"
#include "measuring/ZtDrawnManipulator.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnObjectPainter.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtUnitSettings.h"

#include <QImage>
#include <QPainter>

#include <algorithm>
#include <cmath>
#include <functional>
#include <limits>
#include <memory>

Q_DECLARE_METATYPE(QPolygonF)

namespace {

const double pi = std::acos(-1.0);
const double half = std::sqrt(0.5);

/// A manipulator with a calibration of its own.
struct Measured
{
    explicit Measured(int type, double micrometresPerPixel = 0.0)
        : Measured(type, ZtCalibration(micrometresPerPixel))
    {}

    Measured(int type, const ZtCalibration &made)
        : calibration(std::make_shared<ZtCalibration>(made))
        , manipulator(*ZtDrawnType::find(type), calibration)
    {}

    std::shared_ptr<ZtCalibration> calibration;
    ZtDrawnManipulator manipulator;
};

QPolygonF samplePoints(const ZtDrawnType &type)
{
    const QPolygonF all = polygon({{30, 60}, {90, 60}, {60, 90}});
    return all.mid(0, qMin(type.maximumPoints, all.size()));
}

/// Draws an object and tells how many pixels are much brighter or darker than the plain picture.
struct Drawing
{
    Drawing(int type, const QPolygonF &points, const QColor &background, double zoom = 1.0,
            const QString &text = QString())
    {
        QImage image(120, 120, QImage::Format_RGB32);
        image.fill(background);
        QPainter painter(&image);
        painter.scale(zoom, zoom);
        const QTransform before = painter.worldTransform();
        const Measured measured(type);
        const ZtDrawnObjectData object(points, text);
        measured.manipulator.draw(&painter, 1, &object);
        leavesPainterAlone = painter.worldTransform() == before && painter.pen() == QPen();
        painter.end();
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x) {
                const int grey = qGray(image.pixel(x, y));
                bright += grey > 150 ? 1 : 0;
                dark += grey < 100 ? 1 : 0;
            }
        }
    }

    int bright = 0;
    int dark = 0;
    bool leavesPainterAlone = false;
};

} // namespace

namespace {

constexpr int counterType = ZtDrawnType::Counter;

QPolygonF places(int count)
{
    return QPolygonF(QVector<QPointF>(count, QPointF(1, 1)));
}

/// Counters of the kernel, measured by the type's manipulator.
struct Counters
{
    Counters()
    {
        const ZtDrawnType &type = *ZtDrawnType::find(counterType);
        kernel->registerType(counterType,
                             std::make_unique<ZtDrawnManipulator>(type, std::make_shared<ZtCalibration>()),
                             std::make_unique<ZtKernelObjectDataDescr>(counterType, QLatin1String(type.key)));
        add(1);
        add(3);
    }
    ~Counters() { kernel->unregisterType(counterType); }

    int add(int count) const
    {
        return kernel->addObject(counterType, std::make_unique<ZtDrawnObjectData>(places(count)));
    }
    void set(int id, int count) const
    {
        static_cast<ZtDrawnObjectData *>(kernel->object(counterType, id))->setPoints(places(count));
        kernel->notifyObjectChanged(counterType, id);
    }
    double share(int id) const
    {
        int kind = 0;
        return kernel->getGsManipulator(counterType)
            ->value(QStringLiteral("Share"), kernel->object(counterType, id), kind)
            .toDouble();
    }

    ZtKernelData *kernel = ZtKernelData::getInstance();
};

using Change = std::function<void(const Counters &)>;

/// Asks for the share of the first counter as soon as it hears of a change.
class EagerReader : public QObject
{
    Q_OBJECT
public:
    EagerReader()
    {
        const ZtSignalCenter *const center = ZtSignalCenter::getInstance();
        connect(center, SIGNAL(signalObjectCreated(int,int,const ZtKernelObjectData*)), this,
                               SLOT(slotRead()));
        connect(center, SIGNAL(signalObjectChanged(int,int,const ZtKernelObjectData*)), this,
                               SLOT(slotRead()));
        connect(center, SIGNAL(signalObjectRemoved(int,int)), this, SLOT(slotRead()));
    }

    const Counters *counters = nullptr;
    QVector<double> read;

private slots:
    void slotRead()
    {
        if (counters)
            read.append(counters->share(1));
    }
};

} // namespace

Q_DECLARE_METATYPE(Change)

class ZtDrawnManipulatorTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void hasTheTypes_data();
    void hasTheTypes();
    void measures_data();
    void measures();
    void followsTheCalibration();
    void measuresInReality_data();
    void measuresInReality();
    void drawsCirclesOfReality();
    void outlineIsThatOfTheRegisteredManipulator();
    void labelsScaleBarsInReality();
    void readsInPixelsWithoutCalibration();
    void countsShares();
    void sharesFollowEveryChange_data();
    void sharesFollowEveryChange();
    void sharesAreRightFirst();
    void refusesPoints_data();
    void refusesPoints();
    void knowsNoOtherValues();
    void drawsVisibly_data();
    void drawsVisibly();
    void drawsNothingItCannotMeasure();
    void keepsLabelsOnThePicture();
    void pageIsInTheUnitOfThePainter();
    void namesObjects();
};

void ZtDrawnManipulatorTest::init()
{
    StatReportTest::init();
    ZtUnitSettings::getInstance();
    ZtAppSettings::getInstance()->setStoragePath(QString());
}

void ZtDrawnManipulatorTest::hasTheTypes_data()
{
    QTest::addColumn<int>("id");
    QTest::addColumn<QString>("name");
    QTest::addColumn<QStringList>("values");
    const auto list = [](const char *names) { return QString::fromLatin1(names).split(QLatin1Char(',')); };
    QTest::newRow("rectangle") << 66651 << "Rectangle" << list("Width,Height,Area");
    QTest::newRow("line") << 66653 << "Line" << list("Length");
    QTest::newRow("arc") << 66655 << "Arc" << list("Angle,Arc length");
    QTest::newRow("polygon") << 66656 << "Polygon" << list("Area,Perimeter");
    QTest::newRow("polyline") << 66658 << "Polyline" << list("Length");
    QTest::newRow("parallel distance") << 66659 << "Parallel distance" << list("Distance");
    QTest::newRow("counter") << 66741 << "Counter" << list("Count,Share");
    QTest::newRow("circle") << 66755 << "Circle" << list("Diameter,Area");
    QTest::newRow("text note") << int(ZtDrawnType::TextNote) << "Text note" << QStringList();
    QTest::newRow("scale bar") << int(ZtDrawnType::ScaleBar) << "Scale bar" << QStringList();
}

void ZtDrawnManipulatorTest::hasTheTypes()
{
    QFETCH(int, id);
    QFETCH(QString, name);
    QFETCH(QStringList, values);
    const ZtDrawnType *type = ZtDrawnType::find(id);
    QVERIFY(type);
    QVERIFY(ZtDrawnType::findKey(QLatin1String(type->key)) == type);
    QCOMPARE(ZtDrawnType::all().size(), std::size_t(10));
    const Measured measured(id);
    QCOMPARE(measured.manipulator.objectTypeId(), id);
    QCOMPARE(measured.manipulator.objectTypeName(1), name);
    QCOMPARE(measured.manipulator.getValueNames(), values);
    QCOMPARE(measured.manipulator.typeFlags(0), values.isEmpty() ? 0 : 0x200);
}

void ZtDrawnManipulatorTest::measures_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QPolygonF>("points");
    QTest::addColumn<QString>("value");
    QTest::addColumn<double>("expected"); // with 2 micrometres per pixel
    QTest::addColumn<int>("kind");
    QTest::addColumn<QString>("text");
    const int length = ZtGsManipulator::Length;
    const int area = ZtGsManipulator::Area;
    const int angle = ZtGsManipulator::Angle;
    const QString um = QStringLiteral(" \u03BCm");
    const QString um2 = QStringLiteral(" \u03BCm\u00B2");
    const QString degree = QStringLiteral(" \u00B0");
    const QPolygonF corners = polygon({{10, 20}, {40, 5}});
    QTest::newRow("rectangle, width") << 66651 << corners << "Width" << 60.0 << length << "60.000" + um;
    QTest::newRow("rectangle, height") << 66651 << corners << "Height" << 30.0 << length << "30.000" + um;
    QTest::newRow("rectangle, area") << 66651 << corners << "Area" << 1800.0 << area << "1800.0" + um2;
    QTest::newRow("rectangle of no size")
        << 66651 << polygon({{1, 1}, {1, 1}}) << "Area" << 0.0 << area << QStringLiteral("0.000 nm\u00B2");
    QTest::newRow("rectangle without height")
        << 66651 << polygon({{1, 1}, {5, 1}}) << "Width" << 8.0 << length << "8.000" + um;
    QTest::newRow("line") << 66653 << polygon({{0, 0}, {3, 4}}) << "Length" << 10.0 << length
                          << "10.000" + um;
    QTest::newRow("line of no length")
        << 66653 << polygon({{3, 4}, {3, 4}}) << "Length" << 0.0 << length << "0.000 nm";
    QTest::newRow("arc, angle") << 66655 << polygon({{100, 0}, {100 * half, 100 * half}, {0, 100}}) << "Angle"
                                << 90.0 << angle << "90.000" + degree;
    QTest::newRow("arc, length") << 66655 << polygon({{100, 0}, {100 * half, 100 * half}, {0, 100}})
                                 << "Arc length" << 100.0 * pi << length << "314.16" + um;
    QTest::newRow("arc, the long way") << 66655 << polygon({{100, 0}, {-100 * half, -100 * half}, {0, 100}})
                                       << "Angle" << 270.0 << angle << "270.00" + degree;
    QTest::newRow("straight arc, angle")
        << 66655 << polygon({{0, 0}, {1, 1}, {3, 3}}) << "Angle" << 0.0 << angle << "0.000" + degree;
    QTest::newRow("straight arc, length")
        << 66655 << polygon({{0, 0}, {3, 4}, {6, 8}}) << "Arc length" << 20.0 << length << "20.000" + um;
    const QPolygonF triangle = polygon({{0, 0}, {3, 0}, {3, 4}});
    QTest::newRow("polygon, area") << 66656 << triangle << "Area" << 24.0 << area << "24.000" + um2;
    QTest::newRow("polygon, perimeter")
        << 66656 << triangle << "Perimeter" << 24.0 << length << "24.000" + um;
    QTest::newRow("flat polygon") << 66656 << polygon({{0, 0}, {3, 3}, {6, 6}}) << "Area" << 0.0 << area
                                  << QStringLiteral("0.000 nm\u00B2");
    QTest::newRow("polyline") << 66658 << triangle << "Length" << 14.0 << length << "14.000" + um;
    QTest::newRow("parallel distance")
        << 66659 << polygon({{0, 0}, {4, 3}, {0, 5}}) << "Distance" << 8.0 << length << "8.000" + um;
    QTest::newRow("parallel distance, base of one point")
        << 66659 << polygon({{0, 0}, {0, 0}, {3, 4}}) << "Distance" << 10.0 << length << "10.000" + um;
    QTest::newRow("counter") << 66741 << polygon({{0, 0}, {1, 1}, {1, 1}}) << "Count" << 3.0
                             << int(ZtGsManipulator::Count) << "3 pcs";
    QTest::newRow("empty counter") << 66741 << QPolygonF() << "Count" << 0.0 << int(ZtGsManipulator::Count)
                                   << "0 pcs";
    QTest::newRow("empty counter, share")
        << 66741 << QPolygonF() << "Share" << 0.0 << int(ZtGsManipulator::Percentage) << "0.000 %";
    QTest::newRow("circle, diameter")
        << 66755 << polygon({{5, 5}, {8, 9}}) << "Diameter" << 20.0 << length << "20.000" + um;
    QTest::newRow("circle, area") << 66755 << polygon({{5, 5}, {8, 9}}) << "Area" << 100.0 * pi << area
                                  << "314.16" + um2;
    QTest::newRow("circle of no size")
        << 66755 << polygon({{5, 5}, {5, 5}}) << "Area" << 0.0 << area << QStringLiteral("0.000 nm\u00B2");
}

void ZtDrawnManipulatorTest::measures()
{
    QFETCH(int, type);
    QFETCH(QPolygonF, points);
    QFETCH(QString, value);
    QFETCH(double, expected);
    QFETCH(int, kind);
    const Measured measured(type, 2.0);
    const ZtDrawnObjectData object(points);
    int measuredKind = -1;
    const QVariant result = measured.manipulator.value(value, &object, measuredKind);
    QCOMPARE(measuredKind, kind);
    QCOMPARE(int(result.type()), int(kind == ZtGsManipulator::Count ? QVariant::Int : QVariant::Double));
    QVERIFY2(std::abs(result.toDouble() - expected) <= 1e-9 * qMax(1.0, expected),
             qPrintable(result.toString()));
    QTEST(measured.manipulator.valueText(value, &object), "text");
    std::vector<ZtMeasuredValue> all;
    measured.manipulator.appendShownValues(&object, &all);
    const int position = measured.manipulator.position(value);
    QVERIFY(std::any_of(all.begin(), all.end(), [&](const ZtMeasuredValue &one) {
        return one.position == position && one.kind == kind && one.value == result.toDouble();
    }));
}

void ZtDrawnManipulatorTest::followsTheCalibration()
{
    const Measured measured(ZtDrawnType::Line, 1.0);
    const ZtDrawnObjectData object(polygon({{0, 0}, {100, 0}}));
    QCOMPARE(measured.manipulator.valueText(QStringLiteral("Length"), &object),
             QStringLiteral("100.00 \u03BCm"));
    *measured.calibration = ZtCalibration(25.0);
    QCOMPARE(measured.manipulator.valueText(QStringLiteral("Length"), &object), QStringLiteral("2.500 mm"));
}

// Pixels of 2 by 4 micrometres: 10 pixels across are as long as 5 down.
void ZtDrawnManipulatorTest::measuresInReality_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QPolygonF>("points");
    QTest::addColumn<QString>("value");
    QTest::addColumn<double>("expected");
    const QPolygonF corners = polygon({{10, 20}, {40, 5}});
    QTest::newRow("rectangle, width") << 66651 << corners << "Width" << 60.0;
    QTest::newRow("rectangle, height") << 66651 << corners << "Height" << 60.0;
    QTest::newRow("rectangle, area") << 66651 << corners << "Area" << 3600.0;
    QTest::newRow("line across") << 66653 << polygon({{0, 0}, {10, 0}}) << "Length" << 20.0;
    QTest::newRow("line down") << 66653 << polygon({{0, 0}, {0, 10}}) << "Length" << 40.0;
    QTest::newRow("slanting line") << 66653 << polygon({{0, 0}, {6, 4}}) << "Length" << 20.0;
    const QPolygonF quarter = polygon({{100, 0}, {100 * half, 50 * half}, {0, 50}});
    QTest::newRow("arc, angle") << 66655 << quarter << "Angle" << 90.0;
    QTest::newRow("arc, length") << 66655 << quarter << "Arc length" << 100.0 * pi;
    const QPolygonF triangle = polygon({{0, 0}, {3, 0}, {3, 2}});
    QTest::newRow("polygon, area") << 66656 << triangle << "Area" << 24.0;
    QTest::newRow("polygon, perimeter") << 66656 << triangle << "Perimeter" << 24.0;
    QTest::newRow("polyline") << 66658 << triangle << "Length" << 14.0;
    QTest::newRow("parallel distance") << 66659 << polygon({{0, 0}, {4, 1.5}, {0, 2.5}}) << "Distance" << 8.0;
    QTest::newRow("circle, diameter by a point beside")
        << 66755 << polygon({{5, 5}, {15, 5}}) << "Diameter" << 40.0;
    QTest::newRow("circle, diameter by a point below")
        << 66755 << polygon({{5, 5}, {5, 10}}) << "Diameter" << 40.0;
    QTest::newRow("circle, area") << 66755 << polygon({{5, 5}, {8, 7}}) << "Area" << 100.0 * pi;
    QTest::newRow("counter") << 66741 << polygon({{0, 0}, {1, 1}, {1, 1}}) << "Count" << 3.0;
}

void ZtDrawnManipulatorTest::measuresInReality()
{
    QFETCH(int, type);
    QFETCH(QPolygonF, points);
    QFETCH(QString, value);
    QFETCH(double, expected);
    const Measured measured(type, ZtCalibration(2.0, 4.0));
    const ZtDrawnObjectData object(points);
    int kind = -1;
    const double result = measured.manipulator.value(value, &object, kind).toDouble();
    QVERIFY2(std::abs(result - expected) <= 1e-9 * expected, qPrintable(QString::number(result)));
}

// A circle in reality is an ellipse on an image of oblong pixels, and an arc is part of one.
void ZtDrawnManipulatorTest::drawsCirclesOfReality()
{
    const Measured circle(ZtDrawnType::Circle, ZtCalibration(2.0, 4.0));
    const QRectF ellipse = circle.manipulator.outline(polygon({{50, 50}, {60, 50}})).boundingRect();
    QCOMPARE(ellipse, QRectF(40, 45, 20, 10));
    const QRectF uncalibrated =
        Measured(ZtDrawnType::Circle).manipulator.outline(polygon({{50, 50}, {60, 50}})).boundingRect();
    QCOMPARE(uncalibrated, QRectF(40, 40, 20, 20));

    const Measured arc(ZtDrawnType::Arc, ZtCalibration(2.0, 4.0));
    const QPainterPath way = arc.manipulator.outline(polygon({{100, 0}, {100 * half, 50 * half}, {0, 50}}));
    for (const double share : {0.1, 0.3, 0.5, 0.8}) {
        const QPointF point = way.pointAtPercent(share);
        QVERIFY(std::abs(std::hypot(point.x(), 2.0 * point.y()) - 100.0) < 0.1);
    }

    // The perpendicular of a parallel distance is one in reality.
    const Measured parallel(ZtDrawnType::ParallelDistance, ZtCalibration(1.0, 2.0));
    const QPainterPath lines = parallel.manipulator.outline(polygon({{0, 0}, {40, 10}, {0, 25}}));
    const QPointF foot = lines.elementAt(lines.elementCount() - 2);
    const QPointF along(40, 20);
    QVERIFY(std::abs(QPointF::dotProduct(QPointF(-foot.x(), 2.0 * (25 - foot.y())), along)) < 1e-6);
    QVERIFY(Measured(ZtDrawnType::Counter).manipulator.outline(polygon({{1, 1}})).isEmpty());
}

void ZtDrawnManipulatorTest::outlineIsThatOfTheRegisteredManipulator()
{
    ZtKernelData *kernel = ZtKernelData::getInstance();
    const ZtDrawnType &type = *ZtDrawnType::find(ZtDrawnType::Circle);
    const QPolygonF points = polygon({{50, 50}, {60, 50}});
    QCOMPARE(ZtDrawnManipulator::outlineOf(type, points).boundingRect(), QRectF(40, 40, 20, 20));
    kernel->registerType(
        type.id, std::make_unique<ZtDrawnManipulator>(type, std::make_shared<ZtCalibration>(1.0, 0.5)),
        std::make_unique<ZtKernelObjectDataDescr>(type.id, QLatin1String(type.key)));
    const QRectF bounds = ZtDrawnManipulator::outlineOf(type, points).boundingRect();
    kernel->unregisterType(type.id);
    QCOMPARE(bounds, QRectF(40, 30, 20, 40));
}

void ZtDrawnManipulatorTest::labelsScaleBarsInReality()
{
    const Measured bar(ZtDrawnType::ScaleBar, ZtCalibration(2.0, 4.0));
    const ZtDrawnObjectData object(polygon({{0, 0}, {0, 10}}));
    QCOMPARE(bar.manipulator.labelText(1, &object), QStringLiteral("40.000 \u03BCm"));
}

void ZtDrawnManipulatorTest::readsInPixelsWithoutCalibration()
{
    const ZtDrawnObjectData line(polygon({{0, 0}, {123.44, 0}}));
    const Measured lines(ZtDrawnType::Line);
    int kind = -1;
    QCOMPARE(lines.manipulator.value(QStringLiteral("Length"), &line, kind).toDouble(), 123.44);
    QCOMPARE(kind, int(ZtGsManipulator::NoKind));
    QCOMPARE(lines.manipulator.valueText(QStringLiteral("Length"), &line), QStringLiteral("123.4 px"));

    const ZtDrawnObjectData corners(polygon({{0, 0}, {10, 10}}));
    const Measured rectangles(ZtDrawnType::Rectangle);
    QCOMPARE(rectangles.manipulator.valueText(QStringLiteral("Area"), &corners),
             QStringLiteral("100.0 px\u00B2"));

    const ZtDrawnObjectData arc(polygon({{1, 0}, {half, half}, {0, 1}}));
    const Measured arcs(ZtDrawnType::Arc);
    arcs.manipulator.value(QStringLiteral("Angle"), &arc, kind);
    QCOMPARE(kind, int(ZtGsManipulator::Angle));
}

void ZtDrawnManipulatorTest::countsShares()
{
    ZtKernelData *kernel = ZtKernelData::getInstance();
    const auto calibration = std::make_shared<ZtCalibration>();
    const ZtDrawnType &type = *ZtDrawnType::find(ZtDrawnType::Counter);
    kernel->registerType(type.id, std::make_unique<ZtDrawnManipulator>(type, calibration),
                         std::make_unique<ZtKernelObjectDataDescr>(type.id, QLatin1String(type.key)));
    kernel->addObject(type.id, std::make_unique<ZtDrawnObjectData>(polygon({{0, 0}})));
    kernel->addObject(type.id, std::make_unique<ZtDrawnObjectData>(polygon({{0, 0}, {1, 1}, {2, 2}})));
    kernel->addObject(type.id, std::make_unique<ZtDrawnObjectData>());
    const ZtGsManipulator *manipulator = kernel->getGsManipulator(type.id);
    QStringList texts;
    for (int id = 1; id <= 3; ++id)
        texts.append(manipulator->valueText(QStringLiteral("Share"), kernel->object(type.id, id)));
    kernel->unregisterType(type.id);
    QCOMPARE(texts, (QStringList{QStringLiteral("25.000 %"), QStringLiteral("75.000 %"),
                                 QStringLiteral("0.000 %")}));
}

void ZtDrawnManipulatorTest::sharesFollowEveryChange_data()
{
    QTest::addColumn<Change>("change");
    QTest::addColumn<double>("share");
    const auto row = [](const char *name, double share, const Change &change) {
        QTest::newRow(name) << change << share;
    };
    row("nothing", 25.0, [](const Counters &) {});
    row("more places", 10.0, [](const Counters &c) { c.set(2, 9); });
    row("fewer places", 50.0, [](const Counters &c) { c.set(2, 1); });
    row("own places", 50.0, [](const Counters &c) { c.set(1, 3); });
    row("another counter", 20.0, [](const Counters &c) { c.add(1); });
    row("one counter less", 100.0, [](const Counters &c) { c.kernel->removeObject(counterType, 2); });
    row("silently another one", 12.5, [](const Counters &c) {
        const ZtKernelData::SignalBlocker blocker;
        c.add(4);
    });
    row("silently changed", 50.0, [](const Counters &c) {
        const ZtKernelData::SignalBlocker blocker;
        c.set(2, 1);
    });
    row("in place of another one", 50.0, [](const Counters &c) {
        c.kernel->addObject(counterType, std::make_unique<ZtDrawnObjectData>(places(1)), 2);
    });
}

void ZtDrawnManipulatorTest::sharesFollowEveryChange()
{
    QFETCH(Change, change);
    QFETCH(double, share);
    const Counters counters;
    QCOMPARE(counters.share(1), 25.0);
    change(counters);
    QCOMPARE(counters.share(1), share);
}

// Whoever hears of a change first reads right values already.
void ZtDrawnManipulatorTest::sharesAreRightFirst()
{
    EagerReader reader;
    const Counters counters;
    reader.counters = &counters;
    counters.set(2, 9);
    const int added = counters.add(10);
    counters.kernel->removeObject(counterType, added);
    QCOMPARE(reader.read, (QVector<double>{10.0, 5.0, 10.0}));
}

void ZtDrawnManipulatorTest::refusesPoints_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QPolygonF>("points");
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const double infinity = std::numeric_limits<double>::infinity();
    QTest::newRow("no points") << 66653 << QPolygonF();
    QTest::newRow("too few") << 66656 << polygon({{0, 0}, {1, 1}});
    QTest::newRow("too many") << 66651 << polygon({{0, 0}, {1, 1}, {2, 2}});
    QTest::newRow("no number") << 66653 << polygon({{0, 0}, {nan, 1}});
    QTest::newRow("infinite") << 66755 << polygon({{0, -infinity}, {1, 1}});
    QTest::newRow("far outside of any picture") << 66741 << polygon({{0, 0}, {0, 1.1e9}});
}

void ZtDrawnManipulatorTest::refusesPoints()
{
    QFETCH(int, type);
    QFETCH(QPolygonF, points);
    QVERIFY(!ZtDrawnType::find(type)->acceptsPoints(points));
    const Measured measured(type, 1.0);
    const ZtDrawnObjectData object(points);
    for (const QString &name : measured.manipulator.getValueNames()) {
        int kind = -1;
        QVERIFY(!measured.manipulator.value(name, &object, kind).isValid());
        QCOMPARE(kind, int(ZtGsManipulator::NoKind));
        QCOMPARE(measured.manipulator.valueText(name, &object), QString());
    }
}

void ZtDrawnManipulatorTest::knowsNoOtherValues()
{
    const Measured measured(ZtDrawnType::Line, 1.0);
    const ZtDrawnObjectData object(polygon({{0, 0}, {1, 1}}));
    int kind = -1;
    QVERIFY(!measured.manipulator.value(QStringLiteral("Weight"), &object, kind).isValid());
    QCOMPARE(kind, 0);
    QCOMPARE(measured.manipulator.valueText(QStringLiteral("Weight"), &object), QString());
    QVERIFY(!measured.manipulator.value(QStringLiteral("Length"), nullptr, kind).isValid());
    QCOMPARE(ZtDrawnType::find(1), static_cast<const ZtDrawnType *>(nullptr));
}

void ZtDrawnManipulatorTest::drawsVisibly_data()
{
    QTest::addColumn<int>("type");
    for (const ZtDrawnType &type : ZtDrawnType::all())
        QTest::newRow(type.key) << type.id;
}

void ZtDrawnManipulatorTest::drawsVisibly()
{
    QFETCH(int, type);
    const QPolygonF points = samplePoints(*ZtDrawnType::find(type));
    const QString text = QStringLiteral("Note");
    const Drawing onBlack(type, points, Qt::black, 1.0, text);
    const Drawing onWhite(type, points, Qt::white, 1.0, text);
    const Drawing zoomed(type, points, Qt::black, 0.5, text);
    QVERIFY2(onBlack.bright > 20, qPrintable(QString::number(onBlack.bright)));
    QVERIFY2(onWhite.dark > 20, qPrintable(QString::number(onWhite.dark)));
    QVERIFY2(zoomed.bright > 20, qPrintable(QString::number(zoomed.bright)));
    QVERIFY(onBlack.leavesPainterAlone && zoomed.leavesPainterAlone);
}

void ZtDrawnManipulatorTest::drawsNothingItCannotMeasure()
{
    const double nan = std::numeric_limits<double>::quiet_NaN();
    QCOMPARE(Drawing(ZtDrawnType::Line, polygon({{30, 30}}), Qt::black).bright, 0);
    QCOMPARE(Drawing(ZtDrawnType::Line, polygon({{30, 30}, {nan, 30}}), Qt::black).bright, 0);
    QCOMPARE(Drawing(ZtDrawnType::Counter, QPolygonF(), Qt::black).bright, 0);
    QCOMPARE(Drawing(ZtDrawnType::TextNote, polygon({{30, 30}}), Qt::black).bright, 0);
    QImage image(10, 10, QImage::Format_RGB32);
    QPainter painter(&image);
    Measured(ZtDrawnType::Line).manipulator.draw(&painter, 1, nullptr);
}

void ZtDrawnManipulatorTest::keepsLabelsOnThePicture()
{
    const QString text = QStringLiteral("WWWW");
    const int inside = Drawing(ZtDrawnType::TextNote, polygon({{40, 60}}), Qt::black, 1.0, text).bright;
    const QPolygonF corners = polygon({{0, 0}, {119, 0}, {0, 119}, {119, 119}});
    for (const QPointF &corner : corners) {
        const int atCorner = Drawing(ZtDrawnType::TextNote, polygon({corner}), Qt::black, 1.0, text).bright;
        QVERIFY2(atCorner > inside * 3 / 4, qPrintable(QStringLiteral("%1 of %2").arg(atCorner).arg(inside)));
    }
    QCOMPARE(Drawing(ZtDrawnType::TextNote, polygon({{500, 500}}), Qt::black, 1.0, text).bright, 0);
}

// A picture of twice the resolution has half as many units as pixels.
void ZtDrawnManipulatorTest::pageIsInTheUnitOfThePainter()
{
    QImage image(240, 120, QImage::Format_RGB32);
    for (const double ratio : {1.0, 2.0}) {
        image.setDevicePixelRatio(ratio);
        QPainter painter(&image);
        painter.scale(3.0, 3.0);
        QCOMPARE(ZtDrawnObjectPainter::page(painter), QRectF(0, 0, 240 / ratio, 120 / ratio));
    }
}

void ZtDrawnManipulatorTest::namesObjects()
{
    Measured measured(ZtDrawnType::Circle);
    QCOMPARE(measured.manipulator.getObjectName(7), QStringLiteral("Circle 7"));
    measured.manipulator.setObjectName(7, QStringLiteral("Coin"));
    measured.manipulator.retranslate();
    QCOMPARE(measured.manipulator.getObjectName(7), QStringLiteral("Coin"));
    QCOMPARE(measured.manipulator.getValueNames().size(), 2);
}

STATREPORT_TEST_MAIN(ZtDrawnManipulatorTest)
#include "ZtDrawnManipulatorTest.moc"
