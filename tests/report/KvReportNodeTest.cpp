// SPDX-License-Identifier: MIT
#include "report/KvReportNode.h"
#include "support/FakeReport.h"
#include "support/StatReportTest.h"

#include <QDataStream>
#include <QJsonArray>
#include <QJsonObject>
#include <QMimeData>

#include <limits>

class KvReportNodeTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void holdsItsParts();
    void makesTheDisplayWidgetOnFirstUse();
    void passesTheDisplayParent();
    void forgetsADeletedDisplayWidget();
    void deletesItsDisplayWidget();
    void makesTheDisplayWidgetAnew();
    void livesWithoutADisplayWidget();
    void writesNameAndConfig();
    void appendsNothingOnFailure();
    void dragDataHoldsTheIndex_data();
    void dragDataHoldsTheIndex();
};

void KvReportNodeTest::holdsItsParts()
{
    FakeReport report;
    FakeBlockFactory factory;
    KvReportNode node(nullptr, &factory, report.model()->context(), report.model());
    QCOMPARE(node.model(), report.model());
    QCOMPARE(node.factory(), &factory);
    QCOMPARE(node.context(), report.model()->context());
    QCOMPARE(node.typeName(), QStringLiteral("Fake"));
    QVERIFY(dynamic_cast<FakeBlockCfg *>(node.config()));
    QCOMPARE(node.config()->context(), report.model()->context());

    const KvReportNode loose(nullptr, &factory, nullptr);
    QVERIFY(!loose.model());
}

void KvReportNodeTest::makesTheDisplayWidgetOnFirstUse()
{
    FakeBlockFactory factory;
    KvReportNode node(nullptr, &factory, nullptr);
    QCOMPARE(factory.widgetsMade(), 0);
    KvBaseDisplayWidget *widget = node.displayWidget();
    QVERIFY(widget);
    QCOMPARE(node.displayWidget(), widget);
    QCOMPARE(factory.widgetsMade(), 1);
}

void KvReportNodeTest::passesTheDisplayParent()
{
    FakeReport report;
    QWidget parent;
    KvReportNode node(&parent, report.addText(QString())->factory(), report.model()->context());
    QCOMPARE(node.displayWidget()->subWidgetAt(0)->parentWidget(), &parent);
}

void KvReportNodeTest::forgetsADeletedDisplayWidget()
{
    FakeBlockFactory factory;
    KvReportNode node(nullptr, &factory, nullptr);
    delete node.displayWidget();
    QVERIFY(node.displayWidget());
    QCOMPARE(factory.widgetsMade(), 2);
    QCOMPARE(node.displayWidget()->subWidgetCount(), 1);
}

void KvReportNodeTest::deletesItsDisplayWidget()
{
    FakeBlockFactory factory;
    auto node = std::make_unique<KvReportNode>(nullptr, &factory, nullptr);
    const QPointer<QObject> displaySignals(node->displayWidget()->displaySignals());
    const QPointer<QObject> config(node->config());
    QCOMPARE(FakePiece::alive(), 0);
    QVERIFY(node->displayWidget()->subWidgetAt(0));
    QCOMPARE(FakePiece::alive(), 1);
    node.reset();
    QVERIFY(displaySignals.isNull());
    QVERIFY(config.isNull());
    QCOMPARE(FakePiece::alive(), 0);

    // A parent that dies first takes the widget along.
    FakeReport report;
    auto parent = std::make_unique<QWidget>();
    KvReportNode shown(parent.get(), report.addText(QString())->factory(), report.model()->context());
    QVERIFY(shown.displayWidget());
    parent.reset();
    QVERIFY(shown.displayWidget());
}

void KvReportNodeTest::makesTheDisplayWidgetAnew()
{
    FakeReport report;
    KvReportNode *node = report.addFake({10, 20});
    node->resetDisplayWidget(); // there is none yet
    QCOMPARE(report.fakeFactory()->widgetsMade(), 0);
    KvBaseDisplayWidget *before = node->displayWidget();
    QVERIFY(before->subWidgetAt(0));
    QVERIFY(before->subWidgetAt(1));
    // Whoever listens to its end finds the block without a widget, not with the dying one.
    bool wasTold = false;
    connect(before->displaySignals(), &QObject::destroyed, this, [&]() { wasTold = true; });
    node->resetDisplayWidget();
    QVERIFY(wasTold);
    QCOMPARE(FakePiece::alive(), 0);
    QCOMPARE(report.fakeFactory()->widgetsMade(), 1);
    FakeReport::fakeCfg(node)->setHeights({30});
    QVERIFY(node->displayWidget());
    QCOMPARE(report.fakeFactory()->widgetsMade(), 2);
    QCOMPARE(node->displayWidget()->subWidgetCount(), 1);
    QCOMPARE(node->displayWidget(), node->displayWidget());
    QCOMPARE(report.fakeFactory()->widgetsMade(), 2);
}

void KvReportNodeTest::livesWithoutADisplayWidget()
{
    FakeBlockFactory factory;
    factory.setWithoutWidgets(true);
    KvReportNode node(nullptr, &factory, nullptr);
    QVERIFY(!node.displayWidget());
}

void KvReportNodeTest::writesNameAndConfig()
{
    FakeBlockFactory factory;
    const KvReportNode node(nullptr, &factory, nullptr);
    static_cast<FakeBlockCfg *>(node.config())->setHeights({7, -1});
    QJsonArray nodes{QStringLiteral("before")};
    QVERIFY(node.toJson(nodes));
    const QJsonObject config{{QStringLiteral("heights"), QJsonArray{7, -1}}};
    QCOMPARE(nodes, QJsonArray({QStringLiteral("before"),
                                QJsonObject{{QStringLiteral("name"), QStringLiteral("Fake")},
                                            {QStringLiteral("config"), config}}}));
}

void KvReportNodeTest::appendsNothingOnFailure()
{
    FakeBlockFactory factory;
    const KvReportNode node(nullptr, &factory, nullptr);
    static_cast<FakeBlockCfg *>(node.config())->setWritable(false);
    QJsonArray nodes;
    QVERIFY(!node.toJson(nodes));
    QCOMPARE(nodes, QJsonArray());
}

void KvReportNodeTest::dragDataHoldsTheIndex_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<QByteArray>("indexBytes");
    QTest::newRow("first") << 0 << QByteArray::fromHex("00000000");
    QTest::newRow("258") << 258 << QByteArray::fromHex("00000102");
    QTest::newRow("none") << -1 << QByteArray::fromHex("ffffffff");
    QTest::newRow("largest") << std::numeric_limits<int>::max() << QByteArray::fromHex("7fffffff");
}

void KvReportNodeTest::dragDataHoldsTheIndex()
{
    QFETCH(int, index);
    QFETCH(QByteArray, indexBytes);
    FakeBlockFactory factory;
    const KvReportNode node(nullptr, &factory, nullptr);
    const std::unique_ptr<QMimeData> data(node.mimeData(index));
    const QString format = QStringLiteral("application/x-meeditorpreviewlistmodeldatalist");
    QCOMPARE(data->formats(), QStringList(format));

    // A text is its length in bytes and its UTF-16 units, all big-endian.
    QByteArray expected = QByteArray::fromHex("00000012");
    for (const char letter : QByteArray("nodeIndex"))
        expected += QByteArray(1, '\0') + letter;
    QCOMPARE(data->data(format), expected + indexBytes);

    QByteArray bytes = data->data(format);
    QDataStream stream(&bytes, QIODevice::ReadOnly);
    QString tag;
    qint32 readIndex = 0;
    stream >> tag >> readIndex;
    QCOMPARE(tag, QStringLiteral("nodeIndex"));
    QCOMPARE(readIndex, index);
    QVERIFY(stream.atEnd());
}

STATREPORT_TEST_MAIN(KvReportNodeTest)
#include "KvReportNodeTest.moc"
