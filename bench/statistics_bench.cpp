// SPDX-License-Identifier: MIT
// What live statistics cost the user interface, in processor time: all of it is the GUI thread's.
#include "ProcessorTime.h"
#include "StatisticsCases.h"
#include "SyntheticHost.h"

#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"

#include <benchmark/benchmark.h>

#include <QApplication>
#include <QElapsedTimer>
#include <QTimer>

#include <algorithm>
#include <string>

namespace {

constexpr int kCountersInPie = 12;
constexpr int kBurst = 100;

void fillHost(int records)
{
    fillSyntheticHost(records);
    fillSyntheticCounters(kCountersInPie);
}

template <class Step>
void measure(benchmark::State &state, const char *blockName, LiveBlock::Place place, Step step)
{
    fillHost(static_cast<int>(state.range(0)));
    LiveBlock block(QString::fromLatin1(blockName), place);
    double longest = 0.0;
    for (auto _ : state) {
        block.settle();
        bool isPainted = false;
        const double time = ProcessorTime::seconds([&]() { isPainted = step(block); });
        if (!isPainted) {
            state.SkipWithError("the block was not painted");
            break;
        }
        state.SetIterationTime(time);
        longest = std::max(longest, time);
    }
    state.counters["longest_ms"] = longest * 1e3;
}

// From the announcement of the records to the painted block.
void refreshAndPaint(benchmark::State &state, const char *blockName, LiveBlock::Place place)
{
    measure(state, blockName, place, [](LiveBlock &block) { return block.refresh(); });
}

// The same with the host's answers for every value.
void updateAndPaint(benchmark::State &state, const char *blockName, LiveBlock::Place place)
{
    measure(state, blockName, place, [](LiveBlock &block) { return block.update(); });
}

// All that a burst of changes costs, up to the painted block.
void burst(benchmark::State &state, const char *blockName, LiveBlock::Place place)
{
    fillHost(static_cast<int>(state.range(0)));
    LiveBlock block(QString::fromLatin1(blockName), place);
    const int updatesBefore = block.updateCount();
    int bursts = 0;
    for (auto _ : state) {
        block.settle();
        bool isPainted = false;
        state.SetIterationTime(ProcessorTime::seconds([&]() { isPainted = block.burst(kBurst); }));
        if (!isPainted) {
            state.SkipWithError("the block was not painted");
            break;
        }
        ++bursts;
    }
    state.counters["updates_per_burst"] =
        static_cast<double>(block.updateCount() - updatesBefore) / std::max(bursts, 1);
}

// A second of a program that announces bursts of changes as fast as the event loop lets it, every 10 ms: how
// long the interface answers to nothing at most, and which part of the time it is busy.
void stream(benchmark::State &state, const char *blockName, LiveBlock::Place place)
{
    fillHost(static_cast<int>(state.range(0)));
    LiveBlock block(QString::fromLatin1(blockName), place);
    QTimer source;
    QObject::connect(&source, &QTimer::timeout, []() { announceChanges(kBurst); });
    source.start(10);
    double longest = 0.0;
    double busy = 0.0;
    double wall = 0.0;
    const int updatesBefore = block.updateCount();
    for (auto _ : state) {
        QElapsedTimer clock;
        clock.start();
        double second = 0.0;
        while (!clock.hasExpired(1000)) {
            const double turn = ProcessorTime::seconds(
                []() { QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents); });
            longest = std::max(longest, turn);
            second += turn;
        }
        busy += second;
        wall += static_cast<double>(clock.nsecsElapsed()) * 1e-9;
        state.SetIterationTime(second);
    }
    state.counters["longest_ms"] = longest * 1e3;
    state.counters["busy_percent"] = 100.0 * busy / wall;
    state.counters["updates_per_s"] = (block.updateCount() - updatesBefore) / wall;
}

using Case = void (*)(benchmark::State &, const char *, LiveBlock::Place);

void addSizes(benchmark::internal::Benchmark *benchmark)
{
    benchmark->Arg(1000)->Arg(10000)->Arg(100000)->Unit(benchmark::kMillisecond)->UseManualTime();
}

void addCase(const std::string &name, Case function, const char *blockName, LiveBlock::Place place)
{
    const char *where = place == LiveBlock::Place::Window ? "window" : "page";
    const std::string fullName = name + "/" + where + "/" + blockName;
    auto *added = benchmark::RegisterBenchmark(fullName.c_str(), function, blockName, place);
    if (function == stream)
        added->Arg(10000)->Unit(benchmark::kMillisecond)->UseManualTime()->Iterations(2);
    else
        addSizes(added);
}

void addCases(const std::string &name, Case function)
{
    for (const char *block : {"Statistics Table", "Counters", "MinMedMaxBox", "Trend"})
        addCase(name, function, block, LiveBlock::Place::Window);
    for (const char *block : {"Statistics Table", "Counters", "MinMedMaxBox", "Trend", "Measurement table"})
        addCase(name, function, block, LiveBlock::Place::Page);
}

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
    QApplication app(argc, argv);
    acss::QtAdvancedStylesheet::substituteFonts();
    acss::QtAdvancedStylesheet::getInstance()->applyTo(&app);
    ZtAppSettings::getInstance()->setStoragePath(QString());
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 2;
    addCases("refreshAndPaint", refreshAndPaint);
    addCases("updateAndPaint", updateAndPaint);
    addCases("burst", burst);
    addCases("stream", stream);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
