// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvBaseAxis.h"

namespace kvCharts {

/** An axis along y; alone it is a line without ticks. */
class KvBaseAxisY : public KvBaseAxis
{
    Q_OBJECT
public:
    static constexpr Qt::Orientation Orientation = Qt::Vertical;

    void draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes) override;
};

} // namespace kvCharts
