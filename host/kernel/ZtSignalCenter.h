// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/ZtKernelGlobal.h"

#include <QObject>

class ZtKernelObjectData;

/**
 * The one place where the application announces what happened. Emitters call the signals; GUI thread only.
 */
class ZT_KERNEL_EXPORT ZtSignalCenter : public QObject
{
    Q_OBJECT
public:
    static ZtSignalCenter *getInstance(); ///< made at the first call

signals:
    /** An object was added to ZtKernelData, where it is by now. */
    void signalObjectCreated(const int aType, const int aIndex, const ZtKernelObjectData *aObject);
    /** An object was edited (ZtKernelData::notifyObjectChanged()). */
    void signalObjectChanged(int aType, int aIndex, const ZtKernelObjectData *aObject);
    /** The object is already gone from ZtKernelData. */
    void signalObjectRemoved(const int aType, const int aIndex);
    void signalLengthUnitChanged(); ///< the unit in which the host shows lengths and areas changed
    void signalAngleUnitChanged();  ///< the unit in which the host shows angles changed
    void signalAppAboutToClose();   ///< last chance to write settings

private:
    ZtSignalCenter();
};
