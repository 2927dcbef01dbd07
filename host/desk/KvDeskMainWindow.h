// SPDX-License-Identifier: MIT
#pragma once

#include "common/ZtAppStatus.h"
#include "gui/KvGuiMainWindowBase.h"

class KvDeskActions;
class KvDeskFileCommands;
class KvDeskImageView;
class KvDeskSession;
class KvDeskStatusBar;
class KvDeskStatusLog;
class KvDeskToolColumn;
class KvDeskValueTable;
class QMenu;
class QSplitter;
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
    KvDeskFileCommands *files() const { return m_files; }
    KvDeskImageView *imageView() const { return m_imageView; }
    KvDeskValueTable *valueTable() const { return m_valueTable; }
    KvDeskStatusLog *statusLog() const { return m_statusLog; }
    KvDeskToolColumn *toolColumn() const { return m_toolColumn; }
    KvDeskStatusBar *deskStatusBar() const { return m_statusBar; }
    QMenu *recentMenu() const { return m_recentMenu; }

    /** Activates the tools that were active last time; the first time, the first tool. Called after tools
     * came. */
    void restoreTools();

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
    void slotToggleTheme();
    void slotSettings();
    void slotAbout();
    void slotEntryLogged(const ZtStatusEntry &aEntry);
    void slotShowMessage(const QString &aMessage);

private:
    void createPanels();
    void createMenus();
    void createToolBar();
    void connectSignals();
    void connectActions();
    void restoreWindow();
    void saveWindow() const;
    QStringList activeTools() const;
    bool closeOtherWindows();

    KvDeskActions *m_actions;
    KvDeskSession *m_session;
    KvDeskFileCommands *m_files;
    KvDeskToolColumn *m_toolColumn = nullptr;
    KvDeskImageView *m_imageView = nullptr;
    KvDeskValueTable *m_valueTable = nullptr;
    KvDeskStatusLog *m_statusLog = nullptr;
    KvDeskStatusBar *m_statusBar = nullptr;
    QSplitter *m_imageSplitter = nullptr;
    QSplitter *m_logSplitter = nullptr;
    QMenu *m_recentMenu = nullptr;
    bool m_isClosed = false;
};
