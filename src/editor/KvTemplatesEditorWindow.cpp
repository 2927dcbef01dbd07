// SPDX-License-Identifier: MIT
#include "editor/KvTemplatesEditorWindow.h"

#include "editor/KvEditorPaletteRow.h"
#include "editor/KvEditorToolsList.h"
#include "editor/KvFileDialogs.h"
#include "editor/KvPrintProgressDialog.h"
#include "gui/acss.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtLeftToRight.h"
#include "report/KvBaseDisplayWidget.h"
#include "report/KvReportPagedView.h"
#include "report/KvReportProxyWidgetItem.h"
#include "resources/KvReportResources.h"
#include "templates/KvTemplateModel.h"
#include "ui_KvTemplatesEditorWindowUi.h"

#include <QCloseEvent>
#include <QFileInfo>
#include <QGuiApplication>
#include <QKeyEvent>
#include <QScreen>

#include <algorithm>

namespace {

constexpr int kIconMode = 6;
constexpr QSize kToolbarIconSize(16, 16);
constexpr QSize kPageControlIconSize(24, 24);
constexpr int kSidePanelWidth = 310;
constexpr int kSideHeaderPixelSize = 26;
constexpr int kTopAfterRescue = 30; // pixels below the screen's top

constexpr QLatin1String kSettingsGroup("EditorWindow");
constexpr QLatin1String kGeometryKey("geometry");

/// Makes the button's shortcut part of its tool tip, too.
void explain(QPushButton *button, const QString &text, const QKeySequence &shortcut)
{
    // The button forgets its shortcut whenever its text changes.
    button->setShortcut(shortcut);
    button->setToolTip(QStringLiteral("%1 (%2)").arg(text, shortcut.toString(QKeySequence::NativeText)));
}

/// The icon as it looks on a button in the accent colour, which is the same in every theme.
QIcon onAccent(const QIcon &icon)
{
    QIcon result;
    for (const int scale : {1, 2, 3})
        result.addPixmap(icon.pixmap(kToolbarIconSize * scale, QIcon::Normal, QIcon::On));
    return result;
}

QScreen *screenOf(const QWidget *window)
{
    QScreen *screen = QGuiApplication::screenAt(window->geometry().center());
    return screen ? screen : window->screen();
}

} // namespace

KvTemplatesEditorWindow::KvTemplatesEditorWindow(const QString &baseTitle, KvReportKernelData *kernelData,
                                                 QWidget *parent)
    : QMainWindow(parent, Qt::Window | Qt::FramelessWindowHint)
    , m_ui(std::make_unique<Ui::KvTemplatesEditorWindowUi>())
    , m_model(std::make_unique<KvTemplateModel>(nullptr, kernelData))
    , m_baseTitle(baseTitle)
{
    KvReportResources::ensure();
    setAttribute(Qt::WA_TranslucentBackground);
    setMouseTracking(true);
    m_ui->setupUi(this);
    setUpFrames();
    setUpToolbar();
    setUpPageControls();
    retranslate();
    m_model->setFactories(m_ui->toolsList);
    connectSignals();
    m_ui->pagedView->setModel(m_model.get());
    m_ui->pagedView->setFocus();
    restorePlace();
}

KvTemplatesEditorWindow::~KvTemplatesEditorWindow()
{
    // The base class hides the window when this part of it is gone.
    if (m_isShown)
        endLiveMode();
    // Whatever shows blocks goes before the blocks, and these before the palette, which owns their types.
    slotEditorSelectionChanged(nullptr);
    delete m_ui->pagedView;
    m_model.reset();
}

KvReportPagedView *KvTemplatesEditorWindow::pagedView() const
{
    return m_ui->pagedView;
}

KvEditorToolsList *KvTemplatesEditorWindow::toolsList() const
{
    return m_ui->toolsList;
}

void KvTemplatesEditorWindow::setUpFrames()
{
    m_ui->windowFrame->setLines(Qt::TopEdge | Qt::LeftEdge | Qt::RightEdge | Qt::BottomEdge);
    m_ui->toolbarFrame->setLines(Qt::BottomEdge);
    m_ui->sideScrollContents->setColorName("panel");
    m_ui->sideScrollArea->setFixedWidth(kSidePanelWidth);
    m_ui->sideLayout->setAlignment(Qt::AlignTop);
    m_ui->toolsLayout->setAlignment(Qt::AlignTop);
    m_ui->nodeOptionsLayout->setAlignment(Qt::AlignTop);
    QFont headerFont = m_ui->sideHeader->font();
    headerFont.setPixelSize(kSideHeaderPixelSize);
    m_ui->sideHeader->setFont(headerFont);
    // The label may become lower than its text; where the panel is scrolled its row does not.
    m_ui->sideHeaderLayout->addStrut(m_ui->sideHeader->sizeHint().height());
}

void KvTemplatesEditorWindow::setUpToolbar()
{
    const auto setIcon = [](QPushButton *button, const QString &path) {
        button->setIconSize(kToolbarIconSize);
        button->setIcon(acss::createIcon(kIconMode, path, kToolbarIconSize));
        button->setAutoDefault(false);
    };
    setIcon(m_ui->openButton, QStringLiteral("Icons/open"));
    setIcon(m_ui->clearButton, QStringLiteral("Icons/clear"));
    setIcon(m_ui->saveAsButton, QStringLiteral("Icons/save-as"));
    setIcon(m_ui->saveButton, QStringLiteral("Icons/save"));
    setIcon(m_ui->printButton, QStringLiteral("Icons/print"));
    m_ui->printButton->setIcon(onAccent(m_ui->printButton->icon()));
}

void KvTemplatesEditorWindow::setUpPageControls()
{
    const auto addButton = [this](const QString &name, const QString &iconPath) {
        auto *button = new QPushButton(m_ui->pageControlsFrame);
        button->setObjectName(name);
        button->setCheckable(true);
        button->setIconSize(kPageControlIconSize);
        button->setIcon(acss::createIcon(kIconMode, iconPath, kPageControlIconSize));
        m_ui->pageControlsFrame->addWidget(button);
        return button;
    };
    m_headerButton = addButton(QStringLiteral("headerButton"), QStringLiteral("Icons/IconHeader.svg"));
    m_footerButton = addButton(QStringLiteral("footerButton"), QStringLiteral("Icons/IconFooter.svg"));
    m_pageNumberButton =
        addButton(QStringLiteral("pageNumberButton"), QStringLiteral("Icons/IconPageNumber.svg"));
}

void KvTemplatesEditorWindow::setUpTabOrder()
{
    QVector<QWidget *> order{m_ui->openButton, m_ui->clearButton, m_ui->saveAsButton, m_ui->saveButton,
                             m_ui->printButton};
    for (KvEditorPaletteRow *row : m_ui->toolsList->findChildren<KvEditorPaletteRow *>())
        order.append(row);
    order += {m_headerButton, m_footerButton, m_pageNumberButton, m_ui->pagedView, m_ui->titleBar};
    for (int i = 1; i < order.size(); ++i)
        setTabOrder(order.at(i - 1), order.at(i));
}

void KvTemplatesEditorWindow::moveOptionsInTabOrder(const QWidget *options)
{
    QWidget *last = nullptr;
    for (QWidget *control : options->findChildren<QWidget *>()) {
        if (control->focusPolicy() & Qt::TabFocus && !control->focusProxy())
            last = control;
    }
    if (!last)
        return;
    // New widgets come last: what shall follow them moves behind them.
    setTabOrder(last, m_ui->pagedView);
    setTabOrder(m_ui->pagedView, m_ui->titleBar);
}

void KvTemplatesEditorWindow::retranslate()
{
    m_ui->retranslateUi(this);
    explain(m_ui->openButton, tr("Open a template file"), Qt::CTRL + Qt::Key_O);
    explain(m_ui->clearButton, tr("Start a new, empty template"), Qt::CTRL + Qt::Key_N);
    explain(m_ui->saveAsButton, tr("Save the template to another file"), Qt::CTRL + Qt::SHIFT + Qt::Key_S);
    explain(m_ui->saveButton, tr("Save the template"), Qt::CTRL + Qt::Key_S);
    explain(m_ui->printButton, tr("Print the report to a PDF file"), Qt::CTRL + Qt::Key_P);
    const auto name = [](QPushButton *button, const QString &text) {
        button->setToolTip(text);
        button->setAccessibleName(text);
    };
    name(m_headerButton, tr("Header on every page"));
    name(m_footerButton, tr("Footer on every page"));
    name(m_pageNumberButton, tr("Page numbers"));
    m_ui->pagedView->setAccessibleName(tr("Report pages"));
    m_ui->toolsList->setAccessibleName(tr("Blocks to add"));
    slotTemplateStatusChanged(m_model->filePath(), m_model->isModified());
}

void KvTemplatesEditorWindow::connectSignals()
{
    connect(m_ui->titleBar, SIGNAL(closeClicked()), this, SLOT(close()));
    connect(m_ui->openButton, SIGNAL(clicked(bool)), this, SLOT(slotOpenTemplate()));
    connect(m_ui->clearButton, SIGNAL(clicked(bool)), this, SLOT(slotNewTemplate()));
    connect(m_ui->saveAsButton, SIGNAL(clicked(bool)), this, SLOT(slotSaveTemplateAs()));
    connect(m_ui->saveButton, SIGNAL(clicked(bool)), this, SLOT(slotSaveTemplate()));
    connect(m_ui->printButton, SIGNAL(clicked(bool)), this, SLOT(slotPrintReport()));
    connect(m_headerButton, SIGNAL(clicked(bool)), this, SLOT(slotHeaderButtonClicked(bool)));
    connect(m_footerButton, SIGNAL(clicked(bool)), this, SLOT(slotFooterButtonClicked(bool)));
    connect(m_pageNumberButton, SIGNAL(clicked(bool)), this, SLOT(slotPageNumberButtonClicked(bool)));
    connect(m_ui->toolsList, SIGNAL(signalToolActivated(QString)), this, SLOT(slotToolActivated(QString)));
    connect(m_ui->pagedView, SIGNAL(signalSelectionChanged(KvBaseDisplayWidget*)), this,
                                    SLOT(slotEditorSelectionChanged(KvBaseDisplayWidget*)));
    KvTemplateModel *model = m_model.get();
    connect(model, SIGNAL(signalTemplateStatusChanged(QString,bool)), this,
                          SLOT(slotTemplateStatusChanged(QString,bool)));
    connect(model, SIGNAL(signalHeaderStateChanged(bool)), this, SLOT(slotHeaderStateChanged(bool)));
    connect(model, SIGNAL(signalFooterStateChanged(bool)), this, SLOT(slotFooterStateChanged(bool)));
    connect(model, SIGNAL(signalPageNumberingStateChanged(bool)), this,
                          SLOT(slotPageNumberingStateChanged(bool)));
    connect(model, SIGNAL(signalListChanged()), this, SLOT(slotListChanged()));
}

void KvTemplatesEditorWindow::restorePlace()
{
    ZtAppSettings::beginGroupAbsolute(kSettingsGroup);
    const QByteArray stored = ZtAppSettings::value(kGeometryKey).toByteArray();
    ZtAppSettings::endGroup();
    const bool isRestored = !stored.isEmpty() && restoreGeometry(stored);
    setFixedWidth(FixedWidth);
    if (!isRestored) {
        const QRect available = screenOf(this)->availableGeometry();
        const int left = available.left() + (available.width() - FixedWidth) / 2;
        setGeometry(QRect(QPoint(std::max(left, available.left()), available.top()), size()));
    }
    stretchToScreen();
}

void KvTemplatesEditorWindow::stretchToScreen()
{
    const QRect available = screenOf(this)->availableGeometry();
    QRect place = geometry();
    place.setBottom(available.bottom());
    // The top gives way to a window that would become too low, but not beyond the screen's.
    if (place.height() < minimumHeight())
        place.setTop(std::max(place.bottom() + 1 - minimumHeight(), available.top()));
    setGeometry(place);
}

void KvTemplatesEditorWindow::setBaseTitle(const QString &baseTitle)
{
    m_baseTitle = baseTitle;
    slotTemplateStatusChanged(m_model->filePath(), m_model->isModified());
}

QMessageBox::StandardButton KvTemplatesEditorWindow::askAboutChanges(QMessageBox::StandardButtons buttons)
{
    QMessageBox box(QMessageBox::Question, tr("Are you sure?"),
                    tr("The template is modified, do you want to save it first?"), buttons, this);
    return static_cast<QMessageBox::StandardButton>(box.exec());
}

bool KvTemplatesEditorWindow::mayDiscardChanges()
{
    if (!m_model->isModified())
        return true;
    return askAboutChanges(QMessageBox::Yes | QMessageBox::No) != QMessageBox::Yes || slotSaveTemplate();
}

bool KvTemplatesEditorWindow::mayClose()
{
    if (!m_model->isModified())
        return true;
    QMessageBox::StandardButtons buttons = QMessageBox::Yes | QMessageBox::No;
    if (m_closeCancellable)
        buttons |= QMessageBox::Cancel;
    const QMessageBox::StandardButton answer = askAboutChanges(buttons);
    if (answer == QMessageBox::Yes)
        return slotSaveTemplate();
    return answer != QMessageBox::Cancel;
}

void KvTemplatesEditorWindow::slotNewTemplate()
{
    if (mayDiscardChanges())
        m_model->newTemplate();
}

void KvTemplatesEditorWindow::slotOpenTemplate()
{
    if (!mayDiscardChanges())
        return;
    const QString path = KvFileDialogs::openFileName(
        this, {tr("Choose file to open"), templatesDirectory(), templateFileFilter(), QString(), QString()});
    if (path.isEmpty())
        return;
    setTemplatesDirectory(QFileInfo(path).absolutePath());
    m_model->load(path);
}

bool KvTemplatesEditorWindow::openTemplateFile(const QString &path)
{
    return mayClose() && m_model->load(path);
}

bool KvTemplatesEditorWindow::slotSaveTemplate()
{
    QString suggested = QFileInfo(m_model->filePath()).fileName();
    // The dialog asks about replacing the file that is suggested; "a.b.rtp" would be written as
    // "a.b.rtp.rtp".
    const QString ending = QLatin1Char('.') + templateFileSuffix();
    if (QFileInfo(suggested).completeSuffix() != templateFileSuffix() && suggested.endsWith(ending))
        suggested.chop(ending.size());
    const QString path =
        KvFileDialogs::saveFileName(this, {tr("Choose file to save"), templatesDirectory(),
                                           templateFileFilter(), templateFileSuffix(), suggested});
    if (path.isEmpty())
        return false;
    setTemplatesDirectory(QFileInfo(path).absolutePath());
    return m_model->save(path);
}

bool KvTemplatesEditorWindow::slotSaveTemplateAs()
{
    return slotSaveTemplate();
}

void KvTemplatesEditorWindow::slotPrintReport()
{
    const QString fileName =
        KvFileDialogs::saveFileName(this, {tr("Choose file to print to"), printDirectory(),
                                           tr("Pdf file (*.pdf)"), QStringLiteral("pdf"), QString()});
    if (fileName.isEmpty())
        return;
    setPrintDirectory(QFileInfo(fileName).absolutePath());
    const bool switchLiveMode = !m_isShown;
    if (switchLiveMode)
        m_model->beginLiveUpdates();
    printTo(fileName);
    if (switchLiveMode)
        m_model->endLiveUpdates();
}

void KvTemplatesEditorWindow::printTo(const QString &fileName)
{
    bool isCancelled = false;
    bool isDone = false;
    {
        KvPrintProgressDialog progress(this);
        isDone = m_model->print(fileName, &progress) != 0;
        isCancelled = progress.isCancelled();
    }
    // The blocks' widgets were on the printer's pages. Before any message, which would stand over empty ones.
    if (isVisible())
        m_model->notifyListChanged();
    // Whoever cancels the last page when it is written has a report.
    if (isDone)
        return;
    if (!isCancelled)
        tellPrintFailed(fileName);
}

void KvTemplatesEditorWindow::tellPrintFailed(const QString &fileName)
{
    QMessageBox box(QMessageBox::Critical, tr("Save failed"),
                    tr("Cannot write to file %1").arg(ZtLeftToRight::isolated(fileName)), QMessageBox::Ok,
                    this);
    // File names may look like markup.
    box.setTextFormat(Qt::PlainText);
    box.exec();
}

void KvTemplatesEditorWindow::slotTemplateStatusChanged(const QString &aPath, bool aModified)
{
    const QString title = m_baseTitle + QStringLiteral(" - ") +
                          (aModified ? QStringLiteral("*") : QString()) +
                          (aPath.isEmpty() ? tr("[new]") : ZtLeftToRight::isolated(aPath));
    setWindowTitle(title);
    m_ui->titleBar->setTitle(title);
}

void KvTemplatesEditorWindow::slotEditorSelectionChanged(KvBaseDisplayWidget *aSelectedWidget)
{
    // At once: a panel commits its text when it dies, and what follows may be writing the file.
    qDeleteAll(m_ui->nodeOptionsFrame->findChildren<QWidget *>(QString(), Qt::FindDirectChildrenOnly));
    QWidget *options =
        aSelectedWidget ? aSelectedWidget->createOptionsWidget(m_ui->nodeOptionsFrame, true) : nullptr;
    if (!options)
        return;
    m_ui->nodeOptionsLayout->addWidget(options);
    moveOptionsInTabOrder(options);
}

void KvTemplatesEditorWindow::slotHeaderButtonClicked(bool aChecked)
{
    m_model->setHeaderEnabled(aChecked);
}

void KvTemplatesEditorWindow::slotFooterButtonClicked(bool aChecked)
{
    m_model->setFooterEnabled(aChecked);
}

void KvTemplatesEditorWindow::slotPageNumberButtonClicked(bool aChecked)
{
    m_model->setPageNumberingEnabled(aChecked);
}

void KvTemplatesEditorWindow::slotHeaderStateChanged(bool aEnabled)
{
    m_headerButton->setChecked(aEnabled);
}

void KvTemplatesEditorWindow::slotFooterStateChanged(bool aEnabled)
{
    m_footerButton->setChecked(aEnabled);
}

void KvTemplatesEditorWindow::slotPageNumberingStateChanged(bool aEnabled)
{
    m_pageNumberButton->setChecked(aEnabled);
}

void KvTemplatesEditorWindow::slotListChanged()
{
    m_ui->emptyHint->setVisible(m_model->nodeCount() == 0);
}

void KvTemplatesEditorWindow::slotToolActivated(const QString &aTypeName)
{
    KvReportNode *node = m_model->createNode(aTypeName, -1);
    if (!node)
        return;
    m_ui->pagedView->selectNode(node);
    if (const KvReportProxyWidgetItem *item = m_ui->pagedView->selectedItem())
        m_ui->pagedView->ensureVisible(item);
}

bool KvTemplatesEditorWindow::event(QEvent *event)
{
    // Before it is shown for the first time; by then the palette is filled.
    if (event->type() == QEvent::Polish)
        setUpTabOrder();
    return QMainWindow::event(event);
}

void KvTemplatesEditorWindow::showEvent(QShowEvent *event)
{
    QMainWindow::showEvent(event);
    if (m_isShown)
        return;
    m_isShown = true;
    m_model->beginLiveUpdates();
    const int screenTop = screenOf(this)->geometry().top();
    if (frameGeometry().top() < screenTop)
        move(x(), screenTop + kTopAfterRescue);
}

void KvTemplatesEditorWindow::hideEvent(QHideEvent *event)
{
    QMainWindow::hideEvent(event);
    if (m_isShown)
        endLiveMode();
}

void KvTemplatesEditorWindow::endLiveMode()
{
    m_isShown = false;
    m_model->endLiveUpdates();
}

void KvTemplatesEditorWindow::closeEvent(QCloseEvent *event)
{
    saveGeometryToSettings();
    if (!mayClose()) {
        event->ignore();
        return;
    }
    event->accept();
    emit editorClosed();
}

void KvTemplatesEditorWindow::saveGeometryToSettings() const
{
    ZtAppSettings::beginGroupAbsolute(kSettingsGroup);
    ZtAppSettings::setValue(kGeometryKey, saveGeometry());
    ZtAppSettings::endGroup();
}

void KvTemplatesEditorWindow::keyPressEvent(QKeyEvent *event)
{
    // Keys come here when nothing that has the keyboard wants them: a text that is edited keeps its Delete.
    if (event->key() == Qt::Key_Delete && !m_ui->pagedView->isEditingText())
        m_ui->pagedView->slotDeleteButtonClicked();
    else if (event->key() == Qt::Key_Escape)
        m_ui->pagedView->slotCloseAllEditors();
    else
        QMainWindow::keyPressEvent(event);
}

void KvTemplatesEditorWindow::changeEvent(QEvent *event)
{
    QMainWindow::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        retranslate();
}
