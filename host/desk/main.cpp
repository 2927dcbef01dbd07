// SPDX-License-Identifier: MIT
#include "KvDeskCommandLine.h"
#include "KvDeskFileCommands.h"
#include "KvDeskFirstTemplates.h"
#include "KvDeskLanguages.h"
#include "KvDeskMainWindow.h"
#include "KvDeskPlugins.h"
#include "KvDeskRecoveryFile.h"
#include "KvDeskResources.h"
#include "KvDeskTheme.h"
#include "KvDeskTranslation.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QApplication>
#include <QTranslator>

#include <cstdio>

namespace {

constexpr int usageError = 2;

void setAttributes()
{
    // Reports are laid out alike whatever the screen's resolution.
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
    QCoreApplication::setAttribute(Qt::AA_EnableHighDpiScaling);
    QCoreApplication::setAttribute(Qt::AA_UseHighDpiPixmaps);
}

QStringList wordsOf(int argc, char **argv)
{
    QStringList words;
    for (int i = 0; i < argc; ++i)
        words.append(QString::fromLocal8Bit(argv[i]));
    return words;
}

void openFiles(const KvDeskCommandLine &commandLine, KvDeskMainWindow *window)
{
    KvDeskFileCommands *const files = window->files();
    if (!commandLine.session().isEmpty())
        files->openSession(commandLine.session());
    if (!commandLine.image().isEmpty())
        files->openImage(commandLine.image());
    if (!commandLine.table().isEmpty())
        files->importTable(commandLine.table());
    for (const QString &file : commandLine.files())
        window->openPath(file);
}

void setProgramInfo()
{
    ZtAppSettings::setProgramInfo(QStringLiteral("Measuring Desk"), QStringLiteral(STATREPORT_VERSION),
                                  QStringLiteral(STATREPORT_VENDOR));
}

// Without a display.
int printRequestedText(int argc, char **argv, const QStringList &words)
{
    const QCoreApplication application(argc, argv);
    setProgramInfo();
    QTranslator translator;
    if (translator.load(QStringLiteral(":/measuringdesk/%1.qm").arg(KvDeskLanguages::effectiveName())))
        QCoreApplication::installTranslator(&translator);
    std::fputs(qPrintable(KvDeskCommandLine::requestedText(words)), stdout);
    return 0;
}

int run(const KvDeskCommandLine &commandLine)
{
    KvDeskTheme::apply(commandLine.theme().isEmpty() ? KvDeskTheme::stored() : commandLine.theme());
    // At the end these go in the opposite order: plug-ins own windows that belong to the main window.
    ZtMeasuringDocument document;
    KvDeskMainWindow window(&document);
    KvDeskFirstTemplates::offer(QCoreApplication::applicationDirPath() + QStringLiteral("/Templates"));
    KvDeskPlugins plugins(&window);
    plugins.load(KvDeskPlugins::folders(commandLine.pluginFolders()));
    window.restoreTools();
    QObject::connect(&window, SIGNAL(signalClosed()), qApp, SLOT(quit()));
    window.startRecovery(KvDeskRecoveryFile::standardFolder());
    window.show();
    openFiles(commandLine, &window);
    return QApplication::exec();
}

} // namespace

int main(int argc, char **argv)
{
    // Before the application takes those that it knows, of which "--session" is one of ours.
    const QStringList words = wordsOf(argc, argv);
    if (!KvDeskCommandLine::requestedText(words).isEmpty())
        return printRequestedText(argc, argv, words);
    setAttributes();
    const QApplication application(argc, argv);
    setProgramInfo();
    QGuiApplication::setDesktopFileName(QStringLiteral("org.statreport.measuringdesk"));
    KvDeskResources::ensure();
    const KvDeskTranslation translation(KvDeskLanguages::effectiveName());
    const KvDeskCommandLine commandLine(words);
    if (!commandLine.fault().isEmpty()) {
        std::fprintf(stderr, "measuringdesk: %s\n", qPrintable(commandLine.complaint()));
        return usageError;
    }
    return run(commandLine);
}
