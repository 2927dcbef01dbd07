// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/KvReportBlocks.h"
#include "blocks/table/KvStatisticSubTable.h"
#include "blocks/table/KvStatisticsBaseTableWidgetModel.h"
#include "charts/common/KvStatisticsChartWidget.h"
#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"
#include "data/TableManipulator.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectDataDescr.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "report/KvReportNode.h"
#include "report/KvReportPagedView.h"
#include "statistics/KvStatisticsWindow.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvTemplateModel.h"

#include <QJsonDocument>
#include <QJsonObject>
#include <QRadioButton>

#include <memory>

namespace {

constexpr int lineType = 66653;
constexpr int counterType = 66741;
constexpr int lineCount = 50;
constexpr int counterCount = 3;

/** Counts how often the host is asked for a text, which happens once for each value in a rebuild. */
class CountingManipulator : public TableManipulator
{
public:
    using TableManipulator::TableManipulator;

    QString valueText(const QString &valueName, const ZtKernelObjectData *object) const override
    {
        ++textRequests;
        return TableManipulator::valueText(valueName, object);
    }

    mutable int textRequests = 0;
};

/** Lines and counters of two values each, registered for one test. */
class CountingHost
{
public:
    CountingHost()
    {
        m_lines =
            addType(lineType, QStringLiteral("Line"), {QStringLiteral("Length"), QStringLiteral("Width")});
        m_counters = addType(counterType, QStringLiteral("Counter"),
                             {QStringLiteral("Count"), QStringLiteral("Share")});
        m_counters->kinds = {{QStringLiteral("Count"), ZtGsManipulator::Count},
                             {QStringLiteral("Share"), ZtGsManipulator::Percentage}};
        const ZtKernelData::SignalBlocker blocker;
        for (int i = 0; i < lineCount; ++i)
            addLine(1000.0 + i);
        for (int i = 0; i < counterCount; ++i)
            addObject(counterType, {i + 1, 10.0 * i});
    }
    ~CountingHost()
    {
        const ZtKernelData::SignalBlocker blocker;
        m_kernel->unregisterType(lineType);
        m_kernel->unregisterType(counterType);
    }
    Q_DISABLE_COPY(CountingHost)

    int addLine(double length) { return addObject(lineType, {length, 2 * length}); }
    void removeLine(int id) { m_kernel->removeObject(lineType, id); }
    /** The program edits an object and tells of it. */
    void editLine(int id, double length)
    {
        auto *line = static_cast<TableObject *>(m_kernel->object(lineType, id));
        line->values = {length, 3 * length};
        m_kernel->notifyObjectChanged(lineType, id);
    }
    void editCounter(int id, int count)
    {
        auto *counter = static_cast<TableObject *>(m_kernel->object(counterType, id));
        counter->values = {count, 1.0};
        m_kernel->notifyObjectChanged(counterType, id);
    }

    int textRequests() const { return m_lines->textRequests + m_counters->textRequests; }
    static int valueCount() { return 2 * (lineCount + counterCount); }

private:
    CountingManipulator *addType(int type, const QString &name, const QStringList &valueNames)
    {
        auto manipulator = std::make_unique<CountingManipulator>(type, name, valueNames);
        CountingManipulator *const added = manipulator.get();
        m_kernel->registerType(type, std::move(manipulator),
                               std::make_unique<ZtKernelObjectDataDescr>(type, name));
        return added;
    }
    int addObject(int type, const QVector<QVariant> &values)
    {
        const QStringList texts{QStringLiteral("a"), QStringLiteral("b")};
        return m_kernel->addObject(type, std::make_unique<TableObject>(values, texts));
    }

    ZtKernelData *m_kernel = ZtKernelData::getInstance();
    CountingManipulator *m_lines = nullptr;
    CountingManipulator *m_counters = nullptr;
};

struct Tool
{
    const char *slot;
    const char *settingsKey;
};

const Tool tools[] = {{"slotToolsTableClicked", "StatsTableNodeCfg"},
                      {"slotToolsCounterPieClicked", "CounterPieNodeCfg"},
                      {"slotToolsMinMedMaxBoxClicked", "MinMedMaxBoxNodeCfg"},
                      {"slotToolsTrendClicked", "TrendNodeCfg"}};

const QStringList liveBlocks{QStringLiteral("Statistics Table"), QStringLiteral("Counters"),
                             QStringLiteral("MinMedMaxBox"), QStringLiteral("Trend"),
                             QStringLiteral("Measurement table")};

QVariant storedConfig(const char *key)
{
    ZtAppSettings::beginGroup(QStringLiteral("Statistics"));
    const QVariant value = ZtAppSettings::value(QLatin1String(key));
    ZtAppSettings::endGroup();
    return value;
}

void storeConfig(const char *key, const QByteArray &value)
{
    ZtAppSettings::beginGroup(QStringLiteral("Statistics"));
    ZtAppSettings::setValue(QLatin1String(key), value);
    ZtAppSettings::endGroup();
}

QRadioButton *radioButton(const QWidget &window, const QString &text)
{
    for (QRadioButton *button : window.findChildren<QRadioButton *>()) {
        if (button->text() == text)
            return button;
    }
    return nullptr;
}

} // namespace

/** The whole way from the host's announcements to the blocks on the screen, with the real adapter and engine.
 */
class LiveStatisticsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void aBurstRefreshesTheWindowOnce_data();
    void aBurstRefreshesTheWindowOnce();
    void aBurstRefreshesAReportOnce_data();
    void aBurstRefreshesAReportOnce();
    void changesDuringAnUpdateMakeOneMore();
    void theProgramRunsBetweenUpdates();
    void aHiddenWindowAsksTheHostNothing();
    void everyBlockKeepsItsOptions_data();
    void everyBlockKeepsItsOptions();
    void aConfigWithoutAllItsKeysIsRefusedWhole_data();
    void aConfigWithoutAllItsKeysIsRefusedWhole();

private:
    /** One turn of the event loop: \a changes announcements, after each of which the data is another. */
    void announceBurst(int changes);
    /** The next announcement of new records has come, and there is no other behind it. */
    bool isUpdatedOnce(QSignalSpy &updates) const;

    std::unique_ptr<CountingHost> m_host;
    std::unique_ptr<KvReportKernelData> m_kernelData;
};

void LiveStatisticsTest::init()
{
    StatReportTest::init();
    for (const Tool &tool : tools)
        storeConfig(tool.settingsKey, QByteArray());
    m_host = std::make_unique<CountingHost>();
    m_kernelData = std::make_unique<KvReportKernelData>();
    KvStatisticsEngine::instance().setKernelData(m_kernelData.get());
}

void LiveStatisticsTest::cleanup()
{
    KvStatisticsEngine::instance().setKernelData(nullptr);
    m_kernelData.reset();
    m_host.reset();
    StatReportTest::cleanup();
}

void LiveStatisticsTest::announceBurst(int changes)
{
    for (int i = 0; i < changes; ++i) {
        if (i % 10 == 8)
            m_host->removeLine(m_host->addLine(7.0));
        else if (i % 10 == 9)
            m_host->editCounter(1 + i % counterCount, 3 + i);
        else
            m_host->editLine(1 + i % lineCount, 5000.0 + i);
    }
}

bool LiveStatisticsTest::isUpdatedOnce(QSignalSpy &updates) const
{
    return updates.wait(10000) && updates.count() == 1 &&
           !updates.wait(static_cast<int>(10 * m_kernelData->refreshDelay()));
}

void LiveStatisticsTest::aBurstRefreshesTheWindowOnce_data()
{
    QTest::addColumn<int>("tool");
    QTest::addColumn<int>("changes");
    for (int tool = 0; tool < 4; ++tool) {
        for (const int changes : {10, 100, 10000})
            QTest::addRow("%s, %d changes", tools[tool].settingsKey, changes) << tool << changes;
    }
}

void LiveStatisticsTest::aBurstRefreshesTheWindowOnce()
{
    QFETCH(int, tool);
    QFETCH(int, changes);
    KvStatisticsWindow window(m_kernelData.get());
    QVERIFY(QMetaObject::invokeMethod(&window, tools[tool].slot));
    window.show();
    QVERIFY(QTest::qWaitForWindowExposed(&window));
    const auto *frame = window.findChild<QWidget *>(QStringLiteral("editWidgetFrame"));
    const auto *chart = frame->findChild<KvStatisticsChartWidget *>();
    const auto *table = frame->findChild<KvStatisticSubTable *>();
    QVERIFY((chart != nullptr) != (table != nullptr));
    const QImage before = window.grab().toImage();

    QSignalSpy updates(m_kernelData.get(), SIGNAL(signalMeasuredValuesChanged()));
    QSignalSpy regroupings(&KvStatisticsEngine::instance(), SIGNAL(signalMeasurementsListUpdated()));
    QSignalSpy refreshes(chart ? static_cast<const QObject *>(chart->displaySignals()) : table->model(),
                         chart ? SIGNAL(signalWidgetChanged()) : SIGNAL(modelReset()));
    const int requestsBefore = m_host->textRequests();
    announceBurst(changes);
    QCOMPARE(updates.count(), 0);
    QCOMPARE(m_host->textRequests(), requestsBefore);
    QVERIFY(isUpdatedOnce(updates));
    QCOMPARE(m_host->textRequests() - requestsBefore, CountingHost::valueCount());
    QCOMPARE(regroupings.count(), 1);
    QCOMPARE(refreshes.count(), 1);
    QVERIFY(window.grab().toImage() != before);
}

void LiveStatisticsTest::aBurstRefreshesAReportOnce_data()
{
    QTest::addColumn<int>("changes");
    for (const int changes : {10, 100, 10000})
        QTest::addRow("%d changes", changes) << changes;
}

void LiveStatisticsTest::aBurstRefreshesAReportOnce()
{
    QFETCH(int, changes);
    KvBlockTypeList blocks;
    registerReportBlocks(blocks);
    KvTemplateModel model(nullptr, m_kernelData.get());
    model.setFactories(&blocks);
    model.beginLiveUpdates();
    for (const QString &name : liveBlocks)
        QVERIFY(model.createNode(name, -1));
    KvReportPagedView view;
    view.setModel(&model);
    view.resize(1020, 900);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));

    std::vector<std::unique_ptr<QSignalSpy>> refreshes;
    std::vector<std::unique_ptr<QSignalSpy>> rebuilds;
    for (KvReportNode *node : model.nodes()) {
        const QObject *block = node->displayWidget()->displaySignals();
        refreshes.push_back(std::make_unique<QSignalSpy>(block, SIGNAL(signalWidgetChanged())));
        rebuilds.push_back(std::make_unique<QSignalSpy>(block, SIGNAL(signalSubWidgetsChanged())));
    }
    QSignalSpy updates(m_kernelData.get(), SIGNAL(signalMeasuredValuesChanged()));
    const int requestsBefore = m_host->textRequests();
    announceBurst(changes);
    QVERIFY(isUpdatedOnce(updates));
    QCOMPARE(m_host->textRequests() - requestsBefore, CountingHost::valueCount());
    for (int i = 0; i < liveBlocks.size(); ++i) {
        QCOMPARE(refreshes.at(static_cast<std::size_t>(i))->count(), 1);
        // As many rows as before, so the pages stay.
        QCOMPARE(rebuilds.at(static_cast<std::size_t>(i))->count(), 0);
    }
    model.endLiveUpdates();
}

/// As when a block's refresh makes the program edit objects.
void LiveStatisticsTest::changesDuringAnUpdateMakeOneMore()
{
    KvStatisticsWindow window(m_kernelData.get());
    window.slotToolsTableClicked();
    window.show();
    QSignalSpy updates(m_kernelData.get(), SIGNAL(signalMeasuredValuesChanged()));
    connect(m_kernelData.get(), &KvReportKernelData::signalMeasuredValuesChanged, &window,
            [this, &updates]() {
                if (updates.count() == 1)
                    announceBurst(100);
            });
    announceBurst(100);
    QTRY_COMPARE(updates.count(), 2);
    QVERIFY(!updates.wait(static_cast<int>(10 * m_kernelData->refreshDelay())));
    QCOMPARE(updates.count(), 2);
}

/// However long an update takes: after it the program has three times that long for everything else, up to a
/// limit.
void LiveStatisticsTest::theProgramRunsBetweenUpdates()
{
    constexpr int slowMs = 40;
    KvStatisticsWindow window(m_kernelData.get());
    window.slotToolsTrendClicked();
    window.show();
    QElapsedTimer sinceUpdate;
    QVector<qint64> pauses;
    const auto updateSlowly = [&sinceUpdate, &pauses]() {
        if (sinceUpdate.isValid())
            pauses.append(sinceUpdate.elapsed());
        QTest::qSleep(slowMs);
        sinceUpdate.start();
    };
    connect(m_kernelData.get(), &KvReportKernelData::signalMeasuredValuesChanged, &window, updateSlowly);
    QElapsedTimer clock;
    clock.start();
    while (pauses.size() < 4 && clock.elapsed() < 20000) {
        announceBurst(100);
        QTest::qWait(1);
    }
    QCOMPARE(pauses.size(), 4);
    // The first request came with the delay of an idle program; timers may be early by a twentieth.
    for (int i = 1; i < pauses.size(); ++i)
        QVERIFY2(pauses.at(i) >= 3 * slowMs * 9 / 10, qPrintable(QString::number(pauses.at(i))));
}

void LiveStatisticsTest::aHiddenWindowAsksTheHostNothing()
{
    KvStatisticsWindow window(m_kernelData.get());
    window.slotToolsTableClicked();
    window.show();
    window.hide();
    const int requestsBefore = m_host->textRequests();
    QSignalSpy updates(m_kernelData.get(), SIGNAL(signalMeasuredValuesChanged()));
    announceBurst(100);
    QVERIFY(!updates.wait(static_cast<int>(10 * m_kernelData->refreshDelay())));
    QCOMPARE(m_host->textRequests(), requestsBefore);
    // What changed meanwhile is there as soon as it is shown again.
    window.show();
    QCOMPARE(m_host->textRequests() - requestsBefore, CountingHost::valueCount());
    QCOMPARE(updates.count(), 1);
}

void LiveStatisticsTest::everyBlockKeepsItsOptions_data()
{
    QTest::addColumn<int>("tool");
    for (int tool = 0; tool < 4; ++tool)
        QTest::newRow(tools[tool].settingsKey) << tool;
}

void LiveStatisticsTest::everyBlockKeepsItsOptions()
{
    QFETCH(int, tool);
    {
        KvStatisticsWindow window(m_kernelData.get());
        QVERIFY(QMetaObject::invokeMethod(&window, tools[tool].slot));
        window.show();
        QVERIFY(storedConfig(tools[tool].settingsKey).toByteArray().isEmpty());
        QRadioButton *light = radioButton(window, QStringLiteral("Light"));
        QVERIFY(light && !light->isChecked());
        light->click();
    }
    for (int other = 0; other < 4; ++other)
        QCOMPARE(storedConfig(tools[other].settingsKey).toByteArray().isEmpty(), other != tool);
    const QByteArray stored = storedConfig(tools[tool].settingsKey).toByteArray();
    const QJsonObject config = QJsonDocument::fromJson(stored).object();
    QCOMPARE(config.value(QStringLiteral("theme")).toString(), QStringLiteral("Light"));
    QCOMPARE(stored, QJsonDocument(config).toJson(QJsonDocument::Compact));

    KvStatisticsWindow next(m_kernelData.get());
    QVERIFY(QMetaObject::invokeMethod(&next, tools[tool].slot));
    QVERIFY(radioButton(next, QStringLiteral("Light"))->isChecked());
}

void LiveStatisticsTest::aConfigWithoutAllItsKeysIsRefusedWhole_data()
{
    everyBlockKeepsItsOptions_data();
}

void LiveStatisticsTest::aConfigWithoutAllItsKeysIsRefusedWhole()
{
    QFETCH(int, tool);
    storeConfig(tools[tool].settingsKey, R"({"theme":"Light"})");
    KvStatisticsWindow window(m_kernelData.get());
    QVERIFY(QMetaObject::invokeMethod(&window, tools[tool].slot));
    QVERIFY(radioButton(window, QStringLiteral("Dark"))->isChecked());
    QVERIFY(!radioButton(window, QStringLiteral("Light"))->isChecked());
}

STATREPORT_TEST_MAIN(LiveStatisticsTest)
#include "LiveStatisticsTest.moc"
