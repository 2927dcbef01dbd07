// SPDX-License-Identifier: MIT
#pragma once

#include <QMetaMethod>
#include <QStringList>

/** Signatures of the methods of one kind that a class declares itself, in the order of their declaration. */
inline QStringList ownMethods(const QMetaObject &metaObject, QMetaMethod::MethodType kind)
{
    QStringList signatures;
    for (int i = metaObject.methodOffset(); i < metaObject.methodCount(); ++i) {
        const QMetaMethod method = metaObject.method(i);
        if (method.methodType() == kind && method.access() == QMetaMethod::Public)
            signatures.append(QString::fromLatin1(method.methodSignature()));
    }
    return signatures;
}
