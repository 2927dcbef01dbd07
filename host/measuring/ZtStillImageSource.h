// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtCalibration.h"
#include "measuring/ZtFrameSource.h"

#include <memory>

struct ZtFault;

/** A picture file as a frame source. */
class ZT_MEASURING_EXPORT ZtStillImageSource : public ZtFrameSource
{
    Q_OBJECT
public:
    /** Larger pictures are refused: their pixels would take more than 1.6 GB. */
    static constexpr qint64 maximumPixels = 400LL * 1000 * 1000;

    /** Loads a picture of any format that Qt decodes, turned upright; null with a fault when it cannot be
     * used. */
    static std::unique_ptr<ZtStillImageSource> load(const QString &path, ZtFault *fault,
                                                    qint64 pixelLimit = maximumPixels);

    QImage frame() const override { return m_image; }
    QString displayName() const override;

    /** Absolute path of the file. */
    QString path() const { return m_path; }

    /**
     * The pixel size that the file states. Uncalibrated when it states none, another one per direction, or a
     * resolution that programs write without meaning it (72, 96, 120, 144 and 192 dots per inch).
     */
    ZtCalibration offeredCalibration() const;

private:
    ZtStillImageSource(const QString &path, const QImage &image);

    QString m_path;
    QImage m_image;
};
