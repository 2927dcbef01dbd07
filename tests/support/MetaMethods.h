// SPDX-License-Identifier: MIT
#pragma once

#include <QMetaMethod>
#include <QMetaObject>
#include <QStringList>

/** Signatures of a class's own signals (or slots, ...) in the order of their declaration. */
inline QStringList ownMethods(const QMetaObject &metaObject, QMetaMethod::MethodType type)
{
    QStringList signatures;
    for (int i = metaObject.methodOffset(); i < metaObject.methodCount(); ++i) {
        if (metaObject.method(i).methodType() == type)
            signatures.append(QString::fromLatin1(metaObject.method(i).methodSignature()));
    }
    return signatures;
}
