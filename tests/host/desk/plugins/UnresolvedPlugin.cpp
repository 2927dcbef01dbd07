// SPDX-License-Identifier: MIT
#include "host/desk/plugins/FakePlugin.h"

/** Of a library that is not installed. */
int functionOfNobody();

/** A plug-in that needs what is nowhere. */
class UnresolvedPlugin : public FakePlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "UnresolvedPlugin")
public:
    UnresolvedPlugin()
        : FakePlugin(QStringLiteral("UnresolvedPlugin"), functionOfNobody(), true)
    {}
};

#include "UnresolvedPlugin.moc"
