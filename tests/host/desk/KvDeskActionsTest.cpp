// SPDX-License-Identifier: MIT
#include "KvDeskActions.h"

#include "KvDeskResources.h"
#include "common/ZtAppStatus.h"
#include "support/StatReportTest.h"

#include <QAction>

class KvDeskActionsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();
    void commands_data();
    void commands();
    void noShortcutIsUsedTwice();
    void allIconsAreThere();
};

void KvDeskActionsTest::initTestCase()
{
    KvDeskResources::ensure();
}

void KvDeskActionsTest::commands_data()
{
    QTest::addColumn<int>("id");
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("toolTip");
    QTest::addColumn<bool>("hasIcon");
    QTest::addColumn<bool>("isCheckable");
    const auto row = [](KvDeskActions::Id id, const char *text, const char *toolTip, bool hasIcon = true,
                        bool isCheckable = false) {
        QTest::newRow(text) << static_cast<int>(id) << QString::fromLatin1(text)
                            << QString::fromLatin1(toolTip) << hasIcon << isCheckable;
    };
    using A = KvDeskActions;
    row(A::NewSession, "&New session", "Start an empty session (Ctrl+N)", false);
    row(A::OpenImage, "Open &image...", "Open image (Ctrl+O)");
    row(A::OpenSession, "&Open session...", "Open session (Ctrl+Shift+O)");
    row(A::ImportTable, "Import &table...", "Import table of measured values (Ctrl+I)");
    row(A::ExportTable, "&Export measured values...", "Export measured values as a table (Ctrl+E)");
    row(A::FilterValues, "&Find measured values", "Filter the measured values (Ctrl+F)", false);
    row(A::SaveSession, "&Save session", "Save session (Ctrl+S)");
    row(A::SaveSessionAs, "Save session &as...", "Save session to another file (Ctrl+Shift+S)", false);
    row(A::Quit, "&Quit", "Quit the program (Ctrl+Q)", false);
    row(A::Undo, "&Undo", "Undo the last step (Ctrl+Z)", true, false);
    row(A::Redo, "&Redo", "Redo what was undone (Ctrl+Shift+Z)", true, false);
    row(A::Cut, "Cu&t", "Cut the selected objects (Ctrl+X)", true, false);
    row(A::Copy, "&Copy", "Copy the selected objects (Ctrl+C)", true, false);
    row(A::Paste, "&Paste", "Paste copied objects (Ctrl+V)", true, false);
    row(A::Delete, "&Delete", "Delete the selected objects (Del)", true, false);
    row(A::SelectAll, "Select &all", "Select all objects on the image (Ctrl+A)", false, false);
    row(A::Rename, "Re&name", "Give the selected object a name (F2)", true, false);
    row(A::SelectTool, "&Select", "Select and change objects (V)", true, true);
    row(A::LineTool, "&Line", "Measure a length (L)", true, true);
    row(A::PolylineTool, "&Polyline", "Measure the length of a way (P)", true, true);
    row(A::ParallelTool, "Parallel &distance", "Measure the distance of a point from a line (D)", true, true);
    row(A::ArcTool, "&Arc", "Measure an arc through three points (A)", true, true);
    row(A::CircleTool, "&Circle", "Measure a circle (C)", true, true);
    row(A::RectangleTool, "&Rectangle", "Measure a rectangle (R)", true, true);
    row(A::PolygonTool, "Poly&gon", "Measure the area of a polygon (G)", true, true);
    row(A::CounterTool, "Cou&nter", "Count by clicks (N)", true, true);
    row(A::NoteTool, "&Text note", "Write on the image (T)", true, true);
    row(A::ScaleBarTool, "Scale &bar", "Draw a scale bar (B)", true, true);
    row(A::Calibrate, "Cal&ibration...", "Say how large a pixel of the image is (Ctrl+K)");
    row(A::UseFilePixelSize, "Use the file's pixel size",
        "Measure with the pixel size that the image's file states", false);
    row(A::TakeSnapshot, "&Take snapshot", "Save the image to the gallery (F9)");
    row(A::SnapshotMeasurements, "Snapshots &with measurements",
        "Draw the measured objects on snapshots (Shift+F9)", true, true);
    row(A::Freeze, "&Freeze", "Freeze the live image (F12)", true, true);
    row(A::ZoomIn, "Zoom &in", "Zoom in (Ctrl++)");
    row(A::ZoomOut, "Zoom &out", "Zoom out (Ctrl+-)");
    row(A::ZoomFit, "&Fit to window", "Show the whole image (Ctrl+0)");
    row(A::ZoomActual, "&Actual size", "Show the image at 100 % (Ctrl+1)");
    row(A::ShowLabels, "&Labels on the image", "Show or hide the labels of objects (F4)", true, true);
    row(A::ShowRulers, "&Rulers", "Show or hide the rulers (Shift+F4)", true, true);
    row(A::ShowScaleBar, "&Scale bar on the image", "Show or hide the scale bar, on reports, too (Shift+B)",
        true, true);
    row(A::ShowValues, "&Measured values", "Show or hide the measured values (F6)", true, true);
    row(A::ShowLog, "Stat&us log", "Show or hide the status log (F7)", true, true);
    row(A::ShowGallery, "&Gallery", "Show or hide the gallery (F5)", true, true);
    row(A::ToggleTheme, "&Dark or light theme", "Change between the dark and the light theme (F8)");
    row(A::Settings, "Settin&gs...", "Settings (Ctrl+,)");
    row(A::Guide, "&User guide", "Read the user guide (F1)", false);
    row(A::StartPage, "&Start page", "Show the first steps, the examples and the recent sessions", false);
    row(A::About, "&About Measuring Desk", "About Measuring Desk");
}

void KvDeskActionsTest::commands()
{
    QFETCH(int, id);
    QFETCH(QString, text);
    QFETCH(QString, toolTip);
    QFETCH(bool, hasIcon);
    QFETCH(bool, isCheckable);
    const KvDeskActions actions;
    const QAction *const action = actions.action(static_cast<KvDeskActions::Id>(id));
    QCOMPARE(action->text(), text);
    QCOMPARE(action->toolTip(), toolTip);
    QCOMPARE(action->icon().isNull(), !hasIcon);
    QCOMPARE(action->isCheckable(), isCheckable);
}

void KvDeskActionsTest::noShortcutIsUsedTwice()
{
    const KvDeskActions actions;
    QStringList keys;
    for (int id = 0; id < KvDeskActions::Count; ++id) {
        for (const QKeySequence &sequence : actions.action(static_cast<KvDeskActions::Id>(id))->shortcuts())
            keys.append(sequence.toString());
    }
    QVERIFY(keys.contains(QStringLiteral("Ctrl+=")));
    QCOMPARE(keys.removeDuplicates(), 0);
}

void KvDeskActionsTest::allIconsAreThere()
{
    const KvDeskActions actions;
    // A missing icon is reported there.
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 0);
}

STATREPORT_TEST_MAIN(KvDeskActionsTest)
#include "KvDeskActionsTest.moc"
