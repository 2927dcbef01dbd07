// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringGlobal.h"
#include "measuring/ZtReadyObjects.h"
#include "measuring/ZtSession.h"
#include "measuring/ZtStillImageSource.h"

#include <memory>
#include <vector>

class ZtProgress;

/** A session that was read together with its image: all that a document needs to show it. */
struct ZT_MEASURING_EXPORT ZtLoadedSession
{
    ZtSession session;
    std::unique_ptr<ZtStillImageSource>
        image;                                ///< null for a session without one, and when it cannot be shown
    ZtFault imageFault;                       ///< then why it cannot
    std::vector<ZtReadyObjects> tableObjects; ///< of the session's tables; empty when nobody made them

    /**
     * Reads a session file and its image; false with a fault when the former fails. From any thread: the
     * image belongs to the thread of the application afterwards.
     */
    bool read(const QString &path, ZtFault *fault, ZtProgress *progress = nullptr);
    /** The same of a session file \a bytes at \a path. */
    bool parse(const QByteArray &bytes, const QString &path, ZtFault *fault, ZtProgress *progress = nullptr);
    /** Reads the image of a session that is there already. */
    void readImage(ZtProgress *progress = nullptr);

private:
    bool finish(ZtFault *fault, ZtProgress *progress);
};
