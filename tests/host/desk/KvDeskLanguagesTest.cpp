// SPDX-License-Identifier: MIT
#include "KvDeskLanguages.h"

#include "kernel/ZtAppSettings.h"
#include "support/StatReportTest.h"

class KvDeskLanguagesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void everyLanguageIsNamedLikeTheSystems();
    void effectiveName_data();
    void effectiveName();
    void choiceIsStoredAtTheRoot();
    void localeOfNames();
};

void KvDeskLanguagesTest::cleanup()
{
    ZtAppSettings::getInstance()->setStoragePath(QString());
    StatReportTest::cleanup();
}

void KvDeskLanguagesTest::everyLanguageIsNamedLikeTheSystems()
{
    QCOMPARE(KvDeskLanguages::all().size(), 12);
    for (const KvDeskLanguage &language : KvDeskLanguages::all()) {
        QCOMPARE(ZtAppSettings::getLanguageName(language.locale), language.name);
        QVERIFY(!language.nativeName.isEmpty());
    }
}

void KvDeskLanguagesTest::effectiveName_data()
{
    QTest::addColumn<QString>("stored");
    QTest::addColumn<QString>("name");
    QTest::newRow("nothing stored") << QString() << ZtAppSettings::getSystemLanguageName();
    QTest::newRow("automatic") << QStringLiteral("auto") << ZtAppSettings::getSystemLanguageName();
    QTest::newRow("chosen") << QStringLiteral("Korean") << QStringLiteral("Korean");
}

void KvDeskLanguagesTest::effectiveName()
{
    QFETCH(QString, stored);
    QFETCH(QString, name);
    if (!stored.isEmpty())
        KvDeskLanguages::storeChoice(stored);
    QCOMPARE(KvDeskLanguages::effectiveName(), name);
    QCOMPARE(KvDeskLanguages::storedChoice(), stored.isEmpty() ? QStringLiteral("auto") : stored);
}

void KvDeskLanguagesTest::choiceIsStoredAtTheRoot()
{
    KvDeskLanguages::storeChoice(QStringLiteral("German"));
    QCOMPARE(ZtAppSettings::value(QStringLiteral("GEN_Language")).toString(), QStringLiteral("German"));
}

void KvDeskLanguagesTest::localeOfNames()
{
    QCOMPARE(KvDeskLanguages::localeOf(QStringLiteral("german")).language(), QLocale::German);
    QCOMPARE(KvDeskLanguages::localeOf(QStringLiteral("Arabic")).textDirection(), Qt::RightToLeft);
    QCOMPARE(KvDeskLanguages::localeOf(QStringLiteral("Klingon")), QLocale::c());
}

STATREPORT_TEST_MAIN(KvDeskLanguagesTest)
#include "KvDeskLanguagesTest.moc"
