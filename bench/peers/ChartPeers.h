// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

class ChartData;
class ChartDrawing;

/** The comparison's data drawn with plotting libraries; only those that were found when the build was
 * configured. */
namespace ChartPeers {

/** How a library is set up. */
enum class Look {
    Alike,  ///< draws every point and line, antialiased, where our chart draws it
    Default ///< may leave out points, round places or not antialias, as the library does by itself
};

/** Its curve takes points in any order; its graph only ascending ones, of which it may leave some out. */
std::unique_ptr<ChartDrawing> makeQCustomPlotChart(const ChartData &data, Look look);
std::unique_ptr<ChartDrawing> makeQwtChart(const ChartData &data, Look look);
/** By default the line series draws dots that are 1.5 pens wide; markers of a given size are another series.
 */
std::unique_ptr<ChartDrawing> makeQtChartsChart(const ChartData &data, Look look);

} // namespace ChartPeers
