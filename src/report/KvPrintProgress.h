// SPDX-License-Identifier: MIT
#pragma once

/** Told how far a print is. */
class KvPrintProgress
{
public:
    virtual ~KvPrintProgress() = default;

    /** \a done of \a total pages are written; called once before the first with 0. */
    virtual void pageWritten(int done, int total) = 0;

    /** Asked between pages; once true, the print ends and leaves an unfinished file behind. */
    virtual bool isCancelled() const { return false; }
};
