// SPDX-License-Identifier: MIT
#pragma once

#include "ReportCases.h"

/** The table report on the pages of a shown editor view, as while the user measures. */
class LiveReport
{
public:
    enum class Sections { None, All };

    explicit LiveReport(Sections sections = Sections::None);
    ~LiveReport();

    /** The table takes the records in again; sizes and pages stay. */
    void refreshInPlace();
    /** All pieces and sections are measured, as for each block that tells of another size. */
    void measure();
    /** Pages and frames are looked through for what changed, which is nothing. */
    void reflow();
    /** Records, groups, table and pages follow what the host has now, up to the painting of the view. */
    void takeRecords();
    int pageCount() const;

private:
    TableReport m_report;
    std::unique_ptr<KvReportPagedView> m_view;
};
