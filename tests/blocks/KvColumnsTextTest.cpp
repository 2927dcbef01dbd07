// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/common/KvColumnsText.h"

class KvColumnsTextTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void splits_data();
    void splits();
    void joins_data();
    void joins();
    void indexesFollowTheNames_data();
    void indexesFollowTheNames();
};

void KvColumnsTextTest::splits_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QSet<QString>>("columns");
    QTest::newRow("nothing") << QString() << QSet<QString>{};
    QTest::newRow("only separators") << ";;" << QSet<QString>{};
    QTest::newRow("one") << "Min" << QSet<QString>{"Min"};
    QTest::newRow("several") << "Max;Min;Average" << QSet<QString>{"Min", "Max", "Average"};
    QTest::newRow("empty parts") << ";Max;;Min;" << QSet<QString>{"Min", "Max"};
    QTest::newRow("the same twice") << "Min;Min" << QSet<QString>{"Min"};
    QTest::newRow("names with blanks") << "Object Name;a b" << QSet<QString>{"Object Name", "a b"};
    QTest::newRow("commas do not separate") << "a,b" << QSet<QString>{"a,b"};
}

void KvColumnsTextTest::splits()
{
    QFETCH(QString, text);
    QTEST(KvColumnsText::split(text), "columns");
}

void KvColumnsTextTest::joins_data()
{
    QTest::addColumn<QSet<QString>>("columns");
    QTest::newRow("nothing") << QSet<QString>{};
    QTest::newRow("one") << QSet<QString>{"Min"};
    QTest::newRow("several") << QSet<QString>{"Min", "Max", "Average", "Größe"};
}

void KvColumnsTextTest::joins()
{
    QFETCH(QSet<QString>, columns);
    const QString text = KvColumnsText::join(columns);
    QCOMPARE(text.count(QLatin1Char(';')), qMax(0, columns.size() - 1));
    QCOMPARE(KvColumnsText::split(text), columns);
    if (columns.isEmpty())
        QCOMPARE(text, QString());
}

void KvColumnsTextTest::indexesFollowTheNames_data()
{
    QTest::addColumn<QSet<QString>>("columns");
    QTest::addColumn<QVector<int>>("indexes");
    QTest::newRow("nothing") << QSet<QString>{} << QVector<int>{};
    QTest::newRow("one") << QSet<QString>{"Average"} << QVector<int>{2};
    QTest::newRow("several") << QSet<QString>{"Average", "Min"} << QVector<int>{0, 2};
    QTest::newRow("unknown ones") << QSet<QString>{"min", "Max", ""} << QVector<int>{1};
}

void KvColumnsTextTest::indexesFollowTheNames()
{
    QFETCH(QSet<QString>, columns);
    QTEST(KvColumnsText::indexes({"Min", "Max", "Average"}, columns), "indexes");
}

STATREPORT_TEST_MAIN(KvColumnsTextTest)
#include "KvColumnsTextTest.moc"
