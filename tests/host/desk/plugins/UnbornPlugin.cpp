// SPDX-License-Identifier: MIT
#include "host/desk/plugins/FakePlugin.h"

/** Throws when it is made, and nothing that has a text. */
class UnbornPlugin : public FakePlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "UnbornPlugin")
public:
    UnbornPlugin()
        : FakePlugin(QStringLiteral("UnbornPlugin"), 5, true)
    {
        throw 1;
    }
};

#include "UnbornPlugin.moc"
