// SPDX-License-Identifier: MIT
#include "KvTerminalProgress.h"

#include "KvCliOutput.h"

namespace {
constexpr qint64 kQuietMs = 500;
constexpr qint64 kIntervalMs = 100;
} // namespace

KvTerminalProgress::KvTerminalProgress(const KvCliOutput &output)
    : m_isWanted(!output.isQuiet() && KvCliOutput::isTerminal())
{
    m_sinceStart.start();
}

void KvTerminalProgress::pageWritten(int done, int total)
{
    if (!m_isWanted || m_sinceStart.elapsed() < kQuietMs)
        return;
    if (m_isShown && m_sinceShown.elapsed() < kIntervalMs)
        return;
    m_isShown = true;
    m_sinceShown.start();
    KvCliOutput::progress(tr("page %1 of %2").arg(done).arg(total));
}

void KvTerminalProgress::finish()
{
    if (m_isShown)
        KvCliOutput::progress(QString());
    m_isShown = false;
}
