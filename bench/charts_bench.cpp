// SPDX-License-Identifier: MIT
#include "ChartCases.h"

#include <benchmark/benchmark.h>

#include <QApplication>

#include <algorithm>
#include <ctime>

namespace {

/// Processor time, which other programs on the machine disturb less than the clock on the wall.
template <class Work>
double seconds(Work work)
{
    const std::clock_t start = std::clock();
    work();
    return static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC;
}

/// Runs chart and floor in turn, so that both meet the same load of the machine; reports the best of each.
template <class Chart, class Floor>
void compare(benchmark::State &state, Chart chart, Floor floor)
{
    double chartBest = 1e9;
    double floorBest = 1e9;
    for (auto _ : state) {
        const double time = seconds(chart);
        state.SetIterationTime(time);
        chartBest = std::min(chartBest, time);
        floorBest = std::min(floorBest, seconds(floor));
    }
    state.counters["floor_ms"] = floorBest * 1e3;
    state.counters["best_ms"] = chartBest * 1e3;
    state.counters["ratio"] = chartBest / floorBest;
}

int categoryCount(const benchmark::State &state)
{
    const int points = static_cast<int>(state.range(0));
    return state.range(1) != 0 ? static_cast<int>(state.range(1)) : points / 3;
}

void rebuildAndPaint(benchmark::State &state)
{
    TrendChartCase chart(static_cast<int>(state.range(0)), categoryCount(state));
    compare(
        state,
        [&] {
            chart.rebuild();
            benchmark::DoNotOptimize(chart.paintChart());
        },
        [&] { benchmark::DoNotOptimize(chart.paintFloor()); });
}

void fillAndPaint(benchmark::State &state)
{
    TrendChartCase chart(static_cast<int>(state.range(0)), categoryCount(state));
    compare(
        state,
        [&] {
            chart.fill();
            benchmark::DoNotOptimize(chart.paintChart());
        },
        [&] { benchmark::DoNotOptimize(chart.paintFloor()); });
}

void print(benchmark::State &state)
{
    TrendChartCase chart(static_cast<int>(state.range(0)), categoryCount(state));
    compare(
        state,
        [&] {
            chart.rebuild();
            benchmark::DoNotOptimize(chart.printChart());
        },
        [&] { benchmark::DoNotOptimize(chart.printFloor()); });
    state.counters["size_ratio"] = double(chart.printChart().size()) / double(chart.printFloor().size());
}

void fill(benchmark::State &state)
{
    TrendChartCase chart(static_cast<int>(state.range(0)), categoryCount(state));
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

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
    QApplication app(argc, argv);
    QFont::insertSubstitutions(QStringLiteral("Segoe UI"), {QStringLiteral("Open Sans")});
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 2;
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
