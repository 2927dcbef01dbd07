// SPDX-License-Identifier: MIT
#include "KvDeskSnapshots.h"

#include "KvDeskActions.h"
#include "KvDeskGallerySettings.h"
#include "KvDeskSnapshotFile.h"
#include "KvDeskStatus.h"
#include "common/ZtAppStatus.h"
#include "image/ZtImage.h"
#include "kernel/ZtImageTools.h"
#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtKernelImage.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtWorkerThread.h"

#include <QAction>
#include <QDateTime>
#include <QFileInfo>
#include <QTransform>

KvDeskSnapshots::KvDeskSnapshots(KvDeskActions *actions, ZtMeasuringDocument *document, QObject *parent)
    : QObject(parent)
    , m_actions(actions)
    , m_document(document)
{
    QAction *const take = actions->action(KvDeskActions::TakeSnapshot);
    QAction *const measurements = actions->action(KvDeskActions::SnapshotMeasurements);
    // A key that is held down would fill the disk.
    take->setAutoRepeat(false);
    measurements->setChecked(KvDeskGallerySettings::areMeasurementsBurntIn());
    connect(take, SIGNAL(triggered()), this, SLOT(slotTake()));
    connect(measurements, SIGNAL(toggled(bool)), this, SLOT(slotMeasurementsToggled(bool)));
    connect(document, SIGNAL(signalImageChanged()), this, SLOT(slotUpdate()));
    slotUpdate();
}

KvDeskSnapshots::~KvDeskSnapshots()
{
    if (!m_thread)
        return;
    m_thread->disconnect(this);
    ZtWorkerThread::retire(std::move(m_thread));
    // What was taken is not lost because the program ends.
    ZtWorkerThread::retire(ZtWorkerThread::begin([waiting = m_waiting]() {
        ZtFault fault;
        for (const Snapshot &snapshot : waiting)
            KvDeskSnapshotFile::save(snapshot.image, snapshot.path, &fault);
    }));
}

void KvDeskSnapshots::slotUpdate()
{
    m_actions->setPossible(KvDeskActions::TakeSnapshot, !m_document->kernelImage()->frame().isNull(),
                           tr("Open an image first"));
}

void KvDeskSnapshots::slotMeasurementsToggled(bool aChecked)
{
    KvDeskGallerySettings::setMeasurementsBurntIn(aChecked);
}

QImage KvDeskSnapshots::picture() const
{
    QImage image = m_document->kernelImage()->frame();
    if (!image.isNull() && m_actions->action(KvDeskActions::SnapshotMeasurements)->isChecked()) {
        ZtImage canvas(image);
        ZtImageTools::getInstance()->drawEditorObjectsOnImage(&canvas, QTransform());
        image = canvas.getQImage();
    }
    if (!image.isNull())
        KvDeskSnapshotFile::setPixelSize(&image, m_document->calibration());
    return image;
}

QStringList KvDeskSnapshots::takenPaths() const
{
    QStringList paths{m_path};
    for (const Snapshot &snapshot : m_waiting)
        paths.append(snapshot.path);
    return paths;
}

void KvDeskSnapshots::slotTake()
{
    if (m_waiting.size() >= maximumWaiting) {
        tellFault(tr("No snapshot was taken: earlier ones are still being saved"));
        return;
    }
    const QImage image = picture();
    if (image.isNull())
        return;
    const QString path = KvDeskSnapshotFile::unusedPath(KvDeskGallerySettings::snapshotsFolder(),
                                                        QDateTime::currentDateTime(), takenPaths());
    m_waiting.append({image, path});
    startNext();
}

void KvDeskSnapshots::startNext()
{
    if (m_thread || m_waiting.isEmpty())
        return;
    const Snapshot snapshot = m_waiting.takeFirst();
    m_path = snapshot.path;
    m_result = std::make_shared<ZtFault>();
    m_thread = ZtWorkerThread::create([snapshot, result = m_result]() {
        KvDeskSnapshotFile::save(snapshot.image, snapshot.path, result.get());
    });
    connect(m_thread.get(), SIGNAL(finished()), this, SLOT(slotFinished()));
    m_thread->start();
}

void KvDeskSnapshots::slotFinished()
{
    m_thread.reset();
    const QString path = m_path;
    m_path.clear();
    if (m_result->isNull()) {
        KvDeskStatus::log(ZtAppStatus::Information,
                          tr("Snapshot saved: %1").arg(ZtLeftToRight::isolated(QFileInfo(path).fileName())),
                          QStringLiteral("KvDeskSnapshots::slotFinished"));
        emit signalSaved(path);
    } else {
        tellFault(tr("The snapshot was not saved. %1").arg(m_result->text()));
    }
    startNext();
}

// In the panel, which opens for it: the user did not wait for an answer.
void KvDeskSnapshots::tellFault(const QString &text) const
{
    ZtAppStatus status(ZtAppStatus::Error);
    status.setPreferredDestination(ZtAppStatus::StatusPanel);
    status.setAndLogStatus(ZtAppStatus::Error, 0, text, QStringLiteral("KvDeskSnapshots::slotTake"));
}
