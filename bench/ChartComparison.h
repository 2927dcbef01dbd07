// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

#include <functional>
#include <memory>
#include <vector>

class ChartData;
class ChartDrawing;

/** Draws the same data in all ways there are and prints how long each takes, and how often as long as our
 * chart. */
class ChartComparison
{
public:
    /** With a folder, which it makes, each drawing leaves its picture there. Empty: none do. */
    explicit ChartComparison(const QString &pictureDir);

    /** A table on standard output for pixels. \see ChartData for the counts. */
    void comparePictures(int pointCount, int categoryCount) const;
    /** A table for PDF files, with their sizes. */
    void comparePdf(int pointCount, int categoryCount) const;

private:
    struct Entry
    {
        QString name;
        std::function<std::unique_ptr<ChartDrawing>()> make;
    };
    struct Result
    {
        std::vector<double> times; ///< processor seconds, one for each round
        std::vector<double> ratios;
        int bytes = 0;
    };

    static std::vector<Entry> entries(const ChartData &data);
    static void addPeers(std::vector<Entry> &entries, const ChartData &data);
    std::vector<Result> run(const std::vector<Entry> &entries,
                            const std::function<int(ChartDrawing &)> &work) const;
    static void print(const std::vector<Entry> &entries, const std::vector<Result> &results);
    void savePictures(const std::vector<Entry> &entries, const QString &suffix) const;

    QString m_pictureDir;
};
