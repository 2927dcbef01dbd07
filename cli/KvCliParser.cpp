// SPDX-License-Identifier: MIT
#include "KvCliParser.h"

#include <QCommandLineParser>
#include <QCoreApplication>

#include <memory>

namespace {

const char kOverview[] =
    "Usage: statreport COMMAND [options]\n"
    "Turns measurements and a report template into a PDF report, without a display.\n"
    "\n"
    "Commands:\n"
    "  render TEMPLATE.rtp (--session S | --table T) [--image I] -o OUT.pdf\n"
    "                        prints a report\n"
    "  stats (--session S | --table T) [--group-by object|measurement]\n"
    "        [--format text|csv|json]\n"
    "                        prints the statistics of every measured value\n"
    "  check TEMPLATE.rtp    says what a template holds and what would be skipped or refused\n"
    "  blocks [--format text|json]\n"
    "                        lists the block types and their settings with defaults\n"
    "\n"
    "Options everywhere:\n"
    "  -h, --help            this text, or that of a command\n"
    "  -v, --version         the version\n"
    "  --json-errors         errors as one line of JSON each\n"
    "\n"
    "\"-\" as a file name is standard input or output. Exit codes: 0 done, 1 the work failed,\n"
    "2 wrong usage.\n";

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

// The parser asks the application for the program's name, and the command line is read before there is one.
QString helpOf(const QCommandLineParser &parser, const QString &command)
{
    int count = 1;
    char name[] = "statreport";
    char *words[] = {name, nullptr};
    std::unique_ptr<QCoreApplication> application;
    if (!QCoreApplication::instance())
        application = std::make_unique<QCoreApplication>(count, words);
    // The options come behind the command.
    QString text = parser.helpText();
    return text.replace(QStringLiteral(" [options] ") + command,
                        QLatin1Char(' ') + command + QStringLiteral(" [options]"));
}

void addCommonOptions(QCommandLineParser &parser)
{
    parser.addOption({{QStringLiteral("h"), QStringLiteral("help")}, QStringLiteral("Shows this text.")});
    parser.addOption(
        {{QStringLiteral("v"), QStringLiteral("version")}, QStringLiteral("Shows the version.")});
    parser.addOption(
        {QStringLiteral("json-errors"), QStringLiteral("Writes errors as one line of JSON each.")});
    parser.addOption(
        {{QStringLiteral("q"), QStringLiteral("quiet")}, QStringLiteral("Writes no notes and no progress.")});
}

void addDataOptions(QCommandLineParser &parser)
{
    const QString file = QStringLiteral("file");
    const QString column = QStringLiteral("column");
    parser.addOption(
        {QStringLiteral("session"), QStringLiteral("Measurements: a session of the Measuring Desk."), file});
    parser.addOption(
        {QStringLiteral("table"), QStringLiteral("Measurements: a table (CSV, TSV, ImageJ results)."), file});
    parser.addOption(
        {QStringLiteral("unit"),
         QStringLiteral(
             "Unit of the table's values that state none, or Name=unit for one value. May be given "
             "several times."),
         QStringLiteral("unit")});
    parser.addOption(
        {QStringLiteral("type-column"), QStringLiteral("The table's column with the object types."), column});
    parser.addOption(
        {QStringLiteral("name-column"), QStringLiteral("The table's column with the object names."), column});
    parser.addOption({QStringLiteral("decimal"), QStringLiteral("Decimal mark of the table: point or comma."),
                      QStringLiteral("mark")});
    parser.addOption({QStringLiteral("digits"),
                      QStringLiteral("Significant digits of measured values; 0 is automatic."),
                      QStringLiteral("count")});
}

void addCommandOptions(QCommandLineParser &parser, KvCliArguments::Command command)
{
    const QCommandLineOption format(QStringLiteral("format"),
                                    command == KvCliArguments::Stats
                                        ? QStringLiteral("Output: text, csv or json.")
                                        : QStringLiteral("Output: text or json."),
                                    QStringLiteral("format"), QStringLiteral("text"));
    switch (command) {
    case KvCliArguments::Render:
        parser.setApplicationDescription(
            QStringLiteral("Prints a report: template and measurements in, PDF out."));
        parser.addPositionalArgument(QStringLiteral("TEMPLATE.rtp"), QStringLiteral("The report template."));
        addDataOptions(parser);
        parser.addOption({QStringLiteral("image"), QStringLiteral("The image that was measured."),
                          QStringLiteral("file")});
        parser.addOption({{QStringLiteral("o"), QStringLiteral("output")},
                          QStringLiteral("The PDF file to write."),
                          QStringLiteral("file")});
        break;
    case KvCliArguments::Stats:
        parser.setApplicationDescription(
            QStringLiteral("Prints the statistics of every measured value, in the table's "
                           "own units."));
        addDataOptions(parser);
        parser.addOption({QStringLiteral("group-by"),
                          QStringLiteral("Groups: object (type and value) or measurement."),
                          QStringLiteral("grouping"), QStringLiteral("object")});
        parser.addOption(format);
        break;
    case KvCliArguments::Check:
        parser.setApplicationDescription(
            QStringLiteral("Says what a template holds and what would be skipped or "
                           "refused."));
        parser.addPositionalArgument(QStringLiteral("TEMPLATE.rtp"), QStringLiteral("The report template."));
        break;
    default:
        parser.setApplicationDescription(
            QStringLiteral("Lists the block types and their settings with defaults."));
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
        return QStringLiteral("--format must be %1, not \"%2\"")
            .arg(hasCsv ? QStringLiteral("text, csv or json") : QStringLiteral("text or json"), format);
    return QString();
}

QString takeGrouping(const QCommandLineParser &parser, KvCliArguments &arguments)
{
    if (arguments.command != KvCliArguments::Stats)
        return QString();
    const QString grouping = parser.value(QStringLiteral("group-by"));
    arguments.groupByObject = grouping == QLatin1String("object");
    if (!arguments.groupByObject && grouping != QLatin1String("measurement"))
        return QStringLiteral("--group-by must be object or measurement, not \"%1\"").arg(grouping);
    return QString();
}

QString takeDigits(const QCommandLineParser &parser, KvCliArguments &arguments)
{
    if (!parser.isSet(QStringLiteral("digits")))
        return QString();
    bool isNumber = false;
    arguments.digits = parser.value(QStringLiteral("digits")).toUInt(&isNumber);
    if (!isNumber || arguments.digits > 15)
        return QStringLiteral("--digits must be a number from 0 to 15, not \"%1\"")
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
        return QStringLiteral("give the measurements: either --session or --table");
    if (!arguments.decimalMark.isEmpty() && arguments.decimalMark != QLatin1String("point") &&
        arguments.decimalMark != QLatin1String("comma"))
        return QStringLiteral("--decimal must be point or comma, not \"%1\"").arg(arguments.decimalMark);
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
        return QStringLiteral("the template is missing");
    if (words.size() > wanted)
        return QStringLiteral("unexpected argument \"%1\"").arg(words.at(wanted));
    arguments.templatePath = words.value(0);
    if (arguments.command != KvCliArguments::Render)
        return QString();
    arguments.imagePath = parser.value(QStringLiteral("image"));
    arguments.outputPath = parser.value(QStringLiteral("output"));
    if (arguments.outputPath.isEmpty())
        return QStringLiteral("the file to write is missing: -o OUT.pdf");
    return QString();
}

QString doubleInputFault(const KvCliArguments &arguments)
{
    const QString input = QStringLiteral("-");
    const int count = (arguments.templatePath == input ? 1 : 0) + (arguments.sessionPath == input ? 1 : 0) +
                      (arguments.tablePath == input ? 1 : 0);
    return count > 1 ? QStringLiteral("only one file can be read from standard input") : QString();
}

QString takeValues(const QCommandLineParser &parser, KvCliArguments &arguments)
{
    for (const auto take : {takePositionals, takeData, takeGrouping, takeFormat}) {
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
    for (const QString &word : arguments.mid(1)) {
        if (!common.contains(word))
            return word;
    }
    return QString();
}

} // namespace

KvCliParseResult KvCliParser::parse(const QStringList &arguments)
{
    const QString first = firstWord(arguments);
    if (first == QLatin1String("-h") || first == QLatin1String("--help"))
        return shownText(QLatin1String(kOverview));
    const QString version = QStringLiteral("statreport " STATREPORT_VERSION "\n");
    if (first == QLatin1String("-v") || first == QLatin1String("--version"))
        return shownText(version);

    KvCliParseResult result;
    result.arguments.command = commandOf(first);
    result.arguments.jsonErrors = arguments.contains(QStringLiteral("--json-errors"));
    if (first.isEmpty()) {
        result.text = QStringLiteral("a command is missing: render, stats, check or blocks");
        return result;
    }
    if (result.arguments.command == KvCliArguments::NoCommand) {
        result.text =
            QStringLiteral("unknown command \"%1\"; it must be render, stats, check or blocks").arg(first);
        return result;
    }
    QCommandLineParser parser;
    parser.addPositionalArgument(first, QString(), first);
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
