// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "charts/KvLineSerie.h"

using kvCharts::KvLineSerie;

class KvLineSerieTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void defaults();
    void points();
    void limitsAndTrend();
};

void KvLineSerieTest::defaults()
{
    const KvLineSerie serie(QStringLiteral("a"), Qt::red);
    QCOMPARE(serie.name(), QStringLiteral("a"));
    QCOMPARE(serie.color(), QColor(Qt::red));
    QVERIFY(serie.parent() == nullptr);
    QVERIFY(serie.points().isEmpty());
    QVERIFY(!serie.showLimits());
    QVERIFY(!serie.showTrend());
}

void KvLineSerieTest::points()
{
    KvLineSerie serie(QStringLiteral("a"), Qt::red);
    serie.addPoint(QStringLiteral("x"), 1.5);
    serie.addPoint(QStringLiteral("x"), 2.5); // one category may come more than once
    QCOMPARE(serie.points().size(), 2);
    QCOMPARE(serie.points().at(1).category, QStringLiteral("x"));
    QCOMPARE(serie.points().at(1).value, 2.5);
}

void KvLineSerieTest::limitsAndTrend()
{
    KvLineSerie serie(QStringLiteral("a"), Qt::red);
    serie.setLimits(1.0, 2.0);
    serie.setShowLimits(true);
    serie.setShowTrend(true);
    QCOMPARE(serie.lowerLimit(), 1.0);
    QCOMPARE(serie.upperLimit(), 2.0);
    QVERIFY(serie.showLimits());
    QVERIFY(serie.showTrend());
}

STATREPORT_TEST_MAIN(KvLineSerieTest)
#include "KvLineSerieTest.moc"
