// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "charts/KvLegendLayout.h"

namespace KvLegendLayout = kvCharts::KvLegendLayout;

class KvLegendLayoutTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void entries_data();
    void entries();
    void groupPosition();
    void titlePosition_data();
    void titlePosition();
};

void KvLegendLayoutTest::entries_data()
{
    QTest::addColumn<QVector<QSizeF>>("sizes");
    QTest::addColumn<QVector<QPointF>>("markers");
    QTest::addColumn<QVector<QPointF>>("texts");
    using Sizes = QVector<QSizeF>;
    using Points = QVector<QPointF>;
    QTest::newRow("none") << Sizes{} << Points{} << Points{};
    QTest::newRow("one") << Sizes{{100, 30}} << Points{{0, 0}} << Points{{16, -11}};
    QTest::newRow("side by side") << Sizes{{100, 30}, {50, 20}} << Points{{0, 0}, {148, 0}}
                                  << Points{{16, -11}, {164, -6}};
    // 352 + 48 twice is 800, which is not beyond 800.
    QTest::newRow("full row goes on")
        << Sizes{{352, 30}, {352, 30}, {10, 30}} << Points{{0, 0}, {400, 0}, {800, 0}}
        << Points{{16, -11}, {416, -11}, {816, -11}};
    QTest::newRow("beyond the row") << Sizes{{352, 30}, {353, 24}, {10, 30}}
                                    << Points{{0, 0}, {400, 0}, {0, 34}}
                                    << Points{{16, -11}, {416, -8}, {16, 23}};
    QTest::newRow("longer than a row")
        << Sizes{{900, 30}, {10, 30}} << Points{{0, 0}, {0, 40}} << Points{{16, -11}, {16, 29}};
    QTest::newRow("three rows") << Sizes{{753, 30}, {753, 30}, {753, 30}} << Points{{0, 0}, {0, 40}, {0, 80}}
                                << Points{{16, -11}, {16, 29}, {16, 69}};
}

void KvLegendLayoutTest::entries()
{
    QFETCH(QVector<QSizeF>, sizes);
    QFETCH(QVector<QPointF>, markers);
    QFETCH(QVector<QPointF>, texts);
    const QVector<KvLegendLayout::Entry> entries = KvLegendLayout::entries(sizes);
    QCOMPARE(entries.size(), sizes.size());
    for (int i = 0; i < entries.size(); ++i) {
        QCOMPARE(entries.at(i).marker, markers.at(i));
        QCOMPARE(entries.at(i).text, texts.at(i));
    }
}

void KvLegendLayoutTest::groupPosition()
{
    QCOMPARE(KvLegendLayout::groupPosition(QSizeF(300, 40)), QPointF(350, -40));
    QCOMPARE(KvLegendLayout::groupPosition(QSizeF(1200, 40)), QPointF(-100, -40));
}

void KvLegendLayoutTest::titlePosition_data()
{
    QTest::addColumn<bool>("hasEntries");
    QTest::addColumn<double>("groupHeight");
    QTest::addColumn<QPointF>("expected");
    QTest::newRow("alone") << false << 0.0 << QPointF(400, -35);
    QTest::newRow("above entries") << true << 40.0 << QPointF(400, -81);
}

void KvLegendLayoutTest::titlePosition()
{
    QFETCH(bool, hasEntries);
    QFETCH(double, groupHeight);
    QFETCH(QPointF, expected);
    QCOMPARE(KvLegendLayout::titlePosition(QSizeF(200, 35), hasEntries, groupHeight), expected);
}

STATREPORT_TEST_MAIN(KvLegendLayoutTest)
#include "KvLegendLayoutTest.moc"
