// SPDX-License-Identifier: MIT
#pragma once

#include <QImage>
#include <QVector>

/**
 * A picture at half, a quarter, ... of its size, each pixel the average of those it stands for. Made for
 * every frame of a camera, so it is quick in the one thread it is asked in, and its memory is used again.
 *
 * Where the size cannot be halved, the last column or row stands for one of the picture's own: a pixel is
 * exactly so many of the picture's wide and high.
 */
class KvDeskHalvedImage
{
public:
    /** The picture halved so many times, at least once; valid until the next call. */
    const QImage &of(const QImage &image, int times);
    void clear();

private:
    QVector<QImage> m_steps; ///< half, a quarter, ...; whoever holds one of them makes the next call copy it
};
