// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "measuring/ZtFault.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtFrameSourceCatalogue.h"
#include "measuring/ZtFrameSourceScan.h"

#include <QDir>
#include <QImage>

#include <algorithm>

namespace {

bool hasKind(const QVector<ZtFrameSourceInfo> &sources, ZtFrameSourceInfo::Kind kind)
{
    return std::any_of(sources.begin(), sources.end(),
                       [kind](const ZtFrameSourceInfo &info) { return info.kind == kind; });
}

QString savedPicture(const QString &path)
{
    QImage image(3, 2, QImage::Format_RGB32);
    image.fill(Qt::red);
    if (!image.save(path))
        qCritical("cannot save %s", qPrintable(path));
    return path;
}

} // namespace

class ZtFrameSourceCatalogueTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void initTestCase();

    void absentKindsAreAbsent();
    void listsCameras();
    void scansWithoutWaiting();
    void scanMayDie();
    void opensPictures();
    void opensFolders();
    void opensVideos();
    void opensCameras();
    void faults_data();
    void faults();

private:
    bool m_hasFakeCamera = false;
};

void ZtFrameSourceCatalogueTest::initTestCase()
{
    m_hasFakeCamera = ZtFrameSourceCatalogue::enableFakeCamera();
}

void ZtFrameSourceCatalogueTest::absentKindsAreAbsent()
{
    QVERIFY(ZtFrameSourceCatalogue::isAvailable(ZtFrameSourceInfo::StillImage));
    QVERIFY(ZtFrameSourceCatalogue::isAvailable(ZtFrameSourceInfo::ImageFolder));
    QCOMPARE(ZtFrameSourceCatalogue::isAvailable(ZtFrameSourceInfo::GenicamCamera), m_hasFakeCamera);
    const QVector<ZtFrameSourceInfo> sources = ZtFrameSourceCatalogue::list();
    for (const ZtFrameSourceInfo &info : sources)
        QVERIFY(ZtFrameSourceCatalogue::isAvailable(info.kind));
    QCOMPARE(ZtFrameSourceCatalogue::videoSuffixes().isEmpty(),
             !ZtFrameSourceCatalogue::isAvailable(ZtFrameSourceInfo::VideoFile));
}

void ZtFrameSourceCatalogueTest::listsCameras()
{
    const QVector<ZtFrameSourceInfo> sources = ZtFrameSourceCatalogue::list();
    QVERIFY(!hasKind(sources, ZtFrameSourceInfo::StillImage));
    QCOMPARE(hasKind(sources, ZtFrameSourceInfo::GenicamCamera), m_hasFakeCamera);
}

void ZtFrameSourceCatalogueTest::scansWithoutWaiting()
{
    ZtFrameSourceScan scan;
    QSignalSpy finished(&scan, SIGNAL(signalFinished()));
    for (int round = 0; round < 2; ++round) {
        scan.start();
        scan.start();
        QVERIFY(scan.isRunning());
        QVERIFY(finished.wait(30000));
        QVERIFY(!scan.isRunning());
        QCOMPARE(finished.count(), round + 1);
        QCOMPARE(hasKind(scan.sources(), ZtFrameSourceInfo::GenicamCamera), m_hasFakeCamera);
    }
}

void ZtFrameSourceCatalogueTest::scanMayDie()
{
    {
        ZtFrameSourceScan scan;
        scan.start();
    }
    QCoreApplication::processEvents();
}

void ZtFrameSourceCatalogueTest::opensPictures()
{
    ZtFault fault;
    const QString path = savedPicture(temporaryPath(QStringLiteral("picture.png")));
    QCOMPARE(ZtFrameSourceCatalogue::infoOfPath(path).kind, ZtFrameSourceInfo::StillImage);
    QCOMPARE(ZtFrameSourceCatalogue::infoOfPath(path).title, QStringLiteral("picture.png"));
    const auto source = ZtFrameSourceCatalogue::openPath(path, &fault);
    QVERIFY2(source, qPrintable(fault.text()));
    QVERIFY(!source->isLive());
    QCOMPARE(source->frame().size(), QSize(3, 2));
}

void ZtFrameSourceCatalogueTest::opensFolders()
{
    ZtFault fault;
    const QString path = temporaryPath(QStringLiteral("folder.avi")); // a name proves nothing
    QDir().mkpath(path);
    savedPicture(path + QStringLiteral("/1.png"));
    QCOMPARE(ZtFrameSourceCatalogue::infoOfPath(path).kind, ZtFrameSourceInfo::ImageFolder);
    const auto source = ZtFrameSourceCatalogue::openPath(path, &fault);
    QVERIFY2(source, qPrintable(fault.text()));
    QVERIFY(source->isLive());
    QCOMPARE(source->state(), ZtFrameSource::Stopped);
}

void ZtFrameSourceCatalogueTest::opensVideos()
{
    if (!ZtFrameSourceCatalogue::isAvailable(ZtFrameSourceInfo::VideoFile))
        QSKIP("built without Qt Multimedia");
    QFile file(temporaryPath(QStringLiteral("film.MP4")));
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write("something");
    file.close();
    QCOMPARE(ZtFrameSourceCatalogue::infoOfPath(file.fileName()).kind, ZtFrameSourceInfo::VideoFile);
    ZtFault fault;
    const auto source = ZtFrameSourceCatalogue::openPath(file.fileName(), &fault);
    QVERIFY2(source, qPrintable(fault.text()));
    QVERIFY(source->isLive());
}

void ZtFrameSourceCatalogueTest::opensCameras()
{
    const QVector<ZtFrameSourceInfo> sources = ZtFrameSourceCatalogue::list();
    for (const ZtFrameSourceInfo &info : sources) {
        ZtFault fault;
        const auto source = ZtFrameSourceCatalogue::open(info, &fault);
        QVERIFY2(source, qPrintable(fault.text()));
        QCOMPARE(source->displayName(), info.title);
    }
    QCOMPARE(sources.isEmpty(), !m_hasFakeCamera && !hasKind(sources, ZtFrameSourceInfo::UvcCamera));
}

void ZtFrameSourceCatalogueTest::faults_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<QString>("message");
    QTest::newRow("picture") << int(ZtFrameSourceInfo::StillImage) << "The picture does not exist";
    QTest::newRow("folder") << int(ZtFrameSourceInfo::ImageFolder) << "The folder does not exist";
    const bool hasVideo = ZtFrameSourceCatalogue::isAvailable(ZtFrameSourceInfo::VideoFile);
    QTest::newRow("video") << int(ZtFrameSourceInfo::VideoFile)
                           << (hasVideo ? "The video does not exist" : "This program cannot play videos");
    if (!hasVideo)
        QTest::newRow("UVC") << int(ZtFrameSourceInfo::UvcCamera)
                             << "This program knows no cameras of this kind";
    if (!ZtFrameSourceCatalogue::isAvailable(ZtFrameSourceInfo::GenicamCamera))
        QTest::newRow("GenICam") << int(ZtFrameSourceInfo::GenicamCamera)
                                 << "This program knows no cameras of this kind";
}

void ZtFrameSourceCatalogueTest::faults()
{
    QFETCH(int, kind);
    QFETCH(QString, message);
    ZtFault fault;
    QVERIFY(
        !ZtFrameSourceCatalogue::open({static_cast<ZtFrameSourceInfo::Kind>(kind),
                                       temporaryPath(QStringLiteral("missing")), QStringLiteral("Missing")},
                                      &fault));
    QCOMPARE(fault.message, message);
    QVERIFY(!fault.file.isEmpty());
}

STATREPORT_TEST_MAIN(ZtFrameSourceCatalogueTest)
#include "ZtFrameSourceCatalogueTest.moc"
