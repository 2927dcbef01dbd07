// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvBaseAxisY.h"
#include "charts/KvCategoryAxis.h"

namespace kvCharts {

/** Category axis along y. */
class KvAxisYCategories : public KvCategoryAxis<KvBaseAxisY>
{
    Q_OBJECT
};

} // namespace kvCharts
