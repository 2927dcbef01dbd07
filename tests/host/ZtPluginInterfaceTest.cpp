// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "gui/ZtPluginInterface.h"

namespace {

class FakePlugin
    : public QObject
    , public ZtPluginInterface
{
    Q_OBJECT
    Q_INTERFACES(ZtPluginInterface)
public:
    ~FakePlugin() override { ++destroyed; }
    QStringList groupNames() override { return {QStringLiteral("Fakes")}; }
    bool initialize(const QString &groupName, KvGuiMainWindowBase *mainWindow) override
    {
        return mainWindow == nullptr && groupName == QLatin1String("Fakes");
    }
    int order() override { return 7; }

    static int destroyed;
};

int FakePlugin::destroyed = 0;

} // namespace

class ZtPluginInterfaceTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void theIdIsFixed();
    void objectsAreCastByTheId();
    void otherObjectsAreNoPlugins();
    void diesThroughTheInterface();
};

void ZtPluginInterfaceTest::theIdIsFixed()
{
    QCOMPARE(QByteArray(qobject_interface_iid<ZtPluginInterface *>()),
             QByteArray("com.Tarvosen.plugin.ManipulatorPluginInterface/1.0"));
}

void ZtPluginInterfaceTest::objectsAreCastByTheId()
{
    FakePlugin plugin;
    QObject *const object = &plugin;
    auto *const interface = qobject_cast<ZtPluginInterface *>(object);
    QVERIFY(interface == static_cast<ZtPluginInterface *>(&plugin));
    QCOMPARE(interface->groupNames(), QStringList(QStringLiteral("Fakes")));
    QCOMPARE(interface->order(), 7);
    QVERIFY(interface->initialize(QStringLiteral("Fakes"), nullptr));
    QVERIFY(!interface->initialize(QStringLiteral("Others"), nullptr));
}

void ZtPluginInterfaceTest::otherObjectsAreNoPlugins()
{
    QObject object;
    QVERIFY(qobject_cast<ZtPluginInterface *>(&object) == nullptr);
}

void ZtPluginInterfaceTest::diesThroughTheInterface()
{
    const int before = FakePlugin::destroyed;
    {
        const std::unique_ptr<ZtPluginInterface> plugin = std::make_unique<FakePlugin>();
        QVERIFY(plugin != nullptr);
    }
    QCOMPARE(FakePlugin::destroyed, before + 1);
}

STATREPORT_TEST_MAIN(ZtPluginInterfaceTest)
#include "ZtPluginInterfaceTest.moc"
