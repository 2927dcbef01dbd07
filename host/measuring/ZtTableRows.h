// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

struct ZtCsvRow;
struct ZtFault;

/** The rows of a table, however its file is written, in any number of passes. In most tables the first row
 * names the columns. */
class ZT_MEASURING_EXPORT ZtTableRows
{
public:
    virtual ~ZtTableRows();

    /** Goes back to the first row. */
    virtual void rewind() = 0;
    /** Reads the next row; false behind the last one and after a fault, which fault() then holds. */
    virtual bool next(ZtCsvRow *row) = 0;
    virtual const ZtFault &fault() const = 0;
    /** The rows from here to the end take this part of the time that the whole table takes, 0 to 1. */
    virtual void beginPass(double from, double to) = 0;
};
