// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QByteArray>

struct ZtFault;

/** Brings the bytes of a text file into UTF-8 without a byte order mark. */
class ZT_MEASURING_EXPORT ZtTextDecoder
{
public:
    /**
     * Accepts UTF-8 with or without a byte order mark, and UTF-16 with one.
     * \return false, with a message and, where known, a line in \a fault, for any other bytes
     */
    static bool toUtf8(const QByteArray &bytes, QByteArray *utf8, ZtFault *fault);

    /** Position of the first byte that is not valid UTF-8, or -1. */
    static int firstInvalidByte(const QByteArray &bytes);
};
