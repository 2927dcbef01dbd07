// SPDX-License-Identifier: MIT
#include "charts/KvBaseAxisY.h"

namespace kvCharts {

void KvBaseAxisY::draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes)
{
    drawAxisLine(scene, themes, Orientation);
}

} // namespace kvCharts
