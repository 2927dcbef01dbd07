// SPDX-License-Identifier: MIT
#pragma once

#include <QFrame>
#include <QPointer>
#include <QTimer>

#include <functional>
#include <memory>

class QLabel;
class QProgressBar;
class QPushButton;
class ZtProgress;
class ZtWorkerThread;

/**
 * Does long work in another thread while the user waits, and shows after a while how far it is, with a button
 * that cancels it.
 *
 * The interface goes on drawing, but takes no input meanwhile, except for the button. A wish to close the
 * window is kept until the work is done.
 */
class KvDeskProgress : public QFrame
{
    Q_OBJECT
public:
    enum Outcome { Done, Cancelled, OutOfMemory };

    /** How long nothing is shown. */
    static constexpr int delayMs = 500;

    /** Lies over \a window. */
    explicit KvDeskProgress(QWidget *window);
    ~KvDeskProgress() override;

    /**
     * Returns when \a work is done, or at once when the user cancels; then the work may still go on until it
     * notices. So it shares all that it uses, and its results are looked at only when it is Done. There is
     * one at a time: while one runs, others are Cancelled. \param text what is being done, one sentence
     * without a full stop
     */
    Outcome run(const QString &text, const std::function<void(ZtProgress *)> &work);
    bool isRunning() const { return m_job != nullptr; }

    QString text() const;
    QProgressBar *bar() const { return m_bar; }
    QPushButton *cancelButton() const { return m_cancel; }

    bool eventFilter(QObject *watched, QEvent *event) override;

signals:
    void signalCancelled();

protected:
    void paintEvent(QPaintEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;

private slots:
    void slotShow();
    void slotUpdate();
    void slotCancel();

private:
    struct Job;

    void wait(ZtWorkerThread *thread);
    void beginWaiting();
    void endWaiting();
    void place();
    bool isForMe(QObject *watched) const;

    QLabel *m_label;
    QProgressBar *m_bar;
    QPushButton *m_cancel;
    QTimer m_delay;
    QTimer m_update;
    std::shared_ptr<Job> m_job; ///< that runs
    QPointer<QWidget> m_focusBefore;
    bool m_isCloseWanted = false;
};
