// SPDX-License-Identifier: MIT
#include "KvCliLanguage.h"
#include "KvCliOutput.h"
#include "KvCliParser.h"
#include "KvCliTranslation.h"
#include "KvRenderCommand.h"
#include "KvStatsCommand.h"
#include "KvTemplateCommands.h"

#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"

#include <QApplication>
#include <QHash>
#include <QProcessEnvironment>

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

int runApplication(int argc, char **argv, const QString &language, const KvCliArguments &arguments,
                   const KvCliOutput &output)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    // The same input gives the same output: no random order of keys, no settings of a user, one logical
    // resolution.
    qSetGlobalQHashSeed(0);
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
    QApplication application(argc, argv);
    const KvCliTranslation translation(arguments.isForPrograms() ? QStringLiteral("English") : language);
    // Pages are the same in every language, and messages go to files and other programs: no marks in them.
    QGuiApplication::setLayoutDirection(Qt::LeftToRight);
    acss::QtAdvancedStylesheet::substituteFonts();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtAppSettings::setProgramInfo(QStringLiteral("StatReport"), QStringLiteral(STATREPORT_VERSION),
                                  QStringLiteral(STATREPORT_VENDOR));
    const int exitCode = runCommand(arguments, output);
    // Pieces of tables are deleted later; without an event loop nothing else would do it.
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    return exitCode;
}

// Help, version or a usage error.
int answer(const KvCliParseResult &parsed, const KvCliOutput &output)
{
    if (parsed.kind == KvCliParseResult::ShowText)
        return output.result(parsed.text) ? 0 : 1;
    output.error(KvCliParser::tr("%1 (statreport --help tells more)").arg(parsed.text));
    return 2;
}

int runCommandLine(int argc, char **argv, const QStringList &words)
{
    const QString language = KvCliLanguage::chosen(words, QProcessEnvironment::systemEnvironment());
    KvCliParseResult parsed;
    KvCliOutput output;
    {
        // Translated texts take an application; for these, one without fonts will do. Help shows its name.
        int count = 1;
        char name[] = "statreport";
        char *names[] = {name, nullptr};
        const QCoreApplication application(count, names);
        const KvCliTranslation translation(language);
        parsed = KvCliParser::parse(words);
        output.setJsonErrors(parsed.arguments.jsonErrors);
        output.setQuiet(parsed.arguments.quiet);
        if (parsed.kind != KvCliParseResult::Run)
            return answer(parsed, output);
    }
    return runApplication(argc, argv, language, parsed.arguments, output);
}

} // namespace

int main(int argc, char **argv)
{
    if (!qEnvironmentVariableIsSet("STATREPORT_QT_MESSAGES"))
        qInstallMessageHandler(dropQtMessages);
    QStringList words;
    for (int i = 0; i < argc; ++i)
        words.append(QString::fromLocal8Bit(argv[i]));
    return runCommandLine(argc, argv, words);
}
