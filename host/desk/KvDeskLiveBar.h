// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>
#include <QTimer>

class KvDeskActions;
class KvDeskElidedLabel;
class KvDeskExposureControl;
class QLabel;
class QToolButton;
class QPushButton;
class ZtFrameSource;
class ZtMeasuringDocument;

/**
 * A row above a live image: what it shows and how it is doing, freeze, exposure and frame rate; a button that
 * connects again when the source was lost. Not there as long as the image is not live.
 */
class KvDeskLiveBar : public QFrame
{
    Q_OBJECT
public:
    /** Both have to outlive the bar. */
    KvDeskLiveBar(KvDeskActions *actions, ZtMeasuringDocument *document, QWidget *parent = nullptr);

    KvDeskElidedLabel *status() const { return m_status; }
    KvDeskExposureControl *exposure() const { return m_exposure; }
    QLabel *frameRate() const { return m_frameRate; }
    QToolButton *freezeButton() const { return m_freeze; }
    QPushButton *reconnectButton() const { return m_reconnect; }

public slots:
    void slotReconnect();

private slots:
    void slotSourceChanged();
    void slotUpdate();
    void slotUpdateExposure();
    void slotUpdateRate();
    void slotFreeze(bool aFrozen);
    void slotExposureChosen(double aMilliseconds);

private:
    void createWidgets();
    void connectSignals();
    ZtFrameSource *liveSource() const; ///< null while the image is not live
    QString statusText(const ZtFrameSource &source) const;
    QString statusIcon(const ZtFrameSource &source) const;

    KvDeskActions *m_actions;
    ZtMeasuringDocument *m_document;
    QLabel *m_icon = nullptr;
    KvDeskElidedLabel *m_status = nullptr;
    QPushButton *m_reconnect = nullptr;
    KvDeskExposureControl *m_exposure = nullptr;
    QLabel *m_frameRate = nullptr;
    QToolButton *m_freeze = nullptr;
    QTimer m_rateTimer;
};
