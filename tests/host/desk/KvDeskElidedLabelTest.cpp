// SPDX-License-Identifier: MIT
#include "KvDeskElidedLabel.h"

#include "support/StatReportTest.h"

class KvDeskElidedLabelTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void toolTipHasWhatDoesNotFit();
    void isNarrowByItself();
    void drawsNothingBeyondItsWidth();
};

void KvDeskElidedLabelTest::toolTipHasWhatDoesNotFit()
{
    const QString text = QStringLiteral("A message that is too long for a small label");
    KvDeskElidedLabel label;
    label.setText(text);
    label.resize(60, 20);
    label.show();
    QCOMPARE(label.toolTip(), text);
    label.resize(2000, 20);
    QTRY_COMPARE(label.toolTip(), QString());
}

void KvDeskElidedLabelTest::isNarrowByItself()
{
    KvDeskElidedLabel label;
    label.setText(QString(500, QLatin1Char('x')));
    QVERIFY(label.minimumSizeHint().width() < 100);
    QVERIFY(label.sizeHint().width() > 500);
}

void KvDeskElidedLabelTest::drawsNothingBeyondItsWidth()
{
    KvDeskElidedLabel label;
    label.resize(100, 24);
    label.setText(QStringLiteral("Short"));
    const QImage whole = label.grab().toImage();
    label.setText(QStringLiteral("Short and then a lot more than a hundred pixels of text"));
    const QImage elided = label.grab().toImage();
    QVERIFY(whole != elided);
    // The end is drawn as dots, not cut through a letter: the last column stays free.
    for (int y = 0; y < elided.height(); ++y)
        QCOMPARE(elided.pixel(99, y), whole.pixel(99, y));
}

STATREPORT_TEST_MAIN(KvDeskElidedLabelTest)
#include "KvDeskElidedLabelTest.moc"
