// SPDX-License-Identifier: MIT
#include "KvDeskTheme.h"

#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"
#include "support/StatReportTest.h"

class KvDeskThemeTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void storedTheme_data();
    void storedTheme();
    void applyChangesTheApplication();
    void unknownThemeChangesNothing();
    void toggleRemembers();

private:
    static QString storedValue()
    {
        ZtAppSettings::beginGroup(QStringLiteral("Desk"));
        const QString theme = ZtAppSettings::value(QStringLiteral("Theme")).toString();
        ZtAppSettings::endGroup();
        return theme;
    }
    static QString currentTheme() { return acss::QtAdvancedStylesheet::getInstance()->currentTheme(); }
};

void KvDeskThemeTest::cleanup()
{
    ZtAppSettings::getInstance()->setStoragePath(QString());
    acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Dark"));
    StatReportTest::cleanup();
}

void KvDeskThemeTest::storedTheme_data()
{
    QTest::addColumn<QString>("value");
    QTest::addColumn<QString>("theme");
    QTest::newRow("nothing") << QString() << QStringLiteral("Dark");
    QTest::newRow("light") << QStringLiteral("Light") << QStringLiteral("Light");
    QTest::newRow("unknown") << QStringLiteral("Blue") << QStringLiteral("Dark");
}

void KvDeskThemeTest::storedTheme()
{
    QFETCH(QString, value);
    QFETCH(QString, theme);
    if (!value.isEmpty())
        KvDeskTheme::store(value);
    QCOMPARE(storedValue(), value);
    QCOMPARE(KvDeskTheme::stored(), theme);
}

void KvDeskThemeTest::applyChangesTheApplication()
{
    KvDeskTheme::apply(QStringLiteral("Light"));
    QCOMPARE(currentTheme(), QStringLiteral("Light"));
    QCOMPARE(QApplication::palette().color(QPalette::Window), QColor(0xf3f4f5));
    QCOMPARE(qApp->styleSheet(), acss::QtAdvancedStylesheet::getInstance()->styleSheet());
    KvDeskTheme::apply(QStringLiteral("Dark"));
    QCOMPARE(QApplication::palette().color(QPalette::Window), QColor(0x1f2123));
    QCOMPARE(storedValue(), QString());
}

void KvDeskThemeTest::unknownThemeChangesNothing()
{
    KvDeskTheme::apply(QStringLiteral("Blue"));
    QCOMPARE(currentTheme(), QStringLiteral("Dark"));
}

void KvDeskThemeTest::toggleRemembers()
{
    KvDeskTheme::toggle();
    QCOMPARE(currentTheme(), QStringLiteral("Light"));
    QCOMPARE(storedValue(), QStringLiteral("Light"));
    KvDeskTheme::toggle();
    QCOMPARE(currentTheme(), QStringLiteral("Dark"));
    QCOMPARE(storedValue(), QStringLiteral("Dark"));
}

STATREPORT_TEST_MAIN(KvDeskThemeTest)
#include "KvDeskThemeTest.moc"
