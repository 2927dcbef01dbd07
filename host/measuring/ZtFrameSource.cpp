// SPDX-License-Identifier: MIT
#include "measuring/ZtFrameSource.h"

ZtFrameSource::ZtFrameSource(QObject *parent)
    : QObject(parent)
{
    m_clock.start();
    // Whoever derives from this class only has to announce its frames.
    connect(this, SIGNAL(signalFrameReady()), this, SLOT(slotCountFrame()));
}

ZtFrameSource::~ZtFrameSource() = default;

double ZtFrameSource::frameRate() const
{
    return m_meter.rate(m_clock.elapsed());
}

void ZtFrameSource::slotCountFrame()
{
    m_meter.addFrame(m_clock.elapsed());
}
