// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "kernel/iZTKernelImage.h"

namespace {

class OneFrameImage : public iZTKernelImage
{
public:
    void requestImage() override
    {
        FrameData frame;
        frame.image = QSharedPointer<ZtImage>::create(QImage(6, 4, QImage::Format_RGB32));
        frame.scale = 2.0;
        frame.rect = QRect(3, 5, 6, 4);
        emit signalImageCompleted(frame, handled);
    }

    bool handled = false;
};

} // namespace

class iZTKernelImageTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void aFrameStartsEmpty();
    void framesAreKnownByName();
    void receiversAnswerThroughTheSignal();

public slots:
    void slotImageCompleted(FrameData aFrameData, bool &aHandled);

private:
    FrameData m_received;
};

void iZTKernelImageTest::aFrameStartsEmpty()
{
    const FrameData frame;
    QVERIFY(frame.image.isNull());
    QCOMPARE(frame.scale, 1.0);
    QVERIFY(frame.rect.isNull());
}

void iZTKernelImageTest::framesAreKnownByName()
{
    const OneFrameImage image;
    QVERIFY(QMetaType::type("FrameData") != QMetaType::UnknownType);
}

void iZTKernelImageTest::receiversAnswerThroughTheSignal()
{
    OneFrameImage image;
    QVERIFY(connect(&image, SIGNAL(signalImageCompleted(FrameData,bool&)), this,
                                   SLOT(slotImageCompleted(FrameData,bool&)), Qt::DirectConnection));
    image.requestImage();
    QVERIFY(image.handled);
    QCOMPARE(m_received.image->size(), QSize(6, 4));
    QCOMPARE(m_received.scale, 2.0);
    QCOMPARE(m_received.rect, QRect(3, 5, 6, 4));
}

void iZTKernelImageTest::slotImageCompleted(FrameData aFrameData, bool &aHandled)
{
    m_received = aFrameData;
    aHandled = true;
}

STATREPORT_TEST_MAIN(iZTKernelImageTest)
#include "iZTKernelImageTest.moc"
