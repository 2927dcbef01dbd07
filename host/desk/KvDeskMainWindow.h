// SPDX-License-Identifier: MIT
#pragma once

#include "common/ZtAppStatus.h"
#include "gui/KvGuiMainWindowBase.h"

#include <memory>

class KvDeskActions;
class KvDeskAutosave;
class KvDeskCalibrationCommands;
class KvDeskEditCommands;
class KvDeskFileCommands;
class KvDeskGallery;
class KvDeskImageView;
class KvDeskLiveBar;
class KvDeskObjectEditor;
class KvDeskRecovery;
class KvDeskRecoveryBar;
class KvDeskSelection;
class KvDeskSession;
class KvDeskSnapshots;
class KvDeskSourceCommands;
class KvDeskSourceMenu;
class KvDeskStartPage;
class KvDeskStatusBar;
class KvDeskStatusLog;
class KvDeskToolBox;
class KvDeskToolColumn;
class KvDeskToolStrip;
class KvDeskValueTable;
class QMenu;
class QSplitter;
class QToolButton;
class ZtMeasuringDocument;

/**
 * Main window: tools at the left, the image in the middle, measured values at the right, the status log at
 * the bottom.
 *
 * When the user closes it and nothing holds it back, ZtSignalCenter announces the end of the program, once;
 * then signalClosed() says that the window may be deleted, plug-ins first.
 */
class KvDeskMainWindow : public KvGuiMainWindowBase
{
    Q_OBJECT
public:
    /** \a document has to outlive the window. */
    explicit KvDeskMainWindow(ZtMeasuringDocument *document, QWidget *parent = nullptr);
    ~KvDeskMainWindow() override;

    KvDeskActions *actions() const { return m_actions; }
    KvDeskSession *session() const { return m_session; }
    KvDeskSelection *selection() const { return m_selection; }
    KvDeskObjectEditor *objectEditor() const { return m_objectEditor; }
    KvDeskFileCommands *files() const { return m_files; }
    KvDeskImageView *imageView() const { return m_imageView; }
    KvDeskCalibrationCommands *calibrationCommands() const { return m_calibrationCommands; }
    KvDeskValueTable *valueTable() const { return m_valueTable; }
    KvDeskGallery *gallery() const { return m_gallery; }
    KvDeskLiveBar *liveBar() const { return m_liveBar; }
    KvDeskSourceMenu *sourceMenu() const { return m_sourceMenu; }
    KvDeskSourceCommands *sources() const { return m_sources; }
    KvDeskSnapshots *snapshots() const { return m_snapshots; }
    KvDeskStartPage *startPage() const { return m_startPage; }
    KvDeskStatusLog *statusLog() const { return m_statusLog; }
    KvDeskToolBox *toolBox() const { return m_toolBox; }
    KvDeskToolColumn *toolColumn() const { return m_toolColumn; }
    KvDeskStatusBar *deskStatusBar() const { return m_statusBar; }
    QMenu *recentMenu() const { return m_recentMenu; }

    /** Opens a file, a folder or a video as if it was dropped, and says so when it cannot be opened. */
    void openPath(const QString &path);

    /** Activates the tools that were active last time; the first time, the first tool. Called after tools
     * came. */
    void restoreTools();

    /** From now on unsaved changes are copied to a folder; what other programs left there is offered. */
    void startRecovery(const QString &folder);
    KvDeskAutosave *autosave() const { return m_autosave.get(); }
    KvDeskRecoveryBar *recoveryBar() const { return m_recoveryBar; }

public slots:
    /** Opens whatever the user gave the program: with a tool that takes such files, else as the menu does. */
    void slotOpenFiles(const QStringList &aPaths);

signals:
    void signalClosed();

protected:
    void placeTool(KvToolBase *tool) override;
    void closeEvent(QCloseEvent *event) override;
    void dragEnterEvent(QDragEnterEvent *event) override;
    void dropEvent(QDropEvent *event) override;

private slots:
    void slotStateChanged();
    void slotImageStateChanged();
    void slotFillRecentMenu();
    void slotRecentTriggered(QAction *aAction);
    void slotHideValues();
    void slotHideLog();
    void slotFilterValues();
    void slotHideGallery();
    void slotShowSnapshot(const QString &aPath);
    void slotOpenExample(const QString &aPath);
    void slotOpenRecent(const QString &aPath);
    void slotUpdateStartPage();
    void slotOpenFromGallery(const QString &aPath);
    void slotToggleTheme();
    void slotSettings();
    void slotAbout();
    void slotEntryLogged(const ZtStatusEntry &aEntry);
    void slotShowMessage(const QString &aMessage);

private:
    void createPanels();
    void createMenus();
    void createToolBar();
    void createStartPage();
    QWidget *createImageColumn();
    QToolButton *createSourceButton(QWidget *parent);
    void connectSignals();
    void connectActions();
    void restoreWindow();
    void saveWindow() const;
    QStringList activeTools() const;
    void showFolder(const QString &path);
    bool openWithTool(const QString &path);
    bool openAsSource(const QString &path);
    bool closeOtherWindows();

    KvDeskActions *m_actions;
    KvDeskSession *m_session;
    KvDeskSelection *m_selection;
    KvDeskObjectEditor *m_objectEditor;
    KvDeskFileCommands *m_files;
    KvDeskSourceCommands *m_sources;
    KvDeskSnapshots *m_snapshots;
    KvDeskEditCommands *m_editCommands = nullptr;
    KvDeskCalibrationCommands *m_calibrationCommands = nullptr;
    KvDeskToolBox *m_toolBox = nullptr;
    KvDeskToolColumn *m_toolColumn = nullptr;
    KvDeskToolStrip *m_toolStrip = nullptr;
    KvDeskImageView *m_imageView = nullptr;
    KvDeskValueTable *m_valueTable = nullptr;
    KvDeskGallery *m_gallery = nullptr;
    KvDeskLiveBar *m_liveBar = nullptr;
    KvDeskSourceMenu *m_sourceMenu = nullptr;
    KvDeskStartPage *m_startPage = nullptr;
    KvDeskStatusLog *m_statusLog = nullptr;
    KvDeskStatusBar *m_statusBar = nullptr;
    QSplitter *m_imageSplitter = nullptr;
    QSplitter *m_logSplitter = nullptr;
    QMenu *m_recentMenu = nullptr;
    KvDeskRecovery *m_recovery = nullptr;
    KvDeskRecoveryBar *m_recoveryBar = nullptr;
    std::unique_ptr<KvDeskAutosave> m_autosave; ///< ends before the session does
    bool m_isClosed = false;
};
