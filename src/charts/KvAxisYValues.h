// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvBaseAxisY.h"
#include "charts/KvValueAxis.h"

namespace kvCharts {

/** Value axis along y. */
class KvAxisYValues : public KvValueAxis<KvBaseAxisY>
{
    Q_OBJECT
};

} // namespace kvCharts
