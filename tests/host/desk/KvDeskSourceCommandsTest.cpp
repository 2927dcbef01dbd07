// SPDX-License-Identifier: MIT
#include "KvDeskSourceCommands.h"

#include "DeskLog.h"
#include "FileDialogAnswerer.h"
#include "GalleryFolder.h"
#include "SourceDesk.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtFrameSourceCatalogue.h"
#include "support/MessageBoxAnswerer.h"

class KvDeskSourceCommandsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void opensAFolder();
    void cancelledChangesNothing();
    void failureLeavesTheImage();
    void brokenVideo();
    void stillImage();
    void onlyAnImageIsNoChange();
    void measuredObjectsStay();
    void sameSourceIsNotOpenedTwice();

private:
    ZtFrameSource *source() const { return m_desk->source(); }

    std::unique_ptr<SourceDesk> m_desk;
};

void KvDeskSourceCommandsTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtStatusLog::getInstance()->clear();
    m_desk = std::make_unique<SourceDesk>();
}

void KvDeskSourceCommandsTest::cleanup()
{
    m_desk.reset();
    StatReportTest::cleanup();
}

void KvDeskSourceCommandsTest::opensAFolder()
{
    const GalleryFolder folder;
    folder.add(QStringLiteral("a.png"));
    QVERIFY(!m_desk->commands.current());
    const FileDialogAnswerer answerer(folder.path);
    m_desk->commands.slotOpenFolder();
    QCOMPARE(answerer.dialogs().size(), 1);
    QCOMPARE(answerer.dialogs().first().title, QStringLiteral("Open image folder"));
    QVERIFY(source());
    QVERIFY(source()->isLive());
    QCOMPARE(source()->state(), ZtFrameSource::Running);
    QTRY_VERIFY(!source()->frame().isNull());
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information),
             QStringList(QStringLiteral("Image source: %1").arg(QFileInfo(folder.path).fileName())));
    QVERIFY(m_desk->commands.current());
    QCOMPARE(m_desk->commands.current()->kind, ZtFrameSourceInfo::ImageFolder);
    m_desk->document.setFrameSource(nullptr);
    QVERIFY(!m_desk->commands.current());
}

void KvDeskSourceCommandsTest::cancelledChangesNothing()
{
    const FileDialogAnswerer answerer{QString()};
    m_desk->commands.slotOpenFolder();
    m_desk->commands.slotOpenVideo();
    m_desk->commands.slotOpenImage();
    QCOMPARE(answerer.dialogs().size(), 3);
    QCOMPARE(answerer.dialogs().at(1).title, QStringLiteral("Open video"));
    QVERIFY(!source());
}

void KvDeskSourceCommandsTest::failureLeavesTheImage()
{
    QVERIFY(m_desk->files.openImage(DeskFiles::image(QStringLiteral("still.png"))));
    const ZtFrameSource *const before = source();
    const GalleryFolder empty;
    const MessageBoxAnswerer boxes;
    QVERIFY(!m_desk->commands.open(ZtFrameSourceCatalogue::infoOfPath(empty.path)));
    QCOMPARE(boxes.boxes().size(), 1);
    const QString what =
        QStringLiteral("The image source \"%1\" was not opened.").arg(QFileInfo(empty.path).fileName());
    QCOMPARE(boxes.boxes().first().text, what);
    QCOMPARE(DeskLog::messages(ZtAppStatus::Error),
             QStringList(what + QStringLiteral(" %1: The folder holds no pictures").arg(empty.path)));
    QCOMPARE(source(), before);
    QVERIFY(!m_desk->commands.current());
}

void KvDeskSourceCommandsTest::brokenVideo()
{
    const FileDialogAnswerer answerer(DeskFiles::text(QStringLiteral("empty video.xyz"), ""));
    const MessageBoxAnswerer boxes;
    m_desk->commands.slotOpenVideo();
    QCOMPARE(boxes.boxes().size(), 1);
    QCOMPARE(boxes.boxes().first().text,
             QStringLiteral("The image source \"empty video.xyz\" was not opened."));
    QVERIFY(!source());
}

void KvDeskSourceCommandsTest::stillImage()
{
    const FileDialogAnswerer answerer(DeskFiles::image(QStringLiteral("still.png")));
    m_desk->commands.slotOpenImage();
    QVERIFY(source());
    QVERIFY(!source()->isLive());
    QVERIFY(!m_desk->commands.current());
}

void KvDeskSourceCommandsTest::onlyAnImageIsNoChange()
{
    const GalleryFolder folder;
    folder.add(QStringLiteral("a.png"));
    QVERIFY(m_desk->commands.open(ZtFrameSourceCatalogue::infoOfPath(folder.path)));
    QVERIFY(!m_desk->session.isModified());
}

void KvDeskSourceCommandsTest::measuredObjectsStay()
{
    const GalleryFolder folder;
    folder.add(QStringLiteral("a.png"));
    m_desk->document.addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(9, 9)}));
    m_desk->document.setCalibration(ZtCalibration(2.0));
    m_desk->session.setUnmodified();
    QVERIFY(m_desk->commands.open(ZtFrameSourceCatalogue::infoOfPath(folder.path)));
    QCOMPARE(m_desk->session.objectCount(), 1);
    QCOMPARE(m_desk->document.calibration().micrometresPerPixel(), 2.0);
    QVERIFY(m_desk->session.isModified());
}

void KvDeskSourceCommandsTest::sameSourceIsNotOpenedTwice()
{
    const GalleryFolder folder;
    folder.add(QStringLiteral("a.png"));
    const ZtFrameSourceInfo info = ZtFrameSourceCatalogue::infoOfPath(folder.path);
    QVERIFY(m_desk->commands.open(info));
    const ZtFrameSource *const first = source();
    source()->stop();
    QVERIFY(m_desk->commands.open(info));
    QCOMPARE(source(), first);
    QCOMPARE(source()->state(), ZtFrameSource::Running);
}

STATREPORT_TEST_MAIN(KvDeskSourceCommandsTest)
#include "KvDeskSourceCommandsTest.moc"
