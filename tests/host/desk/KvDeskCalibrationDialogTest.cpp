// SPDX-License-Identifier: MIT
#include "KvDeskCalibrationDialog.h"

#include "CalibratedDesk.h"
#include "KvDeskCalibrationHistory.h"
#include "KvDeskFilePixelSize.h"
#include "KvDeskKnownDistance.h"
#include "KvDeskNumberBox.h"
#include "KvDeskResources.h"
#include "KvDeskTableView.h"
#include "KvDeskTypedPixelSize.h"
#include "kernel/ZtAppSettings.h"

#include <QClipboard>
#include <QComboBox>
#include <QGuiApplication>
#include <QHeaderView>

namespace {

using Dialog = KvDeskCalibrationDialog;

void type(QWidget *field, const char *text)
{
    QTest::keyClicks(field, QString::fromUtf8(text));
}

} // namespace

class KvDeskCalibrationDialogTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void beginsWithWhatIsKnown();
    void calibratesByAKnownDistance();
    void calibratesByTheFile();
    void calibratesByTypedNumbers();
    void cannotCalibrateByNothing();
    void typedNumbersStayWhatTheyAre_data();
    void typedNumbersStayWhatTheyAre();
    void knownDistancesStayWhatTheyAre_data();
    void knownDistancesStayWhatTheyAre();
    void pastedTextStays();
    void newObjectivesAreAdded();
    void showsTheHistoryOfTheObjective();
    void usesAnOldOneAgain();
    void followsUndo();
    void rowsAreAnObjectivesOwn();
    void authorIsRemembered();
    void everyFieldHasAName();
    void tabGoesDownTheWindow();
    void closesByEscape();
};

void KvDeskCalibrationDialogTest::init()
{
    StatReportTest::init();
    KvDeskResources::ensure();
    ZtAppSettings::getInstance()->setStoragePath(QString());
}

void KvDeskCalibrationDialogTest::beginsWithWhatIsKnown()
{
    CalibratedDesk desk;
    {
        const Dialog dialog(&desk.calibrator);
        QCOMPARE(dialog.windowTitle(), QStringLiteral("Calibration"));
        QVERIFY(!dialog.isModal());
        QCOMPARE(dialog.objective(), QString());
        QCOMPARE(dialog.currentText(), QStringLiteral("Not calibrated"));
        QCOMPARE(dialog.resultText(), QStringLiteral("No pixel size yet"));
        QVERIFY(dialog.way() == Dialog::KnownDistance);
        QVERIFY(!dialog.calibrateButton()->isEnabled());
        QVERIFY(!dialog.useAgainButton()->isEnabled());
    }
    ZtCalibration calibration(0.5, 0.25);
    calibration.setObjective(QStringLiteral("10x"));
    desk.calibrator.calibrate(calibration);
    const Dialog dialog(&desk.calibrator);
    QCOMPARE(dialog.objective(), QStringLiteral("10x"));
    QVERIFY(dialog.currentText().startsWith(QStringLiteral("0.5 × 0.25 μm, 10x, Typed")));
    QCOMPARE(dialog.typed()->xBox()->value(), 0.5);
    QCOMPARE(dialog.typed()->yBox()->value(), 0.25);
    QCOMPARE(dialog.history()->rowCount(), 1);
}

void KvDeskCalibrationDialogTest::calibratesByAKnownDistance()
{
    CalibratedDesk desk;
    const KvDeskObjectId line = desk.line({0, 0}, {200, 0});
    const Dialog dialog(&desk.calibrator);
    desk.selection.select(line);
    dialog.knownDistance()->useButton()->click();
    type(dialog.objectiveBox(), "10x");
    type(dialog.knownDistance()->lengthBox(), "0,1");
    type(dialog.nameEdit(), " Stage 7 ");
    type(dialog.authorEdit(), "A. Smith");
    type(dialog.noteEdit(), "Cold");
    QCOMPARE(dialog.resultText(), QStringLiteral("New pixel size: 0.5 μm"));
    QVERIFY(!desk.document.calibration().isCalibrated());
    dialog.calibrateButton()->click();
    const ZtCalibration current = desk.document.calibration();
    QVERIFY(current.hasSamePixelSize(ZtCalibration(0.5)));
    QVERIFY(current.origin() == ZtCalibration::Origin::KnownDistance);
    QCOMPARE(current.objective(), QStringLiteral("10x"));
    QCOMPARE(current.name(), QStringLiteral("Stage 7"));
    QCOMPARE(current.author(), QStringLiteral("A. Smith"));
    QCOMPARE(current.note(), QStringLiteral("Cold"));
    QVERIFY(dialog.currentText().startsWith(QStringLiteral("0.5 μm, 10x, Known distance, A. Smith, ")));
    QCOMPARE(dialog.history()->rowCount(), 1);
}

void KvDeskCalibrationDialogTest::calibratesByTheFile()
{
    CalibratedDesk desk;
    const Dialog dialog(&desk.calibrator);
    dialog.wayButton(Dialog::ImageFile)->click();
    QCOMPARE(dialog.imageFile()->text(),
             QStringLiteral("The image's file does not state how large its pixels are."));
    QVERIFY(!dialog.calibrateButton()->isEnabled());
    // Opened while the window is there.
    QVERIFY(desk.open(CalibratedDesk::picture(QStringLiteral("file.png"), 10.0, 20.0)));
    QCOMPARE(dialog.imageFile()->text(), QStringLiteral("file.png states pixels of 10 × 20 μm."));
    dialog.calibrateButton()->click();
    const QVector<ZtCalibration> history = desk.calibrator.store()->history(QString());
    QCOMPARE(history.size(), 1);
    QVERIFY(history.first().origin() == ZtCalibration::Origin::Metadata);
    QCOMPARE(history.first().name(), QStringLiteral("file.png"));
}

void KvDeskCalibrationDialogTest::calibratesByTypedNumbers()
{
    CalibratedDesk desk;
    const Dialog dialog(&desk.calibrator);
    dialog.wayButton(Dialog::Typed)->click();
    QVERIFY(dialog.way() == Dialog::Typed);
    type(dialog.typed()->xBox(), "0.5");
    QCOMPARE(dialog.resultText(), QStringLiteral("New pixel size: 0.5 μm"));
    dialog.typed()->linkButton()->click();
    dialog.typed()->yBox()->clear();
    QCOMPARE(dialog.resultText(), QStringLiteral("No pixel size yet"));
    type(dialog.typed()->yBox(), "2");
    QCOMPARE(dialog.resultText(), QStringLiteral("New pixel size: 0.5 × 2 μm"));
    dialog.calibrateButton()->click();
    QVERIFY(desk.document.calibration().hasSamePixelSize(ZtCalibration(0.5, 2.0)));
    QVERIFY(desk.document.calibration().origin() == ZtCalibration::Origin::Typed);
}

void KvDeskCalibrationDialogTest::cannotCalibrateByNothing()
{
    CalibratedDesk desk;
    const Dialog dialog(&desk.calibrator);
    for (const Dialog::Way way : {Dialog::KnownDistance, Dialog::ImageFile, Dialog::Typed}) {
        dialog.wayButton(way)->click();
        QVERIFY(!dialog.calibrateButton()->isEnabled());
        QCOMPARE(dialog.calibrateButton()->toolTip(), QStringLiteral("Complete the fields above first"));
    }
}

void KvDeskCalibrationDialogTest::typedNumbersStayWhatTheyAre_data()
{
    const QString noNumber = QStringLiteral("Type a number such as 5.3 or 5,3");
    const QString outside = QStringLiteral("A pixel measures between 0.000001 μm and 1000000 μm");
    QTest::addColumn<QString>("typed");
    QTest::addColumn<QString>("result");
    QTest::addColumn<QString>("fault");
    const auto good = [](const char *typed, const char *size) {
        QTest::newRow(typed) << QString::fromLatin1(typed)
                             << QStringLiteral("New pixel size: %1 μm").arg(QLatin1String(size)) << QString();
    };
    const auto bad = [](const char *typed, const QString &fault) {
        QTest::newRow(typed) << QString::fromLatin1(typed) << fault << fault;
    };
    good("5.3", "5.3");
    good("5,3", "5.3");
    good("1,234", "1.234");
    good("2.5e-3", "0.0025");
    good("1E+2", "100");
    good("0.000001", "1e-06");
    good("1000000", "1e+06");
    bad("1.234,5", noNumber);
    bad("1,234.5", noNumber);
    bad("1 000", noNumber);
    bad("1.2.3", noNumber);
    bad("1a2", noNumber);
    bad("1e", noNumber);
    bad("nan", noNumber);
    bad("-1", outside);
    bad("0", outside);
    bad("1e400", outside);
    bad("1e-400", outside);
    bad("0.0000009", outside);
    bad("1000001", outside);
}

void KvDeskCalibrationDialogTest::typedNumbersStayWhatTheyAre()
{
    QFETCH(QString, typed);
    QFETCH(QString, fault);
    CalibratedDesk desk;
    Dialog dialog(&desk.calibrator);
    dialog.setWay(Dialog::Typed);
    dialog.show();
    KvDeskNumberBox *const field = dialog.typed()->xBox();
    QTest::keyClicks(field, typed);
    QTest::keyClick(field, Qt::Key_Tab);
    QCOMPARE(field->text(), typed);
    QTEST(dialog.resultText(), "result");
    QCOMPARE(dialog.calibrateButton()->isEnabled(), fault.isEmpty());
    QCOMPARE(field->toolTip(), fault);
    QTest::keyClick(field, Qt::Key_Return);
    QCOMPARE(desk.document.calibration().isCalibrated(), fault.isEmpty());
    if (fault.isEmpty())
        return;
    QCOMPARE(dialog.calibrateButton()->toolTip(), fault);
    // Mended, there is nothing left to say.
    field->clear();
    QTest::keyClicks(field, QStringLiteral("2"));
    QCOMPARE(field->toolTip(), QString());
    QCOMPARE(dialog.resultText(), QStringLiteral("New pixel size: 2 μm"));
}

void KvDeskCalibrationDialogTest::knownDistancesStayWhatTheyAre_data()
{
    QTest::addColumn<QString>("typed");
    QTest::addColumn<QString>("result");
    QTest::newRow("comma") << QStringLiteral("0,1") << QStringLiteral("New pixel size: 0.5 μm");
    QTest::newRow("several numbers") << QStringLiteral("1.234,5")
                                     << QStringLiteral("Type a number such as 5.3 or 5,3");
    QTest::newRow("negative") << QStringLiteral("-1")
                              << QStringLiteral("A pixel measures between 0.000001 μm and 1000000 μm");
    QTest::newRow("too large") << QStringLiteral("1e7")
                               << QStringLiteral("A pixel measures between 0.000001 μm and 1000000 μm");
}

void KvDeskCalibrationDialogTest::knownDistancesStayWhatTheyAre()
{
    QFETCH(QString, typed);
    QFETCH(QString, result);
    CalibratedDesk desk;
    desk.selection.select(desk.line({0, 0}, {200, 0}));
    const Dialog dialog(&desk.calibrator);
    KvDeskNumberBox *const field = dialog.knownDistance()->lengthBox();
    QTest::keyClicks(field, typed);
    QCOMPARE(field->text(), typed);
    QCOMPARE(dialog.resultText(), result);
    const bool isPossible = result.startsWith(QStringLiteral("New"));
    QCOMPARE(dialog.calibrateButton()->isEnabled(), isPossible);
    QCOMPARE(field->toolTip(), isPossible ? QString() : result);
    // Another unit may make it possible.
    dialog.knownDistance()->unitBox()->setCurrentText(QStringLiteral("μm"));
    QCOMPARE(dialog.calibrateButton()->isEnabled(), isPossible || typed == QStringLiteral("1e7"));
}

void KvDeskCalibrationDialogTest::pastedTextStays()
{
    CalibratedDesk desk;
    Dialog dialog(&desk.calibrator);
    dialog.setWay(Dialog::Typed);
    QGuiApplication::clipboard()->setText(QStringLiteral("12 345,6"));
    QTest::keyClick(dialog.typed()->xBox(), Qt::Key_V, Qt::ControlModifier);
    QCOMPARE(dialog.typed()->xBox()->text(), QStringLiteral("12 345,6"));
    QVERIFY(!dialog.calibrateButton()->isEnabled());
}

void KvDeskCalibrationDialogTest::newObjectivesAreAdded()
{
    CalibratedDesk desk;
    Dialog dialog(&desk.calibrator);
    dialog.setWay(Dialog::Typed);
    type(dialog.typed()->xBox(), "1");
    for (const char *name : {"50x", " 5x "}) {
        dialog.objectiveBox()->clearEditText();
        type(dialog.objectiveBox(), name);
        dialog.calibrateButton()->click();
    }
    QCOMPARE(dialog.objectiveBox()->count(), 2);
    QCOMPARE(dialog.objectiveBox()->itemText(0), QStringLiteral("5x"));
    QCOMPARE(dialog.objectiveBox()->itemText(1), QStringLiteral("50x"));
    QCOMPARE(dialog.objective(), QStringLiteral("5x"));
    QCOMPARE(desk.document.calibration().objective(), QStringLiteral("5x"));
}

void KvDeskCalibrationDialogTest::showsTheHistoryOfTheObjective()
{
    CalibratedDesk desk;
    for (const double size : {1.0, 2.0, 3.0}) {
        ZtCalibration calibration(size);
        calibration.setObjective(size < 3.0 ? QStringLiteral("5x") : QStringLiteral("50x"));
        desk.calibrator.calibrate(calibration);
    }
    Dialog dialog(&desk.calibrator);
    dialog.show();
    QCOMPARE(dialog.history()->rowCount(), 1);
    dialog.objectiveBox()->setCurrentIndex(0);
    QCOMPARE(dialog.objective(), QStringLiteral("5x"));
    QCOMPARE(dialog.history()->rowCount(), 2);
    QCOMPARE(dialog.history()->calibration(0).micrometresPerPixel(), 2.0);
    // The columns fill the table.
    const auto *const table = dialog.findChild<KvDeskTableView *>();
    QTRY_COMPARE(table->horizontalHeader()->length(), table->viewport()->width());
    QVERIFY(dialog.useAgainButton()->isEnabled());
    // Looking at it changes nothing.
    QCOMPARE(desk.document.calibration().objective(), QStringLiteral("50x"));
    dialog.useAgainButton()->click();
    QCOMPARE(desk.document.calibration().objective(), QStringLiteral("5x"));
    QCOMPARE(desk.document.calibration().micrometresPerPixel(), 2.0);
    QCOMPARE(dialog.history()->rowCount(), 2);
    type(dialog.objectiveBox(), " and more");
    QCOMPARE(dialog.history()->rowCount(), 0);
    QVERIFY(!dialog.useAgainButton()->isEnabled());
    QCOMPARE(dialog.useAgainButton()->toolTip(), QStringLiteral("Select a calibration in the table first"));
}

void KvDeskCalibrationDialogTest::usesAnOldOneAgain()
{
    CalibratedDesk desk;
    desk.calibrator.calibrate(ZtCalibration(1.0));
    desk.calibrator.calibrate(ZtCalibration(2.0));
    const Dialog dialog(&desk.calibrator);
    type(dialog.authorEdit(), "B. Jones");
    dialog.historyView()->selectRow(1);
    dialog.useAgainButton()->click();
    QCOMPARE(desk.document.calibration().micrometresPerPixel(), 1.0);
    QCOMPARE(desk.document.calibration().author(), QStringLiteral("B. Jones"));
    QCOMPARE(dialog.history()->rowCount(), 3);
    QCOMPARE(dialog.historyView()->currentIndex().row(), 0);
}

void KvDeskCalibrationDialogTest::followsUndo()
{
    CalibratedDesk desk;
    desk.calibrator.calibrate(ZtCalibration(1.0));
    const Dialog dialog(&desk.calibrator);
    desk.editor.slotUndo();
    QCOMPARE(dialog.currentText(), QStringLiteral("Not calibrated"));
    QCOMPARE(dialog.history()->rowCount(), 1);
}

void KvDeskCalibrationDialogTest::rowsAreAnObjectivesOwn()
{
    CalibratedDesk desk;
    ZtCalibration calibration(1.0);
    calibration.setObjective(QStringLiteral("5x"));
    desk.calibrator.calibrate(calibration);
    const Dialog dialog(&desk.calibrator);
    dialog.objectiveBox()->clearEditText();
    type(dialog.objectiveBox(), "5X");
    QCOMPARE(dialog.history()->rowCount(), 0);
}

void KvDeskCalibrationDialogTest::authorIsRemembered()
{
    CalibratedDesk desk;
    {
        Dialog dialog(&desk.calibrator);
        dialog.setWay(Dialog::Typed);
        type(dialog.typed()->xBox(), "1");
        type(dialog.authorEdit(), "A. Smith");
        dialog.calibrateButton()->click();
    }
    const Dialog dialog(&desk.calibrator);
    QCOMPARE(dialog.authorEdit()->text(), QStringLiteral("A. Smith"));
    QCOMPARE(dialog.nameEdit()->text(), QString());
}

void KvDeskCalibrationDialogTest::everyFieldHasAName()
{
    CalibratedDesk desk;
    const Dialog dialog(&desk.calibrator);
    const QList<QWidget *> fields{dialog.objectiveBox(), dialog.nameEdit(), dialog.authorEdit(),
                                  dialog.noteEdit(), dialog.historyView()};
    for (const QWidget *const field : fields)
        QVERIFY(!field->accessibleName().isEmpty());
}

void KvDeskCalibrationDialogTest::tabGoesDownTheWindow()
{
    CalibratedDesk desk;
    desk.calibrator.calibrate(ZtCalibration(1.0));
    Dialog dialog(&desk.calibrator);
    dialog.setWay(Dialog::Typed);
    dialog.show();
    dialog.activateWindow();
    QTRY_VERIFY(dialog.isActiveWindow());
    dialog.objectiveBox()->setFocus();
    int lastY = -1;
    QSet<QWidget *> visited;
    for (QWidget *at = dialog.focusWidget(); !visited.contains(at); at = dialog.focusWidget()) {
        visited.insert(at);
        const int y = at->mapTo(&dialog, at->rect().center()).y();
        QVERIFY2(y >= lastY - 2, at->metaObject()->className());
        lastY = y;
        QTest::keyClick(at, Qt::Key_Tab);
    }
    const QList<QWidget *> expected{
        dialog.typed()->xBox(), dialog.typed()->linkButton(), dialog.nameEdit(),    dialog.authorEdit(),
        dialog.noteEdit(),      dialog.calibrateButton(),     dialog.historyView(), dialog.useAgainButton()};
    // Tab comes to one of the ways; arrow keys choose among them.
    QCOMPARE(visited.size(), expected.size() + 3);
    for (QWidget *const widget : expected)
        QVERIFY2(visited.contains(widget), widget->metaObject()->className());
}

void KvDeskCalibrationDialogTest::closesByEscape()
{
    CalibratedDesk desk;
    Dialog dialog(&desk.calibrator);
    dialog.show();
    QTest::keyClick(&dialog, Qt::Key_Escape);
    QVERIFY(!dialog.isVisible());
}

STATREPORT_TEST_MAIN(KvDeskCalibrationDialogTest)
#include "KvDeskCalibrationDialogTest.moc"
