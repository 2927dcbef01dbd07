// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvTextMeasure.h"

#include <QStringList>
#include <QVector>

class QGraphicsScene;

namespace kvCharts {

class KvChartThemes;

/** Equal bands, one for each category; \a Base gives the direction. */
template <class Base>
class KvCategoryAxis : public Base
{
public:
    void draw(QGraphicsScene *scene, const kvCharts::KvChartThemes *themes) override
    {
        if (m_extents.size() != m_categories.size())
            m_extents = this->measure(m_categories);
        Base::draw(scene, themes);
        this->drawCategories(scene, themes, Base::Orientation, m_categories, m_extents, m_gridVisible);
    }

    void setGridVisible(bool visible) override
    {
        if (visible == m_gridVisible)
            return;
        m_gridVisible = visible;
        emit this->changed();
    }

    /** Announces a change even when the list is the same. */
    void setCategories(const QStringList &categories)
    {
        if (!m_categories.isSharedWith(categories)) {
            m_categories = categories;
            m_extents.clear();
        }
        emit this->changed();
    }

    const QStringList &categories() const { return m_categories; }

private:
    QStringList m_categories;
    bool m_gridVisible = false;
    QVector<KvTextExtent> m_extents; ///< measured at the first draw, as redraws are far more frequent
};

} // namespace kvCharts
