// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "charts/KvCategoryList.h"

#include <QElapsedTimer>

#include <limits>

using kvCharts::KvCategoryList;

class KvCategoryListTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void keepsTheOrderOfFirstUse();
    void tellsCaseApart();
    void copiesStandAlone();
    void clears();
    void isLinear_data();
    void isLinear();
};

namespace {

constexpr int kCalls = 20000;

QStringList numbers(int count)
{
    QStringList texts;
    for (int i = 0; i < count; ++i)
        texts.append(QString::number(i));
    return texts;
}

KvCategoryList listOf(const QStringList &texts)
{
    KvCategoryList list;
    for (const QString &text : texts)
        list.add(text);
    return list;
}

/** The shortest of some runs, in nanoseconds. */
template <class Run>
qint64 shortest(Run run)
{
    qint64 least = std::numeric_limits<qint64>::max();
    for (int i = 0; i < 3; ++i) {
        QElapsedTimer stopwatch;
        stopwatch.start();
        run();
        least = qMin(least, stopwatch.nsecsElapsed());
    }
    return least;
}

qint64 addingTime(int size)
{
    const QStringList texts = numbers(size);
    return shortest([&texts]() {
        for (int added = 0; added < kCalls; added += texts.size())
            QCOMPARE(listOf(texts).size(), texts.size());
    });
}

qint64 findingTime(int size)
{
    const QStringList texts = numbers(size);
    const KvCategoryList list = listOf(texts);
    return shortest([&]() {
        for (int i = 0; i < kCalls; ++i)
            QVERIFY(list.indexOf(texts.at(i % size)) == i % size);
    });
}

} // namespace

void KvCategoryListTest::keepsTheOrderOfFirstUse()
{
    KvCategoryList list;
    for (const char *text : {"b", "a", "b", "", "a", ""})
        list.add(QLatin1String(text));
    QCOMPARE(list.texts(), QStringList({QStringLiteral("b"), QStringLiteral("a"), QString()}));
    QCOMPARE(list.size(), 3);
    QCOMPARE(list.indexOf(QStringLiteral("b")), 0);
    QCOMPARE(list.indexOf(QStringLiteral("a")), 1);
    QCOMPARE(list.indexOf(QString()), 2);
    QCOMPARE(list.indexOf(QStringLiteral("c")), -1);
}

void KvCategoryListTest::tellsCaseApart()
{
    KvCategoryList list;
    list.add(QStringLiteral("Leaf"));
    list.add(QStringLiteral("leaf"));
    QCOMPARE(list.size(), 2);
    QCOMPARE(list.indexOf(QStringLiteral("LEAF")), -1);
}

void KvCategoryListTest::copiesStandAlone()
{
    KvCategoryList list;
    list.add(QStringLiteral("a"));
    const KvCategoryList copy = list;
    list.add(QStringLiteral("b"));
    QCOMPARE(copy.size(), 1);
    QCOMPARE(copy.indexOf(QStringLiteral("b")), -1);
}

void KvCategoryListTest::clears()
{
    KvCategoryList list;
    list.add(QStringLiteral("a"));
    list.clear();
    QCOMPARE(list.size(), 0);
    QCOMPARE(list.indexOf(QStringLiteral("a")), -1);
    list.add(QStringLiteral("b"));
    QCOMPARE(list.indexOf(QStringLiteral("b")), 0);
}

void KvCategoryListTest::isLinear_data()
{
    QTest::addColumn<bool>("adding");
    QTest::newRow("adding") << true;
    QTest::newRow("finding") << false;
}

void KvCategoryListTest::isLinear()
{
    QFETCH(bool, adding);
    // The same number of calls with a thousand times as many texts in the list: a search through it would
    // take hundreds of times as long, whatever else the machine does.
    const auto timeOf = adding ? addingTime : findingTime;
    const qint64 few = timeOf(20);
    const qint64 many = timeOf(20000);
    QVERIFY2(many < 20 * few, qPrintable(QStringLiteral("%1 ns, %2 ns").arg(many).arg(few)));
}

STATREPORT_TEST_MAIN(KvCategoryListTest)
#include "KvCategoryListTest.moc"
