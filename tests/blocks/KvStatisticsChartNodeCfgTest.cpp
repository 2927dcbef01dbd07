// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ChartBlocks.h"
#include "templates/KvTemplateContext.h"

#include <QJsonDocument>
#include <QJsonObject>

/** The configurations of all charts: their keys in files. */
class KvStatisticsChartNodeCfgTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void defaults_data() { ChartBlocks::addBlockRows(); }
    void defaults();
    void savesNumbersAndTheTheme_data() { ChartBlocks::addBlockRows(); }
    void savesNumbersAndTheTheme();
    void everyKeyIsRequired_data();
    void everyKeyIsRequired();
    void theThemeIsReadFromARefusedObject_data() { ChartBlocks::addBlockRows(); }
    void theThemeIsReadFromARefusedObject();
    void theThemeIsOptional_data() { ChartBlocks::addBlockRows(); }
    void theThemeIsOptional();
    void otherTypesKeepTheCurrentValue_data();
    void otherTypesKeepTheCurrentValue();
    void everyWidthIsGivenBack_data() { ChartBlocks::addBlockRows(); }
    void everyWidthIsGivenBack();
    void oddNumbersAreKept_data() { ChartBlocks::addBlockRows(); }
    void oddNumbersAreKept();
    void groupingIsKnownByItsSpelling();
};

namespace {

QJsonObject completeObject(const QString &block)
{
    QJsonObject object{{"theme", "Light"}, {"alignment", 2}, {"widthPercent", 53}};
    if (ChartBlocks::isGrouped(block))
        object[QStringLiteral("groupBy")] = 0;
    return object;
}

QJsonObject saved(const KvStatisticsChartNodeCfg &cfg)
{
    QJsonObject object;
    return cfg.toJson(object) ? object : QJsonObject();
}

} // namespace

void KvStatisticsChartNodeCfgTest::defaults()
{
    QFETCH(QString, block);
    KvTemplateContext context(nullptr);
    const auto cfg = ChartBlocks::makeConfig(block, &context);
    QVERIFY(cfg);
    QCOMPARE(cfg->context(), &context);
    QCOMPARE(int(cfg->alignment()), 132);
    QCOMPARE(cfg->widthPercent(), 75);
    QCOMPARE(cfg->themeIndex(), 0);
    QCOMPARE(ChartBlocks::grouped(cfg.get()) != nullptr, ChartBlocks::isGrouped(block));
    if (ChartBlocks::isGrouped(block))
        QCOMPARE(int(ChartBlocks::grouped(cfg.get())->groupBy()), 1);
}

void KvStatisticsChartNodeCfgTest::savesNumbersAndTheTheme()
{
    QFETCH(QString, block);
    const auto cfg = ChartBlocks::makeConfig(block, nullptr);
    QJsonObject expected{{"theme", "Dark"}, {"alignment", 132}, {"widthPercent", 75}};
    if (ChartBlocks::isGrouped(block))
        expected[QStringLiteral("groupBy")] = 1;
    QCOMPARE(saved(*cfg), expected);

    QVERIFY(cfg->fromJson(completeObject(block)));
    QCOMPARE(int(cfg->alignment()), 2);
    QCOMPARE(cfg->widthPercent(), 53);
    QCOMPARE(cfg->themeIndex(), 1);
    QCOMPARE(saved(*cfg), completeObject(block));
}

void KvStatisticsChartNodeCfgTest::everyKeyIsRequired_data()
{
    QTest::addColumn<QString>("block");
    QTest::addColumn<QString>("missing");
    for (const QString &block : ChartBlocks::names()) {
        for (const char *key : {"alignment", "widthPercent", "groupBy"}) {
            if (completeObject(block).contains(QLatin1String(key)))
                QTest::addRow("%s of %s", key, qPrintable(block)) << block << QString::fromLatin1(key);
        }
    }
}

void KvStatisticsChartNodeCfgTest::everyKeyIsRequired()
{
    QFETCH(QString, block);
    QFETCH(QString, missing);
    const auto cfg = ChartBlocks::makeConfig(block, nullptr);
    QJsonObject object = completeObject(block);
    object.remove(missing);
    QVERIFY(!cfg->fromJson(object));
    // Nothing but the theme was read.
    QJsonObject expected{{"theme", "Light"}, {"alignment", 132}, {"widthPercent", 75}};
    if (ChartBlocks::isGrouped(block))
        expected[QStringLiteral("groupBy")] = 1;
    QCOMPARE(saved(*cfg), expected);
}

void KvStatisticsChartNodeCfgTest::theThemeIsReadFromARefusedObject()
{
    QFETCH(QString, block);
    const auto cfg = ChartBlocks::makeConfig(block, nullptr);
    QVERIFY(!cfg->fromJson({{"theme", "Light"}}));
    QCOMPARE(cfg->themeIndex(), 1);
    QVERIFY(!cfg->fromJson({}));
    QCOMPARE(cfg->themeIndex(), 1);
}

void KvStatisticsChartNodeCfgTest::theThemeIsOptional()
{
    QFETCH(QString, block);
    const auto cfg = ChartBlocks::makeConfig(block, nullptr);
    QJsonObject object = completeObject(block);
    object.remove(QStringLiteral("theme"));
    QVERIFY(cfg->fromJson(object));
    QCOMPARE(cfg->themeIndex(), 0);
    QCOMPARE(cfg->widthPercent(), 53);

    object[QStringLiteral("theme")] = 1; // no text
    QVERIFY(cfg->fromJson(object));
    QCOMPARE(cfg->themeIndex(), 0);

    object[QStringLiteral("theme")] = QStringLiteral("light");
    QVERIFY(cfg->fromJson(object));
    QCOMPARE(cfg->themeIndex(), -1);
    QCOMPARE(saved(*cfg).value(QStringLiteral("theme")), QJsonValue(QString()));
}

void KvStatisticsChartNodeCfgTest::otherTypesKeepTheCurrentValue_data()
{
    QTest::addColumn<QString>("block");
    QTest::addColumn<QJsonValue>("value");
    for (const QString &block : ChartBlocks::names()) {
        QTest::addRow("%s, text", qPrintable(block)) << block << QJsonValue(QStringLiteral("7"));
        QTest::addRow("%s, fraction", qPrintable(block)) << block << QJsonValue(7.5);
        QTest::addRow("%s, bool", qPrintable(block)) << block << QJsonValue(true);
        QTest::addRow("%s, null", qPrintable(block)) << block << QJsonValue(QJsonValue::Null);
        QTest::addRow("%s, too large", qPrintable(block)) << block << QJsonValue(3e9);
    }
}

void KvStatisticsChartNodeCfgTest::otherTypesKeepTheCurrentValue()
{
    QFETCH(QString, block);
    QFETCH(QJsonValue, value);
    const auto cfg = ChartBlocks::makeConfig(block, nullptr);
    QVERIFY(cfg->fromJson(completeObject(block)));
    for (const char *key : {"alignment", "widthPercent", "groupBy"}) {
        QJsonObject object = completeObject(block);
        if (!object.contains(QLatin1String(key)))
            continue;
        object[QLatin1String(key)] = value;
        QVERIFY(cfg->fromJson(object));
        QCOMPARE(saved(*cfg), completeObject(block));
    }
}

void KvStatisticsChartNodeCfgTest::everyWidthIsGivenBack()
{
    QFETCH(QString, block);
    for (int percent = 1; percent <= 100; ++percent) {
        const auto cfg = ChartBlocks::makeConfig(block, nullptr);
        cfg->setWidthPercent(percent);
        const QByteArray file = QJsonDocument(saved(*cfg)).toJson();
        const auto reloaded = ChartBlocks::makeConfig(block, nullptr);
        QVERIFY(reloaded->fromJson(QJsonDocument::fromJson(file).object()));
        QCOMPARE(reloaded->widthPercent(), percent);
    }
}

void KvStatisticsChartNodeCfgTest::oddNumbersAreKept()
{
    QFETCH(QString, block);
    const auto cfg = ChartBlocks::makeConfig(block, nullptr);
    QJsonObject object{{"theme", "Dark"}, {"alignment", 4}, {"widthPercent", 300}};
    if (ChartBlocks::isGrouped(block))
        object[QStringLiteral("groupBy")] = 7;
    QVERIFY(cfg->fromJson(object));
    QCOMPARE(saved(*cfg), object);
}

void KvStatisticsChartNodeCfgTest::groupingIsKnownByItsSpelling()
{
    for (const QString &name : ChartBlocks::names())
        ChartBlocks::makeConfig(name, nullptr);
    const int type = qMetaTypeId<KvStatisticsGroupedChartNodeCfg::GroupBy>();
    QCOMPARE(QMetaType::type("KvStatisticsMinMedMaxBoxNodeCfg::GroupBy"), type);
    QCOMPARE(QMetaType::type("KvStatisticsTrendNodeCfg::GroupBy"), type);
}

STATREPORT_TEST_MAIN(KvStatisticsChartNodeCfgTest)
#include "KvStatisticsChartNodeCfgTest.moc"
