// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

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

STATREPORT_TEST_MAIN(ZtKernelImageTest)
#include "ZtKernelImageTest.moc"
