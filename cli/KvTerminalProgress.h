// SPDX-License-Identifier: MIT
#pragma once

#include "report/KvPrintProgress.h"

#include <QCoreApplication>
#include <QElapsedTimer>

class KvCliOutput;

/** Shows how far a long print is, on a terminal only and not in the first half second. */
class KvTerminalProgress : public KvPrintProgress
{
    Q_DECLARE_TR_FUNCTIONS(KvTerminalProgress)

public:
    explicit KvTerminalProgress(const KvCliOutput &output);

    void pageWritten(int done, int total) override;
    /** Removes the progress line. */
    void finish();

private:
    QElapsedTimer m_sinceStart;
    QElapsedTimer m_sinceShown;
    bool m_isWanted;
    bool m_isShown = false;
};
