// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QCoreApplication>

class QFileDevice;

/**
 * Why the system refused a file, in the user's language: a few words without a full stop, for the brackets
 * behind a sentence. Causes that hardly anybody meets read as the system has them.
 */
class ZT_MEASURING_EXPORT ZtFileFault
{
    Q_DECLARE_TR_FUNCTIONS(ZtFileFault)
public:
    /** Why the last operation on \a file did not work. */
    static QString text(const QFileDevice &file);
    /** What an error number of the C library, such as ENOSPC, stands for. */
    static QString text(int errorNumber);
};
