// SPDX-License-Identifier: MIT
#include "report/KvPagedLayout.h"
#include "PagedViewTools.h"
#include "report/KvPageSectionWidget.h"
#include "report/KvReportPage.h"
#include "support/FakeReport.h"
#include "support/StatReportTest.h"

#include <QApplication>
#include <QGraphicsProxyWidget>
#include <QGraphicsRectItem>
#include <QGraphicsScene>
#include <QPen>

#include <functional>
#include <memory>

using namespace PagedViewTools;

namespace {

/** Stands for the view: notes what blocks and sections call. */
class LayoutListener : public QObject
{
    Q_OBJECT
public:
    QStringList taken() { return std::exchange(m_calls, {}); }

public slots:
    void slotUpdateSceneWithSizes() { m_calls.append(QStringLiteral("sizes")); }
    void slotWidgetsListChanged() { m_calls.append(QStringLiteral("pieces")); }
    void slotFocusBackToPageView() { m_calls.append(QStringLiteral("focus")); }

private:
    QStringList m_calls;
};

/** A report, its layout, and the scene that it is in. */
class LaidOutReport
{
public:
    FakeReport &report() { return m_report; }
    KvTemplateModel *model() { return m_report.model(); }
    QGraphicsScene &scene() { return m_scene; }
    LayoutListener &listener() { return m_listener; }
    KvPagedLayout &layout() { return m_layout; }
    void rebuild(const KvReportNode *leftOut = nullptr) { m_layout.rebuild(m_report.model(), leftOut); }

    /** The mark's item; null while there is none. */
    QGraphicsRectItem *mark() const
    {
        for (QGraphicsItem *item : m_scene.items()) {
            if (auto *rect = qgraphicsitem_cast<QGraphicsRectItem *>(item); rect && !rect->parentItem())
                return rect;
        }
        return nullptr;
    }
    QVector<QPoint> places() const { return placesOf(m_layout.pieceItems()); }

private:
    FakeReport m_report;
    LayoutListener m_listener;
    QGraphicsScene m_scene;
    KvPagedLayout m_layout{&m_scene, &m_listener};
};

QPoint at(int page, int y)
{
    return QPoint(20, contentTop(page) + y);
}

const char kBigText[] = "<p style='font-size:40px'>Text</p>";

} // namespace

Q_DECLARE_METATYPE(std::function<void(LaidOutReport &)>)

class KvPagedLayoutTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void isEmptyAtFirst();
    void laysBlocksOut();
    void leavesABlockOut();
    void listensToEachBlockOnce();
    void listensToSections();
    void measuresOnlyWhenAsked();
    void forgetsAllWhenCleared();
    void removesABlocksItems();
    void showsAMark_data();
    void showsAMark();
    void theMarkLooksAsFixed();
    void theMarkMovesWithTheWidth();
    void theMarkMovesWhatFollowsToTheNextPage();
    void theMarkStaysOnItsPage();
    void theMarkSurvivesARebuild();
    void marksAmongBlocksWithoutPieces();
    void aMarkOutOfRangeIsNotShown_data();
    void aMarkOutOfRangeIsNotShown();
    void findsTheDropIndex_data();
    void findsTheDropIndex();
    void countsPiecesForADrop();
    void findsPages();
    void findsItems();
    void blocksCoverSections();
    void keepsDroppedPagesUntilTheyAreDeleted();
    void aRebuildDeletesDroppedPages_data();
    void aRebuildDeletesDroppedPages();
    void itemsNeverLeaveTheScene_data();
    void itemsNeverLeaveTheScene();
    void keepsWhatStays();
    void keepsFramesOfAnotherWidth();
    void stacksPiecesInOrder_data();
    void stacksPiecesInOrder();
    void makesAnewWhatChanged_data();
    void makesAnewWhatChanged();
    void makesAllAnewWhereItDropsThem();
    void keptHeadersShowTheTextOfNow();
    void keptPagesAreMeasured();
    void makesPagesAnewForOtherSections_data();
    void makesPagesAnewForOtherSections();
};

void KvPagedLayoutTest::isEmptyAtFirst()
{
    LaidOutReport laidOut;
    const KvPagedLayout &layout = laidOut.layout();
    QCOMPARE(layout.pages().size(), 0);
    QCOMPARE(layout.pieceItems().size(), 0);
    QCOMPARE(layout.dropIndex(), -1);
    QVERIFY(layout.markRect().isNull());
    QVERIFY(!layout.hasDroppedItems());
    QVERIFY(!layout.pageAt(QPointF(50, 50)));
    QVERIFY(!layout.itemAt(QPointF(50, 50)));
    QVERIFY(!layout.blockItemAt(QPointF(50, 50)));
    QVERIFY(!layout.firstItemOf(nullptr));
    QCOMPARE(layout.dropIndexAt(100), 0);
    // Without a template a mark is only noted.
    laidOut.layout().setDropIndex(0);
    QCOMPARE(layout.dropIndex(), 0);
    QCOMPARE(laidOut.scene().items().size(), 0);
}

void KvPagedLayoutTest::laysBlocksOut()
{
    LaidOutReport laidOut;
    laidOut.report().addFake({100, 1200});
    laidOut.report().addFake({7});
    laidOut.rebuild();
    QCOMPARE(laidOut.places(), QVector<QPoint>({at(0, 0), at(0, 101), at(1, 0)}));
    QCOMPARE(laidOut.layout().pages().size(), 2);
    QCOMPARE(laidOut.scene().sceneRect(), QRectF(0, 0, 991, 2751));
    for (const KvReportProxyWidgetItem *item : laidOut.layout().pieceItems()) {
        QCOMPARE(item->scene(), &laidOut.scene());
        QVERIFY(!item->parentItem());
    }
}

void KvPagedLayoutTest::leavesABlockOut()
{
    LaidOutReport laidOut;
    laidOut.report().addFake({100});
    KvReportNode *second = laidOut.report().addFake({50, 60});
    KvReportNode *third = laidOut.report().addFake({7});
    laidOut.rebuild(second);
    QCOMPARE(laidOut.places(), QVector<QPoint>({at(0, 0), at(0, 101)}));
    QCOMPARE(laidOut.layout().pieceItems().last()->node(), third);
    QVERIFY(!laidOut.layout().firstItemOf(second));
    // Passes leave it out, too, and its widget is not made for nothing.
    laidOut.layout().updateSizes();
    QCOMPARE(laidOut.layout().pieceItems().size(), 2);
    QCOMPARE(laidOut.report().fakeFactory()->widgetsMade(), 2);
    laidOut.rebuild();
    QCOMPARE(laidOut.places(), QVector<QPoint>({at(0, 0), at(0, 101), at(0, 152), at(0, 213)}));
}

void KvPagedLayoutTest::listensToEachBlockOnce()
{
    LaidOutReport laidOut;
    KvReportNode *node = laidOut.report().addFake({100});
    KvReportNode *withoutPieces = laidOut.report().addFake({});
    for (int i = 0; i < 3; ++i)
        laidOut.rebuild();
    for (KvReportNode *talking : {node, withoutPieces}) {
        KvBaseDisplayWidgetSignals *said = talking->displayWidget()->displaySignals();
        emit said->signalWidgetChanged();
        QCOMPARE(laidOut.listener().taken(), QStringList(QStringLiteral("sizes")));
        emit said->signalFocusBackToPageView();
        QCOMPARE(laidOut.listener().taken(), QStringList(QStringLiteral("focus")));
        emit said->signalSubWidgetsChanged();
        QCOMPARE(laidOut.listener().taken(), QStringList());
        QCoreApplication::processEvents();
        QCOMPARE(laidOut.listener().taken(), QStringList(QStringLiteral("pieces")));
        emit said->signalWidgetConfigChanged(talking->config());
        QCoreApplication::processEvents();
        QCOMPARE(laidOut.listener().taken(), QStringList());
    }
}

void KvPagedLayoutTest::listensToSections()
{
    LaidOutReport laidOut;
    laidOut.model()->setHeaderEnabled(true);
    laidOut.model()->setFooterEnabled(true);
    laidOut.report().addFake({1000, 1000});
    laidOut.rebuild();
    QCOMPARE(laidOut.layout().pages().size(), 2);
    for (const KvReportPage *page : laidOut.layout().pages()) {
        for (KvPageSectionWidget *section : {page->headerWidget(), page->footerWidget()}) {
            emit section->displaySignals()->signalWidgetChanged();
            QCOMPARE(laidOut.listener().taken(), QStringList(QStringLiteral("sizes")));
            emit section->displaySignals()->signalFocusBackToPageView();
            QCOMPARE(laidOut.listener().taken(), QStringList(QStringLiteral("focus")));
        }
    }
}

void KvPagedLayoutTest::measuresOnlyWhenAsked()
{
    LaidOutReport laidOut;
    KvReportNode *node = laidOut.report().addFake({100});
    laidOut.report().addFake({50});
    laidOut.rebuild();
    FakePiece *piece = FakeReport::fakeWidget(node)->piece(0);
    piece->setHeightHint(30);
    const int requests = piece->sizeRequests();
    laidOut.layout().setDropIndex(0);
    laidOut.layout().setDropIndex(-1);
    QCOMPARE(piece->sizeRequests(), requests);
    QCOMPARE(laidOut.places(), QVector<QPoint>({at(0, 0), at(0, 101)}));
    laidOut.layout().updateSizes();
    QVERIFY(piece->sizeRequests() > requests);
    QCOMPARE(laidOut.places(), QVector<QPoint>({at(0, 0), at(0, 31)}));
}

void KvPagedLayoutTest::forgetsAllWhenCleared()
{
    LaidOutReport laidOut;
    laidOut.model()->setHeaderEnabled(true);
    KvReportNode *node = laidOut.report().addFake({100, 50});
    laidOut.rebuild();
    laidOut.layout().setDropIndex(1);
    laidOut.layout().clear();
    QCOMPARE(laidOut.layout().pages().size(), 0);
    QCOMPARE(laidOut.layout().pieceItems().size(), 0);
    QVERIFY(laidOut.layout().markRect().isNull());
    QCOMPARE(laidOut.scene().items().size(), 0);
    QCOMPARE(FakePiece::alive(), 2);
    QVERIFY(FakeReport::fakeWidget(node)->piece(0));
    QVERIFY(!FakeReport::fakeWidget(node)->piece(0)->parentWidget());
}

void KvPagedLayoutTest::removesABlocksItems()
{
    LaidOutReport laidOut;
    KvReportNode *first = laidOut.report().addFake({100, 50});
    KvReportNode *second = laidOut.report().addFake({10});
    laidOut.rebuild();
    laidOut.layout().removeNode(first);
    QCOMPARE(laidOut.layout().pieceItems().size(), 1);
    QCOMPARE(laidOut.layout().firstItemOf(second), laidOut.layout().pieceItems().first());
    QVERIFY(!laidOut.layout().firstItemOf(first));
    QVERIFY(!laidOut.layout().blockItemAt(QPointF(100, 60)));
    QCOMPARE(FakePiece::alive(), 3);
    // What is left flows without it, around a mark, too.
    laidOut.layout().setDropIndex(1);
    QCOMPARE(laidOut.places(), QVector<QPoint>({at(0, 0)}));
    QCOMPARE(laidOut.layout().markRect(), QRectF(QPointF(at(0, 11)), QSizeF(912, 40)));
    laidOut.layout().removeNode(nullptr);
    laidOut.layout().removeNode(first);
    QCOMPARE(laidOut.layout().pieceItems().size(), 1);
}

void KvPagedLayoutTest::showsAMark_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<QPoint>("mark");
    QTest::addColumn<QVector<QPoint>>("places");
    using Places = QVector<QPoint>;
    // Blocks of 100, of 50 and 60 in two pieces, and of 7.
    QTest::newRow("first") << 0 << at(0, 0) << Places{at(0, 40), at(0, 141), at(0, 192), at(0, 253)};
    QTest::newRow("second") << 1 << at(0, 101) << Places{at(0, 0), at(0, 141), at(0, 192), at(0, 253)};
    QTest::newRow("third") << 2 << at(0, 213) << Places{at(0, 0), at(0, 101), at(0, 152), at(0, 253)};
    QTest::newRow("last") << 3 << at(0, 221) << Places{at(0, 0), at(0, 101), at(0, 152), at(0, 213)};
}

void KvPagedLayoutTest::showsAMark()
{
    QFETCH(int, index);
    QFETCH(QPoint, mark);
    LaidOutReport laidOut;
    laidOut.report().addFake({100});
    laidOut.report().addFake({50, 60});
    laidOut.report().addFake({7});
    laidOut.rebuild();
    const QVector<QPoint> before = laidOut.places();
    const QList<KvReportProxyWidgetItem *> items = laidOut.layout().pieceItems();
    laidOut.layout().setDropIndex(index);
    QCOMPARE(laidOut.layout().dropIndex(), index);
    QCOMPARE(laidOut.layout().markRect(), QRectF(QPointF(mark), QSizeF(912, 40)));
    QTEST(laidOut.places(), "places");
    // The same items: a drag goes on over them.
    QCOMPARE(laidOut.layout().pieceItems(), items);
    laidOut.layout().updateSizes();
    QTEST(laidOut.places(), "places");

    laidOut.layout().setDropIndex(-1);
    QVERIFY(laidOut.layout().markRect().isNull());
    QVERIFY(!laidOut.mark());
    QCOMPARE(laidOut.places(), before);
}

void KvPagedLayoutTest::theMarkLooksAsFixed()
{
    LaidOutReport laidOut;
    laidOut.rebuild();
    laidOut.layout().setDropIndex(0);
    const QGraphicsRectItem *mark = laidOut.mark();
    QVERIFY(mark);
    QCOMPARE(mark->sceneBoundingRect().center(), QRectF(20, 40, 912, 40).center());
    QCOMPARE(mark->pen(), QPen(QColor(0x00, 0x65, 0x9d)));
    QCOMPARE(mark->brush().style(), Qt::SolidPattern);
    QCOMPARE(mark->brush().color().rgb(), QColor(0x00, 0x65, 0x9d).rgb());
    QVERIFY(qAbs(mark->brush().color().alphaF() - 0.3) < 0.001);
    // In front of the page.
    QVERIFY(mark->zValue() > laidOut.layout().pages().first()->zValue());
}

void KvPagedLayoutTest::theMarkMovesWithTheWidth()
{
    LaidOutReport laidOut;
    laidOut.report().addFake({100});
    laidOut.rebuild();
    laidOut.layout().setDropIndex(1);
    laidOut.model()->setPageWidth(600);
    laidOut.rebuild();
    QCOMPARE(laidOut.layout().markRect(), QRectF(20, 141, 560, 40));
}

void KvPagedLayoutTest::theMarkMovesWhatFollowsToTheNextPage()
{
    LaidOutReport laidOut;
    laidOut.report().addFake({1264});
    laidOut.report().addFake({30});
    laidOut.rebuild();
    QCOMPARE(laidOut.layout().pages().size(), 1);
    laidOut.layout().setDropIndex(1);
    QCOMPARE(laidOut.layout().markRect().topLeft(), QPointF(at(0, 1265)));
    QCOMPARE(laidOut.places(), QVector<QPoint>({at(0, 0), at(1, 0)}));
    QCOMPARE(laidOut.layout().pages().size(), 2);
    QCOMPARE(laidOut.scene().sceneRect(), QRectF(0, 0, 991, 2751));
    laidOut.layout().setDropIndex(-1);
    QCOMPARE(laidOut.places(), QVector<QPoint>({at(0, 0), at(0, 1265)}));
    QCOMPARE(laidOut.layout().pages().size(), 1);
    QCOMPARE(laidOut.scene().sceneRect(), QRectF(0, 0, 991, 1385));
}

void KvPagedLayoutTest::theMarkStaysOnItsPage()
{
    LaidOutReport laidOut;
    laidOut.report().addFake({1304});
    laidOut.rebuild();
    // The page is full; the mark hangs over its edge and asks for no other page.
    laidOut.layout().setDropIndex(1);
    QCOMPARE(laidOut.layout().markRect().topLeft(), QPointF(at(0, 1305)));
    QCOMPARE(laidOut.layout().pages().size(), 1);
}

void KvPagedLayoutTest::theMarkSurvivesARebuild()
{
    LaidOutReport laidOut;
    KvReportNode *dragged = laidOut.report().addFake({100});
    laidOut.report().addFake({50});
    laidOut.rebuild(dragged);
    laidOut.layout().setDropIndex(1);
    QCOMPARE(laidOut.layout().markRect().topLeft(), QPointF(at(0, 51)));
    // As when measured values come in during a drag.
    laidOut.rebuild(dragged);
    QCOMPARE(laidOut.layout().dropIndex(), 1);
    QCOMPARE(laidOut.layout().markRect().topLeft(), QPointF(at(0, 51)));
    int marks = 0;
    for (const QGraphicsItem *item : laidOut.scene().items())
        marks += !item->parentItem() && qgraphicsitem_cast<const QGraphicsRectItem *>(item) ? 1 : 0;
    QCOMPARE(marks, 1);
}

void KvPagedLayoutTest::marksAmongBlocksWithoutPieces()
{
    LaidOutReport laidOut;
    laidOut.report().addFake({});
    laidOut.report().addFake({100});
    laidOut.report().addFake({-1});
    laidOut.report().addFake({50});
    laidOut.rebuild();
    const auto markY = [&laidOut](int index) {
        laidOut.layout().setDropIndex(index);
        return laidOut.layout().markRect().toRect().y() - contentTop(0);
    };
    QCOMPARE(markY(0), 0);
    QCOMPARE(markY(1), 0);
    QCOMPARE(markY(2), 101);
    QCOMPARE(markY(3), 101);
    QCOMPARE(markY(4), 152);
}

void KvPagedLayoutTest::aMarkOutOfRangeIsNotShown_data()
{
    QTest::addColumn<int>("index");
    for (const int index : {-2, 2, 1000})
        QTest::addRow("%d", index) << index;
}

void KvPagedLayoutTest::aMarkOutOfRangeIsNotShown()
{
    QFETCH(int, index);
    LaidOutReport laidOut;
    laidOut.report().addFake({100});
    laidOut.rebuild();
    laidOut.layout().setDropIndex(1);
    QVERIFY(laidOut.mark());
    laidOut.layout().setDropIndex(index);
    QVERIFY(!laidOut.mark());
    QVERIFY(laidOut.layout().markRect().isNull());
    QCOMPARE(laidOut.places(), QVector<QPoint>({at(0, 0)}));
}

void KvPagedLayoutTest::findsTheDropIndex_data()
{
    QTest::addColumn<double>("y");
    QTest::addColumn<int>("index");
    // Pieces of 100 and 50, and one of 1200 on the second page.
    const auto row = [](const char *name, int page, double y, int index) {
        QTest::newRow(name) << contentTop(page) + y << index;
    };
    row("above all pages", 0, -100, 0);
    row("above the first", 0, -5, 0);
    row("top of the first", 0, 0, 0);
    row("upper half of the first", 0, 49.5, 0);
    row("middle of the first", 0, 50, 1);
    row("lower half of the first", 0, 50.5, 1);
    row("gap", 0, 100.5, 1);
    row("upper half of the second", 0, 125, 1);
    row("middle of the second", 0, 126, 2);
    row("lower half of the second", 0, 150, 2);
    row("end of the first page", 0, 1300, 2);
    row("upper half on the second page", 1, 599, 2);
    row("lower half on the second page", 1, 601, 3);
    row("below the last", 1, 1250, 3);
    row("below all pages", 2, 1000, 3);
}

void KvPagedLayoutTest::findsTheDropIndex()
{
    QFETCH(double, y);
    LaidOutReport laidOut;
    laidOut.report().addFake({100});
    laidOut.report().addFake({50});
    laidOut.report().addFake({1200});
    laidOut.rebuild();
    QTEST(laidOut.layout().dropIndexAt(y), "index");
}

void KvPagedLayoutTest::countsPiecesForADrop()
{
    LaidOutReport laidOut;
    laidOut.report().addFake({100, 100, 100});
    laidOut.report().addFake({50});
    laidOut.rebuild();
    const auto indexAt = [&laidOut](int y) { return laidOut.layout().dropIndexAt(contentTop(0) + y); };
    QCOMPARE(indexAt(10), 0);
    QCOMPARE(indexAt(160), 2);
    QCOMPARE(indexAt(310), 3);
    QCOMPARE(indexAt(340), 4);
    // There are two blocks only: none stands at 3, so that no mark is shown.
    laidOut.layout().setDropIndex(indexAt(310));
    QVERIFY(!laidOut.mark());
    // The mark of 1 stands before the second block, wherever in the first one it came from.
    laidOut.layout().setDropIndex(indexAt(60));
    QCOMPARE(laidOut.layout().markRect().topLeft(), QPointF(at(0, 303)));
}

void KvPagedLayoutTest::findsPages()
{
    LaidOutReport laidOut;
    laidOut.report().addFake({1300, 100});
    laidOut.rebuild();
    const KvPagedLayout &layout = laidOut.layout();
    KvReportPage *first = layout.pages().first();
    KvReportPage *second = layout.pages().last();
    QCOMPARE(layout.pageAt(QPointF(20, 20)), first);
    QCOMPARE(layout.pageAt(QPointF(500, 1365)), first);
    QVERIFY(!layout.pageAt(QPointF(500, 1376)));
    QCOMPARE(layout.pageAt(QPointF(500, 1387)), second);
    QVERIFY(!layout.pageAt(QPointF(10, 500)));
    QVERIFY(!layout.pageAt(QPointF(980, 500)));
    QVERIFY(!layout.pageAt(QPointF(500, 3000)));
}

void KvPagedLayoutTest::findsItems()
{
    LaidOutReport laidOut;
    laidOut.model()->header()->setText(QLatin1String(kBigText));
    laidOut.model()->footer()->setText(QLatin1String(kBigText));
    laidOut.model()->setHeaderEnabled(true);
    laidOut.model()->setFooterEnabled(true);
    laidOut.model()->setPageNumberingEnabled(true);
    KvReportNode *node = laidOut.report().addFake({100, 50});
    laidOut.rebuild();
    const KvPagedLayout &layout = laidOut.layout();
    const KvReportPage *page = layout.pages().first();
    const QRect content = page->contentRect();

    QCOMPARE(layout.itemAt(QPointF(content.topLeft()) + QPointF(300, 50)), layout.pieceItems().at(0));
    QCOMPARE(layout.itemAt(QPointF(content.topLeft()) + QPointF(300, 120)), layout.pieceItems().at(1));
    QCOMPARE(layout.firstItemOf(node), layout.pieceItems().at(0));
    QVERIFY(!layout.itemAt(QPointF(content.topLeft()) + QPointF(300, 500)));
    const KvReportProxyWidgetItem *header = layout.itemAt(QPointF(300, 50));
    QVERIFY(header);
    QCOMPARE(header->widget(), page->headerWidget());
    const KvReportProxyWidgetItem *footer = layout.itemAt(QPointF(300, content.bottom() + 10));
    QVERIFY(footer);
    QCOMPARE(footer->widget(), page->footerWidget());
    // The page number stands on the footer.
    const KvReportProxyWidgetItem *number = layout.itemAt(QPointF(971 - 45, 1365 - 35));
    QVERIFY(number);
    QCOMPARE(number->displayWidget()->displayName(), QStringLiteral("Page count"));
    for (const KvReportProxyWidgetItem *section : {header, footer, number}) {
        QVERIFY(!section->belongsToBlock());
        QVERIFY(!layout.blockItemAt(section->scenePos() + QPointF(1, 1)));
    }
}

void KvPagedLayoutTest::blocksCoverSections()
{
    LaidOutReport laidOut;
    laidOut.model()->header()->setText(QLatin1String(kBigText));
    laidOut.model()->setHeaderEnabled(true);
    laidOut.report().addFake({3000});
    laidOut.report().addFake({10});
    laidOut.rebuild();
    // The piece overflows the second page, and covers the header of the third.
    const KvPagedLayout &layout = laidOut.layout();
    QCOMPARE(layout.pages().size(), 3);
    const QPointF onHeader(300, layout.pages().last()->pageRect().top() + 30);
    QCOMPARE(layout.itemAt(onHeader), layout.pieceItems().first());
    QVERIFY(layout.pages().last()->sectionItemAt(onHeader));
}

void KvPagedLayoutTest::keepsDroppedPagesUntilTheyAreDeleted()
{
    LaidOutReport laidOut;
    laidOut.model()->setHeaderEnabled(true);
    KvReportNode *node = laidOut.report().addFake({1200, 1200});
    laidOut.rebuild();
    QCOMPARE(laidOut.layout().pages().size(), 2);
    const QPointer<KvPageSectionWidget> header = laidOut.layout().pages().last()->headerWidget();
    FakeReport::fakeWidget(node)->piece(1)->setHeightHint(10);
    laidOut.layout().updateSizes();
    QCOMPARE(laidOut.layout().pages().size(), 1);
    QVERIFY(laidOut.layout().hasDroppedItems());
    QVERIFY(header);
    QVERIFY(!laidOut.layout().itemAt(QPointF(300, 1386 + 25)));
    laidOut.layout().deleteDroppedItems();
    QVERIFY(!laidOut.layout().hasDroppedItems());
    QVERIFY(!header);
}

void KvPagedLayoutTest::aRebuildDeletesDroppedPages_data()
{
    QTest::addColumn<bool>("clear");
    QTest::newRow("rebuilt") << false;
    QTest::newRow("cleared") << true;
}

void KvPagedLayoutTest::aRebuildDeletesDroppedPages()
{
    QFETCH(bool, clear);
    LaidOutReport laidOut;
    laidOut.model()->setHeaderEnabled(true);
    laidOut.report().addFake({1250});
    laidOut.rebuild();
    laidOut.layout().setDropIndex(0);
    QCOMPARE(laidOut.layout().pages().size(), 2);
    laidOut.layout().setDropIndex(-1);
    QVERIFY(laidOut.layout().hasDroppedItems());
    // A new template replaces the sections that headers on these pages show.
    if (clear)
        laidOut.layout().clear();
    else
        laidOut.rebuild();
    QVERIFY(!laidOut.layout().hasDroppedItems());
}

void KvPagedLayoutTest::itemsNeverLeaveTheScene_data()
{
    using Act = std::function<void(LaidOutReport &)>;
    QTest::addColumn<std::function<void(LaidOutReport &)>>("act");
    QTest::newRow("pieces shrink") << Act([](LaidOutReport &laidOut) {
        FakeReport::fakeWidget(laidOut.model()->node(0))->piece(1)->setHeightHint(10);
        laidOut.layout().updateSizes();
    });
    QTest::newRow("the mark goes") << Act([](LaidOutReport &laidOut) {
        laidOut.layout().setDropIndex(0);
        QCOMPARE(laidOut.layout().pages().size(), 3);
        laidOut.layout().setDropIndex(-1);
    });
    QTest::newRow("rebuilt") << Act([](LaidOutReport &laidOut) {
        laidOut.layout().rebuild(laidOut.model(), nullptr, KvPagedLayout::OldItems::Dropped);
    });
}

void KvPagedLayoutTest::itemsNeverLeaveTheScene()
{
    // Those that live on somewhere else would be followed by the scene after their death.
    QFETCH(std::function<void(LaidOutReport &)>, act);
    LaidOutReport laidOut;
    laidOut.model()->setHeaderEnabled(true);
    laidOut.model()->setPageNumberingEnabled(true);
    laidOut.report().addFake({1240, 1240});
    laidOut.rebuild();
    QCOMPARE(laidOut.layout().pages().size(), 2);
    act(laidOut);
    QVERIFY(laidOut.layout().hasDroppedItems());
    int embedded = 0;
    for (const QWidget *widget : QApplication::topLevelWidgets()) {
        const QGraphicsProxyWidget *item = widget->graphicsProxyWidget();
        embedded += item ? 1 : 0;
        QVERIFY(!item || item->scene() == &laidOut.scene());
    }
    int shown = 0;
    for (const QGraphicsItem *item : laidOut.scene().items())
        shown += item->isWidget() && item->isVisible() ? 1 : 0;
    QCOMPARE(shown, laidOut.layout().pieceItems().size() + 2 * laidOut.layout().pages().size());
    QVERIFY(embedded > shown);
}

void KvPagedLayoutTest::keepsWhatStays()
{
    LaidOutReport laidOut;
    laidOut.model()->setHeaderEnabled(true);
    laidOut.model()->setFooterEnabled(true);
    laidOut.model()->setPageNumberingEnabled(true);
    KvReportNode *node = laidOut.report().addFake({1200, 1200});
    laidOut.report().addFake({50});
    laidOut.rebuild();
    const QList<KvReportProxyWidgetItem *> items = laidOut.layout().pieceItems();
    const QVector<KvReportPage *> pages = laidOut.layout().pages();
    QWidget *frame = items.first()->widget();

    FakeReport::fakeCfg(node)->setHeights({1200, 1200, 1200});
    laidOut.rebuild();
    QCOMPARE(laidOut.layout().pieceItems().size(), 4);
    QCOMPARE(laidOut.layout().pieceItems().mid(0, 2), items.mid(0, 2));
    QCOMPARE(laidOut.layout().pieceItems().last(), items.last());
    QCOMPARE(items.first()->widget(), frame);
    QCOMPARE(laidOut.layout().pages().size(), 3);
    QCOMPARE(laidOut.layout().pages().mid(0, 2), pages);
    QCOMPARE(items.last()->pos(),
             QPointF(laidOut.layout().pages().last()->contentRect().topLeft()) + QPointF(0, 1201));

    FakeReport::fakeCfg(node)->setHeights({1100});
    laidOut.rebuild();
    QCOMPARE(laidOut.layout().pieceItems(), QList<KvReportProxyWidgetItem *>({items.first(), items.last()}));
    QCOMPARE(items.first()->pieceHeight(), 1100);
    QCOMPARE(laidOut.layout().pages(), pages.mid(0, 1));
    // The rest is gone at once: sheet, three sections and two lines of the page, and the two pieces.
    QVERIFY(!laidOut.layout().hasDroppedItems());
    QCOMPARE(laidOut.scene().items().size(), 1 + 6 + 2);
}

void KvPagedLayoutTest::keepsFramesOfAnotherWidth()
{
    LaidOutReport laidOut;
    KvReportNode *node = laidOut.report().addFake({100});
    laidOut.report().addText(QStringLiteral("word ").repeated(100));
    laidOut.rebuild();
    const QList<KvReportProxyWidgetItem *> items = laidOut.layout().pieceItems();
    const int height = items.last()->pieceHeight();
    laidOut.model()->setPageWidth(600);
    laidOut.rebuild();
    QCOMPARE(laidOut.layout().pieceItems(), items);
    QCOMPARE(laidOut.layout().pages().first()->pageRect(), QRect(20, 20, 600, 848));
    for (const KvReportProxyWidgetItem *item : items) {
        QCOMPARE(item->size().width(), 600.0);
        QCOMPARE(item->widget()->width(), 600);
    }
    const int margin = laidOut.model()->context()->marginPixels();
    QCOMPARE(FakeReport::fakeWidget(node)->piece(0)->geometry(), QRect(margin, 0, 600 - 2 * margin, 100));
    QVERIFY(items.last()->pieceHeight() > height);
}

void KvPagedLayoutTest::stacksPiecesInOrder_data()
{
    using Act = std::function<void(LaidOutReport &)>;
    QTest::addColumn<std::function<void(LaidOutReport &)>>("act");
    QTest::newRow("more pieces") << Act([](LaidOutReport &laidOut) {
        FakeReport::fakeCfg(laidOut.model()->node(0))->setHeights({3000, 10, 10, 10});
    });
    QTest::newRow("a new block in between")
        << Act([](LaidOutReport &laidOut) { laidOut.model()->createNode(QStringLiteral("Fake"), 1); });
    QTest::newRow("first to the end") << Act([](LaidOutReport &laidOut) { laidOut.model()->moveNode(0, 2); });
    QTest::newRow("last to the front")
        << Act([](LaidOutReport &laidOut) { laidOut.model()->moveNode(2, 0); });
    QTest::newRow("another widget") << Act(
        [](LaidOutReport &laidOut) { laidOut.model()->node(0)->resetDisplayWidget(); });
}

void KvPagedLayoutTest::stacksPiecesInOrder()
{
    // What stands on a page covers what overflows the one before.
    QFETCH(std::function<void(LaidOutReport &)>, act);
    LaidOutReport laidOut;
    laidOut.report().addFake({3000, 20});
    laidOut.report().addFake({50, 3000});
    laidOut.report().addFake({7});
    laidOut.rebuild();
    act(laidOut);
    laidOut.rebuild();
    QList<KvReportProxyWidgetItem *> stacked;
    for (QGraphicsItem *item : laidOut.scene().items(Qt::AscendingOrder)) {
        if (auto *proxy = dynamic_cast<KvReportProxyWidgetItem *>(item))
            stacked.append(proxy);
    }
    QCOMPARE(stacked, laidOut.layout().pieceItems());
    QVector<KvReportNode *> nodes;
    for (const KvReportProxyWidgetItem *item : qAsConst(stacked)) {
        if (nodes.isEmpty() || nodes.last() != item->node())
            nodes.append(item->node());
    }
    QCOMPARE(nodes, laidOut.model()->nodes());
}

void KvPagedLayoutTest::makesAnewWhatChanged_data()
{
    using Act = std::function<void(LaidOutReport &)>;
    QTest::addColumn<std::function<void(LaidOutReport &)>>("act");
    QTest::newRow("another widget") << Act(
        [](LaidOutReport &laidOut) { laidOut.model()->node(0)->resetDisplayWidget(); });
    QTest::newRow("the piece moved on") << Act([](LaidOutReport &laidOut) {
        FakeReport::fakeWidget(laidOut.model()->node(0))->piece(0)->setParent(nullptr);
    });
    QTest::newRow("the piece died") << Act(
        [](LaidOutReport &laidOut) { delete FakeReport::fakeWidget(laidOut.model()->node(0))->piece(0); });
    QTest::newRow("had the focus") << Act(
        [](LaidOutReport &laidOut) { laidOut.layout().pieceItems().first()->takeFocus(); });
}

void KvPagedLayoutTest::makesAnewWhatChanged()
{
    QFETCH(std::function<void(LaidOutReport &)>, act);
    LaidOutReport laidOut;
    KvReportNode *node = laidOut.report().addFake({100});
    laidOut.report().addFake({50});
    laidOut.rebuild();
    const QPointer<KvReportProxyWidgetItem> first = laidOut.layout().pieceItems().first();
    KvReportProxyWidgetItem *second = laidOut.layout().pieceItems().last();
    act(laidOut);
    laidOut.rebuild();
    QVERIFY(!first);
    QCOMPARE(laidOut.layout().pieceItems().size(), 2);
    QCOMPARE(laidOut.layout().pieceItems().last(), second);
    const KvReportProxyWidgetItem *item = laidOut.layout().pieceItems().first();
    QCOMPARE(item->node(), node);
    QCOMPARE(item->displayWidget(), node->displayWidget());
    QCOMPARE(pieceOf(item), FakeReport::fakeWidget(node)->piece(0));
    QCOMPARE(item->piece()->parentWidget(), item->widget());
    QCOMPARE(laidOut.places(), QVector<QPoint>({at(0, 0), at(0, 101)}));
}

void KvPagedLayoutTest::makesAllAnewWhereItDropsThem()
{
    // Pieces that get a new parent are polished at once: measured in the midst of a change of style, they
    // have the new one.
    LaidOutReport laidOut;
    laidOut.report().addFake({100});
    laidOut.rebuild();
    const QPointer<KvReportProxyWidgetItem> item = laidOut.layout().pieceItems().first();
    const KvReportPage *page = laidOut.layout().pages().first();
    laidOut.layout().rebuild(laidOut.model(), nullptr, KvPagedLayout::OldItems::Dropped);
    QVERIFY(laidOut.layout().pieceItems().first() != item);
    QVERIFY(laidOut.layout().pages().first() != page);
    QVERIFY(item);
    QVERIFY(!item->isVisible());
    laidOut.layout().deleteDroppedItems();
    QVERIFY(!item);
}

void KvPagedLayoutTest::keptHeadersShowTheTextOfNow()
{
    LaidOutReport laidOut;
    laidOut.model()->header()->setText(QStringLiteral("before"));
    laidOut.model()->setHeaderEnabled(true);
    laidOut.report().addFake({100});
    laidOut.rebuild();
    const KvReportPage *page = laidOut.layout().pages().first();
    const int height = page->headerWidget()->height();
    laidOut.model()->header()->setText(QLatin1String(kBigText));
    laidOut.rebuild();
    QCOMPARE(laidOut.layout().pages().first(), page);
    QCOMPARE(page->headerWidget()->toPlainText(), QStringLiteral("Text"));
    QVERIFY(page->headerWidget()->height() > height);
    QCOMPARE(laidOut.places().first(), page->contentRect().topLeft());
    QCOMPARE(page->contentRect().top(), contentTop(0) + page->headerWidget()->height());
    // The rebuild has measured it: nothing is left to announce.
    laidOut.listener().taken();
    QCoreApplication::processEvents();
    QCOMPARE(laidOut.listener().taken(), QStringList());
}

void KvPagedLayoutTest::keptPagesAreMeasured()
{
    LaidOutReport laidOut;
    laidOut.rebuild();
    KvTemplateContext *context = laidOut.model()->context();
    const int height = context->contentHeight();
    // As another view or a printed page leaves it.
    context->setContentHeight(100);
    const KvReportPage *page = laidOut.layout().pages().first();
    laidOut.rebuild();
    QCOMPARE(laidOut.layout().pages().first(), page);
    QCOMPARE(context->contentHeight(), height);
}

void KvPagedLayoutTest::makesPagesAnewForOtherSections_data()
{
    using Act = std::function<void(LaidOutReport &)>;
    QTest::addColumn<std::function<void(LaidOutReport &)>>("act");
    QTest::newRow("header goes") << Act([](LaidOutReport &r) { r.model()->setHeaderEnabled(false); });
    QTest::newRow("footer goes") << Act([](LaidOutReport &r) { r.model()->setFooterEnabled(false); });
    QTest::newRow("number comes") << Act([](LaidOutReport &r) { r.model()->setPageNumberingEnabled(true); });
    QTest::newRow("width") << Act([](LaidOutReport &r) { r.model()->setPageWidth(600); });
    QTest::newRow("new template") << Act([](LaidOutReport &r) {
        r.model()->newTemplate();
        r.model()->setHeaderEnabled(true);
        r.model()->setFooterEnabled(true);
    });
    QTest::newRow("header had the focus") << Act([](LaidOutReport &r) {
        const QRect page = r.layout().pages().first()->pageRect();
        r.layout().itemAt(page.topLeft() + QPoint(100, 25))->takeFocus();
    });
    QTest::newRow("header is edited") << Act([panel = std::make_shared<QWidget>()](LaidOutReport &r) {
        r.layout().pages().first()->headerWidget()->createOptionsWidget(panel.get(), true);
    });
}

void KvPagedLayoutTest::makesPagesAnewForOtherSections()
{
    QFETCH(std::function<void(LaidOutReport &)>, act);
    LaidOutReport laidOut;
    laidOut.model()->header()->setText(QLatin1String(kBigText));
    laidOut.model()->setHeaderEnabled(true);
    laidOut.model()->setFooterEnabled(true);
    laidOut.rebuild();
    const QPointer<KvPageSectionWidget> header = laidOut.layout().pages().first()->headerWidget();
    laidOut.rebuild();
    QCOMPARE(laidOut.layout().pages().first()->headerWidget(), header.data());
    act(laidOut);
    laidOut.rebuild();
    QVERIFY(!header);
    QCOMPARE(laidOut.layout().pages().size(), 1);
    const KvReportPage *page = laidOut.layout().pages().first();
    QCOMPARE(page->headerWidget() != nullptr, laidOut.model()->isHeaderEnabled());
    QCOMPARE(page->footerWidget() != nullptr, laidOut.model()->isFooterEnabled());
    QCOMPARE(page->pageRect().width(), laidOut.model()->pageWidth());
    QVERIFY(!page->headerWidget() || !page->headerWidget()->isEditing());
}

STATREPORT_TEST_MAIN(KvPagedLayoutTest)
#include "KvPagedLayoutTest.moc"
