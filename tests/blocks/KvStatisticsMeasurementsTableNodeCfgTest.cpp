// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.h"

#include <QJsonDocument>
#include <QJsonObject>

namespace {

QJsonObject saved(const KvStatisticsMeasurementsTableNodeCfg &cfg)
{
    QJsonObject config;
    [&]() { QVERIFY(cfg.toJson(config)); }();
    return config;
}

QSet<QString> asSet(const QJsonValue &columns)
{
    const QStringList names = columns.toString().split(QLatin1Char(';'), Qt::SkipEmptyParts);
    return QSet<QString>(names.begin(), names.end());
}

const QSet<QString> allColumns{QStringLiteral("Object Name"), QStringLiteral("Object Type"),
                               QStringLiteral("Value Name"), QStringLiteral("Value")};

} // namespace

class KvStatisticsMeasurementsTableNodeCfgTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void hasItsDefaults();
    void columnNamesAreInTheirOrder();
    void savesFiveKeysAndTheTheme();
    void savesWhatWasSet();
    void missingKeysKeepTheCurrentValues();
    void readsEveryKey();
    void columnsAreReplacedAsAWhole_data();
    void columnsAreReplacedAsAWhole();
    void wrongTypesKeepTheCurrentValues_data();
    void wrongTypesKeepTheCurrentValues();
    void everyWidthComesBack();
    void comesBackFromItsOwnFile();
    void themeIsRead_data();
    void themeIsRead();
    void optionsCompareByAllMembers();
};

void KvStatisticsMeasurementsTableNodeCfgTest::hasItsDefaults()
{
    const KvStatisticsMeasurementsTableNodeCfg cfg(nullptr);
    QCOMPARE(int(cfg.alignment()), 132);
    QCOMPARE(cfg.widthPercent(), 75);
    QCOMPARE(cfg.columns(), allColumns);
    QCOMPARE(cfg.orderColumn(), QString());
    QVERIFY(cfg.isOrderAscending());
    QCOMPARE(cfg.themeIndex(), 0);
}

void KvStatisticsMeasurementsTableNodeCfgTest::columnNamesAreInTheirOrder()
{
    QCOMPARE(KvStatisticsMeasurementsTableNodeCfg::columnNames(),
             QStringList({"Object Name", "Object Type", "Value Name", "Value"}));
    for (const QString &name : KvStatisticsMeasurementsTableNodeCfg::columnNames())
        QCOMPARE(KvStatisticsMeasurementsTableNodeCfg::columnLabel(name), name); // without a translation
}

void KvStatisticsMeasurementsTableNodeCfgTest::savesFiveKeysAndTheTheme()
{
    const QJsonObject config = saved(KvStatisticsMeasurementsTableNodeCfg(nullptr));
    QCOMPARE(config.keys(),
             QStringList({"alignment", "columns", "orderAscending", "orderColumn", "theme", "widthPercent"}));
    QCOMPARE(config["alignment"], QJsonValue(132));
    QCOMPARE(config["widthPercent"], QJsonValue(75));
    QCOMPARE(config["orderColumn"], QJsonValue(QString()));
    QVERIFY(config["orderColumn"].isString());
    QCOMPARE(config["orderAscending"], QJsonValue(true));
    QCOMPARE(config["theme"], QJsonValue(QStringLiteral("Dark")));
    QCOMPARE(asSet(config["columns"]), allColumns);
    QCOMPARE(config["columns"].toString().size(), 11 + 11 + 10 + 5 + 3); // the names and three semicolons
}

void KvStatisticsMeasurementsTableNodeCfgTest::savesWhatWasSet()
{
    KvStatisticsMeasurementsTableNodeCfg cfg(nullptr);
    cfg.setAlignment(Qt::AlignRight);
    cfg.setWidthPercent(40);
    cfg.setColumns({QStringLiteral("Value")});
    cfg.setOrder(QStringLiteral("Value Name"), false);
    QVERIFY(cfg.setTheme(1));
    const QJsonObject config = saved(cfg);
    QCOMPARE(config["alignment"], QJsonValue(2));
    QCOMPARE(config["widthPercent"], QJsonValue(40));
    QCOMPARE(config["columns"], QJsonValue(QStringLiteral("Value")));
    QCOMPARE(config["orderColumn"], QJsonValue(QStringLiteral("Value Name")));
    QCOMPARE(config["orderAscending"], QJsonValue(false));
    QCOMPARE(config["theme"], QJsonValue(QStringLiteral("Light")));
    cfg.setColumns({});
    QCOMPARE(saved(cfg)["columns"], QJsonValue(QString()));
    QVERIFY(saved(cfg)["columns"].isString());
}

void KvStatisticsMeasurementsTableNodeCfgTest::missingKeysKeepTheCurrentValues()
{
    KvStatisticsMeasurementsTableNodeCfg cfg(nullptr);
    cfg.setAlignment(Qt::AlignLeft);
    cfg.setWidthPercent(10);
    cfg.setColumns({QStringLiteral("Value")});
    cfg.setOrder(QStringLiteral("Value"), false);
    cfg.setTheme(1);
    const QJsonObject before = saved(cfg);
    QVERIFY(cfg.fromJson(QJsonObject()));
    QCOMPARE(saved(cfg), before);
}

void KvStatisticsMeasurementsTableNodeCfgTest::readsEveryKey()
{
    KvStatisticsMeasurementsTableNodeCfg cfg(nullptr);
    QVERIFY(cfg.fromJson({{"alignment", 1},
                          {"widthPercent", 33},
                          {"columns", "Value;Object Name"},
                          {"orderColumn", "Value"},
                          {"orderAscending", false},
                          {"theme", "Light"}}));
    QCOMPARE(int(cfg.alignment()), 1);
    QCOMPARE(cfg.widthPercent(), 33);
    QCOMPARE(cfg.columns(), QSet<QString>({"Object Name", "Value"}));
    QCOMPARE(cfg.orderColumn(), QStringLiteral("Value"));
    QVERIFY(!cfg.isOrderAscending());
    QCOMPARE(cfg.themeIndex(), 1);
}

void KvStatisticsMeasurementsTableNodeCfgTest::columnsAreReplacedAsAWhole_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QSet<QString>>("columns");
    QTest::newRow("none") << "" << QSet<QString>{};
    QTest::newRow("only separators") << ";;;" << QSet<QString>{};
    QTest::newRow("one") << "Value" << QSet<QString>{"Value"};
    QTest::newRow("empty parts") << ";Value;;Object Name;" << QSet<QString>{"Value", "Object Name"};
    QTest::newRow("twice") << "Value;Value" << QSet<QString>{"Value"};
    QTest::newRow("unknown ones are kept") << "Colour;Value" << QSet<QString>{"Colour", "Value"};
    QTest::newRow("blanks are part of a name") << " Value; " << QSet<QString>{" Value", " "};
}

void KvStatisticsMeasurementsTableNodeCfgTest::columnsAreReplacedAsAWhole()
{
    QFETCH(QString, text);
    QFETCH(QSet<QString>, columns);
    KvStatisticsMeasurementsTableNodeCfg cfg(nullptr);
    QVERIFY(cfg.fromJson({{"columns", text}}));
    QCOMPARE(cfg.columns(), columns);
    QCOMPARE(asSet(saved(cfg)["columns"]), columns);
}

void KvStatisticsMeasurementsTableNodeCfgTest::wrongTypesKeepTheCurrentValues_data()
{
    QTest::addColumn<QJsonObject>("config");
    QTest::newRow("alignment as text") << QJsonObject{{"alignment", "1"}};
    QTest::newRow("alignment as a fraction") << QJsonObject{{"alignment", 1.5}};
    QTest::newRow("alignment null") << QJsonObject{{"alignment", QJsonValue::Null}};
    QTest::newRow("width as text") << QJsonObject{{"widthPercent", "10"}};
    QTest::newRow("width as a fraction") << QJsonObject{{"widthPercent", 10.5}};
    QTest::newRow("width too large for an int") << QJsonObject{{"widthPercent", 3e9}};
    QTest::newRow("columns as number") << QJsonObject{{"columns", 5}};
    QTest::newRow("columns as list") << QJsonObject{{"columns", QJsonArray{"Value"}}};
    QTest::newRow("columns null") << QJsonObject{{"columns", QJsonValue::Null}};
    QTest::newRow("order column as number") << QJsonObject{{"orderColumn", 5}};
    QTest::newRow("direction as number") << QJsonObject{{"orderAscending", 1}};
    QTest::newRow("direction as text") << QJsonObject{{"orderAscending", "true"}};
    QTest::newRow("theme as number") << QJsonObject{{"theme", 0}};
    QTest::newRow("theme null") << QJsonObject{{"theme", QJsonValue::Null}};
}

void KvStatisticsMeasurementsTableNodeCfgTest::wrongTypesKeepTheCurrentValues()
{
    QFETCH(QJsonObject, config);
    KvStatisticsMeasurementsTableNodeCfg cfg(nullptr);
    QVERIFY(cfg.fromJson({{"alignment", 2},
                          {"widthPercent", 44},
                          {"columns", "Value"},
                          {"orderColumn", "Value"},
                          {"orderAscending", false},
                          {"theme", "Light"}}));
    const QJsonObject before = saved(cfg);
    QVERIFY(cfg.fromJson(config));
    QCOMPARE(saved(cfg), before);
}

void KvStatisticsMeasurementsTableNodeCfgTest::everyWidthComesBack()
{
    for (int percent = 1; percent <= 100; ++percent) {
        KvStatisticsMeasurementsTableNodeCfg cfg(nullptr);
        cfg.setWidthPercent(percent);
        const QByteArray file = QJsonDocument(saved(cfg)).toJson();
        KvStatisticsMeasurementsTableNodeCfg again(nullptr);
        QVERIFY(again.fromJson(QJsonDocument::fromJson(file).object()));
        QCOMPARE(again.widthPercent(), percent);
    }
}

void KvStatisticsMeasurementsTableNodeCfgTest::comesBackFromItsOwnFile()
{
    KvStatisticsMeasurementsTableNodeCfg cfg(nullptr);
    cfg.setAlignment(Qt::AlignLeft);
    cfg.setColumns({QStringLiteral("Value"), QStringLiteral("Messgröße")});
    cfg.setOrder(QStringLiteral("Object Type"), false);
    cfg.setTheme(1);
    const QByteArray file = QJsonDocument(saved(cfg)).toJson();
    KvStatisticsMeasurementsTableNodeCfg again(nullptr);
    QVERIFY(again.fromJson(QJsonDocument::fromJson(file).object()));
    QVERIFY(again.options() == cfg.options());
    QCOMPARE(again.themeIndex(), 1);
}

void KvStatisticsMeasurementsTableNodeCfgTest::themeIsRead_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("index");
    QTest::addColumn<QString>("savedName");
    QTest::newRow("Dark") << "Dark" << 0 << "Dark";
    QTest::newRow("Light") << "Light" << 1 << "Light";
    QTest::newRow("unknown") << "Blue" << -1 << "";
}

void KvStatisticsMeasurementsTableNodeCfgTest::themeIsRead()
{
    QFETCH(QString, name);
    KvStatisticsMeasurementsTableNodeCfg cfg(nullptr);
    QVERIFY(cfg.fromJson({{"theme", name}}));
    QTEST(cfg.themeIndex(), "index");
    QTEST(saved(cfg)["theme"].toString(), "savedName");
}

void KvStatisticsMeasurementsTableNodeCfgTest::optionsCompareByAllMembers()
{
    using Options = KvStatisticsMeasurementsTableNodeCfg::Options;
    const Options options;
    QVERIFY(options == Options());
    Options other;
    other.alignment = Qt::AlignLeft;
    QVERIFY(!(options == other));
    other = options;
    other.widthPercent = 74;
    QVERIFY(!(options == other));
    other = options;
    other.columns.insert(QStringLiteral("Value"));
    QVERIFY(!(options == other));
    other = options;
    other.orderColumn = QStringLiteral("Value");
    QVERIFY(!(options == other));
    other = options;
    other.orderAscending = false;
    QVERIFY(!(options == other));
}

STATREPORT_TEST_MAIN(KvStatisticsMeasurementsTableNodeCfgTest)
#include "KvStatisticsMeasurementsTableNodeCfgTest.moc"
