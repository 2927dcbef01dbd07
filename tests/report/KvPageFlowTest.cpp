// SPDX-License-Identifier: MIT
#include "report/KvPageFlow.h"
#include "support/StatReportTest.h"

#include <QRandomGenerator>

namespace {

// Pages of a column as on screen, 20 pixels apart.
QRect columnPage(int page, int contentHeight)
{
    return QRect(20, 40 + page * (contentHeight + 60), 952, contentHeight);
}

QVector<KvPlacedPiece> placeAll(const QVector<int> &heights, int contentHeight)
{
    return KvPageFlow::place(heights, [contentHeight](int page) { return columnPage(page, contentHeight); });
}

struct Place
{
    int page;
    int y; // from the top of the page's content
};

} // namespace

Q_DECLARE_METATYPE(QVector<Place>)

class KvPageFlowTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void places_data();
    void places();
    void asksForPagesInOrder();
    void marksNeverChangeThePage();
    void pagesMayDiffer();
    void manyPiecesKeepTheRule_data();
    void manyPiecesKeepTheRule();
};

void KvPageFlowTest::places_data()
{
    QTest::addColumn<int>("contentHeight");
    QTest::addColumn<QVector<int>>("heights");
    QTest::addColumn<QVector<Place>>("places");
    QTest::addColumn<int>("pageCount");

    using Heights = QVector<int>;
    using Places = QVector<Place>;
    QTest::newRow("nothing") << 1306 << Heights() << Places() << 1;
    QTest::newRow("one") << 1306 << Heights{100} << Places{{0, 0}} << 1;
    QTest::newRow("one pixel apart") << 1306 << Heights{100, 50, 1} << Places{{0, 0}, {0, 101}, {0, 152}}
                                     << 1;
    QTest::newRow("flat pieces") << 1306 << Heights{0, 0, 0} << Places{{0, 0}, {0, 1}, {0, 2}} << 1;
    // Content rows 0 to 1305: the point below a piece of 1304 is row 1305, the last one inside.
    QTest::newRow("just fits") << 1306 << Heights{1304} << Places{{0, 0}} << 1;
    QTest::newRow("one pixel too high") << 1306 << Heights{1305} << Places{{1, 0}} << 2;
    QTest::newRow("two just fit") << 1306 << Heights{1000, 303} << Places{{0, 0}, {0, 1001}} << 1;
    QTest::newRow("the second does not") << 1306 << Heights{1000, 304} << Places{{0, 0}, {1, 0}} << 2;
    QTest::newRow("flat piece at the end") << 1306 << Heights{1304, 0} << Places{{0, 0}, {1, 0}} << 2;
    QTest::newRow("too high at first") << 1306 << Heights{2000, 10} << Places{{1, 0}, {2, 0}} << 3;
    QTest::newRow("too high in between")
        << 1306 << Heights{10, 2000, 10, 10} << Places{{0, 0}, {1, 0}, {2, 0}, {2, 11}} << 3;
    QTest::newRow("too high twice") << 1306 << Heights{2000, 2000} << Places{{1, 0}, {2, 0}} << 3;
    QTest::newRow("no room at all") << 0 << Heights{10, 10} << Places{{1, 0}, {2, 0}} << 3;
    QTest::newRow("less than no room") << -40 << Heights{0, 0} << Places{{1, 0}, {2, 0}} << 3;
}

void KvPageFlowTest::places()
{
    QFETCH(int, contentHeight);
    QFETCH(QVector<int>, heights);
    QFETCH(QVector<Place>, places);

    QVector<KvPlacedPiece> expected;
    for (const Place &place : qAsConst(places)) {
        const QPoint topLeft = columnPage(place.page, contentHeight).topLeft();
        expected.append({place.page, topLeft + QPoint(0, place.y)});
    }
    QCOMPARE(placeAll(heights, contentHeight), expected);

    KvPageFlow flow([contentHeight](int page) { return columnPage(page, contentHeight); });
    for (const int height : qAsConst(heights))
        flow.place(height);
    QTEST(flow.pageCount(), "pageCount");
}

void KvPageFlowTest::asksForPagesInOrder()
{
    QVector<int> asked;
    KvPageFlow flow([&asked](int page) {
        asked.append(page);
        return QRect(0, 20, 952, 1306);
    });
    QCOMPARE(asked, QVector<int>({0}));
    flow.place(1000);
    flow.place(200);
    QCOMPARE(asked, QVector<int>({0}));
    flow.place(1000);
    flow.place(2000);
    QCOMPARE(asked, QVector<int>({0, 1, 2}));
    QCOMPARE(flow.pageCount(), 3);
}

void KvPageFlowTest::marksNeverChangeThePage()
{
    KvPageFlow flow([](int page) { return columnPage(page, 1306); });
    QCOMPARE(flow.place(1300), (KvPlacedPiece{0, QPoint(20, 40)}));
    // No pixel between a mark and what follows it.
    QCOMPARE(flow.placeMark(40), (KvPlacedPiece{0, QPoint(20, 1341)}));
    QCOMPARE(flow.pageCount(), 1);
    QCOMPARE(flow.place(10), (KvPlacedPiece{1, QPoint(20, 1406)}));
    QCOMPARE(flow.placeMark(40), (KvPlacedPiece{1, QPoint(20, 1417)}));
    QCOMPARE(flow.place(10), (KvPlacedPiece{1, QPoint(20, 1457)}));
}

void KvPageFlowTest::pagesMayDiffer()
{
    const QVector<QRect> pages{QRect(0, 20, 952, 100), QRect(0, 60, 952, 50), QRect(0, 20, 952, 300)};
    const auto provider = [&pages](int page) { return pages.at(page); };
    const QVector<KvPlacedPiece> expected{
        {0, QPoint(0, 20)}, {1, QPoint(0, 60)}, {2, QPoint(0, 20)}, {2, QPoint(0, 81)}};
    QCOMPARE(KvPageFlow::place({60, 48, 60, 60}, provider), expected);
}

void KvPageFlowTest::manyPiecesKeepTheRule_data()
{
    QTest::addColumn<int>("contentHeight");
    QTest::addColumn<int>("highest");
    QTest::newRow("small pieces") << 1306 << 60;
    QTest::newRow("up to a page") << 1306 << 1304;
    QTest::newRow("up to two pages") << 1306 << 2600;
    QTest::newRow("low pages") << 16 << 40;
}

void KvPageFlowTest::manyPiecesKeepTheRule()
{
    QFETCH(int, contentHeight);
    QFETCH(int, highest);
    constexpr int count = 10000;
    QRandomGenerator random(4711);
    QVector<int> heights;
    for (int i = 0; i < count; ++i)
        heights.append(random.bounded(highest + 1));

    const QVector<KvPlacedPiece> placed = placeAll(heights, contentHeight);
    QCOMPARE(placed.size(), count);
    for (int i = 0; i < count; ++i) {
        const QRect content = columnPage(placed.at(i).page, contentHeight);
        const QPoint point = placed.at(i).topLeft;
        QCOMPARE(point.x(), content.left());
        const bool fits = point.y() + heights.at(i) + 1 <= content.bottom();
        const bool atTop = point.y() == content.top();
        QVERIFY2(fits || (atTop && placed.at(i).page > 0), qPrintable(QString::number(i)));

        // Where the piece was tried: below the one before, at the top for the first.
        const int page = i == 0 ? 0 : placed.at(i - 1).page;
        const QRect before = columnPage(page, contentHeight);
        const int y = i == 0 ? before.top() : placed.at(i - 1).topLeft.y() + heights.at(i - 1) + 1;
        const bool fitted = y + heights.at(i) + 1 <= before.bottom();
        QCOMPARE(placed.at(i).page, fitted ? page : page + 1);
        QCOMPARE(point.y(), fitted ? y : content.top());
    }
}

STATREPORT_TEST_MAIN(KvPageFlowTest)
#include "KvPageFlowTest.moc"
