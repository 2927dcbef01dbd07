// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "charts/KvCategoryList.h"

using kvCharts::KvCategoryList;

class KvCategoryListTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void keepsTheOrderOfFirstUse();
    void tellsCaseApart();
    void copiesStandAlone();
    void clears();
    void isLinear();
};

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

void KvCategoryListTest::isLinear()
{
    // A search through the list for each of them would take minutes.
    constexpr int count = 200000;
    KvCategoryList list;
    for (int i = 0; i < count; ++i)
        list.add(QString::number(i));
    for (int i = 0; i < count; ++i)
        QVERIFY(list.indexOf(QString::number(i)) == i);
}

STATREPORT_TEST_MAIN(KvCategoryListTest)
#include "KvCategoryListTest.moc"
