// SPDX-License-Identifier: MIT
#pragma once

#include <QSignalSpy>

class KvBaseEditorNodeCfg;

/** The configuration that a recorded signalWidgetConfigChanged() carried; null when it carried something
 * else. */
inline const KvBaseEditorNodeCfg *configArgument(const QSignalSpy &spy, int emission)
{
    const QVariant argument = spy.at(emission).at(0);
    if (argument.userType() != QMetaType::type("const KvBaseEditorNodeCfg*"))
        return nullptr;
    return *static_cast<const KvBaseEditorNodeCfg *const *>(argument.constData());
}
