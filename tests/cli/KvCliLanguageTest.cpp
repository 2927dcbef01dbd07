// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvCliLanguage.h"
#include "KvCliTranslation.h"

#include <QProcessEnvironment>

namespace {

QProcessEnvironment environmentOf(const QString &assignments)
{
    QProcessEnvironment environment;
    for (const QString &assignment : assignments.split(QLatin1Char(' '), Qt::SkipEmptyParts))
        environment.insert(assignment.section(QLatin1Char('='), 0, 0),
                           assignment.section(QLatin1Char('='), 1));
    return environment;
}

} // namespace

class KvCliLanguageTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void findsNames_data();
    void findsNames();
    void readsTheEnvironment_data();
    void readsTheEnvironment();
    void optionComesFirst_data();
    void optionComesFirst();
    void translates_data();
    void translates();
    void endsTranslating();
};

void KvCliLanguageTest::findsNames_data()
{
    QTest::addColumn<QString>("name");
    const auto row = [](const char *word, const char *name) {
        QTest::newRow(word) << QString::fromLatin1(name);
    };
    row("", "");
    row("German", "German");
    row("german", "German");
    row("CHINESESIMPLE", "ChineseSimple");
    row("de", "German");
    row("de_AT.UTF-8@euro", "German");
    row("en_GB", "English");
    row("sk", "Slovakian");
    row("ar_EG", "Arabic");
    row("zh", "ChineseSimple");
    row("zh_CN.UTF-8", "ChineseSimple");
    row("zh_TW", "ChineseTraditional");
    row("zh_HK", "ChineseTraditional");
    row("pt_BR", "");
    row("C", "");
    row("Klingon", "");
}

void KvCliLanguageTest::findsNames()
{
    QTEST(KvCliLanguage::named(QLatin1String(QTest::currentDataTag())), "name");
}

void KvCliLanguageTest::readsTheEnvironment_data()
{
    QTest::addColumn<QString>("name");
    const auto row = [](const char *variables, const char *name) {
        QTest::newRow(variables) << QString::fromLatin1(name);
    };
    row("", "English");
    row("LANG=de_DE.UTF-8", "German");
    row("LC_MESSAGES=fr_FR LANG=de_DE", "French");
    row("LC_ALL=it_IT LC_MESSAGES=fr_FR LANG=de_DE", "Italian");
    row("LC_ALL= LC_MESSAGES= LANG=de_DE", "German");
    row("LC_ALL=C LANG=de_DE", "English");
    row("LC_ALL=C.UTF-8 LANGUAGE=de", "English");
    row("LANG=POSIX LANGUAGE=de", "English");
    row("LANGUAGE=de", "English");
    row("LANG=de_DE LANGUAGE=ja", "Japanese");
    row("LANG=de_DE LANGUAGE=pt:ko:ja", "Korean");
    row("LANG=de_DE LANGUAGE=pt", "German");
    row("LANG=de_DE LANGUAGE=", "German");
    row("LANG=de_DE LANGUAGE=en", "English");
    row("LANG=pt_BR", "English");
    row("LC_NUMERIC=de_DE LC_CTYPE=de_DE", "English");
}

void KvCliLanguageTest::readsTheEnvironment()
{
    QTEST(KvCliLanguage::ofEnvironment(environmentOf(QLatin1String(QTest::currentDataTag()))), "name");
}

void KvCliLanguageTest::optionComesFirst_data()
{
    QTest::addColumn<QString>("name");
    const auto row = [](const char *line, const char *name) {
        QTest::newRow(line) << QString::fromLatin1(name);
    };
    row("statreport check a.rtp", "German");
    row("statreport check a.rtp --language ja", "Japanese");
    row("statreport --language=Korean check a.rtp", "Korean");
    row("statreport --language=Korean check a.rtp --language fr", "French");
    row("statreport check --language", "German");
    row("statreport check --language Klingon", "German");
    row("statreport check -- --language ja", "German");
}

void KvCliLanguageTest::optionComesFirst()
{
    const QStringList words = QString::fromLatin1(QTest::currentDataTag()).split(QLatin1Char(' '));
    QTEST(KvCliLanguage::chosen(words, environmentOf(QStringLiteral("LANG=de_DE"))), "name");
}

void KvCliLanguageTest::translates_data()
{
    QTest::addColumn<QString>("language");
    for (const QString &language : KvCliLanguage::names())
        QTest::newRow(qPrintable(language)) << language;
}

/// A text of each product: all are in the program.
void KvCliLanguageTest::translates()
{
    QFETCH(QString, language);
    const KvCliTranslation translation(language);
    const bool isEnglish = language == QLatin1String("English");
    const auto isTranslated = [](const char *context, const char *text) {
        return QCoreApplication::translate(context, text) != QLatin1String(text);
    };
    QCOMPARE(isTranslated("KvCliParser", "the template is missing"), !isEnglish);
    QCOMPARE(isTranslated("QCommandLineParser", "Unknown option '%1'."), !isEnglish);
    QCOMPARE(isTranslated("ZtTableImport", "The file cannot be read (%1)"), !isEnglish);
    QCOMPARE(isTranslated("KvBaseEditorNodeFactory", "Text Document"), !isEnglish);
}

void KvCliLanguageTest::endsTranslating()
{
    {
        const KvCliTranslation translation(QStringLiteral("German"));
        QCOMPARE(QCoreApplication::translate("KvCliSource", "cannot be read"),
                 QStringLiteral("kann nicht gelesen werden"));
    }
    QCOMPARE(QCoreApplication::translate("KvCliSource", "cannot be read"), QStringLiteral("cannot be read"));
    const KvCliTranslation none(QStringLiteral("Klingon"));
    QCOMPARE(QCoreApplication::translate("KvCliSource", "cannot be read"), QStringLiteral("cannot be read"));
}

STATREPORT_TEST_MAIN(KvCliLanguageTest)
#include "KvCliLanguageTest.moc"
