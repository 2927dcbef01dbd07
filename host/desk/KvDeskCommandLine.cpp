// SPDX-License-Identifier: MIT
#include "KvDeskCommandLine.h"

#include "gui/QtAdvancedStylesheet.h"

#include <QCommandLineParser>

namespace {

QCommandLineOption option(const char *name, const char *valueName)
{
    return QCommandLineOption(QLatin1String(name), QString(), QLatin1String(valueName));
}

} // namespace

KvDeskCommandLine::KvDeskCommandLine(const QStringList &words)
{
    const QCommandLineOption session = option("session", "FILE");
    const QCommandLineOption image = option("image", "FILE");
    const QCommandLineOption table = option("table", "FILE");
    const QCommandLineOption theme = option("theme", "NAME");
    const QCommandLineOption plugins = option("plugins", "DIR");
    QCommandLineParser parser;
    parser.addOptions({session, image, table, theme, plugins});
    if (!parser.parse(words)) {
        m_fault = parser.errorText();
        return;
    }
    m_session = parser.value(session);
    m_image = parser.value(image);
    m_table = parser.value(table);
    m_theme = parser.value(theme);
    m_pluginFolders = parser.values(plugins);
    m_files = parser.positionalArguments();
    checkTheme();
}

void KvDeskCommandLine::checkTheme()
{
    const QStringList themes = acss::QtAdvancedStylesheet::getInstance()->themes();
    if (m_theme.isEmpty() || themes.contains(m_theme))
        return;
    for (const QString &known : themes) {
        if (m_theme.compare(known, Qt::CaseInsensitive) == 0) {
            m_theme = known;
            return;
        }
    }
    m_fault = tr("There is no theme \"%1\": use %2").arg(m_theme, themes.join(tr(" or ")));
}

QString KvDeskCommandLine::complaint() const
{
    return m_fault.isEmpty() ? m_fault : tr("%1 (measuringdesk --help tells more)").arg(m_fault);
}

QString KvDeskCommandLine::requestedText(const QStringList &words)
{
    for (const QString &word : words.mid(1)) {
        if (word == QLatin1String("--"))
            break;
        if (word == QLatin1String("--help") || word == QLatin1String("-h"))
            return helpText();
        if (word == QLatin1String("--version") || word == QLatin1String("-v"))
            return QStringLiteral("measuringdesk " STATREPORT_VERSION "\n");
    }
    return QString();
}

QString KvDeskCommandLine::helpText()
{
    return tr("Usage: measuringdesk [OPTION...] [SESSION|IMAGE|TABLE|FOLDER|VIDEO...]\n"
              "Measures objects on images and shows their values.\n"
              "\n"
              "  --session FILE      open a session\n"
              "  --image FILE        open an image\n"
              "  --table FILE        import a table of measured values\n"
              "  --theme Dark|Light  theme of this run\n"
              "  --plugins DIR       look for plug-ins here, too; can be given several times\n"
              "  --help              show this text\n"
              "  --version           show the version\n"
              "\n"
              "The environment variable STATREPORT_PLUGINS names more folders with plug-ins.\n");
}
