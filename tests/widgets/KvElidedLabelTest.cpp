// SPDX-License-Identifier: MIT
#include "widgets/KvElidedLabel.h"
#include "support/StatReportTest.h"

class KvElidedLabelTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void asksForNoWidth();
    void keepsItsText();
    void leavesOutTheMiddle();
    void textIsNoMarkup();
};

void KvElidedLabelTest::asksForNoWidth()
{
    KvElidedLabel label;
    label.setText(QString(500, QLatin1Char('x')));
    QCOMPARE(label.minimumSizeHint().width(), 0);
    QVERIFY(label.minimumSizeHint().height() > 0);
}

void KvElidedLabelTest::keepsItsText()
{
    KvElidedLabel label;
    const QString text(500, QLatin1Char('x'));
    label.setText(text);
    label.resize(60, 20);
    label.grab();
    QCOMPARE(label.text(), text);
}

void KvElidedLabelTest::leavesOutTheMiddle()
{
    KvElidedLabel wide;
    wide.setText(QStringLiteral("aaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaa"));
    wide.resize(100, 20);
    KvElidedLabel fitting;
    fitting.setText(fitting.fontMetrics().elidedText(wide.text(), Qt::ElideMiddle, 100));
    fitting.resize(100, 20);
    QVERIFY(fitting.text().contains(QChar(0x2026)));
    QCOMPARE(wide.grab().toImage(), fitting.grab().toImage());
}

void KvElidedLabelTest::textIsNoMarkup()
{
    KvElidedLabel marked;
    marked.setText(QStringLiteral("<b></b>"));
    marked.resize(100, 20);
    KvElidedLabel empty;
    empty.resize(100, 20);
    QVERIFY(marked.grab().toImage() != empty.grab().toImage());
}

STATREPORT_TEST_MAIN(KvElidedLabelTest)
#include "KvElidedLabelTest.moc"
