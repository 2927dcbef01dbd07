// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "templates/KvStatisticsThemedNodeCfg.h"
#include "templates/KvTemplateContext.h"

#include <QJsonArray>
#include <QJsonObject>

using kvCharts::KvChartThemes;

class KvStatisticsThemedNodeCfgTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsDark();
    void keepsItsContext();
    void selectsThemes();
    void writesTheTheme();
    void writesBesideOtherMembers();
    void readsTheTheme_data();
    void readsTheTheme();
    void survivesARoundTrip_data();
    void survivesARoundTrip();
    void everyConfigurationHasItsOwnTheme();
};

void KvStatisticsThemedNodeCfgTest::startsDark()
{
    KvStatisticsThemedNodeCfg cfg(nullptr);
    QCOMPARE(cfg.themeIndex(), 0);
    QCOMPARE(cfg.themes()->themeName(), QStringLiteral("Dark"));
    const KvStatisticsThemedNodeCfg &fixed = cfg;
    QCOMPARE(fixed.themes(), cfg.themes());
}

void KvStatisticsThemedNodeCfgTest::keepsItsContext()
{
    KvTemplateContext context(nullptr);
    QCOMPARE(KvStatisticsThemedNodeCfg(&context).context(), &context);
    const KvStatisticsThemedNodeCfg windowed(nullptr);
    QVERIFY(windowed.context() == nullptr);
    QVERIFY(windowed.inherits("KvBaseEditorNodeCfg"));
}

void KvStatisticsThemedNodeCfgTest::selectsThemes()
{
    KvStatisticsThemedNodeCfg cfg(nullptr);
    QSignalSpy spy(cfg.themes(), SIGNAL(signalThemeChanged()));
    QVERIFY(!cfg.setTheme(0));
    QCOMPARE(spy.count(), 0);
    QVERIFY(cfg.setTheme(1));
    QCOMPARE(spy.count(), 1);
    QCOMPARE(cfg.themeIndex(), 1);
    QCOMPARE(cfg.themes()->theme(), KvChartThemes::Light);
    QVERIFY(!cfg.setTheme(1));
    QCOMPARE(spy.count(), 1);
    QVERIFY(cfg.setTheme(0));
    QCOMPARE(cfg.themeIndex(), 0);
}

void KvStatisticsThemedNodeCfgTest::writesTheTheme()
{
    KvStatisticsThemedNodeCfg cfg(nullptr);
    QJsonObject json;
    QVERIFY(cfg.toJson(json));
    QCOMPARE(json, QJsonObject({{QStringLiteral("theme"), QStringLiteral("Dark")}}));
    cfg.setTheme(1);
    QVERIFY(cfg.toJson(json));
    QCOMPARE(json, QJsonObject({{QStringLiteral("theme"), QStringLiteral("Light")}}));
}

void KvStatisticsThemedNodeCfgTest::writesBesideOtherMembers()
{
    const KvStatisticsThemedNodeCfg cfg(nullptr);
    QJsonObject json{{QStringLiteral("alignment"), 4}};
    QVERIFY(cfg.toJson(json));
    QCOMPARE(json.size(), 2);
    QCOMPARE(json.value(QStringLiteral("alignment")).toInt(), 4);
}

void KvStatisticsThemedNodeCfgTest::readsTheTheme_data()
{
    QTest::addColumn<QJsonObject>("json");
    QTest::addColumn<int>("before");
    QTest::addColumn<int>("after");
    const QString key = QStringLiteral("theme");
    QTest::newRow("missing") << QJsonObject() << 0 << 0;
    QTest::newRow("missing, Light") << QJsonObject() << 1 << 1;
    QTest::newRow("Light") << QJsonObject({{key, QStringLiteral("Light")}}) << 0 << 1;
    QTest::newRow("Dark") << QJsonObject({{key, QStringLiteral("Dark")}}) << 1 << 0;
    QTest::newRow("unknown") << QJsonObject({{key, QStringLiteral("light")}}) << 1 << -1;
    QTest::newRow("empty") << QJsonObject({{key, QString()}}) << 1 << -1;
    QTest::newRow("qualified") << QJsonObject({{key, QStringLiteral("kvCharts::KvChartThemes::Light")}}) << 0
                               << -1;
    QTest::newRow("number") << QJsonObject({{key, 1}}) << 0 << 0;
    QTest::newRow("number, Light") << QJsonObject({{key, 0}}) << 1 << 1;
    QTest::newRow("bool") << QJsonObject({{key, true}}) << 0 << 0;
    QTest::newRow("null") << QJsonObject({{key, QJsonValue::Null}}) << 1 << 1;
    QTest::newRow("array") << QJsonObject({{key, QJsonArray({QStringLiteral("Light")})}}) << 0 << 0;
    QTest::newRow("another key") << QJsonObject({{QStringLiteral("Theme"), QStringLiteral("Light")}}) << 0
                                 << 0;
}

void KvStatisticsThemedNodeCfgTest::readsTheTheme()
{
    QFETCH(QJsonObject, json);
    QFETCH(int, before);
    QFETCH(int, after);
    KvStatisticsThemedNodeCfg cfg(nullptr);
    cfg.setTheme(before);
    QSignalSpy spy(cfg.themes(), SIGNAL(signalThemeChanged()));
    QVERIFY(cfg.fromJson(json)); // whatever it says
    QCOMPARE(cfg.themeIndex(), after);
    QCOMPARE(spy.count(), before == after ? 0 : 1);
}

void KvStatisticsThemedNodeCfgTest::survivesARoundTrip_data()
{
    QTest::addColumn<QString>("read");
    QTest::addColumn<QString>("written");
    QTest::newRow("Dark") << QStringLiteral("Dark") << QStringLiteral("Dark");
    QTest::newRow("Light") << QStringLiteral("Light") << QStringLiteral("Light");
    QTest::newRow("unknown") << QStringLiteral("Sepia") << QString();
}

void KvStatisticsThemedNodeCfgTest::survivesARoundTrip()
{
    QFETCH(QString, read);
    QFETCH(QString, written);
    KvStatisticsThemedNodeCfg cfg(nullptr);
    QVERIFY(cfg.fromJson({{QStringLiteral("theme"), read}}));
    QJsonObject json;
    QVERIFY(cfg.toJson(json));
    QVERIFY(json.value(QStringLiteral("theme")).isString());
    QCOMPARE(json.value(QStringLiteral("theme")).toString(), written);
}

void KvStatisticsThemedNodeCfgTest::everyConfigurationHasItsOwnTheme()
{
    KvStatisticsThemedNodeCfg one(nullptr);
    KvStatisticsThemedNodeCfg other(nullptr);
    one.setTheme(1);
    QCOMPARE(other.themeIndex(), 0);
    QVERIFY(one.themes() != other.themes());
}

STATREPORT_TEST_MAIN(KvStatisticsThemedNodeCfgTest)
#include "KvStatisticsThemedNodeCfgTest.moc"
