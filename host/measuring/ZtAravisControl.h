// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtExposureRange.h"

#include <QMutex>

#include <optional>

/**
 * What the owner of an Aravis camera and the thread that talks to it tell one another. All methods may be
 * called from any thread.
 */
class ZtAravisControl
{
public:
    struct Wishes
    {
        std::optional<double> exposure; ///< milliseconds
        std::optional<double> framesPerSecond;
        bool unplugging = false;
    };

    struct Facts
    {
        std::optional<ZtExposureRange> exposureRange;
        double exposure = 0.0; ///< milliseconds
        double framesPerSecond = 0.0;

        bool operator==(const Facts &other) const
        {
            return exposureRange == other.exposureRange && exposure == other.exposure &&
                   framesPerSecond == other.framesPerSecond;
        }
    };

    Facts facts() const;
    /** Returns whether the facts are other ones. */
    bool setFacts(const Facts &facts);

    void wishExposure(double milliseconds);
    void wishFramesPerSecond(double framesPerSecond);
    void wishUnplugging();
    Wishes takeWishes();

    /** Held by the thread that uses the camera: a camera takes orders from one at a time. */
    QMutex *camera() { return &m_camera; }

private:
    mutable QMutex m_mutex;
    QMutex m_camera;
    Facts m_facts;
    Wishes m_wishes;
};
