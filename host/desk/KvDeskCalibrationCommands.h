// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QPointer>

class KvDeskActions;
class KvDeskCalibrationDialog;
class KvDeskCalibrator;
class KvDeskImageView;
class KvDeskNotice;
class KvDeskObjectEditor;
class KvDeskSession;
class QWidget;

/** The commands around the calibration: the window for it, the pixel size of the image's file, which a
 * message over the image offers where it differs, and the scale bar. */
class KvDeskCalibrationCommands : public QObject
{
    Q_OBJECT
public:
    /** All of them have to outlive this. */
    KvDeskCalibrationCommands(KvDeskActions *actions, KvDeskImageView *view, KvDeskSession *session,
                              KvDeskObjectEditor *editor, QObject *parent = nullptr);

    KvDeskCalibrator *calibrator() const { return m_calibrator; }
    KvDeskNotice *notice() const { return m_notice; }
    /** Null while the window is closed. */
    KvDeskCalibrationDialog *dialog() const;

public slots:
    /** Opens the window, or brings it to the front. */
    void slotShowDialog();

private slots:
    void slotUpdate();

private:
    void moveBesideImage(QWidget *dialog) const;

    void connectSignals();

    KvDeskActions *m_actions;
    KvDeskImageView *m_view;
    KvDeskCalibrator *m_calibrator;
    KvDeskNotice *m_notice;
    QPointer<KvDeskCalibrationDialog> m_dialog;
};
