// SPDX-License-Identifier: MIT
#pragma once

namespace KvDeskResources {

/** Makes the program's icons available; any number of calls. A static library does not do so itself. */
void ensure();

} // namespace KvDeskResources
