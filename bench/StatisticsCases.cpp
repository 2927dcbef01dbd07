// SPDX-License-Identifier: MIT
#include "StatisticsCases.h"

#include "blocks/KvReportBlocks.h"
#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtKernelObjectData.h"
#include "kernel/ZtKernelObjectDataDescr.h"
#include "report/KvReportPagedView.h"
#include "statistics/KvStatisticsWindow.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvTemplateModel.h"

#include <QAbstractScrollArea>
#include <QApplication>
#include <QElapsedTimer>

namespace {

constexpr int kCounterType = 66741;
constexpr int kLongestWaitMs = 30000;
constexpr int kSettleMs = 30; // longer than a window waits before it paints what changed

class CounterData : public ZtKernelObjectData
{
public:
    explicit CounterData(int count)
        : m_count(count)
    {}
    int count() const { return m_count; }

private:
    int m_count;
};

class CounterManipulator : public ZtGsManipulator
{
public:
    CounterManipulator()
        : ZtGsManipulator({QStringLiteral("Count"), QStringLiteral("Share")})
    {}
    int objectTypeId() const override { return kCounterType; }
    int typeFlags(int) const override { return MeasurementFlag; }
    QString objectTypeName(int) const override { return QStringLiteral("Counter"); }
    bool isValueShown(const QString &, const QStringList &) const override { return true; }
    QVariant value(const QString &valueName, const ZtKernelObjectData *object,
                   int &measureKind) const override
    {
        const int count = static_cast<const CounterData *>(object)->count();
        measureKind = valueName == getValueNames().first() ? Count : Percentage;
        return measureKind == Count ? QVariant(count) : QVariant(count / 100.0);
    }
    QString valueText(const QString &, const ZtKernelObjectData *object) const override
    {
        return QString::number(static_cast<const CounterData *>(object)->count());
    }
    QStringList valueSet(int) const override { return getValueNames(); }
};

QString slotOf(const QString &blockName)
{
    if (blockName == QLatin1String("Statistics Table"))
        return QStringLiteral("slotToolsTableClicked");
    if (blockName == QLatin1String("Counters"))
        return QStringLiteral("slotToolsCounterPieClicked");
    if (blockName == QLatin1String("MinMedMaxBox"))
        return QStringLiteral("slotToolsMinMedMaxBoxClicked");
    return QStringLiteral("slotToolsTrendClicked");
}

} // namespace

void fillSyntheticCounters(int count)
{
    const ZtKernelData::SignalBlocker blocker;
    ZtKernelData *kernel = ZtKernelData::getInstance();
    kernel->unregisterType(kCounterType);
    if (count == 0)
        return;
    kernel->registerType(kCounterType, std::make_unique<CounterManipulator>(),
                         std::make_unique<ZtKernelObjectDataDescr>(kCounterType, QStringLiteral("counter")));
    for (int i = 0; i < count; ++i)
        kernel->addObject(kCounterType, std::make_unique<CounterData>(1 + i % 40));
}

void announceChanges(int count)
{
    const ZtKernelData *kernel = ZtKernelData::getInstance();
    for (auto type = kernel->objects().constBegin(); type != kernel->objects().constEnd(); ++type) {
        for (auto object = type->constBegin(); object != type->constEnd() && count > 0; ++object, --count)
            kernel->notifyObjectChanged(type.key(), object.key());
    }
}

PaintWatch::PaintWatch(QWidget *root)
    : m_root(root)
{
    qApp->installEventFilter(this);
}

bool PaintWatch::waitForPainting()
{
    QElapsedTimer clock;
    clock.start();
    while (!m_isPainted && !clock.hasExpired(kLongestWaitMs))
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    return m_isPainted;
}

bool PaintWatch::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() != QEvent::Paint || m_isPainted)
        return false;
    const auto *widget = qobject_cast<const QWidget *>(watched);
    const auto *area = widget ? qobject_cast<const QAbstractScrollArea *>(widget->parentWidget()) : nullptr;
    m_isPainted = area && (area == m_root || m_root->isAncestorOf(area));
    return false;
}

LiveBlock::LiveBlock(const QString &blockName, Place place)
    : m_kernelData(std::make_unique<KvReportKernelData>())
{
    QObject::connect(m_kernelData.get(), &KvReportKernelData::signalMeasuredValuesChanged,
                     [this]() { takeUpdate(); });
    KvStatisticsEngine::instance().setKernelData(m_kernelData.get());
    if (place == Place::Window)
        showInWindow(blockName);
    else
        showOnPage(blockName);
    m_watch = std::make_unique<PaintWatch>(m_widget.get());
    settle();
}

LiveBlock::~LiveBlock()
{
    m_widget.reset();
    if (m_model)
        m_model->endLiveUpdates();
    m_model.reset();
    KvStatisticsEngine::instance().setKernelData(nullptr);
}

void LiveBlock::showInWindow(const QString &blockName)
{
    m_widget = std::make_unique<KvStatisticsWindow>(m_kernelData.get());
    m_widget->show();
    QMetaObject::invokeMethod(m_widget.get(), slotOf(blockName).toLatin1().constData());
}

void LiveBlock::showOnPage(const QString &blockName)
{
    m_blocks = std::make_unique<KvBlockTypeList>();
    registerReportBlocks(*m_blocks);
    m_model = std::make_unique<KvTemplateModel>(nullptr, m_kernelData.get());
    m_model->setFactories(m_blocks.get());
    m_model->beginLiveUpdates();
    m_model->createNode(blockName, -1);
    auto view = std::make_unique<KvReportPagedView>();
    view->setModel(m_model.get());
    view->resize(1020, 900);
    view->show();
    m_widget = std::move(view);
}

void LiveBlock::takeUpdate()
{
    ++m_updates;
    // Before the blocks hear of it, as the watch was connected first: what is painted from now on is new.
    if (m_watch)
        m_watch->reset();
}

void LiveBlock::settle()
{
    QElapsedTimer clock;
    clock.start();
    while (!clock.hasExpired(kSettleMs))
        QCoreApplication::processEvents(QEventLoop::AllEvents);
}

bool LiveBlock::refresh()
{
    emit m_kernelData->signalMeasuredValuesChanged();
    return m_watch->waitForPainting();
}

bool LiveBlock::update()
{
    m_kernelData->slotDelayedMeasurementsUpdate();
    return m_watch->waitForPainting();
}

bool LiveBlock::burst(int changes)
{
    const int updatesBefore = m_updates;
    announceChanges(changes);
    while (m_updates == updatesBefore)
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    return m_watch->waitForPainting();
}
