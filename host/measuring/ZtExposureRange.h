// SPDX-License-Identifier: MIT
#pragma once

/** The exposure times that a camera offers, in milliseconds. */
struct ZtExposureRange
{
    double minimum = 0.0;
    double maximum = 0.0;

    bool operator==(const ZtExposureRange &other) const
    {
        return minimum == other.minimum && maximum == other.maximum;
    }
};
