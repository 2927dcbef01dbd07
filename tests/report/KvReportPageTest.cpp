// SPDX-License-Identifier: MIT
#include "report/KvReportPage.h"
#include "report/KvHeaderWidget.h"
#include "report/KvPageCountWidget.h"
#include "report/KvReportProxyWidgetItem.h"
#include "support/FakeReport.h"
#include "support/StatReportTest.h"

#include <QGraphicsScene>
#include <QPen>

namespace {

template <typename Item>
QList<Item *> childrenOf(const KvReportPage &page)
{
    QList<Item *> found;
    for (QGraphicsItem *item : page.childItems()) {
        if (auto *match = dynamic_cast<Item *>(item))
            found.append(match);
    }
    return found;
}

KvReportProxyWidgetItem *itemOf(const KvReportPage &page, const QWidget *widget)
{
    for (KvReportProxyWidgetItem *item : childrenOf<KvReportProxyWidgetItem>(page)) {
        if (item->widget() == widget)
            return item;
    }
    return nullptr;
}

KvPageCountWidget *pageCountOf(const KvReportPage &page)
{
    for (KvReportProxyWidgetItem *item : childrenOf<KvReportProxyWidgetItem>(page)) {
        if (auto *label = qobject_cast<KvPageCountWidget *>(item->widget()))
            return label;
    }
    return nullptr;
}

void fillSections(KvTemplateModel *model)
{
    model->header()->setText(QStringLiteral("<p style='font-size:40px'>Header</p>"));
    model->footer()->setText(QStringLiteral("<p style='font-size:25px'>Footer</p>"));
}

} // namespace

class KvReportPageTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void standsInAColumn_data();
    void standsInAColumn();
    void standsAtTheOriginInPrint();
    void isAGroupBelowTheBlocks();
    void hasAWhiteSheetOnScreen();
    void isHitInsideItsRectangle();
    void placesTheHeader_data();
    void placesTheHeader();
    void placesTheFooter_data();
    void placesTheFooter();
    void placesHeaderAndFooter();
    void placesThePageNumber();
    void separatorsAreDashed();
    void printHasNeitherSheetNorLines();
    void tellsTheContentHeight();
    void updatesItsSections();
    void survivesOddPages_data();
    void survivesOddPages();
    void findsSections();
};

void KvReportPageTest::standsInAColumn_data()
{
    QTest::addColumn<int>("pageWidth");
    QTest::addColumn<int>("index");
    QTest::addColumn<QRect>("rect");
    QTest::newRow("first") << 952 << 0 << QRect(20, 20, 952, 1346);
    QTest::newRow("second") << 952 << 1 << QRect(20, 1386, 952, 1346);
    QTest::newRow("eleventh") << 952 << 10 << QRect(20, 13680, 952, 1346);
    QTest::newRow("second at 600") << 600 << 1 << QRect(20, 888, 600, 848);
}

void KvReportPageTest::standsInAColumn()
{
    QFETCH(int, pageWidth);
    QFETCH(int, index);
    QFETCH(QRect, rect);
    FakeReport report;
    report.model()->setPageWidth(pageWidth);
    const KvReportPage page(report.model(), index, false);
    QCOMPARE(page.index(), index);
    QCOMPARE(page.pageRect(), rect);
    QCOMPARE(page.contentRect(), rect.adjusted(0, 20, 0, -20));
}

void KvReportPageTest::standsAtTheOriginInPrint()
{
    FakeReport report;
    const KvReportPage page(report.model(), 3, true);
    QCOMPARE(page.pageRect(), QRect(0, 0, 952, 1346));
    QCOMPARE(page.contentRect(), QRect(0, 20, 952, 1306));
}

void KvReportPageTest::isAGroupBelowTheBlocks()
{
    FakeReport report;
    const KvReportPage page(report.model(), 0, false);
    QCOMPARE(page.zValue(), -1.0);
    QVERIFY(!page.handlesChildEvents());
}

void KvReportPageTest::hasAWhiteSheetOnScreen()
{
    FakeReport report;
    const KvReportPage page(report.model(), 1, false);
    const QList<QGraphicsRectItem *> sheets = childrenOf<QGraphicsRectItem>(page);
    QCOMPARE(sheets.size(), 1);
    QCOMPARE(page.childItems().size(), 1);
    QCOMPARE(sheets.first()->rect(), QRectF(20, 1386, 952, 1346));
    QCOMPARE(sheets.first()->pos(), QPointF(0, 0));
    QCOMPARE(sheets.first()->zValue(), -2.0);
    QCOMPARE(sheets.first()->pen().color(), QColor(Qt::white));
    QCOMPARE(sheets.first()->brush(), QBrush(Qt::white, Qt::SolidPattern));
}

void KvReportPageTest::isHitInsideItsRectangle()
{
    FakeReport report;
    const KvReportPage page(report.model(), 1, false);
    QVERIFY(page.contains(QPointF(20, 1386)));
    QVERIFY(page.contains(QPointF(500, 2000)));
    QVERIFY(page.contains(QPointF(971, 2731)));
    QVERIFY(!page.contains(QPointF(19, 2000)));
    QVERIFY(!page.contains(QPointF(973, 2000)));
    QVERIFY(!page.contains(QPointF(500, 1385)));
    QVERIFY(!page.contains(QPointF(500, 2733)));
}

void KvReportPageTest::placesTheHeader_data()
{
    QTest::addColumn<bool>("printMode");
    QTest::addColumn<QPoint>("topLeft");
    QTest::newRow("screen") << false << QPoint(20, 1386);
    QTest::newRow("print") << true << QPoint(0, 0);
}

void KvReportPageTest::placesTheHeader()
{
    QFETCH(bool, printMode);
    QFETCH(QPoint, topLeft);
    FakeReport report;
    fillSections(report.model());
    report.model()->setHeaderEnabled(true);
    QGraphicsScene scene;
    auto *page = new KvReportPage(report.model(), 1, printMode);
    scene.addItem(page);

    QWidget *header = page->headerWidget();
    QVERIFY(header);
    QVERIFY(!page->footerWidget());
    QCOMPARE(header->styleSheet(), QStringLiteral("QWidget { background-color: white; }"));
    QCOMPARE(header->width(), 952);
    QVERIFY2(header->height() >= 40, "a line of 40 px");
    QVERIFY(header->height() < 100);
    const KvReportProxyWidgetItem *item = itemOf(*page, header);
    QVERIFY(item);
    QVERIFY(!item->node());
    QCOMPARE(item->scenePos(), QPointF(topLeft + QPoint(0, 20)));
    QCOMPARE(item->size(), QSizeF(header->size()));
    QCOMPARE(item->zValue(), 2.0);
    QCOMPARE(page->contentRect(),
             QRect(topLeft.x(), topLeft.y() + 20 + header->height(), 952, 1306 - header->height()));

    const QList<QGraphicsLineItem *> lines = childrenOf<QGraphicsLineItem>(*page);
    QCOMPARE(lines.size(), printMode ? 0 : 1);
    if (!printMode) {
        QCOMPARE(lines.first()->line(), QLineF(0, 0, 952, 0));
        QCOMPARE(lines.first()->scenePos(), QPointF(page->contentRect().topLeft()));
        QCOMPARE(lines.first()->zValue(), 5.0);
    }
}

void KvReportPageTest::placesTheFooter_data()
{
    placesTheHeader_data();
}

void KvReportPageTest::placesTheFooter()
{
    QFETCH(bool, printMode);
    QFETCH(QPoint, topLeft);
    FakeReport report;
    fillSections(report.model());
    report.model()->setFooterEnabled(true);
    const KvReportPage page(report.model(), 1, printMode);

    QWidget *footer = page.footerWidget();
    QVERIFY(footer);
    QVERIFY(!page.headerWidget());
    QCOMPARE(footer->styleSheet(), QStringLiteral("QWidget { background-color: white; }"));
    QCOMPARE(footer->width(), 952);
    QVERIFY(footer->height() >= 25);
    const int height = footer->height();
    QCOMPARE(page.contentRect(), QRect(topLeft.x(), topLeft.y() + 20, 952, 1306 - height));
    const KvReportProxyWidgetItem *item = itemOf(page, footer);
    QVERIFY(item);
    QCOMPARE(item->zValue(), 2.0);
    QCOMPARE(item->pos(), QPointF(page.contentRect().bottomLeft()));

    const QList<QGraphicsLineItem *> lines = childrenOf<QGraphicsLineItem>(page);
    QCOMPARE(lines.size(), printMode ? 0 : 1);
    if (!printMode) {
        QCOMPARE(lines.first()->line(), QLineF(0, 0, 952, 0));
        QCOMPARE(lines.first()->pos(), item->pos());
        QCOMPARE(lines.first()->zValue(), 5.0);
    }
}

void KvReportPageTest::placesHeaderAndFooter()
{
    FakeReport report;
    fillSections(report.model());
    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    const KvReportPage page(report.model(), 0, false);
    const int header = page.headerWidget()->height();
    const int footer = page.footerWidget()->height();
    QVERIFY(header != footer);
    QCOMPARE(page.contentRect(), QRect(20, 40 + header, 952, 1306 - header - footer));
    QCOMPARE(childrenOf<QGraphicsLineItem>(page).size(), 2);
}

void KvReportPageTest::placesThePageNumber()
{
    FakeReport report;
    report.model()->setPageNumberingEnabled(true);
    KvReportPage page(report.model(), 1, false);
    KvPageCountWidget *label = pageCountOf(page);
    QVERIFY(label);
    QCOMPARE(label->text(), QStringLiteral("2"));
    const KvReportProxyWidgetItem *item = itemOf(page, label);
    QCOMPARE(item->zValue(), 3.0);
    const auto expected = [&item]() {
        return QPointF(20 + 952 - 1 - (item->size().width() + 40),
                       1386 + 1346 - 1 - (item->size().height() + 30));
    };
    QCOMPARE(item->pos(), expected());
    // The page number takes nothing from the content.
    QCOMPARE(page.contentRect(), QRect(20, 1406, 952, 1306));

    const qreal narrow = item->size().width();
    page.setPageTotal(12345);
    QCOMPARE(label->text(), QStringLiteral("2/12345"));
    QVERIFY(item->size().width() > narrow);
    QCOMPARE(item->size(), QSizeF(label->sizeHint()));
    QCOMPARE(item->pos(), expected());

    report.model()->setPageNumberingEnabled(false);
    KvReportPage without(report.model(), 0, false);
    QVERIFY(!pageCountOf(without));
    without.setPageTotal(7);
}

void KvReportPageTest::separatorsAreDashed()
{
    FakeReport report;
    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    const KvReportPage page(report.model(), 0, false);
    for (const QGraphicsLineItem *line : childrenOf<QGraphicsLineItem>(page)) {
        const QPen pen = line->pen();
        QCOMPARE(pen.color(), QColor(0x00, 0x65, 0x9d));
        QCOMPARE(pen.widthF(), 1.0);
        QCOMPARE(pen.style(), Qt::CustomDashLine);
        QCOMPARE(pen.dashPattern(), QVector<qreal>({5, 2}));
        QCOMPARE(pen.capStyle(), Qt::SquareCap);
        QCOMPARE(pen.joinStyle(), Qt::BevelJoin);
    }
}

void KvReportPageTest::printHasNeitherSheetNorLines()
{
    FakeReport report;
    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    report.model()->setPageNumberingEnabled(true);
    const KvReportPage page(report.model(), 0, true);
    QCOMPARE(childrenOf<KvReportProxyWidgetItem>(page).size(), 3);
    QCOMPARE(page.childItems().size(), 3);
}

void KvReportPageTest::tellsTheContentHeight()
{
    FakeReport report;
    KvTemplateContext *context = report.model()->context();
    const QSignalSpy changed(context, SIGNAL(signalContentHeightChanged()));
    KvReportPage page(report.model(), 0, false);
    QCOMPARE(context->contentHeight(), 1304);
    QCOMPARE(changed.count(), 1);
    const KvReportPage second(report.model(), 1, false);
    const KvReportPage printed(report.model(), 0, true);
    page.updateSections();
    QCOMPARE(context->contentHeight(), 1304);
    QCOMPARE(changed.count(), 1);

    fillSections(report.model());
    report.model()->setHeaderEnabled(true);
    const KvReportPage withHeader(report.model(), 0, false);
    QCOMPARE(context->contentHeight(), 1304 - withHeader.headerWidget()->height());
    QCOMPARE(changed.count(), 2);
}

void KvReportPageTest::updatesItsSections()
{
    FakeReport report;
    fillSections(report.model());
    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    QGraphicsScene scene;
    auto *page = new KvReportPage(report.model(), 0, false);
    scene.addItem(page);
    const int headerBefore = page->headerWidget()->height();
    report.model()->header()->setText(QStringLiteral("<p style='font-size:40px'>one</p>"
                                                     "<p style='font-size:40px'>two</p>"));
    report.model()->footer()->setText(QStringLiteral("<p style='font-size:90px'>high</p>"));
    emit report.model()->context()->signalTemplateModified();
    const QSignalSpy changed(report.model()->context(), SIGNAL(signalContentHeightChanged()));
    page->updateSections();

    const int header = page->headerWidget()->height();
    const int footer = page->footerWidget()->height();
    QVERIFY(header > headerBefore + 40);
    QVERIFY(footer >= 90);
    QCOMPARE(page->contentRect(), QRect(20, 40 + header, 952, 1306 - header - footer));
    QCOMPARE(itemOf(*page, page->headerWidget())->size(), QSizeF(952, header));
    QCOMPARE(itemOf(*page, page->footerWidget())->pos(), QPointF(page->contentRect().bottomLeft()));
    QList<QPointF> linePositions;
    for (const QGraphicsLineItem *line : childrenOf<QGraphicsLineItem>(*page))
        linePositions.append(line->pos());
    QCOMPARE(linePositions,
             QList<QPointF>({page->contentRect().topLeft(), page->contentRect().bottomLeft()}));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(report.model()->context()->contentHeight(), page->contentRect().height() - 2);
    page->updateSections();
    QCOMPARE(changed.count(), 1);

    report.model()->header()->setText(QString());
    emit report.model()->context()->signalTemplateModified();
    page->updateSections();
    QVERIFY(page->headerWidget()->height() < headerBefore);
    QCOMPARE(page->contentRect().height(), 1306 - page->headerWidget()->height() - footer);
}

void KvReportPageTest::survivesOddPages_data()
{
    QTest::addColumn<int>("pageWidth");
    for (const int width : {-2147483647 - 1, -1000, -5, -1, 0, 1, 2, 10, 39, 40, 41, 1000000, 16777215,
                            16777216, 2147483600, 2147483647})
        QTest::addRow("%d", width) << width;
}

void KvReportPageTest::survivesOddPages()
{
    QFETCH(int, pageWidth);
    FakeReport report;
    fillSections(report.model());
    report.model()->setPageWidth(pageWidth);
    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    report.model()->setPageNumberingEnabled(true);
    for (const bool printMode : {false, true}) {
        QGraphicsScene scene;
        auto *page = new KvReportPage(report.model(), 300, printMode);
        scene.addItem(page);
        page->updateSections();
        page->setPageTotal(301);
        QVERIFY(page->pageRect().width() >= 0);
        QVERIFY(page->pageRect().height() >= 0);
        QCOMPARE(pageCountOf(*page)->text(), QStringLiteral("301/301"));
    }
}

void KvReportPageTest::findsSections()
{
    FakeReport report;
    fillSections(report.model());
    QGraphicsScene scene;
    auto *bare = new KvReportPage(report.model(), 0, false);
    scene.addItem(bare);
    QVERIFY(!bare->sectionItemAt(QPointF(300, 50)));
    QVERIFY(!bare->sectionItemAt(QPointF(971 - 42, 1365 - 32)));

    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    report.model()->setPageNumberingEnabled(true);
    auto *page = new KvReportPage(report.model(), 1, false);
    scene.addItem(page);
    page->setPageTotal(2);
    const QRect rect = page->pageRect();
    const auto widgetAt = [page](const QPointF &point) {
        const KvReportProxyWidgetItem *item = page->sectionItemAt(point);
        return item ? item->widget() : nullptr;
    };
    QCOMPARE(widgetAt(QPointF(300, rect.top() + 25)), page->headerWidget());
    QCOMPARE(widgetAt(QPointF(300, page->contentRect().bottom() + 5)), page->footerWidget());
    // The page number stands over the footer.
    const KvReportProxyWidgetItem *number = itemOf(*page, pageCountOf(*page));
    QVERIFY(number);
    QCOMPARE(page->sectionItemAt(number->scenePos() + QPointF(1, 1)), number);
    for (const QPointF &point :
         {QPointF(300, rect.top() + 10), QPointF(300, rect.top() + 600), QPointF(300, rect.bottom() - 5),
          QPointF(10, rect.top() + 25), QPointF(300, 50)})
        QVERIFY(!page->sectionItemAt(point));
    for (const KvReportProxyWidgetItem *item : childrenOf<KvReportProxyWidgetItem>(*page))
        QVERIFY(!item->belongsToBlock());
}

STATREPORT_TEST_MAIN(KvReportPageTest)
#include "KvReportPageTest.moc"
