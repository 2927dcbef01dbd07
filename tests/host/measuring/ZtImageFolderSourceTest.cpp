// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"
#include "support/UnprivilegedUser.h"

#include "measuring/ZtFault.h"
#include "measuring/ZtImageFolderSource.h"

#include <QDir>
#include <QFile>
#include <QImage>

namespace {

/// A folder of the test's own.
class Folder
{
public:
    Folder() { QVERIFY(m_dir.isValid()); }

    QString path() const { return m_dir.path(); }
    QString file(const QString &name) const { return m_dir.filePath(name); }

    void addPicture(const QString &name, const QColor &color) const
    {
        QImage image(4, 3, QImage::Format_RGB32);
        image.fill(color);
        QVERIFY(image.save(file(name)));
    }

    void addBroken(const QString &name) const
    {
        QFile broken(file(name));
        QVERIFY(broken.open(QIODevice::WriteOnly));
        broken.write("no picture");
    }

private:
    QTemporaryDir m_dir;
};

/// Notes the colours of the frames.
class Watcher : public QObject
{
    Q_OBJECT
public:
    explicit Watcher(const ZtFrameSource *source)
        : m_source(source)
    {
        connect(source, SIGNAL(signalFrameReady()), this, SLOT(slotFrameReady()));
    }

    QStringList colors;

private slots:
    void slotFrameReady() { colors.append(m_source->frame().pixelColor(0, 0).name()); }

private:
    const ZtFrameSource *m_source;
};

std::unique_ptr<ZtImageFolderSource> opened(const Folder &folder, double framesPerSecond)
{
    ZtFault fault;
    auto source = ZtImageFolderSource::load(folder.path(), &fault, framesPerSecond);
    if (!source)
        qCritical("%s", qPrintable(fault.text()));
    return source;
}

} // namespace

class ZtImageFolderSourceTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void sortsNaturally();
    void playsOverAndOver();
    void keepsTheSpeed();
    void framesNeedNoConversion();
    void skipsBrokenFiles();
    void isLostWithoutAnyPicture();
    void takesNewFiles();
    void startsAgain();
    void refuses_data();
    void refuses();
    void refusesUnreadableFolders();
    void stopsAtOnce();
};

void ZtImageFolderSourceTest::sortsNaturally()
{
    const Folder folder;
    for (const char *name :
         {"picture 10.png", "Picture 2.png", "picture 1.png", "a.tif", "notes.txt", "b.JPG"})
        folder.addBroken(QString::fromLatin1(name));
    QDir(folder.path()).mkdir(QStringLiteral("folder.png"));
    QCOMPARE(ZtImageFolderSource::pictureNames(folder.path()),
             QStringList({QStringLiteral("a.tif"), QStringLiteral("b.JPG"), QStringLiteral("picture 1.png"),
                          QStringLiteral("Picture 2.png"), QStringLiteral("picture 10.png")}));
}

void ZtImageFolderSourceTest::playsOverAndOver()
{
    const Folder folder;
    folder.addPicture(QStringLiteral("2.png"), Qt::green);
    folder.addPicture(QStringLiteral("10.png"), Qt::blue);
    folder.addPicture(QStringLiteral("1.png"), Qt::red);
    const auto source = opened(folder, 20.0);
    QVERIFY(source);
    QCOMPARE(source->state(), ZtFrameSource::Stopped);
    QCOMPARE(source->displayName(), QFileInfo(folder.path()).fileName());
    QCOMPARE(source->path(), folder.path());
    const Watcher watcher(source.get());
    source->start();
    QTRY_VERIFY(watcher.colors.size() >= 5);
    // A busy computer may drop one, but the order stays.
    const QStringList order{QStringLiteral("#ff0000"), QStringLiteral("#00ff00"), QStringLiteral("#0000ff")};
    if (source->droppedFrames() == 0)
        QCOMPARE(watcher.colors.mid(0, 5), order + order.mid(0, 2));
    QCOMPARE(QSet<QString>(watcher.colors.begin(), watcher.colors.end()),
             QSet<QString>(order.begin(), order.end()));
}

void ZtImageFolderSourceTest::keepsTheSpeed()
{
    const Folder folder;
    folder.addPicture(QStringLiteral("1.png"), Qt::red);
    QCOMPARE(opened(folder, 25.0)->framesPerSecond(), ZtImageFolderSource::defaultFramesPerSecond);
    const auto source = opened(folder, 20.0);
    QSignalSpy frames(source.get(), SIGNAL(signalFrameReady()));
    QElapsedTimer clock;
    clock.start();
    source->start();
    while (frames.count() < 11)
        QVERIFY(frames.wait());
    // Ten distances of 50 ms: never sooner, whatever else the computer does.
    QVERIFY2(clock.elapsed() >= 490, qPrintable(QString::number(clock.elapsed())));
    QVERIFY(source->frameRate() > 0.0);
    QVERIFY(source->frameRate() < 30.0);
}

void ZtImageFolderSourceTest::framesNeedNoConversion()
{
    const Folder folder;
    QImage grey(5, 4, QImage::Format_Grayscale8);
    grey.fill(0x55);
    QVERIFY(grey.save(folder.file(QStringLiteral("grey.png"))));
    const auto source = opened(folder, 50.0);
    source->start();
    QTRY_VERIFY(!source->frame().isNull());
    QCOMPARE(source->frame().format(), QImage::Format_RGB32);
    QCOMPARE(source->frame().pixelColor(0, 0), QColor(0x55, 0x55, 0x55));
}

void ZtImageFolderSourceTest::skipsBrokenFiles()
{
    const Folder folder;
    folder.addPicture(QStringLiteral("1.png"), Qt::red);
    folder.addBroken(QStringLiteral("2.png"));
    folder.addBroken(QStringLiteral("3.tif"));
    const auto source = opened(folder, 100.0);
    const QSignalSpy faults(source.get(), SIGNAL(signalFault(QString)));
    const Watcher watcher(source.get());
    source->start();
    QTRY_VERIFY(watcher.colors.size() >= 5);
    // Said once, not in every round.
    QCOMPARE(faults.count(), 2);
    QVERIFY(faults.at(0).at(0).toString().startsWith(folder.file(QStringLiteral("2.png"))));
    QVERIFY(faults.at(0).at(0).toString().contains(QLatin1String("The picture cannot be decoded")));
    QCOMPARE(source->state(), ZtFrameSource::Running);
}

void ZtImageFolderSourceTest::isLostWithoutAnyPicture()
{
    const Folder folder;
    folder.addBroken(QStringLiteral("1.png"));
    const auto source = opened(folder, 100.0);
    const QSignalSpy faults(source.get(), SIGNAL(signalFault(QString)));
    source->start();
    QTRY_COMPARE(source->state(), ZtFrameSource::Lost);
    QCOMPARE(faults.count(), 2);
    QCOMPARE(faults.at(1).at(0).toString(),
             folder.path() + QStringLiteral(": no picture of the folder can be shown"));
}

void ZtImageFolderSourceTest::takesNewFiles()
{
    const Folder folder;
    folder.addPicture(QStringLiteral("1.png"), Qt::red);
    const auto source = opened(folder, 100.0);
    const Watcher watcher(source.get());
    source->start();
    QTRY_VERIFY(!watcher.colors.isEmpty());
    folder.addPicture(QStringLiteral("2.png"), Qt::blue);
    QTRY_VERIFY(watcher.colors.contains(QStringLiteral("#0000ff")));
}

void ZtImageFolderSourceTest::startsAgain()
{
    const Folder folder;
    folder.addPicture(QStringLiteral("1.png"), Qt::red);
    const auto source = opened(folder, 100.0);
    QSignalSpy frames(source.get(), SIGNAL(signalFrameReady()));
    for (int run = 0; run < 3; ++run) {
        source->start();
        QVERIFY(frames.wait());
        source->stop();
        frames.clear();
    }
    QCoreApplication::processEvents();
    QCOMPARE(frames.count(), 0);
}

void ZtImageFolderSourceTest::refuses_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("message");
    QDir().mkpath(temporaryPath(QStringLiteral("empty")));
    QFile file(temporaryPath(QStringLiteral("file.png")));
    QVERIFY(file.open(QIODevice::WriteOnly));
    QTest::newRow("missing") << temporaryPath(QStringLiteral("missing")) << "The folder does not exist";
    QTest::newRow("no path") << QString() << "The folder does not exist";
    QTest::newRow("file") << file.fileName() << "The folder does not exist";
    QTest::newRow("empty") << temporaryPath(QStringLiteral("empty")) << "The folder holds no pictures";
}

void ZtImageFolderSourceTest::refuses()
{
    QFETCH(QString, path);
    QFETCH(QString, message);
    ZtFault fault;
    QVERIFY(!ZtImageFolderSource::load(path, &fault));
    QCOMPARE(fault.message, message);
    QCOMPARE(fault.file, path);
}

void ZtImageFolderSourceTest::refusesUnreadableFolders()
{
    const QString path = temporaryPath(QStringLiteral("closed"));
    QDir().mkpath(path);
    QFile::setPermissions(path, QFileDevice::Permissions());
    {
        const UnprivilegedUser user;
        QVERIFY(user.isUnprivileged());
        ZtFault fault;
        QVERIFY(!ZtImageFolderSource::load(path, &fault));
        QCOMPARE(fault.message, QStringLiteral("The folder cannot be read"));
    }
    QFile::setPermissions(path, QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner);
}

void ZtImageFolderSourceTest::stopsAtOnce()
{
    const Folder folder;
    folder.addPicture(QStringLiteral("1.png"), Qt::red);
    auto source = opened(folder, 0.01);
    QSignalSpy frames(source.get(), SIGNAL(signalFrameReady()));
    source->start();
    QVERIFY(frames.wait());
    // The next frame is due in a hundred seconds.
    QElapsedTimer clock;
    clock.start();
    source->stop();
    source.reset();
    QVERIFY(clock.elapsed() < 5000);
}

STATREPORT_TEST_MAIN(ZtImageFolderSourceTest)
#include "ZtImageFolderSourceTest.moc"
