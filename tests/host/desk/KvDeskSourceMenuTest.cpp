// SPDX-License-Identifier: MIT
#include "KvDeskSourceMenu.h"

#include "FileDialogAnswerer.h"
#include "GalleryFolder.h"
#include "KvDeskResources.h"
#include "SourceDesk.h"
#include "common/ZtAppStatus.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtFrameSourceCatalogue.h"
#include "measuring/ZtFrameSourceScan.h"

class KvDeskSourceMenuTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void files();
    void looksForCamerasWhenOpened();
    void opensAFolder();
    void opensACamera();
    void canBeDeletedWhileLooking();

private:
    QStringList texts() const;
    void look();

    std::unique_ptr<SourceDesk> m_desk;
    std::unique_ptr<KvDeskSourceMenu> m_menu;
};

void KvDeskSourceMenuTest::init()
{
    StatReportTest::init();
    KvDeskResources::ensure();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtStatusLog::getInstance()->clear();
    m_desk = std::make_unique<SourceDesk>();
    m_menu = std::make_unique<KvDeskSourceMenu>(&m_desk->commands);
}

void KvDeskSourceMenuTest::cleanup()
{
    m_menu.reset();
    m_desk.reset();
    StatReportTest::cleanup();
}

QStringList KvDeskSourceMenuTest::texts() const
{
    QStringList texts;
    for (const QAction *const action : m_menu->actions())
        texts.append(action->text());
    return texts;
}

void KvDeskSourceMenuTest::look()
{
    QSignalSpy spy(m_menu->scan(), SIGNAL(signalFinished()));
    emit m_menu->aboutToShow();
    QVERIFY(spy.wait(20000));
}

void KvDeskSourceMenuTest::files()
{
    QCOMPARE(m_menu->title(), QStringLiteral("Image &source"));
    QStringList expected{QStringLiteral("Still &image..."), QStringLiteral("Image &folder...")};
    if (ZtFrameSourceCatalogue::isAvailable(ZtFrameSourceInfo::VideoFile))
        expected.append(QStringLiteral("&Video..."));
    QCOMPARE(texts().mid(0, expected.size()), expected);
    QVERIFY(m_menu->actions().at(expected.size())->isSeparator());
    // A missing icon is reported there.
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 0);
}

void KvDeskSourceMenuTest::looksForCamerasWhenOpened()
{
    QVERIFY(!m_menu->scan()->isRunning());
    emit m_menu->aboutToShow();
    QVERIFY(m_menu->scan()->isRunning());
    QCOMPARE(m_menu->cameraActions().last()->text(), QStringLiteral("Looking for cameras..."));
    QVERIFY(!m_menu->cameraActions().last()->isEnabled());
    QTRY_VERIFY_WITH_TIMEOUT(!m_menu->scan()->isRunning(), 20000);
    const int found = m_menu->scan()->sources().size();
    QCOMPARE(m_menu->cameraActions().size(), qMax(1, found));
    if (found == 0) {
        QCOMPARE(m_menu->cameraActions().first()->text(), QStringLiteral("No camera is connected"));
        QVERIFY(!m_menu->cameraActions().first()->isEnabled());
    }
}

void KvDeskSourceMenuTest::opensAFolder()
{
    const GalleryFolder folder;
    folder.add(QStringLiteral("a.png"));
    const FileDialogAnswerer answerer(folder.path);
    m_menu->actions().at(1)->trigger();
    QVERIFY(m_desk->source());
    QCOMPARE(m_desk->source()->displayName(), QFileInfo(folder.path).fileName());
}

void KvDeskSourceMenuTest::opensACamera()
{
    if (!ZtFrameSourceCatalogue::enableFakeCamera())
        QSKIP("This build has no camera that needs no hardware.");
    look();
    QVERIFY(!m_menu->scan()->sources().isEmpty());
    const QString title = m_menu->scan()->sources().last().title;
    QAction *const camera = m_menu->cameraActions().last();
    QCOMPARE(camera->text(), title);
    QVERIFY(!camera->isChecked());
    camera->trigger();
    QVERIFY(m_desk->source());
    QCOMPARE(m_desk->source()->displayName(), title);
    QTRY_VERIFY_WITH_TIMEOUT(!m_desk->source()->frame().isNull(), 30000);
    // The next time it is marked.
    look();
    QVERIFY(m_menu->cameraActions().last()->isChecked());
}

void KvDeskSourceMenuTest::canBeDeletedWhileLooking()
{
    emit m_menu->aboutToShow();
    QVERIFY(m_menu->scan()->isRunning());
    m_menu.reset();
    QCoreApplication::processEvents();
}

STATREPORT_TEST_MAIN(KvDeskSourceMenuTest)
#include "KvDeskSourceMenuTest.moc"
