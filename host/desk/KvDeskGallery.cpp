// SPDX-License-Identifier: MIT
#include "KvDeskGallery.h"

#include "KvDeskActions.h"
#include "KvDeskEmptyState.h"
#include "KvDeskGalleryFolder.h"
#include "KvDeskGalleryModel.h"
#include "KvDeskGallerySettings.h"
#include "KvDeskGalleryView.h"
#include "KvDeskPanelHeader.h"
#include "KvDeskStatus.h"
#include "common/ZtAppStatus.h"
#include "gui/acss.h"
#include "kernel/ZtLeftToRight.h"

#include <QAction>
#include <QClipboard>
#include <QComboBox>
#include <QDesktopServices>
#include <QDir>
#include <QFileDialog>
#include <QGuiApplication>
#include <QMenu>
#include <QMessageBox>
#include <QPushButton>
#include <QStandardPaths>
#include <QTemporaryFile>
#include <QToolButton>
#include <QUrl>

namespace {

constexpr int foldersWidth = 200;
constexpr QSize iconSize(24, 24);

QIcon icon(const char *name)
{
    return acss::createIcon(6, QStringLiteral("Icons/") + QLatin1String(name), iconSize);
}

// Where it cannot write, Qt looks for an unused name in the user's trash for ever.
bool isTrashWritable()
{
    const QString folder =
        QStandardPaths::writableLocation(QStandardPaths::GenericDataLocation) + QStringLiteral("/Trash/info");
    QTemporaryFile probe(folder + QStringLiteral("/probe-XXXXXX"));
    return !QFileInfo(folder).isDir() || probe.open();
}

QString shownPath(const QString &path)
{
    return ZtLeftToRight::isolated(QDir::toNativeSeparators(path));
}

QStringList fileNames(const QStringList &paths)
{
    QStringList names;
    for (const QString &path : paths)
        names.append(ZtLeftToRight::isolated(QFileInfo(path).fileName()));
    return names;
}

} // namespace

KvDeskGallery::KvDeskGallery(KvDeskActions *actions, QWidget *parent)
    : KvDeskPanel(tr("Gallery"), tr("Hide the gallery"), parent)
    , m_actions(actions)
    , m_model(new KvDeskGalleryModel(this))
{
    createMenu();
    createHeader();
    createContent();
    connectSignals();
    fillFolders();
    slotUpdateMenu();
}

void KvDeskGallery::createMenu()
{
    m_menu = new QMenu(this);
    m_menu->setToolTipsVisible(true);
    m_open = m_menu->addAction(icon("open-image"), tr("&Open image"), this, SLOT(slotOpen()), Qt::Key_Return);
    m_showInFolder = m_menu->addAction(tr("&Show in folder"), this, SLOT(slotShowInFolder()));
    m_copyPaths = m_menu->addAction(icon("copy"), tr("&Copy path"), this, SLOT(slotCopyPaths()));
    m_remove =
        m_menu->addAction(icon("delete"), tr("&Move to trash..."), this, SLOT(slotRemove()), Qt::Key_Delete);
    // The view has the keys; here they are shown only.
    m_open->setShortcutContext(Qt::WidgetShortcut);
    m_remove->setShortcutContext(Qt::WidgetShortcut);
    m_menu->addSeparator();
    m_chooseFolder =
        m_menu->addAction(icon("open-session"), tr("Choose &folder..."), this, SLOT(slotChooseFolder()));
    m_chooseFolder->setToolTip(tr("Show the images of a folder"));
    m_useForSnapshots =
        m_menu->addAction(tr("Save s&napshots in this folder"), this, SLOT(slotUseForSnapshots()));
    m_menu->addAction(m_actions->action(KvDeskActions::SnapshotMeasurements));
}

void KvDeskGallery::createHeader()
{
    m_folders = new QComboBox(this);
    m_folders->setFixedWidth(foldersWidth);
    m_folders->setAccessibleName(tr("Folder of the gallery"));
    header()->addWidget(m_folders);
    m_chooseButton = header()->addButton(QStringLiteral("Icons/open-session"), m_chooseFolder->toolTip());
    m_menuButton = header()->addButton(QStringLiteral("Icons/more"), tr("More commands of the gallery"));
    m_menuButton->setMenu(m_menu);
    m_menuButton->setPopupMode(QToolButton::InstantPopup);
}

void KvDeskGallery::createContent()
{
    m_view = new KvDeskGalleryView(this);
    m_view->setModel(m_model);
    m_view->setContextMenuPolicy(Qt::CustomContextMenu);
    m_emptyState = new KvDeskEmptyState(QString(), m_view->viewport());
    m_emptyState->addAction(m_chooseFolder, false);
    m_emptyState->hide();
    setContent(m_view);
}

void KvDeskGallery::connectSignals()
{
    connect(m_folders, SIGNAL(activated(int)), this, SLOT(slotFolderActivated(int)));
    connect(m_chooseButton, SIGNAL(clicked()), this, SLOT(slotChooseFolder()));
    connect(m_menu, SIGNAL(aboutToShow()), this, SLOT(slotUpdateMenu()));
    connect(m_model, SIGNAL(signalFolderRead()), this, SLOT(slotFolderRead()));
    connect(m_view, SIGNAL(signalOpenRequested(QModelIndex)), this, SLOT(slotOpen()));
    connect(m_view, SIGNAL(signalRemoveRequested()), this, SLOT(slotRemove()));
    connect(m_view, SIGNAL(customContextMenuRequested(QPoint)), this, SLOT(slotContextMenu(QPoint)));
}

void KvDeskGallery::showEvent(QShowEvent *event)
{
    KvDeskPanel::showEvent(event);
    if (m_model->folder()->path().isEmpty())
        m_model->setFolder(KvDeskGallerySettings::folder());
}

void KvDeskGallery::showFolder(const QString &path)
{
    KvDeskGallerySettings::setFolder(path);
    fillFolders();
    header()->setNote(QString());
    m_emptyState->hide();
    m_model->setFolder(path);
}

void KvDeskGallery::fillFolders()
{
    const auto add = [this](const QString &text, const QString &path) {
        m_folders->addItem(text, path);
        m_folders->setItemData(m_folders->count() - 1, shownPath(path), Qt::ToolTipRole);
    };
    m_folders->clear();
    add(tr("Snapshots"), KvDeskGallerySettings::snapshotsFolder());
    for (const QString &path : KvDeskGallerySettings::folders())
        add(QDir(path).isRoot() ? shownPath(path) : QDir(path).dirName(), path);
    const QString shown = KvDeskGallerySettings::folder();
    m_folders->setCurrentIndex(qMax(0, m_folders->findData(shown)));
    m_folders->setToolTip(shownPath(shown));
}

void KvDeskGallery::slotFolderActivated(int aIndex)
{
    showFolder(m_folders->itemData(aIndex).toString());
}

void KvDeskGallery::slotChooseFolder()
{
    QFileDialog dialog(this, tr("Choose folder"), KvDeskGallerySettings::folder());
    dialog.setFileMode(QFileDialog::Directory);
    dialog.setOption(QFileDialog::ShowDirsOnly);
    if (dialog.exec() == QDialog::Accepted && !dialog.selectedFiles().isEmpty())
        showFolder(dialog.selectedFiles().first());
}

void KvDeskGallery::slotUseForSnapshots()
{
    KvDeskGallerySettings::setSnapshotsFolder(m_model->folder()->path());
    fillFolders();
    KvDeskStatus::log(ZtAppStatus::Information,
                      tr("Snapshots are saved in %1").arg(shownPath(m_model->folder()->path())),
                      QStringLiteral("KvDeskGallery::slotUseForSnapshots"));
}

void KvDeskGallery::slotShowFile(const QString &aPath)
{
    m_pendingFile = aPath;
    const QString folder = QFileInfo(aPath).absolutePath();
    if (folder != KvDeskGallerySettings::folder() || folder != m_model->folder()->path())
        showFolder(folder);
    else
        m_model->folder()->slotRefresh();
}

void KvDeskGallery::slotFolderRead()
{
    const int count = m_model->rowCount();
    header()->setNote(count > 0 ? QString::number(count) : QString());
    m_emptyState->setText(emptyText());
    m_emptyState->setVisible(count == 0);
    selectPendingFile();
}

void KvDeskGallery::selectPendingFile()
{
    const QModelIndex index = m_model->indexOf(m_pendingFile);
    if (m_pendingFile.isEmpty() || !index.isValid())
        return;
    m_pendingFile.clear();
    m_view->setCurrentIndex(index);
    m_view->scrollTo(index);
}

QString KvDeskGallery::emptyText() const
{
    const QString folder = m_model->folder()->path();
    if (folder == KvDeskGallerySettings::snapshotsFolder()) {
        const QKeySequence key = m_actions->action(KvDeskActions::TakeSnapshot)->shortcut();
        return tr("Snapshots (%1) and the images of a folder appear here; drag them onto report pages")
            .arg(key.toString(QKeySequence::NativeText));
    }
    const QString name = shownPath(folder);
    return m_model->folder()->exists() ? tr("There are no images in %1").arg(name)
                                       : tr("The folder %1 does not exist").arg(name);
}

QStringList KvDeskGallery::selectedPaths() const
{
    QStringList paths;
    for (const QModelIndex &index : m_view->selectedRows())
        paths.append(index.data(KvDeskGalleryModel::PathRole).toString());
    return paths;
}

void KvDeskGallery::slotContextMenu(const QPoint &aPosition)
{
    m_menu->popup(m_view->viewport()->mapToGlobal(aPosition));
}

void KvDeskGallery::slotUpdateMenu()
{
    const bool isAnySelected = m_view->selectionModel()->hasSelection();
    for (QAction *const action : {m_open, m_showInFolder, m_copyPaths, m_remove}) {
        action->setEnabled(isAnySelected);
        action->setToolTip(isAnySelected ? QString() : tr("Select an image first"));
    }
    const bool isForSnapshots = m_model->folder()->path() == KvDeskGallerySettings::snapshotsFolder();
    m_useForSnapshots->setEnabled(!isForSnapshots);
    m_useForSnapshots->setToolTip(isForSnapshots ? tr("Snapshots are saved in this folder already")
                                                 : QString());
}

void KvDeskGallery::slotOpen()
{
    if (m_view->currentIndex().isValid())
        emit signalOpenRequested(m_view->currentIndex().data(KvDeskGalleryModel::PathRole).toString());
}

void KvDeskGallery::slotShowInFolder()
{
    QDesktopServices::openUrl(QUrl::fromLocalFile(m_model->folder()->path()));
}

void KvDeskGallery::slotCopyPaths()
{
    QStringList paths;
    for (const QString &path : selectedPaths())
        paths.append(QDir::toNativeSeparators(path));
    if (!paths.isEmpty())
        QGuiApplication::clipboard()->setText(paths.join(QLatin1Char('\n')));
}

void KvDeskGallery::slotRemove()
{
    const QStringList paths = selectedPaths();
    if (paths.isEmpty() || !askToRemove(paths))
        return;
    const bool isTrashUsable = isTrashWritable();
    QStringList removed;
    QStringList kept;
    for (const QString &path : paths) {
        // Who removed it before us did what was wanted.
        const bool isGone = (isTrashUsable && QFile::moveToTrash(path)) || !QFileInfo::exists(path);
        (isGone ? removed : kept).append(path);
    }
    m_model->folder()->slotRefresh();
    tellRemoved(removed, kept);
}

bool KvDeskGallery::askToRemove(const QStringList &paths)
{
    const QString question = paths.size() == 1
                                 ? tr("Move \"%1\" to the trash?").arg(fileNames(paths).first())
                                 : tr("Move %n selected image(s) to the trash?", "", paths.size());
    QMessageBox box(QMessageBox::Question, tr("Move to trash"), question,
                    QMessageBox::Yes | QMessageBox::Cancel, this);
    box.button(QMessageBox::Yes)->setText(tr("Move to trash"));
    return box.exec() == QMessageBox::Yes;
}

void KvDeskGallery::tellRemoved(const QStringList &removed, const QStringList &kept)
{
    const QString source = QStringLiteral("KvDeskGallery::slotRemove");
    if (!removed.isEmpty())
        KvDeskStatus::log(ZtAppStatus::Information,
                          tr("Moved to the trash: %1").arg(fileNames(removed).join(QStringLiteral(", "))),
                          source);
    if (kept.isEmpty())
        return;
    const QString text = tr("Not moved to the trash: %1").arg(fileNames(kept).join(QStringLiteral(", ")));
    KvDeskStatus::log(ZtAppStatus::Error, text, source);
    QMessageBox box(QMessageBox::Warning, tr("Measuring Desk"), text, QMessageBox::Ok, this);
    box.setInformativeText(
        tr("The files are still there. They are write-protected, or there is no trash for them."));
    box.exec();
}
