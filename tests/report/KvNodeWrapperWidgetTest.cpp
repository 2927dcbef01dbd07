// SPDX-License-Identifier: MIT
#include "report/KvNodeWrapperWidget.h"
#include "support/FakeReport.h"
#include "support/StatReportTest.h"

#include <QHBoxLayout>

class KvNodeWrapperWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void hasThreeParts();
    void setsStyles();
    void fitsToThePiece_data();
    void fitsToThePiece();
    void followsSilentSizeChanges();
    void followsTheMargin();
    void letsThePieceGo();
    void keepsOffAPieceThatMovedOn();
    void survivesItsPiece();
    void staysLeftToRight();
    void opaquePiecesNeedNoStyleInPrint();
};

void KvNodeWrapperWidgetTest::hasThreeParts()
{
    FakeReport report;
    KvReportNode *node = report.addFake({50});
    QWidget *piece = node->displayWidget()->subWidgetAt(0);
    KvNodeWrapperWidget wrapper(node, piece);
    QCOMPARE(wrapper.node(), node);
    QCOMPARE(wrapper.piece(), piece);

    auto *layout = qobject_cast<QHBoxLayout *>(wrapper.layout());
    QVERIFY(layout);
    QCOMPARE(layout->count(), 3);
    QCOMPARE(layout->spacing(), 0);
    QCOMPARE(layout->contentsMargins(), QMargins());
    QCOMPARE(layout->itemAt(0)->widget()->objectName(), QStringLiteral("leftMargin"));
    QCOMPARE(layout->itemAt(1)->layout()->objectName(), QStringLiteral("contentVerticalLayout"));
    QCOMPARE(layout->itemAt(1)->layout()->itemAt(0)->widget(), piece);
    QCOMPARE(layout->itemAt(2)->widget()->objectName(), QStringLiteral("rightMargin"));
    QCOMPARE(piece->parentWidget(), &wrapper);
    QVERIFY(!piece->isHidden());
}

void KvNodeWrapperWidgetTest::setsStyles()
{
    FakeReport report;
    KvReportNode *node = report.addFake({50});
    QWidget *piece = node->displayWidget()->subWidgetAt(0);
    const KvNodeWrapperWidget wrapper(node, piece);
    QCOMPARE(wrapper.styleSheet(), QStringLiteral("QWidget { background: white; }"));
    QCOMPARE(piece->styleSheet(), QStringLiteral("QWidget { background: white; color: black;}"));
}

void KvNodeWrapperWidgetTest::fitsToThePiece_data()
{
    QTest::addColumn<int>("height");
    QTest::newRow("flat") << 0;
    QTest::newRow("line") << 20;
    // A window would be capped at two thirds of the screen, which is 800 x 800 here.
    QTest::newRow("page") << 1300;
    QTest::newRow("ten pages") << 13460;
}

void KvNodeWrapperWidgetTest::fitsToThePiece()
{
    QFETCH(int, height);
    FakeReport report;
    KvReportNode *node = report.addFake({height});
    QWidget *piece = node->displayWidget()->subWidgetAt(0);
    KvNodeWrapperWidget wrapper(node, piece);
    wrapper.setMargin(114);
    wrapper.fitToPiece();
    QCOMPARE(wrapper.size(), QSize(952, height));
    QCOMPARE(wrapper.findChild<QWidget *>(QStringLiteral("leftMargin"))->minimumWidth(), 114);
    QCOMPARE(wrapper.findChild<QWidget *>(QStringLiteral("leftMargin"))->maximumWidth(), 114);
    QCOMPARE(wrapper.findChild<QWidget *>(QStringLiteral("rightMargin"))->minimumWidth(), 114);
    QCOMPARE(wrapper.findChild<QWidget *>(QStringLiteral("rightMargin"))->maximumWidth(), 114);
}

void KvNodeWrapperWidgetTest::followsSilentSizeChanges()
{
    // A piece says "changed" through its block, and not always through updateGeometry().
    FakeReport report;
    KvReportNode *node = report.addFake({50});
    auto *piece = static_cast<FakePiece *>(node->displayWidget()->subWidgetAt(0));
    KvNodeWrapperWidget wrapper(node, piece);
    wrapper.setMargin(114);
    wrapper.fitToPiece();
    QCOMPARE(wrapper.height(), 50);
    piece->setHeightHint(400);
    wrapper.fitToPiece();
    QCOMPARE(wrapper.height(), 400);
    piece->setHeightHint(10);
    wrapper.fitToPiece();
    QCOMPARE(wrapper.height(), 10);
}

void KvNodeWrapperWidgetTest::followsTheMargin()
{
    FakeReport report;
    KvReportNode *node = report.addFake({50});
    KvNodeWrapperWidget wrapper(node, node->displayWidget()->subWidgetAt(0));
    for (const int margin : {114, 0, 300, 4}) {
        wrapper.setMargin(margin);
        wrapper.fitToPiece();
        QCOMPARE(wrapper.width(), 724 + 2 * margin);
    }
}

void KvNodeWrapperWidgetTest::letsThePieceGo()
{
    FakeReport report;
    KvReportNode *node = report.addFake({50});
    const QPointer<QWidget> piece(node->displayWidget()->subWidgetAt(0));
    delete new KvNodeWrapperWidget(node, piece);
    QVERIFY(piece);
    QVERIFY(!piece->parentWidget());
}

void KvNodeWrapperWidgetTest::keepsOffAPieceThatMovedOn()
{
    FakeReport report;
    KvReportNode *node = report.addFake({50});
    const QPointer<QWidget> piece(node->displayWidget()->subWidgetAt(0));
    auto first = std::make_unique<KvNodeWrapperWidget>(node, piece);
    KvNodeWrapperWidget second(node, piece);
    QCOMPARE(piece->parentWidget(), &second);
    QVERIFY(!first->piece());
    QCOMPARE(second.piece(), piece.data());
    first->fitToPiece();
    first.reset();
    QVERIFY(piece);
    QCOMPARE(piece->parentWidget(), &second);
    second.fitToPiece();
    QCOMPARE(second.height(), 50);
}

void KvNodeWrapperWidgetTest::survivesItsPiece()
{
    FakeReport report;
    KvReportNode *node = report.addFake({50});
    KvNodeWrapperWidget wrapper(node, node->displayWidget()->subWidgetAt(0));
    delete wrapper.piece();
    QVERIFY(!wrapper.piece());
    wrapper.fitToPiece();
    QCOMPARE(wrapper.height(), 0);
}

void KvNodeWrapperWidgetTest::staysLeftToRight()
{
    FakeReport report;
    KvReportNode *node = report.addFake({50});
    QApplication::setLayoutDirection(Qt::RightToLeft);
    const KvNodeWrapperWidget wrapper(node, node->displayWidget()->subWidgetAt(0));
    const Qt::LayoutDirection direction = wrapper.layoutDirection();
    QApplication::setLayoutDirection(Qt::LeftToRight);
    QCOMPARE(direction, Qt::LeftToRight);
}

void KvNodeWrapperWidgetTest::opaquePiecesNeedNoStyleInPrint()
{
    FakeReport report;
    KvReportNode *node = report.addFake({50, 60});
    QWidget *opaque = node->displayWidget()->subWidgetAt(0);
    opaque->setAttribute(Qt::WA_OpaquePaintEvent);
    report.model()->context()->setPrinting(true);
    const KvNodeWrapperWidget bare(node, opaque);
    const KvNodeWrapperWidget styled(node, node->displayWidget()->subWidgetAt(1));
    report.model()->context()->setPrinting(false);
    QCOMPARE(bare.styleSheet(), QString());
    QCOMPARE(opaque->styleSheet(), QString());
    QCOMPARE(styled.styleSheet(), QStringLiteral("QWidget { background: white; }"));

    const KvNodeWrapperWidget onScreen(node, opaque);
    QCOMPARE(opaque->styleSheet(), QStringLiteral("QWidget { background: white; color: black;}"));
}

STATREPORT_TEST_MAIN(KvNodeWrapperWidgetTest)
#include "KvNodeWrapperWidgetTest.moc"
