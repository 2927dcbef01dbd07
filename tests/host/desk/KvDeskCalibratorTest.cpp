// SPDX-License-Identifier: MIT
#include "KvDeskCalibrator.h"

#include "CalibratedDesk.h"
#include "DeskLog.h"
#include "KvDeskObjectState.h"
#include "kernel/ZtAppSettings.h"

namespace {

ZtCalibration typed(const char *objective, double size)
{
    ZtCalibration calibration(size);
    calibration.setObjective(QString::fromLatin1(objective));
    calibration.setAuthor(QStringLiteral("A. Smith"));
    return calibration;
}

} // namespace

class KvDeskCalibratorTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void calibratesAndRemembers();
    void oneStepThatCanBeUndone();
    void undoneChangesLeaveTheSessionUnmodified();
    void newestIsUsedWithoutAnotherEntry();
    void oldOneIsUsedAgainAsANewEntry();
    void uncalibratedIsNoStep();
    void usesWhatTheFileStates();
    void offersAnotherPixelSize_data();
    void offersAnotherPixelSize();
    void offerIsWithdrawn_data();
    void offerIsWithdrawn();
    void openedSessionsAreNotQuestioned();
    void firstImageCalibratesAnEmptySession();
    void theLogTellsOfIt();
    void theLogTellsWhatIsInForceAgain();
};

void KvDeskCalibratorTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtStatusLog::getInstance()->clear();
}

void KvDeskCalibratorTest::calibratesAndRemembers()
{
    CalibratedDesk desk;
    QSignalSpy changed(&desk.calibrator, SIGNAL(signalChanged()));
    const QDateTime before = QDateTime::currentDateTimeUtc();
    desk.calibrator.calibrate(typed("10x", 0.5));
    QVERIFY(changed.count() > 0);
    const ZtCalibration current = desk.document.calibration();
    QVERIFY(current == desk.calibrator.current());
    QCOMPARE(current.micrometresPerPixel(), 0.5);
    QVERIFY(current.date() >= before && current.date() <= QDateTime::currentDateTimeUtc());
    QVERIFY(desk.calibrator.store()->current(QStringLiteral("10x")) == current);
    QCOMPARE(desk.calibrator.store()->author(), QStringLiteral("A. Smith"));
    QCOMPARE(desk.calibrator.store()->lastObjective(), QStringLiteral("10x"));
}

void KvDeskCalibratorTest::oneStepThatCanBeUndone()
{
    CalibratedDesk desk;
    desk.calibrator.calibrate(typed("10x", 0.5));
    desk.calibrator.calibrate(typed("50x", 0.1));
    QCOMPARE(desk.editor.undoStack()->count(), 2);
    QCOMPARE(desk.editor.undoStack()->undoText(), QStringLiteral("change of the calibration"));
    desk.editor.slotUndo();
    QCOMPARE(desk.document.calibration().micrometresPerPixel(), 0.5);
    desk.editor.slotUndo();
    QVERIFY(!desk.document.calibration().isCalibrated());
    desk.editor.slotRedo();
    QCOMPARE(desk.document.calibration().objective(), QStringLiteral("10x"));
    // What was once calibrated stays known.
    QCOMPARE(desk.calibrator.store()->objectives(),
             QStringList({QStringLiteral("10x"), QStringLiteral("50x")}));
}

void KvDeskCalibratorTest::undoneChangesLeaveTheSessionUnmodified()
{
    CalibratedDesk desk;
    ZtFault fault;
    QVERIFY(desk.session.save(temporaryPath(QStringLiteral("saved.json")), &fault));
    desk.calibrator.calibrate(typed("10x", 0.5));
    QVERIFY(desk.session.isModified());
    desk.editor.slotUndo();
    QVERIFY(!desk.session.isModified());
}

void KvDeskCalibratorTest::newestIsUsedWithoutAnotherEntry()
{
    CalibratedDesk desk;
    desk.calibrator.calibrate(typed("10x", 0.5));
    desk.calibrator.calibrate(typed("50x", 0.1));
    const ZtCalibration ten = desk.calibrator.store()->current(QStringLiteral("10x"));
    desk.calibrator.useAgain(ten, QStringLiteral("B. Jones"));
    QVERIFY(desk.document.calibration() == ten);
    QCOMPARE(desk.calibrator.store()->history(QStringLiteral("10x")).size(), 1);
    QCOMPARE(desk.calibrator.store()->lastObjective(), QStringLiteral("10x"));
    QCOMPARE(desk.editor.undoStack()->count(), 3);
}

void KvDeskCalibratorTest::oldOneIsUsedAgainAsANewEntry()
{
    CalibratedDesk desk;
    desk.calibrator.calibrate(typed("10x", 0.5));
    desk.calibrator.calibrate(typed("10x", 0.6));
    const ZtCalibration old = desk.calibrator.store()->history(QStringLiteral("10x")).last();
    desk.calibrator.useAgain(old, QStringLiteral("B. Jones"));
    const QVector<ZtCalibration> history = desk.calibrator.store()->history(QStringLiteral("10x"));
    QCOMPARE(history.size(), 3);
    QVERIFY(history.last() == old);
    QCOMPARE(history.first().micrometresPerPixel(), 0.5);
    QCOMPARE(history.first().author(), QStringLiteral("B. Jones"));
    QVERIFY(history.first().date() >= history.at(1).date());
    QVERIFY(desk.document.calibration() == history.first());
}

void KvDeskCalibratorTest::uncalibratedIsNoStep()
{
    CalibratedDesk desk;
    desk.calibrator.calibrate(typed("10x", 0.0));
    QCOMPARE(desk.editor.undoStack()->count(), 0);
    QCOMPARE(desk.calibrator.store()->author(), QString());
}

void KvDeskCalibratorTest::usesWhatTheFileStates()
{
    CalibratedDesk desk;
    desk.calibrator.calibrate(typed("10x", 0.5));
    QVERIFY(desk.open(CalibratedDesk::picture(QStringLiteral("stated.png"), 10.0, 20.0)));
    desk.calibrator.slotUseOffered();
    const ZtCalibration current = desk.document.calibration();
    QVERIFY(current.hasSamePixelSize(ZtCalibration(10.0, 20.0)));
    QVERIFY(current.origin() == ZtCalibration::Origin::Metadata);
    QCOMPARE(current.name(), QStringLiteral("stated.png"));
    QCOMPARE(current.objective(), QStringLiteral("10x"));
    QCOMPARE(current.author(), QStringLiteral("A. Smith"));
    QVERIFY(desk.calibrator.store()->current(QStringLiteral("10x")) == current);
    desk.editor.slotUndo();
    QCOMPARE(desk.document.calibration().micrometresPerPixel(), 0.5);
}

void KvDeskCalibratorTest::offersAnotherPixelSize_data()
{
    QTest::addColumn<double>("size");
    QTest::addColumn<bool>("isStated");
    QTest::addColumn<QString>("offer");
    QTest::newRow("another size") << 3.0 << true
                                  << "a.png states pixels of 10 μm; the session measures with 3 μm";
    QTest::newRow("measured in pixels")
        << 0.0 << true << "a.png states pixels of 10 μm; the session measures in pixels";
    QTest::newRow("the same size") << 10.0 << true << QString();
    QTest::newRow("nothing stated") << 3.0 << false << QString();
}

void KvDeskCalibratorTest::offersAnotherPixelSize()
{
    QFETCH(double, size);
    QFETCH(bool, isStated);
    QFETCH(QString, offer);
    CalibratedDesk desk;
    desk.line({0, 0}, {10, 10});
    desk.document.setCalibration(ZtCalibration(size));
    QSignalSpy made(&desk.calibrator, SIGNAL(signalOfferMade(QString)));
    const QString name = QStringLiteral("a.png");
    QVERIFY(desk.open(isStated ? CalibratedDesk::picture(name, 10.0, 10.0) : DeskFiles::image(name)));
    QCOMPARE(made.count(), offer.isEmpty() ? 0 : 1);
    if (!offer.isEmpty())
        QCOMPARE(made.first().first().toString(), offer);
    // Nothing changes without being asked for.
    QVERIFY(desk.document.calibration() == ZtCalibration(size));
}

void KvDeskCalibratorTest::offerIsWithdrawn_data()
{
    QTest::addColumn<QString>("reason");
    for (const char *reason : {"used", "typed", "other image", "no image"})
        QTest::newRow(reason) << QString::fromLatin1(reason);
}

void KvDeskCalibratorTest::offerIsWithdrawn()
{
    QFETCH(QString, reason);
    CalibratedDesk desk;
    desk.document.setCalibration(ZtCalibration(3.0));
    QVERIFY(desk.open(CalibratedDesk::picture(QStringLiteral("b.png"), 10.0, 10.0)));
    QSignalSpy withdrawn(&desk.calibrator, SIGNAL(signalOfferWithdrawn()));
    desk.document.setCalibration(ZtCalibration(4.0));
    QCOMPARE(withdrawn.count(), 0);
    if (reason == QLatin1String("used"))
        desk.calibrator.slotUseOffered();
    else if (reason == QLatin1String("typed"))
        desk.calibrator.calibrate(typed("", 10.0));
    else if (reason == QLatin1String("other image"))
        desk.open(DeskFiles::image(QStringLiteral("c.png")));
    else
        desk.session.clear();
    QVERIFY(withdrawn.count() > 0);
}

// What a session was measured with is no mistake of the user.
void KvDeskCalibratorTest::openedSessionsAreNotQuestioned()
{
    const QString path = temporaryPath(QStringLiteral("other.json"));
    ZtFault fault;
    CalibratedDesk desk;
    QVERIFY(desk.open(CalibratedDesk::picture(QStringLiteral("d.png"), 10.0, 10.0)));
    desk.calibrator.calibrate(typed("10x", 0.5));
    QVERIFY(desk.session.save(path, &fault));
    QSignalSpy made(&desk.calibrator, SIGNAL(signalOfferMade(QString)));
    QVERIFY(desk.session.open(path, false, &fault));
    QCOMPARE(made.count(), 0);
    QCOMPARE(desk.document.calibration().objective(), QStringLiteral("10x"));
    QCOMPARE(desk.document.calibration().author(), QStringLiteral("A. Smith"));
}

void KvDeskCalibratorTest::firstImageCalibratesAnEmptySession()
{
    CalibratedDesk desk;
    QSignalSpy made(&desk.calibrator, SIGNAL(signalOfferMade(QString)));
    QVERIFY(desk.open(CalibratedDesk::picture(QStringLiteral("e.png"), 10.0, 20.0)));
    QCOMPARE(made.count(), 0);
    QVERIFY(desk.document.calibration().hasSamePixelSize(ZtCalibration(10.0, 20.0)));
    QVERIFY(desk.document.calibration().date().isValid());
    QCOMPARE(desk.calibrator.store()->objectives(), QStringList());
}

void KvDeskCalibratorTest::theLogTellsOfIt()
{
    CalibratedDesk desk;
    QVERIFY(desk.open(CalibratedDesk::picture(QStringLiteral("f.png"), 10.0, 20.0)));
    desk.calibrator.calibrate(typed("10x", 0.5));
    desk.calibrator.calibrate(typed("", 0.25));
    desk.calibrator.calibrate(typed("nothing", 0.0));
    desk.calibrator.useAgain(desk.calibrator.store()->current(QStringLiteral("10x")), QString());
    desk.calibrator.slotUseOffered();
    const QStringList expected{
        QStringLiteral("Calibrated: f.png, 10 × 20 μm per pixel"),
        QStringLiteral("Calibrated: 10x, 0.5 μm per pixel"),
        QStringLiteral("Calibrated: Typed, 0.25 μm per pixel"),
        QStringLiteral("Calibrated: 10x, 0.5 μm per pixel"),
        QStringLiteral("Calibrated: 10x, 10 × 20 μm per pixel"),
    };
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information), expected);
    // An image that says the same changes nothing.
    QVERIFY(desk.open(CalibratedDesk::picture(QStringLiteral("g.png"), 10.0, 20.0)));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information).size(), expected.size());
}

void KvDeskCalibratorTest::theLogTellsWhatIsInForceAgain()
{
    CalibratedDesk desk;
    desk.calibrator.calibrate(typed("10x", 0.5));
    desk.calibrator.calibrate(typed("", 2.35));
    const KvDeskObjectId line = desk.editor.create(ZtDrawnType::Line, polygon({{0, 0}, {9, 9}}));
    ZtStatusLog::getInstance()->clear();
    desk.editor.slotUndo();
    QVERIFY(!KvDeskObjectState::of(line).exists);
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information), QStringList());
    desk.editor.slotUndo();
    desk.editor.slotUndo();
    desk.editor.slotRedo();
    desk.editor.slotRedo();
    QCOMPARE(
        DeskLog::messages(ZtAppStatus::Information),
        QStringList({QStringLiteral("Calibrated: 10x, 0.5 μm per pixel"), QStringLiteral("Not calibrated"),
                     QStringLiteral("Calibrated: 10x, 0.5 μm per pixel"),
                     QStringLiteral("Calibrated: Typed, 2.35 μm per pixel")}));
}

STATREPORT_TEST_MAIN(KvDeskCalibratorTest)
#include "KvDeskCalibratorTest.moc"
