// SPDX-License-Identifier: MIT
#include "report/KvReportPagedView.h"
#include "PagedViewTools.h"
#include "PdfFile.h"
#include "report/KvHeaderWidget.h"
#include "report/KvPageCountWidget.h"
#include "report/KvReportPage.h"
#include "support/FakeReport.h"
#include "support/StatReportTest.h"

#include <QGraphicsScene>
#include <QScrollBar>

using namespace PagedViewTools;

namespace {

QStringList pageNumbersOf(const KvReportPagedView &view)
{
    QStringList numbers;
    for (const KvReportPage *page : view.pages()) {
        for (QGraphicsItem *item : page->childItems()) {
            auto *proxy = dynamic_cast<KvReportProxyWidgetItem *>(item);
            if (const auto *label = proxy ? qobject_cast<KvPageCountWidget *>(proxy->widget()) : nullptr)
                numbers.append(label->text());
        }
    }
    return numbers;
}

const char kBigHeader[] = "<p style='font-size:40px'>Header</p>";

} // namespace

class KvReportPagedViewTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void isSetUp();
    void staysEmptyWithoutAModel();
    void anEmptyTemplateHasOnePage();
    void flowsBlocks_data();
    void flowsBlocks();
    void skipsNullPieces();
    void setsTheSceneRectangle();
    void rebuildsKeepTheDisplayWidgets();
    void rebuildsConnectOnce();
    void rebuildsKeepTheScrollPosition();
    void modelSignalsWorkAtOnce();
    void changedPiecesWorkQueued();
    void aLoadCostsOneRebuild_data();
    void aLoadCostsOneRebuild();
    void aRefusedLoadShowsWhatWasRead();
    void newTemplateWithSections();
    void sectionsComeAndGo();
    void headerTogglingSplitsTablesOnce();
    void sizeChangesFlowAnew();
    void pagesAreAddedAndDropped();
    void passesAreNotNested();
    void editingAHeaderMeasuresAllPages();
    void editingTheLastHeaderMayDropItsPage();
    void removedBlocksDisappear();
    void pageWidthFollowsTheView();
    void aHiddenViewLeavesThePageWidthAlone();
    void loadingLeavesThePageWidthUntilAResize();
    void textsFollowThePageWidth();
    void survivesNarrowViews_data();
    void survivesNarrowViews();
    void survivesOddTemplates_data();
    void survivesOddTemplates();
    void printingLeavesTheBlocksToTheView();
    void showingBringsBackPrintedBlocks();
    void viewAndPrintAgree_data();
    void viewAndPrintAgree();
    void aDarkTableStaysDark();
    void outlivesTheModel();
    void leavesThePiecesToTheModel();
};

void KvReportPagedViewTest::isSetUp()
{
    QApplication::setLayoutDirection(Qt::RightToLeft);
    const KvReportPagedView view;
    const Qt::LayoutDirection direction = view.layoutDirection();
    QApplication::setLayoutDirection(Qt::LeftToRight);
    QCOMPARE(direction, Qt::LeftToRight);
    QVERIFY(view.renderHints().testFlag(QPainter::Antialiasing));
    QVERIFY(view.renderHints().testFlag(QPainter::SmoothPixmapTransform));
    QCOMPARE(view.horizontalScrollBarPolicy(), Qt::ScrollBarAlwaysOff);
    QCOMPARE(view.verticalScrollBarPolicy(), Qt::ScrollBarAlwaysOn);
    QCOMPARE(view.frameShape(), QFrame::NoFrame);
    QVERIFY(view.acceptDrops());
    QCOMPARE(view.scene()->backgroundBrush(), QBrush(QColor(0x31, 0x31, 0x31)));
    for (const char *slot :
         {"slotWidgetsListChanged()", "slotUpdateSceneWithSizes()", "slotBeforeDeleteNode(KvReportNode*)"})
        QVERIFY2(view.metaObject()->indexOfSlot(slot) >= 0, slot);
}

void KvReportPagedViewTest::staysEmptyWithoutAModel()
{
    KvReportPagedView view;
    QVERIFY(!view.model());
    view.slotWidgetsListChanged();
    view.slotUpdateSceneWithSizes();
    view.slotBeforeDeleteNode(nullptr);
    QCOMPARE(view.pages().size(), 0);
    QCOMPARE(view.scene()->items().size(), 0);
    view.setModel(nullptr);
    QCOMPARE(view.scene()->items().size(), 0);
}

void KvReportPagedViewTest::anEmptyTemplateHasOnePage()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    QCOMPARE(view.model(), report.model());
    QCOMPARE(view.pages().size(), 1);
    QCOMPARE(view.pages().first()->pageRect(), QRect(20, 20, 952, 1346));
    QCOMPARE(view.pieceItems().size(), 0);
    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    report.model()->setPageNumberingEnabled(true);
    QCOMPARE(view.pages().size(), 1);
    QVERIFY(view.pages().first()->headerWidget());
    QVERIFY(view.pages().first()->footerWidget());
    QCOMPARE(pageNumbersOf(view), QStringList(QStringLiteral("1/1")));
}

void KvReportPagedViewTest::flowsBlocks_data()
{
    QTest::addColumn<QVector<QVector<int>>>("blocks");
    QTest::addColumn<QVector<QPoint>>("places");
    QTest::addColumn<int>("pages");

    using Blocks = QVector<QVector<int>>;
    using Places = QVector<QPoint>;
    const auto at = [](int page, int y) { return QPoint(20, contentTop(page) + y); };
    QTest::newRow("one") << Blocks{{100}} << Places{at(0, 0)} << 1;
    QTest::newRow("two blocks") << Blocks{{100}, {50}} << Places{at(0, 0), at(0, 101)} << 1;
    QTest::newRow("pieces of one block")
        << Blocks{{100, 50}, {7}} << Places{at(0, 0), at(0, 101), at(0, 152)} << 1;
    QTest::newRow("just fits") << Blocks{{1304}} << Places{at(0, 0)} << 1;
    QTest::newRow("one pixel too high") << Blocks{{1305}} << Places{at(1, 0)} << 2;
    QTest::newRow("page full") << Blocks{{1304}, {10}} << Places{at(0, 0), at(1, 0)} << 2;
    QTest::newRow("too high at first")
        << Blocks{{3000}, {10}, {10}} << Places{at(1, 0), at(2, 0), at(2, 11)} << 3;
    QTest::newRow("too high in between")
        << Blocks{{10}, {3000}, {10}} << Places{at(0, 0), at(1, 0), at(2, 0)} << 3;
    QTest::newRow("no pieces") << Blocks{{}, {10}, {}} << Places{at(0, 0)} << 1;
}

void KvReportPagedViewTest::flowsBlocks()
{
    QFETCH(QVector<QVector<int>>, blocks);
    QFETCH(int, pages);
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    for (const QVector<int> &heights : qAsConst(blocks))
        report.addFake(heights);
    QTEST(placesOf(view), "places");
    QCOMPARE(view.pages().size(), pages);
    for (const KvReportProxyWidgetItem *item : view.pieceItems()) {
        QCOMPARE(item->size().width(), 952.0);
        QCOMPARE(item->zValue(), 0.0);
        QCOMPARE(item->scene(), view.scene());
        QVERIFY(item->node());
        QCOMPARE(item->displayWidget(), item->node()->displayWidget());
    }
    // The size pass comes to the same result.
    view.slotUpdateSceneWithSizes();
    QTEST(placesOf(view), "places");
    QCOMPARE(view.pages().size(), pages);
}

void KvReportPagedViewTest::skipsNullPieces()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    report.addFake({-1, 100, -1, 50, -1});
    report.addFake({-1});
    report.addFake({20});
    report.fakeFactory()->setWithoutWidgets(true);
    report.addFake({30});
    QCOMPARE(placesOf(view), QVector<QPoint>({QPoint(20, 40), QPoint(20, 141), QPoint(20, 192)}));
}

void KvReportPagedViewTest::setsTheSceneRectangle()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    // Right and bottom are the last pixels inside: 971 and 1365.
    QCOMPARE(view.sceneRect(), QRectF(0, 0, 991, 1385));
    report.addFake({1304, 10});
    QCOMPARE(view.sceneRect(), QRectF(0, 0, 991, 2751));
    FakeReport::fakeWidget(report.model()->node(0))->piece(0)->setHeightHint(10);
    view.slotUpdateSceneWithSizes();
    QCOMPARE(view.sceneRect(), QRectF(0, 0, 991, 1385));
}

void KvReportPagedViewTest::rebuildsKeepTheDisplayWidgets()
{
    FakeReport report;
    report.setRowCount(100);
    KvReportPagedView view;
    view.setModel(report.model());
    KvReportNode *fake = report.addFake({100, 1300});
    KvReportNode *text = report.addText(QStringLiteral("some text"));
    KvReportNode *table = report.addTable();
    report.model()->beginLiveUpdates();
    report.model()->setHeaderEnabled(true);
    report.model()->setPageNumberingEnabled(true);
    deliverQueuedCalls();

    QVector<KvBaseDisplayWidget *> widgets;
    QVector<QWidget *> pieces;
    const auto look = [&]() {
        widgets.clear();
        pieces.clear();
        for (KvReportNode *node : {fake, text, table})
            widgets.append(node->displayWidget());
        for (const KvReportProxyWidgetItem *item : view.pieceItems())
            pieces.append(pieceOf(item));
    };
    look();
    const QVector<KvBaseDisplayWidget *> widgetsBefore = widgets;
    const QVector<QWidget *> piecesBefore = pieces;
    const int widgetCount = QApplication::allWidgets().size();
    const int itemCount = view.scene()->items().size();
    QVERIFY(pieces.size() > 5);
    for (int i = 0; i < 3; ++i) {
        view.slotWidgetsListChanged();
        deliverQueuedCalls();
        look();
        QCOMPARE(widgets, widgetsBefore);
        QCOMPARE(pieces, piecesBefore);
        QCOMPARE(QApplication::allWidgets().size(), widgetCount);
        QCOMPARE(view.scene()->items().size(), itemCount);
        QCOMPARE(FakePiece::alive(), 2);
    }
    report.model()->endLiveUpdates();
}

void KvReportPagedViewTest::rebuildsConnectOnce()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    FakeBlockWidget *widget = FakeReport::fakeWidget(report.addFake({100}));
    const auto sizeRequestsOfOneSignal = [widget]() {
        const int before = widget->piece(0)->sizeRequests();
        emit widget->displaySignals()->signalWidgetChanged();
        return widget->piece(0)->sizeRequests() - before;
    };
    const auto rebuildsOfOneSignal = [widget]() {
        const int before = widget->pieceRequests();
        emit widget->displaySignals()->signalSubWidgetsChanged();
        deliverQueuedCalls();
        return widget->pieceRequests() - before;
    };
    const int once = sizeRequestsOfOneSignal();
    QVERIFY(once > 0);
    QCOMPARE(rebuildsOfOneSignal(), 1);
    for (int i = 0; i < 3; ++i)
        view.slotWidgetsListChanged();
    QCOMPARE(sizeRequestsOfOneSignal(), once);
    QCOMPARE(rebuildsOfOneSignal(), 1);
}

void KvReportPagedViewTest::rebuildsKeepTheScrollPosition()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    report.addFake({1300, 1300, 1300});
    showView(view, QSize(1000, 600));
    view.verticalScrollBar()->setValue(1500);
    QCOMPARE(view.verticalScrollBar()->value(), 1500);
    report.addFake({100});
    QCOMPARE(view.verticalScrollBar()->value(), 1500);
    view.slotUpdateSceneWithSizes();
    QCOMPARE(view.verticalScrollBar()->value(), 1500);
}

void KvReportPagedViewTest::modelSignalsWorkAtOnce()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    report.addFake({10});
    QCOMPARE(view.pieceItems().size(), 1);
    report.addFake({10});
    QCOMPARE(view.pieceItems().size(), 2);
    report.model()->moveNode(0, 1);
    QCOMPARE(view.pieceItems().first()->node(), report.model()->node(1));
    report.model()->notifyListChanged();
    QCOMPARE(view.pieceItems().first()->node(), report.model()->node(0));
    report.model()->removeNode(report.model()->node(0));
    QCOMPARE(view.pieceItems().size(), 1);
    report.model()->clearNodes();
    QCOMPARE(view.pieceItems().size(), 0);
    QCOMPARE(view.pages().size(), 1);
}

void KvReportPagedViewTest::changedPiecesWorkQueued()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    KvReportNode *node = report.addFake({10});
    FakeReport::fakeCfg(node)->setHeights({10, 20});
    emit node->displayWidget()->displaySignals()->signalSubWidgetsChanged();
    QCOMPARE(view.pieceItems().size(), 1);
    deliverQueuedCalls();
    QCOMPARE(view.pieceItems().size(), 2);
    QCOMPARE(placesOf(view), QVector<QPoint>({QPoint(20, 40), QPoint(20, 51)}));
    FakeReport::fakeCfg(node)->setHeights({});
    emit node->displayWidget()->displaySignals()->signalSubWidgetsChanged();
    deliverQueuedCalls();
    QCOMPARE(view.pieceItems().size(), 0);
}

void KvReportPagedViewTest::aLoadCostsOneRebuild_data()
{
    QTest::addColumn<QByteArray>("tail");
    QTest::addColumn<bool>("loads");
    QTest::newRow("known blocks") << QByteArray() << true;
    QTest::newRow("unknown one at the end") << QByteArray(R"(, {"name": "Pony", "config": {}})") << true;
    QTest::newRow("refused one at the end") << QByteArray(R"(, {"name": "Fake", "config": {}})") << false;
}

void KvReportPagedViewTest::aLoadCostsOneRebuild()
{
    QFETCH(QByteArray, tail);
    QFETCH(bool, loads);
    QByteArray nodes;
    for (int i = 0; i < 200; ++i)
        nodes += QByteArray(i > 0 ? "," : "") + R"({"name": "Fake", "config": {"heights": [30]}})";
    const QString path = temporaryPath(QStringLiteral("many.rtp"));
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(R"({"header": {"enabled": true, "text": "top"}, "nodes": [)" + nodes + tail + "]}");
    file.close();

    FakeReport report;
    report.addFake({10});
    KvReportPagedView view;
    view.setModel(report.model());
    QCOMPARE(report.model()->load(path), loads);
    // Content of 1304 less the header; 31 a piece.
    QCOMPARE(view.pieceItems().size(), 200);
    QVERIFY(view.pages().size() >= 5);
    int requests = 0;
    for (KvReportNode *node : report.model()->nodes())
        requests += FakeReport::fakeWidget(node)->pieceRequests();
    QCOMPARE(requests, 200);
    for (const KvReportPage *page : view.pages())
        QCOMPARE(page->headerWidget()->toPlainText(), QStringLiteral("top"));
}

void KvReportPagedViewTest::aRefusedLoadShowsWhatWasRead()
{
    const QString path = temporaryPath(QStringLiteral("refused.rtp"));
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(R"({"config": {"pageWidth": 600}, "nodes": [{"name": "Fake", "config": {"heights": [30, 40]}},
                   {"name": "Fake"}, {"name": "Fake", "config": {"heights": [50]}}]})");
    file.close();
    FakeReport report;
    report.addFake({10});
    KvReportPagedView view;
    view.setModel(report.model());
    QVERIFY(!report.model()->load(path));
    QCOMPARE(placesOf(view), QVector<QPoint>({QPoint(20, 40), QPoint(20, 71)}));
    QCOMPARE(view.pages().first()->pageRect(), QRect(20, 20, 600, 848));
}

void KvReportPagedViewTest::newTemplateWithSections()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    report.model()->header()->setText(QLatin1String(kBigHeader));
    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    report.model()->setPageNumberingEnabled(true);
    report.addFake({1000, 1000});
    showView(view, QSize(1000, 600));
    report.model()->newTemplate();
    QCOMPARE(view.pages().size(), 1);
    QVERIFY(!view.pages().first()->headerWidget());
    QVERIFY(!view.pages().first()->footerWidget());
    QCOMPARE(pageNumbersOf(view), QStringList());
    QCOMPARE(view.pages().first()->pageRect().width(), 952);
    deliverQueuedCalls();
    QVERIFY(!view.grab().isNull());
    report.model()->setHeaderEnabled(true);
    QCOMPARE(view.pages().first()->headerWidget()->toPlainText(), QString());
}

void KvReportPagedViewTest::sectionsComeAndGo()
{
    FakeReport report;
    report.model()->header()->setText(QLatin1String(kBigHeader));
    report.model()->footer()->setText(QLatin1String(kBigHeader));
    KvReportPagedView view;
    view.setModel(report.model());
    report.addFake({1304, 10});
    QCOMPARE(view.pages().size(), 2);
    const QRect before = view.pages().at(1)->contentRect();

    report.model()->setHeaderEnabled(true);
    QCOMPARE(view.pages().size(), 3); // the first piece fits no page now
    for (const KvReportPage *page : view.pages()) {
        const int height = page->headerWidget()->height();
        QVERIFY(height >= 40);
        QCOMPARE(page->contentRect().height(), before.height() - height);
        QCOMPARE(page->contentRect().top(), page->pageRect().top() + 20 + height);
    }
    report.model()->setFooterEnabled(true);
    for (const KvReportPage *page : view.pages())
        QCOMPARE(page->contentRect().height(),
                 before.height() - page->headerWidget()->height() - page->footerWidget()->height());
    report.model()->setHeaderEnabled(false);
    report.model()->setFooterEnabled(false);
    QCOMPARE(view.pages().size(), 2);
    QCOMPARE(view.pages().at(1)->contentRect(), before);
}

void KvReportPagedViewTest::headerTogglingSplitsTablesOnce()
{
    FakeReport report;
    report.setRowCount(39); // fill a page without header to the last row
    report.model()->header()->setText(QLatin1String(kBigHeader));
    KvReportPagedView view;
    view.setModel(report.model());
    report.model()->beginLiveUpdates();
    KvReportNode *table = report.addTable();
    deliverQueuedCalls();
    QCOMPARE(view.pieceItems().size(), 1);
    QCOMPARE(view.pages().size(), 1);

    const QSignalSpy pieces(table->displayWidget()->displaySignals(), SIGNAL(signalSubWidgetsChanged()));
    const QSignalSpy height(report.model()->context(), SIGNAL(signalContentHeightChanged()));
    report.model()->setHeaderEnabled(true);
    QCOMPARE(table->displayWidget()->subWidgetCount(), 2);
    deliverQueuedCalls();
    QCOMPARE(pieces.count(), 1);
    QCOMPARE(height.count(), 1);
    QCOMPARE(view.pieceItems().size(), 2);
    QCOMPARE(view.pages().size(), 2);

    report.model()->setHeaderEnabled(false);
    deliverQueuedCalls();
    QCOMPARE(pieces.count(), 2);
    QCOMPARE(height.count(), 2);
    QCOMPARE(view.pieceItems().size(), 1);
    QCOMPARE(view.pages().size(), 1);
    report.model()->endLiveUpdates();
}

void KvReportPagedViewTest::sizeChangesFlowAnew()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    FakeBlockWidget *first = FakeReport::fakeWidget(report.addFake({100}));
    report.addFake({50});
    const KvReportProxyWidgetItem *item = view.pieceItems().first();
    first->piece(0)->setHeightHint(300);
    emit first->displaySignals()->signalWidgetChanged();
    QCOMPARE(view.pieceItems().first(), item);
    QCOMPARE(item->pieceHeight(), 300);
    QCOMPARE(placesOf(view), QVector<QPoint>({QPoint(20, 40), QPoint(20, 341)}));
    first->piece(0)->setHeightHint(5);
    emit first->displaySignals()->signalWidgetChanged();
    QCOMPARE(placesOf(view), QVector<QPoint>({QPoint(20, 40), QPoint(20, 46)}));
    first->piece(0)->setHeightHint(1400);
    emit first->displaySignals()->signalWidgetChanged();
    QCOMPARE(placesOf(view), QVector<QPoint>({QPoint(20, contentTop(1)), QPoint(20, contentTop(2))}));
}

void KvReportPagedViewTest::pagesAreAddedAndDropped()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    report.model()->setPageNumberingEnabled(true);
    FakeBlockWidget *widget = FakeReport::fakeWidget(report.addFake({600, 600}));
    QCOMPARE(pageNumbersOf(view), QStringList(QStringLiteral("1/1")));
    const KvReportPage *firstPage = view.pages().first();
    widget->piece(0)->setHeightHint(1400);
    emit widget->displaySignals()->signalWidgetChanged();
    QCOMPARE(pageNumbersOf(view),
             QStringList({QStringLiteral("1/3"), QStringLiteral("2/3"), QStringLiteral("3/3")}));
    widget->piece(0)->setHeightHint(800);
    emit widget->displaySignals()->signalWidgetChanged();
    QCOMPARE(pageNumbersOf(view), QStringList({QStringLiteral("1/2"), QStringLiteral("2/2")}));
    widget->piece(0)->setHeightHint(100);
    emit widget->displaySignals()->signalWidgetChanged();
    QCOMPARE(pageNumbersOf(view), QStringList(QStringLiteral("1/1")));
    QCOMPARE(view.pages().first(), firstPage);
    QCOMPARE(view.sceneRect(), QRectF(0, 0, 991, 1385));
    deliverQueuedCalls();
    int pageItems = 0;
    for (QGraphicsItem *item : view.scene()->items())
        pageItems += dynamic_cast<KvReportPage *>(item) ? 1 : 0;
    QCOMPARE(pageItems, 1);
}

void KvReportPagedViewTest::passesAreNotNested()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    report.model()->setHeaderEnabled(true);
    FakeBlockWidget *widget = FakeReport::fakeWidget(report.addFake({100}));
    // A block that answers to the page's content height with a change of its own, as tables do.
    connect(report.model()->context(), &KvTemplateContext::signalContentHeightChanged, this,
            [widget]() { emit widget->displaySignals()->signalWidgetChanged(); });
    const auto requestsDuring = [widget](const std::function<void()> &act) {
        const int before = widget->piece(0)->sizeRequests();
        act();
        return widget->piece(0)->sizeRequests() - before;
    };
    const int once = requestsDuring([&view]() { view.slotUpdateSceneWithSizes(); });
    KvPageSectionWidget *header = view.pages().first()->headerWidget();
    const QSignalSpy height(report.model()->context(), SIGNAL(signalContentHeightChanged()));
    const int edited = requestsDuring([header]() { header->setHtml(QLatin1String(kBigHeader)); });
    QCOMPARE(height.count(), 1);
    QCOMPARE(edited, once);
    // The guard ends with the pass.
    QCOMPARE(requestsDuring([&view]() { view.slotUpdateSceneWithSizes(); }), once);
}

void KvReportPagedViewTest::editingAHeaderMeasuresAllPages()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    report.addFake({1000, 200});
    QCOMPARE(view.pages().size(), 1);
    KvPageSectionWidget *header = view.pages().first()->headerWidget();
    const int before = view.pages().first()->contentRect().height();
    header->setHtml(QLatin1String(kBigHeader) + QLatin1String(kBigHeader));
    QCOMPARE(view.pages().size(), 2);
    QCOMPARE(view.pages().first()->headerWidget(), header);
    for (const KvReportPage *page : view.pages()) {
        QCOMPARE(page->headerWidget()->toPlainText(), QStringLiteral("Header\nHeader"));
        QVERIFY(page->contentRect().height() < before - 40);
    }
    QCOMPARE(placesOf(view).first(), view.pages().at(0)->contentRect().topLeft());
    QCOMPARE(placesOf(view).last(), view.pages().at(1)->contentRect().topLeft());
    QVERIFY(report.model()->isModified());
}

void KvReportPagedViewTest::editingTheLastHeaderMayDropItsPage()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    report.model()->header()->setText(QLatin1String(kBigHeader) + QLatin1String(kBigHeader));
    report.model()->setHeaderEnabled(true);
    report.addFake({1000, 230});
    QCOMPARE(view.pages().size(), 2);
    // The header that is edited stands on the page that is not needed any more.
    KvPageSectionWidget *header = view.pages().last()->headerWidget();
    QTextCursor cursor(header->document());
    cursor.select(QTextCursor::Document);
    cursor.insertHtml(QStringLiteral("<p style='font-size:8px'>x</p>"));
    QCOMPARE(view.pages().size(), 1);
    deliverQueuedCalls();
    QCOMPARE(view.pages().first()->headerWidget()->toPlainText(), QStringLiteral("x"));
    QVERIFY(!view.grab().isNull());
}

void KvReportPagedViewTest::removedBlocksDisappear()
{
    FakeReport report;
    report.setRowCount(100);
    KvReportPagedView view;
    view.setModel(report.model());
    report.model()->beginLiveUpdates();
    report.addFake({100, 50});
    KvReportNode *table = report.addTable();
    KvReportNode *text = report.addText(QStringLiteral("text"));
    report.addFake({10});
    showView(view, QSize(1000, 600));
    QCOMPARE(view.pieceItems().size(), 2 + 3 + 1 + 1);

    // Without a rebuild: the slot alone takes the items away.
    view.slotBeforeDeleteNode(report.model()->node(0));
    QCOMPARE(view.pieceItems().size(), 5);
    view.slotBeforeDeleteNode(report.model()->node(0));
    QCOMPARE(view.pieceItems().size(), 5);
    QCOMPARE(FakePiece::alive(), 3);

    report.model()->removeNode(table);
    QCOMPARE(view.pieceItems().size(), 2 + 1 + 1);
    report.model()->removeNode(text);
    QCOMPARE(view.pieceItems().size(), 2 + 1);
    deliverQueuedCalls();
    QVERIFY(showsAllPieces(view));
    report.model()->clearNodes();
    deliverQueuedCalls();
    QCOMPARE(FakePiece::alive(), 0);
    QCOMPARE(view.pieceItems().size(), 0);
    report.model()->endLiveUpdates();
}

void KvReportPagedViewTest::pageWidthFollowsTheView()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    report.addFake({100});
    showView(view, QSize(800, 600));
    const int scrollBar = view.verticalScrollBar()->width();
    QVERIFY(scrollBar > 0);
    for (const int width : {800, 1000, 500}) {
        view.resize(width, 600);
        QCOMPARE(view.viewport()->width(), width - scrollBar);
        QCOMPARE(report.model()->pageWidth(), width - scrollBar - 40);
        QCOMPARE(view.pages().first()->pageRect(),
                 QRect(20, 20, report.model()->pageWidth(), report.model()->context()->pageHeight()));
        QCOMPARE(view.pieceItems().first()->size().toSize().width(), report.model()->pageWidth());
    }
    // Another height alone is no reason for a rebuild.
    const int requests = FakeReport::fakeWidget(report.model()->node(0))->pieceRequests();
    view.resize(500, 700);
    QCOMPARE(FakeReport::fakeWidget(report.model()->node(0))->pieceRequests(), requests);
    QVERIFY2(report.model()->isModified(), "the block that was added");
    report.model()->save(temporaryPath(QStringLiteral("width.rtp")));
    view.resize(600, 700);
    QVERIFY2(!report.model()->isModified(), "the page width follows the view silently");
}

void KvReportPagedViewTest::aHiddenViewLeavesThePageWidthAlone()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    view.resize(700, 500);
    QCOMPARE(report.model()->pageWidth(), 952);
    showView(view, QSize(700, 500));
    QCOMPARE(report.model()->pageWidth(), view.viewport()->width() - 40);
    view.hide();
    report.model()->setPageWidth(600);
    view.resize(900, 500);
    QVERIFY(!view.grab().isNull()); // which makes Qt deliver the resize event to the hidden view
    QCOMPARE(report.model()->pageWidth(), 600);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    QCOMPARE(view.viewport()->width(), 900 - view.verticalScrollBar()->width());
    QCOMPARE(report.model()->pageWidth(), view.viewport()->width() - 40);
    QCOMPARE(view.pages().first()->pageRect().width(), report.model()->pageWidth());
}

void KvReportPagedViewTest::loadingLeavesThePageWidthUntilAResize()
{
    const QString path = temporaryPath(QStringLiteral("page600.rtp"));
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(R"({"config": {"pageWidth": 600}, "nodes": []})");
    file.close();
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    showView(view, QSize(1000, 500));
    QVERIFY(report.model()->load(path));
    QCOMPARE(report.model()->pageWidth(), 600);
    QCOMPARE(view.pages().first()->pageRect(), QRect(20, 20, 600, 848));
    view.resize(1000, 501);
    QCOMPARE(report.model()->pageWidth(), view.viewport()->width() - 40);
    QCOMPARE(view.pages().first()->pageRect().width(), report.model()->pageWidth());
}

void KvReportPagedViewTest::textsFollowThePageWidth()
{
    FakeReport report;
    report.setRowCount(3);
    KvReportPagedView view;
    view.setModel(report.model());
    KvReportNode *text = report.addText(QStringLiteral("word ").repeated(100));
    KvReportNode *table = report.addTable();
    showView(view, QSize(1000, 600));
    int lastHeight = 0;
    for (const int width : {1000, 800, 600}) {
        view.resize(width, 600);
        const int page = report.model()->pageWidth();
        const int margin = report.model()->context()->marginPixels();
        QCOMPARE(margin, static_cast<int>(static_cast<float>(page) * 0.12f));
        QCOMPARE(text->displayWidget()->subWidgetAt(0)->width(), page - 2 * margin);
        QCOMPARE(table->displayWidget()->subWidgetAt(0)->width(), page - 2 * margin);
        const int height = view.pieceItems().first()->pieceHeight();
        QVERIFY2(height > lastHeight, "a narrower text is higher");
        lastHeight = height;
        QCOMPARE(placesOf(view).last().y(), 40 + height + 1);
    }
}

void KvReportPagedViewTest::survivesNarrowViews_data()
{
    QTest::addColumn<int>("width");
    for (const int width : {100, 60, 55, 54, 53, 41, 40, 30, 14, 1})
        QTest::addRow("%d", width) << width;
}

void KvReportPagedViewTest::survivesNarrowViews()
{
    QFETCH(int, width);
    FakeReport report;
    report.setRowCount(50);
    report.model()->header()->setText(QLatin1String(kBigHeader));
    KvReportPagedView view;
    view.setModel(report.model());
    report.model()->beginLiveUpdates();
    report.addTable();
    report.addText(QStringLiteral("some words"));
    report.model()->setHeaderEnabled(true);
    report.model()->setPageNumberingEnabled(true);
    showView(view, QSize(600, 400));
    const int before = report.model()->pageWidth();
    view.resize(width, 400);
    deliverQueuedCalls();
    const int wanted = view.viewport()->width() - 40;
    QCOMPARE(report.model()->pageWidth(), wanted > 0 ? wanted : before);
    QVERIFY(!view.grab().isNull());
    view.resize(600, 400);
    deliverQueuedCalls();
    QCOMPARE(report.model()->pageWidth(), before);
    QVERIFY(showsAllPieces(view));
    report.model()->endLiveUpdates();
}

void KvReportPagedViewTest::survivesOddTemplates_data()
{
    QTest::addColumn<int>("pageWidth");
    QTest::addColumn<float>("margin");
    for (int width = -2; width <= 41; ++width)
        QTest::addRow("width %d", width) << width << 0.12f;
    for (const int width : {-2147483647 - 1, -1000, 2147483647, 16777216, 100000})
        QTest::addRow("width %d", width) << width << 0.12f;
    for (const float margin : {0.5f, 1.0f, 10.0f, 1e6f, 1e30f, -1.0f, -1e30f})
        QTest::addRow("margin %g", static_cast<double>(margin)) << 952 << margin;
    QTest::newRow("nothing of anything") << 0 << 0.0f;
    QTest::newRow("all margin") << 10 << 1e30f;
}

void KvReportPagedViewTest::survivesOddTemplates()
{
    QFETCH(int, pageWidth);
    QFETCH(float, margin);
    FakeReport report;
    report.setRowCount(50);
    report.model()->header()->setText(QLatin1String(kBigHeader));
    KvReportPagedView view;
    view.setModel(report.model());
    report.model()->beginLiveUpdates();
    report.addTable();
    report.addText(QStringLiteral("some words"));
    report.addFake({100, 2000});
    showView(view, QSize(600, 400));
    report.model()->setPageWidth(pageWidth);
    report.model()->context()->setMarginWidth(margin);
    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    report.model()->setPageNumberingEnabled(true);
    report.model()->notifyListChanged();
    deliverQueuedCalls();
    view.slotUpdateSceneWithSizes();
    QVERIFY(!view.grab().isNull());
    // Every piece stands once, on pages that are counted right.
    QVERIFY(view.pieceItems().size() >= 4);
    QVERIFY(view.pages().size() <= view.pieceItems().size() + 1);
    QCOMPARE(pageNumbersOf(view).last(), QStringLiteral("%1/%1").arg(view.pages().size()));
    report.model()->endLiveUpdates();
}

void KvReportPagedViewTest::printingLeavesTheBlocksToTheView()
{
    FakeReport report;
    report.setRowCount(100);
    KvReportPagedView view;
    view.setModel(report.model());
    report.model()->beginLiveUpdates();
    report.addFake({100, 1000});
    report.addTable();
    report.addText(QStringLiteral("some words"));
    report.model()->setHeaderEnabled(true);
    showView(view, QSize(900, 600));
    QVERIFY(showsAllPieces(view));
    const QVector<QPoint> places = placesOf(view);
    const QImage before = view.grab().toImage();

    QCOMPARE(report.model()->print(temporaryPath(QStringLiteral("view.pdf"))), 1);
    report.model()->notifyListChanged();
    deliverQueuedCalls();
    QVERIFY(showsAllPieces(view));
    QCOMPARE(placesOf(view), places);
    QCOMPARE(view.grab().toImage(), before);

    // A print that fails has taken the blocks all the same.
    expectWarning(QRegularExpression(QStringLiteral("^QPainter::begin\\(\\): Returned false$")));
    QCOMPARE(report.model()->print(temporaryPath(QStringLiteral("none/view.pdf"))), 0);
    view.slotUpdateSceneWithSizes();
    report.model()->notifyListChanged();
    deliverQueuedCalls();
    QVERIFY(showsAllPieces(view));
    QCOMPARE(placesOf(view), places);
    QCOMPARE(view.grab().toImage(), before);
    report.model()->endLiveUpdates();
}

void KvReportPagedViewTest::showingBringsBackPrintedBlocks()
{
    FakeReport report;
    KvReportPagedView view;
    view.setModel(report.model());
    report.addFake({100, 1000});
    report.addText(QStringLiteral("some words"));
    showView(view, QSize(900, 600));
    const QImage before = view.grab().toImage();
    view.hide();
    // Nobody tells a hidden view of a print.
    QCOMPARE(report.model()->print(temporaryPath(QStringLiteral("hidden.pdf"))), 1);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    QVERIFY(showsAllPieces(view));
    QCOMPARE(view.grab().toImage(), before);
}

void KvReportPagedViewTest::viewAndPrintAgree_data()
{
    QTest::addColumn<int>("viewWidth");
    QTest::addColumn<bool>("sections");
    QTest::addColumn<int>("rows");
    for (const int width : {1006, 700, 1400}) {
        for (const bool sections : {false, true}) {
            for (const int rows : {0, 39, 40, 130})
                QTest::addRow("%d px, %d rows%s", width, rows, sections ? ", sections" : "")
                    << width << sections << rows;
        }
    }
}

void KvReportPagedViewTest::viewAndPrintAgree()
{
    QFETCH(int, viewWidth);
    QFETCH(bool, sections);
    QFETCH(int, rows);
    FakeReport report;
    report.setRowCount(rows);
    report.model()->header()->setText(QLatin1String(kBigHeader));
    report.model()->footer()->setText(QStringLiteral("word ").repeated(80));
    KvReportPagedView view;
    view.setModel(report.model());
    report.model()->beginLiveUpdates();
    report.addText(QStringLiteral("word ").repeated(700));
    report.addTable();
    report.addText(QStringLiteral("word ").repeated(70));
    report.addFake({500, 400, 300});
    if (sections) {
        report.model()->setHeaderEnabled(true);
        report.model()->setFooterEnabled(true);
        report.model()->setPageNumberingEnabled(true);
    }
    showView(view, QSize(viewWidth, 600));
    const QString path = temporaryPath(QStringLiteral("agree.pdf"));
    QCOMPARE(report.model()->print(path), 1);
    QCOMPARE(PdfFile(path).pageCount(), view.pages().size());
    report.model()->notifyListChanged();
    deliverQueuedCalls();
    QCOMPARE(PdfFile(path).pageCount(), view.pages().size());
    report.model()->endLiveUpdates();
}

void KvReportPagedViewTest::aDarkTableStaysDark()
{
    FakeReport report;
    report.setRowCount(3);
    KvReportPagedView view;
    view.setModel(report.model());
    report.model()->beginLiveUpdates();
    auto *cfg = static_cast<KvStatisticsMeasurementsTableNodeCfg *>(report.addTable()->config());
    showView(view, QSize(900, 600));
    const QColor background = cfg->themes()->color(kvCharts::KvChartThemes::TableBackground);
    QVERIFY(background.lightness() < 128);
    const KvReportProxyWidgetItem *item = view.pieceItems().first();
    // In a cell, above its text.
    const QPointF point = item->scenePos() + QPointF(item->size().width() / 2, 5 + 32 + 4);
    const QImage image = view.grab().toImage();
    QCOMPARE(image.pixelColor(view.mapFromScene(point)), background);
    // The paper beside the table.
    QCOMPARE(image.pixelColor(view.mapFromScene(item->scenePos() + QPointF(10, 30))), QColor(Qt::white));
    report.model()->endLiveUpdates();
}

void KvReportPagedViewTest::outlivesTheModel()
{
    FakeReport report;
    report.setRowCount(3);
    KvReportPagedView view;
    view.setModel(report.model());
    report.addFake({100});
    report.addText(QStringLiteral("some words"));
    report.addTable();
    report.model()->setHeaderEnabled(true);
    showView(view, QSize(900, 600));
    report.deleteModel();
    QVERIFY(!view.model());
    view.slotUpdateSceneWithSizes();
    view.resize(700, 500);
    deliverQueuedCalls();
    view.slotWidgetsListChanged();
    QCOMPARE(view.pages().size(), 0);
    QVERIFY(!view.grab().isNull());
}

void KvReportPagedViewTest::leavesThePiecesToTheModel()
{
    FakeReport report;
    KvReportNode *node = report.addFake({100, 50});
    QWidget *text = nullptr;
    {
        KvReportPagedView view;
        view.setModel(report.model());
        text = report.addText(QStringLiteral("some words"))->displayWidget()->subWidgetAt(0);
        showView(view, QSize(900, 600));
    }
    QCOMPARE(FakePiece::alive(), 2);
    QCOMPARE(report.model()->node(1)->displayWidget()->subWidgetAt(0), text);
    KvReportPagedView other;
    other.setModel(report.model());
    showView(other, QSize(900, 600));
    QVERIFY(showsAllPieces(other));
    QCOMPARE(FakePiece::alive(), 2);
    QCOMPARE(pieceOf(other.pieceItems().first()), FakeReport::fakeWidget(node)->piece(0));
}

STATREPORT_TEST_MAIN(KvReportPagedViewTest)
#include "KvReportPagedViewTest.moc"
