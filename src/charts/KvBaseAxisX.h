// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvBaseAxis.h"

namespace kvCharts {

/** An axis along x; alone it is a line without ticks. */
class KvBaseAxisX : public KvBaseAxis
{
    Q_OBJECT
public:
    static constexpr Qt::Orientation Orientation = Qt::Horizontal;

    void draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes) override;
};

} // namespace kvCharts
