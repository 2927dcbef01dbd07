// SPDX-License-Identifier: MIT
#include "report/KvReportProxyWidgetItem.h"
#include "report/KvNodeWrapperWidget.h"
#include "support/FakeReport.h"
#include "support/StatReportTest.h"

#include <QGraphicsScene>

class KvReportProxyWidgetItemTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsEmpty();
    void carriesAPiece();
    void refusesWhatIsNoPiece();
    void forgetsADeadDisplayWidget();
    void changesTheDisplayWidget();
    void adjustsToPieceAndMargin();
    void leavesThePieceToItsBlock();
};

void KvReportProxyWidgetItemTest::startsEmpty()
{
    KvReportProxyWidgetItem item;
    QVERIFY(!item.node());
    QVERIFY(!item.displayWidget());
    QVERIFY(!item.belongsToBlock());
    QCOMPARE(item.cacheMode(), QGraphicsItem::NoCache);
    QVERIFY(!item.graphicsEffect());
    // Tab passes it by.
    QCOMPARE(item.focusPolicy(), Qt::ClickFocus);
    item.adjustToPiece();
}

void KvReportProxyWidgetItemTest::carriesAPiece()
{
    FakeReport report;
    KvReportNode *node = report.addFake({50, 1300});
    const std::unique_ptr<KvReportProxyWidgetItem> item(KvReportProxyWidgetItem::createForPiece(node, 1));
    QVERIFY(item);
    QCOMPARE(item->node(), node);
    QVERIFY(item->belongsToBlock());
    QCOMPARE(item->displayWidget(), node->displayWidget());
    auto *wrapper = qobject_cast<KvNodeWrapperWidget *>(item->widget());
    QVERIFY(wrapper);
    QCOMPARE(wrapper->piece(), FakeReport::fakeWidget(node)->piece(1));
    QCOMPARE(item->size(), QSizeF(952, 1300));
    QCOMPARE(item->boundingRect(), QRectF(0, 0, 952, 1300));
    QCOMPARE(item->pieceHeight(), 1300);
}

void KvReportProxyWidgetItemTest::refusesWhatIsNoPiece()
{
    FakeReport report;
    KvReportNode *node = report.addFake({50, -1});
    QVERIFY(!KvReportProxyWidgetItem::createForPiece(node, 1));
    QVERIFY(!KvReportProxyWidgetItem::createForPiece(node, 2));
    report.fakeFactory()->setWithoutWidgets(true);
    QVERIFY(!KvReportProxyWidgetItem::createForPiece(report.addFake({50}), 0));
}

void KvReportProxyWidgetItemTest::forgetsADeadDisplayWidget()
{
    FakeReport report;
    KvReportNode *node = report.addFake({50});
    const std::unique_ptr<KvReportProxyWidgetItem> item(KvReportProxyWidgetItem::createForPiece(node, 0));
    delete node->displayWidget();
    QVERIFY(!item->displayWidget());
    item->adjustToPiece();
    QCOMPARE(item->pieceHeight(), 0);
}

void KvReportProxyWidgetItemTest::changesTheDisplayWidget()
{
    FakeReport report;
    KvReportNode *first = report.addFake({50});
    KvReportNode *second = report.addFake({50});
    KvReportProxyWidgetItem item;
    item.setDisplayWidget(first->displayWidget());
    item.setDisplayWidget(second->displayWidget());
    delete first->displayWidget();
    QCOMPARE(item.displayWidget(), second->displayWidget());
    item.setDisplayWidget(nullptr);
    QVERIFY(!item.displayWidget());
}

void KvReportProxyWidgetItemTest::adjustsToPieceAndMargin()
{
    FakeReport report;
    KvReportNode *node = report.addFake({50});
    QGraphicsScene scene;
    KvReportProxyWidgetItem *item = KvReportProxyWidgetItem::createForPiece(node, 0);
    scene.addItem(item);
    FakeReport::fakeWidget(node)->piece(0)->setHeightHint(700);
    item->adjustToPiece();
    QCOMPARE(item->size(), QSizeF(952, 700));
    FakeReport::fakeWidget(node)->piece(0)->setHeightHint(20);
    report.model()->setPageWidth(600);
    item->adjustToPiece();
    QCOMPARE(item->size(), QSizeF(600, 20));
    report.model()->context()->setMarginWidth(0.0f);
    item->adjustToPiece();
    QCOMPARE(item->size(), QSizeF(600, 20));
    QCOMPARE(item->widget()->findChild<QWidget *>(QStringLiteral("leftMargin"))->maximumWidth(), 0);
}

void KvReportProxyWidgetItemTest::leavesThePieceToItsBlock()
{
    FakeReport report;
    KvReportNode *node = report.addFake({50});
    {
        QGraphicsScene scene;
        scene.addItem(KvReportProxyWidgetItem::createForPiece(node, 0));
    }
    QCOMPARE(FakePiece::alive(), 1);
    const QWidget *piece = FakeReport::fakeWidget(node)->piece(0);
    QVERIFY(piece);
    const std::unique_ptr<KvReportProxyWidgetItem> again(KvReportProxyWidgetItem::createForPiece(node, 0));
    QCOMPARE(static_cast<KvNodeWrapperWidget *>(again->widget())->piece(), piece);
    QCOMPARE(again->pieceHeight(), 50);
}

STATREPORT_TEST_MAIN(KvReportProxyWidgetItemTest)
#include "KvReportProxyWidgetItemTest.moc"
