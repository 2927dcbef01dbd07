// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>

class QAction;
class QKeySequence;

/** The commands of the program, with texts, icons and shortcuts. Tool tips name the shortcut. */
class KvDeskActions : public QObject
{
    Q_OBJECT
public:
    enum Id {
        NewSession,
        OpenImage,
        OpenSession,
        ImportTable,
        ExportTable,
        SaveSession,
        SaveSessionAs,
        Quit,
        Undo,
        Redo,
        Cut,
        Copy,
        Paste,
        Delete,
        SelectAll,
        Rename,
        FilterValues,
        SelectTool,
        LineTool,
        PolylineTool,
        ParallelTool,
        ArcTool,
        CircleTool,
        RectangleTool,
        PolygonTool,
        CounterTool,
        NoteTool,
        ScaleBarTool,
        Calibrate,
        UseFilePixelSize,
        TakeSnapshot,
        SnapshotMeasurements,
        Freeze,
        ZoomIn,
        ZoomOut,
        ZoomFit,
        ZoomActual,
        ShowLabels,
        ShowRulers,
        ShowScaleBar,
        ShowValues,
        ShowLog,
        ShowGallery,
        ToggleTheme,
        Settings,
        Guide,
        StartPage,
        About,
        Count
    };

    /** The tool tip of a command with a shortcut. */
    static QString withShortcut(const QString &name, const QKeySequence &shortcut);

    explicit KvDeskActions(QObject *parent = nullptr);

    QAction *action(Id id) const { return m_actions[id]; }
    /** What a command does and its shortcut, whatever its action's tool tip reads at the moment. */
    QString toolTip(Id id) const;
    /** Enables or disables an action; the tool tip of one that is not possible adds the reason. */
    void setPossible(Id id, bool isPossible, const QString &reason);

private:
    QAction *m_actions[Count] = {};
};
