// SPDX-License-Identifier: MIT
#include "charts/KvLegendLayout.h"

namespace kvCharts::KvLegendLayout {

namespace {

constexpr double kRowEnd = 800.0;
constexpr double kPlotCenter = 500.0;
constexpr double kTextIndent = 16.0;
constexpr double kTextCenter = 4.0; // below the top of the marker
constexpr double kEntryGap = 32.0;
constexpr double kRowGap = 10.0;
constexpr double kTitleGap = 6.0;

} // namespace

QVector<Entry> entries(const QVector<QSizeF> &textSizes)
{
    QVector<Entry> result;
    result.reserve(textSizes.size());
    double x = 0.0;
    double y = 0.0;
    for (const QSizeF &size : textSizes) {
        result.append({QPointF(x, y), QPointF(x + kTextIndent, y + kTextCenter - size.height() / 2)});
        x += size.width() + kTextIndent + kEntryGap;
        if (x > kRowEnd) {
            x = 0.0;
            y += size.height() + kRowGap;
        }
    }
    return result;
}

QPointF groupPosition(const QSizeF &groupSize)
{
    return QPointF(kPlotCenter - groupSize.width() / 2, -groupSize.height());
}

QPointF titlePosition(const QSizeF &titleSize, bool hasEntries, double groupHeight)
{
    const double top = hasEntries ? -kTitleGap - groupHeight : 0.0;
    return QPointF(kPlotCenter - titleSize.width() / 2, top - titleSize.height());
}

} // namespace kvCharts::KvLegendLayout
