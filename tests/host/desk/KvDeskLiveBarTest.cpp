// SPDX-License-Identifier: MIT
#include "KvDeskLiveBar.h"

#include "DeskFiles.h"
#include "DeskLog.h"
#include "FakeCamera.h"
#include "KvDeskActions.h"
#include "KvDeskElidedLabel.h"
#include "KvDeskExposureControl.h"
#include "KvDeskResources.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtKernelImage.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QAction>
#include <QDoubleSpinBox>
#include <QPushButton>
#include <QSlider>
#include <QToolButton>

class KvDeskLiveBarTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void onlyThereForLiveImages();
    void tellsTheState();
    void freezes();
    void freezingIsOverWithTheSource();
    void lostCamera();
    void lostBeforeTheFirstPicture();
    void stoppedCamera();
    void exposure();
    void cameraWithoutExposure();
    void frameRate();
    void everythingHasAName();

private:
    FakeCamera *show();
    QAction *freeze() const { return m_actions->action(KvDeskActions::Freeze); }
    QColor shownColor() const
    {
        const QImage frame = m_document->kernelImage()->frame();
        return frame.isNull() ? QColor() : frame.pixelColor(0, 0);
    }

    std::unique_ptr<KvDeskActions> m_actions;
    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<QWidget> m_window;
    KvDeskLiveBar *m_bar = nullptr;
};

void KvDeskLiveBarTest::init()
{
    StatReportTest::init();
    // Numbers are written as in every language.
    QLocale::setDefault(QLocale(QLocale::Arabic, QLocale::Egypt));
    KvDeskResources::ensure();
    ZtStatusLog::getInstance()->clear();
    m_actions = std::make_unique<KvDeskActions>();
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_window = std::make_unique<QWidget>();
    m_bar = new KvDeskLiveBar(m_actions.get(), m_document.get(), m_window.get());
    m_window->resize(800, 100);
    m_bar->resize(800, 36);
    m_window->show();
}

void KvDeskLiveBarTest::cleanup()
{
    m_window.reset();
    m_document.reset();
    QLocale::setDefault(QLocale::c());
    StatReportTest::cleanup();
}

FakeCamera *KvDeskLiveBarTest::show()
{
    auto camera = std::make_unique<FakeCamera>();
    FakeCamera *const shown = camera.get();
    m_document->setFrameSource(std::move(camera));
    shown->start();
    return shown;
}

void KvDeskLiveBarTest::onlyThereForLiveImages()
{
    QVERIFY(m_bar->isHidden());
    QVERIFY(!freeze()->isEnabled());
    QCOMPARE(freeze()->toolTip(), QStringLiteral("Freeze the live image (F12)\nThis image is not live"));
    show();
    QVERIFY(m_bar->isVisible());
    QVERIFY(freeze()->isEnabled());
    QCOMPARE(freeze()->toolTip(), QStringLiteral("Freeze the live image (F12)"));
    ZtFault fault;
    QVERIFY(m_document->loadImage(DeskFiles::image(QStringLiteral("still.png")), &fault));
    QVERIFY(m_bar->isHidden());
    QVERIFY(!freeze()->isEnabled());
    m_document->setFrameSource(nullptr);
    QVERIFY(m_bar->isHidden());
}

void KvDeskLiveBarTest::tellsTheState()
{
    FakeCamera *const camera = show();
    QCOMPARE(m_bar->status()->text(), QStringLiteral("Waiting for the first picture of Cam"));
    camera->deliver();
    QTRY_COMPARE(m_bar->status()->text(), QStringLiteral("Live: Cam"));
    QCOMPARE(m_bar->runButton()->text(), QString());
}

void KvDeskLiveBarTest::freezes()
{
    FakeCamera *const camera = show();
    camera->deliver(Qt::red);
    QTRY_COMPARE(shownColor(), QColor(Qt::red));
    m_bar->freezeButton()->click();
    QVERIFY(m_document->kernelImage()->isFrozen());
    QVERIFY(freeze()->isChecked());
    QCOMPARE(m_bar->status()->text(), QStringLiteral("Frozen: Cam"));
    QSignalSpy frames(camera, SIGNAL(signalFrameReady()));
    camera->deliver(Qt::green);
    QVERIFY(frames.wait());
    QCOMPARE(shownColor(), QColor(Qt::red));
    freeze()->trigger();
    QVERIFY(!m_document->kernelImage()->isFrozen());
    QCOMPARE(shownColor(), QColor(Qt::green));
    QCOMPARE(m_bar->status()->text(), QStringLiteral("Live: Cam"));
    // Others may freeze the image as well.
    m_document->kernelImage()->setFrozen(true);
    QVERIFY(freeze()->isChecked());
}

void KvDeskLiveBarTest::freezingIsOverWithTheSource()
{
    show()->deliver();
    QTRY_VERIFY(!m_document->kernelImage()->frame().isNull());
    freeze()->trigger();
    show();
    QVERIFY(!freeze()->isChecked());
    QVERIFY(!m_document->kernelImage()->isFrozen());
    m_document->setFrameSource(nullptr);
    QVERIFY(!freeze()->isChecked());
}

void KvDeskLiveBarTest::lostCamera()
{
    FakeCamera *const camera = show();
    camera->deliver(Qt::red);
    QTRY_COMPARE(shownColor(), QColor(Qt::red));
    camera->lose(QStringLiteral("Cam was unplugged"));
    QCOMPARE(m_bar->status()->text(),
             QStringLiteral("Cam delivers no pictures any more; this is the last one"));
    QCOMPARE(shownColor(), QColor(Qt::red));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Warning), QStringList(QStringLiteral("Cam was unplugged")));
    QVERIFY(!m_bar->exposure()->isVisible());
    QCOMPARE(m_bar->runButton()->text(), QStringLiteral("&Reconnect"));
    m_bar->runButton()->click();
    QCOMPARE(camera->state(), ZtFrameSource::Running);
    QCOMPARE(camera->begun, 2);
    QCOMPARE(m_bar->runButton()->text(), QString());
    QVERIFY(m_bar->exposure()->isVisible());
    camera->deliver(Qt::blue);
    QTRY_COMPARE(shownColor(), QColor(Qt::blue));
    QCOMPARE(m_bar->status()->text(), QStringLiteral("Live: Cam"));
}

void KvDeskLiveBarTest::lostBeforeTheFirstPicture()
{
    auto camera = std::make_unique<FakeCamera>();
    camera->isAbsent = true;
    FakeCamera *const shown = camera.get();
    m_document->setFrameSource(std::move(camera));
    shown->start();
    QCOMPARE(m_bar->status()->text(), QStringLiteral("Cam delivers no pictures"));
    m_bar->runButton()->click();
    QCOMPARE(m_bar->runButton()->text(), QStringLiteral("&Reconnect"));
    shown->isAbsent = false;
    m_bar->runButton()->click();
    QCOMPARE(m_bar->runButton()->text(), QString());
}

void KvDeskLiveBarTest::stoppedCamera()
{
    FakeCamera *const camera = show();
    camera->deliver(Qt::red);
    QTRY_COMPARE(shownColor(), QColor(Qt::red));
    m_bar->runButton()->click();
    QCOMPARE(camera->state(), ZtFrameSource::Stopped);
    QCOMPARE(m_bar->status()->text(), QStringLiteral("Cam is stopped"));
    QCOMPARE(shownColor(), QColor(Qt::red));
    QCOMPARE(m_bar->runButton()->text(), QStringLiteral("&Start"));
    m_bar->runButton()->click();
    QCOMPARE(camera->state(), ZtFrameSource::Running);
}

void KvDeskLiveBarTest::exposure()
{
    FakeCamera *const camera = show();
    QVERIFY(m_bar->exposure()->isVisible());
    QCOMPARE(m_bar->exposure()->field()->value(), 20.0);
    // The camera takes the nearest one that it has.
    m_bar->exposure()->field()->setValue(33.3);
    QCOMPARE(camera->wishes, QVector<double>({33.3}));
    QCOMPARE(m_bar->exposure()->field()->value(), 33.5);
    m_bar->exposure()->slider()->setValue(1000);
    QCOMPARE(camera->wishes.size(), 2);
    QCOMPARE(m_bar->exposure()->field()->value(), 1000.0);
}

void KvDeskLiveBarTest::cameraWithoutExposure()
{
    FakeCamera *const camera = show();
    camera->range.reset();
    emit camera->signalExposureChanged();
    QVERIFY(!m_bar->exposure()->isVisible());
    QVERIFY(m_bar->frameRate()->isVisible());
    // Some tell it when they are connected.
    camera->range = ZtExposureRange{1.0, 50.0};
    emit camera->signalExposureChanged();
    QVERIFY(m_bar->exposure()->isVisible());
    QCOMPARE(m_bar->exposure()->field()->maximum(), 50.0);
}

void KvDeskLiveBarTest::frameRate()
{
    FakeCamera *const camera = show();
    QCOMPARE(m_bar->frameRate()->text(), QStringLiteral("0.0 fps"));
    QSignalSpy frames(camera, SIGNAL(signalFrameReady()));
    for (int i = 0; i < 5; ++i) {
        // The first of the two has no chance.
        camera->deliver(Qt::red);
        camera->deliver(Qt::green);
        QVERIFY(frames.wait());
        QTest::qWait(20);
    }
    QTRY_VERIFY(m_bar->frameRate()->text() != QStringLiteral("0.0 fps"));
    QVERIFY(m_bar->frameRate()->text().endsWith(QStringLiteral(" fps")));
    QCOMPARE(m_bar->frameRate()->toolTip(),
             QStringLiteral("Frames per second\nDropped, because newer ones came first: 5"));
    // No more frames: it goes down by itself.
    QTRY_COMPARE(m_bar->frameRate()->text(), QStringLiteral("0.0 fps"));
}

void KvDeskLiveBarTest::everythingHasAName()
{
    show();
    QCOMPARE(m_bar->freezeButton()->accessibleName(), QStringLiteral("Freeze"));
    QVERIFY(m_bar->runButton()->toolTip().startsWith(QStringLiteral("Stop the live image")));
    QCOMPARE(m_bar->runButton()->accessibleName(), m_bar->runButton()->toolTip());
    QCOMPARE(m_bar->freezeButton()->toolTip(), QStringLiteral("Freeze the live image (F12)"));
    QVERIFY(!m_bar->exposure()->slider()->accessibleName().isEmpty());
    QVERIFY(!m_bar->exposure()->field()->accessibleName().isEmpty());
    QVERIFY2(m_bar->minimumSizeHint().width() < 600,
             qPrintable(QString::number(m_bar->minimumSizeHint().width())));
}

STATREPORT_TEST_MAIN(KvDeskLiveBarTest)
#include "KvDeskLiveBarTest.moc"
