// SPDX-License-Identifier: MIT
#include "host/desk/plugins/FakePlugin.h"

class FailingPlugin : public FakePlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "FailingPlugin")
public:
    FailingPlugin()
        : FakePlugin(QStringLiteral("FailingPlugin"), 20, false)
    {}
};

#include "FailingPlugin.moc"
