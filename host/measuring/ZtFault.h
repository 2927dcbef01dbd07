// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QString>

/** Why a file could not be used: where, and one sentence for the user. */
struct ZT_MEASURING_EXPORT ZtFault
{
    QString file;    ///< as the caller named it
    int line = 0;    ///< from 1; 0 when the fault has no line
    int column = 0;  ///< field of the row in a table, from 1; 0 when the fault has none
    QString place;   ///< path inside a structured file, such as objects[3].points
    QString message; ///< one sentence without a full stop

    bool isNull() const { return message.isEmpty(); }

    /** "file:line:column: message" or "file: place: message"; parts that are not known are left out. Empty
     *  without a message. */
    QString text() const;
};
