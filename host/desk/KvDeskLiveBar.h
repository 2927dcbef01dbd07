// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>
#include <QTimer>

class KvDeskActions;
class KvDeskElidedLabel;
class KvDeskExposureControl;
class QBoxLayout;
class QHBoxLayout;
class QLabel;
class QToolButton;
class QPushButton;
class ZtFrameSource;
class ZtMeasuringDocument;

/**
 * A row above a live image: what it shows and how it is doing, freeze, exposure and frame rate; a button that
 * stops the source, which frees a camera for other programs, and starts it again, as after a loss. Not there
 * as long as the image is not live.
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
    QPushButton *runButton() const { return m_run; }

    QSize minimumSizeHint() const override; ///< of two lines, which a narrow bar has

protected:
    void resizeEvent(QResizeEvent *event) override;

private slots:
    void slotSourceChanged();
    void slotUpdate();
    void slotUpdateExposure();
    void slotUpdateRate();
    void slotFreeze(bool aFrozen);
    void slotExposureChosen(double aMilliseconds);
    void slotStartOrStop();

private:
    void createWidgets();
    void connectSignals();
    ZtFrameSource *liveSource() const; ///< null while the image is not live
    QString statusText(const ZtFrameSource &source) const;
    QString statusIcon(const ZtFrameSource &source) const;
    void updateRunButton(const ZtFrameSource &source);

    KvDeskActions *m_actions;
    ZtMeasuringDocument *m_document;
    QBoxLayout *m_layout = nullptr;
    QHBoxLayout *m_first = nullptr; ///< the line with the state of the source
    QLabel *m_icon = nullptr;
    KvDeskElidedLabel *m_status = nullptr;
    QPushButton *m_run = nullptr; ///< stops, starts or connects again, whichever is due
    KvDeskExposureControl *m_exposure = nullptr;
    QLabel *m_frameRate = nullptr;
    QToolButton *m_freeze = nullptr;
    QTimer m_rateTimer;
};
