// SPDX-License-Identifier: MIT
#pragma once

#include "measuring/ZtCalibrationStore.h"

#include <QObject>

class KvDeskObjectEditor;
class KvDeskSelection;
class KvDeskSession;

/**
 * Calibrates the session: by a new calibration, which is remembered for its objective, by an old one, or by
 * what the image's file says. Each is one step that can be undone; what was remembered stays so.
 */
class KvDeskCalibrator : public QObject
{
    Q_OBJECT
public:
    /** Both have to outlive this. */
    KvDeskCalibrator(KvDeskSession *session, KvDeskObjectEditor *editor, QObject *parent = nullptr);

    ZtCalibrationStore *store() { return &m_store; }
    KvDeskSelection *selection() const;

    /** What the session measures with. */
    ZtCalibration current() const;
    /** What the image's file states; uncalibrated when it states nothing. */
    ZtCalibration offered() const;

    /** Remembers a calibration as of now and measures with it. Its author is remembered, too. */
    void calibrate(ZtCalibration calibration);
    /** Measures with a calibration out of the history. One that is not its objective's newest becomes that,
     * by \a author and as of now. */
    void useAgain(ZtCalibration calibration, const QString &author);

public slots:
    /** Measures with the pixel size of the image's file, for the objective of the session. */
    void slotUseOffered();

signals:
    void signalChanged(); ///< current(), offered() or the store
    /** An image was opened whose file states another pixel size than the session's: a sentence about it. */
    void signalOfferMade(QString aText);
    void signalOfferWithdrawn(); ///< the pixel size is used now, or that image is no longer shown

private slots:
    void slotImageOpened();
    void slotImageChanged();
    void slotCalibrationChanged();
    void slotCalibrationRestored();

private:
    void connectSignals();
    void measureWith(const ZtCalibration &calibration);
    static void logCalibrated(const ZtCalibration &calibration);
    bool isOfferInUse() const;
    bool isOtherOffered() const;

    KvDeskSession *m_session;
    KvDeskObjectEditor *m_editor;
    ZtCalibrationStore m_store;
};
