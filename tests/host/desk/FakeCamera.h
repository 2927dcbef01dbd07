// SPDX-License-Identifier: MIT
#pragma once

#include "host/measuring/FakeLiveSource.h"

/** A camera of the tests that has an exposure, which it takes in steps of half a millisecond. */
class FakeCamera : public FakeLiveSource
{
public:
    QString displayName() const override { return QStringLiteral("Cam"); }
    std::optional<ZtExposureRange> exposureRange() const override { return range; }
    double exposure() const override { return m_exposure; }
    void setExposure(double milliseconds) override
    {
        wishes.append(milliseconds);
        m_exposure = qRound(milliseconds * 2.0) / 2.0;
        emit signalExposureChanged();
    }

    /** Delivers a picture; comes through the event loop. */
    void deliver(const QColor &color = Qt::green) { mailbox->put(picture(color)); }

    std::optional<ZtExposureRange> range = ZtExposureRange{0.01, 1000.0};
    QVector<double> wishes;

private:
    double m_exposure = 20.0;
};
