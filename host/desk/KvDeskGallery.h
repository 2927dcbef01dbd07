// SPDX-License-Identifier: MIT
#pragma once

#include "KvDeskPanel.h"

class KvDeskActions;
class KvDeskEmptyState;
class KvDeskGalleryModel;
class KvDeskGalleryView;
class QAction;
class QComboBox;
class QMenu;
class QToolButton;

/**
 * Panel with the snapshots, or with the pictures of another folder. They can be opened, dragged onto report
 * pages and moved to the trash.
 *
 * Nothing is read before the panel is seen for the first time.
 */
class KvDeskGallery : public KvDeskPanel
{
    Q_OBJECT
public:
    /** \a actions has to outlive the panel. */
    explicit KvDeskGallery(KvDeskActions *actions, QWidget *parent = nullptr);

    KvDeskGalleryModel *model() const { return m_model; }
    KvDeskGalleryView *view() const { return m_view; }
    KvDeskEmptyState *emptyState() const { return m_emptyState; }
    QComboBox *folders() const { return m_folders; }
    QToolButton *chooseButton() const { return m_chooseButton; }
    /** What can be done with the selected pictures and the folder. */
    QMenu *menu() const { return m_menu; }

    /** Shows another folder, and remembers it. */
    void showFolder(const QString &path);

public slots:
    /** Shows the folder of a file, and selects the file. */
    void slotShowFile(const QString &aPath);
    void slotChooseFolder();
    void slotOpen(); ///< the current picture
    void slotShowInFolder();
    void slotCopyPaths();
    void slotRemove(); ///< asks, and moves the selected pictures to the trash
    void slotUseForSnapshots();

signals:
    void signalOpenRequested(const QString &aPath); ///< the user wants to work on this picture

protected:
    void showEvent(QShowEvent *event) override;

private slots:
    void slotFolderActivated(int aIndex);
    void slotFolderRead();
    void slotContextMenu(const QPoint &aPosition);
    void slotUpdateMenu();

private:
    void createHeader();
    void createMenu();
    void createContent();
    void connectSignals();
    void fillFolders();
    QString emptyText() const;
    QStringList selectedPaths() const;
    bool askToRemove(const QStringList &paths);
    void tellRemoved(const QStringList &removed, const QStringList &kept);
    void selectPendingFile();

    KvDeskActions *m_actions;
    KvDeskGalleryModel *m_model;
    QComboBox *m_folders = nullptr;
    QToolButton *m_chooseButton = nullptr;
    QToolButton *m_menuButton = nullptr;
    QMenu *m_menu = nullptr;
    QAction *m_open = nullptr;
    QAction *m_showInFolder = nullptr;
    QAction *m_copyPaths = nullptr;
    QAction *m_remove = nullptr;
    QAction *m_useForSnapshots = nullptr;
    QAction *m_chooseFolder = nullptr;
    KvDeskGalleryView *m_view = nullptr;
    KvDeskEmptyState *m_emptyState = nullptr;
    QString m_pendingFile; ///< to select when the folder is read
};
