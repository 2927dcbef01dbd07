// SPDX-License-Identifier: MIT
#pragma once

namespace KvReportResources {

/** Makes the icons of the report libraries available; any number of calls. A static library does not do so
 * itself. */
void ensure();

} // namespace KvReportResources
