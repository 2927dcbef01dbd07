// SPDX-License-Identifier: MIT
#include "KvCliOutput.h"
#include "KvCliParser.h"
#include "KvRenderCommand.h"
#include "KvStatsCommand.h"
#include "KvTemplateCommands.h"

#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"

#include <QApplication>
#include <QHash>

#include <cstdio>

namespace {

// Qt's own remarks (a missing run-time directory, say) mean nothing to the user of a command-line tool.
void dropQtMessages(QtMsgType type, const QMessageLogContext &context, const QString &message)
{
    Q_UNUSED(context)
    if (type == QtFatalMsg)
        std::fprintf(stderr, "statreport: %s\n", qPrintable(message));
}

int runCommand(const KvCliArguments &arguments, const KvCliOutput &output)
{
    switch (arguments.command) {
    case KvCliArguments::Render:
        return KvRenderCommand(arguments, output).run();
    case KvCliArguments::Stats:
        return KvStatsCommand(arguments, output).run();
    case KvCliArguments::Check:
        return KvTemplateCommands::check(arguments, output);
    default:
        return KvTemplateCommands::blocks(arguments, output);
    }
}

int runApplication(int argc, char **argv, const KvCliArguments &arguments, const KvCliOutput &output)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    // The same input gives the same output: no random order of keys, no settings of a user, one logical
    // resolution.
    qSetGlobalQHashSeed(0);
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
    QApplication application(argc, argv);
    acss::QtAdvancedStylesheet::substituteFonts();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtAppSettings::setProgramInfo(QStringLiteral("StatReport"), QStringLiteral(STATREPORT_VERSION),
                                  QStringLiteral("The StatReport authors"));
    const int exitCode = runCommand(arguments, output);
    // Pieces of tables are deleted later; without an event loop nothing else would do it.
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    return exitCode;
}

} // namespace

int main(int argc, char **argv)
{
    if (!qEnvironmentVariableIsSet("STATREPORT_QT_MESSAGES"))
        qInstallMessageHandler(dropQtMessages);
    QStringList words;
    for (int i = 0; i < argc; ++i)
        words.append(QString::fromLocal8Bit(argv[i]));
    const KvCliParseResult parsed = KvCliParser::parse(words);
    KvCliOutput output;
    output.setJsonErrors(parsed.arguments.jsonErrors);
    output.setQuiet(parsed.arguments.quiet);
    if (parsed.kind == KvCliParseResult::ShowText) {
        return output.result(parsed.text) ? 0 : 1;
    }
    if (parsed.kind == KvCliParseResult::UsageError) {
        output.error(parsed.text + QStringLiteral(" (statreport --help tells more)"));
        return 2;
    }
    return runApplication(argc, argv, parsed.arguments, output);
}
