// SPDX-License-Identifier: MIT
#pragma once

#include "ReportCases.h"

/** The table report on the pages of a shown editor view, as while the user measures. */
class LiveReport
{
public:
    LiveReport();
    ~LiveReport();

    /** The table takes the records in again; sizes and pages stay. */
    void refreshInPlace();
    /** All pages and frames are made anew. */
    void reflow();
    int pageCount() const;

private:
    TableReport m_report;
    std::unique_ptr<KvReportPagedView> m_view;
};
