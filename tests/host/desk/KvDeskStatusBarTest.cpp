// SPDX-License-Identifier: MIT
#include "KvDeskStatusBar.h"

#include "KvDeskResources.h"
#include "KvDeskStatus.h"
#include "support/StatReportTest.h"

class KvDeskStatusBarTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void showsTheNewestMessage();
    void showsWhatWasLoggedBefore();
    void categoryIsIconAndText();
    void image_data();
    void image();
    void zoomAndPosition();
};

void KvDeskStatusBarTest::init()
{
    StatReportTest::init();
    KvDeskResources::ensure();
    ZtStatusLog::getInstance()->clear();
}

void KvDeskStatusBarTest::showsTheNewestMessage()
{
    const KvDeskStatusBar bar;
    QCOMPARE(bar.message(), QString());
    KvDeskStatus::log(ZtAppStatus::Information, QStringLiteral("One"), QString());
    KvDeskStatus::log(ZtAppStatus::Warning, QStringLiteral("Two\nlines"), QString());
    QCOMPARE(bar.message(), QStringLiteral("Two lines"));
    ZtStatusLog::getInstance()->clear();
    QCOMPARE(bar.message(), QString());
}

void KvDeskStatusBarTest::showsWhatWasLoggedBefore()
{
    KvDeskStatus::log(ZtAppStatus::Information, QStringLiteral("Before"), QString());
    QCOMPARE(KvDeskStatusBar().message(), QStringLiteral("Before"));
}

void KvDeskStatusBarTest::categoryIsIconAndText()
{
    const KvDeskStatusBar bar;
    KvDeskStatus::log(ZtAppStatus::Warning, QStringLiteral("Careful"), QString());
    bool hasIcon = false;
    bool hasText = false;
    for (const QLabel *const label : bar.findChildren<QLabel *>()) {
        hasIcon = hasIcon || (label->pixmap(Qt::ReturnByValue).isNull() == false);
        hasText = hasText || label->text() == QStringLiteral("Warning");
    }
    QVERIFY(hasIcon);
    QVERIFY(hasText);
}

void KvDeskStatusBarTest::image_data()
{
    QTest::addColumn<QSize>("size");
    QTest::addColumn<double>("pixelSize");
    QTest::addColumn<QString>("text");
    QTest::newRow("none") << QSize() << 0.0 << QString();
    QTest::newRow("none, calibrated") << QSize() << 2.5 << QString();
    QTest::newRow("uncalibrated") << QSize(960, 720) << 0.0 << QStringLiteral("960 × 720 px");
    QTest::newRow("calibrated") << QSize(960, 720) << 12.5 << QStringLiteral("960 × 720 px, 12.5 μm/px");
}

void KvDeskStatusBarTest::image()
{
    QFETCH(QSize, size);
    QFETCH(double, pixelSize);
    QFETCH(QString, text);
    KvDeskStatusBar bar;
    bar.setImage(size, pixelSize);
    QCOMPARE(bar.imageText(), text);
}

void KvDeskStatusBarTest::zoomAndPosition()
{
    KvDeskStatusBar bar;
    bar.slotZoomChanged(0.8837);
    QCOMPARE(bar.zoomText(), QStringLiteral("88 %"));
    bar.slotPointerMoved(QPointF(12.9, 3.2));
    QCOMPARE(bar.positionText(), QStringLiteral("x 12, y 3"));
    bar.slotPointerLeft();
    QCOMPARE(bar.positionText(), QString());
}

STATREPORT_TEST_MAIN(KvDeskStatusBarTest)
#include "KvDeskStatusBarTest.moc"
