// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/iZTKernelImage.h"
#include "measuring/ZtMeasuringGlobal.h"

#include <QPointer>

class ZtFrameSource;

/** The kernel's image of a measuring application: hands on the frames of one source, unscaled. */
class ZT_MEASURING_EXPORT ZtKernelImage : public iZTKernelImage
{
    Q_OBJECT
public:
    explicit ZtKernelImage(QObject *parent = nullptr);

    /** Takes frames from another source (not owned), or from none. Every frame it announces is delivered. */
    void setSource(ZtFrameSource *source);
    ZtFrameSource *source() const { return m_source; }

    /** Delivers the current frame at once; receivers may draw on it, as each delivery has a picture of its
     * own. */
    void requestImage() override;

private slots:
    void slotFrameReady();

private:
    QPointer<ZtFrameSource> m_source;
};
