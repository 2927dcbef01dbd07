// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtCalibration.h"
#include "measuring/ZtCalibrationJson.h"
#include "measuring/ZtFault.h"

#include <QJsonDocument>

namespace {

QJsonObject json(const char *text)
{
    return QJsonDocument::fromJson(text).object();
}

} // namespace

class ZtCalibrationJsonTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void keepsEverything_data();
    void keepsEverything();
    void writesTheseNames();
    void readsTheLeast();
    void refuses_data();
    void refuses();
};

void ZtCalibrationJsonTest::keepsEverything_data()
{
    QTest::addColumn<int>("origin");
    QTest::newRow("known distance") << static_cast<int>(ZtCalibration::Origin::KnownDistance);
    QTest::newRow("metadata") << static_cast<int>(ZtCalibration::Origin::Metadata);
    QTest::newRow("typed") << static_cast<int>(ZtCalibration::Origin::Typed);
}

void ZtCalibrationJsonTest::keepsEverything()
{
    QFETCH(int, origin);
    ZtCalibration calibration(0.1234567890123456, 1.0 / 3.0);
    calibration.setName(QStringLiteral("Stage \"A\""));
    calibration.setObjective(QStringLiteral("10x/0.25"));
    calibration.setAuthor(QString::fromUtf8("Zoë 測"));
    calibration.setNote(QStringLiteral("two\nlines"));
    calibration.setDate(QDateTime(QDate(2026, 1, 31), QTime(23, 59, 59, 123), Qt::UTC));
    calibration.setOrigin(static_cast<ZtCalibration::Origin>(origin));
    ZtCalibration again;
    ZtFault fault;
    QVERIFY2(ZtCalibrationJson::read(ZtCalibrationJson::toJson(calibration), &again, &fault),
             qPrintable(fault.text()));
    QVERIFY(again == calibration);
}

void ZtCalibrationJsonTest::writesTheseNames()
{
    ZtCalibration calibration(0.5, 0.25);
    calibration.setOrigin(ZtCalibration::Origin::KnownDistance);
    calibration.setObjective(QStringLiteral("10x"));
    calibration.setDate(QDateTime(QDate(2026, 1, 31), QTime(12, 0), Qt::UTC));
    QCOMPARE(ZtCalibrationJson::toJson(calibration),
             json(R"({"micrometresPerPixelX": 0.5, "micrometresPerPixelY": 0.25, "objective": "10x",
                      "origin": "knownDistance", "date": "2026-01-31T12:00:00.000Z"})"));
}

void ZtCalibrationJsonTest::readsTheLeast()
{
    ZtCalibration calibration;
    ZtFault fault;
    QVERIFY(ZtCalibrationJson::read(
        json(R"({"micrometresPerPixelX": 2, "micrometresPerPixelY": 3, "future": []})"), &calibration,
        &fault));
    QVERIFY(calibration == ZtCalibration(2.0, 3.0));
    QVERIFY(fault.isNull());
}

void ZtCalibrationJsonTest::refuses_data()
{
    QTest::addColumn<QByteArray>("members");
    QTest::addColumn<QString>("fault");
    const QByteArray sizes = "\"micrometresPerPixelX\": 2, \"micrometresPerPixelY\": 3, ";
    QTest::newRow("nothing") << QByteArray("\"a\": 1")
                             << "micrometresPerPixelX: This must be a number greater than 0";
    QTest::newRow("one size") << QByteArray("\"micrometresPerPixelX\": 2")
                              << "micrometresPerPixelY: This must be a number greater than 0";
    QTest::newRow("size 0") << QByteArray("\"micrometresPerPixelX\": 0, \"micrometresPerPixelY\": 3")
                            << "micrometresPerPixelX: This must be a number greater than 0";
    QTest::newRow("size in text") << QByteArray("\"micrometresPerPixelX\": \"2\"")
                                  << "micrometresPerPixelX: This must be a number greater than 0";
    QTest::newRow("name") << QByteArray(sizes + "\"name\": 5") << "name: This must be a text";
    QTest::newRow("objective") << QByteArray(sizes + "\"objective\": null")
                               << "objective: This must be a text";
    QTest::newRow("date, number") << QByteArray(sizes + "\"date\": 5") << "date: This must be a text";
    QTest::newRow("date") << QByteArray(sizes + "\"date\": \"yesterday\"")
                          << "date: This must be a date such as 2026-01-31T12:00:00Z";
    QTest::newRow("origin") << QByteArray(sizes + "\"origin\": \"guessed\"")
                            << "origin: This must be \"knownDistance\", \"metadata\" or \"typed\"";
}

void ZtCalibrationJsonTest::refuses()
{
    QFETCH(QByteArray, members);
    const ZtCalibration before(7.0);
    ZtCalibration calibration = before;
    ZtFault fault;
    QVERIFY(!ZtCalibrationJson::read(json("{" + members + "}"), &calibration, &fault));
    QTEST(fault.text(), "fault");
    QVERIFY(calibration == before);
}

STATREPORT_TEST_MAIN(ZtCalibrationJsonTest)
#include "ZtCalibrationJsonTest.moc"
