// SPDX-License-Identifier: MIT
#include "KvDeskActions.h"

#include "gui/acss.h"
#include "kernel/ZtLeftToRight.h"

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
    {KvDeskActions::ExportTable, QT_TRANSLATE_NOOP("KvDeskActions", "&Export measured values..."),
     QT_TRANSLATE_NOOP("KvDeskActions", "Export measured values as a table"), "export-table", "Ctrl+E",
     false},
    {KvDeskActions::SaveSession, QT_TRANSLATE_NOOP("KvDeskActions", "&Save session"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Save session"), "save-session", "Ctrl+S", false},
    {KvDeskActions::SaveSessionAs, QT_TRANSLATE_NOOP("KvDeskActions", "Save session &as..."),
     QT_TRANSLATE_NOOP("KvDeskActions", "Save session to another file"), nullptr, "Ctrl+Shift+S", false},
    {KvDeskActions::Quit, QT_TRANSLATE_NOOP("KvDeskActions", "&Quit"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Quit the program"), nullptr, "Ctrl+Q", false},
    {KvDeskActions::Undo, QT_TRANSLATE_NOOP("KvDeskActions", "&Undo"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Undo the last step"), "undo", "Ctrl+Z", false},
    {KvDeskActions::Redo, QT_TRANSLATE_NOOP("KvDeskActions", "&Redo"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Redo what was undone"), "redo", "Ctrl+Shift+Z; Ctrl+Y", false},
    {KvDeskActions::Cut, QT_TRANSLATE_NOOP("KvDeskActions", "Cu&t"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Cut the selected objects"), "cut", "Ctrl+X", false},
    {KvDeskActions::Copy, QT_TRANSLATE_NOOP("KvDeskActions", "&Copy"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Copy the selected objects"), "copy", "Ctrl+C", false},
    {KvDeskActions::Paste, QT_TRANSLATE_NOOP("KvDeskActions", "&Paste"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Paste copied objects"), "paste", "Ctrl+V", false},
    {KvDeskActions::Delete, QT_TRANSLATE_NOOP("KvDeskActions", "&Delete"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Delete the selected objects"), "delete", "Del", false},
    {KvDeskActions::SelectAll, QT_TRANSLATE_NOOP("KvDeskActions", "Select &all"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Select all objects on the image"), nullptr, "Ctrl+A", false},
    {KvDeskActions::Rename, QT_TRANSLATE_NOOP("KvDeskActions", "Re&name"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Give the selected object a name"), "rename", "F2", false},
    {KvDeskActions::FilterValues, QT_TRANSLATE_NOOP("KvDeskActions", "&Find measured values"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Filter the measured values"), nullptr, "Ctrl+F", false},
    {KvDeskActions::SelectTool, QT_TRANSLATE_NOOP("KvDeskActions", "&Select"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Select and change objects"), "tool-select", "V", true},
    {KvDeskActions::LineTool, QT_TRANSLATE_NOOP("KvDeskActions", "&Line"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Measure a length"), "tool-line", "L", true},
    {KvDeskActions::PolylineTool, QT_TRANSLATE_NOOP("KvDeskActions", "&Polyline"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Measure the length of a way"), "tool-polyline", "P", true},
    {KvDeskActions::ParallelTool, QT_TRANSLATE_NOOP("KvDeskActions", "Parallel &distance"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Measure the distance of a point from a line"), "tool-parallel", "D",
     true},
    {KvDeskActions::ArcTool, QT_TRANSLATE_NOOP("KvDeskActions", "&Arc"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Measure an arc through three points"), "tool-arc", "A", true},
    {KvDeskActions::CircleTool, QT_TRANSLATE_NOOP("KvDeskActions", "&Circle"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Measure a circle"), "tool-circle", "C", true},
    {KvDeskActions::RectangleTool, QT_TRANSLATE_NOOP("KvDeskActions", "&Rectangle"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Measure a rectangle"), "tool-rectangle", "R", true},
    {KvDeskActions::PolygonTool, QT_TRANSLATE_NOOP("KvDeskActions", "Poly&gon"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Measure the area of a polygon"), "tool-polygon", "G", true},
    {KvDeskActions::CounterTool, QT_TRANSLATE_NOOP("KvDeskActions", "Cou&nter"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Count by clicks"), "tool-counter", "N", true},
    {KvDeskActions::NoteTool, QT_TRANSLATE_NOOP("KvDeskActions", "&Text note"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Write on the image"), "tool-note", "T", true},
    {KvDeskActions::ScaleBarTool, QT_TRANSLATE_NOOP("KvDeskActions", "Scale &bar"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Draw a scale bar"), "tool-scale-bar", "B", true},
    {KvDeskActions::Calibrate, QT_TRANSLATE_NOOP("KvDeskActions", "Cal&ibration..."),
     QT_TRANSLATE_NOOP("KvDeskActions", "Say how large a pixel of the image is"), "calibration", "Ctrl+K",
     false},
    {KvDeskActions::UseFilePixelSize, QT_TRANSLATE_NOOP("KvDeskActions", "Use the file's pixel size"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Measure with the pixel size that the image's file states"), nullptr,
     nullptr, false},
    {KvDeskActions::TakeSnapshot, QT_TRANSLATE_NOOP("KvDeskActions", "&Take snapshot"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Save the image to the gallery"), "snapshot", "F9", false},
    {KvDeskActions::SnapshotMeasurements, QT_TRANSLATE_NOOP("KvDeskActions", "Snapshots &with measurements"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Draw the measured objects on snapshots"), "labels", "Shift+F9",
     true},
    {KvDeskActions::Freeze, QT_TRANSLATE_NOOP("KvDeskActions", "&Freeze"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Freeze the live image"), "freeze", "F12", true},
    {KvDeskActions::ZoomIn, QT_TRANSLATE_NOOP("KvDeskActions", "Zoom &in"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Zoom in"), "zoom-in", "Ctrl++; Ctrl+=", false},
    {KvDeskActions::ZoomOut, QT_TRANSLATE_NOOP("KvDeskActions", "Zoom &out"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Zoom out"), "zoom-out", "Ctrl+-", false},
    {KvDeskActions::ZoomFit, QT_TRANSLATE_NOOP("KvDeskActions", "&Fit to window"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Show the whole image"), "zoom-fit", "Ctrl+0", false},
    {KvDeskActions::ZoomActual, QT_TRANSLATE_NOOP("KvDeskActions", "&Actual size"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Show the image at 100 %"), "zoom-100", "Ctrl+1", false},
    {KvDeskActions::ShowLabels, QT_TRANSLATE_NOOP("KvDeskActions", "&Labels on the image"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Show or hide the labels of objects"), "labels", "F4", true},
    {KvDeskActions::ShowRulers, QT_TRANSLATE_NOOP("KvDeskActions", "&Rulers"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Show or hide the rulers"), "rulers", "Shift+F4", true},
    {KvDeskActions::ShowScaleBar, QT_TRANSLATE_NOOP("KvDeskActions", "&Scale bar on the image"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Show or hide the scale bar, on reports, too"), "scale-bar",
     "Shift+B", true},
    {KvDeskActions::ShowValues, QT_TRANSLATE_NOOP("KvDeskActions", "&Measured values"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Show or hide the measured values"), "table", "F6", true},
    {KvDeskActions::ShowLog, QT_TRANSLATE_NOOP("KvDeskActions", "Stat&us log"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Show or hide the status log"), "log", "F7", true},
    {KvDeskActions::ShowGallery, QT_TRANSLATE_NOOP("KvDeskActions", "&Gallery"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Show or hide the gallery"), "gallery", "F5", true},
    {KvDeskActions::ToggleTheme, QT_TRANSLATE_NOOP("KvDeskActions", "&Dark or light theme"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Change between the dark and the light theme"), "theme", "F8", false},
    {KvDeskActions::Settings, QT_TRANSLATE_NOOP("KvDeskActions", "Settin&gs..."),
     QT_TRANSLATE_NOOP("KvDeskActions", "Settings"), "settings", "Ctrl+,", false},
    {KvDeskActions::Guide, QT_TRANSLATE_NOOP("KvDeskActions", "&User guide"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Read the user guide"), nullptr, "F1", false},
    {KvDeskActions::StartPage, QT_TRANSLATE_NOOP("KvDeskActions", "&Start page"),
     QT_TRANSLATE_NOOP("KvDeskActions", "Show the first steps, the examples and the recent sessions"),
     nullptr, nullptr, false},
    {KvDeskActions::About, QT_TRANSLATE_NOOP("KvDeskActions", "&About Measuring Desk"),
     QT_TRANSLATE_NOOP("KvDeskActions", "About Measuring Desk"), "about", nullptr, false},
};

QString toolTip(const Definition &definition, const QAction &action)
{
    return KvDeskActions::withShortcut(KvDeskActions::tr(definition.toolTip), action.shortcut());
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

QString KvDeskActions::withShortcut(const QString &name, const QKeySequence &shortcut)
{
    const QString keys = shortcut.toString(QKeySequence::NativeText);
    return keys.isEmpty() ? name
                          : tr("%1 (%2)", "command (shortcut)").arg(name, ZtLeftToRight::isolated(keys));
}

QString KvDeskActions::toolTip(Id id) const
{
    for (const Definition &definition : definitions) {
        if (definition.id == id)
            return ::toolTip(definition, *action(id));
    }
    return QString();
}

void KvDeskActions::setPossible(Id id, bool isPossible, const QString &reason)
{
    action(id)->setEnabled(isPossible);
    action(id)->setToolTip(isPossible ? toolTip(id) : toolTip(id) + QLatin1Char('\n') + reason);
}
