// SPDX-License-Identifier: MIT
#pragma once

#include "charts/KvBaseAxisX.h"
#include "charts/KvValueAxis.h"

namespace kvCharts {

/** Value axis along x. */
class KvAxisXValues : public KvValueAxis<KvBaseAxisX>
{
    Q_OBJECT
};

} // namespace kvCharts
