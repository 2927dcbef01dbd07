// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/KvReportBlocks.h"
#include "data/KvReportKernelData.h"
#include "kernel/ZtAppSettings.h"
#include "statistics/FakeStatisticsBlock.h"
#include "statistics/KvStatisticsWindow.h"
#include "support/FakeBlock.h"
#include "support/MetaMethods.h"
#include "templates/KvBlockRegistry.h"
#include "widgets/KvStatisticsToolIconButton.h"
#include "widgets/KvWindowTitleBar.h"

#include <QGridLayout>
#include <QJsonDocument>
#include <QMouseEvent>
#include <QSpinBox>
#include <qtestspontaneevent.h>

#include <memory>

namespace {

const QStringList blockNames{QStringLiteral("Statistics Table"), QStringLiteral("Counters"),
                             QStringLiteral("MinMedMaxBox"), QStringLiteral("Trend")};
const QStringList settingsKeys{QStringLiteral("StatsTableNodeCfg"), QStringLiteral("CounterPieNodeCfg"),
                               QStringLiteral("MinMedMaxBoxNodeCfg"), QStringLiteral("TrendNodeCfg")};
const char *const toolSlots[] = {"slotToolsTableClicked", "slotToolsCounterPieClicked",
                                 "slotToolsMinMedMaxBoxClicked", "slotToolsTrendClicked"};

void forgetSettings()
{
    for (const char *group : {"Statistics", "StatisticsWindow"}) {
        ZtAppSettings::beginGroup(QLatin1String(group));
        ZtAppSettings::remove(QString());
        ZtAppSettings::endGroup();
        ZtAppSettings::beginGroupAbsolute(QLatin1String(group));
        ZtAppSettings::remove(QString());
        ZtAppSettings::endGroup();
    }
}

void storeConfig(const QString &key, const QVariant &value)
{
    ZtAppSettings::beginGroup(QStringLiteral("Statistics"));
    ZtAppSettings::setValue(key, value);
    ZtAppSettings::endGroup();
}

QVariant storedConfig(const QString &key)
{
    ZtAppSettings::beginGroup(QStringLiteral("Statistics"));
    const QVariant value = ZtAppSettings::value(key);
    ZtAppSettings::endGroup();
    return value;
}

QVariant storedGeometry()
{
    ZtAppSettings::beginGroupAbsolute(QStringLiteral("StatisticsWindow"));
    const QVariant value = ZtAppSettings::value(QStringLiteral("geometry"));
    ZtAppSettings::endGroup();
    return value;
}

void storeGeometry(const QByteArray &geometry)
{
    ZtAppSettings::beginGroupAbsolute(QStringLiteral("StatisticsWindow"));
    ZtAppSettings::setValue(QStringLiteral("geometry"), geometry);
    ZtAppSettings::endGroup();
}

QList<KvStatisticsToolIconButton *> buttonsOf(const QWidget &window)
{
    QList<KvStatisticsToolIconButton *> buttons;
    const QLayout *layout = window.findChild<QFrame *>(QStringLiteral("toolsFrame"))->layout();
    for (int i = 0; i < layout->count(); ++i)
        buttons.append(qobject_cast<KvStatisticsToolIconButton *>(layout->itemAt(i)->widget()));
    return buttons;
}

QLabel *hintOf(const QWidget &window)
{
    const QList<QLabel *> labels = window.findChild<QFrame *>(QStringLiteral("mainFrame"))
                                       ->findChildren<QLabel *>(QString(), Qt::FindDirectChildrenOnly);
    return labels.value(0);
}

QWidget *onlyWidgetIn(const QWidget &window, const char *frame)
{
    const QLayout *layout = window.findChild<QFrame *>(QLatin1String(frame))->layout();
    return layout->count() == 1 ? layout->itemAt(0)->widget() : nullptr;
}

bool isEmptyFrame(const QWidget &window, const char *frame)
{
    return window.findChild<QFrame *>(QLatin1String(frame))->layout()->isEmpty();
}

void sendMouse(QWidget *window, QEvent::Type type, int y, int globalY, Qt::MouseButton button,
               Qt::MouseButtons buttons)
{
    QMouseEvent event(type, QPointF(50, y), QPointF(50, y), QPointF(50, globalY), button, buttons,
                      Qt::NoModifier);
    QCoreApplication::sendEvent(window, &event);
}

void press(QWidget *window, int y, int globalY)
{
    sendMouse(window, QEvent::MouseButtonPress, y, globalY, Qt::LeftButton, Qt::LeftButton);
}

void drag(QWidget *window, int globalY, Qt::MouseButtons buttons = Qt::LeftButton)
{
    sendMouse(window, QEvent::MouseMove, 100, globalY, Qt::NoButton, buttons);
}

void release(QWidget *window)
{
    sendMouse(window, QEvent::MouseButtonRelease, 100, 100, Qt::LeftButton, Qt::NoButton);
}

void hover(QWidget *window, int y)
{
    sendMouse(window, QEvent::MouseMove, y, y, Qt::NoButton, Qt::NoButton);
}

} // namespace

class KvStatisticsWindowTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void declaresItsSignalAndSlotsInOrder();
    void hasItsForm();
    void offersFourTools();
    void theFirstToolHasTheFocus();
    void offersOnlyTheBlocksThereAre();
    void saysThatThereIsNoBlock();
    void saysWhatToDoUntilABlockIsChosen();
    void offersTheBlocksOfReports();
    void showsTheBlocksOfReports();
    void showsABlock_data();
    void showsABlock();
    void showsOneBlockAtATime();
    void theSameToolShowsItsBlockAnew();
    void aBlockMayHaveNoOptions();
    void aBlockMayBeMissing();
    void aBlockMayBeNoWidget();
    void readsStoredConfigs_data();
    void readsStoredConfigs();
    void storesChangesAtOnce_data();
    void storesChangesAtOnce();
    void storesNoOtherConfig();
    void forgetsABlockThatIsDeletedElsewhere();
    void toolsWithoutABlockDoNothing();
    void tracksWhileItIsShown();
    void tracksOncePerShow();
    void endsTrackingWhenItDies();
    void thePanelDiesBeforeItsConfiguration();
    void outlivesTheData();
    void closingStoresTheGeometry();
    void restoresTheGeometry();
    void theWidthIsFixed_data();
    void theWidthIsFixed();
    void comesDownFromAboveTheScreen();
    void comesDownFromAboveTheScreenInTheNextRun();
    void followsTheFrameOfItsParent_data();
    void followsTheFrameOfItsParent();
    void theTitleBarCloses();
    void theBottomEdgeChangesTheCursor();
    void theBottomEdgeStartsADrag_data();
    void theBottomEdgeStartsADrag();
    void draggingStopsAtTheLeastHeight();
    void draggingTakesTheLeftButton();
    void aFramedWindowLeavesTheMouseAlone();

private:
    void makeWindow(const QStringList &names = blockNames, bool frameless = false);
    FakeStatisticsFactory *factory(int index) const { return m_factories.at(index); }
    FakeStatisticsCfg *configOf(int index) const { return factory(index)->display()->cfg(); }

    KvReportKernelData *m_kernelData = nullptr;
    QWidget *m_parent = nullptr;
    KvStatisticsWindow *m_window = nullptr; ///< of the parent
    QVector<FakeStatisticsFactory *> m_factories;
};

void KvStatisticsWindowTest::init()
{
    StatReportTest::init();
    forgetSettings();
    m_kernelData = new KvReportKernelData;
}

void KvStatisticsWindowTest::cleanup()
{
    delete m_parent;
    m_parent = nullptr;
    m_window = nullptr;
    delete m_kernelData;
    m_kernelData = nullptr;
    StatReportTest::cleanup();
}

void KvStatisticsWindowTest::makeWindow(const QStringList &names, bool frameless)
{
    delete m_parent;
    m_factories.clear();
    auto blocks = std::make_unique<KvBlockTypeList>();
    for (const QString &name : names) {
        auto factory = std::make_unique<FakeStatisticsFactory>(name);
        m_factories.append(factory.get());
        blocks->registerFactory(std::move(factory));
    }
    m_parent = new QWidget(nullptr, frameless ? Qt::Window | Qt::FramelessWindowHint : Qt::Window);
    m_window = new KvStatisticsWindow(std::move(blocks), m_kernelData, m_parent);
}

void KvStatisticsWindowTest::declaresItsSignalAndSlotsInOrder()
{
    const QMetaObject &metaObject = KvStatisticsWindow::staticMetaObject;
    QCOMPARE(ownMethods(metaObject, QMetaMethod::Signal), QStringList(QStringLiteral("windowClosed()")));
    QCOMPARE(ownMethods(metaObject, QMetaMethod::Slot),
             QStringList(
                 {QStringLiteral("slotToolsTableClicked()"), QStringLiteral("slotToolsCounterPieClicked()"),
                  QStringLiteral("slotToolsMinMedMaxBoxClicked()"), QStringLiteral("slotToolsTrendClicked()"),
                  QStringLiteral("slotWidgetConfigChanged(const KvBaseEditorNodeCfg*)")}));
}

void KvStatisticsWindowTest::hasItsForm()
{
    makeWindow();
    QCOMPARE(m_window->windowTitle(), QStringLiteral("Measurement statistics"));
    const auto *mainFrame = m_window->findChild<QFrame *>(QStringLiteral("mainFrame"));
    QVERIFY(m_window->centralWidget()->isAncestorOf(mainFrame));
    QCOMPARE(mainFrame->minimumSize(), QSize(1000, 500));
    QCOMPARE(mainFrame->maximumWidth(), 1000);
    QCOMPARE(mainFrame->frameShape(), QFrame::NoFrame);
    const auto *grid = qobject_cast<QGridLayout *>(mainFrame->layout());
    QVERIFY(grid);
    QCOMPARE(grid->horizontalSpacing(), 0);
    QCOMPARE(grid->verticalSpacing(), 0);
    QCOMPARE(grid->contentsMargins(), QMargins());

    QCOMPARE(m_window->findChild<QFrame *>(QStringLiteral("topBar"))->minimumHeight(), 40);
    const auto *sideFrame = m_window->findChild<QFrame *>(QStringLiteral("sideFrame"));
    QCOMPARE(sideFrame->minimumWidth(), 310);
    QCOMPARE(sideFrame->maximumWidth(), 310);
    const auto *toolsFrame = m_window->findChild<QFrame *>(QStringLiteral("toolsFrame"));
    QCOMPARE(toolsFrame->parentWidget(), sideFrame);
    const auto *tools = qobject_cast<QVBoxLayout *>(toolsFrame->layout());
    QVERIFY(tools);
    QCOMPARE(tools->spacing(), 8);
    QCOMPARE(tools->contentsMargins(), QMargins(6, 6, 6, 6));
    QCOMPARE(int(tools->alignment()), int(Qt::AlignTop));
    QVERIFY(m_window->findChild<QFrame *>(QStringLiteral("optionsFrame"))->parentWidget() == sideFrame);
}

void KvStatisticsWindowTest::offersFourTools()
{
    makeWindow();
    const QList<KvStatisticsToolIconButton *> buttons = buttonsOf(*m_window);
    QCOMPARE(buttons.size(), 4);
    const char *const icons[] = {"Icons/ToolIconTable.svg", "Icons/ToolIconPie.svg",
                                 "Icons/ToolIconMinMax.svg", "Icons/ToolIconTrend.svg"};
    for (int i = 0; i < 4; ++i) {
        const KvStatisticsToolIconButton *button = buttons.at(i);
        QVERIFY(button->isCheckable());
        QVERIFY(!button->isChecked());
        QCOMPARE(button->iconPath(), QLatin1String(icons[i]));
        QCOMPARE(button->toolTip(), blockNames.at(i) + QStringLiteral(" title"));
        QCOMPARE(button->accessibleName(), button->toolTip());
    }
}

void KvStatisticsWindowTest::theFirstToolHasTheFocus()
{
    makeWindow(blockNames, true);
    QCOMPARE(m_window->focusWidget(), buttonsOf(*m_window).at(0));
    for (int i = 1; i < 4; ++i)
        QCOMPARE(buttonsOf(*m_window).at(i - 1)->nextInFocusChain(), buttonsOf(*m_window).at(i));
}

void KvStatisticsWindowTest::offersOnlyTheBlocksThereAre()
{
    makeWindow({QStringLiteral("Trend"), QStringLiteral("Text Document"), QStringLiteral("Counters")});
    const QList<KvStatisticsToolIconButton *> buttons = buttonsOf(*m_window);
    QCOMPARE(buttons.size(), 2);
    QCOMPARE(buttons.at(0)->toolTip(), QStringLiteral("Counters title"));
    QCOMPARE(buttons.at(1)->toolTip(), QStringLiteral("Trend title"));
}

void KvStatisticsWindowTest::saysThatThereIsNoBlock()
{
    makeWindow({QStringLiteral("Text Document")});
    QVERIFY(buttonsOf(*m_window).isEmpty());
    QCOMPARE(hintOf(*m_window)->text(), QStringLiteral("No statistics blocks are installed."));
    QVERIFY(isEmptyFrame(*m_window, "editWidgetFrame"));
}

void KvStatisticsWindowTest::saysWhatToDoUntilABlockIsChosen()
{
    makeWindow();
    m_window->show();
    QCOMPARE(hintOf(*m_window)->text(), QStringLiteral("Choose a statistics view on the right."));
    QVERIFY(hintOf(*m_window)->isVisible());
    QVERIFY(isEmptyFrame(*m_window, "editWidgetFrame"));
    QVERIFY(isEmptyFrame(*m_window, "optionsFrame"));
    QTest::mouseClick(buttonsOf(*m_window).at(0), Qt::LeftButton);
    QVERIFY(!hintOf(*m_window));
}

void KvStatisticsWindowTest::offersTheBlocksOfReports()
{
    KvBlockTypeList blocks;
    registerReportBlocks(blocks);
    QStringList titles;
    for (const QString &name : blockNames) {
        if (const KvBaseEditorNodeFactory *factory = blocks.find(name))
            titles.append(factory->title());
    }
    const KvStatisticsWindow window(m_kernelData);
    QStringList toolTips;
    for (const KvStatisticsToolIconButton *button : buttonsOf(window))
        toolTips.append(button->toolTip());
    QCOMPARE(toolTips, titles);
    QCOMPARE(hintOf(window)->text(), titles.isEmpty()
                                         ? QStringLiteral("No statistics blocks are installed.")
                                         : QStringLiteral("Choose a statistics view on the right."));
}

/// The real blocks, each after each other one, with their panels and without a page.
void KvStatisticsWindowTest::showsTheBlocksOfReports()
{
    KvStatisticsWindow window(m_kernelData);
    window.show();
    const QList<KvStatisticsToolIconButton *> buttons = buttonsOf(window);
    for (KvStatisticsToolIconButton *first : buttons) {
        for (KvStatisticsToolIconButton *second : buttons) {
            first->click();
            second->click();
            QVERIFY(second->isChecked());
            QVERIFY(onlyWidgetIn(window, "editWidgetFrame"));
            const QWidget *options = onlyWidgetIn(window, "optionsFrame");
            QVERIFY(options);
            QVERIFY(!options->findChild<QSpinBox *>()); // the width is the window's
            QCoreApplication::processEvents();
        }
    }
    QCOMPARE(window.width(), 1000);
}

void KvStatisticsWindowTest::showsABlock_data()
{
    QTest::addColumn<int>("tool");
    QTest::addColumn<bool>("bySlot");
    for (int i = 0; i < 4; ++i) {
        QTest::addRow("%s, button", qPrintable(blockNames.at(i))) << i << false;
        QTest::addRow("%s, slot", qPrintable(blockNames.at(i))) << i << true;
    }
}

void KvStatisticsWindowTest::showsABlock()
{
    QFETCH(int, tool);
    QFETCH(bool, bySlot);
    makeWindow();
    m_window->show();
    if (bySlot)
        QVERIFY(QMetaObject::invokeMethod(m_window, toolSlots[tool]));
    else
        QTest::mouseClick(buttonsOf(*m_window).at(tool), Qt::LeftButton);
    for (int i = 0; i < 4; ++i) {
        QCOMPARE(buttonsOf(*m_window).at(i)->isChecked(), i == tool);
        QCOMPARE(factory(i)->displaysMade(), i == tool ? 1 : 0);
        QCOMPARE(factory(i)->configsMade(), i == tool ? 1 : 0);
    }
    FakeStatisticsDisplay *display = factory(tool)->display();
    QVERIFY(!display->cfg()->context());
    QCOMPARE(onlyWidgetIn(*m_window, "editWidgetFrame"), display);
    QTRY_VERIFY(display->isVisible());
    // On its own, without the rows for width and alignment.
    QCOMPARE(display->optionsRequests(), 1);
    QVERIFY(!display->optionsParent());
    QVERIFY(!display->withPlacement());
    QVERIFY(display->options());
    QCOMPARE(onlyWidgetIn(*m_window, "optionsFrame"), display->options());
    QTRY_VERIFY(display->options()->isVisible());
}

void KvStatisticsWindowTest::showsOneBlockAtATime()
{
    makeWindow();
    m_window->slotToolsTableClicked();
    const QPointer<FakeStatisticsDisplay> first = factory(0)->display();
    const QPointer<QWidget> firstOptions = first->options();
    m_window->slotToolsTrendClicked();
    QVERIFY(!first);
    QVERIFY(!firstOptions);
    QCOMPARE(onlyWidgetIn(*m_window, "editWidgetFrame"), factory(3)->display());
    QCOMPARE(onlyWidgetIn(*m_window, "optionsFrame"), factory(3)->display()->options());
    QVERIFY(!buttonsOf(*m_window).at(0)->isChecked());
    QVERIFY(buttonsOf(*m_window).at(3)->isChecked());
}

void KvStatisticsWindowTest::theSameToolShowsItsBlockAnew()
{
    makeWindow();
    m_window->slotToolsCounterPieClicked();
    const QPointer<FakeStatisticsDisplay> first = factory(1)->display();
    FakeStatisticsCfg *cfg = first->cfg();
    cfg->number = 99;
    QTest::mouseClick(buttonsOf(*m_window).at(1), Qt::LeftButton);
    QVERIFY(!first);
    QCOMPARE(factory(1)->displaysMade(), 2);
    QCOMPARE(factory(1)->configsMade(), 1);
    QCOMPARE(configOf(1), cfg);
    QCOMPARE(cfg->number, 99);
    QVERIFY(buttonsOf(*m_window).at(1)->isChecked());
    // Another block between does not change that.
    m_window->slotToolsTableClicked();
    m_window->slotToolsCounterPieClicked();
    QCOMPARE(configOf(1), cfg);
}

void KvStatisticsWindowTest::aBlockMayHaveNoOptions()
{
    makeWindow();
    m_window->slotToolsTableClicked();
    factory(1)->setWithoutOptions(true);
    m_window->slotToolsCounterPieClicked();
    QVERIFY(isEmptyFrame(*m_window, "optionsFrame"));
    QCOMPARE(onlyWidgetIn(*m_window, "editWidgetFrame"), factory(1)->display());
}

void KvStatisticsWindowTest::aBlockMayBeMissing()
{
    makeWindow();
    m_window->slotToolsTableClicked();
    factory(2)->setRefusing(true);
    QTest::mouseClick(buttonsOf(*m_window).at(2), Qt::LeftButton);
    QVERIFY(!buttonsOf(*m_window).at(2)->isChecked());
    QVERIFY(buttonsOf(*m_window).at(0)->isChecked());
    QCOMPARE(onlyWidgetIn(*m_window, "editWidgetFrame"), factory(0)->display());
}

/// Tables are objects that own their pieces.
void KvStatisticsWindowTest::aBlockMayBeNoWidget()
{
    const int before = FakePiece::alive();
    auto blocks = std::make_unique<KvBlockTypeList>();
    blocks->registerFactory(std::make_unique<FakeBlockFactory>(QStringLiteral("Statistics Table")));
    auto window = std::make_unique<KvStatisticsWindow>(std::move(blocks), m_kernelData);
    window->slotToolsTableClicked();
    QCOMPARE(FakePiece::alive(), before + 1);
    QVERIFY(onlyWidgetIn(*window, "editWidgetFrame"));
    window->slotToolsTableClicked();
    QCOMPARE(FakePiece::alive(), before + 1);
    window.reset();
    QCOMPARE(FakePiece::alive(), before);
}

void KvStatisticsWindowTest::readsStoredConfigs_data()
{
    QTest::addColumn<QVariant>("stored");
    QTest::addColumn<QString>("theme");
    QTest::addColumn<int>("number");
    const QString dark = QStringLiteral("Dark");
    const QString light = QStringLiteral("Light");
    QTest::newRow("none") << QVariant() << dark << 7;
    QTest::newRow("bytes") << QVariant(QByteArray(R"({"theme":"Light","number":3})")) << light << 3;
    QTest::newRow("text") << QVariant(QStringLiteral(R"({"theme":"Light","number":4})")) << light << 4;
    QTest::newRow("empty") << QVariant(QByteArray("")) << dark << 7;
    QTest::newRow("no JSON") << QVariant(QByteArray("{\"number\":")) << dark << 7;
    QTest::newRow("list") << QVariant(QByteArray("[{\"number\":3}]")) << dark << 7;
    QTest::newRow("number") << QVariant(3) << dark << 7;
    // The theme was read before the object was refused.
    QTest::newRow("incomplete") << QVariant(QByteArray(R"({"theme":"Light"})")) << dark << 7;
}

void KvStatisticsWindowTest::readsStoredConfigs()
{
    QFETCH(QVariant, stored);
    for (int tool = 0; tool < 4; ++tool) {
        forgetSettings();
        if (stored.isValid())
            storeConfig(settingsKeys.at(tool), stored);
        makeWindow();
        QVERIFY(QMetaObject::invokeMethod(m_window, toolSlots[tool]));
        QTEST(configOf(tool)->theme, "theme");
        QTEST(configOf(tool)->number, "number");
        QCOMPARE(storedConfig(settingsKeys.at(tool)), stored);
    }
}

void KvStatisticsWindowTest::storesChangesAtOnce_data()
{
    QTest::addColumn<int>("tool");
    for (int i = 0; i < 4; ++i)
        QTest::newRow(qPrintable(settingsKeys.at(i))) << i;
}

void KvStatisticsWindowTest::storesChangesAtOnce()
{
    QFETCH(int, tool);
    makeWindow();
    QVERIFY(QMetaObject::invokeMethod(m_window, toolSlots[tool]));
    factory(tool)->display()->changeNumber(42);
    for (int i = 0; i < 4; ++i) {
        const QVariant stored = storedConfig(settingsKeys.at(i));
        if (i != tool) {
            QVERIFY(!stored.isValid());
            continue;
        }
        QCOMPARE(stored.userType(), int(QMetaType::QByteArray));
        QCOMPARE(stored.toByteArray(), QByteArray(R"({"number":42,"theme":"Dark"})"));
    }
    // The next window starts with it.
    makeWindow();
    QVERIFY(QMetaObject::invokeMethod(m_window, toolSlots[tool]));
    QCOMPARE(configOf(tool)->number, 42);
}

void KvStatisticsWindowTest::storesNoOtherConfig()
{
    makeWindow();
    m_window->slotToolsTableClicked();
    const FakeStatisticsCfg other(nullptr);
    m_window->slotWidgetConfigChanged(&other);
    m_window->slotWidgetConfigChanged(nullptr);
    for (const QString &key : settingsKeys)
        QVERIFY(!storedConfig(key).isValid());
    // A block that is not shown any more is still the window's.
    FakeStatisticsCfg *cfg = configOf(0);
    m_window->slotToolsTrendClicked();
    m_window->slotWidgetConfigChanged(cfg);
    QVERIFY(storedConfig(settingsKeys.at(0)).isValid());
}

void KvStatisticsWindowTest::forgetsABlockThatIsDeletedElsewhere()
{
    makeWindow();
    m_window->slotToolsTableClicked();
    delete factory(0)->display();
    QVERIFY(isEmptyFrame(*m_window, "editWidgetFrame"));
    m_window->slotToolsTrendClicked();
    QCOMPARE(onlyWidgetIn(*m_window, "editWidgetFrame"), factory(3)->display());
    delete factory(3)->display();
    delete m_window;
    m_window = nullptr;
}

void KvStatisticsWindowTest::toolsWithoutABlockDoNothing()
{
    makeWindow({QStringLiteral("Trend")});
    m_window->slotToolsTableClicked();
    m_window->slotToolsCounterPieClicked();
    m_window->slotToolsMinMedMaxBoxClicked();
    QVERIFY(isEmptyFrame(*m_window, "editWidgetFrame"));
    QVERIFY(hintOf(*m_window));
}

void KvStatisticsWindowTest::tracksWhileItIsShown()
{
    makeWindow();
    QVERIFY(!m_kernelData->isActive());
    m_window->show();
    QVERIFY(m_kernelData->isActive());
    m_window->hide();
    QVERIFY(!m_kernelData->isActive());
    // Another view keeps its own count.
    m_kernelData->setActive(true);
    m_window->show();
    m_window->close();
    QVERIFY(m_kernelData->isActive());
    m_kernelData->setActive(false);
    QVERIFY(!m_kernelData->isActive());
}

void KvStatisticsWindowTest::tracksOncePerShow()
{
    makeWindow();
    m_kernelData->setActive(true);
    m_window->show();
    for (int i = 0; i < 2; ++i) { // minimised, as the window system tells it
        QHideEvent hidden;
        QSpontaneKeyEvent::setSpontaneous(&hidden);
        qApp->notify(m_window, &hidden);
    }
    QVERIFY(m_kernelData->isActive());
    for (int i = 0; i < 2; ++i) {
        QShowEvent shown;
        QSpontaneKeyEvent::setSpontaneous(&shown);
        qApp->notify(m_window, &shown);
    }
    m_window->hide();
    m_kernelData->setActive(false);
    QVERIFY(!m_kernelData->isActive());
}

void KvStatisticsWindowTest::endsTrackingWhenItDies()
{
    makeWindow();
    m_window->show();
    m_window->slotToolsTableClicked();
    delete m_window;
    m_window = nullptr;
    QVERIFY(!m_kernelData->isActive());
    m_kernelData->setActive(true);
    m_kernelData->setActive(false);
    QVERIFY(!m_kernelData->isActive());
}

/// Panels talk to the configuration to their end.
void KvStatisticsWindowTest::thePanelDiesBeforeItsConfiguration()
{
    makeWindow();
    m_window->slotToolsTableClicked();
    const QPointer<FakeStatisticsCfg> cfg = configOf(0);
    bool isTooLate = true;
    connect(factory(0)->display()->options(), &QObject::destroyed, this,
            [&cfg, &isTooLate]() { isTooLate = !cfg; });
    delete m_window;
    m_window = nullptr;
    QVERIFY(!cfg);
    QVERIFY(!isTooLate);
}

void KvStatisticsWindowTest::outlivesTheData()
{
    makeWindow();
    m_window->show();
    m_window->slotToolsTableClicked();
    delete m_kernelData;
    m_kernelData = nullptr;
    m_window->hide();
    m_window->show();
    QVERIFY(m_window->isVisible());
}

void KvStatisticsWindowTest::closingStoresTheGeometry()
{
    makeWindow();
    QSignalSpy closed(m_window, SIGNAL(windowClosed()));
    const QPointer<KvStatisticsWindow> window = m_window;
    m_window->show();
    QVERIFY(!storedGeometry().isValid());
    m_window->hide();
    QCOMPARE(closed.count(), 0);
    m_window->show();
    QByteArray seen;
    connect(m_window, &KvStatisticsWindow::windowClosed, m_window,
            [&seen]() { seen = storedGeometry().toByteArray(); });
    QVERIFY(m_window->close());
    QCOMPARE(closed.count(), 1);
    QVERIFY(!m_window->isVisible());
    QVERIFY(!seen.isEmpty()); // before the signal
    QCOMPARE(storedGeometry().userType(), int(QMetaType::QByteArray));
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QVERIFY(window);
}

void KvStatisticsWindowTest::restoresTheGeometry()
{
    makeWindow();
    m_window->show();
    m_window->move(60, 50);
    m_window->resize(m_window->width(), 520);
    const QRect geometry = m_window->geometry();
    m_window->close();
    makeWindow();
    QCOMPARE(m_window->geometry().height(), 520);
    m_window->show();
    QCOMPARE(m_window->geometry(), geometry);
}

void KvStatisticsWindowTest::theWidthIsFixed_data()
{
    QTest::addColumn<int>("storedWidth");
    QTest::addColumn<int>("width");
    QTest::newRow("nothing stored") << 0 << 1000;
    QTest::newRow("as stored by itself") << 1000 << 1000;
    QTest::newRow("stored on a narrow screen") << 300 << 1000;
}

void KvStatisticsWindowTest::theWidthIsFixed()
{
    QFETCH(int, storedWidth);
    QFETCH(int, width);
    if (storedWidth > 0) {
        QWidget other;
        other.setGeometry(10, 40, storedWidth, 520);
        storeGeometry(other.saveGeometry());
    }
    makeWindow();
    QCOMPARE(m_window->minimumWidth(), width);
    QCOMPARE(m_window->maximumWidth(), width);
    m_window->show();
    QCOMPARE(m_window->width(), width);
    QCOMPARE(m_window->findChild<QFrame *>(QStringLiteral("mainFrame"))->width(), 1000);
}

void KvStatisticsWindowTest::comesDownFromAboveTheScreen()
{
    makeWindow();
    m_window->show();
    m_window->hide();
    m_window->move(10, -100);
    m_window->show();
    QCOMPARE(m_window->frameGeometry().topLeft(), QPoint(10, 30));
    m_window->hide();
    m_window->move(10, 0);
    m_window->show();
    QCOMPARE(m_window->frameGeometry().top(), 0);
}

void KvStatisticsWindowTest::comesDownFromAboveTheScreenInTheNextRun()
{
    makeWindow();
    m_window->show();
    m_window->move(10, -100);
    m_window->close();
    makeWindow();
    m_window->show();
    QCOMPARE(m_window->frameGeometry().top(), 30);
}

void KvStatisticsWindowTest::followsTheFrameOfItsParent_data()
{
    QTest::addColumn<bool>("frameless");
    QTest::newRow("framed") << false;
    QTest::newRow("frameless") << true;
}

void KvStatisticsWindowTest::followsTheFrameOfItsParent()
{
    QFETCH(bool, frameless);
    makeWindow(blockNames, frameless);
    m_window->show();
    QVERIFY(m_window->isWindow());
    QCOMPARE(m_window->windowFlags().testFlag(Qt::FramelessWindowHint), frameless);
    QCOMPARE(m_window->testAttribute(Qt::WA_TranslucentBackground), frameless);
    const auto *topBar = m_window->findChild<QFrame *>(QStringLiteral("topBar"));
    const auto *titleBar = topBar->findChild<KvWindowTitleBar *>();
    QCOMPARE(titleBar != nullptr, frameless);
    QCOMPARE(topBar->isVisible(), frameless);
    QCOMPARE(m_window->windowTitle(), QStringLiteral("Measurement statistics"));
    if (!frameless)
        return;
    QCOMPARE(int(m_window->windowFlags()), int(Qt::Window | Qt::FramelessWindowHint));
    QCOMPARE(titleBar->title(), QStringLiteral("Measurement statistics"));
    QCOMPARE(titleBar->minimumHeight(), 5);
    QVERIFY(topBar->height() >= 40);
}

void KvStatisticsWindowTest::theTitleBarCloses()
{
    makeWindow(blockNames, true);
    m_window->show();
    QSignalSpy closed(m_window, SIGNAL(windowClosed()));
    QTest::mouseClick(m_window->findChild<KvWindowTitleBar *>()->findChild<QAbstractButton *>(),
                      Qt::LeftButton);
    QCOMPARE(closed.count(), 1);
    QVERIFY(!m_window->isVisible());
}

void KvStatisticsWindowTest::theBottomEdgeChangesTheCursor()
{
    makeWindow(blockNames, true);
    m_window->show();
    QVERIFY(m_window->hasMouseTracking());
    const int height = m_window->height();
    for (const int y : {height - 1, height - 2}) {
        hover(m_window, y);
        QCOMPARE(m_window->cursor().shape(), Qt::SizeVerCursor);
        hover(m_window, height - 10);
        QCOMPARE(m_window->cursor().shape(), Qt::ArrowCursor);
    }
    hover(m_window, height - 3);
    QCOMPARE(m_window->cursor().shape(), Qt::ArrowCursor);
    // A pressed button is somebody else's drag.
    sendMouse(m_window, QEvent::MouseMove, height - 1, 0, Qt::NoButton, Qt::RightButton);
    QCOMPARE(m_window->cursor().shape(), Qt::ArrowCursor);
}

void KvStatisticsWindowTest::theBottomEdgeStartsADrag_data()
{
    QTest::addColumn<int>("fromBottom");
    QTest::addColumn<bool>("drags");
    QTest::newRow("last row") << 1 << true;
    QTest::newRow("second to last") << 2 << true;
    QTest::newRow("above the edge") << 3 << false;
    QTest::newRow("inside") << 50 << false;
}

void KvStatisticsWindowTest::theBottomEdgeStartsADrag()
{
    QFETCH(int, fromBottom);
    QFETCH(bool, drags);
    makeWindow(blockNames, true);
    m_window->show();
    const QSize size = m_window->size();
    press(m_window, size.height() - fromBottom, 1000);
    drag(m_window, 1010);
    QCOMPARE(m_window->size(), size + QSize(0, drags ? 10 : 0));
    // From where the mouse was last, not from the press.
    drag(m_window, 1025);
    QCOMPARE(m_window->size(), size + QSize(0, drags ? 25 : 0));
    drag(m_window, 1020);
    QCOMPARE(m_window->size(), size + QSize(0, drags ? 20 : 0));
    release(m_window);
    drag(m_window, 1100);
    QCOMPARE(m_window->size(), size + QSize(0, drags ? 20 : 0));
}

void KvStatisticsWindowTest::draggingStopsAtTheLeastHeight()
{
    makeWindow(blockNames, true);
    m_window->show();
    const int least = m_window->minimumHeight();
    QVERIFY(least >= 500);
    m_window->resize(m_window->width(), least + 20);
    press(m_window, m_window->height() - 1, 1000);
    drag(m_window, 900);
    QCOMPARE(m_window->height(), least);
    // Back at the place where the limit was met: only from here on the edge follows again.
    drag(m_window, 980);
    QCOMPARE(m_window->height(), least);
    drag(m_window, 990);
    QCOMPARE(m_window->height(), least + 10);
    QCOMPARE(m_window->width(), m_window->minimumWidth());
}

void KvStatisticsWindowTest::draggingTakesTheLeftButton()
{
    makeWindow(blockNames, true);
    m_window->show();
    const QSize size = m_window->size();
    press(m_window, size.height() - 1, 1000);
    drag(m_window, 1010, Qt::RightButton);
    QCOMPARE(m_window->size(), size);
    drag(m_window, 1010, Qt::LeftButton | Qt::RightButton);
    QCOMPARE(m_window->size(), size + QSize(0, 10));
}

void KvStatisticsWindowTest::aFramedWindowLeavesTheMouseAlone()
{
    makeWindow();
    m_window->show();
    const QSize size = m_window->size();
    hover(m_window, size.height() - 1);
    QVERIFY(!m_window->testAttribute(Qt::WA_SetCursor));
    press(m_window, size.height() - 1, 1000);
    drag(m_window, 1010);
    QCOMPARE(m_window->size(), size);
    release(m_window);
}

STATREPORT_TEST_MAIN(KvStatisticsWindowTest)
#include "KvStatisticsWindowTest.moc"
