// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/textdocument/KvEditorAddImageExtWidget.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QSpinBox>

class KvEditorAddImageExtWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void isARowOfTwoSettings();
    void widthIsOneToHundredPercent_data();
    void widthIsOneToHundredPercent();
    void placesThePicture_data();
    void placesThePicture();
};

void KvEditorAddImageExtWidgetTest::isARowOfTwoSettings()
{
    const KvEditorAddImageExtWidget widget;
    const auto *frame = widget.findChild<QFrame *>(QStringLiteral("frame"));
    QVERIFY(frame);
    const auto *row = qobject_cast<QHBoxLayout *>(frame->layout());
    QVERIFY(row);
    QCOMPARE(row->objectName(), QStringLiteral("horizontalLayout_2"));
    QCOMPARE(row->spacing(), 0);
    QCOMPARE(row->contentsMargins(), QMargins());
    QStringList names;
    for (int i = 0; i < row->count(); ++i)
        names.append(row->itemAt(i)->widget()->objectName());
    QCOMPARE(names, (QStringList{"label", "widthSpinBox", "label_2", "floatComboBox"}));

    const auto *widthLabel = frame->findChild<QLabel *>(QStringLiteral("label"));
    const auto *floatLabel = frame->findChild<QLabel *>(QStringLiteral("label_2"));
    QCOMPARE(widthLabel->text(), QStringLiteral("Width:"));
    QCOMPARE(floatLabel->text(), QStringLiteral("Float:"));
    QCOMPARE(widthLabel->buddy(), frame->findChild<QSpinBox *>());
    QCOMPARE(floatLabel->buddy(), frame->findChild<QComboBox *>());

    const auto *box = frame->findChild<QSpinBox *>();
    QCOMPARE(box->minimum(), 1);
    QCOMPARE(box->maximum(), 100);
    QCOMPARE(box->suffix(), QStringLiteral("%"));
    QCOMPARE(box->value(), 25);
    QCOMPARE(widget.widthPercent(), 25);
}

void KvEditorAddImageExtWidgetTest::widthIsOneToHundredPercent_data()
{
    QTest::addColumn<int>("entered");
    QTest::addColumn<int>("percent");
    QTest::newRow("1") << 1 << 1;
    QTest::newRow("59") << 59 << 59;
    QTest::newRow("100") << 100 << 100;
    QTest::newRow("0") << 0 << 1;
    QTest::newRow("101") << 101 << 100;
}

void KvEditorAddImageExtWidgetTest::widthIsOneToHundredPercent()
{
    QFETCH(int, entered);
    const KvEditorAddImageExtWidget widget;
    widget.findChild<QSpinBox *>()->setValue(entered);
    QTEST(widget.widthPercent(), "percent");
}

void KvEditorAddImageExtWidgetTest::placesThePicture_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("placement");
    QTest::newRow("none") << 0 << "none"
                          << "style=\"float:none;\"";
    QTest::newRow("left") << 1 << "left"
                          << "style=\"float:left;\"";
    QTest::newRow("right") << 2 << "right"
                           << "style=\"float:right;\"";
}

void KvEditorAddImageExtWidgetTest::placesThePicture()
{
    QFETCH(int, index);
    const KvEditorAddImageExtWidget widget;
    auto *box = widget.findChild<QComboBox *>(QStringLiteral("floatComboBox"));
    QCOMPARE(box->count(), 3);
    QVERIFY(!box->isEditable());
    QCOMPARE(box->currentIndex(), 0);
    QTEST(box->itemText(index), "text");
    box->setCurrentIndex(index);
    QTEST(widget.placement(), "placement");
}

STATREPORT_TEST_MAIN(KvEditorAddImageExtWidgetTest)
#include "KvEditorAddImageExtWidgetTest.moc"
