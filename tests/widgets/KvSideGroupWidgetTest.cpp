// SPDX-License-Identifier: MIT
#include "widgets/KvSideGroupWidget.h"
#include "support/StatReportTest.h"

#include <QLabel>
#include <QLayout>

class KvSideGroupWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void isARowAtTheLeft();
    void takesWidgetsOver();
};

void KvSideGroupWidgetTest::isARowAtTheLeft()
{
    const KvSideGroupWidget group;
    const auto *row = qobject_cast<QHBoxLayout *>(group.layout());
    QVERIFY(row);
    QCOMPARE(row->contentsMargins(), QMargins(6, 6, 6, 6));
    QCOMPARE(row->spacing(), 12);
    QCOMPARE(row->alignment(), Qt::Alignment(Qt::AlignLeft));
    QCOMPARE(group.frameShape(), QFrame::NoFrame);
}

void KvSideGroupWidgetTest::takesWidgetsOver()
{
    KvSideGroupWidget group;
    QVector<QLabel *> labels;
    for (int i = 0; i < 3; ++i) {
        labels.append(new QLabel(QString::number(i)));
        labels.last()->setFixedSize(20, 20);
        group.addWidget(labels.last());
        QCOMPARE(labels.last()->parentWidget(), &group);
    }
    group.resize(400, 40);
    group.layout()->activate();
    QCOMPARE(labels.at(0)->x(), 6);
    QCOMPARE(labels.at(1)->x(), 6 + 20 + 12);
    QCOMPARE(labels.at(2)->x(), 6 + 2 * (20 + 12));
}

STATREPORT_TEST_MAIN(KvSideGroupWidgetTest)
#include "KvSideGroupWidgetTest.moc"
