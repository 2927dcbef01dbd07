// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtCalibration.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtPicture.h"
#include "measuring/ZtPictureReader.h"

#include <memory>

class ZtProgress;
struct ZtFault;

/** A picture file as a frame source. */
class ZT_MEASURING_EXPORT ZtStillImageSource : public ZtFrameSource
{
    Q_OBJECT
public:
    /** Larger pictures are refused. */
    static constexpr qint64 maximumPixels = ZtPictureReader::maximumPixels;

    /** Loads a TIFF or a picture of any format that Qt decodes, turned upright; null with a fault when it
     * cannot be used. */
    static std::unique_ptr<ZtStillImageSource> load(const QString &path, ZtFault *fault,
                                                    qint64 pixelLimit = maximumPixels,
                                                    ZtProgress *progress = nullptr);

    QImage frame() const override { return m_picture.image; }
    QString displayName() const override;

    /** Absolute path of the file. */
    QString path() const { return m_path; }

    /** The bits that the grey values of the file take; frame() shows the upper eight. 8 for all other
     * pictures.
     */
    int greyBits() const { return m_picture.greyBits; }

    /**
     * The pixel size that the file states: by OME-XML, by ImageJ, by the resolution of the format. Unknown
     * when it states none, or a resolution that programs write without meaning it (72, 96, 120, 144 and 192
     * dots per inch).
     */
    ZtOfferedPixelSize offeredPixelSize() const { return m_picture.pixelSize; }

    /** The same as a calibration that has the name of the file; uncalibrated when it states none. */
    ZtCalibration offeredCalibration() const;

private:
    ZtStillImageSource(const QString &path, const ZtPicture &picture);

    QString m_path;
    ZtPicture m_picture;
};
