// SPDX-License-Identifier: MIT
#include "KvDeskPlugins.h"

#include "DeskFiles.h"
#include "DeskLog.h"
#include "gui/KvGuiMainWindowBase.h"
#include "gui/KvToolBase.h"

namespace {

QStringList pluginLog()
{
    return qApp->property("pluginLog").toStringList();
}

QString folderOf(const char *plugin)
{
    return QStringLiteral(FAKE_PLUGINS "/") + QLatin1String(plugin);
}

QStringList warnings()
{
    return DeskLog::messages(ZtAppStatus::Warning);
}

} // namespace

class KvDeskPluginsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void startsByOrderAndDeletesInReverse();
    void failures_data();
    void failures();
    void goodOnesWorkBesideBadOnes();
    void linkToAPluginIsTheSamePlugin();
    void nothingFoundIsSaid();
    void librariesStayLoaded();
    void folders();

private:
    KvGuiMainWindowBase m_window;
};

void KvDeskPluginsTest::init()
{
    StatReportTest::init();
    ZtStatusLog::getInstance()->clear();
    qApp->setProperty("pluginLog", QStringList());
    m_window.setObjectName(QStringLiteral("desk"));
    qDeleteAll(m_window.tools());
    qunsetenv("STATREPORT_PLUGINS");
}

void KvDeskPluginsTest::startsByOrderAndDeletesInReverse()
{
    {
        KvDeskPlugins plugins(&m_window);
        plugins.load({folderOf("GoodPlugin"), folderOf("EarlyPlugin")});
        QCOMPARE(plugins.count(), 2);
        QCOMPARE(warnings(), QStringList());
        QCOMPARE(m_window.tools().size(), 2);
        QCOMPARE(m_window.tools().first()->name(), QStringLiteral("EarlyPlugin"));
    }
    QCOMPARE(pluginLog(), QStringList({QStringLiteral("initialize EarlyPlugin tools"),
                                       QStringLiteral("initialize GoodPlugin tools"),
                                       QStringLiteral("delete GoodPlugin window desk"),
                                       QStringLiteral("delete EarlyPlugin window desk")}));
}

void KvDeskPluginsTest::failures_data()
{
    QTest::addColumn<QString>("folder");
    QTest::addColumn<QString>("reason");
    QTest::newRow("does not start") << folderOf("FailingPlugin")
                                    << QStringLiteral(
                                           "Its tools \"FailingPlugin tools\" could not be started");
    QTest::newRow("another program's")
        << folderOf("OtherPlugin") << QStringLiteral("It is no plug-in for this program");
    QTest::newRow("throws while it starts")
        << folderOf("ThrowingPlugin") << QStringLiteral("It failed: no licence for the tools");
    QTest::newRow("throws while it is made")
        << folderOf("UnbornPlugin") << QStringLiteral("It failed for a reason of its own");
    QTest::newRow("lacks a library") << folderOf("UnresolvedPlugin") << QStringLiteral("functionOfNobody");
    const QString cut = temporaryPath(QStringLiteral("cut"));
    QDir().mkpath(cut);
    const QByteArray whole = DeskFiles::bytes(folderOf("GoodPlugin") + QStringLiteral("/libGoodPlugin.so"));
    DeskFiles::text(QStringLiteral("cut/Cut.so"), whole.left(whole.size() / 2));
    QTest::newRow("cut in the middle") << cut << QStringLiteral("Cut.so");
    const QString empty = temporaryPath(QStringLiteral("empty"));
    QDir().mkpath(empty);
    DeskFiles::text(QStringLiteral("empty/Empty.so"), "");
    QTest::newRow("empty") << empty << QStringLiteral("Empty.so");
    const QString folder = temporaryPath(QStringLiteral("garbage"));
    QDir().mkpath(folder);
    DeskFiles::text(QStringLiteral("garbage/Garbage.so"), "this is no library");
    QTest::newRow("garbage") << folder << QStringLiteral("Garbage.so");
}

void KvDeskPluginsTest::failures()
{
    QFETCH(QString, folder);
    QFETCH(QString, reason);
    KvDeskPlugins plugins(&m_window);
    plugins.load({folder});
    QCOMPARE(plugins.count(), 0);
    QCOMPARE(warnings().size(), 1);
    QVERIFY2(warnings().first().startsWith(QStringLiteral("Plug-in not loaded: ") + folder),
             qPrintable(warnings().first()));
    QVERIFY2(warnings().first().contains(reason), qPrintable(warnings().first()));
    // A reason is more than the name of the file.
    QVERIFY(warnings().first().size() > folder.size() + 40);
    QCOMPARE(m_window.tools().size(), 0);
}

void KvDeskPluginsTest::goodOnesWorkBesideBadOnes()
{
    const QString garbage = temporaryPath(QStringLiteral("beside"));
    QDir().mkpath(garbage);
    DeskFiles::text(QStringLiteral("beside/A.so"), "this is no library");
    DeskFiles::text(QStringLiteral("beside/notes.txt"), "this is none, and does not pretend");
    KvDeskPlugins plugins(&m_window);
    plugins.load({garbage, folderOf("FailingPlugin"), folderOf("OtherPlugin"), folderOf("ThrowingPlugin"),
                  folderOf("UnbornPlugin"), folderOf("UnresolvedPlugin"), folderOf("GoodPlugin")});
    QCOMPARE(plugins.count(), 1);
    QCOMPARE(warnings().size(), 6);
    QCOMPARE(m_window.tools().size(), 1);
    QCOMPARE(ZtStatusLog::getInstance()->entries().last().message,
             QStringLiteral("Plug-in loaded: libGoodPlugin.so"));
}

void KvDeskPluginsTest::linkToAPluginIsTheSamePlugin()
{
    const QString folder = temporaryPath(QStringLiteral("links"));
    QDir().mkpath(folder);
    QVERIFY(QFile::link(folderOf("GoodPlugin") + QStringLiteral("/libGoodPlugin.so"),
                        folder + QStringLiteral("/libAnother.so")));
    KvDeskPlugins plugins(&m_window);
    plugins.load({folderOf("GoodPlugin"), folder});
    QCOMPARE(plugins.count(), 1);
    QCOMPARE(pluginLog(), QStringList(QStringLiteral("initialize GoodPlugin tools")));
}

void KvDeskPluginsTest::nothingFoundIsSaid()
{
    KvDeskPlugins plugins(&m_window);
    plugins.load({QStringLiteral("/no such folder")});
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 1);
    QCOMPARE(ZtStatusLog::getInstance()->entries().first().message, QStringLiteral("No plug-ins were found"));
    QCOMPARE(ZtStatusLog::getInstance()->entries().first().category,
             static_cast<int>(ZtAppStatus::Information));
}

void KvDeskPluginsTest::librariesStayLoaded()
{
    for (int i = 0; i < 2; ++i) {
        KvDeskPlugins plugins(&m_window);
        plugins.load({folderOf("GoodPlugin")});
        QCOMPARE(plugins.count(), 1);
    }
    // What the kernel has mapped into the program.
    QVERIFY(DeskFiles::bytes(QStringLiteral("/proc/self/maps")).contains("libGoodPlugin.so"));
}

void KvDeskPluginsTest::folders()
{
    qputenv("STATREPORT_PLUGINS", "/one:/two/../two");
    const QStringList folders = KvDeskPlugins::folders({QStringLiteral("/three"), QStringLiteral("/one")});
    const QString program = QCoreApplication::applicationDirPath();
    QCOMPARE(folders, QStringList({QStringLiteral("/one"), QStringLiteral("/two"), QStringLiteral("/three"),
                                   QDir::cleanPath(program + QStringLiteral("/../plugins")),
                                   QDir::cleanPath(program + QStringLiteral("/../lib/statreport/plugins"))}));
}

STATREPORT_TEST_MAIN(KvDeskPluginsTest)
#include "KvDeskPluginsTest.moc"
