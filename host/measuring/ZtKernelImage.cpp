// SPDX-License-Identifier: MIT
#include "measuring/ZtKernelImage.h"

#include "common/ZtAppStatus.h"
#include "kernel/ZtLeftToRight.h"

ZtKernelImage::ZtKernelImage(QObject *parent)
    : iZTKernelImage(parent)
{}

void ZtKernelImage::setSource(ZtFrameSource *source)
{
    if (source == m_source)
        return;
    setFrozen(false);
    if (m_source)
        m_source->disconnect(this);
    m_source = source;
    m_wasLost = source && source->state() == ZtFrameSource::Lost;
    if (source)
        connectSource();
}

void ZtKernelImage::connectSource()
{
    connect(m_source, SIGNAL(signalFrameReady()), this, SLOT(slotFrameReady()));
    connect(m_source, SIGNAL(signalStateChanged()), this, SLOT(slotStateChanged()));
    connect(m_source, SIGNAL(signalFault(QString)), this, SLOT(slotFault(QString)));
}

QImage ZtKernelImage::frame() const
{
    if (m_isFrozen)
        return m_frozenFrame;
    return m_source ? m_source->frame() : QImage();
}

void ZtKernelImage::setFrozen(bool frozen)
{
    if (frozen == m_isFrozen)
        return;
    m_frozenFrame = frozen ? frame() : QImage();
    m_isFrozen = frozen;
    emit signalFrozenChanged(frozen);
    if (!frozen)
        requestImage();
}

void ZtKernelImage::requestImage()
{
    const QImage image = frame();
    if (image.isNull())
        return;
    FrameData data;
    data.image = QSharedPointer<ZtImage>::create(image);
    data.rect = image.rect();
    bool handled = false;
    emit signalImageCompleted(data, handled);
}

void ZtKernelImage::slotFrameReady()
{
    if (m_wasLost)
        logReturn();
    if (!m_isFrozen)
        requestImage();
}

// Why a source is lost comes as a fault of its own.
void ZtKernelImage::slotStateChanged()
{
    m_wasLost = m_wasLost || m_source->state() == ZtFrameSource::Lost;
}

void ZtKernelImage::logReturn()
{
    m_wasLost = false;
    ZtAppStatus().setAndLogStatus(
        ZtAppStatus::Information, 0,
        tr("%1 delivers pictures again").arg(ZtLeftToRight::isolated(m_source->displayName())),
        QStringLiteral("ZtKernelImage::slotFrameReady"));
}

void ZtKernelImage::slotFault(const QString &aText)
{
    ZtAppStatus().setAndLogStatus(ZtAppStatus::Warning, 0, aText, QStringLiteral("ZtKernelImage::slotFault"));
}
