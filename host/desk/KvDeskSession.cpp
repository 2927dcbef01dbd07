// SPDX-License-Identifier: MIT
#include "KvDeskSession.h"

#include "kernel/ZtKernelData.h"
#include "kernel/ZtLeftToRight.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtImportedTable.h"
#include "measuring/ZtLoadedSession.h"
#include "measuring/ZtMeasuringDocument.h"
#include "measuring/ZtReadyObjects.h"
#include "measuring/ZtTableImport.h"

#include <QFileInfo>
#include <QScopedValueRollback>

KvDeskSession::KvDeskSession(ZtMeasuringDocument *document, QObject *parent)
    : QObject(parent)
    , m_document(document)
{
    connectSignals();
}

void KvDeskSession::connectSignals()
{
    const ZtSignalCenter *const center = ZtSignalCenter::getInstance();
    connect(center, SIGNAL(signalObjectCreated(int,int,const ZtKernelObjectData*)), this,
                           SLOT(slotMarkModified()));
    connect(center, SIGNAL(signalObjectChanged(int,int,const ZtKernelObjectData*)), this,
                           SLOT(slotMarkModified()));
    connect(center, SIGNAL(signalObjectRemoved(int,int)), this, SLOT(slotMarkModified()));
    connect(m_document, SIGNAL(signalCalibrationChanged()), this, SLOT(slotMarkModified()));
}

QString KvDeskSession::displayName() const
{
    return m_path.isEmpty() ? tr("Untitled session") : ZtLeftToRight::isolated(QFileInfo(m_path).fileName());
}

int KvDeskSession::objectCount() const
{
    int count = 0;
    for (const ZtObjectMap &objects : ZtKernelData::getInstance()->objects())
        count += objects.size();
    return count;
}

void KvDeskSession::clear()
{
    {
        const QScopedValueRollback<bool> replacing(m_isReplacing, true);
        m_document->clear();
    }
    m_stamp = KvDeskFileStamp();
    emit signalReplaced();
    setState(QString(), false);
}

bool KvDeskSession::open(const QString &path, bool withoutImage, ZtFault *fault)
{
    const KvDeskFileStamp stamp = KvDeskFileStamp::of(path);
    ZtLoadedSession loaded;
    if (!loaded.read(path, fault))
        return false;
    if (!withoutImage && !loaded.imageFault.isNull()) {
        *fault = {path, 0, 0, QStringLiteral("image"), loaded.imageFault.text()};
        return false;
    }
    setSession(&loaded, path, stamp);
    return true;
}

void KvDeskSession::setSession(ZtLoadedSession *loaded, const QString &path, const KvDeskFileStamp &stamp)
{
    replaceBy(loaded, stamp);
    setState(QFileInfo(path).absoluteFilePath(), false);
}

void KvDeskSession::setCopy(ZtLoadedSession *loaded)
{
    replaceBy(loaded, KvDeskFileStamp());
    setState(QString(), false);
}

void KvDeskSession::restore(ZtLoadedSession *loaded, const QString &path, const KvDeskFileStamp &stamp)
{
    replaceBy(loaded, stamp);
    ++m_changeCount;
    setState(path, true);
}

void KvDeskSession::replaceBy(ZtLoadedSession *loaded, const KvDeskFileStamp &stamp)
{
    {
        const QScopedValueRollback<bool> replacing(m_isReplacing, true);
        m_document->setSession(loaded);
    }
    m_stamp = stamp;
    emit signalReplaced();
}

bool KvDeskSession::save(const QString &path, ZtFault *fault)
{
    if (!m_document->saveSession(path, fault))
        return false;
    setSaved(path, m_changeCount);
    return true;
}

void KvDeskSession::setSaved(const QString &path, quint64 changeCount)
{
    m_stamp = KvDeskFileStamp::of(path);
    setState(QFileInfo(path).absoluteFilePath(), m_isModified && changeCount != m_changeCount);
}

// Of a file that is gone nothing is lost by writing it.
bool KvDeskSession::isChangedOnDisk() const
{
    const KvDeskFileStamp stamp = KvDeskFileStamp::of(m_path);
    return stamp.exists() && stamp != m_stamp;
}

bool KvDeskSession::openImage(const QString &path, ZtFault *fault)
{
    std::unique_ptr<ZtStillImageSource> image = ZtStillImageSource::load(path, fault);
    if (!image)
        return false;
    showImage(std::move(image));
    return true;
}

void KvDeskSession::showImage(std::unique_ptr<ZtStillImageSource> image)
{
    const bool isFresh = m_path.isEmpty() && objectCount() == 0;
    const QScopedValueRollback<bool> replacing(m_isReplacing, isFresh);
    m_document->showImage(std::move(image));
    if (!m_document->calibration().isCalibrated() && objectCount() == 0)
        m_document->setCalibration(offeredNow());
    slotMarkModified();
    emit signalImageOpened();
}

ZtCalibration KvDeskSession::offeredNow() const
{
    ZtCalibration calibration = m_document->offeredCalibration();
    if (calibration.isCalibrated())
        calibration.setDate(QDateTime::currentDateTimeUtc());
    return calibration;
}

void KvDeskSession::showSource(std::unique_ptr<ZtFrameSource> source)
{
    const bool isFresh = m_path.isEmpty() && objectCount() == 0;
    const QScopedValueRollback<bool> replacing(m_isReplacing, isFresh);
    m_document->setFrameSource(std::move(source));
    slotMarkModified();
}

bool KvDeskSession::importTable(const QString &path, ZtFault *fault, QStringList *notes)
{
    ZtImportedTable table;
    if (!ZtTableImport::readFile(path, ZtTableImportOptions(), &table, fault))
        return false;
    *notes = table.notes;
    std::vector<ZtReadyObjects> ready = ZtReadyObjects::ofTable(table);
    addTable(&ready);
    return true;
}

void KvDeskSession::addTable(std::vector<ZtReadyObjects> *ready)
{
    m_document->addTable(ready);
    slotMarkModified();
}

void KvDeskSession::slotMarkModified()
{
    if (m_isReplacing)
        return;
    ++m_changeCount;
    setState(m_path, true);
    emit signalChanged();
}

void KvDeskSession::setState(const QString &path, bool isModified)
{
    if (path == m_path && isModified == m_isModified)
        return;
    m_path = path;
    m_isModified = isModified;
    emit signalStateChanged();
}
