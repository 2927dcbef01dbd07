// SPDX-License-Identifier: MIT
#pragma once

#include <QCoreApplication>

#include <memory>

class KvBlockTypeList;
class KvCliOutput;
class KvReportKernelData;
class ZtMeasuringDocument;
struct KvCliArguments;

/** What stands in for the measuring application: its document, the adapter of the plug-in, and the block
 * types. */
class KvCliHost
{
    Q_DECLARE_TR_FUNCTIONS(KvCliHost)

public:
    KvCliHost();
    ~KvCliHost();

    /** Reads session or table, and the image; false after writing an error. */
    bool loadData(const KvCliArguments &arguments, const KvCliOutput &output);

    ZtMeasuringDocument &document() { return *m_document; }
    KvReportKernelData &kernelData() { return *m_kernelData; }
    KvBlockTypeList &blocks() { return *m_blocks; }

private:
    bool loadSession(const KvCliArguments &arguments, const KvCliOutput &output);
    bool loadTable(const KvCliArguments &arguments, const KvCliOutput &output);

    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvReportKernelData> m_kernelData;
    std::unique_ptr<KvBlockTypeList> m_blocks;
};
