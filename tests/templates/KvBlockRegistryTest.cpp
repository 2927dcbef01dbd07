// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/KvReportBlocks.h"
#include "support/BracketTranslator.h"
#include "templates/FakeBlockFactory.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvTemplateContext.h"

#include <QJsonObject>

#include <memory>

namespace {

struct ExpectedBlock
{
    const char *name;
    const char *title;
    bool isStatistics;
};

// All block types of reports, in the order of the palette. Names are the keys in files.
const ExpectedBlock expectedBlocks[] = {
    {"Image View", "Image View", false},
    {"Camera Image View", "Camera Image View", false},
    {"Text Document", "Text Document", false},
    {"Measurement table", "Measurements Table", false},
    {"Statistics Table", "Statistics Table", true},
    {"MinMedMaxBox", "Min / Median / Max Box", true},
    {"Trend", "Trend", true},
    {"Counters", "Counters", true},
};

int expectedIndex(const QString &name)
{
    int index = 0;
    for (const ExpectedBlock &block : expectedBlocks) {
        if (name == QLatin1String(block.name))
            return index;
        ++index;
    }
    return -1;
}

std::unique_ptr<FakeBlockFactory> fake(const QString &name, bool *deleted = nullptr)
{
    return std::make_unique<FakeBlockFactory>(name, QString(), QString(), deleted);
}

} // namespace

class KvBlockRegistryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsEmpty();
    void findsByExactName_data();
    void findsByExactName();
    void keepsTheOrderOfRegistration();
    void keepsTheGroup();
    void nothingIsNotRegistered();
    void ownsTheFactories();

    void reportBlocksKeepTheirOrder();
    void reportBlocksHaveTitlesAndGroups();
    void reportBlocksAreKnownByName_data();
    void reportBlocksAreKnownByName();
    void titlesAreTranslatedAndNamesAreNot();
    void reportBlocksMakeTheirConfigurations();
};

void KvBlockRegistryTest::startsEmpty()
{
    const KvBlockTypeList registry;
    QVERIFY(registry.blockTypes().isEmpty());
    QVERIFY(registry.find(QString()) == nullptr);
    QVERIFY(registry.find(QStringLiteral("Text Document")) == nullptr);
}

void KvBlockRegistryTest::findsByExactName_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<bool>("found");
    QTest::newRow("exact") << QStringLiteral("Measurement table") << true;
    QTest::newRow("other case") << QStringLiteral("Measurement Table") << false;
    QTest::newRow("the title") << QStringLiteral("Measurements Table") << false;
    QTest::newRow("a part") << QStringLiteral("Measurement") << false;
    QTest::newRow("a blank more") << QStringLiteral("Measurement table ") << false;
    QTest::newRow("empty") << QString() << false;
}

void KvBlockRegistryTest::findsByExactName()
{
    QFETCH(QString, name);
    QFETCH(bool, found);
    KvBlockTypeList registry;
    registry.registerFactory(fake(QStringLiteral("Trend")));
    auto factory = std::make_unique<FakeBlockFactory>(QStringLiteral("Measurement table"),
                                                      QStringLiteral("Measurements Table"));
    const KvBaseEditorNodeFactory *expected = found ? factory.get() : nullptr;
    registry.registerFactory(std::move(factory));
    QCOMPARE(registry.find(name), expected);
}

void KvBlockRegistryTest::keepsTheOrderOfRegistration()
{
    KvBlockTypeList registry;
    const QStringList names{QStringLiteral("c"), QStringLiteral("a"), QStringLiteral("b")};
    for (const QString &name : names)
        registry.registerFactory(fake(name));
    QStringList listed;
    for (const KvBlockType &type : registry.blockTypes()) {
        listed.append(type.factory->name());
        QCOMPARE(registry.find(type.factory->name()), type.factory);
    }
    QCOMPARE(listed, names);
}

void KvBlockRegistryTest::keepsTheGroup()
{
    KvBlockTypeList registry;
    registry.registerFactory(fake(QStringLiteral("a")));
    registry.registerFactory(fake(QStringLiteral("b")),
                             {QStringLiteral("Statistics"), QStringLiteral("Icons/ToolIconStats.svg")});
    QVERIFY(registry.blockTypes().at(0).group.title.isEmpty());
    QVERIFY(registry.blockTypes().at(0).group.iconPath.isEmpty());
    QCOMPARE(registry.blockTypes().at(1).group.title, QStringLiteral("Statistics"));
    QCOMPARE(registry.blockTypes().at(1).group.iconPath, QStringLiteral("Icons/ToolIconStats.svg"));
}

void KvBlockRegistryTest::nothingIsNotRegistered()
{
    KvBlockTypeList registry;
    registry.registerFactory(nullptr);
    QVERIFY(registry.blockTypes().isEmpty());
}

void KvBlockRegistryTest::ownsTheFactories()
{
    bool deleted = false;
    {
        KvBlockTypeList registry;
        registry.registerFactory(fake(QStringLiteral("a"), &deleted));
        QVERIFY(!deleted);
    }
    QVERIFY(deleted);
}

void KvBlockRegistryTest::reportBlocksKeepTheirOrder()
{
    KvBlockTypeList registry;
    registerReportBlocks(registry);
    QVERIFY(!registry.blockTypes().isEmpty());
    int previous = -1;
    for (const KvBlockType &type : registry.blockTypes()) {
        const int index = expectedIndex(type.factory->name());
        QVERIFY2(index > previous, qPrintable(type.factory->name()));
        previous = index;
    }
}

void KvBlockRegistryTest::reportBlocksHaveTitlesAndGroups()
{
    KvBlockTypeList registry;
    registerReportBlocks(registry);
    for (const KvBlockType &type : registry.blockTypes()) {
        const int index = expectedIndex(type.factory->name());
        QVERIFY2(index >= 0, qPrintable(type.factory->name()));
        const ExpectedBlock &expected = expectedBlocks[index];
        QCOMPARE(type.factory->title(), QString::fromLatin1(expected.title));
        QCOMPARE(type.group.title, expected.isStatistics ? QStringLiteral("Statistics") : QString());
        QCOMPARE(type.group.iconPath,
                 expected.isStatistics ? QStringLiteral("Icons/ToolIconStats.svg") : QString());
    }
}

void KvBlockRegistryTest::reportBlocksAreKnownByName_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<bool>("known");
    QTest::newRow("text") << QStringLiteral("Text Document") << true;
    QTest::newRow("measurements table") << QStringLiteral("Measurement table") << true;
    QTest::newRow("the measurements table's title") << QStringLiteral("Measurements Table") << false;
    QTest::newRow("lower case") << QStringLiteral("text document") << false;
}

void KvBlockRegistryTest::reportBlocksAreKnownByName()
{
    QFETCH(QString, name);
    QFETCH(bool, known);
    KvBlockTypeList registry;
    registerReportBlocks(registry);
    QCOMPARE(registry.find(name) != nullptr, known);
}

void KvBlockRegistryTest::titlesAreTranslatedAndNamesAreNot()
{
    const BracketTranslator translator(QStringLiteral("KvBaseEditorNodeFactory"));
    KvBlockTypeList registry;
    registerReportBlocks(registry);
    for (const KvBlockType &type : registry.blockTypes()) {
        const int index = expectedIndex(type.factory->name());
        QVERIFY2(index >= 0, qPrintable(type.factory->name()));
        QCOMPARE(type.factory->title(),
                 QLatin1Char('[') + QLatin1String(expectedBlocks[index].title) + QLatin1Char(']'));
    }
}

void KvBlockRegistryTest::reportBlocksMakeTheirConfigurations()
{
    KvTemplateContext context(nullptr);
    KvBlockTypeList registry;
    registerReportBlocks(registry);
    for (const KvBlockType &type : registry.blockTypes()) {
        const std::unique_ptr<KvBaseEditorNodeCfg> cfg(type.factory->createConfig(&context));
        QVERIFY2(cfg != nullptr, qPrintable(type.factory->name()));
        QCOMPARE(cfg->context(), &context);
        // What a new block writes, a new block of the same type reads.
        QJsonObject json;
        QVERIFY2(cfg->toJson(json), qPrintable(type.factory->name()));
        const std::unique_ptr<KvBaseEditorNodeCfg> other(type.factory->createConfig(&context));
        QVERIFY2(other->fromJson(json), qPrintable(type.factory->name()));
    }
    // The table is a themed block.
    const std::unique_ptr<KvBaseEditorNodeCfg> table(
        registry.find(QStringLiteral("Measurement table"))->createConfig(&context));
    QVERIFY(table->inherits("KvStatisticsThemedNodeCfg"));
}

STATREPORT_TEST_MAIN(KvBlockRegistryTest)
#include "KvBlockRegistryTest.moc"
