// SPDX-License-Identifier: MIT
#include "KvDeskSnapshots.h"

#include "DeskLog.h"
#include "FakeCamera.h"
#include "GalleryFolder.h"
#include "KvDeskActions.h"
#include "KvDeskGallerySettings.h"
#include "KvDeskResources.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtKernelImage.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtStillImageSource.h"

#include <QAction>

class KvDeskSnapshotsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void needsAnImage();
    void savesTheImage();
    void statesThePixelSize();
    void measurementsAreDrawnWhenWanted();
    void choiceIsRemembered();
    void frozenFrameIsTaken();
    void severalAtOnce();
    void tooManyAtOnce();
    void waitingOnesAreSavedAtTheEnd();
    void failureIsLogged();

private:
    QAction *take() const { return m_actions->action(KvDeskActions::TakeSnapshot); }
    void open(const QSize &size = QSize(400, 300));
    QString savedPath();

    std::unique_ptr<GalleryFolder> m_folder;
    std::unique_ptr<KvDeskActions> m_actions;
    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskSnapshots> m_snapshots;
};

void KvDeskSnapshotsTest::init()
{
    StatReportTest::init();
    KvDeskResources::ensure();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtStatusLog::getInstance()->clear();
    m_folder = std::make_unique<GalleryFolder>();
    KvDeskGallerySettings::setSnapshotsFolder(m_folder->path);
    m_actions = std::make_unique<KvDeskActions>();
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_snapshots = std::make_unique<KvDeskSnapshots>(m_actions.get(), m_document.get());
}

void KvDeskSnapshotsTest::cleanup()
{
    m_snapshots.reset();
    m_document.reset();
    StatReportTest::cleanup();
}

void KvDeskSnapshotsTest::open(const QSize &size)
{
    ZtFault fault;
    QVERIFY(m_document->loadImage(DeskFiles::image(QStringLiteral("source.png"), size, Qt::white), &fault));
    m_snapshots->slotUpdate();
}

QString KvDeskSnapshotsTest::savedPath()
{
    QSignalSpy spy(m_snapshots.get(), SIGNAL(signalSaved(QString)));
    take()->trigger();
    return spy.wait(20000) ? spy.first().first().toString() : QString();
}

void KvDeskSnapshotsTest::needsAnImage()
{
    QVERIFY(!take()->isEnabled());
    QCOMPARE(take()->toolTip(), QStringLiteral("Save the image to the gallery (F9)\nOpen an image first"));
    QVERIFY(!take()->autoRepeat());
    m_snapshots->slotTake();
    QVERIFY(!m_snapshots->isSaving());
    open();
    QVERIFY(take()->isEnabled());
    m_document->clear();
    QVERIFY(!take()->isEnabled());
}

void KvDeskSnapshotsTest::savesTheImage()
{
    open();
    const QDateTime before = QDateTime::currentDateTime();
    const QString path = savedPath();
    QCOMPARE(QFileInfo(path).path(), m_folder->path);
    const QDateTime named =
        QDateTime::fromString(QFileInfo(path).completeBaseName(), QStringLiteral("yyyy-MM-dd HH-mm-ss"));
    QVERIFY2(named.isValid(), qPrintable(path));
    QVERIFY(qAbs(before.secsTo(named)) < 30);
    QCOMPARE(m_folder->names(), QStringList(QFileInfo(path).fileName()));
    const QImage saved(path);
    QCOMPARE(saved.size(), QSize(400, 300));
    QCOMPARE(saved.pixelColor(10, 10), QColor(Qt::white));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information),
             QStringList(QStringLiteral("Snapshot saved: %1").arg(QFileInfo(path).fileName())));
}

void KvDeskSnapshotsTest::statesThePixelSize()
{
    open();
    m_document->setCalibration(ZtCalibration(2.0, 2.5));
    ZtFault fault;
    const auto read = ZtStillImageSource::load(savedPath(), &fault);
    QVERIFY(read);
    QVERIFY(read->offeredCalibration().hasNearlySamePixelSize(ZtCalibration(2.0, 2.5)));
}

void KvDeskSnapshotsTest::measurementsAreDrawnWhenWanted()
{
    open();
    QVERIFY(m_document->addObject(ZtDrawnType::Line, polygon({QPointF(50, 150), QPointF(350, 150)})) > 0);
    const auto isDrawn = [](const QString &path) {
        const QImage image(path);
        for (int y = 140; y <= 160; ++y) {
            if (image.pixelColor(100, y) != QColor(Qt::white))
                return true;
        }
        return false;
    };
    QVERIFY(!isDrawn(savedPath()));
    m_actions->action(KvDeskActions::SnapshotMeasurements)->trigger();
    QVERIFY(isDrawn(savedPath()));
    // The image itself stays clean.
    QCOMPARE(m_document->kernelImage()->frame().pixelColor(100, 150), QColor(Qt::white));
}

void KvDeskSnapshotsTest::choiceIsRemembered()
{
    m_actions->action(KvDeskActions::SnapshotMeasurements)->trigger();
    QVERIFY(KvDeskGallerySettings::areMeasurementsBurntIn());
    m_actions = std::make_unique<KvDeskActions>();
    m_snapshots = std::make_unique<KvDeskSnapshots>(m_actions.get(), m_document.get());
    QVERIFY(m_actions->action(KvDeskActions::SnapshotMeasurements)->isChecked());
}

void KvDeskSnapshotsTest::frozenFrameIsTaken()
{
    auto camera = std::make_unique<FakeCamera>();
    FakeCamera *const shown = camera.get();
    m_document->setFrameSource(std::move(camera));
    shown->start();
    QSignalSpy frames(shown, SIGNAL(signalFrameReady()));
    shown->deliver(Qt::red);
    QVERIFY(frames.wait());
    m_document->kernelImage()->setFrozen(true);
    shown->deliver(Qt::blue);
    QVERIFY(frames.wait());
    m_snapshots->slotUpdate();
    QCOMPARE(QImage(savedPath()).pixelColor(0, 0), QColor(Qt::red));
}

void KvDeskSnapshotsTest::severalAtOnce()
{
    open();
    QSignalSpy spy(m_snapshots.get(), SIGNAL(signalSaved(QString)));
    for (int i = 0; i < 5; ++i)
        take()->trigger();
    QTRY_COMPARE_WITH_TIMEOUT(spy.count(), 5, 20000);
    QCOMPARE(m_folder->names().size(), 5);
    QTRY_VERIFY(!m_snapshots->isSaving());
}

void KvDeskSnapshotsTest::tooManyAtOnce()
{
    open();
    QSignalSpy spy(m_snapshots.get(), SIGNAL(signalSaved(QString)));
    for (int i = 0; i < KvDeskSnapshots::maximumWaiting + 3; ++i)
        take()->trigger();
    QCOMPARE(DeskLog::messages(ZtAppStatus::Error),
             QStringList({QStringLiteral("No snapshot was taken: earlier ones are still being saved"),
                          QStringLiteral("No snapshot was taken: earlier ones are still being saved")}));
    // One is being written, the others wait.
    QTRY_COMPARE_WITH_TIMEOUT(spy.count(), KvDeskSnapshots::maximumWaiting + 1, 40000);
}

void KvDeskSnapshotsTest::waitingOnesAreSavedAtTheEnd()
{
    open();
    for (int i = 0; i < 4; ++i)
        take()->trigger();
    m_snapshots.reset();
    QTRY_COMPARE_WITH_TIMEOUT(m_folder->names().filter(QStringLiteral(".png")).size(), 4, 20000);
}

void KvDeskSnapshotsTest::failureIsLogged()
{
    open();
    // A file where the folder should be.
    const QString file = m_folder->add(QStringLiteral("a.png"));
    KvDeskGallerySettings::setSnapshotsFolder(file);
    QSignalSpy logged(ZtStatusLog::getInstance(), SIGNAL(signalEntryLogged(ZtStatusEntry)));
    QSignalSpy saved(m_snapshots.get(), SIGNAL(signalSaved(QString)));
    take()->trigger();
    QVERIFY(logged.wait());
    QCOMPARE(saved.count(), 0);
    const ZtStatusEntry entry = ZtStatusLog::getInstance()->entries().last();
    QCOMPARE(entry.category, static_cast<int>(ZtAppStatus::Error));
    QCOMPARE(entry.destination, static_cast<int>(ZtAppStatus::StatusPanel));
    QVERIFY2(entry.message.startsWith(QStringLiteral("The snapshot was not saved. %1/").arg(file)),
             qPrintable(entry.message));
    QVERIFY(entry.message.endsWith(QStringLiteral("The folder cannot be created")));
}

STATREPORT_TEST_MAIN(KvDeskSnapshotsTest)
#include "KvDeskSnapshotsTest.moc"
