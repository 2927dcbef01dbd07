// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

class QGraphicsScene;

namespace kvCharts {

class KvChartThemes;

/** Whatever a chart draws: axis, legend, slice, box, series. Created without a parent. */
class KvBaseChartPart : public QObject
{
    Q_OBJECT
public:
    KvBaseChartPart();
    ~KvBaseChartPart() override;

    /**
     * Adds this part's items to the scene, in the colours of the current theme.
     *
     * The scene owns the items and discards them at the next redraw; a part never keeps one.
     */
    virtual void draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes) = 0;

signals:
    /** Some data or setting of the part changed; the chart redraws itself. */
    void changed();
};

} // namespace kvCharts
