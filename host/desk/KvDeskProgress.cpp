// SPDX-License-Identifier: MIT
#include "KvDeskProgress.h"

#include "KvDeskReason.h"
#include "gui/QtAdvancedStylesheet.h"
#include "measuring/ZtProgress.h"
#include "measuring/ZtWorkerThread.h"

#include <QApplication>
#include <QEventLoop>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QPainter>
#include <QProgressBar>
#include <QPushButton>
#include <QVBoxLayout>
#include <QVariant>

#include <atomic>
#include <new>

namespace {

constexpr int quickMs = 80; ///< work that is done by then needs no event loop
constexpr int updateMs = 100;
constexpr int barSteps = 1000;
constexpr int barWidth = 320;
constexpr int margin = 16;
constexpr int spacing = 8;

bool isDrag(QEvent::Type type)
{
    return type == QEvent::DragEnter || type == QEvent::DragMove || type == QEvent::Drop;
}

bool isInput(QEvent::Type type)
{
    switch (type) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseMove:
    case QEvent::Wheel:
    case QEvent::KeyPress:
    case QEvent::KeyRelease:
    case QEvent::Shortcut:
    case QEvent::ShortcutOverride:
    case QEvent::InputMethod:
    case QEvent::ContextMenu:
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
    case QEvent::TabletPress:
    case QEvent::TabletMove:
    case QEvent::TabletRelease:
    case QEvent::NativeGesture:
        return true;
    default:
        return isDrag(type);
    }
}

} // namespace

/// What the threads share; it may outlive the window.
struct KvDeskProgress::Job
{
    std::function<void(ZtProgress *)> work;
    ZtProgress progress;
    std::atomic<bool> isOutOfMemory{false};
    std::atomic<bool> isDone{false};

    void run()
    {
        try {
            work(&progress);
        } catch (const std::bad_alloc &) {
            isOutOfMemory = true;
        }
        isDone = true;
    }
};

KvDeskProgress::KvDeskProgress(QWidget *window)
    : QFrame(window)
    , m_label(new QLabel(this))
    , m_bar(new QProgressBar(this))
    , m_cancel(new QPushButton(tr("Cancel"), this))
{
    setObjectName(QStringLiteral("DeskProgress"));
    setProperty("panel", true);
    setAutoFillBackground(true);
    m_bar->setFixedWidth(barWidth);
    m_bar->setTextVisible(false);
    m_cancel->setToolTip(tr("Leave everything as it was (Esc)"));
    auto *const row = new QHBoxLayout;
    row->setSpacing(spacing);
    row->addWidget(m_bar);
    row->addWidget(m_cancel);
    auto *const layout = new QVBoxLayout(this);
    layout->setContentsMargins(margin, margin, margin, margin);
    layout->setSpacing(spacing);
    layout->addWidget(m_label);
    layout->addLayout(row);
    m_delay.setSingleShot(true);
    connect(&m_delay, SIGNAL(timeout()), this, SLOT(slotShow()));
    connect(&m_update, SIGNAL(timeout()), this, SLOT(slotUpdate()));
    connect(m_cancel, SIGNAL(clicked()), this, SLOT(slotCancel()));
    hide();
}

KvDeskProgress::~KvDeskProgress() = default;

QString KvDeskProgress::text() const
{
    return m_label->text();
}

KvDeskProgress::Outcome KvDeskProgress::run(const QString &text,
                                            const std::function<void(ZtProgress *)> &work)
{
    if (isRunning())
        return Cancelled;
    m_job = std::make_shared<Job>();
    m_job->work = work;
    m_label->setText(text);
    m_bar->setAccessibleName(text);
    auto thread = ZtWorkerThread::create([job = m_job]() { job->run(); });
    wait(thread.get());
    ZtWorkerThread::retire(std::move(thread));
    const std::shared_ptr<Job> job = std::move(m_job);
    if (job->progress.isCancelled())
        return Cancelled;
    return job->isOutOfMemory ? OutOfMemory : Done;
}

void KvDeskProgress::wait(ZtWorkerThread *thread)
{
    QEventLoop loop;
    // Before it starts: its end is announced once.
    connect(thread, SIGNAL(finished()), &loop, SLOT(quit()));
    connect(this, SIGNAL(signalCancelled()), &loop, SLOT(quit()));
    thread->start();
    if (thread->wait(quickMs))
        return;
    beginWaiting();
    loop.exec();
    endWaiting();
    // The loop ends with the application, too: then nobody waits for what can be left.
    const bool isAbandoned = !m_job->isDone && m_job->progress.cancel();
    if (!isAbandoned)
        thread->wait();
}

void KvDeskProgress::beginWaiting()
{
    m_isCloseWanted = false;
    KvDeskReason::setPossible(m_cancel, true, QString());
    m_delay.start(delayMs - quickMs);
    QApplication::setOverrideCursor(Qt::BusyCursor);
    qApp->installEventFilter(this);
}

void KvDeskProgress::endWaiting()
{
    qApp->removeEventFilter(this);
    QApplication::restoreOverrideCursor();
    m_delay.stop();
    m_update.stop();
    if (isVisible() && m_focusBefore)
        m_focusBefore->setFocus();
    hide();
    if (m_isCloseWanted)
        QMetaObject::invokeMethod(parentWidget()->window(), "close", Qt::QueuedConnection);
}

void KvDeskProgress::slotShow()
{
    m_focusBefore = QApplication::focusWidget();
    slotUpdate();
    raise();
    show();
    m_cancel->setFocus();
    m_update.start(updateMs);
}

void KvDeskProgress::slotUpdate()
{
    const int done = m_job ? qRound(m_job->progress.fraction() * barSteps) : 0;
    // Nothing is known at first: then the bar only moves.
    m_bar->setRange(0, done > 0 ? barSteps : 0);
    m_bar->setValue(done);
    place();
}

void KvDeskProgress::slotCancel()
{
    if (m_job && m_job->progress.cancel())
        emit signalCancelled();
    else
        KvDeskReason::setPossible(m_cancel, false, tr("This can no longer be cancelled"));
}

void KvDeskProgress::place()
{
    adjustSize();
    const QRect all = parentWidget()->rect();
    move(qMax(0, all.center().x() - width() / 2), qMax(0, all.center().y() - height() / 2));
}

// A line around, as it lies over panels of its own colour.
void KvDeskProgress::paintEvent(QPaintEvent *event)
{
    QFrame::paintEvent(event);
    QPainter painter(this);
    painter.setPen(acss::QtAdvancedStylesheet::getInstance()->color(QStringLiteral("line")));
    painter.drawRect(rect().adjusted(0, 0, -1, -1));
}

void KvDeskProgress::keyPressEvent(QKeyEvent *event)
{
    if (event->key() == Qt::Key_Escape)
        m_cancel->click();
    else
        QFrame::keyPressEvent(event);
}

bool KvDeskProgress::isForMe(QObject *watched) const
{
    const auto *const widget = qobject_cast<QWidget *>(watched);
    return isVisible() && widget && (widget == this || isAncestorOf(widget));
}

bool KvDeskProgress::eventFilter(QObject *watched, QEvent *event)
{
    const bool isClosing = event->type() == QEvent::Close && watched == parentWidget()->window();
    if (isClosing)
        m_isCloseWanted = true;
    // The windows of the system hand input on to the widgets, of which one may be the button.
    else if (!isInput(event->type()) || watched->isWindowType() || isForMe(watched))
        return QFrame::eventFilter(watched, event);
    if (isClosing || isDrag(event->type()))
        event->ignore();
    return true;
}
