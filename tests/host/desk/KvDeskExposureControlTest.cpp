// SPDX-License-Identifier: MIT
#include "KvDeskExposureControl.h"

#include "support/StatReportTest.h"

#include <QDoubleSpinBox>
#include <QLineEdit>
#include <QSlider>

class KvDeskExposureControlTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void showsTheExposure_data();
    void showsTheExposure();
    void settingEmitsNothing();
    void sliderChooses();
    void fieldChooses();
    void cameraDoesNotPullTheSliderAway();
    void oddRanges_data();
    void oddRanges();
    void takesNoDrops();
};

void KvDeskExposureControlTest::showsTheExposure_data()
{
    QTest::addColumn<double>("exposure");
    QTest::addColumn<int>("position");
    QTest::newRow("shortest") << 0.01 << 0;
    QTest::newRow("a tenth") << 0.1 << 200;
    QTest::newRow("ten") << 10.0 << 600;
    QTest::newRow("longest") << 1000.0 << 1000;
}

void KvDeskExposureControlTest::showsTheExposure()
{
    QFETCH(double, exposure);
    QFETCH(int, position);
    KvDeskExposureControl control;
    control.setExposure({0.01, 1000.0}, exposure);
    QCOMPARE(control.slider()->value(), position);
    QCOMPARE(control.field()->value(), exposure);
    QCOMPARE(control.field()->minimum(), 0.01);
    QCOMPARE(control.field()->maximum(), 1000.0);
}

void KvDeskExposureControlTest::settingEmitsNothing()
{
    KvDeskExposureControl control;
    QSignalSpy spy(&control, SIGNAL(signalExposureChosen(double)));
    control.setExposure({0.01, 1000.0}, 10.0);
    control.setExposure({1.0, 5.0}, 2.0);
    QCOMPARE(spy.count(), 0);
}

void KvDeskExposureControlTest::sliderChooses()
{
    KvDeskExposureControl control;
    control.setExposure({0.01, 1000.0}, 10.0);
    QSignalSpy spy(&control, SIGNAL(signalExposureChosen(double)));
    control.slider()->setValue(800);
    QCOMPARE(spy.count(), 1);
    QVERIFY(qAbs(spy.first().first().toDouble() - 100.0) < 1e-6);
    control.slider()->setValue(1000);
    QVERIFY(qAbs(spy.last().first().toDouble() - 1000.0) < 1e-6);
}

void KvDeskExposureControlTest::fieldChooses()
{
    KvDeskExposureControl control;
    control.show();
    control.setExposure({0.01, 1000.0}, 10.0);
    QSignalSpy spy(&control, SIGNAL(signalExposureChosen(double)));
    auto *const edit = control.field()->findChild<QLineEdit *>();
    edit->selectAll();
    QTest::keyClicks(edit, QStringLiteral("250"));
    // Not after each digit.
    QCOMPARE(spy.count(), 0);
    QTest::keyClick(edit, Qt::Key_Return);
    QCOMPARE(spy.count(), 1);
    QCOMPARE(spy.first().first().toDouble(), 250.0);
}

void KvDeskExposureControlTest::cameraDoesNotPullTheSliderAway()
{
    KvDeskExposureControl control;
    control.setExposure({0.01, 1000.0}, 10.0);
    control.slider()->setSliderDown(true);
    control.setExposure({0.01, 1000.0}, 100.0);
    QCOMPARE(control.slider()->value(), 600);
    QCOMPARE(control.field()->value(), 100.0);
    control.slider()->setSliderDown(false);
    control.setExposure({0.01, 1000.0}, 100.0);
    QCOMPARE(control.slider()->value(), 800);
}

void KvDeskExposureControlTest::oddRanges_data()
{
    QTest::addColumn<double>("minimum");
    QTest::addColumn<double>("maximum");
    QTest::addColumn<double>("exposure");
    QTest::newRow("from nothing") << 0.0 << 100.0 << 0.0;
    QTest::newRow("fixed") << 5.0 << 5.0 << 5.0;
    QTest::newRow("none") << 0.0 << 0.0 << 0.0;
}

void KvDeskExposureControlTest::oddRanges()
{
    QFETCH(double, minimum);
    QFETCH(double, maximum);
    QFETCH(double, exposure);
    KvDeskExposureControl control;
    control.setExposure({minimum, maximum}, exposure);
    QCOMPARE(control.slider()->value(), 0);
    QSignalSpy spy(&control, SIGNAL(signalExposureChosen(double)));
    control.slider()->setValue(1000);
    QCOMPARE(spy.count(), 1);
    QVERIFY(qIsFinite(spy.first().first().toDouble()));
    QVERIFY(spy.first().first().toDouble() <= qMax(maximum, 0.001) + 1e-9);
}

void KvDeskExposureControlTest::takesNoDrops()
{
    const KvDeskExposureControl control;
    for (const QWidget *const child : control.findChildren<QWidget *>())
        QVERIFY(!child->acceptDrops());
}

STATREPORT_TEST_MAIN(KvDeskExposureControlTest)
#include "KvDeskExposureControlTest.moc"
