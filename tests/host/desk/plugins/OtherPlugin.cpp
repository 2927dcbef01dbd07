// SPDX-License-Identifier: MIT
#include <QObject>
#include <QtPlugin>

/** A Qt plug-in, but none for the application. */
class OtherPlugin : public QObject
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID "OtherPlugin")
};

#include "OtherPlugin.moc"
