// SPDX-License-Identifier: MIT
#include "KvDeskProgress.h"

#include "measuring/ZtProgress.h"
#include "support/StatReportTest.h"

#include <QProgressBar>
#include <QPushButton>
#include <QSemaphore>
#include <QShortcut>

#include <memory>
#include <new>

namespace {

/// Work that goes on until it is told to end, whoever waits for it.
struct LongWork
{
    std::shared_ptr<QSemaphore> mayEnd = std::make_shared<QSemaphore>();
    std::shared_ptr<std::atomic<int>> done = std::make_shared<std::atomic<int>>(0);
    double share = 0.0;

    std::function<void(ZtProgress *)> work() const
    {
        return [mayEnd = mayEnd, done = done, share = share](ZtProgress *progress) {
            progress->setDone(share);
            mayEnd->tryAcquire(1, 30000);
            ++*done;
        };
    }
};

/// Counts what the user did to it.
class Surface : public QWidget
{
public:
    using QWidget::QWidget;
    int presses = 0;
    int keys = 0;
    int drops = 0;

protected:
    void mousePressEvent(QMouseEvent *) override { ++presses; }
    void keyPressEvent(QKeyEvent *) override { ++keys; }
    void dragEnterEvent(QDragEnterEvent *event) override { event->acceptProposedAction(); }
    void dropEvent(QDropEvent *) override { ++drops; }
};

} // namespace

class KvDeskProgressTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void cleanup();

    void quickWorkShowsNothing();
    void longWorkIsShown();
    void unknownShareMovesTheBar();
    void buttonCancels();
    void endOfEarlierWorkIsNotTheEnd();
    void escapeCancels();
    void whatCannotBeCancelledIsWaitedFor();
    void inputIsBlocked();
    void interfaceGoesOn();
    void closingWaits();
    void thereIsOneAtATime();
    void lackOfMemoryIsNoEnd();
    void focusComesBack();

private:
    // Called while the work runs, some time after the progress is shown.
    void whenShown(const std::function<void()> &action);

    std::unique_ptr<QWidget> m_window;
    Surface *m_surface = nullptr;
    KvDeskProgress *m_progress = nullptr;
};

void KvDeskProgressTest::init()
{
    StatReportTest::init();
    m_window = std::make_unique<QWidget>();
    m_window->resize(800, 600);
    m_surface = new Surface(m_window.get());
    m_surface->resize(800, 600);
    m_surface->setFocusPolicy(Qt::StrongFocus);
    m_surface->setAcceptDrops(true);
    m_progress = new KvDeskProgress(m_window.get());
    m_window->show();
    m_window->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
    m_surface->setFocus();
}

void KvDeskProgressTest::cleanup()
{
    m_window.reset();
    QVERIFY(!QGuiApplication::overrideCursor());
    StatReportTest::cleanup();
}

void KvDeskProgressTest::whenShown(const std::function<void()> &action)
{
    auto *const timer = new QTimer(m_progress);
    connect(timer, &QTimer::timeout, m_progress, [this, timer, action]() {
        if (!m_progress->isVisible())
            return;
        timer->deleteLater();
        timer->stop();
        action();
    });
    timer->start(5);
}

void KvDeskProgressTest::quickWorkShowsNothing()
{
    bool wasHere = false;
    QCOMPARE(m_progress->run(QStringLiteral("Quick"), [&wasHere](ZtProgress *) { wasHere = true; }),
             KvDeskProgress::Done);
    QVERIFY(wasHere);
    QVERIFY(m_progress->isHidden());
    QVERIFY(!m_progress->isRunning());
}

void KvDeskProgressTest::longWorkIsShown()
{
    LongWork work;
    work.share = 0.25;
    QElapsedTimer clock;
    clock.start();
    qint64 shownAfter = 0;
    int value = -1;
    bool isRunning = false;
    whenShown([&]() {
        shownAfter = clock.elapsed();
        value = m_progress->bar()->value() * 100 / m_progress->bar()->maximum();
        isRunning = m_progress->isRunning();
        work.mayEnd->release();
    });
    QCOMPARE(m_progress->run(QStringLiteral("Reading a file"), work.work()), KvDeskProgress::Done);
    QVERIFY2(shownAfter >= KvDeskProgress::delayMs - 50, qPrintable(QString::number(shownAfter)));
    QCOMPARE(value, 25);
    QVERIFY(isRunning);
    QCOMPARE(m_progress->text(), QStringLiteral("Reading a file"));
    QCOMPARE(m_progress->bar()->accessibleName(), QStringLiteral("Reading a file"));
    QCOMPARE(m_progress->cancelButton()->text(), QStringLiteral("Cancel"));
    QCOMPARE(work.done->load(), 1);
    QVERIFY(m_progress->isHidden());
}

void KvDeskProgressTest::unknownShareMovesTheBar()
{
    LongWork work;
    int maximum = -1;
    whenShown([&]() {
        maximum = m_progress->bar()->maximum();
        work.mayEnd->release();
    });
    m_progress->run(QStringLiteral("Decoding"), work.work());
    QCOMPARE(maximum, 0);
}

void KvDeskProgressTest::buttonCancels()
{
    LongWork work;
    whenShown([&]() { QTest::mouseClick(m_progress->cancelButton(), Qt::LeftButton); });
    // Nobody lets the work end: the user does not wait for it.
    QCOMPARE(m_progress->run(QStringLiteral("Long"), work.work()), KvDeskProgress::Cancelled);
    QCOMPARE(work.done->load(), 0);
    QVERIFY(m_progress->isHidden());
    work.mayEnd->release();
    QTRY_COMPARE(work.done->load(), 1);
}

void KvDeskProgressTest::endOfEarlierWorkIsNotTheEnd()
{
    // Its end is still on the way when the next begins.
    m_progress->run(QStringLiteral("Quick"), [](ZtProgress *) {});
    LongWork work;
    whenShown([&]() { m_progress->cancelButton()->click(); });
    QCOMPARE(m_progress->run(QStringLiteral("Long"), work.work()), KvDeskProgress::Cancelled);
    QCOMPARE(work.done->load(), 0);
    work.mayEnd->release();
}

void KvDeskProgressTest::escapeCancels()
{
    LongWork work;
    whenShown([&]() { QTest::keyClick(m_window->windowHandle(), Qt::Key_Escape); });
    QCOMPARE(m_progress->run(QStringLiteral("Long"), work.work()), KvDeskProgress::Cancelled);
    work.mayEnd->release();
}

void KvDeskProgressTest::whatCannotBeCancelledIsWaitedFor()
{
    LongWork work;
    const auto committing = [inner = work.work()](ZtProgress *progress) {
        progress->commit();
        inner(progress);
    };
    const QString usual = m_progress->cancelButton()->toolTip();
    bool isEnabled = true;
    QString reason;
    whenShown([&]() {
        m_progress->cancelButton()->click();
        isEnabled = m_progress->cancelButton()->isEnabled();
        reason = m_progress->cancelButton()->toolTip();
        work.mayEnd->release();
    });
    QCOMPARE(m_progress->run(QStringLiteral("Long"), committing), KvDeskProgress::Done);
    QVERIFY(!isEnabled);
    QCOMPARE(reason, usual + QStringLiteral("\nThis can no longer be cancelled"));
    QCOMPARE(work.done->load(), 1);
    // The next work can be cancelled again.
    QCOMPARE(m_progress->run(QStringLiteral("Long"), [](ZtProgress *) { QTest::qSleep(200); }),
             KvDeskProgress::Done);
    QVERIFY(m_progress->cancelButton()->isEnabled());
    QCOMPARE(m_progress->cancelButton()->toolTip(), usual);
}

void KvDeskProgressTest::inputIsBlocked()
{
    int shortcuts = 0;
    QShortcut shortcut(QKeySequence(Qt::CTRL | Qt::Key_S), m_window.get());
    connect(&shortcut, &QShortcut::activated, m_window.get(), [&shortcuts]() { ++shortcuts; });
    const auto use = [this]() {
        QTest::mouseClick(m_window->windowHandle(), Qt::LeftButton, Qt::NoModifier, QPoint(20, 20));
        QTest::keyClick(m_surface, Qt::Key_A);
        QTest::keyClick(m_window->windowHandle(), Qt::Key_S, Qt::ControlModifier);
        QMimeData data;
        QDragEnterEvent enter(QPoint(20, 20), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(m_surface, &enter);
        QDropEvent drop(QPointF(20, 20), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(m_surface, &drop);
    };
    LongWork work;
    whenShown([&]() {
        use();
        work.mayEnd->release();
    });
    m_progress->run(QStringLiteral("Long"), work.work());
    QCOMPARE(m_surface->presses, 0);
    QCOMPARE(m_surface->keys, 0);
    QCOMPARE(m_surface->drops, 0);
    QCOMPARE(shortcuts, 0);
    use();
    QCOMPARE(m_surface->presses, 1);
    QVERIFY(m_surface->keys >= 1);
    QCOMPARE(m_surface->drops, 1);
    QCOMPARE(shortcuts, 1);
}

void KvDeskProgressTest::interfaceGoesOn()
{
    LongWork work;
    int ticks = 0;
    QTimer timer;
    connect(&timer, &QTimer::timeout, m_window.get(), [&]() {
        if (++ticks == 20)
            work.mayEnd->release();
    });
    timer.start(10);
    QCOMPARE(m_progress->run(QStringLiteral("Long"), work.work()), KvDeskProgress::Done);
    QVERIFY(ticks >= 20);
}

void KvDeskProgressTest::closingWaits()
{
    LongWork work;
    bool isClosed = true;
    whenShown([&]() {
        isClosed = m_window->close();
        work.mayEnd->release();
    });
    QCOMPARE(m_progress->run(QStringLiteral("Long"), work.work()), KvDeskProgress::Done);
    QVERIFY(!isClosed);
    QTRY_VERIFY(!m_window->isVisible());
}

void KvDeskProgressTest::thereIsOneAtATime()
{
    LongWork work;
    KvDeskProgress::Outcome inner = KvDeskProgress::Done;
    whenShown([&]() {
        inner = m_progress->run(QStringLiteral("Another"), [](ZtProgress *) {});
        work.mayEnd->release();
    });
    QCOMPARE(m_progress->run(QStringLiteral("Long"), work.work()), KvDeskProgress::Done);
    QCOMPARE(inner, KvDeskProgress::Cancelled);
    QCOMPARE(m_progress->text(), QStringLiteral("Long"));
}

void KvDeskProgressTest::lackOfMemoryIsNoEnd()
{
    QCOMPARE(m_progress->run(QStringLiteral("Huge"), [](ZtProgress *) { throw std::bad_alloc(); }),
             KvDeskProgress::OutOfMemory);
}

void KvDeskProgressTest::focusComesBack()
{
    LongWork work;
    QWidget *focus = nullptr;
    whenShown([&]() {
        focus = QApplication::focusWidget();
        work.mayEnd->release();
    });
    m_progress->run(QStringLiteral("Long"), work.work());
    QCOMPARE(focus, m_progress->cancelButton());
    QCOMPARE(QApplication::focusWidget(), m_surface);
}

STATREPORT_TEST_MAIN(KvDeskProgressTest)
#include "KvDeskProgressTest.moc"
