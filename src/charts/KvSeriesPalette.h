// SPDX-License-Identifier: MIT
#pragma once

#include <QColor>

namespace kvCharts {

/**
 * Colour of the series \a index (0 at least) in every chart of the process. Sixteen are fixed; for higher
 * indexes random colours are made on first request and kept. GUI thread only.
 */
QColor seriesColor(int index);

} // namespace kvCharts
