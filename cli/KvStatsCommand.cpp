// SPDX-License-Identifier: MIT
#include "KvStatsCommand.h"

#include "KvCliArguments.h"
#include "KvCliHost.h"
#include "KvCliOutput.h"
#include "KvStatsReport.h"

#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"

KvStatsCommand::KvStatsCommand(const KvCliArguments &arguments, const KvCliOutput &output)
    : m_arguments(arguments)
    , m_output(output)
{}

int KvStatsCommand::run()
{
    KvCliHost host;
    if (!host.loadData(m_arguments, m_output))
        return 1;
    host.kernelData().setActive(true);
    const KvStatsReport report(KvStatisticsEngine::instance(), host.document(), m_arguments.groupByObject);
    host.kernelData().setActive(false);
    bool isWritten = false;
    switch (m_arguments.format) {
    case KvCliArguments::Csv:
        isWritten = m_output.result(report.toCsv());
        break;
    case KvCliArguments::Json:
        isWritten = m_output.result(report.toJson());
        break;
    default:
        isWritten = m_output.result(report.toText());
        break;
    }
    return isWritten ? 0 : 1;
}
