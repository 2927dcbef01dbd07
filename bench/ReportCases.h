// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

#include <memory>

class KvReportKernelData;
class KvReportPagedView;
class KvTemplateModel;
class KvBlockTypeList;

/** A report of one measurements table with all four columns over the synthetic host's records. */
class TableReport
{
public:
    TableReport();
    ~TableReport();

    KvTemplateModel &model() { return *m_model; }
    KvReportKernelData &kernelData() { return *m_kernelData; }

    /** Prints the report; the number of pages is that of the records over 39 or so. */
    bool print(const QString &fileName);

private:
    std::unique_ptr<KvReportKernelData> m_kernelData;
    std::unique_ptr<KvBlockTypeList> m_blocks;
    std::unique_ptr<KvTemplateModel> m_model;
};

/** The same rows and pages drawn with bare QPainter calls on a QPdfWriter at 600 dpi: what printing costs at
 * least. */
bool printFloor(const QString &fileName);
