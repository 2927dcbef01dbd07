// SPDX-License-Identifier: MIT
#include "KvDeskActions.h"

#include "gui/acss.h"

#include <QAction>
#include <QCoreApplication>

namespace {

constexpr int toolIconStyle = 6;
constexpr QSize iconSize(24, 24);

struct Definition
{
    KvDeskActions::Id id;
    const char *text;
    const char *toolTip;
    const char *icon;     ///< null for none
    const char *shortcut; ///< portable; several with "; " between them
    bool isCheckable;
};

constexpr Definition definitions[] = {
    {KvDeskActions::NewSession, QT_TRANSLATE_NOOP("KvDeskActions", "&New session"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Start an empty session"), nullptr, "Ctrl+N", false},
    {KvDeskActions::OpenImage, QT_TRANSLATE_NOOP("KvDeskActions", "Open &image..."),
     QT_TRANSLATE_NOOP("KvDeskActions", "Open image"), "open-image", "Ctrl+O", false},
    {KvDeskActions::OpenSession, QT_TRANSLATE_NOOP("KvDeskActions", "&Open session..."),
     QT_TRANSLATE_NOOP("KvDeskActions", "Open session"), "open-session", "Ctrl+Shift+O", false},
    {KvDeskActions::ImportTable, QT_TRANSLATE_NOOP("KvDeskActions", "Import &table..."),
     QT_TRANSLATE_NOOP("KvDeskActions", "Import table of measured values"), "import-table", "Ctrl+I", false},
    {KvDeskActions::SaveSession, QT_TRANSLATE_NOOP("KvDeskActions", "&Save session"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Save session"), "save-session", "Ctrl+S", false},
    {KvDeskActions::SaveSessionAs, QT_TRANSLATE_NOOP("KvDeskActions", "Save session &as..."),
     QT_TRANSLATE_NOOP("KvDeskActions", "Save session to another file"), nullptr, "Ctrl+Shift+S", false},
    {KvDeskActions::Quit, QT_TRANSLATE_NOOP("KvDeskActions", "&Quit"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Quit the program"), nullptr, "Ctrl+Q", false},
    {KvDeskActions::ZoomIn, QT_TRANSLATE_NOOP("KvDeskActions", "Zoom &in"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Zoom in"), "zoom-in", "Ctrl++; Ctrl+=", false},
    {KvDeskActions::ZoomOut, QT_TRANSLATE_NOOP("KvDeskActions", "Zoom &out"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Zoom out"), "zoom-out", "Ctrl+-", false},
    {KvDeskActions::ZoomFit, QT_TRANSLATE_NOOP("KvDeskActions", "&Fit to window"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Show the whole image"), "zoom-fit", "Ctrl+0", false},
    {KvDeskActions::ZoomActual, QT_TRANSLATE_NOOP("KvDeskActions", "&Actual size"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Show the image at 100 %"), "zoom-100", "Ctrl+1", false},
    {KvDeskActions::ShowValues, QT_TRANSLATE_NOOP("KvDeskActions", "&Measured values"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Show or hide the measured values"), "table", "F6", true},
    {KvDeskActions::ShowLog, QT_TRANSLATE_NOOP("KvDeskActions", "Status &log"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Show or hide the status log"), "log", "F7", true},
    {KvDeskActions::ToggleTheme, QT_TRANSLATE_NOOP("KvDeskActions", "&Dark or light theme"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Change between the dark and the light theme"), "theme", "F8", false},
    {KvDeskActions::Settings, QT_TRANSLATE_NOOP("KvDeskActions", "S&ettings..."),
     QT_TRANSLATE_NOOP("KvDeskActions", "Settings"), "settings", "Ctrl+,", false},
    {KvDeskActions::About, QT_TRANSLATE_NOOP("KvDeskActions", "&About Measuring Desk"),
     QT_TRANSLATE_NOOP("KvDeskActions", "About Measuring Desk"), "about", nullptr, false},
};

QString toolTip(const Definition &definition, const QAction &action)
{
    const QString name = KvDeskActions::tr(definition.toolTip);
    const QString keys = action.shortcut().toString(QKeySequence::NativeText);
    return keys.isEmpty() ? name : KvDeskActions::tr("%1 (%2)", "command (shortcut)").arg(name, keys);
}

QAction *createAction(const Definition &definition, QObject *parent)
{
    auto *const action = new QAction(KvDeskActions::tr(definition.text), parent);
    if (definition.icon)
        action->setIcon(acss::createIcon(
            toolIconStyle, QStringLiteral("Icons/") + QLatin1String(definition.icon), iconSize));
    if (definition.shortcut)
        action->setShortcuts(QKeySequence::listFromString(QLatin1String(definition.shortcut)));
    action->setToolTip(toolTip(definition, *action));
    action->setCheckable(definition.isCheckable);
    return action;
}

} // namespace

KvDeskActions::KvDeskActions(QObject *parent)
    : QObject(parent)
{
    for (const Definition &definition : definitions)
        m_actions[definition.id] = createAction(definition, this);
    action(Quit)->setMenuRole(QAction::QuitRole);
    action(Settings)->setMenuRole(QAction::PreferencesRole);
    action(About)->setMenuRole(QAction::AboutRole);
}
