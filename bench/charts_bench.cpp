// SPDX-License-Identifier: MIT
#include "BareChart.h"
#include "ChartComparison.h"
#include "ChartData.h"
#include "OwnChart.h"
#include "ProcessorTime.h"

#include <benchmark/benchmark.h>

#include <QApplication>

#include <algorithm>
#include <cstring>

namespace {

/// Runs chart and floor in turn, so that both meet the same load of the machine; reports the best of each.
template <class Chart, class Floor>
void compare(benchmark::State &state, Chart chart, Floor floor)
{
    double chartBest = 1e9;
    double floorBest = 1e9;
    for (auto _ : state) {
        const double time = ProcessorTime::seconds(chart);
        state.SetIterationTime(time);
        chartBest = std::min(chartBest, time);
        floorBest = std::min(floorBest, ProcessorTime::seconds(floor));
    }
    state.counters["floor_ms"] = floorBest * 1e3;
    state.counters["best_ms"] = chartBest * 1e3;
    state.counters["ratio"] = chartBest / floorBest;
}

ChartData dataFor(const benchmark::State &state)
{
    const int points = static_cast<int>(state.range(0));
    const int categories = static_cast<int>(state.range(1));
    return ChartData(points, categories != 0 ? categories : points / ChartData::SeriesCount);
}

void rebuildAndPaint(benchmark::State &state)
{
    const ChartData data = dataFor(state);
    OwnChart chart(data);
    BareChart floor(data);
    compare(
        state,
        [&] {
            chart.rebuild();
            benchmark::DoNotOptimize(chart.picture());
        },
        [&] { benchmark::DoNotOptimize(floor.picture()); });
}

void fillAndPaint(benchmark::State &state)
{
    const ChartData data = dataFor(state);
    OwnChart chart(data);
    BareChart floor(data);
    compare(
        state,
        [&] {
            chart.fill();
            benchmark::DoNotOptimize(chart.picture());
        },
        [&] { benchmark::DoNotOptimize(floor.picture()); });
}

void print(benchmark::State &state)
{
    const ChartData data = dataFor(state);
    OwnChart chart(data);
    BareChart floor(data);
    compare(
        state,
        [&] {
            chart.rebuild();
            benchmark::DoNotOptimize(chart.pdf());
        },
        [&] { benchmark::DoNotOptimize(floor.pdf()); });
    state.counters["size_ratio"] = double(chart.pdf().size()) / double(floor.pdf().size());
}

void fill(benchmark::State &state)
{
    const ChartData data = dataFor(state);
    OwnChart chart(data);
    for (auto _ : state)
        chart.fill();
    state.SetComplexityN(state.range(0));
}

// Points, and categories: 0 stands for one per point of a series.
void sizes(benchmark::internal::Benchmark *benchmark)
{
    for (const int points : {1000, 10000, 100000}) {
        for (const int categories : {50, 0})
            benchmark->Args({points, categories});
    }
    benchmark->Unit(benchmark::kMillisecond)->UseManualTime();
}

BENCHMARK(rebuildAndPaint)->Apply(sizes);
BENCHMARK(fillAndPaint)->Apply(sizes);
BENCHMARK(print)->Args({10000, 50})->Args({10000, 0})->Unit(benchmark::kMillisecond)->UseManualTime();
BENCHMARK(fill)
    ->Args({1000, 0})
    ->Args({10000, 0})
    ->Args({100000, 0})
    ->Unit(benchmark::kMillisecond)
    ->Complexity();

/// Takes "--pictures DIR" out of the arguments, as the benchmark library knows only its own.
QString takePictureDir(int &argc, char **argv)
{
    QString dir;
    int kept = 1;
    for (int i = 1; i < argc; ++i) {
        if (std::strcmp(argv[i], "--pictures") == 0 && i + 1 < argc)
            dir = QString::fromLocal8Bit(argv[++i]);
        else
            argv[kept++] = argv[i];
    }
    argc = kept;
    return dir;
}

void compareWithPeers(const QString &pictureDir)
{
    const ChartComparison comparison(pictureDir);
    for (const int points : {1000, 10000, 100000})
        comparison.comparePictures(points, 50);
    for (const int points : {1000, 10000})
        comparison.comparePictures(points, points / ChartData::SeriesCount);
    comparison.comparePdf(10000, 50);
}

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
    QApplication app(argc, argv);
    QFont::insertSubstitutions(QStringLiteral("Segoe UI"), {QStringLiteral("Open Sans")});
    const QString pictureDir = takePictureDir(argc, argv);
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 2;
    benchmark::RunSpecifiedBenchmarks();
    compareWithPeers(pictureDir);
    return 0;
}
