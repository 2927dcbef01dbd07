// SPDX-License-Identifier: MIT
#include "charts/KvBaseChartPart.h"

namespace kvCharts {

KvBaseChartPart::KvBaseChartPart() = default;

KvBaseChartPart::~KvBaseChartPart() = default;

} // namespace kvCharts
