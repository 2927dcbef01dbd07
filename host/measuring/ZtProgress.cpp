// SPDX-License-Identifier: MIT
#include "measuring/ZtProgress.h"

void ZtProgress::setPart(double from, double to)
{
    m_from = from;
    m_to = to;
    setDone(0.0);
}

void ZtProgress::setDone(double share)
{
    m_fraction = m_from + (m_to - m_from) * qBound(0.0, share, 1.0);
}

bool ZtProgress::change(State to)
{
    State before = Running;
    return m_state.compare_exchange_strong(before, to) || before == to;
}

bool ZtProgress::cancel()
{
    return change(Cancelled);
}

bool ZtProgress::commit()
{
    return change(Committed);
}

void ZtProgress::setPart(ZtProgress *progress, double from, double to)
{
    if (progress)
        progress->setPart(from, to);
}

bool ZtProgress::look(ZtProgress *progress, qint64 done, qint64 count)
{
    if (!progress || done % stride != 0)
        return true;
    if (count > 0)
        progress->setDone(static_cast<double>(done) / static_cast<double>(count));
    return !progress->isCancelled();
}
