// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "FinishedProcess.h"

#include <QDate>
#include <QDir>
#include <QImage>
#include <QLocale>
#include <QMimeDatabase>
#include <QSet>
#include <QXmlStreamReader>

#include <cstdio>

namespace {

const QStringList languageCodes{QStringLiteral("de"),    QStringLiteral("fr"), QStringLiteral("es"),
                                QStringLiteral("it"),    QStringLiteral("ru"), QStringLiteral("ja"),
                                QStringLiteral("ko"),    QStringLiteral("ar"), QStringLiteral("zh_CN"),
                                QStringLiteral("zh_TW"), QStringLiteral("sk")};

QString packagingFile(const char *name)
{
    return StatReportTest::sourcePath(QStringLiteral("packaging/%1").arg(QLatin1String(name)));
}

QString read(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

/// The long options that the program's help names; of a command, or of the program.
QSet<QString> optionsOfHelp(const QString &command)
{
    QStringList arguments(QStringLiteral("--help"));
    if (!command.isEmpty())
        arguments.prepend(command);
    const FinishedProcess help = FinishedProcess::run(QStringLiteral(STATREPORT_PROGRAM), arguments);
    QSet<QString> options;
    QRegularExpressionMatchIterator it =
        QRegularExpression(QStringLiteral("^ +(?:-\\w, )?(--[a-z-]+)"), QRegularExpression::MultilineOption)
            .globalMatch(help.output);
    while (it.hasNext())
        options.insert(it.next().captured(1));
    return options;
}

/// What the completion offers after \a words, of which the last is being typed.
QSet<QString> completions(const QStringList &words)
{
    QStringList quoted;
    for (const QString &word : words)
        quoted.append(QStringLiteral("'%1'").arg(word));
    const QString script =
        QStringLiteral("shopt -s extglob; compopt() { :; }; source '%1'; COMP_WORDS=(%2); COMP_CWORD=%3; "
                       "_statreport; printf '%s\\n' \"${COMPREPLY[@]}\"")
            .arg(packagingFile("completion/statreport.bash"), quoted.join(QLatin1Char(' ')))
            .arg(words.size() - 1);
    const QString output =
        FinishedProcess::run(QStringLiteral("bash"), {QStringLiteral("-c"), script}).output;
    const QStringList offered = output.split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    return QSet<QString>(offered.begin(), offered.end());
}

/// How many elements of a name are in a language; those without one are in "". Empty ones do not count.
int textCount(const QString &path, const char *element, const QString &language)
{
    int count = 0;
    QXmlStreamReader xml(read(path));
    while (!xml.atEnd()) {
        if (xml.readNext() != QXmlStreamReader::StartElement || xml.name() != QLatin1String(element) ||
            xml.attributes().value(QLatin1String("xml:lang")) != language)
            continue;
        if (!xml.readElementText().trimmed().isEmpty())
            ++count;
    }
    return count;
}

/// What the MIME database with our types alone beside the system's makes of a file.
QString mimeTypeOf(const QString &file)
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("XDG_DATA_DIRS"),
                       StatReportTest::temporaryPath(QStringLiteral("data")) + QStringLiteral(":/usr/share"));
    environment.insert(QStringLiteral("HOME"), StatReportTest::temporaryPath(QStringLiteral("home")));
    environment.remove(QStringLiteral("XDG_DATA_HOME"));
    return FinishedProcess::run(QCoreApplication::applicationFilePath(),
                                {QStringLiteral("--mime-type-of"), file}, environment)
        .output.trimmed();
}

} // namespace

class PackagingTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void toolsFindNothing_data();
    void toolsFindNothing();
    void everyLanguageIsThere_data();
    void everyLanguageIsThere();
    void mimeTypesAreRecognised_data();
    void mimeTypesAreRecognised();
    void completionKnowsEveryOption_data();
    void completionKnowsEveryOption();
    void completionOffers_data();
    void completionOffers();
    void completionOffersEveryOption_data();
    void completionOffersEveryOption();
    void manualKnowsEveryOption();
    void everyVersionIsThisOne_data();
    void everyVersionIsThisOne();
    void packagesRecommendWhatTheyUse_data();
    void packagesRecommendWhatTheyUse();
    void guideNamesThePictures();
    void overridesHaveReasons();
};

void PackagingTest::toolsFindNothing_data()
{
    QTest::addColumn<QString>("tool");
    QTest::addColumn<QStringList>("arguments");
    QTest::newRow("desktop entry") << QStringLiteral("desktop-file-validate")
                                   << QStringList(
                                          packagingFile("linux/org.statreport.measuringdesk.desktop"));
    QTest::newRow("metainfo") << QStringLiteral("appstreamcli")
                              << QStringList(
                                     {QStringLiteral("validate"), QStringLiteral("--no-net"),
                                      QStringLiteral("--pedantic"), QStringLiteral("--no-color"),
                                      packagingFile("linux/org.statreport.measuringdesk.metainfo.xml")});
    for (const char *program : {"statreport", "measuringdesk"}) {
        QTest::newRow(qPrintable(QStringLiteral("manual of %1").arg(QLatin1String(program))))
            << QStringLiteral("mandoc")
            << QStringList({QStringLiteral("-T"), QStringLiteral("lint"), QStringLiteral("-W"),
                            QStringLiteral("warning"),
                            sourcePath(QStringLiteral("docs/man/%1.1").arg(QLatin1String(program)))});
    }
    const QPair<const char *, const char *> shells[] = {
        {"bash", "-n"}, {"zsh", "-n"}, {"fish", "--no-execute"}};
    for (const auto &shell : shells)
        QTest::newRow(qPrintable(QStringLiteral("%1 completion").arg(QLatin1String(shell.first))))
            << QString::fromLatin1(shell.first)
            << QStringList({QLatin1String(shell.second),
                            packagingFile("completion/statreport.") + QLatin1String(shell.first)});
}

void PackagingTest::toolsFindNothing()
{
    QFETCH(QString, tool);
    QFETCH(QStringList, arguments);
    const FinishedProcess finished = FinishedProcess::run(tool, arguments);
    QVERIFY2(finished.exitCode == 0, qPrintable(finished.output));
    for (const char *complaint : {"error", "warning", "hint", "W:", "I:"})
        QVERIFY2(!finished.output.contains(QLatin1String(complaint)), qPrintable(finished.output));
}

void PackagingTest::everyLanguageIsThere_data()
{
    QTest::addColumn<QString>("code");
    for (const QString &code : languageCodes)
        QTest::newRow(qPrintable(code)) << code;
}

void PackagingTest::everyLanguageIsThere()
{
    QFETCH(QString, code);
    const QString entry = read(packagingFile("linux/org.statreport.measuringdesk.desktop"));
    for (const char *key : {"GenericName", "Comment", "Keywords"})
        QVERIFY2(entry.contains(QStringLiteral("\n%1[%2]=").arg(QLatin1String(key), code)), key);
    const QString metainfo = packagingFile("linux/org.statreport.measuringdesk.metainfo.xml");
    for (const char *element : {"summary", "p", "li"})
        QCOMPARE(textCount(metainfo, element, code), textCount(metainfo, element, QString()));
    QVERIFY(textCount(metainfo, "li", code) > 1);
    const QString types = packagingFile("linux/statreport.xml");
    QCOMPARE(textCount(types, "comment", code), 2);
}

void PackagingTest::mimeTypesAreRecognised_data()
{
    const QString packages = temporaryPath(QStringLiteral("data/mime/packages"));
    QDir().mkpath(packages);
    QDir().mkpath(temporaryPath(QStringLiteral("home")));
    QFile::copy(packagingFile("linux/statreport.xml"), packages + QStringLiteral("/statreport.xml"));
    const FinishedProcess updated = FinishedProcess::run(QStringLiteral("update-mime-database"),
                                                         {temporaryPath(QStringLiteral("data/mime"))});
    QCOMPARE(updated.exitCode, 0);

    QTest::addColumn<QString>("file");
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("type");
    const QString templateType = QStringLiteral("application/x-statreport-template");
    const QString sessionType = QStringLiteral("application/x-measuringdesk-session");
    const QDir templates(sourcePath(QStringLiteral("examples/templates")));
    for (const QString &file : templates.entryList({QStringLiteral("*.rtp")})) {
        QTest::newRow(qPrintable(file)) << templates.filePath(file) << file << templateType;
        QTest::newRow(qPrintable(file + QStringLiteral(" without its suffix")))
            << templates.filePath(file) << QStringLiteral("template") << templateType;
    }
    const QDir sessions(sourcePath(QStringLiteral("examples/sessions")));
    for (const QString &file : sessions.entryList({QStringLiteral("*.json")}))
        QTest::newRow(qPrintable(file))
            << sessions.filePath(file) << QStringLiteral("session") << sessionType;
    QTest::newRow("a table") << sourcePath(QStringLiteral("examples/tables/bolts.csv"))
                             << QStringLiteral("bolts.csv") << QStringLiteral("text/csv");
}

void PackagingTest::mimeTypesAreRecognised()
{
    QFETCH(QString, file);
    QFETCH(QString, name);
    QFETCH(QString, type);
    const QString copy = temporaryPath(QStringLiteral("home/%1").arg(name));
    QFile::remove(copy);
    QVERIFY(QFile::copy(file, copy));
    QCOMPARE(mimeTypeOf(copy), type);
}

void PackagingTest::completionKnowsEveryOption_data()
{
    QTest::addColumn<QString>("command");
    for (const char *command : {"render", "stats", "check", "blocks"})
        QTest::newRow(command) << QString::fromLatin1(command);
}

void PackagingTest::completionKnowsEveryOption()
{
    QFETCH(QString, command);
    const QSet<QString> options = optionsOfHelp(command);
    QVERIFY(options.contains(QStringLiteral("--json-errors")));
    QSet<QString> offered = completions({QStringLiteral("statreport"), command, QStringLiteral("-")});
    offered.remove(QStringLiteral("-o"));
    QCOMPARE(offered, options);
    for (const char *shell : {"zsh", "fish"}) {
        const QString script = read(packagingFile("completion/statreport.") + QLatin1String(shell));
        for (const QString &option : options)
            QVERIFY2(script.contains(option) || script.contains(QStringLiteral("-l ") + option.mid(2)),
                     qPrintable(option));
    }
}

void PackagingTest::completionOffers_data()
{
    QTest::addColumn<QStringList>("words");
    QTest::addColumn<QStringList>("offered");
    const QString program = QStringLiteral("statreport");
    QTest::newRow("commands") << QStringList({program, QStringLiteral("s")})
                              << QStringList(QStringLiteral("stats"));
    QTest::newRow("format of stats")
        << QStringList({program, QStringLiteral("stats"), QStringLiteral("--format"), QString()})
        << QStringList({QStringLiteral("text"), QStringLiteral("csv"), QStringLiteral("json")});
    QTest::newRow("format of blocks")
        << QStringList({program, QStringLiteral("blocks"), QStringLiteral("--format"), QString()})
        << QStringList({QStringLiteral("text"), QStringLiteral("json")});
    const QString template1 = sourcePath(QStringLiteral("examples/templates/de"));
    QTest::newRow("templates") << QStringList({program, QStringLiteral("check"), template1})
                               << QStringList(template1 + QStringLiteral("mo.rtp"));
    const QString session = sourcePath(QStringLiteral("examples/sessions/de"));
    QTest::newRow("sessions") << QStringList(
                                     {program, QStringLiteral("stats"), QStringLiteral("--session"), session})
                              << QStringList(session + QStringLiteral("mo.json"));
}

void PackagingTest::completionOffers()
{
    QFETCH(QStringList, words);
    QFETCH(QStringList, offered);
    QCOMPARE(completions(words), QSet<QString>(offered.begin(), offered.end()));
}

void PackagingTest::completionOffersEveryOption_data()
{
    QTest::addColumn<QString>("shell");
    QTest::addColumn<QStringList>("arguments");
    // What the shell itself makes of the line; -i and --no-config keep the user's own settings out.
    QTest::newRow("bash") << QStringLiteral("bash")
                          << QStringList(
                                 {QStringLiteral("--norc"), QStringLiteral("-c"),
                                  QStringLiteral("compopt() { :; }; source '%1'; COMP_WORDS=(statreport --); "
                                                 "COMP_CWORD=1; $(complete -p statreport | awk '{ print "
                                                 "$(NF - 1) }'); printf '%s\\n' \"${COMPREPLY[@]}\"")
                                      .arg(packagingFile("completion/statreport.bash"))});
    QTest::newRow("fish") << QStringLiteral("fish")
                          << QStringList({QStringLiteral("--no-config"), QStringLiteral("-c"),
                                          QStringLiteral("source '%1'; complete -C 'statreport --'")
                                              .arg(packagingFile("completion/statreport.fish"))});
}

void PackagingTest::completionOffersEveryOption()
{
    QFETCH(QString, shell);
    QFETCH(QStringList, arguments);
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("HOME"), temporaryPath(QStringLiteral("home")));
    const FinishedProcess finished = FinishedProcess::run(shell, arguments, environment);
    QSet<QString> offered;
    for (const QString &line : finished.output.split(QLatin1Char('\n'))) {
        const QString word = line.section(QLatin1Char('\t'), 0, 0).section(QLatin1Char('='), 0, 0);
        if (word.startsWith(QLatin1String("--")))
            offered.insert(word);
    }
    QVERIFY2(offered == optionsOfHelp(QString()), qPrintable(finished.output));
}

void PackagingTest::everyVersionIsThisOne_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<QString>("pattern");
    QTest::newRow("changes") << sourcePath(QStringLiteral("CHANGELOG.md"))
                             << QStringLiteral("^## ([^ ,]+), ([0-9-]+)$");
    QTest::newRow("metainfo") << packagingFile("linux/org.statreport.measuringdesk.metainfo.xml")
                              << QStringLiteral("<release version=\"([^\"]+)\" date=\"([^\"]+)\"");
    QTest::newRow("changes of the packages")
        << packagingFile("linux/changelog")
        << QStringLiteral("^statreport \\(([^)]+)\\)[^>]*> +\\w+, (.+) \\d+:");
}

// The newest one, which comes first, in each; and all were made on the same day.
void PackagingTest::everyVersionIsThisOne()
{
    QFETCH(QString, file);
    QFETCH(QString, pattern);
    const QRegularExpressionMatch found =
        QRegularExpression(pattern, QRegularExpression::MultilineOption).match(read(file));
    QVERIFY2(found.hasMatch(), qPrintable(file));
    QCOMPARE(found.captured(1), QStringLiteral(STATREPORT_VERSION));
    QDate date = QDate::fromString(found.captured(2), Qt::ISODate);
    if (!date.isValid())
        date = QLocale::c().toDate(found.captured(2), QStringLiteral("dd MMM yyyy"));
    QVERIFY2(date.isValid(), qPrintable(found.captured(2)));
    static const QDate first = date;
    QCOMPARE(date, first);
}

void PackagingTest::packagesRecommendWhatTheyUse_data()
{
    QTest::addColumn<QString>("package");
    QTest::addColumn<QString>("needed");
    const auto row = [](const char *package, const char *needed) {
        QTest::addRow("%s: %s", package, needed)
            << QString::fromLatin1(package) << QString::fromLatin1(needed);
    };
    for (const char *const package : {"DESK", "PLUGIN"}) {
        for (const char *const font : {"fonts-open-sans", "fonts-noto-core", "fonts-noto-cjk"})
            row(package, font);
    }
    for (const char *const needed : {"statreport-plugin", "qttranslations5-l10n", "desktop-file-utils",
                                     "hicolor-icon-theme", "shared-mime-info", "xdg-utils"})
        row("DESK", needed);
}

void PackagingTest::packagesRecommendWhatTheyUse()
{
    QFETCH(QString, package);
    QFETCH(QString, needed);
    const QRegularExpression line(
        QStringLiteral("set\\(CPACK_DEBIAN_%1_PACKAGE_RECOMMENDS \"(.*)\"\\)").arg(package));
    const QString list = line.match(read(QStringLiteral(STATREPORT_CPACK_CONFIG))).captured(1);
    QStringList names;
    for (const QString &entry : list.split(QStringLiteral(", ")))
        names.append(entry.section(QLatin1Char(' '), 0, 0));
    QVERIFY2(names.contains(needed), qPrintable(list));
}

void PackagingTest::guideNamesThePictures()
{
    const QString guide = read(sourcePath(QStringLiteral("docs/user-guide.md")));
    const QDir pictures(sourcePath(QStringLiteral("docs/pictures")));
    QSet<QString> named;
    QRegularExpressionMatchIterator it =
        QRegularExpression(QStringLiteral("!\\[[^]]+\\]\\(pictures/([^)]+)\\)")).globalMatch(guide);
    while (it.hasNext())
        named.insert(it.next().captured(1));
    for (const QString &name : qAsConst(named))
        QVERIFY2(!QImage(pictures.filePath(name)).isNull(), qPrintable(name));
    const QStringList made = pictures.entryList({QStringLiteral("guide-*.png")});
    QCOMPARE(named, QSet<QString>(made.begin(), made.end()));
}

// Only where a reason is given is a finding of the packages' checker left alone.
void PackagingTest::overridesHaveReasons()
{
    const QStringList lines = read(packagingFile("linux/libstatreporthost.lintian-overrides"))
                                  .split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    QVERIFY(lines.size() > 1);
    for (int i = 1; i < lines.size(); ++i) {
        if (!lines.at(i).startsWith(QLatin1Char('#')))
            QVERIFY2(lines.at(i - 1).startsWith(QLatin1Char('#')), qPrintable(lines.at(i)));
    }
}

void PackagingTest::manualKnowsEveryOption()
{
    const QString manual = read(sourcePath(QStringLiteral("docs/man/statreport.1")));
    for (const char *command : {"", "render", "stats", "check", "blocks"}) {
        for (const QString &option : optionsOfHelp(QString::fromLatin1(command)))
            QVERIFY2(manual.contains(QStringLiteral("Fl Fl ") + option.mid(2)), qPrintable(option));
    }
}

namespace {

// The database is read once per process, from the folders of the process' environment.
int printMimeType(const char *file)
{
    const QString name = QMimeDatabase().mimeTypeForFile(QString::fromLocal8Bit(file)).name();
    std::puts(qPrintable(name));
    return 0;
}

} // namespace

int main(int argc, char **argv)
{
    if (argc == 3 && qstrcmp(argv[1], "--mime-type-of") == 0)
        return printMimeType(argv[2]);
    return runStatReportTest(argc, argv, []() -> StatReportTest * { return new PackagingTest; });
}

#include "PackagingTest.moc"
