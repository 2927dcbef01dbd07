// SPDX-License-Identifier: MIT
#include "KvDeskSession.h"

#include "kernel/ZtKernelData.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtMeasuringDocument.h"

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
    return m_path.isEmpty() ? tr("Untitled session") : QFileInfo(m_path).fileName();
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
    setState(QString(), false);
}

bool KvDeskSession::open(const QString &path, bool withoutImage, ZtFault *fault)
{
    const auto missing = withoutImage ? ZtMeasuringDocument::MissingImage::IsIgnored
                                      : ZtMeasuringDocument::MissingImage::IsFault;
    {
        const QScopedValueRollback<bool> replacing(m_isReplacing, true);
        if (!m_document->loadSession(path, fault, missing))
            return false;
    }
    setState(QFileInfo(path).absoluteFilePath(), false);
    return true;
}

bool KvDeskSession::save(const QString &path, ZtFault *fault)
{
    if (!m_document->saveSession(path, fault))
        return false;
    setState(QFileInfo(path).absoluteFilePath(), false);
    return true;
}

bool KvDeskSession::openImage(const QString &path, ZtFault *fault)
{
    const bool isFresh = m_path.isEmpty() && objectCount() == 0;
    const QScopedValueRollback<bool> replacing(m_isReplacing, isFresh);
    if (!m_document->loadImage(path, fault))
        return false;
    if (!m_document->calibration().isCalibrated() && objectCount() == 0)
        m_document->setCalibration(m_document->offeredCalibration());
    slotMarkModified();
    return true;
}

bool KvDeskSession::importTable(const QString &path, ZtFault *fault, QStringList *notes)
{
    if (!m_document->importTable(path, ZtTableImportOptions(), fault, notes))
        return false;
    slotMarkModified();
    return true;
}

void KvDeskSession::slotMarkModified()
{
    if (!m_isReplacing)
        setState(m_path, true);
}

void KvDeskSession::setState(const QString &path, bool isModified)
{
    if (path == m_path && isModified == m_isModified)
        return;
    m_path = path;
    m_isModified = isModified;
    emit signalStateChanged();
}
