// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "charts/KvSeriesPalette.h"

#include <QSet>
#include <QVector>

using kvCharts::seriesColor;

class KvSeriesPaletteTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void fixedColors_data();
    void fixedColors();
    void theLastFixedColorIsInvalid();
    void furtherColorsAreMadeOnce();
    void furtherColorsAreRandom();
    void negativeIndexesHaveNone();
};

void KvSeriesPaletteTest::fixedColors_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<QString>("name");
    const QStringList names{QStringLiteral("#ff5722"), QStringLiteral("#4caf50"), QStringLiteral("#ffc107"),
                            QStringLiteral("#2196f3"), QStringLiteral("#da90e6"), QStringLiteral("#009688"),
                            QStringLiteral("#ff9800"), QStringLiteral("#673ab7"), QStringLiteral("#8de429"),
                            QStringLiteral("#b2a429"), QStringLiteral("#8e98cf"), QStringLiteral("#cf8e8e"),
                            QStringLiteral("#cfc38e"), QStringLiteral("#a3cf8e"), QStringLiteral("#8ebecf")};
    for (int i = 0; i < names.size(); ++i)
        QTest::addRow("%d", i) << i << names.at(i);
}

void KvSeriesPaletteTest::fixedColors()
{
    QFETCH(int, index);
    QFETCH(QString, name);
    QVERIFY(seriesColor(index).isValid());
    QCOMPARE(seriesColor(index).name(), name);
    QCOMPARE(seriesColor(index).alpha(), 255);
}

void KvSeriesPaletteTest::theLastFixedColorIsInvalid()
{
    QVERIFY(!seriesColor(15).isValid());
    QCOMPARE(seriesColor(15).rgb(), QColor(Qt::black).rgb()); // what a brush of it paints
    QVERIFY(!seriesColor(15).isValid());                      // not replaced by a random one
}

void KvSeriesPaletteTest::furtherColorsAreMadeOnce()
{
    const QColor last = seriesColor(20);
    QVector<QColor> colors;
    for (int i = 16; i <= 20; ++i)
        colors.append(seriesColor(i));
    QCOMPARE(colors.last(), last);
    seriesColor(40);
    for (int i = 16; i <= 20; ++i) {
        QCOMPARE(seriesColor(i), colors.at(i - 16));
        QVERIFY(seriesColor(i).isValid());
        QCOMPARE(seriesColor(i).alpha(), 255);
    }
    QCOMPARE(seriesColor(14).name(), QStringLiteral("#8ebecf"));
}

void KvSeriesPaletteTest::furtherColorsAreRandom()
{
    // A component that took the wrong bits would be 0 in all, or the same in all three.
    QSet<int> reds;
    QSet<int> greens;
    QSet<int> blues;
    int grey = 0;
    for (int i = 100; i < 1100; ++i) {
        const QColor color = seriesColor(i);
        reds.insert(color.red());
        greens.insert(color.green());
        blues.insert(color.blue());
        grey += color.red() == color.green() && color.green() == color.blue() ? 1 : 0;
    }
    // 1000 draws of 256 values leave about 5 out; fewer than 200 different ones never come by chance.
    QVERIFY2(reds.size() > 200 && greens.size() > 200 && blues.size() > 200,
             qPrintable(QStringLiteral("%1 %2 %3").arg(reds.size()).arg(greens.size()).arg(blues.size())));
    QVERIFY(grey < 10);
}

void KvSeriesPaletteTest::negativeIndexesHaveNone()
{
    QVERIFY(!seriesColor(-1).isValid());
}

STATREPORT_TEST_MAIN(KvSeriesPaletteTest)
#include "KvSeriesPaletteTest.moc"
