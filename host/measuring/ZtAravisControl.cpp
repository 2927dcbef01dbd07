// SPDX-License-Identifier: MIT
#include "measuring/ZtAravisControl.h"

#include <QMutexLocker>

#include <utility>

ZtAravisControl::Facts ZtAravisControl::facts() const
{
    const QMutexLocker lock(&m_mutex);
    return m_facts;
}

bool ZtAravisControl::setFacts(const Facts &facts)
{
    const QMutexLocker lock(&m_mutex);
    if (facts == m_facts)
        return false;
    m_facts = facts;
    return true;
}

void ZtAravisControl::wishExposure(double milliseconds)
{
    const QMutexLocker lock(&m_mutex);
    m_wishes.exposure = milliseconds;
}

void ZtAravisControl::wishFramesPerSecond(double framesPerSecond)
{
    const QMutexLocker lock(&m_mutex);
    m_wishes.framesPerSecond = framesPerSecond;
}

void ZtAravisControl::wishUnplugging()
{
    const QMutexLocker lock(&m_mutex);
    m_wishes.unplugging = true;
}

ZtAravisControl::Wishes ZtAravisControl::takeWishes()
{
    const QMutexLocker lock(&m_mutex);
    return std::exchange(m_wishes, Wishes());
}
