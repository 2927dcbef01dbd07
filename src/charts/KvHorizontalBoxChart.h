// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvChart.h"

#include <QColor>

#include <array>

namespace kvCharts {

class KvHorizontalBox;

/** One box per entry, the first at the top, over a value axis that takes a range for all. */
class KvHorizontalBoxChart : public KvChart
{
    Q_OBJECT
public:
    explicit KvHorizontalBoxChart(const KvChartThemes *themes);

    /** Entries with a value that is not a finite number get their place, but no box. */
    void addBox(const QString &name, double minimum, double lower, double median, double upper,
                double maximum, const QColor &color);
    void clearBoxes();
    int boxCount() const { return m_entries.size(); }

protected:
    /** Without entries the axes keep what they show. */
    void rebuild() override;

private:
    struct Entry
    {
        QString name;
        std::array<double, 5> values; ///< minimum, lower box value, median, upper box value, maximum
        QColor color;
    };

    static bool isDrawable(const Entry &entry);
    static KvHorizontalBox *makeBox(const Entry &entry, double low, double high);
    void updateAxes();

    QVector<Entry> m_entries;
};

} // namespace kvCharts
