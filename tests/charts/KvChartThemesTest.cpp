// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "charts/KvChartThemes.h"
#include "support/MetaMethods.h"

#include <QMetaEnum>

using kvCharts::KvChartThemes;

class KvChartThemesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsDark();
    void themesAreAMetaEnum();
    void theOnlySignal();
    void colors_data();
    void colors();
    void selectsByValue();
    void selectsByName_data();
    void selectsByName();
    void unknownThemesAreDark();
    void anUnknownNameIsAnnouncedOnce();
};

void KvChartThemesTest::startsDark()
{
    const KvChartThemes themes;
    QCOMPARE(themes.theme(), KvChartThemes::Dark);
    QCOMPARE(themes.themeName(), QStringLiteral("Dark"));
    QVERIFY(themes.parent() == nullptr);
    QObject owner;
    QCOMPARE((new KvChartThemes(&owner))->parent(), &owner);
}

void KvChartThemesTest::themesAreAMetaEnum()
{
    const KvChartThemes themes;
    const QMetaEnum keys = QMetaEnum::fromType<KvChartThemes::ThemeType>();
    QCOMPARE(keys.keyCount(), 2);
    QCOMPARE(keys.key(0), "Dark");
    QCOMPARE(keys.value(0), 0);
    QCOMPARE(keys.key(1), "Light");
    QCOMPARE(keys.value(1), 1);
    // Under both spellings that signatures use.
    QVERIFY(QMetaType::type("ThemeType") != QMetaType::UnknownType);
    QVERIFY(QMetaType::type("kvCharts::KvChartThemes::ThemeType") != QMetaType::UnknownType);
}

void KvChartThemesTest::theOnlySignal()
{
    QCOMPARE(ownMethods(KvChartThemes::staticMetaObject, QMetaMethod::Signal),
             QStringList(QStringLiteral("signalThemeChanged()")));
}

void KvChartThemesTest::colors_data()
{
    QTest::addColumn<int>("role");
    QTest::addColumn<QString>("dark");
    QTest::addColumn<QString>("light");
    QTest::newRow("chart background") << 0 << QStringLiteral("#262626") << QStringLiteral("#ffffff");
    QTest::newRow("part label") << 1 << QStringLiteral("#ffffff") << QStringLiteral("#313131");
    QTest::newRow("legend") << 2 << QStringLiteral("#ffffff") << QStringLiteral("#313131");
    QTest::newRow("tick label") << 3 << QStringLiteral("#ffffff") << QStringLiteral("#313131");
    QTest::newRow("red") << 4 << QStringLiteral("#872222") << QStringLiteral("#d55959");
    QTest::newRow("green") << 5 << QStringLiteral("#226a25") << QStringLiteral("#60bd65");
    QTest::newRow("axis line") << 6 << QStringLiteral("#dcdcdc") << QStringLiteral("#373737");
    QTest::newRow("grid line") << 7 << QStringLiteral("#373737") << QStringLiteral("#dcdcdc");
    QTest::newRow("table grid line") << 8 << QStringLiteral("#4d4d4d") << QStringLiteral("#dddddd");
    QTest::newRow("table background") << 9 << QStringLiteral("#4d4d4d") << QStringLiteral("#dddddd");
    QTest::newRow("table text") << 10 << QStringLiteral("#f0f0f1") << QStringLiteral("#141414");
}

void KvChartThemesTest::colors()
{
    QFETCH(int, role);
    QFETCH(QString, dark);
    QFETCH(QString, light);
    KvChartThemes themes;
    QCOMPARE(themes.colors().size(), 11);
    QCOMPARE(themes.colors().at(role).name(), dark);
    QCOMPARE(themes.color(static_cast<KvChartThemes::ColorRole>(role)).name(), dark);
    themes.setTheme(KvChartThemes::Light);
    QCOMPARE(themes.colors().size(), 11);
    QCOMPARE(themes.colors().at(role).name(), light);
    QCOMPARE(themes.color(static_cast<KvChartThemes::ColorRole>(role)).name(), light);
    QCOMPARE(themes.colors().at(role).alpha(), 255);
}

void KvChartThemesTest::selectsByValue()
{
    KvChartThemes themes;
    QSignalSpy spy(&themes, SIGNAL(signalThemeChanged()));
    QVERIFY(!themes.setTheme(KvChartThemes::Dark));
    QCOMPARE(spy.count(), 0);
    QVERIFY(themes.setTheme(KvChartThemes::Light));
    QCOMPARE(spy.count(), 1);
    QCOMPARE(themes.theme(), KvChartThemes::Light);
    QCOMPARE(themes.themeName(), QStringLiteral("Light"));
    QVERIFY(!themes.setTheme(KvChartThemes::Light));
    QCOMPARE(spy.count(), 1);
    QVERIFY(themes.setTheme(KvChartThemes::Dark));
    QCOMPARE(spy.count(), 2);
}

void KvChartThemesTest::selectsByName_data()
{
    QTest::addColumn<int>("before");
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("after");
    QTest::newRow("Light") << 0 << QStringLiteral("Light") << 1;
    QTest::newRow("Dark") << 1 << QStringLiteral("Dark") << 0;
    QTest::newRow("Dark again") << 0 << QStringLiteral("Dark") << 0;
    QTest::newRow("Light again") << 1 << QStringLiteral("Light") << 1;
    QTest::newRow("lower case") << 1 << QStringLiteral("light") << -1;
    QTest::newRow("lower case, from Dark") << 0 << QStringLiteral("dark") << -1;
    QTest::newRow("empty") << 1 << QString() << -1;
    QTest::newRow("other") << 0 << QStringLiteral("Sepia") << -1;
    QTest::newRow("a blank more") << 0 << QStringLiteral("Light ") << -1;
    QTest::newRow("number") << 0 << QStringLiteral("1") << -1;
    QTest::newRow("qualified") << 0 << QStringLiteral("KvChartThemes::Light") << -1;
    QTest::newRow("fully qualified") << 0 << QStringLiteral("kvCharts::KvChartThemes::Light") << -1;
}

void KvChartThemesTest::selectsByName()
{
    QFETCH(int, before);
    QFETCH(QString, name);
    QFETCH(int, after);
    KvChartThemes themes;
    themes.setTheme(static_cast<KvChartThemes::ThemeType>(before));
    QSignalSpy spy(&themes, SIGNAL(signalThemeChanged()));
    themes.setTheme(name);
    QCOMPARE(int(themes.theme()), after);
    QCOMPARE(spy.count(), before == after ? 0 : 1);
}

void KvChartThemesTest::unknownThemesAreDark()
{
    KvChartThemes themes;
    themes.setTheme(KvChartThemes::Light);
    themes.setTheme(QStringLiteral("light"));
    QCOMPARE(themes.colors().first(), QColor(0x26, 0x26, 0x26));
    QCOMPARE(themes.themeName(), QString());
    themes.setTheme(static_cast<KvChartThemes::ThemeType>(2));
    QCOMPARE(themes.colors().first(), QColor(0x26, 0x26, 0x26));
    QCOMPARE(themes.themeName(), QString());
}

void KvChartThemesTest::anUnknownNameIsAnnouncedOnce()
{
    KvChartThemes themes;
    QSignalSpy spy(&themes, SIGNAL(signalThemeChanged()));
    themes.setTheme(QStringLiteral("Sepia"));
    themes.setTheme(QStringLiteral("Green")); // -1 as before
    QCOMPARE(spy.count(), 1);
    themes.setTheme(QStringLiteral("Dark")); // the same colours, but another theme
    QCOMPARE(spy.count(), 2);
}

STATREPORT_TEST_MAIN(KvChartThemesTest)
#include "KvChartThemesTest.moc"
