// SPDX-License-Identifier: MIT
#include "EditorCases.h"

#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"

#include <benchmark/benchmark.h>

#include <QApplication>

#include <cstdio>

namespace {

void keystroke(benchmark::State &state)
{
    EditedReport report(static_cast<int>(state.range(0)) * 8, 5);
    state.counters["pages"] = report.pageCount();
    for (auto _ : state)
        report.type();
}

void newLine(benchmark::State &state)
{
    EditedReport report(static_cast<int>(state.range(0)) * 8, 5);
    state.counters["pages"] = report.pageCount();
    for (auto _ : state)
        report.typeLine();
}

void dragMark(benchmark::State &state)
{
    EditedReport report(static_cast<int>(state.range(0)), 5);
    state.counters["pages"] = report.pageCount();
    for (auto _ : state)
        report.moveMark();
}

void loadTemplate(benchmark::State &state)
{
    EditorFile file(static_cast<int>(state.range(0)));
    for (auto _ : state)
        file.load();
}

void pageFlow(benchmark::State &state)
{
    for (auto _ : state)
        benchmark::DoNotOptimize(flowPieces(static_cast<int>(state.range(0))));
    state.SetComplexityN(state.range(0));
}

BENCHMARK(keystroke)->Arg(1)->Arg(30)->Unit(benchmark::kMillisecond);
BENCHMARK(newLine)->Arg(1)->Arg(30)->Unit(benchmark::kMillisecond);
BENCHMARK(dragMark)->Arg(30)->Unit(benchmark::kMillisecond);
BENCHMARK(loadTemplate)->Arg(20)->Arg(200)->Unit(benchmark::kMillisecond);
BENCHMARK(pageFlow)->RangeMultiplier(10)->Range(100, 100000)->Unit(benchmark::kMicrosecond)->Complexity();

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
    QApplication app(argc, argv);
    ZtAppSettings::getInstance()->setStoragePath(QString());
    acss::QtAdvancedStylesheet::getInstance()->applyTo(&app);
    // Only once in a process, so not among the benchmarks.
    std::printf("first opening of the editor: %.1f ms\n", openEditor());
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 2;
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
