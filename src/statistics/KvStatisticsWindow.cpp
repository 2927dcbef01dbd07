// SPDX-License-Identifier: MIT
#include "statistics/KvStatisticsWindow.h"

#include "blocks/KvReportBlocks.h"
#include "data/KvReportKernelData.h"
#include "kernel/ZtAppSettings.h"
#include "report/KvBaseDisplayWidget.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "templates/KvBaseEditorNodeCfg.h"
#include "templates/KvBaseEditorNodeFactory.h"
#include "templates/KvBlockRegistry.h"
#include "ui_KvStatisticsWindowUi.h"
#include "widgets/KvStatisticsToolIconButton.h"
#include "widgets/KvWindowTitleBar.h"

#include <QCloseEvent>
#include <QDataStream>
#include <QJsonDocument>
#include <QJsonObject>
#include <QLabel>
#include <QMouseEvent>

#include <algorithm>
#include <utility>

namespace {

constexpr int kEdge = 3;           ///< pixels at the bottom that take hold of the edge
constexpr int kTopOnScreen = 30;   ///< y of a window that would start above the screen
constexpr int kTitleBarHeight = 5; ///< least height in pixels; the top bar around it gives it more

const QString kGeometryGroup = QStringLiteral("StatisticsWindow");
const QString kGeometryKey = QStringLiteral("geometry");
const QString kConfigGroup = QStringLiteral("Statistics");

struct ToolType
{
    const char *blockType;
    const char *settingsKey;
    const char *iconPath;
    const char *clickedSlot;
};

/// In the order of KvStatisticsWindow::Tool.
const ToolType kToolTypes[] = {
    {"Statistics Table", "StatsTableNodeCfg", "Icons/ToolIconTable.svg", SLOT(slotToolsTableClicked())},
     {"Counters", "CounterPieNodeCfg", "Icons/ToolIconPie.svg", SLOT(slotToolsCounterPieClicked())},
      {"MinMedMaxBox", "MinMedMaxBoxNodeCfg", "Icons/ToolIconMinMax.svg",
       SLOT(slotToolsMinMedMaxBoxClicked())},
       {"Trend", "TrendNodeCfg", "Icons/ToolIconTrend.svg", SLOT(slotToolsTrendClicked())},
};

std::unique_ptr<KvBlockRegistry> reportBlocks()
{
    auto blocks = std::make_unique<KvBlockTypeList>();
    registerReportBlocks(*blocks);
    return blocks;
}

void clearLayout(QLayout *layout)
{
    while (QLayoutItem *item = layout->takeAt(0)) {
        delete item->widget();
        delete item;
    }
}

/// Whether the top of the frame was above the screen when QWidget::saveGeometry() wrote \a geometry: magic
/// number, two version numbers, frame. Restoring moves such a window by itself, so that it shows no more
/// afterwards.
bool wasAboveScreen(const QByteArray &geometry)
{
    constexpr quint32 magicNumber = 0x1D9D0CB;
    QDataStream stream(geometry);
    stream.setVersion(QDataStream::Qt_4_0);
    quint32 magic = 0;
    quint16 version[2] = {};
    QRect frame;
    stream >> magic >> version[0] >> version[1] >> frame;
    return stream.status() == QDataStream::Ok && magic == magicNumber && frame.top() < 0;
}

QByteArray storedConfig(const char *key)
{
    ZtAppSettings::beginGroup(kConfigGroup);
    const QByteArray bytes = ZtAppSettings::value(QLatin1String(key)).toByteArray();
    ZtAppSettings::endGroup();
    return bytes;
}

} // namespace

KvStatisticsWindow::KvStatisticsWindow(KvReportKernelData *kernelData, QWidget *parent)
    : KvStatisticsWindow(reportBlocks(), kernelData, parent)
{}

KvStatisticsWindow::KvStatisticsWindow(std::unique_ptr<KvBlockRegistry> blocks,
                                       KvReportKernelData *kernelData, QWidget *parent)
    : QMainWindow(parent)
    , m_blocks(std::move(blocks))
    , m_ui(std::make_unique<Ui::KvStatisticsWindowUi>())
    , m_frameless(parent && parent->windowFlags().testFlag(Qt::FramelessWindowHint))
    , m_kernelData(kernelData)
{
    m_ui->setupUi(this);
    createFrame();
    createTools();
    createHint();
    restoreWindow();
}

KvStatisticsWindow::~KvStatisticsWindow()
{
    // No hide event reaches this class any more.
    setTracking(false);
    // Before the configurations that both talk to.
    removeBlock();
    clearLayout(m_ui->optionsLayout);
}

void KvStatisticsWindow::createFrame()
{
    const QString title = tr("Measurement statistics");
    setWindowTitle(title);
    m_ui->sideFrame->setBackgroundRole(QPalette::AlternateBase); // the theme's colour of panels
    m_ui->topBar->setVisible(m_frameless);
    if (!m_frameless)
        return;

    setWindowFlags(Qt::Window | Qt::FramelessWindowHint);
    setAttribute(Qt::WA_TranslucentBackground);
    setMouseTracking(true);
    m_ui->centralWidget->setMouseTracking(true);
    // A strip that no block covers, so that the edge can be grasped, in the colour of the window.
    m_ui->centralWidget->setAutoFillBackground(true);
    m_ui->centralLayout->setContentsMargins(0, 0, 0, kEdge);
    // What lies above the strip must not take over the window's resize cursor.
    m_ui->mainFrame->setCursor(Qt::ArrowCursor);

    auto *titleBar = new KvWindowTitleBar(m_ui->topBar);
    titleBar->setTitle(title);
    titleBar->setMinimumHeight(kTitleBarHeight);
    m_ui->topBarLayout->addWidget(titleBar);
    connect(titleBar, SIGNAL(closeClicked()), this, SLOT(close()));
}

void KvStatisticsWindow::createTools()
{
    m_ui->toolsLayout->setAlignment(Qt::AlignTop);
    for (int i = 0; i < ToolCount; ++i) {
        m_tools[static_cast<size_t>(i)].factory = m_blocks->find(QLatin1String(kToolTypes[i].blockType));
        if (m_tools[static_cast<size_t>(i)].factory)
            addToolButton(static_cast<Tool>(i));
    }
    // Not the close button, which comes first in the window.
    if (QLayoutItem *first = m_ui->toolsLayout->itemAt(0))
        first->widget()->setFocus();
}

void KvStatisticsWindow::addToolButton(Tool tool)
{
    ToolState &state = m_tools[tool];
    state.button = new KvStatisticsToolIconButton(QLatin1String(kToolTypes[tool].iconPath), m_ui->toolsFrame);
    state.button->setCheckable(true);
    state.button->setToolTip(state.factory->title());
    state.button->setAccessibleName(state.factory->title());
    m_ui->toolsLayout->addWidget(state.button);
    connect(state.button, SIGNAL(clicked(bool)), this, kToolTypes[tool].clickedSlot);
}

void KvStatisticsWindow::createHint()
{
    const bool hasTools = std::any_of(m_tools.cbegin(), m_tools.cend(),
                                      [](const ToolState &state) { return state.button != nullptr; });
    m_hint = new QLabel(hasTools ? tr("Choose a statistics view on the right.")
                                 : tr("No statistics blocks are installed."),
                        m_ui->mainFrame);
    m_hint->setProperty("caption", true);
    // In the cell of the display area, whose own layout holds nothing but the block.
    m_ui->mainLayout->addWidget(m_hint, 1, 0, Qt::AlignCenter);
}

void KvStatisticsWindow::restoreWindow()
{
    // Only now has the window its least size, below which a small screen would cut it.
    layout()->activate();
    ZtAppSettings::beginGroupAbsolute(kGeometryGroup);
    const QByteArray geometry = ZtAppSettings::value(kGeometryKey).toByteArray();
    ZtAppSettings::endGroup();
    if (!geometry.isNull())
        restoreGeometry(geometry);
    if (wasAboveScreen(geometry))
        move(pos().x(), kTopOnScreen);
    setFixedWidth(this->geometry().width());
}

void KvStatisticsWindow::slotToolsTableClicked()
{
    openTool(Table);
}

void KvStatisticsWindow::slotToolsCounterPieClicked()
{
    openTool(CounterPie);
}

void KvStatisticsWindow::slotToolsMinMedMaxBoxClicked()
{
    openTool(MinMedMaxBox);
}

void KvStatisticsWindow::slotToolsTrendClicked()
{
    openTool(Trend);
}

void KvStatisticsWindow::openTool(Tool tool)
{
    const ToolState &state = m_tools[tool];
    if (!state.factory)
        return;
    KvBaseEditorNodeCfg *cfg = configOf(tool);
    KvBaseDisplayWidget *display = state.factory->createDisplayWidget(m_ui->editWidgetFrame, cfg);
    if (display)
        showBlock(state.button, cfg, display);
    else
        state.button->setChecked(state.button == m_currentButton);
}

KvBaseEditorNodeCfg *KvStatisticsWindow::configOf(Tool tool)
{
    std::unique_ptr<KvBaseEditorNodeCfg> &cfg = m_tools[tool].cfg;
    if (!cfg)
        cfg = readConfig(tool);
    return cfg.get();
}

std::unique_ptr<KvBaseEditorNodeCfg> KvStatisticsWindow::readConfig(Tool tool) const
{
    KvBaseEditorNodeFactory *factory = m_tools[tool].factory;
    std::unique_ptr<KvBaseEditorNodeCfg> cfg(factory->createConfig(nullptr));
    const QJsonDocument stored = QJsonDocument::fromJson(storedConfig(kToolTypes[tool].settingsKey));
    // A refused object may have been read in part.
    if (stored.isObject() && !cfg->fromJson(stored.object()))
        cfg.reset(factory->createConfig(nullptr));
    return cfg;
}

void KvStatisticsWindow::showBlock(KvStatisticsToolIconButton *button, KvBaseEditorNodeCfg *cfg,
                                   KvBaseDisplayWidget *display)
{
    selectButton(button);
    removeBlock();
    m_currentCfg = cfg;
    m_displayWidget = display;
    connect(display->displaySignals(), &QObject::destroyed, this, &KvStatisticsWindow::forgetDisplayWidget);
    if (QWidget *widget = display->subWidgetAt(0))
        m_ui->editWidgetLayout->addWidget(widget);
    showOptions();
    connect(display->displaySignals(), SIGNAL(signalWidgetConfigChanged(const KvBaseEditorNodeCfg*)), this,
                                              SLOT(slotWidgetConfigChanged(const KvBaseEditorNodeCfg*)));
}

void KvStatisticsWindow::showOptions()
{
    clearLayout(m_ui->optionsLayout);
    if (QWidget *options = m_displayWidget->createOptionsWidget(nullptr, false))
        m_ui->optionsLayout->addWidget(options);
}

void KvStatisticsWindow::removeBlock()
{
    delete m_hint;
    m_hint = nullptr;
    delete m_displayWidget; // forgets itself
    m_currentCfg = nullptr;
    // Pieces that the block leaves to the event loop.
    clearLayout(m_ui->editWidgetLayout);
}

void KvStatisticsWindow::selectButton(KvStatisticsToolIconButton *button)
{
    if (m_currentButton)
        m_currentButton->setChecked(false);
    m_currentButton = button;
    m_currentButton->setChecked(true);
}

void KvStatisticsWindow::forgetDisplayWidget()
{
    m_displayWidget = nullptr;
}

void KvStatisticsWindow::slotWidgetConfigChanged(const KvBaseEditorNodeCfg *aCfg)
{
    const auto tool = std::find_if(m_tools.cbegin(), m_tools.cend(), [aCfg](const ToolState &state) {
        return aCfg && state.cfg.get() == aCfg;
    });
    if (tool == m_tools.cend())
        return;

    QJsonObject config;
    aCfg->toJson(config);
    const char *key = kToolTypes[std::distance(m_tools.cbegin(), tool)].settingsKey;
    ZtAppSettings::beginGroup(kConfigGroup);
    ZtAppSettings::setValue(QLatin1String(key), QJsonDocument(config).toJson(QJsonDocument::Compact));
    ZtAppSettings::endGroup();
}

void KvStatisticsWindow::setTracking(bool on)
{
    // Minimising sends show and hide events of its own, which must not count.
    if (on == m_shown)
        return;
    m_shown = on;
    if (m_kernelData)
        m_kernelData->setActive(on);
}

void KvStatisticsWindow::showEvent(QShowEvent *event)
{
    QMainWindow::showEvent(event);
    setTracking(true);
    if (frameGeometry().top() < 0)
        move(pos().x(), kTopOnScreen);
}

void KvStatisticsWindow::hideEvent(QHideEvent *event)
{
    QMainWindow::hideEvent(event);
    setTracking(false);
}

void KvStatisticsWindow::closeEvent(QCloseEvent *event)
{
    event->accept();
    ZtAppSettings::beginGroupAbsolute(kGeometryGroup);
    ZtAppSettings::setValue(kGeometryKey, saveGeometry());
    ZtAppSettings::endGroup();
    emit windowClosed();
}

bool KvStatisticsWindow::isOnBottomEdge(const QPoint &position) const
{
    return position.y() > height() - kEdge;
}

void KvStatisticsWindow::mousePressEvent(QMouseEvent *event)
{
    if (!m_frameless)
        return;
    m_dragging = isOnBottomEdge(event->pos());
    if (m_dragging)
        m_lastGlobalY = event->globalPos().y();
}

void KvStatisticsWindow::mouseMoveEvent(QMouseEvent *event)
{
    if (!m_frameless)
        return;
    if (m_dragging && event->buttons().testFlag(Qt::LeftButton))
        dragBottomEdge(event->globalPos().y());
    else if (!m_dragging && event->buttons() == Qt::NoButton && isOnBottomEdge(event->pos()))
        setCursor(Qt::SizeVerCursor);
    else if (!m_dragging && event->buttons() == Qt::NoButton)
        unsetCursor();
}

void KvStatisticsWindow::mouseReleaseEvent(QMouseEvent *event)
{
    Q_UNUSED(event)
    if (m_frameless)
        m_dragging = false;
}

void KvStatisticsWindow::dragBottomEdge(int globalY)
{
    const int wanted = height() + globalY - m_lastGlobalY;
    const int allowed = std::max(wanted, minimumHeight());
    // Where the height is clamped the mouse runs ahead; the edge waits until it comes back.
    m_lastGlobalY = globalY + (allowed - wanted);
    resize(width(), allowed);
}
