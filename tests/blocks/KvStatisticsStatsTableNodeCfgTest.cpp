// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/statisticstable/KvStatisticsStatsTableNodeCfg.h"

#include <QJsonDocument>
#include <QJsonObject>

namespace {

using Cfg = KvStatisticsStatsTableNodeCfg;

QJsonObject saved(const Cfg &cfg)
{
    QJsonObject config;
    [&]() { QVERIFY(cfg.toJson(config)); }();
    return config;
}

QSet<QString> asSet(const QJsonValue &columns)
{
    const QStringList names = columns.toString().split(QLatin1Char(';'));
    return QSet<QString>(names.begin(), names.end());
}

QJsonObject completeConfig()
{
    return {{"alignment", 2},
            {"groupBy", 0},
            {"widthPercent", 33},
            {"columns", "Sigma;;Min"},
            {"theme", "Light"}};
}

QJsonObject with(const QString &key, const QJsonValue &value)
{
    QJsonObject config = completeConfig();
    config[key] = value;
    return config;
}

} // namespace

class KvStatisticsStatsTableNodeCfgTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void hasItsDefaults();
    void groupingsHaveTheirNumbers();
    void columnNamesAreInTheirOrder();
    void savesFourKeysAndTheTheme();
    void readsEveryKey();
    void withoutAnyOfFourKeysItIsRefusedWhole_data();
    void withoutAnyOfFourKeysItIsRefusedWhole();
    void theThemeAloneIsRefused();
    void aMissingThemeIsKept();
    void wrongTypesKeepTheCurrentValues_data();
    void wrongTypesKeepTheCurrentValues();
    void columnsAreReplacedAsAWhole_data();
    void columnsAreReplacedAsAWhole();
    void unknownNumbersAreKept();
    void aNewTableSavesFour();
    void everyWidthComesBack();
    void themeIsRead_data();
    void themeIsRead();
    void optionsCompareByAllMembers();
};

void KvStatisticsStatsTableNodeCfgTest::hasItsDefaults()
{
    const Cfg cfg(nullptr);
    QCOMPARE(int(cfg.alignment()), 4);
    QCOMPARE(int(cfg.groupBy()), 1);
    QCOMPARE(cfg.widthPercent(), 75);
    QCOMPARE(cfg.columns(), QSet<QString>({"Min", "Max", "Average", "Sigma", "3 Sigma", "6 Sigma"}));
    QCOMPARE(cfg.themeIndex(), 0);
}

void KvStatisticsStatsTableNodeCfgTest::groupingsHaveTheirNumbers()
{
    QCOMPARE(int(Cfg::ByMeasurement), 0);
    QCOMPARE(int(Cfg::ByObject), 1);
}

void KvStatisticsStatsTableNodeCfgTest::columnNamesAreInTheirOrder()
{
    QCOMPARE(Cfg::columnNames(), QStringList({"Min", "Max", "Average", "Sigma", "3 Sigma", "6 Sigma"}));
    for (const QString &name : Cfg::columnNames())
        QCOMPARE(Cfg::columnLabel(name), name); // without a translation
}

void KvStatisticsStatsTableNodeCfgTest::savesFourKeysAndTheTheme()
{
    Cfg cfg(nullptr);
    const QJsonObject fresh = saved(cfg);
    QCOMPARE(fresh.keys(), QStringList({"alignment", "columns", "groupBy", "theme", "widthPercent"}));
    QCOMPARE(fresh["groupBy"], QJsonValue(1));
    QCOMPARE(fresh["widthPercent"], QJsonValue(75));
    QCOMPARE(fresh["theme"], QJsonValue(QStringLiteral("Dark")));
    QCOMPARE(asSet(fresh["columns"]), cfg.columns());

    cfg.setAlignment(Qt::AlignLeft);
    cfg.setGroupBy(Cfg::ByMeasurement);
    cfg.setWidthPercent(40);
    cfg.setColumns({QStringLiteral("6 Sigma")});
    QVERIFY(cfg.setTheme(1));
    QCOMPARE(saved(cfg), QJsonObject({{"alignment", 1},
                                      {"groupBy", 0},
                                      {"widthPercent", 40},
                                      {"columns", "6 Sigma"},
                                      {"theme", "Light"}}));
    cfg.setColumns({});
    QCOMPARE(saved(cfg)["columns"], QJsonValue(QString()));
}

void KvStatisticsStatsTableNodeCfgTest::readsEveryKey()
{
    Cfg cfg(nullptr);
    QVERIFY(cfg.fromJson(completeConfig()));
    QCOMPARE(int(cfg.alignment()), 2);
    QCOMPARE(cfg.groupBy(), Cfg::ByMeasurement);
    QCOMPARE(cfg.widthPercent(), 33);
    QCOMPARE(cfg.columns(), QSet<QString>({"Sigma", "Min"}));
    QCOMPARE(cfg.themeIndex(), 1);

    Cfg again(nullptr);
    QVERIFY(again.fromJson(QJsonDocument::fromJson(QJsonDocument(saved(cfg)).toJson()).object()));
    QVERIFY(again.options() == cfg.options());
    QCOMPARE(again.themeIndex(), 1);
}

void KvStatisticsStatsTableNodeCfgTest::withoutAnyOfFourKeysItIsRefusedWhole_data()
{
    QTest::addColumn<QString>("key");
    for (const char *key : {"alignment", "groupBy", "widthPercent", "columns"})
        QTest::newRow(key) << QString::fromLatin1(key);
}

void KvStatisticsStatsTableNodeCfgTest::withoutAnyOfFourKeysItIsRefusedWhole()
{
    QFETCH(QString, key);
    Cfg cfg(nullptr);
    const QJsonObject before = saved(cfg);
    QJsonObject config = completeConfig();
    config.remove(key);
    QVERIFY(!cfg.fromJson(config));
    QCOMPARE(saved(cfg), before); // the theme, too
}

void KvStatisticsStatsTableNodeCfgTest::theThemeAloneIsRefused()
{
    Cfg cfg(nullptr);
    QVERIFY(!cfg.fromJson({{"theme", "Light"}}));
    QCOMPARE(cfg.themeIndex(), 0);
    QVERIFY(!cfg.fromJson({}));
}

void KvStatisticsStatsTableNodeCfgTest::aMissingThemeIsKept()
{
    QJsonObject config = completeConfig();
    config.remove(QStringLiteral("theme"));
    for (const int theme : {0, 1}) {
        Cfg cfg(nullptr);
        cfg.setTheme(theme);
        QVERIFY(cfg.fromJson(config));
        QCOMPARE(cfg.themeIndex(), theme);
        QCOMPARE(cfg.widthPercent(), 33);
    }
}

void KvStatisticsStatsTableNodeCfgTest::wrongTypesKeepTheCurrentValues_data()
{
    QTest::addColumn<QString>("key");
    QTest::addColumn<QJsonValue>("value");
    QTest::newRow("alignment as text") << "alignment" << QJsonValue("1");
    QTest::newRow("alignment null") << "alignment" << QJsonValue(QJsonValue::Null);
    QTest::newRow("grouping as text") << "groupBy" << QJsonValue("1");
    QTest::newRow("grouping as boolean") << "groupBy" << QJsonValue(true);
    QTest::newRow("grouping as a fraction") << "groupBy" << QJsonValue(0.5);
    QTest::newRow("width as text") << "widthPercent" << QJsonValue("10");
    QTest::newRow("width as a fraction") << "widthPercent" << QJsonValue(10.5);
    QTest::newRow("width too large for an int") << "widthPercent" << QJsonValue(3e9);
    QTest::newRow("columns as number") << "columns" << QJsonValue(5);
    QTest::newRow("columns as list") << "columns" << QJsonValue(QJsonArray{"Min"});
    QTest::newRow("columns null") << "columns" << QJsonValue(QJsonValue::Null);
    QTest::newRow("theme as number") << "theme" << QJsonValue(0);
}

void KvStatisticsStatsTableNodeCfgTest::wrongTypesKeepTheCurrentValues()
{
    QFETCH(QString, key);
    QFETCH(QJsonValue, value);
    Cfg cfg(nullptr);
    QVERIFY(cfg.fromJson(
        {{"alignment", 1}, {"groupBy", 0}, {"widthPercent", 44}, {"columns", "Max"}, {"theme", "Light"}}));
    QJsonObject expected = saved(cfg);
    QVERIFY(cfg.fromJson(with(key, value)));
    // The other keys of the same object are read.
    for (const char *other : {"alignment", "groupBy", "widthPercent", "theme"}) {
        if (key != QLatin1String(other))
            expected[QLatin1String(other)] = completeConfig().value(QLatin1String(other));
    }
    QJsonObject found = saved(cfg);
    QCOMPARE(asSet(found.take(QStringLiteral("columns"))),
             key == QLatin1String("columns") ? QSet<QString>{"Max"} : QSet<QString>({"Sigma", "Min"}));
    expected.remove(QStringLiteral("columns"));
    QCOMPARE(found, expected);
}

void KvStatisticsStatsTableNodeCfgTest::columnsAreReplacedAsAWhole_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QSet<QString>>("columns");
    QTest::newRow("none") << "" << QSet<QString>{};
    QTest::newRow("only separators") << ";;" << QSet<QString>{};
    QTest::newRow("empty parts") << ";3 Sigma;;Min;" << QSet<QString>{"3 Sigma", "Min"};
    QTest::newRow("unknown ones are kept") << "Median;Min" << QSet<QString>{"Median", "Min"};
}

void KvStatisticsStatsTableNodeCfgTest::columnsAreReplacedAsAWhole()
{
    QFETCH(QString, text);
    Cfg cfg(nullptr);
    QVERIFY(cfg.fromJson(with(QStringLiteral("columns"), text)));
    QTEST(cfg.columns(), "columns");
}

void KvStatisticsStatsTableNodeCfgTest::unknownNumbersAreKept()
{
    Cfg cfg(nullptr);
    QVERIFY(cfg.fromJson({{"alignment", 64}, {"groupBy", 7}, {"widthPercent", 250}, {"columns", "Min"}}));
    QCOMPARE(saved(cfg), QJsonObject({{"alignment", 64},
                                      {"groupBy", 7},
                                      {"widthPercent", 250},
                                      {"columns", "Min"},
                                      {"theme", "Dark"}}));
}

void KvStatisticsStatsTableNodeCfgTest::aNewTableSavesFour()
{
    const QJsonObject config = saved(Cfg(nullptr));
    QCOMPARE(config["alignment"], QJsonValue(4));
    Cfg again(nullptr);
    QVERIFY(again.fromJson(config));
    QCOMPARE(saved(again)["alignment"], QJsonValue(4));
}

void KvStatisticsStatsTableNodeCfgTest::everyWidthComesBack()
{
    for (int percent = 1; percent <= 100; ++percent) {
        Cfg cfg(nullptr);
        cfg.setWidthPercent(percent);
        const QByteArray file = QJsonDocument(saved(cfg)).toJson();
        Cfg again(nullptr);
        QVERIFY(again.fromJson(QJsonDocument::fromJson(file).object()));
        QCOMPARE(again.widthPercent(), percent);
    }
}

void KvStatisticsStatsTableNodeCfgTest::themeIsRead_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("index");
    QTest::addColumn<QString>("savedName");
    QTest::newRow("Dark") << "Dark" << 0 << "Dark";
    QTest::newRow("Light") << "Light" << 1 << "Light";
    QTest::newRow("unknown") << "Blue" << -1 << "";
}

void KvStatisticsStatsTableNodeCfgTest::themeIsRead()
{
    QFETCH(QString, name);
    Cfg cfg(nullptr);
    QVERIFY(cfg.fromJson(with(QStringLiteral("theme"), name)));
    QTEST(cfg.themeIndex(), "index");
    QTEST(saved(cfg)["theme"].toString(), "savedName");
}

void KvStatisticsStatsTableNodeCfgTest::optionsCompareByAllMembers()
{
    const Cfg::Options options;
    QVERIFY(options == Cfg::Options());
    QVector<Cfg::Options> others(4);
    others[0].alignment = Qt::AlignLeft;
    others[1].groupBy = Cfg::ByMeasurement;
    others[2].widthPercent = 74;
    others[3].columns.insert(QStringLiteral("Min"));
    for (const Cfg::Options &other : qAsConst(others))
        QVERIFY(!(options == other));
}

STATREPORT_TEST_MAIN(KvStatisticsStatsTableNodeCfgTest)
#include "KvStatisticsStatsTableNodeCfgTest.moc"
