// SPDX-License-Identifier: MIT
#include "measuring/ZtFramePool.h"

#include <atomic>

QImage ZtFramePool::take(const QSize &size, QImage::Format format)
{
    for (int i = 0; i < m_images.size(); ++i) {
        if (!m_images.at(i).isDetached())
            continue;
        // Whoever held it last has read what it wanted before anything is written.
        std::atomic_thread_fence(std::memory_order_acquire);
        const QImage free = m_images.takeAt(i);
        if (free.size() == size && free.format() == format)
            return free;
        --i; // of another size, so of no use
    }
    return QImage(size, format);
}

void ZtFramePool::keep(const QImage &filled)
{
    if (m_images.size() < capacity)
        m_images.append(filled);
}
