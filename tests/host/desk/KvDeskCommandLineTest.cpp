// SPDX-License-Identifier: MIT
#include "KvDeskCommandLine.h"

#include "support/BracketTranslator.h"
#include "support/StatReportTest.h"

class KvDeskCommandLineTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void options();
    void files_data();
    void files();
    void theme_data();
    void theme();
    void faults_data();
    void faults();
    void complaintIsTranslated();
    void requestedTexts_data();
    void requestedTexts();
    void helpNamesAllOptions();

private:
    static QStringList words(const QString &line)
    {
        return QStringList(QStringLiteral("measuringdesk")) +
               line.split(QLatin1Char(' '), Qt::SkipEmptyParts);
    }
};

void KvDeskCommandLineTest::options()
{
    const KvDeskCommandLine line(words(QStringLiteral(
        "--session s.json --image=i.png --table t.csv --plugins a --plugins b --theme Light x y")));
    QCOMPARE(line.fault(), QString());
    QCOMPARE(line.session(), QStringLiteral("s.json"));
    QCOMPARE(line.image(), QStringLiteral("i.png"));
    QCOMPARE(line.table(), QStringLiteral("t.csv"));
    QCOMPARE(line.theme(), QStringLiteral("Light"));
    QCOMPARE(line.pluginFolders(), QStringList({QStringLiteral("a"), QStringLiteral("b")}));
    QCOMPARE(line.files(), QStringList({QStringLiteral("x"), QStringLiteral("y")}));
}

void KvDeskCommandLineTest::files_data()
{
    QTest::addColumn<QString>("line");
    QTest::addColumn<QStringList>("files");
    QTest::newRow("none") << QString() << QStringList();
    QTest::newRow("one") << QStringLiteral("demo.json") << QStringList(QStringLiteral("demo.json"));
    QTest::newRow("like an option") << QStringLiteral("-- --help") << QStringList(QStringLiteral("--help"));
}

void KvDeskCommandLineTest::files()
{
    QFETCH(QString, line);
    QFETCH(QStringList, files);
    const KvDeskCommandLine commandLine(words(line));
    QCOMPARE(commandLine.fault(), QString());
    QCOMPARE(commandLine.files(), files);
    QCOMPARE(commandLine.session() + commandLine.image() + commandLine.table() + commandLine.theme(),
             QString());
}

void KvDeskCommandLineTest::theme_data()
{
    QTest::addColumn<QString>("given");
    QTest::addColumn<QString>("theme");
    QTest::newRow("as written") << QStringLiteral("Dark") << QStringLiteral("Dark");
    QTest::newRow("small letters") << QStringLiteral("light") << QStringLiteral("Light");
}

void KvDeskCommandLineTest::theme()
{
    QFETCH(QString, given);
    QFETCH(QString, theme);
    const KvDeskCommandLine line(words(QStringLiteral("--theme ") + given));
    QCOMPARE(line.fault(), QString());
    QCOMPARE(line.theme(), theme);
}

void KvDeskCommandLineTest::faults_data()
{
    QTest::addColumn<QString>("line");
    QTest::addColumn<QString>("fault");
    QTest::newRow("unknown option") << QStringLiteral("--colour")
                                    << QStringLiteral("Unknown option 'colour'.");
    QTest::newRow("value missing") << QStringLiteral("--session")
                                   << QStringLiteral("Missing value after '--session'.");
    QTest::newRow("unknown theme") << QStringLiteral("--theme Blue")
                                   << QStringLiteral("There is no theme \"Blue\": use Dark or Light");
}

void KvDeskCommandLineTest::faults()
{
    QFETCH(QString, line);
    QFETCH(QString, fault);
    QCOMPARE(KvDeskCommandLine(words(line)).fault(), fault);
}

void KvDeskCommandLineTest::complaintIsTranslated()
{
    QCOMPARE(KvDeskCommandLine(words(QStringLiteral("a.json"))).complaint(), QString());
    const KvDeskCommandLine wrong(words(QStringLiteral("--theme Blue")));
    QCOMPARE(wrong.complaint(), wrong.fault() + QStringLiteral(" (measuringdesk --help tells more)"));
    const BracketTranslator translator(QStringLiteral("KvDeskCommandLine"));
    QCOMPARE(wrong.complaint(), QStringLiteral("[%1 (measuringdesk --help tells more)]").arg(wrong.fault()));
}

void KvDeskCommandLineTest::requestedTexts_data()
{
    QTest::addColumn<QString>("line");
    QTest::addColumn<QString>("start");
    QTest::newRow("nothing") << QStringLiteral("a.json") << QString();
    QTest::newRow("help") << QStringLiteral("a.json --help") << QStringLiteral("Usage: measuringdesk ");
    QTest::newRow("help, short") << QStringLiteral("-h") << QStringLiteral("Usage: measuringdesk ");
    QTest::newRow("version") << QStringLiteral("--version")
                             << QStringLiteral("measuringdesk " STATREPORT_VERSION "\n");
    QTest::newRow("a file of this name") << QStringLiteral("-- --help") << QString();
}

void KvDeskCommandLineTest::requestedTexts()
{
    QFETCH(QString, line);
    QFETCH(QString, start);
    const QString text = KvDeskCommandLine::requestedText(words(line));
    QCOMPARE(text.left(start.size()), start);
    QCOMPARE(text.isEmpty(), start.isEmpty());
}

void KvDeskCommandLineTest::helpNamesAllOptions()
{
    for (const char *option :
         {"--session", "--image", "--table", "--theme", "--plugins", "--help", "--version"})
        QVERIFY2(KvDeskCommandLine::helpText().contains(QLatin1String(option)), option);
}

STATREPORT_TEST_MAIN(KvDeskCommandLineTest)
#include "KvDeskCommandLineTest.moc"
