// SPDX-License-Identifier: MIT
#include "KvDeskStatusBar.h"

#include "KvDeskResources.h"
#include "KvDeskStatus.h"
#include "measuring/ZtCalibration.h"
#include "support/StatReportTest.h"

Q_DECLARE_METATYPE(ZtCalibration)

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
    void statistics();
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
    QTest::addColumn<ZtCalibration>("calibration");
    QTest::addColumn<QString>("text");
    QTest::newRow("none") << QSize() << ZtCalibration() << QString();
    QTest::newRow("none, calibrated") << QSize() << ZtCalibration(2.5) << QString();
    QTest::newRow("uncalibrated") << QSize(960, 720) << ZtCalibration() << QStringLiteral("960 × 720 px");
    QTest::newRow("calibrated") << QSize(960, 720) << ZtCalibration(12.5)
                                << QStringLiteral("960 × 720 px, 12.5 μm/px");
    ZtCalibration oblong(0.5, 0.25);
    oblong.setObjective(QStringLiteral("10x"));
    QTest::newRow("oblong pixels, objective")
        << QSize(960, 720) << oblong << QStringLiteral("960 × 720 px, 10x, 0.5 × 0.25 μm/px");
}

void KvDeskStatusBarTest::image()
{
    QFETCH(QSize, size);
    QFETCH(ZtCalibration, calibration);
    QFETCH(QString, text);
    KvDeskStatusBar bar;
    bar.setImage(size, calibration);
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

void KvDeskStatusBarTest::statistics()
{
    KvDeskStatusBar bar;
    bar.show();
    bar.slotSetStatistics(QStringLiteral("n = 2"), QStringLiteral("Details"));
    QCOMPARE(bar.statisticsText(), QStringLiteral("n = 2"));
    QLabel *shown = nullptr;
    for (QLabel *const label : bar.findChildren<QLabel *>()) {
        if (label->accessibleName() == QStringLiteral("Statistics of the selected values"))
            shown = label;
    }
    QVERIFY(shown);
    QVERIFY(shown->isVisible());
    QCOMPARE(shown->toolTip(), QStringLiteral("Details"));
    // A long text is cut at its end: it makes no window wider.
    const int least = bar.minimumSizeHint().width();
    bar.resize(500, bar.height());
    bar.slotSetStatistics(QStringLiteral("n = 2, ").repeated(50), QStringLiteral("More details"));
    QCOMPARE(bar.minimumSizeHint().width(), least);
    QTRY_VERIFY(shown->width() < shown->sizeHint().width() && shown->geometry().right() < 500);
    QCOMPARE(shown->toolTip(), QStringLiteral("More details"));
    bar.slotSetStatistics(QString(), QString());
    QVERIFY(!shown->isVisible());
}

STATREPORT_TEST_MAIN(KvDeskStatusBarTest)
#include "KvDeskStatusBarTest.moc"
