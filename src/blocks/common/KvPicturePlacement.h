// SPDX-License-Identifier: MIT
#pragma once

#include <Qt>

class QJsonObject;

/**
 * How a picture stands in a report: the settings that all blocks with a picture share.
 *
 * In files each is a decimal number inside a string, unlike the numbers of the other blocks.
 */
struct KvPicturePlacement
{
    Qt::Alignment alignment = Qt::AlignHCenter | Qt::AlignVCenter;
    int widthPercent = 75; ///< of the width between the page's margins; 1..100
    int rotation = 0;      ///< clockwise, in degrees; 0, 90, 180 or 270

    bool operator==(const KvPicturePlacement &other) const;
    bool operator!=(const KvPicturePlacement &other) const { return !(*this == other); }

    void toJson(QJsonObject &config) const;
    /** Whether \a config has all keys that readFrom() requires. */
    static bool isIn(const QJsonObject &config);
    /**
     * Reads alignment, width and rotation, in this order. False at a text that is no number: the member is
     * then 0 and what follows is left as it was. What is no text keeps its value; only the rotation is 0
     * unless it is a number in a text.
     */
    bool readFrom(const QJsonObject &config);
};
