// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvChart.h"

#include <QColor>

namespace kvCharts {

/** Slices in proportion to their values, clockwise from 3 o'clock. */
class KvPieChart : public KvChart
{
    Q_OBJECT
public:
    explicit KvPieChart(const KvChartThemes *themes);

    /** Invalid colours stand for a white outline and for the next palette colour. */
    void addSlice(const QString &label, double value, const QColor &outlineColor, const QColor &fillColor);
    void clearSlices();
    int sliceCount() const { return m_slices.size(); }

protected:
    void rebuild() override;

private:
    struct Slice
    {
        QString label;
        double value;
        QColor outlineColor;
        QColor fillColor;
    };

    QVector<double> values() const;
    void fillInvalidColors();

    QVector<Slice> m_slices;
};

} // namespace kvCharts
