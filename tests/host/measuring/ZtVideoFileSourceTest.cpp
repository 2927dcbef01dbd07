// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "host/measuring/MjpegAvi.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtVideoFileSource.h"

#include <QFile>

namespace {

QString write(const QString &name, const QByteArray &bytes)
{
    QFile file(StatReportTest::temporaryPath(name));
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        qCritical("cannot write %s", qPrintable(file.fileName()));
    return file.fileName();
}

/// Five frames of one colour each, in half a second.
QByteArray shortFilm()
{
    QVector<QImage> frames;
    for (const QColor &color :
         {QColor(Qt::red), QColor(Qt::green), QColor(Qt::blue), QColor(Qt::white), QColor(Qt::black)}) {
        frames.append(QImage(64, 48, QImage::Format_RGB32));
        frames.last().fill(color);
    }
    return MjpegAvi::bytes(frames, 10);
}

QString nearestName(const QColor &color)
{
    const auto digit = [](int value) { return value > 127 ? QLatin1Char('1') : QLatin1Char('0'); };
    return QString(digit(color.red())) + digit(color.green()) + digit(color.blue());
}

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
    void slotFrameReady() { colors.append(nearestName(m_source->frame().pixelColor(32, 24))); }

private:
    const ZtFrameSource *m_source;
};

} // namespace

class ZtVideoFileSourceTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void plays();
    void playsOverAndOver();
    void stopsAndStartsAgain();
    void refuses_data();
    void refuses();
    void isLostWhenItIsNoVideo();
    void framesOutliveTheSource();
};

void ZtVideoFileSourceTest::plays()
{
    ZtFault fault;
    const auto source = ZtVideoFileSource::load(write(QStringLiteral("film.avi"), shortFilm()), &fault);
    QVERIFY2(source, qPrintable(fault.text()));
    QCOMPARE(source->displayName(), QStringLiteral("film.avi"));
    QCOMPARE(source->state(), ZtFrameSource::Stopped);
    QVERIFY(source->isLive());
    const QSignalSpy faults(source.get(), SIGNAL(signalFault(QString)));
    const Watcher watcher(source.get());
    source->start();
    QTRY_VERIFY2_WITH_TIMEOUT(watcher.colors.size() >= 3,
                              faults.isEmpty() ? "" : qPrintable(faults.at(0).at(0).toString()), 20000);
    QCOMPARE(source->frame().size(), QSize(64, 48));
    QCOMPARE(source->frame().format(), QImage::Format_RGB32);
    QCOMPARE(faults.count(), 0);
    QVERIFY(source->frameRate() > 1.0);
}

void ZtVideoFileSourceTest::playsOverAndOver()
{
    ZtFault fault;
    const auto source = ZtVideoFileSource::load(write(QStringLiteral("loop.avi"), shortFilm()), &fault);
    const Watcher watcher(source.get());
    source->start();
    // Red, the first, comes again after black, the last.
    const auto cameAgain = [&watcher] {
        const int last = watcher.colors.indexOf(QStringLiteral("000"));
        return last >= 0 && watcher.colors.indexOf(QStringLiteral("100"), last) >= 0;
    };
    QTRY_VERIFY2_WITH_TIMEOUT(cameAgain(), qPrintable(watcher.colors.join(QLatin1Char(' '))), 20000);
    QCOMPARE(source->state(), ZtFrameSource::Running);
}

void ZtVideoFileSourceTest::stopsAndStartsAgain()
{
    ZtFault fault;
    const auto source = ZtVideoFileSource::load(write(QStringLiteral("stop.avi"), shortFilm()), &fault);
    QSignalSpy frames(source.get(), SIGNAL(signalFrameReady()));
    for (int run = 0; run < 3; ++run) {
        source->start();
        QVERIFY(frames.wait(20000));
        source->stop();
        frames.clear();
        QVERIFY(!frames.wait(250));
        QVERIFY(!source->frame().isNull());
    }
}

void ZtVideoFileSourceTest::refuses_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("message");
    QTest::newRow("missing") << temporaryPath(QStringLiteral("missing.avi")) << "The video does not exist";
    QTest::newRow("folder") << QFileInfo(temporaryPath(QStringLiteral("x"))).path()
                            << "The video cannot be read";
    QTest::newRow("empty") << write(QStringLiteral("empty.avi"), QByteArray()) << "The video is empty";
}

void ZtVideoFileSourceTest::refuses()
{
    QFETCH(QString, path);
    QFETCH(QString, message);
    ZtFault fault;
    QVERIFY(!ZtVideoFileSource::load(path, &fault));
    QCOMPARE(fault.message, message);
    QCOMPARE(fault.file, path);
}

void ZtVideoFileSourceTest::isLostWhenItIsNoVideo()
{
    ZtFault fault;
    const auto source =
        ZtVideoFileSource::load(write(QStringLiteral("text.avi"), QByteArray(5000, 'x')), &fault);
    QVERIFY(source);
    QSignalSpy faults(source.get(), SIGNAL(signalFault(QString)));
    // Said by Qt's player beside its error.
    expectWarning(QRegularExpression(QStringLiteral("^Error: ")));
    source->start();
    QTRY_COMPARE_WITH_TIMEOUT(source->state(), ZtFrameSource::Lost, 20000);
    QCOMPARE(faults.count(), 1);
    QVERIFY2(faults.at(0).at(0).toString().startsWith(QLatin1String("The video text.avi cannot be played (")),
             qPrintable(faults.at(0).at(0).toString()));
}

void ZtVideoFileSourceTest::framesOutliveTheSource()
{
    ZtFault fault;
    auto source = ZtVideoFileSource::load(write(QStringLiteral("short.avi"), shortFilm()), &fault);
    QSignalSpy frames(source.get(), SIGNAL(signalFrameReady()));
    source->start();
    QVERIFY(frames.wait(20000));
    const QImage frame = source->frame();
    const QImage copy = frame.copy();
    source.reset();
    QCoreApplication::processEvents();
    QCOMPARE(frame, copy);
}

STATREPORT_TEST_MAIN(ZtVideoFileSourceTest)
#include "ZtVideoFileSourceTest.moc"
