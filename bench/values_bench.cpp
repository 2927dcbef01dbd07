// SPDX-License-Identifier: MIT
#include "KvDeskValueTableModel.h"
#include "ProcessorTime.h"
#include "TableFiles.h"
#include "ValueTableCases.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtImportedTable.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtSession.h"
#include "measuring/ZtTableExport.h"
#include "measuring/ZtTableImport.h"

#include <benchmark/benchmark.h>

#include <QApplication>

#include <algorithm>

namespace {

constexpr int manyObjects = 100000;
constexpr int millionRows = 333334; ///< objects of an imported table, with three values each

// A frame of a display that shows 60 of them in a second.
constexpr double frameMs = 16.0;

/// Reports the slowest of all runs, too: one that is late is seen.
template <class Work>
void measure(benchmark::State &state, Work work)
{
    double worst = 0.0;
    for (auto _ : state) {
        const double time = ProcessorTime::seconds(work);
        state.SetIterationTime(time);
        worst = std::max(worst, time);
    }
    state.counters["worst_ms"] = worst * 1e3;
    state.counters["frame_ms"] = frameMs;
}

void changeOne(benchmark::State &state)
{
    ValueTableCases cases(manyObjects);
    cases.sort(static_cast<int>(state.range(0)));
    measure(state, [&cases] { cases.changeOne(); });
}

void changeOneFiltered(benchmark::State &state)
{
    ValueTableCases cases(manyObjects);
    cases.filter(QStringLiteral("length"));
    measure(state, [&cases] { cases.changeOne(); });
}

void changeOneWhileAllAreSelected(benchmark::State &state)
{
    ValueTableCases cases(manyObjects);
    cases.selectAll();
    measure(state, [&cases] { cases.changeOne(); });
}

void addAndRemoveOne(benchmark::State &state)
{
    ValueTableCases cases(manyObjects);
    cases.sort(static_cast<int>(state.range(0)));
    measure(state, [&cases] {
        cases.addOne();
        cases.removeOne();
    });
}

void selectOne(benchmark::State &state)
{
    ValueTableCases cases(manyObjects);
    measure(state, [&cases] { cases.selectOne(); });
}

void selectAll(benchmark::State &state)
{
    ValueTableCases cases(manyObjects);
    measure(state, [&cases] { cases.selectAll(); });
}

void scroll(benchmark::State &state)
{
    ValueTableCases cases(manyObjects);
    measure(state, [&cases] { cases.scroll(); });
}

void sort(benchmark::State &state)
{
    ValueTableCases cases(manyObjects);
    const int column = static_cast<int>(state.range(0));
    for (auto _ : state) {
        cases.sort(-1);
        state.SetIterationTime(ProcessorTime::seconds([&] { cases.sort(column); }));
    }
}

void filter(benchmark::State &state)
{
    ValueTableCases cases(manyObjects);
    for (auto _ : state) {
        cases.filter(QString());
        state.SetIterationTime(ProcessorTime::seconds([&] { cases.filter(QStringLiteral("circle 77")); }));
    }
}

void readEverything(benchmark::State &state)
{
    ValueTableCases cases(manyObjects);
    measure(state, [&cases] { cases.reset(); });
}

void showMillion(benchmark::State &state)
{
    ValueTableCases cases;
    double worst = 0.0;
    for (auto _ : state) {
        cases.clear();
        cases.import(millionRows);
        const double time = ProcessorTime::seconds([&cases] { cases.follow(); });
        state.SetIterationTime(time);
        worst = std::max(worst, time);
    }
    state.counters["worst_ms"] = worst * 1e3;
    state.counters["rows"] = cases.rowCount();
}

void sortMillion(benchmark::State &state)
{
    ValueTableCases cases;
    cases.import(millionRows);
    cases.follow();
    const int column = static_cast<int>(state.range(0));
    for (auto _ : state) {
        cases.sort(-1);
        state.SetIterationTime(ProcessorTime::seconds([&] { cases.sort(column); }));
    }
}

void filterMillion(benchmark::State &state)
{
    ValueTableCases cases;
    cases.import(millionRows);
    cases.follow();
    for (auto _ : state) {
        cases.filter(QString());
        state.SetIterationTime(ProcessorTime::seconds([&] { cases.filter(QStringLiteral("grain 77")); }));
    }
}

void takeSessionAfterRemoval(benchmark::State &state)
{
    ValueTableCases cases;
    cases.import(millionRows);
    cases.takeSession();
    for (auto _ : state) {
        cases.removeImported();
        state.SetIterationTime(ProcessorTime::seconds([&cases] { cases.takeSession(); }));
    }
}

void exportTable(benchmark::State &state)
{
    const ValueTableCases cases(manyObjects);
    ZtTableExport::Options options;
    options.layout = static_cast<ZtTableExport::Layout>(state.range(0));
    int bytes = 0;
    for (auto _ : state)
        state.SetIterationTime(
            ProcessorTime::seconds([&] { bytes = ZtTableExport::toBytes(options).size(); }));
    state.counters["MB"] = bytes / 1e6;
}

/// Runs the work and the least that reading the same file takes in turn; reports the best of each.
template <class Work, class TidyUp>
void compareWithSplitting(benchmark::State &state, const QString &path, char separator, Work work,
                          TidyUp tidyUp)
{
    double best = 1e9;
    double splitBest = 1e9;
    double textsBest = 1e9;
    for (auto _ : state) {
        const double time = ProcessorTime::seconds(work);
        tidyUp();
        state.SetIterationTime(time);
        best = std::min(best, time);
        splitBest = std::min(splitBest, ProcessorTime::seconds([&] {
                                 benchmark::DoNotOptimize(TableFiles::readAndSplit(path, separator));
                             }));
        textsBest = std::min(textsBest, ProcessorTime::seconds([&] {
                                 benchmark::DoNotOptimize(
                                     TableFiles::readAndSplitTexts(path, QLatin1Char(separator)));
                             }));
    }
    state.counters["split_ms"] = splitBest * 1e3;
    state.counters["best_ms"] = best * 1e3;
    state.counters["ratio"] = best / splitBest;
    state.counters["texts_ms"] = textsBest * 1e3;
    state.counters["texts_ratio"] = best / textsBest;
}

template <class Work>
void compareWithSplitting(benchmark::State &state, const QString &path, char separator, Work work)
{
    compareWithSplitting(state, path, separator, work, [] {});
}

void readTable(benchmark::State &state, const QByteArray &bytes)
{
    const QString path = TableFiles::write(QStringLiteral("table.csv"), bytes);
    compareWithSplitting(state, path, ',', [&path] {
        ZtImportedTable table;
        ZtFault fault;
        if (!ZtTableImport::readFile(path, ZtTableImportOptions(), &table, &fault))
            qFatal("The table is wrong");
    });
}

void readWide(benchmark::State &state)
{
    readTable(state, TableFiles::wideTable(static_cast<int>(state.range(0))));
}

void readTidy(benchmark::State &state)
{
    readTable(state, TableFiles::tidyTable(static_cast<int>(state.range(0))));
}

/// From the file to objects that everybody sees.
void importWide(benchmark::State &state)
{
    const QByteArray bytes = TableFiles::wideTable(static_cast<int>(state.range(0)));
    const QString path = TableFiles::write(QStringLiteral("table.csv"), bytes);
    ZtMeasuringDocument document;
    compareWithSplitting(
        state, path, ',',
        [&] {
            ZtFault fault;
            if (!document.importTable(path, ZtTableImportOptions(), &fault))
                qFatal("The table is wrong");
        },
        [&document] { document.clear(); });
}

QString sessionFile(int rows)
{
    ZtMeasuringDocument document;
    ZtFault fault;
    const QString table = TableFiles::write(QStringLiteral("table.csv"), TableFiles::wideTable(rows));
    const QString path = TableFiles::write(QStringLiteral("session.json"), QByteArray());
    if (!document.importTable(table, ZtTableImportOptions(), &fault) || !document.saveSession(path, &fault))
        qFatal("The session is wrong");
    return path;
}

void loadSession(benchmark::State &state)
{
    const QString path = sessionFile(static_cast<int>(state.range(0)));
    compareWithSplitting(state, path, ',', [&path] {
        ZtSession session;
        ZtFault fault;
        if (!ZtSession::load(path, &session, &fault))
            qFatal("The session is wrong");
    });
}

void saveSession(benchmark::State &state)
{
    const QString path = sessionFile(static_cast<int>(state.range(0)));
    ZtSession session;
    ZtFault fault;
    if (!ZtSession::load(path, &session, &fault))
        qFatal("The session is wrong");
    compareWithSplitting(state, path, ',', [&] {
        ZtFault writing;
        if (!session.save(path, &writing))
            qFatal("The session is wrong");
    });
}

BENCHMARK(changeOne)->ArgName("column")->Arg(-1)->Arg(1)->Arg(3)->UseManualTime()->Unit(
    benchmark::kMillisecond);
BENCHMARK(changeOneFiltered)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(changeOneWhileAllAreSelected)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(addAndRemoveOne)
    ->ArgName("column")
    ->Arg(-1)
    ->Arg(3)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);
BENCHMARK(selectOne)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(selectAll)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(scroll)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(sort)->ArgName("column")->DenseRange(0, 3)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(filter)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(readEverything)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(showMillion)->UseManualTime()->Iterations(5)->Unit(benchmark::kMillisecond);
BENCHMARK(sortMillion)
    ->ArgName("column")
    ->DenseRange(0, 3)
    ->UseManualTime()
    ->Iterations(2)
    ->Unit(benchmark::kMillisecond);
BENCHMARK(filterMillion)->UseManualTime()->Iterations(3)->Unit(benchmark::kMillisecond);
BENCHMARK(takeSessionAfterRemoval)->UseManualTime()->Iterations(5)->Unit(benchmark::kMillisecond);
BENCHMARK(exportTable)->ArgName("layout")->DenseRange(0, 2)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(readWide)
    ->RangeMultiplier(10)
    ->Range(10000, 1000000)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);
BENCHMARK(readTidy)
    ->RangeMultiplier(10)
    ->Range(10000, 1000000)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);
BENCHMARK(importWide)
    ->RangeMultiplier(10)
    ->Range(10000, 1000000)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);
BENCHMARK(loadSession)
    ->RangeMultiplier(10)
    ->Range(10000, 1000000)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);
BENCHMARK(saveSession)
    ->RangeMultiplier(10)
    ->Range(10000, 1000000)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QCoreApplication::setAttribute(Qt::AA_Use96Dpi);
    const QApplication app(argc, argv);
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 2;
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
