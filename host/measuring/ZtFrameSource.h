// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtMeasuringGlobal.h"

#include <QImage>
#include <QObject>

/** Where pictures come from: an image file, a folder, a video, a camera. */
class ZT_MEASURING_EXPORT ZtFrameSource : public QObject
{
    Q_OBJECT
public:
    explicit ZtFrameSource(QObject *parent = nullptr);
    ~ZtFrameSource() override;

    /** The newest frame; null as long as there is none. */
    virtual QImage frame() const = 0;

    /** What the user calls this source, such as a file name. */
    virtual QString displayName() const = 0;

signals:
    void signalFrameReady(); ///< frame() is a new one
};
