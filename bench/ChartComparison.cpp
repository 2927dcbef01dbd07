// SPDX-License-Identifier: MIT
#include "ChartComparison.h"

#include "BareChart.h"
#include "ChartData.h"
#include "ItemChart.h"
#include "OwnChart.h"
#include "ProcessorTime.h"
#include "peers/ChartPeers.h"

#include <QDir>

#include <algorithm>
#include <cstdio>

namespace {

constexpr double kSecondsForAll = 4.0; // of one round after the other, unless that is less than kLeastRounds
constexpr int kLeastRounds = 5;
constexpr int kMostRounds = 25;
constexpr double kSecondsTooSlow = 4.0; // then a second round tells no more than the first

double median(std::vector<double> values)
{
    std::sort(values.begin(), values.end());
    return values.at(values.size() / 2);
}

} // namespace

ChartComparison::ChartComparison(const QString &pictureDir)
    : m_pictureDir(pictureDir)
{
    if (!m_pictureDir.isEmpty())
        QDir().mkpath(m_pictureDir);
}

void ChartComparison::comparePictures(int pointCount, int categoryCount) const
{
    const ChartData data(pointCount, categoryCount);
    const std::vector<Entry> all = entries(data);
    std::printf("\n%d points over %d categories: rebuilt and painted on 900 x 900 pixels\n", pointCount,
                categoryCount);
    print(all, run(all, [](ChartDrawing &drawing) {
              drawing.rebuild();
              return drawing.picture().isNull() ? 1 : 0;
          }));
    savePictures(all, QStringLiteral("%1-%2").arg(pointCount).arg(categoryCount));
}

void ChartComparison::comparePdf(int pointCount, int categoryCount) const
{
    const ChartData data(pointCount, categoryCount);
    const std::vector<Entry> all = entries(data);
    std::printf("\n%d points over %d categories: rebuilt and written as PDF\n", pointCount, categoryCount);
    print(all, run(all, [](ChartDrawing &drawing) {
              drawing.rebuild();
              return drawing.pdf().size();
          }));
}

std::vector<ChartComparison::Entry> ChartComparison::entries(const ChartData &data)
{
    std::vector<Entry> result;
    result.push_back({QStringLiteral("our chart"), [&data] { return std::make_unique<OwnChart>(data); }});
    result.push_back(
        {QStringLiteral("bare QPainter"), [&data] { return std::make_unique<BareChart>(data); }});
    result.push_back(
        {QStringLiteral("item per point"), [&data] { return std::make_unique<ItemChart>(data); }});
    addPeers(result, data);
    return result;
}

void ChartComparison::addPeers(std::vector<Entry> &entries, const ChartData &data)
{
    using ChartPeers::Look;
    const auto add = [&](const char *name, auto make) {
        const QString title = QString::fromLatin1(name);
        entries.push_back({title, [&data, make] { return make(data, Look::Alike); }});
        entries.push_back(
            {title + QStringLiteral(", default"), [&data, make] { return make(data, Look::Default); }});
    };
    Q_UNUSED(add)
#ifdef BENCH_QCUSTOMPLOT
    add("QCustomPlot", &ChartPeers::makeQCustomPlotChart);
#endif
#ifdef BENCH_QWT
    add("Qwt", &ChartPeers::makeQwtChart);
#endif
#ifdef BENCH_QTCHARTS
    add("Qt Charts", &ChartPeers::makeQtChartsChart);
#endif
}

// Round by round, so that all meet the same load of the machine.
std::vector<ChartComparison::Result>
ChartComparison::run(const std::vector<Entry> &entries, const std::function<int(ChartDrawing &)> &work) const
{
    std::vector<std::unique_ptr<ChartDrawing>> drawings;
    for (const Entry &entry : entries)
        drawings.push_back(entry.make());
    std::vector<Result> results(entries.size());
    double total = 0.0;
    for (int round = 0; round < kLeastRounds || (round < kMostRounds && total < kSecondsForAll); ++round) {
        for (std::size_t i = 0; i < drawings.size(); ++i) {
            Result &result = results.at(i);
            if (!result.times.empty() && result.times.front() > kSecondsTooSlow)
                continue;
            const double time = ProcessorTime::seconds([&] { result.bytes = work(*drawings.at(i)); });
            result.times.push_back(time);
            result.ratios.push_back(time / results.front().times.back());
            total += time;
        }
    }
    return results;
}

void ChartComparison::print(const std::vector<Entry> &entries, const std::vector<Result> &results)
{
    const bool hasSize = results.front().bytes > 0;
    std::printf("%-24s %10s %8s%s\n", "", "ms", "ratio", hasSize ? "         kB    ratio" : "");
    for (std::size_t i = 0; i < entries.size(); ++i) {
        const Result &result = results.at(i);
        std::printf("%-24s %10.2f %8.2f", qPrintable(entries.at(i).name), median(result.times) * 1e3,
                    median(result.ratios));
        if (hasSize)
            std::printf(" %10.1f %8.2f", result.bytes / 1e3, double(result.bytes) / results.front().bytes);
        std::printf("\n");
    }
}

void ChartComparison::savePictures(const std::vector<Entry> &entries, const QString &suffix) const
{
    if (m_pictureDir.isEmpty())
        return;
    for (const Entry &entry : entries) {
        const QString name =
            QString(entry.name).remove(QLatin1Char(',')).replace(QLatin1Char(' '), QLatin1Char('-'));
        entry.make()->picture().save(QStringLiteral("%1/%2-%3.png").arg(m_pictureDir, name, suffix));
    }
}
