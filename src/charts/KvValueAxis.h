// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvAxisRange.h"

class QGraphicsScene;

namespace kvCharts {

class KvChartThemes;

/** A numeric range with evenly spaced ticks; \a Base gives the direction. */
template <class Base>
class KvValueAxis : public Base
{
public:
    void draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes) override
    {
        Base::draw(scene, themes);
        this->drawValues(scene, themes, Base::Orientation, m_range, m_gridVisible);
    }

    void setGridVisible(bool visible) override
    {
        if (visible == m_gridVisible)
            return;
        m_gridVisible = visible;
        emit this->changed();
    }

    void setRange(double minimum, double maximum) override
    {
        if (minimum == m_range.minimum && maximum == m_range.maximum)
            return;
        m_range.minimum = minimum;
        m_range.maximum = maximum;
        emit this->changed();
    }

    /** Below 1 the axis is a line without ticks. */
    void setTickCount(int count) override
    {
        if (count == m_range.tickCount)
            return;
        m_range.tickCount = count;
        emit this->changed();
    }

    double minimum() const override { return m_range.minimum; }
    double maximum() const override { return m_range.maximum; }

private:
    KvAxisRange m_range;
    bool m_gridVisible = false;
};

} // namespace kvCharts
