// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "common/ZtAppStatus.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtCalibrationStore.h"

#include <QSettings>
#include <QSignalSpy>

namespace {

const QString ten = QStringLiteral("10x");
const QString fifty = QStringLiteral("50x");

ZtCalibration calibration(const QString &objective, double size, const QString &author = QString())
{
    ZtCalibration result(size);
    result.setObjective(objective);
    result.setAuthor(author);
    return result;
}

QVector<double> sizes(const QVector<ZtCalibration> &history)
{
    QVector<double> result;
    for (const ZtCalibration &entry : history)
        result.append(entry.micrometresPerPixel());
    return result;
}

QStringList warnings()
{
    QStringList result;
    for (const ZtStatusEntry &entry : ZtStatusLog::getInstance()->entries()) {
        if (entry.category == ZtAppStatus::Warning)
            result.append(entry.message);
    }
    return result;
}

} // namespace

class ZtCalibrationStoreTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void cleanup();

    void isEmptyAtFirst();
    void newestIsCurrent();
    void sortsObjectivesAsPeopleDo();
    void keepsTheHistoryInTheSettings();
    void takesNothingUncalibrated();
    void keepsItsOrderWhenTheClockIsSetBack();
    void profilesAreApart();
    void programsDoNotOverwriteEachOther();
    void brokenEntriesAreReportedAndLeftAlone();
    void remembersAuthorAndObjective();

private:
    /** What another start of the program would find. */
    void startAgain() const { ZtAppSettings::getInstance()->setStoragePath(m_path); }
    QStringList storedKeys() const;

    QString m_path;
};

void ZtCalibrationStoreTest::init()
{
    StatReportTest::init();
    m_path = temporaryPath(QString::fromLatin1(QTest::currentTestFunction()) + QStringLiteral(".ini"));
    ZtAppSettings::getInstance()->setStoragePath(m_path);
    ZtStatusLog::getInstance()->clear();
}

void ZtCalibrationStoreTest::cleanup()
{
    ZtAppSettings::getInstance()->setStoragePath(QString());
    StatReportTest::cleanup();
}

QStringList ZtCalibrationStoreTest::storedKeys() const
{
    ZtAppSettings::getInstance()->sync();
    QStringList keys;
    const QStringList all = QSettings(m_path, QSettings::IniFormat).allKeys();
    for (const QString &key : all) {
        if (key.startsWith(QLatin1String("DefaultProfile/Calibrations/History/")))
            keys.append(key.section(QLatin1Char('/'), -1));
    }
    keys.sort();
    return keys;
}

void ZtCalibrationStoreTest::isEmptyAtFirst()
{
    const ZtCalibrationStore store;
    QCOMPARE(store.objectives(), QStringList());
    QVERIFY(store.history(ten).isEmpty());
    QVERIFY(!store.current(ten).isCalibrated());
    QCOMPARE(store.author(), QString());
    QCOMPARE(store.lastObjective(), QString());
}

void ZtCalibrationStoreTest::newestIsCurrent()
{
    ZtCalibrationStore store;
    QSignalSpy changed(&store, SIGNAL(signalChanged()));
    QVERIFY(store.append(calibration(ten, 1.0)));
    QVERIFY(store.append(calibration(fifty, 0.2)));
    QVERIFY(store.append(calibration(ten, 1.1)));
    QVERIFY(store.append(store.history(ten).last()));
    QVERIFY(store.append(calibration(QString(), 5.0)));
    QCOMPARE(changed.count(), 5);
    QCOMPARE(sizes(store.history(ten)), QVector<double>({1.0, 1.1, 1.0}));
    QCOMPARE(store.current(ten).micrometresPerPixel(), 1.0);
    QCOMPARE(store.current(fifty).micrometresPerPixel(), 0.2);
    QCOMPARE(store.current(QString()).micrometresPerPixel(), 5.0);
    QCOMPARE(store.objectives(), QStringList({ten, fifty}));
}

void ZtCalibrationStoreTest::sortsObjectivesAsPeopleDo()
{
    ZtCalibrationStore store;
    for (const char *name : {"100x", "5x", "a/b", "10x", "5x"})
        store.append(calibration(QString::fromLatin1(name), 1.0));
    QCOMPARE(store.objectives(),
             QStringList({QStringLiteral("5x"), ten, QStringLiteral("100x"), QStringLiteral("a/b")}));
}

void ZtCalibrationStoreTest::keepsTheHistoryInTheSettings()
{
    ZtCalibration full(0.5, 0.25);
    full.setObjective(QString::fromUtf8("Öl, 100x;\"=%/"));
    full.setName(QStringLiteral("@Invalid()"));
    full.setNote(QStringLiteral("two\nlines"));
    full.setDate(QDateTime::currentDateTimeUtc());
    full.setOrigin(ZtCalibration::Origin::KnownDistance);
    {
        ZtCalibrationStore store;
        store.append(full);
        store.append(calibration(full.objective(), 2.0));
        store.append(calibration(full.objective(), 3.0));
    }
    startAgain();
    const ZtCalibrationStore store;
    QCOMPARE(sizes(store.history(full.objective())), QVector<double>({3.0, 2.0, 0.5}));
    QVERIFY(store.history(full.objective()).last() == full);
    QCOMPARE(storedKeys().size(), 3);
}

void ZtCalibrationStoreTest::takesNothingUncalibrated()
{
    ZtCalibrationStore store;
    QSignalSpy changed(&store, SIGNAL(signalChanged()));
    QVERIFY(!store.append(calibration(ten, 0.0)));
    QCOMPARE(changed.count(), 0);
    QCOMPARE(storedKeys(), QStringList());
}

void ZtCalibrationStoreTest::keepsItsOrderWhenTheClockIsSetBack()
{
    ZtAppSettings::beginGroup(QStringLiteral("Calibrations/History"));
    ZtAppSettings::setValue(
        QStringLiteral("29991231235959999-00000000"),
        QStringLiteral(R"({"micrometresPerPixelX": 9, "micrometresPerPixelY": 9, "objective": "10x"})"));
    ZtAppSettings::endGroup();
    {
        ZtCalibrationStore store;
        store.append(calibration(ten, 1.0));
        store.append(calibration(ten, 2.0));
    }
    startAgain();
    QCOMPARE(sizes(ZtCalibrationStore().history(ten)), QVector<double>({2.0, 1.0, 9.0}));
}

void ZtCalibrationStoreTest::profilesAreApart()
{
    ZtCalibrationStore store;
    store.append(calibration(ten, 1.0));
    QSignalSpy changed(&store, SIGNAL(signalChanged()));
    ZtAppSettings::getInstance()->setCurrentProfile(QStringLiteral("Other microscope"));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(store.objectives(), QStringList());
    store.append(calibration(fifty, 2.0));
    ZtAppSettings::getInstance()->setCurrentProfile(QString());
    QCOMPARE(store.objectives(), QStringList(ten));
}

// Each program reads the settings when it starts and writes only what it changed.
void ZtCalibrationStoreTest::programsDoNotOverwriteEachOther()
{
    {
        ZtCalibrationStore store;
        store.append(calibration(ten, 1.0));
    }
    QVERIFY(ZtAppSettings::getInstance()->sync());
    const QString other = temporaryPath(QStringLiteral("other.ini"));
    QVERIFY(QFile::copy(m_path, other));
    ZtCalibrationStore store;
    store.append(calibration(ten, 2.0));
    const QStringList here = storedKeys();
    ZtAppSettings::getInstance()->setStoragePath(other);
    ZtCalibrationStore otherStore;
    otherStore.append(calibration(ten, 3.0));
    ZtAppSettings::getInstance()->sync();
    m_path = other;
    const QStringList there = storedKeys();
    QCOMPARE(here.size(), 2);
    QCOMPARE(there.size(), 2);
    QCOMPARE(here.first(), there.first());
    QVERIFY(here.last() != there.last());
}

void ZtCalibrationStoreTest::brokenEntriesAreReportedAndLeftAlone()
{
    ZtAppSettings::beginGroup(QStringLiteral("Calibrations/History"));
    ZtAppSettings::setValue(QStringLiteral("20260101000000000-a"), QStringLiteral("{\"microm"));
    ZtAppSettings::setValue(
        QStringLiteral("20260101000000000-b"),
        QStringLiteral(R"({"micrometresPerPixelX": 1, "micrometresPerPixelY": -1, "objective": "10x"})"));
    ZtAppSettings::setValue(QStringLiteral("what is this"), 5);
    ZtAppSettings::setValue(
        QStringLiteral("20260101000000000-c"),
        QStringLiteral(R"({"micrometresPerPixelX": 1, "micrometresPerPixelY": 1, "objective": "10x"})"));
    ZtAppSettings::endGroup();
    {
        ZtCalibrationStore store;
        QCOMPARE(sizes(store.history(ten)), QVector<double>({1.0}));
        QCOMPARE(warnings(),
                 QStringList({QStringLiteral("A calibration in the settings is damaged and was left out "
                                             "(20260101000000000-a: This is not a calibration)"),
                              QStringLiteral(
                                  "A calibration in the settings is damaged and was left out "
                                  "(20260101000000000-b: micrometresPerPixelY: This must be a number greater "
                                  "than 0)"),
                              QStringLiteral("A calibration in the settings is damaged and was left out "
                                             "(what is this: This is not a calibration)")}));
        QVERIFY(store.append(calibration(ten, 2.0)));
        QCOMPARE(sizes(store.history(ten)), QVector<double>({2.0, 1.0}));
    }
    QCOMPARE(storedKeys().size(), 5);
}

void ZtCalibrationStoreTest::remembersAuthorAndObjective()
{
    {
        ZtCalibrationStore store;
        store.setAuthor(QString::fromUtf8("Zoë"));
        store.setLastObjective(fifty);
    }
    startAgain();
    const ZtCalibrationStore store;
    QCOMPARE(store.author(), QString::fromUtf8("Zoë"));
    QCOMPARE(store.lastObjective(), fifty);
    QCOMPARE(store.objectives(), QStringList());
}

STATREPORT_TEST_MAIN(ZtCalibrationStoreTest)
#include "ZtCalibrationStoreTest.moc"
