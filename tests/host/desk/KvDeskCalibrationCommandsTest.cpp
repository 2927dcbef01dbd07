// SPDX-License-Identifier: MIT
#include "KvDeskCalibrationCommands.h"

#include "CalibratedDesk.h"
#include "KvDeskActions.h"
#include "KvDeskCalibrationDialog.h"
#include "KvDeskImageView.h"
#include "KvDeskMainWindow.h"
#include "KvDeskNotice.h"
#include "KvDeskObjectPlaces.h"
#include "KvDeskStatusBar.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtObjectsPainter.h"

class KvDeskCalibrationCommandsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void opensOneWindow();
    void offersTheFilesPixelSizeOverTheImage();
    void offerCanBeClosed();
    void commandSaysWhyItIsNotPossible();
    void scaleBarIsShownAndRemembered();
    void scaleBarFollowsZoomAndCalibration();
    void statusBarShowsObjectiveAndPixelSize();
    void objectsMoveToTheirPlaceInReality();

private:
    QAction *action(KvDeskActions::Id id) const { return m_window->actions()->action(id); }
    bool open(const QString &path)
    {
        ZtFault fault;
        return m_window->session()->openImage(path, &fault);
    }

    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskMainWindow> m_window;
    KvDeskCalibrationCommands *m_commands = nullptr;
};

void KvDeskCalibrationCommandsTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_window = std::make_unique<KvDeskMainWindow>(m_document.get());
    m_window->show();
    m_commands = m_window->calibrationCommands();
}

void KvDeskCalibrationCommandsTest::cleanup()
{
    m_window.reset();
    m_document.reset();
    StatReportTest::cleanup();
}

void KvDeskCalibrationCommandsTest::opensOneWindow()
{
    QVERIFY(!m_commands->dialog());
    action(KvDeskActions::Calibrate)->trigger();
    QPointer<KvDeskCalibrationDialog> dialog = m_commands->dialog();
    QVERIFY(dialog && dialog->isVisible() && !dialog->isModal());
    action(KvDeskActions::Calibrate)->trigger();
    QCOMPARE(m_commands->dialog(), dialog.data());
    dialog->close();
    QTRY_VERIFY(!dialog);
    QVERIFY(!m_commands->dialog());
    action(KvDeskActions::Calibrate)->trigger();
    QVERIFY(m_commands->dialog());
}

void KvDeskCalibrationCommandsTest::offersTheFilesPixelSizeOverTheImage()
{
    KvDeskNotice *const notice = m_commands->notice();
    m_document->setCalibration(ZtCalibration(3.0));
    QVERIFY(!notice->isVisible());
    QVERIFY(open(CalibratedDesk::picture(QStringLiteral("offer.png"), 10.0, 10.0)));
    QVERIFY(notice->isVisible());
    QCOMPARE(notice->text(),
             QStringLiteral("offer.png states pixels of 10 μm; the session measures with 3 μm"));
    QCOMPARE(notice->actionButton()->text(), QStringLiteral("Use the file's pixel size"));
    QCOMPARE(m_document->calibration().micrometresPerPixel(), 3.0);
    QTest::mouseClick(notice->actionButton(), Qt::LeftButton);
    QCOMPARE(m_document->calibration().micrometresPerPixel(), 10.0);
    QVERIFY(!notice->isVisible());
    action(KvDeskActions::Undo)->trigger();
    QCOMPARE(m_document->calibration().micrometresPerPixel(), 3.0);
}

void KvDeskCalibrationCommandsTest::offerCanBeClosed()
{
    m_document->setCalibration(ZtCalibration(3.0));
    QVERIFY(open(CalibratedDesk::picture(QStringLiteral("closed.png"), 10.0, 10.0)));
    QTest::mouseClick(m_commands->notice()->closeButton(), Qt::LeftButton);
    QVERIFY(!m_commands->notice()->isVisible());
    QCOMPARE(m_document->calibration().micrometresPerPixel(), 3.0);
    QVERIFY(action(KvDeskActions::UseFilePixelSize)->isEnabled());
}

void KvDeskCalibrationCommandsTest::commandSaysWhyItIsNotPossible()
{
    const QAction *const use = action(KvDeskActions::UseFilePixelSize);
    QVERIFY(!use->isEnabled());
    QVERIFY(use->toolTip().endsWith(QStringLiteral("\nThe image's file does not state one")));
    QVERIFY(open(CalibratedDesk::picture(QStringLiteral("why.png"), 10.0, 10.0)));
    QVERIFY(!use->isEnabled());
    QVERIFY(use->toolTip().endsWith(QStringLiteral("\nThe session measures with it already")));
    m_document->setCalibration(ZtCalibration(3.0));
    QVERIFY(use->isEnabled());
}

void KvDeskCalibrationCommandsTest::scaleBarIsShownAndRemembered()
{
    QVERIFY(!action(KvDeskActions::ShowScaleBar)->isChecked());
    QVERIFY(!m_document->objectsPainter()->isScaleBarShown());
    action(KvDeskActions::ShowScaleBar)->trigger();
    QVERIFY(m_window->imageView()->isScaleBarVisible());
    QVERIFY(m_document->objectsPainter()->isScaleBarShown());
    m_window->close();
    m_window = std::make_unique<KvDeskMainWindow>(m_document.get());
    QVERIFY(action(KvDeskActions::ShowScaleBar)->isChecked());
    QVERIFY(m_window->imageView()->isScaleBarVisible());
    action(KvDeskActions::ShowScaleBar)->trigger();
    QVERIFY(!m_document->objectsPainter()->isScaleBarShown());
}

void KvDeskCalibrationCommandsTest::scaleBarFollowsZoomAndCalibration()
{
    QVERIFY(open(DeskFiles::image(QStringLiteral("bar.png"), QSize(1200, 900))));
    const auto shown = [this] { return m_window->imageView()->viewport()->grab().toImage(); };
    const QImage without = shown();
    action(KvDeskActions::ShowScaleBar)->trigger();
    const QImage inPixels = shown();
    QVERIFY(inPixels != without);
    m_document->setCalibration(ZtCalibration(0.7));
    const QImage calibrated = shown();
    QVERIFY(calibrated != inPixels);
    m_window->imageView()->slotZoomIn();
    QVERIFY(shown() != calibrated);
    action(KvDeskActions::ShowScaleBar)->trigger();
    m_window->imageView()->slotZoomFit();
    QCOMPARE(shown(), without);
}

void KvDeskCalibrationCommandsTest::statusBarShowsObjectiveAndPixelSize()
{
    QVERIFY(open(DeskFiles::image(QStringLiteral("status.png"))));
    ZtCalibration calibration(0.5, 0.25);
    calibration.setObjective(QStringLiteral("10x"));
    m_commands->calibrator()->calibrate(calibration);
    QCOMPARE(m_window->deskStatusBar()->imageText(), QStringLiteral("40 × 30 px, 10x, 0.5 × 0.25 μm/px"));
}

// A circle is drawn and hit where it is in reality.
void KvDeskCalibrationCommandsTest::objectsMoveToTheirPlaceInReality()
{
    QVERIFY(open(DeskFiles::image(QStringLiteral("circle.png"), QSize(400, 300))));
    m_document->addObject(ZtDrawnType::Circle, polygon({{200, 150}, {250, 150}}));
    const KvDeskObjectId circle{ZtDrawnType::Circle, 1};
    const auto isAt = [this](double x, double y) {
        return !m_window->imageView()->places().objectAt(QPointF(x, y), 2.0).isNull();
    };
    const auto bounds = [&] { return m_window->imageView()->places().index().rect(circle); };
    QVERIFY(isAt(200, 100) && !isAt(200, 125));
    const QImage square = m_window->imageView()->viewport()->grab().toImage();
    m_document->setCalibration(ZtCalibration(1.0, 2.0));
    QVERIFY(!isAt(200, 100) && isAt(200, 125));
    QVERIFY(bounds().height() < 51.0 && bounds().width() > 99.0);
    QVERIFY(m_window->imageView()->viewport()->grab().toImage() != square);
    m_document->setCalibration(ZtCalibration());
    QVERIFY(isAt(200, 100));
}

STATREPORT_TEST_MAIN(KvDeskCalibrationCommandsTest)
#include "KvDeskCalibrationCommandsTest.moc"
