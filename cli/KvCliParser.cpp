// SPDX-License-Identifier: MIT
#include "KvCliParser.h"

#include "KvCliLanguage.h"

#include <QCommandLineParser>

namespace {

// Qt's own texts, which its translations would translate if they were there.
constexpr const char *kParserTexts[] = {
    QT_TRANSLATE_NOOP("QCommandLineParser", "Usage: %1"),
    QT_TRANSLATE_NOOP("QCommandLineParser", "[options]"),
    QT_TRANSLATE_NOOP("QCommandLineParser", "Options:"),
    QT_TRANSLATE_NOOP("QCommandLineParser", "Arguments:"),
    QT_TRANSLATE_NOOP("QCommandLineParser", "Unknown option '%1'."),
    QT_TRANSLATE_NOOP("QCommandLineParser", "Unknown options: %1."),
    QT_TRANSLATE_NOOP("QCommandLineParser", "Missing value after '%1'."),
    QT_TRANSLATE_NOOP("QCommandLineParser", "Unexpected value after '%1'.")};

struct CommandName
{
    const char *name;
    KvCliArguments::Command command;
};

constexpr CommandName kCommands[] = {{"render", KvCliArguments::Render},
                                     {"stats", KvCliArguments::Stats},
                                     {"check", KvCliArguments::Check},
                                     {"blocks", KvCliArguments::Blocks}};

KvCliArguments::Command commandOf(const QString &word)
{
    for (const CommandName &entry : kCommands) {
        if (word == QLatin1String(entry.name))
            return entry.command;
    }
    return KvCliArguments::NoCommand;
}

KvCliParseResult shownText(const QString &text)
{
    KvCliParseResult result;
    result.kind = KvCliParseResult::ShowText;
    result.text = text;
    return result;
}

QString languageDescription()
{
    return KvCliParser::tr("Language of messages and reports, such as German or de; otherwise the system's.");
}

QString descriptionOf(KvCliArguments::Command command)
{
    switch (command) {
    case KvCliArguments::Render:
        return KvCliParser::tr("Prints a report: template and measurements in, PDF out.");
    case KvCliArguments::Stats:
        return KvCliParser::tr("Prints the statistics of every measured value, in the table's own units.");
    case KvCliArguments::Check:
        return KvCliParser::tr("Says what a template holds and what would be skipped or refused.");
    default:
        return KvCliParser::tr("Lists the block types and their settings with defaults.");
    }
}

QString optionsWord()
{
    return QCommandLineParser::tr(kParserTexts[1]);
}

QString helpOf(const QCommandLineParser &parser, const QString &command)
{
    // The command stands in the usage only, before the options: it is no argument that needs to be explained.
    QString text = parser.helpText();
    return text.insert(text.indexOf(optionsWord()), command + QLatin1Char(' '));
}

/** A line of the overview: what to write, and behind it or on the next line, what it does. */
QString overviewLine(const QString &syntax, const QString &description)
{
    constexpr int kColumn = 24;
    const QString start = QStringLiteral("  ") + syntax;
    if (start.size() < kColumn - 1)
        return start.leftJustified(kColumn) + description + QLatin1Char('\n');
    return start + QLatin1Char('\n') + QString(kColumn, QLatin1Char(' ')) + description + QLatin1Char('\n');
}

QString overview()
{
    const QString usage = QStringLiteral("statreport %1 %2").arg(QStringLiteral("COMMAND"), optionsWord());
    QString text = QCommandLineParser::tr(kParserTexts[0]).arg(usage) + QLatin1Char('\n');
    text += KvCliParser::tr("Turns measurements and a report template into a PDF report, without a display.");
    text += QLatin1String("\n\n") + KvCliParser::tr("Commands:") + QLatin1Char('\n');
    text +=
        overviewLine(QStringLiteral("render TEMPLATE.rtp (--session S | --table T) [--image I] -o OUT.pdf"),
                     descriptionOf(KvCliArguments::Render));
    text += overviewLine(QStringLiteral("stats (--session S | --table T) [--group-by object|measurement]\n"
                                        "        [--format text|csv|json]"),
                         descriptionOf(KvCliArguments::Stats));
    text += overviewLine(QStringLiteral("check TEMPLATE.rtp"), descriptionOf(KvCliArguments::Check));
    text +=
        overviewLine(QStringLiteral("blocks [--format text|json]"), descriptionOf(KvCliArguments::Blocks));
    text += QLatin1Char('\n') + KvCliParser::tr("Options everywhere:") + QLatin1Char('\n');
    text +=
        overviewLine(QStringLiteral("-h, --help"), KvCliParser::tr("Shows this text, or that of a command."));
    text += overviewLine(QStringLiteral("-v, --version"), KvCliParser::tr("Shows the version."));
    text += overviewLine(QStringLiteral("-q, --quiet"), KvCliParser::tr("Writes no notes and no progress."));
    text += overviewLine(QStringLiteral("--json-errors"),
                         KvCliParser::tr("Writes errors as one line of JSON each."));
    text += overviewLine(QStringLiteral("--language NAME"), languageDescription());
    text += QLatin1Char('\n') + KvCliParser::tr("\"-\" as a file name is standard input or output.");
    text += QLatin1Char('\n') + KvCliParser::tr("Exit codes: 0 done, 1 the work failed, 2 wrong usage.");
    return text + QLatin1Char('\n');
}

void addCommonOptions(QCommandLineParser &parser)
{
    parser.addOption({{QStringLiteral("h"), QStringLiteral("help")}, KvCliParser::tr("Shows this text.")});
    parser.addOption(
        {{QStringLiteral("v"), QStringLiteral("version")}, KvCliParser::tr("Shows the version.")});
    parser.addOption(
        {QStringLiteral("json-errors"), KvCliParser::tr("Writes errors as one line of JSON each.")});
    parser.addOption({QStringLiteral("language"), languageDescription(), QStringLiteral("name")});
    parser.addOption({{QStringLiteral("q"), QStringLiteral("quiet")},
                      KvCliParser::tr("Writes no notes and no progress.")});
}

void addDataOptions(QCommandLineParser &parser)
{
    const QString file = QStringLiteral("file");
    const QString column = QStringLiteral("column");
    parser.addOption(
        {QStringLiteral("session"), KvCliParser::tr("Measurements: a session of the Measuring Desk."), file});
    parser.addOption({QStringLiteral("table"),
                      KvCliParser::tr("Measurements: a table (CSV, TSV, ImageJ results)."), file});
    parser.addOption({QStringLiteral("unit"),
                      KvCliParser::tr("Unit of the table's values that state none, or Name=unit for one "
                                      "value. May be given several times."),
                      QStringLiteral("unit")});
    parser.addOption({QStringLiteral("type-column"),
                      KvCliParser::tr("The table's column with the object types."), column});
    parser.addOption({QStringLiteral("name-column"),
                      KvCliParser::tr("The table's column with the object names."), column});
    parser.addOption({QStringLiteral("decimal"),
                      KvCliParser::tr("Decimal mark of the table: point or comma."), QStringLiteral("mark")});
    parser.addOption({QStringLiteral("digits"),
                      KvCliParser::tr("Significant digits of measured values; 0 is automatic."),
                      QStringLiteral("count")});
}

void addCommandOptions(QCommandLineParser &parser, KvCliArguments::Command command)
{
    const QCommandLineOption format(QStringLiteral("format"),
                                    command == KvCliArguments::Stats
                                        ? KvCliParser::tr("Output: text, csv or json.")
                                        : KvCliParser::tr("Output: text or json."),
                                    QStringLiteral("format"), QStringLiteral("text"));
    parser.setApplicationDescription(descriptionOf(command));
    switch (command) {
    case KvCliArguments::Render:
        parser.addPositionalArgument(QStringLiteral("TEMPLATE.rtp"), KvCliParser::tr("The report template."));
        addDataOptions(parser);
        parser.addOption({QStringLiteral("image"), KvCliParser::tr("The image that was measured."),
                          QStringLiteral("file")});
        parser.addOption({{QStringLiteral("o"), QStringLiteral("output")},
                          KvCliParser::tr("The PDF file to write."),
                          QStringLiteral("file")});
        break;
    case KvCliArguments::Stats:
        addDataOptions(parser);
        parser.addOption({QStringLiteral("group-by"),
                          KvCliParser::tr("Groups: object (type and value) or measurement."),
                          QStringLiteral("grouping"), QStringLiteral("object")});
        parser.addOption(format);
        break;
    case KvCliArguments::Check:
        parser.addPositionalArgument(QStringLiteral("TEMPLATE.rtp"), KvCliParser::tr("The report template."));
        break;
    default:
        parser.addOption(format);
        break;
    }
}

// The checks below return a sentence for the user, empty when all is well.

QString takeFormat(const QCommandLineParser &parser, KvCliArguments &arguments)
{
    if (arguments.command != KvCliArguments::Stats && arguments.command != KvCliArguments::Blocks)
        return QString();
    const QString format = parser.value(QStringLiteral("format"));
    const bool hasCsv = arguments.command == KvCliArguments::Stats;
    if (format == QLatin1String("json"))
        arguments.format = KvCliArguments::Json;
    else if (format == QLatin1String("csv") && hasCsv)
        arguments.format = KvCliArguments::Csv;
    else if (format != QLatin1String("text"))
        return KvCliParser::tr("--format must be %1, not \"%2\"")
            .arg(hasCsv ? KvCliParser::tr("text, csv or json") : KvCliParser::tr("text or json"), format);
    return QString();
}

QString takeGrouping(const QCommandLineParser &parser, KvCliArguments &arguments)
{
    if (arguments.command != KvCliArguments::Stats)
        return QString();
    const QString grouping = parser.value(QStringLiteral("group-by"));
    arguments.groupByObject = grouping == QLatin1String("object");
    if (!arguments.groupByObject && grouping != QLatin1String("measurement"))
        return KvCliParser::tr("--group-by must be object or measurement, not \"%1\"").arg(grouping);
    return QString();
}

QString takeDigits(const QCommandLineParser &parser, KvCliArguments &arguments)
{
    if (!parser.isSet(QStringLiteral("digits")))
        return QString();
    bool isNumber = false;
    arguments.digits = parser.value(QStringLiteral("digits")).toUInt(&isNumber);
    if (!isNumber || arguments.digits > 15)
        return KvCliParser::tr("--digits must be a number from 0 to 15, not \"%1\"")
            .arg(parser.value(QStringLiteral("digits")));
    return QString();
}

QString takeData(const QCommandLineParser &parser, KvCliArguments &arguments)
{
    if (arguments.command != KvCliArguments::Render && arguments.command != KvCliArguments::Stats)
        return QString();
    arguments.sessionPath = parser.value(QStringLiteral("session"));
    arguments.tablePath = parser.value(QStringLiteral("table"));
    arguments.units = parser.values(QStringLiteral("unit"));
    arguments.typeColumn = parser.value(QStringLiteral("type-column"));
    arguments.nameColumn = parser.value(QStringLiteral("name-column"));
    arguments.decimalMark = parser.value(QStringLiteral("decimal"));
    if (arguments.sessionPath.isEmpty() == arguments.tablePath.isEmpty())
        return KvCliParser::tr("give the measurements: either --session or --table");
    if (!arguments.decimalMark.isEmpty() && arguments.decimalMark != QLatin1String("point") &&
        arguments.decimalMark != QLatin1String("comma"))
        return KvCliParser::tr("--decimal must be point or comma, not \"%1\"").arg(arguments.decimalMark);
    return takeDigits(parser, arguments);
}

QString takePositionals(const QCommandLineParser &parser, KvCliArguments &arguments)
{
    // The first one is the command itself.
    const QStringList words = parser.positionalArguments().mid(1);
    const bool wantsTemplate =
        arguments.command == KvCliArguments::Render || arguments.command == KvCliArguments::Check;
    const int wanted = wantsTemplate ? 1 : 0;
    if (words.size() < wanted)
        return KvCliParser::tr("the template is missing");
    if (words.size() > wanted)
        return KvCliParser::tr("unexpected argument \"%1\"").arg(words.at(wanted));
    arguments.templatePath = words.value(0);
    if (arguments.command != KvCliArguments::Render)
        return QString();
    arguments.imagePath = parser.value(QStringLiteral("image"));
    arguments.outputPath = parser.value(QStringLiteral("output"));
    if (arguments.outputPath.isEmpty())
        return KvCliParser::tr("the file to write is missing: -o OUT.pdf");
    return QString();
}

QString doubleInputFault(const KvCliArguments &arguments)
{
    const QString input = QStringLiteral("-");
    const int count = (arguments.templatePath == input ? 1 : 0) + (arguments.sessionPath == input ? 1 : 0) +
                      (arguments.tablePath == input ? 1 : 0);
    return count > 1 ? KvCliParser::tr("only one file can be read from standard input") : QString();
}

QString takeLanguage(const QCommandLineParser &parser, KvCliArguments &arguments)
{
    Q_UNUSED(arguments)
    const QString name = parser.value(QStringLiteral("language"));
    if (!parser.isSet(QStringLiteral("language")) || !KvCliLanguage::named(name).isEmpty())
        return QString();
    return KvCliParser::tr("--language must be one of %1, not \"%2\"")
        .arg(KvCliLanguage::names().join(QLatin1String(", ")), name);
}

QString takeValues(const QCommandLineParser &parser, KvCliArguments &arguments)
{
    for (const auto take : {takeLanguage, takePositionals, takeData, takeGrouping, takeFormat}) {
        const QString fault = take(parser, arguments);
        if (!fault.isEmpty())
            return fault;
    }
    return doubleInputFault(arguments);
}

// The command, unless it is missing: options that hold for every command may stand before it.
QString firstWord(const QStringList &arguments)
{
    const QStringList common{QStringLiteral("--json-errors"), QStringLiteral("-q"),
                             QStringLiteral("--quiet")};
    const QString language = QStringLiteral("--language");
    for (int i = 1; i < arguments.size(); ++i) {
        const QString &word = arguments.at(i);
        if (word == language)
            ++i; // its value
        else if (!common.contains(word) && !word.startsWith(language + QLatin1Char('=')))
            return word;
    }
    return QString();
}

} // namespace

KvCliParseResult KvCliParser::parse(const QStringList &arguments)
{
    const QString first = firstWord(arguments);
    if (first == QLatin1String("-h") || first == QLatin1String("--help"))
        return shownText(overview());
    const QString version = QStringLiteral("statreport " STATREPORT_VERSION "\n");
    if (first == QLatin1String("-v") || first == QLatin1String("--version"))
        return shownText(version);

    KvCliParseResult result;
    result.arguments.command = commandOf(first);
    result.arguments.jsonErrors = arguments.contains(QStringLiteral("--json-errors"));
    if (first.isEmpty()) {
        result.text = KvCliParser::tr("a command is missing: render, stats, check or blocks");
        return result;
    }
    if (result.arguments.command == KvCliArguments::NoCommand) {
        result.text =
            KvCliParser::tr("unknown command \"%1\"; it must be render, stats, check or blocks").arg(first);
        return result;
    }
    QCommandLineParser parser;
    addCommonOptions(parser);
    addCommandOptions(parser, result.arguments.command);
    if (!parser.parse(arguments)) {
        result.text = parser.errorText();
        return result;
    }
    if (parser.isSet(QStringLiteral("help")))
        return shownText(helpOf(parser, first));
    if (parser.isSet(QStringLiteral("version")))
        return shownText(version);
    result.arguments.quiet = parser.isSet(QStringLiteral("quiet"));
    result.text = takeValues(parser, result.arguments);
    if (result.text.isEmpty())
        result.kind = KvCliParseResult::Run;
    return result;
}
