// SPDX-License-Identifier: MIT
#include "KvDeskMainWindow.h"

#include "KvDeskActions.h"
#include "KvDeskAutosave.h"
#include "KvDeskCalibrationCommands.h"
#include "KvDeskCounterBar.h"
#include "KvDeskEditCommands.h"
#include "KvDeskEmptyState.h"
#include "KvDeskExamples.h"
#include "KvDeskExportCommand.h"
#include "KvDeskFieldKeys.h"
#include "KvDeskFileCommands.h"
#include "KvDeskGallery.h"
#include "KvDeskGuideCommand.h"
#include "KvDeskImageMenu.h"
#include "KvDeskImageView.h"
#include "KvDeskInlineEditor.h"
#include "KvDeskLanguages.h"
#include "KvDeskLiveBar.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskRecentFiles.h"
#include "KvDeskRecovery.h"
#include "KvDeskRecoveryBar.h"
#include "KvDeskResources.h"
#include "KvDeskSelection.h"
#include "KvDeskSession.h"
#include "KvDeskSettingsDialog.h"
#include "KvDeskSnapshots.h"
#include "KvDeskSourceCommands.h"
#include "KvDeskSourceMenu.h"
#include "KvDeskStartPage.h"
#include "KvDeskStatusBar.h"
#include "KvDeskStatusLog.h"
#include "KvDeskTheme.h"
#include "KvDeskToolBox.h"
#include "KvDeskToolColumn.h"
#include "KvDeskToolStrip.h"
#include "KvDeskValueTable.h"
#include "gui/KvToolBase.h"
#include "gui/acss.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtLeftToRight.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtFrameSourceCatalogue.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QAction>
#include <QApplication>
#include <QCloseEvent>
#include <QDir>
#include <QHBoxLayout>
#include <QMenu>
#include <QMenuBar>
#include <QMessageBox>
#include <QMimeData>
#include <QScreen>
#include <QSplitter>
#include <QToolBar>
#include <QToolButton>
#include <QUrl>

#include <algorithm>

namespace {

constexpr QSize firstSize(1280, 800);
constexpr QSize smallestSize(800, 528);
constexpr int valuesWidth = 416;          ///< at first; the numbers of objects are whole in every language
constexpr QSize leastImageSize(280, 248); ///< the panels give way first
constexpr int logHeight = 144;
constexpr int galleryHeight = 188; ///< one row of thumbnails

const char windowGroup[] = "DeskWindow";
const char geometryKey[] = "geometry";
const char stateKey[] = "state";
const char imageSplitterKey[] = "imageSplitter";
const char logSplitterKey[] = "logSplitter";
const char labelsKey[] = "labelsVisible";
const char rulersKey[] = "rulersVisible";
const char scaleBarKey[] = "scaleBarVisible";
const char valuesKey[] = "valuesVisible";
const char logKey[] = "logVisible";
const char galleryKey[] = "galleryVisible";
const char toolsKey[] = "activeTools";

QStringList localFiles(const QMimeData *data)
{
    QStringList files;
    for (const QUrl &url : data->urls()) {
        if (url.isLocalFile())
            files.append(url.toLocalFile());
    }
    return files;
}

// Only what a user would call a window: no menus, tool tips or the like.
bool isOpenWindow(const QWidget *widget)
{
    const bool isWindow = widget->windowType() == Qt::Window || widget->windowType() == Qt::Dialog ||
                          widget->windowType() == Qt::Tool;
    return isWindow && widget->isVisible();
}

} // namespace

KvDeskMainWindow::KvDeskMainWindow(ZtMeasuringDocument *document, QWidget *parent)
    : KvGuiMainWindowBase(parent)
    , m_actions((KvDeskResources::ensure(), new KvDeskActions(this)))
    , m_session(new KvDeskSession(document, this))
    , m_selection(new KvDeskSelection(this))
    , m_objectEditor(new KvDeskObjectEditor(m_session, m_selection, this))
    , m_files(new KvDeskFileCommands(m_session, this, m_objectEditor))
    , m_sources(new KvDeskSourceCommands(m_session, m_files, this))
    , m_snapshots(new KvDeskSnapshots(m_actions, document, this))
{
    setObjectName(QStringLiteral("DeskMainWindow"));
    setWindowIcon(QIcon(acss::getPathSVG(QStringLiteral("Icons/measuringdesk"))));
    setAcceptDrops(true);
    // The tool bar stays: a context menu could only hide it.
    setContextMenuPolicy(Qt::PreventContextMenu);
    setMinimumSize(smallestSize);
    createPanels();
    createMenus();
    createToolBar();
    createStartPage();
    connectSignals();
    connectActions();
    m_imageView->setDocument(document);
    restoreWindow();
    slotStateChanged();
    // Tab goes to its buttons, and the image takes the keyboard when there is one.
    m_startPage->setFocus();
}

KvDeskMainWindow::~KvDeskMainWindow() = default;

void KvDeskMainWindow::createPanels()
{
    m_toolColumn = new KvDeskToolColumn(this);
    m_imageView = new KvDeskImageView(this);
    m_imageView->setEditor(m_objectEditor);
    m_toolBox = new KvDeskToolBox(m_actions, m_imageView, this);
    m_toolStrip = new KvDeskToolStrip(m_toolBox, this);
    new KvDeskCounterBar(m_toolBox, m_imageView);
    m_editCommands = new KvDeskEditCommands(m_actions, m_imageView, m_objectEditor, this);
    new KvDeskImageMenu(m_actions, m_imageView);
    new KvDeskFieldKeys(m_actions, this);
    m_calibrationCommands =
        new KvDeskCalibrationCommands(m_actions, m_imageView, m_session, m_objectEditor, this);
    m_valueTable = new KvDeskValueTable(this);
    m_valueTable->setEditor(m_objectEditor);
    new KvDeskExportCommand(m_actions->action(KvDeskActions::ExportTable), m_files, m_session, m_selection,
                            this);
    new KvDeskGuideCommand(m_actions, KvDeskGuideCommand::guide(KvDeskLanguages::effectiveName()), this);
    m_gallery = new KvDeskGallery(m_actions, this);
    m_liveBar = new KvDeskLiveBar(m_actions, m_session->document(), this);
    m_statusLog = new KvDeskStatusLog(this);
    m_statusBar = new KvDeskStatusBar(this);
    setStatusBar(m_statusBar);

    m_imageSplitter = new QSplitter(Qt::Horizontal, this);
    m_imageSplitter->addWidget(createImageColumn());
    m_imageSplitter->addWidget(m_valueTable);
    m_imageSplitter->setChildrenCollapsible(false);
    m_imageSplitter->setStretchFactor(0, 1);
    m_imageSplitter->setSizes({firstSize.width() - valuesWidth, valuesWidth});
    m_logSplitter = new QSplitter(Qt::Vertical, this);
    m_logSplitter->addWidget(m_imageSplitter);
    m_logSplitter->addWidget(m_gallery);
    m_logSplitter->addWidget(m_statusLog);
    m_logSplitter->setChildrenCollapsible(false);
    m_logSplitter->setStretchFactor(0, 1);
    m_logSplitter->setSizes({firstSize.height() - galleryHeight - logHeight, galleryHeight, logHeight});

    auto *const central = new QWidget(this);
    auto *const layout = new QHBoxLayout(central);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(m_toolColumn);
    layout->addWidget(m_toolStrip);
    layout->addWidget(m_logSplitter, 1);
    setCentralWidget(central);
    m_toolColumn->hide();
}

QWidget *KvDeskMainWindow::createImageColumn()
{
    auto *const column = new QWidget(this);
    column->setMinimumSize(leastImageSize);
    auto *const layout = new QVBoxLayout(column);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(m_liveBar);
    layout->addWidget(m_imageView, 1);
    return column;
}

void KvDeskMainWindow::createMenus()
{
    using A = KvDeskActions;
    const auto add = [this](QMenu *menu, std::initializer_list<A::Id> ids) {
        for (const A::Id id : ids)
            menu->addAction(m_actions->action(id));
    };
    QMenu *const file = menuBar()->addMenu(tr("&File"));
    file->setToolTipsVisible(true);
    add(file, {A::NewSession, A::OpenSession});
    m_recentMenu = file->addMenu(acss::createIcon(6, QStringLiteral("Icons/recent"), QSize(24, 24)),
                                 tr("&Recent sessions"));
    m_recentMenu->setToolTipsVisible(true);
    add(file, {A::OpenImage, A::ImportTable, A::ExportTable});
    file->addSeparator();
    add(file, {A::SaveSession, A::SaveSessionAs});
    file->addSeparator();
    add(file, {A::Settings});
    file->addSeparator();
    add(file, {A::Quit});
    QMenu *const edit = menuBar()->addMenu(tr("&Edit"));
    edit->setToolTipsVisible(true);
    add(edit, {A::Undo, A::Redo});
    edit->addSeparator();
    add(edit, {A::Cut, A::Copy, A::Paste, A::Delete});
    edit->addSeparator();
    add(edit, {A::SelectAll, A::Rename});
    edit->addSeparator();
    add(edit, {A::FilterValues});
    QMenu *const image = menuBar()->addMenu(tr("&Image"));
    image->setToolTipsVisible(true);
    m_sourceMenu = new KvDeskSourceMenu(m_sources, this);
    image->addMenu(m_sourceMenu);
    add(image, {A::Freeze});
    image->addSeparator();
    add(image, {A::TakeSnapshot, A::SnapshotMeasurements});
    QMenu *const measure = menuBar()->addMenu(tr("&Measure"));
    for (const QVector<QAction *> &group : m_toolBox->groups()) {
        measure->addActions(group.toList());
        measure->addSeparator();
    }
    measure->setToolTipsVisible(true);
    add(measure, {A::Calibrate, A::UseFilePixelSize});
    QMenu *const view = menuBar()->addMenu(tr("&View"));
    view->setToolTipsVisible(true);
    add(view, {A::ZoomIn, A::ZoomOut, A::ZoomFit, A::ZoomActual});
    view->addSeparator();
    add(view, {A::ShowLabels, A::ShowRulers, A::ShowScaleBar});
    view->addSeparator();
    add(view, {A::ShowValues, A::ShowGallery, A::ShowLog});
    view->addSeparator();
    add(view, {A::ToggleTheme});
    QMenu *const help = menuBar()->addMenu(tr("&Help"));
    help->setToolTipsVisible(true);
    add(help, {A::Guide, A::StartPage});
    help->addSeparator();
    add(help, {A::About});
}

void KvDeskMainWindow::createToolBar()
{
    using A = KvDeskActions;
    QToolBar *const bar = addToolBar(tr("Main tool bar"));
    bar->setObjectName(QStringLiteral("MainToolBar"));
    bar->setMovable(false);
    bar->setIconSize(QSize(24, 24));
    const auto add = [this, bar](std::initializer_list<A::Id> ids) {
        for (const A::Id id : ids)
            bar->addAction(m_actions->action(id));
    };
    add({A::OpenImage, A::OpenSession, A::SaveSession, A::ImportTable, A::ExportTable});
    bar->addSeparator();
    add({A::Undo, A::Redo});
    bar->addSeparator();
    add({A::ZoomOut, A::ZoomIn, A::ZoomFit, A::ZoomActual});
    bar->addSeparator();
    bar->addWidget(createSourceButton(bar));
    add({A::TakeSnapshot});
    auto *const space = new QWidget(bar);
    space->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred);
    bar->addWidget(space);
    add({A::ShowGallery, A::ShowLog, A::ShowValues});
    bar->addSeparator();
    add({A::ToggleTheme, A::Settings});
}

void KvDeskMainWindow::createStartPage()
{
    m_startPage = new KvDeskStartPage(m_actions, m_sourceMenu, KvDeskExamples::folder());
    m_imageView->emptyState()->setContent(m_startPage);
    connect(m_startPage, SIGNAL(signalExampleChosen(QString)), this, SLOT(slotOpenExample(QString)));
    connect(m_startPage, SIGNAL(signalRecentChosen(QString)), this, SLOT(slotOpenRecent(QString)));
    connect(m_startPage, SIGNAL(signalLeft()), m_imageView, SLOT(slotHideStart()));
    connect(m_imageView, SIGNAL(signalContentChanged()), this, SLOT(slotUpdateStartPage()));
    connect(m_toolBox, SIGNAL(signalToolChanged()), m_imageView, SLOT(slotHideStart()));
    connect(m_session, SIGNAL(signalReplaced()), m_imageView, SLOT(slotHideStart()));
    connect(m_session, SIGNAL(signalImageOpened()), m_imageView, SLOT(slotHideStart()));
    connect(m_session->document(), SIGNAL(signalImageChanged()), m_imageView, SLOT(slotHideStart()));
}

QToolButton *KvDeskMainWindow::createSourceButton(QWidget *parent)
{
    auto *const button = new QToolButton(parent);
    button->setMenu(m_sourceMenu);
    button->setPopupMode(QToolButton::InstantPopup);
    button->setIcon(m_sourceMenu->icon());
    button->setToolTip(tr("Choose the image source"));
    button->setAccessibleName(button->toolTip());
    return button;
}

void KvDeskMainWindow::connectSignals()
{
    connect(m_session, SIGNAL(signalStateChanged()), this, SLOT(slotStateChanged()));
    connect(m_session->document(), SIGNAL(signalCalibrationChanged()), this, SLOT(slotImageStateChanged()));
    connect(m_imageView, SIGNAL(signalFrameChanged()), this, SLOT(slotImageStateChanged()));
    connect(m_imageView, SIGNAL(signalZoomChanged(double)), m_statusBar, SLOT(slotZoomChanged(double)));
    connect(m_imageView, SIGNAL(signalPointerMoved(QPointF)), m_statusBar, SLOT(slotPointerMoved(QPointF)));
    connect(m_imageView, SIGNAL(signalPointerLeft()), m_statusBar, SLOT(slotPointerLeft()));
    connect(m_valueTable, SIGNAL(signalStatisticsChanged(QString,QString)), m_statusBar,
                                 SLOT(slotSetStatistics(QString,QString)));
    connect(m_valueTable, SIGNAL(signalCloseClicked()), this, SLOT(slotHideValues()));
    connect(m_gallery, SIGNAL(signalCloseClicked()), this, SLOT(slotHideGallery()));
    connect(m_gallery, SIGNAL(signalOpenRequested(QString)), this, SLOT(slotOpenFromGallery(QString)));
    connect(m_snapshots, SIGNAL(signalSaved(QString)), this, SLOT(slotShowSnapshot(QString)));
    connect(m_imageView, SIGNAL(signalFrameChanged()), m_snapshots, SLOT(slotUpdate()));
    connect(m_statusLog, SIGNAL(signalCloseClicked()), this, SLOT(slotHideLog()));
    connect(m_recentMenu, SIGNAL(aboutToShow()), this, SLOT(slotFillRecentMenu()));
    connect(m_recentMenu, SIGNAL(triggered(QAction*)), this, SLOT(slotRecentTriggered(QAction*)));
    connect(ZtStatusLog::getInstance(), SIGNAL(signalEntryLogged(ZtStatusEntry)), this,
                                               SLOT(slotEntryLogged(ZtStatusEntry)));
}

void KvDeskMainWindow::connectActions()
{
    using A = KvDeskActions;
    const auto onTrigger = [this](A::Id id, QObject *receiver, const char *slot) {
        connect(m_actions->action(id), SIGNAL(triggered()), receiver, slot);
    };
    onTrigger(A::NewSession, m_files, SLOT(slotNewSession()));
    onTrigger(A::OpenImage, m_files, SLOT(slotOpenImage()));
    onTrigger(A::OpenSession, m_files, SLOT(slotOpenSession()));
    onTrigger(A::ImportTable, m_files, SLOT(slotImportTable()));
    onTrigger(A::FilterValues, this, SLOT(slotFilterValues()));
    onTrigger(A::SaveSession, m_files, SLOT(slotSaveSession()));
    onTrigger(A::SaveSessionAs, m_files, SLOT(slotSaveSessionAs()));
    onTrigger(A::Quit, this, SLOT(close()));
    onTrigger(A::ZoomIn, m_imageView, SLOT(slotZoomIn()));
    onTrigger(A::ZoomOut, m_imageView, SLOT(slotZoomOut()));
    onTrigger(A::ZoomFit, m_imageView, SLOT(slotZoomFit()));
    onTrigger(A::ZoomActual, m_imageView, SLOT(slotZoomActual()));
    onTrigger(A::ToggleTheme, this, SLOT(slotToggleTheme()));
    onTrigger(A::Settings, this, SLOT(slotSettings()));
    onTrigger(A::StartPage, m_imageView, SLOT(slotShowStart()));
    onTrigger(A::About, this, SLOT(slotAbout()));
    connect(m_actions->action(A::ShowLabels), SIGNAL(toggled(bool)), m_imageView,
                                                     SLOT(slotSetLabelsVisible(bool)));
    connect(m_actions->action(A::ShowRulers), SIGNAL(toggled(bool)), m_imageView,
                                                     SLOT(slotSetRulersVisible(bool)));
    connect(m_actions->action(A::ShowValues), SIGNAL(toggled(bool)), m_valueTable, SLOT(setVisible(bool)));
    connect(m_actions->action(A::ShowGallery), SIGNAL(toggled(bool)), m_gallery, SLOT(setVisible(bool)));
    connect(m_actions->action(A::ShowLog), SIGNAL(toggled(bool)), m_statusLog, SLOT(setVisible(bool)));
}

void KvDeskMainWindow::placeTool(KvToolBase *tool)
{
    m_toolColumn->addTool(tool);
    m_toolColumn->show();
}

void KvDeskMainWindow::startRecovery(const QString &folder)
{
    m_recovery = new KvDeskRecovery(m_session, m_files, this);
    m_recoveryBar = new KvDeskRecoveryBar(m_recovery, m_imageView->parentWidget());
    qobject_cast<QBoxLayout *>(m_imageView->parentWidget()->layout())->insertWidget(0, m_recoveryBar);
    m_recovery->find(folder);
    m_autosave = std::make_unique<KvDeskAutosave>(m_session, folder);
}

void KvDeskMainWindow::restoreTools()
{
    ZtAppSettings::beginGroupAbsolute(QLatin1String(windowGroup));
    const bool isFirstTime = !ZtAppSettings::contains(QLatin1String(toolsKey));
    const QStringList active = ZtAppSettings::value(QLatin1String(toolsKey)).toStringList();
    ZtAppSettings::endGroup();
    const QList<KvToolBase *> all = tools();
    for (KvToolBase *const tool : all) {
        const bool isWanted = isFirstTime ? tool == all.first() : active.contains(tool->name());
        if (isWanted && tool->isEnabled())
            tool->getToolButton()->setChecked(true);
    }
}

QStringList KvDeskMainWindow::activeTools() const
{
    QStringList names;
    for (const KvToolBase *const tool : tools()) {
        if (tool->isActivated())
            names.append(tool->name());
    }
    return names;
}

void KvDeskMainWindow::restoreWindow()
{
    ZtAppSettings::beginGroupAbsolute(QLatin1String(windowGroup));
    const auto bytes = [](const char *key) { return ZtAppSettings::value(QLatin1String(key)).toByteArray(); };
    if (!restoreGeometry(bytes(geometryKey)))
        resize(firstSize.boundedTo(screen()->availableSize()));
    restoreState(bytes(stateKey));
    m_imageSplitter->restoreState(bytes(imageSplitterKey));
    m_logSplitter->restoreState(bytes(logSplitterKey));
    const bool labelsVisible = ZtAppSettings::value(QLatin1String(labelsKey), true).toBool();
    const bool rulersVisible = ZtAppSettings::value(QLatin1String(rulersKey), true).toBool();
    const bool scaleBarVisible = ZtAppSettings::value(QLatin1String(scaleBarKey), false).toBool();
    const bool valuesVisible = ZtAppSettings::value(QLatin1String(valuesKey), true).toBool();
    const bool galleryVisible = ZtAppSettings::value(QLatin1String(galleryKey), false).toBool();
    const bool logVisible = ZtAppSettings::value(QLatin1String(logKey), false).toBool();
    ZtAppSettings::endGroup();
    m_actions->action(KvDeskActions::ShowLabels)->setChecked(labelsVisible);
    m_imageView->slotSetLabelsVisible(labelsVisible);
    m_actions->action(KvDeskActions::ShowRulers)->setChecked(rulersVisible);
    m_imageView->slotSetRulersVisible(rulersVisible);
    m_actions->action(KvDeskActions::ShowScaleBar)->setChecked(scaleBarVisible);
    m_imageView->slotSetScaleBarVisible(scaleBarVisible);
    m_actions->action(KvDeskActions::ShowValues)->setChecked(valuesVisible);
    m_valueTable->setVisible(valuesVisible);
    m_actions->action(KvDeskActions::ShowGallery)->setChecked(galleryVisible);
    m_gallery->setVisible(galleryVisible);
    m_actions->action(KvDeskActions::ShowLog)->setChecked(logVisible);
    m_statusLog->setVisible(logVisible);
}

void KvDeskMainWindow::saveWindow() const
{
    ZtAppSettings::beginGroupAbsolute(QLatin1String(windowGroup));
    ZtAppSettings::setValue(QLatin1String(geometryKey), saveGeometry());
    ZtAppSettings::setValue(QLatin1String(stateKey), saveState());
    ZtAppSettings::setValue(QLatin1String(imageSplitterKey), m_imageSplitter->saveState());
    ZtAppSettings::setValue(QLatin1String(logSplitterKey), m_logSplitter->saveState());
    ZtAppSettings::setValue(QLatin1String(labelsKey), m_imageView->areLabelsVisible());
    ZtAppSettings::setValue(QLatin1String(rulersKey), m_imageView->areRulersVisible());
    ZtAppSettings::setValue(QLatin1String(scaleBarKey), m_imageView->isScaleBarVisible());
    ZtAppSettings::setValue(QLatin1String(valuesKey),
                            m_actions->action(KvDeskActions::ShowValues)->isChecked());
    ZtAppSettings::setValue(QLatin1String(galleryKey),
                            m_actions->action(KvDeskActions::ShowGallery)->isChecked());
    ZtAppSettings::setValue(QLatin1String(logKey), m_actions->action(KvDeskActions::ShowLog)->isChecked());
    ZtAppSettings::setValue(QLatin1String(toolsKey), activeTools());
    ZtAppSettings::endGroup();
}

void KvDeskMainWindow::closeEvent(QCloseEvent *event)
{
    if (m_isClosed)
        return;
    // What is being written on the image is not lost with the field.
    m_imageView->inlineEditor()->slotAccept();
    if (!m_files->maybeSave() || !closeOtherWindows()) {
        event->ignore();
        return;
    }
    m_isClosed = true;
    if (m_autosave) {
        m_autosave->end();
        m_recovery->end();
    }
    saveWindow();
    emit ZtSignalCenter::getInstance()->signalAppAboutToClose();
    event->accept();
    emit signalClosed();
}

// The windows of plug-ins ask about unsaved changes of their own, and may hold the program back.
bool KvDeskMainWindow::closeOtherWindows()
{
    QList<QPointer<QWidget>> windows;
    for (QWidget *const widget : QApplication::topLevelWidgets()) {
        if (widget != this && isOpenWindow(widget))
            windows.append(widget);
    }
    for (const QPointer<QWidget> &other : qAsConst(windows)) {
        if (other && !other->close())
            return false;
    }
    return true;
}

void KvDeskMainWindow::dragEnterEvent(QDragEnterEvent *event)
{
    if (localFiles(event->mimeData()).isEmpty())
        return;
    event->setDropAction(Qt::CopyAction);
    event->accept();
}

void KvDeskMainWindow::dropEvent(QDropEvent *event)
{
    event->setDropAction(Qt::CopyAction);
    event->accept();
    // Later: the program that the files come from waits for the end of the drag.
    QMetaObject::invokeMethod(this, "slotOpenFiles", Qt::QueuedConnection,
                              Q_ARG(QStringList, localFiles(event->mimeData())));
}

void KvDeskMainWindow::showFolder(const QString &path)
{
    m_actions->action(KvDeskActions::ShowGallery)->setChecked(true);
    m_gallery->showFolder(path);
}

bool KvDeskMainWindow::openWithTool(const QString &path)
{
    const QList<KvToolBase *> all = tools();
    const auto tool = std::find_if(
        all.begin(), all.end(), [&path](const KvToolBase *candidate) { return candidate->opensFile(path); });
    if (tool == all.end() || !QFileInfo(path).isFile())
        return false;
    (*tool)->openFile(path);
    return true;
}

void KvDeskMainWindow::slotOpenFiles(const QStringList &aPaths)
{
    QStringList files;
    for (const QString &path : aPaths) {
        if (!openWithTool(path) && !openAsSource(path))
            files.append(path);
    }
    m_files->openFiles(files);
}

void KvDeskMainWindow::openPath(const QString &path)
{
    if (!openWithTool(path) && !openAsSource(path))
        m_files->openFile(path);
}

// False for what is no folder and no video.
bool KvDeskMainWindow::openAsSource(const QString &path)
{
    const ZtFrameSourceInfo info = ZtFrameSourceCatalogue::infoOfPath(path);
    if (info.kind == ZtFrameSourceInfo::ImageFolder)
        showFolder(path);
    else if (info.kind == ZtFrameSourceInfo::VideoFile)
        m_sources->open(info);
    else
        return false;
    return true;
}

void KvDeskMainWindow::slotStateChanged()
{
    //: %1 is the name of a session; [*] is replaced by a star when it has unsaved changes
    setWindowTitle(tr("%1[*] - Measuring Desk").arg(m_session->displayName()));
    setWindowModified(m_session->isModified());
    setWindowFilePath(m_session->path());
}

void KvDeskMainWindow::slotImageStateChanged()
{
    m_statusBar->setImage(m_imageView->frame().image().size(), m_session->document()->calibration());
    m_statusBar->slotZoomChanged(m_imageView->zoom());
}

void KvDeskMainWindow::slotFillRecentMenu()
{
    m_recentMenu->clear();
    for (const QString &path : KvDeskRecentFiles::paths()) {
        // An ampersand would underline the letter after it.
        QAction *const action = m_recentMenu->addAction(ZtLeftToRight::isolated(QFileInfo(path).fileName())
                                                            .replace(QLatin1Char('&'), QLatin1String("&&")));
        action->setData(path);
        action->setToolTip(ZtLeftToRight::isolated(QDir::toNativeSeparators(path)));
    }
    if (m_recentMenu->isEmpty())
        m_recentMenu->addAction(tr("None yet"))->setEnabled(false);
}

void KvDeskMainWindow::slotRecentTriggered(QAction *aAction)
{
    slotOpenRecent(aAction->data().toString());
}

void KvDeskMainWindow::slotOpenRecent(const QString &aPath)
{
    if (!m_files->openSession(aPath) && !QFileInfo::exists(aPath))
        KvDeskRecentFiles::remove(aPath);
}

void KvDeskMainWindow::slotOpenExample(const QString &aPath)
{
    m_files->openCopy(aPath);
}

void KvDeskMainWindow::slotUpdateStartPage()
{
    m_startPage->setAnythingOpen(m_imageView->isAnythingOpen());
}

void KvDeskMainWindow::slotHideValues()
{
    m_actions->action(KvDeskActions::ShowValues)->setChecked(false);
}

void KvDeskMainWindow::slotFilterValues()
{
    m_actions->action(KvDeskActions::ShowValues)->setChecked(true);
    m_valueTable->slotFocusFilter();
}

void KvDeskMainWindow::slotHideLog()
{
    m_actions->action(KvDeskActions::ShowLog)->setChecked(false);
}

void KvDeskMainWindow::slotHideGallery()
{
    m_actions->action(KvDeskActions::ShowGallery)->setChecked(false);
}

void KvDeskMainWindow::slotShowSnapshot(const QString &aPath)
{
    m_actions->action(KvDeskActions::ShowGallery)->setChecked(true);
    m_gallery->slotShowFile(aPath);
}

void KvDeskMainWindow::slotOpenFromGallery(const QString &aPath)
{
    m_files->openImage(aPath);
}

void KvDeskMainWindow::slotToggleTheme()
{
    KvDeskTheme::toggle();
}

void KvDeskMainWindow::slotSettings()
{
    KvDeskSettingsDialog dialog(this);
    dialog.exec();
}

void KvDeskMainWindow::slotAbout()
{
    QMessageBox::about(
        this, tr("About Measuring Desk"),
        tr("<b>Measuring Desk %1</b><p>Measures objects on images, and hosts plug-ins such as the "
           "statistics reports.</p><p>%2, MIT licence</p>")
            .arg(ZtAppSettings::getProgramVersion(), ZtAppSettings::getVendor()));
}

void KvDeskMainWindow::slotEntryLogged(const ZtStatusEntry &aEntry)
{
    const bool isProblem = aEntry.category == ZtAppStatus::Warning || aEntry.category == ZtAppStatus::Error;
    if (aEntry.destination == ZtAppStatus::StatusPanel && isProblem)
        m_actions->action(KvDeskActions::ShowLog)->setChecked(true);
    // Later: whoever reports is in the middle of something.
    if (aEntry.destination == ZtAppStatus::MessageBox)
        QMetaObject::invokeMethod(this, "slotShowMessage", Qt::QueuedConnection,
                                  Q_ARG(QString, aEntry.message));
}

void KvDeskMainWindow::slotShowMessage(const QString &aMessage)
{
    QMessageBox::warning(this, tr("Measuring Desk"), aMessage);
}
