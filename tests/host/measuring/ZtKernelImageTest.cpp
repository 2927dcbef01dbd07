// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "common/ZtAppStatus.h"
#include "host/measuring/FakeLiveSource.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtKernelImage.h"

#include <memory>

namespace {

class PlainSource : public ZtFrameSource
{
    Q_OBJECT
public:
    QImage frame() const override { return m_frame; }
    QString displayName() const override { return QStringLiteral("plain"); }
    void show(const QColor &color)
    {
        m_frame = QImage(7, 5, QImage::Format_RGB32);
        m_frame.fill(color);
        emit signalFrameReady();
    }

private:
    QImage m_frame;
};

class Receiver : public QObject
{
    Q_OBJECT
public:
    explicit Receiver(ZtKernelImage *image)
    {
        connect(image, SIGNAL(signalImageCompleted(FrameData, bool &)), this,
                              SLOT(slotCompleted(FrameData, bool &)), Qt::DirectConnection);
    }

    QVector<FrameData> frames;

private slots:
    void slotCompleted(FrameData frame, bool &handled)
    {
        frames.append(frame);
        handled = true;
    }
};

} // namespace

class ZtKernelImageTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void deliversAtOnce();
    void deliversEveryNewFrame();
    void deliversNothingWithoutAPicture();
    void givesEachReceiverItsOwnPicture();
    void forgetsADeletedSource();
    void copiesNoPixels();
    void freezes();
    void anotherSourceIsNotFrozen();
    void frozenFrameOutlivesItsSource();
    void lostSourceLeavesItsLastFrame();
    void faultsAreLogged();
    void returnIsLogged();
};

void ZtKernelImageTest::deliversAtOnce()
{
    PlainSource source;
    source.show(Qt::red);
    ZtKernelImage image;
    image.setSource(&source);
    QVERIFY(image.source() == &source);
    const Receiver receiver(&image);
    image.requestImage();
    QCOMPARE(receiver.frames.size(), 1);
    const FrameData &frame = receiver.frames.first();
    QCOMPARE(frame.scale, 1.0);
    QCOMPARE(frame.rect, QRect(0, 0, 7, 5));
    QCOMPARE(frame.image->getQImage(), source.frame());
}

void ZtKernelImageTest::deliversEveryNewFrame()
{
    PlainSource first;
    PlainSource second;
    ZtKernelImage image;
    const Receiver receiver(&image);
    image.setSource(&first);
    image.setSource(&first);
    first.show(Qt::red);
    QCOMPARE(receiver.frames.size(), 1);
    image.setSource(&second);
    first.show(Qt::green);
    QCOMPARE(receiver.frames.size(), 1);
    second.show(Qt::blue);
    QCOMPARE(receiver.frames.size(), 2);
    QCOMPARE(receiver.frames.last().image->getQImage().pixelColor(0, 0), QColor(Qt::blue));
}

void ZtKernelImageTest::deliversNothingWithoutAPicture()
{
    PlainSource source;
    ZtKernelImage image;
    const Receiver receiver(&image);
    image.requestImage();
    image.setSource(&source);
    image.requestImage();
    image.setSource(nullptr);
    image.requestImage();
    QCOMPARE(receiver.frames.size(), 0);
}

void ZtKernelImageTest::givesEachReceiverItsOwnPicture()
{
    PlainSource source;
    source.show(Qt::red);
    ZtKernelImage image;
    image.setSource(&source);
    const Receiver receiver(&image);
    image.requestImage();
    image.requestImage();
    QImage painted = receiver.frames.first().image->getQImage();
    painted.fill(Qt::black);
    receiver.frames.first().image->setQImage(painted);
    QCOMPARE(receiver.frames.last().image->getQImage().pixelColor(0, 0), QColor(Qt::red));
    QCOMPARE(source.frame().pixelColor(0, 0), QColor(Qt::red));
}

void ZtKernelImageTest::forgetsADeletedSource()
{
    auto source = std::make_unique<PlainSource>();
    source->show(Qt::red);
    ZtKernelImage image;
    image.setSource(source.get());
    const Receiver receiver(&image);
    source.reset();
    image.requestImage();
    QVERIFY(!image.source());
    QCOMPARE(receiver.frames.size(), 0);
}

void ZtKernelImageTest::copiesNoPixels()
{
    FakeLiveSource source;
    ZtKernelImage image;
    image.setSource(&source);
    const Receiver receiver(&image);
    source.start();
    const QImage taken = FakeLiveSource::picture(Qt::red);
    source.mailbox->put(taken);
    QCoreApplication::processEvents();
    QCOMPARE(receiver.frames.size(), 1);
    const QImage shown = receiver.frames.first().image->getQImage(QRect());
    QVERIFY(shown.constBits() == taken.constBits());
    QCOMPARE(shown.cacheKey(), taken.cacheKey());
    // Neither does the plug-in, which keeps a pixmap.
    QVERIFY(QPixmap::fromImage(shown).toImage().constBits() == taken.constBits());
    image.setFrozen(true);
    QVERIFY(image.frame().constBits() == taken.constBits());
}

void ZtKernelImageTest::freezes()
{
    PlainSource source;
    source.show(Qt::red);
    ZtKernelImage image;
    const QSignalSpy changes(&image, SIGNAL(signalFrozenChanged(bool)));
    image.setSource(&source);
    const Receiver receiver(&image);
    QVERIFY(!image.isFrozen());
    image.setFrozen(true);
    image.setFrozen(true);
    QVERIFY(image.isFrozen());
    QCOMPARE(changes.count(), 1);
    QCOMPARE(changes.at(0).at(0).toBool(), true);
    source.show(Qt::green);
    QCOMPARE(receiver.frames.size(), 0);
    image.requestImage();
    QCOMPARE(receiver.frames.last().image->getQImage().pixelColor(0, 0), QColor(Qt::red));
    QCOMPARE(image.frame().pixelColor(0, 0), QColor(Qt::red));
    image.setFrozen(false);
    QCOMPARE(changes.count(), 2);
    QCOMPARE(receiver.frames.size(), 2);
    QCOMPARE(receiver.frames.last().image->getQImage().pixelColor(0, 0), QColor(Qt::green));
    source.show(Qt::blue);
    QCOMPARE(receiver.frames.size(), 3);
}

void ZtKernelImageTest::anotherSourceIsNotFrozen()
{
    PlainSource first;
    first.show(Qt::red);
    PlainSource second;
    second.show(Qt::blue);
    ZtKernelImage image;
    image.setSource(&first);
    image.setFrozen(true);
    image.setSource(&first);
    QVERIFY(image.isFrozen());
    image.setSource(&second);
    QVERIFY(!image.isFrozen());
    QCOMPARE(image.frame().pixelColor(0, 0), QColor(Qt::blue));
}

void ZtKernelImageTest::frozenFrameOutlivesItsSource()
{
    auto source = std::make_unique<PlainSource>();
    source->show(Qt::red);
    ZtKernelImage image;
    image.setSource(source.get());
    image.setFrozen(true);
    const Receiver receiver(&image);
    source.reset();
    image.requestImage();
    QCOMPARE(receiver.frames.size(), 1);
}

void ZtKernelImageTest::lostSourceLeavesItsLastFrame()
{
    FakeLiveSource source;
    ZtKernelImage image;
    image.setSource(&source);
    const Receiver receiver(&image);
    source.start();
    source.mailbox->put(FakeLiveSource::picture(Qt::red));
    QCoreApplication::processEvents();
    source.lose(QStringLiteral("Fake is gone"));
    image.requestImage();
    QCOMPARE(receiver.frames.size(), 2);
    QCOMPARE(receiver.frames.last().image->getQImage(), FakeLiveSource::picture(Qt::red));
}

void ZtKernelImageTest::faultsAreLogged()
{
    ZtStatusLog::getInstance()->clear();
    FakeLiveSource source;
    ZtKernelImage image;
    image.setSource(&source);
    source.start();
    source.lose(QStringLiteral("Fake is gone"));
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 1);
    const ZtStatusEntry entry = ZtStatusLog::getInstance()->entries().first();
    QCOMPARE(entry.category, int(ZtAppStatus::Warning));
    QCOMPARE(entry.message, QStringLiteral("Fake is gone"));
    // A source that is no longer shown is of no interest.
    image.setSource(nullptr);
    source.start();
    source.lose(QStringLiteral("Fake is gone"));
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 1);
}

void ZtKernelImageTest::returnIsLogged()
{
    FakeLiveSource source;
    ZtKernelImage image;
    image.setSource(&source);
    source.start();
    source.lose(QStringLiteral("Fake is gone"));
    ZtStatusLog::getInstance()->clear();
    source.start();
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 0);
    source.mailbox->put(FakeLiveSource::picture(Qt::red));
    QCoreApplication::processEvents();
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 1);
    const ZtStatusEntry entry = ZtStatusLog::getInstance()->entries().first();
    QCOMPARE(entry.category, int(ZtAppStatus::Information));
    QCOMPARE(entry.message, QStringLiteral("Fake delivers pictures again"));
    source.mailbox->put(FakeLiveSource::picture(Qt::red));
    QCoreApplication::processEvents();
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 1);
}

STATREPORT_TEST_MAIN(ZtKernelImageTest)
#include "ZtKernelImageTest.moc"
