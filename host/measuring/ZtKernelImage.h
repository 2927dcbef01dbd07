// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/iZTKernelImage.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtMeasuringGlobal.h"

#include <QPointer>

/**
 * The kernel's image of a measuring application: hands on the frames of one source, unscaled and uncopied.
 *
 * What the source has to say to the user, and that it is lost or back, goes to the status log.
 */
class ZT_MEASURING_EXPORT ZtKernelImage : public iZTKernelImage
{
    Q_OBJECT
public:
    explicit ZtKernelImage(QObject *parent = nullptr);

    /** Takes frames from another source (not owned), or from none; that is not frozen. Every frame it
     * announces is delivered. */
    void setSource(ZtFrameSource *source);
    ZtFrameSource *source() const { return m_source; }

    /** The frame that is delivered: the source's newest, or while frozen the one it had then. */
    QImage frame() const;

    /** Frozen, the frame of this moment stays until the image is live again, which delivers the newest at
     * once. The source goes on. */
    void setFrozen(bool frozen);
    bool isFrozen() const { return m_isFrozen; }

    /** Delivers frame() at once. Receivers may draw on it: each delivery has a picture of its own, which
     * shares the pixels with the frame until somebody changes it. */
    void requestImage() override;

signals:
    void signalFrozenChanged(bool aFrozen);

private slots:
    void slotFrameReady();
    void slotStateChanged();
    void slotFault(const QString &aText);

private:
    void connectSource();
    void logReturn();

    QPointer<ZtFrameSource> m_source;
    QImage m_frozenFrame;
    bool m_wasLost = false; ///< and delivered nothing since
    bool m_isFrozen = false;
};
