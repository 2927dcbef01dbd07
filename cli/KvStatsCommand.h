// SPDX-License-Identifier: MIT
#pragma once

class KvCliOutput;
struct KvCliArguments;

/** "statreport stats": the statistics of every group of measured values. */
class KvStatsCommand
{
public:
    KvStatsCommand(const KvCliArguments &arguments, const KvCliOutput &output);

    /** Returns the exit code. */
    int run();

private:
    const KvCliArguments &m_arguments;
    const KvCliOutput &m_output;
};
