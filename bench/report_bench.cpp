// SPDX-License-Identifier: MIT
#include "LiveReport.h"
#include "ReportCases.h"
#include "SyntheticHost.h"

#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"
#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"

#include <benchmark/benchmark.h>

#include <QApplication>
#include <QTemporaryDir>

#include <cstdio>
#include <map>
#include <string>

namespace {

int rows(const benchmark::State &state)
{
    return static_cast<int>(state.range(0));
}

QString outputFile()
{
    static const QTemporaryDir dir;
    return dir.filePath(QStringLiteral("bench.pdf"));
}

// What the host itself takes to answer for every value: the least that a rebuild of the records can cost.
void hostCalls(benchmark::State &state)
{
    fillSyntheticHost(rows(state));
    const ZtKernelData *kernel = ZtKernelData::getInstance();
    for (auto _ : state) {
        for (auto type = kernel->objects().constBegin(); type != kernel->objects().constEnd(); ++type) {
            const ZtGsManipulator *manipulator = kernel->getGsManipulator(type.key());
            const QStringList names = manipulator->getValueNames();
            for (const ZtKernelObjectData *object : type.value()) {
                for (const QString &name : names) {
                    int kind = 0;
                    benchmark::DoNotOptimize(manipulator->valueText(name, object));
                    benchmark::DoNotOptimize(manipulator->value(name, object, kind));
                }
            }
        }
    }
}

void rebuildRecords(benchmark::State &state)
{
    fillSyntheticHost(rows(state));
    KvReportKernelData kernelData;
    for (auto _ : state)
        kernelData.slotDelayedMeasurementsUpdate();
}

void deepCopy(benchmark::State &state)
{
    fillSyntheticHost(rows(state));
    KvReportKernelData kernelData;
    kernelData.slotDelayedMeasurementsUpdate();
    const QVector<KvMeasuredValue> records = kernelData.measuredValues();
    for (auto _ : state) {
        QVector<KvMeasuredValue> copy = records;
        copy.detach();
        benchmark::DoNotOptimize(copy.data());
    }
}

void regroup(benchmark::State &state)
{
    fillSyntheticHost(rows(state));
    KvReportKernelData kernelData;
    KvStatisticsEngine &engine = KvStatisticsEngine::instance();
    engine.setKernelData(&kernelData);
    kernelData.slotDelayedMeasurementsUpdate();
    for (auto _ : state)
        engine.slotMeasurementsListUpdated();
    engine.setKernelData(nullptr);
}

void pdfFloor(benchmark::State &state)
{
    fillSyntheticHost(rows(state));
    for (auto _ : state)
        printFloor(outputFile());
}

void pdfReport(benchmark::State &state)
{
    fillSyntheticHost(rows(state));
    for (auto _ : state) {
        TableReport report;
        report.print(outputFile());
    }
}

void liveRefresh(benchmark::State &state)
{
    fillSyntheticHost(rows(state));
    LiveReport report;
    state.counters["pages"] = report.pageCount();
    for (auto _ : state)
        report.refreshInPlace();
}

LiveReport::Sections sections(const benchmark::State &state)
{
    return state.range(1) ? LiveReport::Sections::All : LiveReport::Sections::None;
}

void liveMeasure(benchmark::State &state)
{
    fillSyntheticHost(rows(state));
    LiveReport report(sections(state));
    state.counters["pages"] = report.pageCount();
    for (auto _ : state)
        report.measure();
}

void liveReflow(benchmark::State &state)
{
    fillSyntheticHost(rows(state));
    LiveReport report(sections(state));
    state.counters["pages"] = report.pageCount();
    for (auto _ : state)
        report.reflow();
}

// A page more and a page less, by turns: what one more record costs now and then.
void livePageChange(benchmark::State &state)
{
    constexpr int kMoreThanAPage = 40;
    fillSyntheticHost(rows(state));
    LiveReport report(sections(state));
    int more = 0;
    for (auto _ : state) {
        state.PauseTiming();
        more = kMoreThanAPage - more;
        fillSyntheticHost(rows(state) + more);
        state.ResumeTiming();
        report.takeRecords();
    }
    state.counters["pages"] = report.pageCount();
}

// Records, and whether there are header, footer and page numbers.
void liveArguments(benchmark::internal::Benchmark *live)
{
    live->ArgsProduct({{1000, 10000}, {0, 1}})->Unit(benchmark::kMillisecond);
}

BENCHMARK(hostCalls)->Arg(1000)->Arg(10000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(rebuildRecords)->Arg(1000)->Arg(10000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(deepCopy)->Arg(1000)->Arg(10000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(regroup)->Arg(1000)->Arg(10000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(pdfFloor)->Arg(100)->Arg(1000)->Arg(10000)->Unit(benchmark::kMillisecond);
BENCHMARK(pdfReport)->Arg(100)->Arg(1000)->Arg(10000)->Unit(benchmark::kMillisecond);
BENCHMARK(liveRefresh)->Arg(1000)->Arg(10000)->Unit(benchmark::kMillisecond);
BENCHMARK(liveMeasure)->Apply(liveArguments);
BENCHMARK(liveReflow)->Apply(liveArguments);
BENCHMARK(livePageChange)->Apply(liveArguments);

/** Keeps the times of all runs, so that they can be set against each other at the end. */
class RatioReporter : public benchmark::ConsoleReporter
{
public:
    void ReportRuns(const std::vector<Run> &reports) override
    {
        ConsoleReporter::ReportRuns(reports);
        for (const Run &run : reports)
            m_times[run.benchmark_name()] = run.GetAdjustedCPUTime();
    }

    void printRatio(const char *text, const std::string &name, const std::string &base, int size) const
    {
        const std::string suffix = "/" + std::to_string(size);
        const auto time = m_times.find(name + suffix);
        const auto baseTime = m_times.find(base + suffix);
        if (time != m_times.end() && baseTime != m_times.end())
            std::printf("%-52s %8d   %6.2f\n", text, size, time->second / baseTime->second);
    }

private:
    std::map<std::string, double> m_times;
};

void printRatios(const RatioReporter &reporter)
{
    std::printf("\n%-52s %8s   %6s\n", "ratio", "records", "times");
    for (const int size : {1000, 10000, 100000}) {
        reporter.printRatio("rebuild of the records / the host's own calls", "rebuildRecords", "hostCalls",
                            size);
        reporter.printRatio("regrouping / a deep copy of the records", "regroup", "deepCopy", size);
    }
    for (const int size : {100, 1000, 10000})
        reporter.printRatio("table report to PDF / bare QPainter", "pdfReport", "pdfFloor", size);
}

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
    QApplication app(argc, argv);
    acss::QtAdvancedStylesheet::substituteFonts();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 2;
    RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    printRatios(reporter);
    return 0;
}
