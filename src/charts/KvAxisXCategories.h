// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvBaseAxisX.h"
#include "charts/KvCategoryAxis.h"

namespace kvCharts {

/** Category axis along x. */
class KvAxisXCategories : public KvCategoryAxis<KvBaseAxisX>
{
    Q_OBJECT
};

} // namespace kvCharts
