// SPDX-License-Identifier: MIT
#include "editor/KvEditorToolsList.h"
#include "editor/KvEditorToolCombo.h"
#include "editor/KvEditorToolWidget.h"
#include "support/FakeBlock.h"
#include "support/StatReportTest.h"

namespace {

const KvBlockGroup kStatistics{QStringLiteral("Statistics"), QStringLiteral("Icons/ToolIconStats.svg")};
const KvBlockGroup kOther{QStringLiteral("Other"), QStringLiteral("Icons/ToolIconStats.svg")};

FakeBlockFactory *add(KvEditorToolsList &list, const char *name, const KvBlockGroup &group = KvBlockGroup())
{
    auto factory = std::make_unique<FakeBlockFactory>(QLatin1String(name));
    FakeBlockFactory *result = factory.get();
    list.registerFactory(std::move(factory), group);
    return result;
}

QStringList toolTexts(const QWidget &widget)
{
    QStringList texts;
    for (const KvEditorToolWidget *tool : widget.findChildren<KvEditorToolWidget *>())
        texts.append(tool->text());
    return texts;
}

} // namespace

class KvEditorToolsListTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void isARegistry();
    void findsByExactName_data();
    void findsByExactName();
    void showsToolsInOrder();
    void groupsShareACombo();
    void nothingIsNotAdded();
    void activationIsPassedOn_data();
    void activationIsPassedOn();
    void tabReachesTheToolsOfOpenGroups();
    void diesWithItsTools();
};

void KvEditorToolsListTest::isARegistry()
{
    KvEditorToolsList list;
    const FakeBlockFactory *first = add(list, "One");
    const FakeBlockFactory *second = add(list, "Two", kStatistics);
    KvBlockRegistry *registry = &list;
    QCOMPARE(registry->blockTypes().size(), 2);
    QCOMPARE(registry->blockTypes().at(0).factory, first);
    QVERIFY(registry->blockTypes().at(0).group.title.isEmpty());
    QCOMPARE(registry->blockTypes().at(1).factory, second);
    QCOMPARE(registry->blockTypes().at(1).group.title, QStringLiteral("Statistics"));
}

void KvEditorToolsListTest::findsByExactName_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<bool>("isFound");
    QTest::newRow("name") << QStringLiteral("Image View") << true;
    QTest::newRow("other case") << QStringLiteral("image view") << false;
    QTest::newRow("title") << QStringLiteral("Image View title") << false;
    QTest::newRow("empty") << QString() << false;
}

void KvEditorToolsListTest::findsByExactName()
{
    QFETCH(QString, name);
    KvEditorToolsList list;
    add(list, "Image View", kStatistics);
    QTEST(list.find(name) != nullptr, "isFound");
}

void KvEditorToolsListTest::showsToolsInOrder()
{
    KvEditorToolsList list;
    add(list, "One");
    add(list, "Two");
    add(list, "Three", kStatistics);
    add(list, "Four");
    list.show();
    QVERIFY(QTest::qWaitForWindowExposed(&list));
    const auto tools = list.findChildren<KvEditorToolWidget *>(QString(), Qt::FindDirectChildrenOnly);
    QCOMPARE(tools.size(), 3);
    QCOMPARE(tools.at(0)->text(), QStringLiteral("One title"));
    QVERIFY(tools.at(0)->y() < tools.at(1)->y());
    const auto *combo = list.findChild<KvEditorToolCombo *>();
    QVERIFY(tools.at(1)->y() < combo->y());
    QVERIFY(combo->y() < tools.at(2)->y());
}

void KvEditorToolsListTest::groupsShareACombo()
{
    KvEditorToolsList list;
    add(list, "One", kStatistics);
    add(list, "Two", kOther);
    add(list, "Three", kStatistics);
    const auto combos = list.findChildren<KvEditorToolCombo *>();
    QCOMPARE(combos.size(), 2);
    QCOMPARE(combos.at(0)->title(), QStringLiteral("Statistics"));
    QCOMPARE(toolTexts(*combos.at(0)),
             QStringList({QStringLiteral("One title"), QStringLiteral("Three title")}));
    QCOMPARE(toolTexts(*combos.at(1)), QStringList(QStringLiteral("Two title")));
}

void KvEditorToolsListTest::nothingIsNotAdded()
{
    KvEditorToolsList list;
    list.registerFactory(nullptr);
    list.registerFactory(nullptr, kStatistics);
    QVERIFY(list.blockTypes().isEmpty());
    QVERIFY(!list.findChild<KvEditorToolCombo *>());
}

void KvEditorToolsListTest::activationIsPassedOn_data()
{
    QTest::addColumn<bool>("grouped");
    QTest::newRow("ungrouped") << false;
    QTest::newRow("in a group") << true;
}

void KvEditorToolsListTest::activationIsPassedOn()
{
    QFETCH(bool, grouped);
    KvEditorToolsList list;
    FakeBlockFactory *factory = add(list, "Trend", grouped ? kStatistics : KvBlockGroup());
    QSignalSpy activated(&list, SIGNAL(signalToolActivated(QString)));
    QTest::keyClick(factory->toolWidget(nullptr), Qt::Key_Return);
    QCOMPARE(activated.count(), 1);
    QCOMPARE(activated.first().first().toString(), QStringLiteral("Trend"));
}

void KvEditorToolsListTest::tabReachesTheToolsOfOpenGroups()
{
    KvEditorToolsList list;
    FakeBlockFactory *first = add(list, "One");
    FakeBlockFactory *second = add(list, "Two", kStatistics);
    list.show();
    list.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&list));
    auto *combo = list.findChild<KvEditorToolCombo *>();
    QVERIFY(first->toolWidget(nullptr)->isVisible());
    QVERIFY(!second->toolWidget(nullptr)->isVisible());
    combo->setOpen(true);
    QVERIFY(second->toolWidget(nullptr)->isVisible());
    second->toolWidget(nullptr)->setFocus(Qt::TabFocusReason);
    QTRY_VERIFY(second->toolWidget(nullptr)->hasFocus());
}

void KvEditorToolsListTest::diesWithItsTools()
{
    auto list = std::make_unique<KvEditorToolsList>();
    const QPointer<KvEditorToolWidget> alone = add(*list, "One")->toolWidget(nullptr);
    const QPointer<KvEditorToolWidget> grouped = add(*list, "Two", kStatistics)->toolWidget(nullptr);
    list.reset();
    QVERIFY(!alone);
    QVERIFY(!grouped);
}

STATREPORT_TEST_MAIN(KvEditorToolsListTest)
#include "KvEditorToolsListTest.moc"
