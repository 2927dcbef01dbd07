// SPDX-License-Identifier: MIT
#include "KvDeskCalibrationCommand.h"

#include "measuring/ZtMeasuringDocument.h"
#include "support/StatReportTest.h"

#include <QSignalSpy>
#include <QUndoStack>

class KvDeskCalibrationCommandTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void goesBackAndForth();
    void everyStepIsAnnounced();
};

void KvDeskCalibrationCommandTest::goesBackAndForth()
{
    ZtMeasuringDocument document;
    document.setCalibration(ZtCalibration(2.0));
    QUndoStack stack;
    stack.push(new KvDeskCalibrationCommand(QStringLiteral("calibration"), &document, ZtCalibration(0.5)));
    QCOMPARE(document.calibration().micrometresPerPixelX(), 0.5);
    stack.push(new KvDeskCalibrationCommand(QStringLiteral("calibration"), &document, ZtCalibration()));
    QVERIFY(!document.calibration().isCalibrated());
    stack.undo();
    QCOMPARE(document.calibration().micrometresPerPixelX(), 0.5);
    stack.undo();
    QVERIFY(document.calibration() == ZtCalibration(2.0));
    stack.setIndex(2);
    QVERIFY(!document.calibration().isCalibrated());
}

void KvDeskCalibrationCommandTest::everyStepIsAnnounced()
{
    ZtMeasuringDocument document;
    QSignalSpy changed(&document, SIGNAL(signalCalibrationChanged()));
    QUndoStack stack;
    stack.push(new KvDeskCalibrationCommand(QStringLiteral("calibration"), &document, ZtCalibration(0.5)));
    stack.undo();
    stack.redo();
    QCOMPARE(changed.count(), 3);
}

STATREPORT_TEST_MAIN(KvDeskCalibrationCommandTest)
#include "KvDeskCalibrationCommandTest.moc"
