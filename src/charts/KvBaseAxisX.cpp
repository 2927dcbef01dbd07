// SPDX-License-Identifier: MIT
#include "charts/KvBaseAxisX.h"

namespace kvCharts {

void KvBaseAxisX::draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes)
{
    drawAxisLine(scene, themes, Orientation);
}

} // namespace kvCharts
