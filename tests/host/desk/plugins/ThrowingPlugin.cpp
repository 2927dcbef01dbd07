// SPDX-License-Identifier: MIT
#include "host/desk/plugins/FakePlugin.h"

#include <stdexcept>

/** Throws when its tools are to be started. */
class ThrowingPlugin : public FakePlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "ThrowingPlugin")
public:
    ThrowingPlugin()
        : FakePlugin(QStringLiteral("ThrowingPlugin"), 5, true)
    {}

    bool initialize(const QString &groupName, KvGuiMainWindowBase *mainWindow) override
    {
        Q_UNUSED(groupName)
        Q_UNUSED(mainWindow)
        throw std::runtime_error("no licence for the tools");
    }
};

#include "ThrowingPlugin.moc"
