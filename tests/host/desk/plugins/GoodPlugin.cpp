// SPDX-License-Identifier: MIT
#include "host/desk/plugins/FakePlugin.h"

class GoodPlugin : public FakePlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "GoodPlugin")
public:
    GoodPlugin()
        : FakePlugin(QStringLiteral("GoodPlugin"), 50, true)
    {}
};

#include "GoodPlugin.moc"
