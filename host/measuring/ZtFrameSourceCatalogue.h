// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFrameSourceInfo.h"
#include "measuring/ZtMeasuringGlobal.h"

#include <QVector>

#include <memory>

class ZtFrameSource;
struct ZtFault;

/**
 * The frame sources of this build. Kinds whose libraries were missing when it was configured do not appear.
 *
 * Sources that are live are opened stopped.
 */
class ZT_MEASURING_EXPORT ZtFrameSourceCatalogue
{
public:
    static bool isAvailable(ZtFrameSourceInfo::Kind kind);

    /** The cameras that are connected. GUI thread only; takes a second where cameras on the network are
     * looked for, see ZtFrameSourceScan for a way that does not wait. */
    static QVector<ZtFrameSourceInfo> list();
    /** The part of list() that the system knows; quick. GUI thread only. */
    static QVector<ZtFrameSourceInfo> listSystemCameras();
    /** The part of list() that takes time; from any thread. */
    static QVector<ZtFrameSourceInfo> listNetworkCameras();

    /** Makes a camera appear that needs no hardware; false where this build has none. */
    static bool enableFakeCamera();

    /** Null with a fault when the source cannot be opened. Whether a camera answers shows when it is started.
     */
    static std::unique_ptr<ZtFrameSource> open(const ZtFrameSourceInfo &info, ZtFault *fault);

    /** Opens a folder of pictures, a video file or a picture file, whichever it is. */
    static std::unique_ptr<ZtFrameSource> openPath(const QString &path, ZtFault *fault);

    /** What openPath() takes a path for. Files are judged by their names. */
    static ZtFrameSourceInfo infoOfPath(const QString &path);

    /** Suffixes of video files without a dot, in lower case; none where videos cannot be played. */
    static QStringList videoSuffixes();
};
