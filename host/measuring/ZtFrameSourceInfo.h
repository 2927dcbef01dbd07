// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

/** A frame source that can be opened: a device that is present, or a path. */
struct ZtFrameSourceInfo
{
    enum Kind {
        StillImage,   ///< a picture file
        ImageFolder,  ///< the pictures of a folder, played
        VideoFile,    ///< a video file, played
        UvcCamera,    ///< a camera of the system, such as a webcam
        GenicamCamera ///< an industrial camera on USB or Ethernet
    };

    Kind kind = StillImage;
    QString id;    ///< what the kind knows it by: a path or the name of a device; not for the user
    QString title; ///< what the user calls it

    bool operator==(const ZtFrameSourceInfo &other) const { return kind == other.kind && id == other.id; }
    bool operator!=(const ZtFrameSourceInfo &other) const { return !(*this == other); }
};
