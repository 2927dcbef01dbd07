// SPDX-License-Identifier: MIT
#include "KvDeskSession.h"

#include "DeskFiles.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtLoadedSession.h"
#include "measuring/ZtMeasuringDocument.h"

namespace {

const QPolygonF diagonal = polygon({QPointF(0, 0), QPointF(10, 10)});

QString calibratedImage()
{
    QImage image(10, 10, QImage::Format_RGB32);
    image.fill(Qt::gray);
    image.setDotsPerMeterX(100000); // 10 micrometres per pixel
    image.setDotsPerMeterY(100000);
    const QString path = StatReportTest::temporaryPath(QStringLiteral("calibrated.png"));
    image.save(path);
    return path;
}

} // namespace

class KvDeskSessionTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void startsEmpty();
    void opens();
    void failedOpeningChangesNothing();
    void savesAndReadsBack();
    void failedSavingChangesNothing();
    void everyObjectChangeModifies();
    void imageAloneIsNothingToLose();
    void imageBelowObjectsModifies();
    void takesPixelSizeOverOnlyAtFirst();
    void importing();
    void failedImportChangesNothing();
    void clears();
    void opensWithoutItsImage();
    void noticesOtherProgramsWriting();
    void changesWhileSavingStayUnsaved();
    void everyChangeIsAnnounced();
    void restoredSessionIsUnsaved();

private:
    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskSession> m_session;
    ZtFault m_fault;
};

void KvDeskSessionTest::init()
{
    StatReportTest::init();
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_session = std::make_unique<KvDeskSession>(m_document.get());
    m_fault = ZtFault();
}

void KvDeskSessionTest::cleanup()
{
    m_session.reset();
    m_document.reset();
    StatReportTest::cleanup();
}

void KvDeskSessionTest::startsEmpty()
{
    QCOMPARE(m_session->path(), QString());
    QCOMPARE(m_session->displayName(), QStringLiteral("Untitled session"));
    QVERIFY(!m_session->isModified());
    QCOMPARE(m_session->objectCount(), 0);
}

void KvDeskSessionTest::opens()
{
    m_document->addObject(ZtDrawnType::Line, diagonal);
    QVERIFY(m_session->isModified());
    QSignalSpy spy(m_session.get(), SIGNAL(signalStateChanged()));
    QVERIFY2(m_session->open(DeskFiles::demoSession(), false, &m_fault), qPrintable(m_fault.text()));
    QCOMPARE(m_session->path(), DeskFiles::demoSession());
    QCOMPARE(m_session->displayName(), QStringLiteral("demo.json"));
    QVERIFY(!m_session->isModified());
    QCOMPARE(m_session->objectCount(), 33);
    QCOMPARE(spy.count(), 1);
}

void KvDeskSessionTest::failedOpeningChangesNothing()
{
    m_document->addObject(ZtDrawnType::Line, diagonal);
    QVERIFY(!m_session->open(QStringLiteral("/none.json"), false, &m_fault));
    QCOMPARE(m_fault.file, QStringLiteral("/none.json"));
    QCOMPARE(m_session->path(), QString());
    QVERIFY(m_session->isModified());
    QCOMPARE(m_session->objectCount(), 1);
}

void KvDeskSessionTest::savesAndReadsBack()
{
    m_document->addObject(ZtDrawnType::Line, diagonal);
    const QString path = temporaryPath(QStringLiteral("saved.json"));
    QVERIFY(m_session->save(path, &m_fault));
    QVERIFY(!m_session->isModified());
    QCOMPARE(m_session->path(), path);
    m_session->clear();
    QVERIFY(m_session->open(path, false, &m_fault));
    QCOMPARE(m_session->objectCount(), 1);
}

void KvDeskSessionTest::failedSavingChangesNothing()
{
    m_document->addObject(ZtDrawnType::Line, diagonal);
    QVERIFY(!m_session->save(temporaryPath(QStringLiteral("no folder/a.json")), &m_fault));
    QVERIFY(!m_fault.isNull());
    QVERIFY(m_session->isModified());
    QCOMPARE(m_session->path(), QString());
}

void KvDeskSessionTest::everyObjectChangeModifies()
{
    const QString path = temporaryPath(QStringLiteral("changes.json"));
    const auto isModifiedAgain = [this, &path]() {
        const bool isModified = m_session->isModified();
        m_session->save(path, &m_fault);
        return isModified;
    };
    const int id = m_document->addObject(ZtDrawnType::Line, diagonal);
    QVERIFY(isModifiedAgain());
    ZtKernelData::getInstance()->notifyObjectChanged(ZtDrawnType::Line, id);
    QVERIFY(isModifiedAgain());
    m_document->setCalibration(ZtCalibration(2.0));
    QVERIFY(isModifiedAgain());
    ZtKernelData::getInstance()->removeObject(ZtDrawnType::Line, id);
    QVERIFY(isModifiedAgain());
    QVERIFY(!isModifiedAgain());
}

void KvDeskSessionTest::imageAloneIsNothingToLose()
{
    QVERIFY(m_session->openImage(DeskFiles::image(QStringLiteral("alone.png")), &m_fault));
    QVERIFY(!m_session->isModified());
    QVERIFY(m_session->openImage(calibratedImage(), &m_fault));
    QVERIFY(!m_session->isModified());
}

void KvDeskSessionTest::imageBelowObjectsModifies()
{
    QVERIFY(m_session->open(DeskFiles::demoSession(), false, &m_fault));
    QVERIFY(m_session->openImage(DeskFiles::image(QStringLiteral("other.png")), &m_fault));
    QVERIFY(m_session->isModified());
    QCOMPARE(m_session->objectCount(), 33);
}

void KvDeskSessionTest::takesPixelSizeOverOnlyAtFirst()
{
    QVERIFY(m_session->openImage(calibratedImage(), &m_fault));
    QCOMPARE(m_document->calibration().micrometresPerPixel(), 10.0);
    m_document->setCalibration(ZtCalibration(3.0));
    QVERIFY(m_session->openImage(calibratedImage(), &m_fault));
    QCOMPARE(m_document->calibration().micrometresPerPixel(), 3.0);
    m_session->clear();
    m_document->addObject(ZtDrawnType::Line, diagonal);
    QVERIFY(m_session->openImage(calibratedImage(), &m_fault));
    QVERIFY(!m_document->calibration().isCalibrated());
}

void KvDeskSessionTest::importing()
{
    QStringList notes;
    QVERIFY2(m_session->importTable(DeskFiles::table(), &m_fault, &notes), qPrintable(m_fault.text()));
    QCOMPARE(m_session->objectCount(), 2);
    QVERIFY(m_session->isModified());
}

void KvDeskSessionTest::failedImportChangesNothing()
{
    QStringList notes;
    const QString path = DeskFiles::text(QStringLiteral("broken.csv"), "Object,Length\nBolt,\xff\xfe\n");
    QVERIFY(!m_session->importTable(path, &m_fault, &notes));
    QCOMPARE(m_fault.file, path);
    QVERIFY(!m_session->isModified());
    QCOMPARE(m_session->objectCount(), 0);
}

void KvDeskSessionTest::clears()
{
    QVERIFY(m_session->open(DeskFiles::demoSession(), false, &m_fault));
    m_session->clear();
    QCOMPARE(m_session->path(), QString());
    QCOMPARE(m_session->objectCount(), 0);
    QVERIFY(!m_session->isModified());
    QVERIFY(!m_document->frameSource());
}

void KvDeskSessionTest::opensWithoutItsImage()
{
    const QString path = DeskFiles::text(
        QStringLiteral("imageless.json"),
        "{\"format\": \"statreport-session\", \"version\": 1, \"image\": \"gone.png\", \"objects\": []}");
    QVERIFY(!m_session->open(path, false, &m_fault));
    QCOMPARE(m_fault.place, QStringLiteral("image"));
    QVERIFY(m_session->open(path, true, &m_fault));
    QCOMPARE(m_session->path(), path);
    QCOMPARE(m_document->imagePath(), temporaryPath(QStringLiteral("gone.png")));
}

void KvDeskSessionTest::noticesOtherProgramsWriting()
{
    QVERIFY(!m_session->isChangedOnDisk());
    const QString path = temporaryPath(QStringLiteral("watched.json"));
    QVERIFY(m_session->save(path, &m_fault));
    QVERIFY(!m_session->isChangedOnDisk());
    const QByteArray bytes = DeskFiles::bytes(path);
    DeskFiles::text(QStringLiteral("watched.json"), bytes + '\n');
    QVERIFY(m_session->isChangedOnDisk());
    QVERIFY(m_session->open(path, false, &m_fault));
    QVERIFY(!m_session->isChangedOnDisk());
    // Nothing would be lost by writing it again.
    QVERIFY(QFile::remove(path));
    QVERIFY(!m_session->isChangedOnDisk());
    m_session->clear();
    QVERIFY(!m_session->isChangedOnDisk());
}

void KvDeskSessionTest::changesWhileSavingStayUnsaved()
{
    m_document->addObject(ZtDrawnType::Line, diagonal);
    const QString path = temporaryPath(QStringLiteral("meanwhile.json"));
    const quint64 written = m_session->changeCount();
    m_document->addObject(ZtDrawnType::Line, diagonal);
    m_session->setSaved(path, written);
    QCOMPARE(m_session->path(), path);
    QVERIFY(m_session->isModified());
    m_session->setSaved(path, m_session->changeCount());
    QVERIFY(!m_session->isModified());
}

void KvDeskSessionTest::everyChangeIsAnnounced()
{
    QSignalSpy spy(m_session.get(), SIGNAL(signalChanged()));
    m_document->addObject(ZtDrawnType::Line, diagonal);
    m_document->addObject(ZtDrawnType::Line, diagonal);
    QCOMPARE(spy.count(), 2);
    QCOMPARE(m_session->changeCount(), quint64(2));
    QVERIFY(m_session->open(DeskFiles::demoSession(), false, &m_fault));
    QCOMPARE(spy.count(), 2);
}

void KvDeskSessionTest::restoredSessionIsUnsaved()
{
    ZtLoadedSession loaded;
    QVERIFY(loaded.read(DeskFiles::demoSession(), &m_fault));
    QSignalSpy replaced(m_session.get(), SIGNAL(signalReplaced()));
    m_session->restore(&loaded, QStringLiteral("/x/original.json"), KvDeskFileStamp());
    QCOMPARE(m_session->path(), QStringLiteral("/x/original.json"));
    QVERIFY(m_session->isModified());
    QCOMPARE(m_session->objectCount(), 33);
    QVERIFY(m_document->frameSource());
    QCOMPARE(replaced.count(), 1);
}

STATREPORT_TEST_MAIN(KvDeskSessionTest)
#include "KvDeskSessionTest.moc"
