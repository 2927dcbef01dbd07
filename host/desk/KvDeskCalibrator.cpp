// SPDX-License-Identifier: MIT
#include "KvDeskCalibrator.h"

#include "KvDeskCalibrationText.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskSession.h"
#include "KvDeskStatus.h"
#include "common/ZtAppStatus.h"
#include "kernel/ZtLeftToRight.h"
#include "measuring/ZtMeasuringDocument.h"

KvDeskCalibrator::KvDeskCalibrator(KvDeskSession *session, KvDeskObjectEditor *editor, QObject *parent)
    : QObject(parent)
    , m_session(session)
    , m_editor(editor)
{
    connectSignals();
}

void KvDeskCalibrator::connectSignals()
{
    connect(m_session, SIGNAL(signalImageOpened()), this, SLOT(slotImageOpened()));
    connect(m_session->document(), SIGNAL(signalImageChanged()), this, SLOT(slotImageChanged()));
    connect(m_session->document(), SIGNAL(signalCalibrationChanged()), this, SLOT(slotCalibrationChanged()));
    connect(m_editor, SIGNAL(signalCalibrationRestored()), this, SLOT(slotCalibrationRestored()));
    connect(&m_store, SIGNAL(signalChanged()), this, SIGNAL(signalChanged()));
}

KvDeskSelection *KvDeskCalibrator::selection() const
{
    return m_editor->selection();
}

ZtCalibration KvDeskCalibrator::current() const
{
    return m_session->document()->calibration();
}

ZtCalibration KvDeskCalibrator::offered() const
{
    return m_session->document()->offeredCalibration();
}

void KvDeskCalibrator::measureWith(const ZtCalibration &calibration)
{
    m_store.setLastObjective(calibration.objective());
    m_editor->setCalibration(calibration);
    logCalibrated(calibration);
}

void KvDeskCalibrator::logCalibrated(const ZtCalibration &calibration)
{
    const QString place = QStringLiteral("KvDeskCalibrator::logCalibrated");
    if (!calibration.isCalibrated()) {
        KvDeskStatus::log(ZtAppStatus::Information, KvDeskCalibrationText::summary(calibration), place);
        return;
    }
    QString name = calibration.objective().isEmpty() ? calibration.name() : calibration.objective();
    if (name.isEmpty())
        name = KvDeskCalibrationText::origin(calibration.origin());
    //: %1 is an objective or a file, %2 the size of a pixel with its unit
    const QString text =
        tr("Calibrated: %1, %2 per pixel")
            .arg(ZtLeftToRight::isolated(name), KvDeskCalibrationText::pixelSize(calibration));
    KvDeskStatus::log(ZtAppStatus::Information, text, place);
}

void KvDeskCalibrator::calibrate(ZtCalibration calibration)
{
    calibration.setDate(QDateTime::currentDateTimeUtc());
    if (!m_store.append(calibration))
        return;
    m_store.setAuthor(calibration.author());
    measureWith(calibration);
}

void KvDeskCalibrator::useAgain(ZtCalibration calibration, const QString &author)
{
    if (calibration == m_store.current(calibration.objective())) {
        measureWith(calibration);
        return;
    }
    calibration.setAuthor(author);
    calibrate(calibration);
}

void KvDeskCalibrator::slotUseOffered()
{
    ZtCalibration calibration = offered();
    calibration.setObjective(current().objective());
    calibration.setAuthor(m_store.author());
    calibrate(calibration);
}

bool KvDeskCalibrator::isOtherOffered() const
{
    return offered().isCalibrated() && !offered().hasNearlySamePixelSize(current());
}

// The first image of a session calibrates it without being asked.
bool KvDeskCalibrator::isOfferInUse() const
{
    return offered().isCalibrated() && current().hasSamePixelSize(offered()) &&
           current().origin() == ZtCalibration::Origin::Metadata && current().name() == offered().name();
}

void KvDeskCalibrator::slotImageOpened()
{
    if (isOfferInUse())
        logCalibrated(current());
    if (!isOtherOffered())
        return;
    const QString size = KvDeskCalibrationText::pixelSize(offered());
    const QString name = ZtLeftToRight::isolated(offered().name());
    const QString text = current().isCalibrated()
                             ? tr("%1 states pixels of %2; the session measures with %3")
                                   .arg(name, size, KvDeskCalibrationText::pixelSize(current()))
                             : tr("%1 states pixels of %2; the session measures in pixels").arg(name, size);
    emit signalOfferMade(text);
}

void KvDeskCalibrator::slotImageChanged()
{
    emit signalOfferWithdrawn();
    emit signalChanged();
}

void KvDeskCalibrator::slotCalibrationChanged()
{
    if (!isOtherOffered())
        emit signalOfferWithdrawn();
    emit signalChanged();
}

// What was last said about the calibration is no longer true.
void KvDeskCalibrator::slotCalibrationRestored()
{
    logCalibrated(current());
}
