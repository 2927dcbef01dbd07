// SPDX-License-Identifier: MIT
#include "host/desk/plugins/FakePlugin.h"

class EarlyPlugin : public FakePlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "EarlyPlugin")
public:
    EarlyPlugin()
        : FakePlugin(QStringLiteral("EarlyPlugin"), 10, true)
    {}
};

#include "EarlyPlugin.moc"
