// SPDX-License-Identifier: MIT
// What the user waits for on the Desk's image: many objects, large frames. A step counts with the drawing
// that shows it. Floor: 16 ms for a step, 20 ms for a frame.
#include "BenchCamera.h"
#include "KvDeskImageView.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskSelection.h"
#include "KvDeskSession.h"
#include "ThreadTime.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QApplication>
#include <QPainter>
#include <QScrollBar>

#include <benchmark/benchmark.h>

#include <algorithm>
#include <atomic>
#include <chrono>
#include <random>
#include <thread>

namespace {

constexpr QSize frameSize(4000, 3000);
constexpr QSize windowSize(1280, 800);

/// A camera that gives two frames in turn.
class TurningCamera : public ZtFrameSource
{
public:
    TurningCamera()
    {
        for (int i = 0; i < 2; ++i) {
            m_frames[i] = QImage(frameSize, QImage::Format_RGB32);
            m_frames[i].fill(i ? Qt::darkCyan : Qt::darkBlue);
        }
    }

    QImage frame() const override { return m_frames[m_current]; }
    QString displayName() const override { return QStringLiteral("Camera"); }
    void deliver()
    {
        m_current = 1 - m_current;
        emit signalFrameReady();
    }

private:
    QImage m_frames[2];
    int m_current = 0;
};

/// An image view with so many small objects all over a frame of 12 megapixels.
class Desk
{
public:
    explicit Desk(int objectCount)
        : session(&document)
        , editor(&session, &selection)
    {
        view.resize(windowSize);
        view.setDocument(&document);
        view.setEditor(&editor);
        view.show();
        auto source = std::make_unique<TurningCamera>();
        camera = source.get();
        document.setFrameSource(std::move(source));
        camera->deliver();
        addObjects(objectCount);
        show();
    }

    /// Draws the view as it is on the screen.
    void show()
    {
        QPainter painter(&m_screen);
        view.viewport()->render(&painter);
    }

    ZtMeasuringDocument document;
    KvDeskSession session;
    KvDeskSelection selection;
    KvDeskObjectEditor editor;
    KvDeskImageView view;
    TurningCamera *camera = nullptr;

private:
    void addObjects(int count)
    {
        std::mt19937 random(1);
        std::uniform_real_distribution<double> x(0.0, frameSize.width());
        std::uniform_real_distribution<double> y(0.0, frameSize.height());
        std::uniform_real_distribution<double> size(5.0, 60.0);
        const int types[] = {ZtDrawnType::Line, ZtDrawnType::Circle, ZtDrawnType::Rectangle};
        for (int i = 0; i < count; ++i) {
            const QPointF start(x(random), y(random));
            document.addObject(types[i % 3], QPolygonF(QVector<QPointF>{
                                                 start, start + QPointF(size(random), size(random))}));
        }
    }

    QImage m_screen = QImage(windowSize, QImage::Format_RGB32);
};

void selectOne(benchmark::State &state)
{
    Desk desk(static_cast<int>(state.range(0)));
    int id = 0;
    for (auto _ : state) {
        id = id % 300 + 1;
        desk.selection.select({ZtDrawnType::Line, id});
        desk.show();
    }
}

void clickAtOne(benchmark::State &state)
{
    Desk desk(static_cast<int>(state.range(0)));
    int i = 0;
    for (auto _ : state) {
        i = (i + 37) % 500;
        benchmark::DoNotOptimize(desk.view.objectAt(QPoint(100 + i, 100 + i)));
    }
}

void moveOne(benchmark::State &state)
{
    Desk desk(static_cast<int>(state.range(0)));
    const KvDeskObjectId object{ZtDrawnType::Circle, 7};
    desk.selection.select(object);
    for (auto _ : state) {
        desk.editor.moveBy({object}, QPointF(1, 1));
        desk.show();
    }
}

void undoAndRedoOne(benchmark::State &state)
{
    Desk desk(static_cast<int>(state.range(0)));
    desk.editor.moveBy({{ZtDrawnType::Circle, 7}}, QPointF(30, 30));
    bool isDone = true;
    for (auto _ : state) {
        if (isDone)
            desk.editor.slotUndo();
        else
            desk.editor.slotRedo();
        isDone = !isDone;
        desk.show();
    }
}

void drawAndRemoveOne(benchmark::State &state)
{
    Desk desk(static_cast<int>(state.range(0)));
    for (auto _ : state) {
        const KvDeskObjectId object = desk.editor.create(
            ZtDrawnType::Line, QPolygonF(QVector<QPointF>{QPointF(100, 100), QPointF(150, 130)}));
        desk.show();
        desk.editor.remove({object});
        desk.show();
    }
}

void liveFrame(benchmark::State &state)
{
    Desk desk(static_cast<int>(state.range(0)));
    for (auto _ : state) {
        desk.camera->deliver();
        desk.show();
    }
}

void liveFrameWhileDragging(benchmark::State &state)
{
    Desk desk(static_cast<int>(state.range(0)));
    const KvDeskObjectId object{ZtDrawnType::Circle, 7};
    desk.selection.select(object);
    for (auto _ : state) {
        desk.camera->deliver();
        desk.editor.moveBy({object}, QPointF(1, 0));
        desk.show();
    }
}

void zoomStep(benchmark::State &state)
{
    Desk desk(static_cast<int>(state.range(0)));
    bool isIn = true;
    for (auto _ : state) {
        if (isIn)
            desk.view.slotZoomIn();
        else
            desk.view.slotZoomOut();
        isIn = !isIn;
        desk.show();
    }
}

void panStep(benchmark::State &state)
{
    Desk desk(static_cast<int>(state.range(0)));
    desk.view.slotZoomIn();
    int step = 17;
    for (auto _ : state) {
        QScrollBar *const bar = desk.view.horizontalScrollBar();
        const int before = bar->value();
        bar->setValue(before + step);
        if (bar->value() != before + step)
            step = -step;
        desk.show();
    }
}

using Clock = std::chrono::steady_clock;

/// Stands for a movement of the mouse; knows when it was made.
class Input : public QEvent
{
public:
    Input()
        : QEvent(QEvent::User)
    {}
    const Clock::time_point made = Clock::now();
};

/// Makes a hundred inputs per second in a thread of its own, and measures how long each waits for the view.
class InputProbe : public QObject
{
public:
    explicit InputProbe(QObject *receiver)
    {
        receiver->installEventFilter(this);
        m_hand = std::thread([this, receiver]() {
            while (!m_isEnded) {
                QCoreApplication::postEvent(receiver, new Input);
                std::this_thread::sleep_for(std::chrono::milliseconds(10));
            }
        });
    }
    ~InputProbe() override
    {
        m_isEnded = true;
        m_hand.join();
    }

    bool eventFilter(QObject *, QEvent *event) override
    {
        if (event->type() != QEvent::User)
            return false;
        const double delay =
            std::chrono::duration<double>(Clock::now() - static_cast<Input *>(event)->made).count();
        worst = std::max(worst, delay);
        sum += delay;
        ++count;
        return true;
    }

    double worst = 0.0; ///< seconds
    double sum = 0.0;
    int count = 0;

private:
    std::atomic<bool> m_isEnded{false};
    std::thread m_hand;
};

/// A camera of 25 frames per second in the view: what a frame costs this thread, and how long input waits.
void inputWhileFramesCome(benchmark::State &state)
{
    Desk desk(static_cast<int>(state.range(0)));
    auto source = std::make_unique<BenchCamera>(ZtRawFormat{ZtRawFormat::Mono, 8}, 25.0);
    BenchCamera *const camera = source.get();
    desk.document.setFrameSource(std::move(source));
    camera->start();
    for (auto _ : state) {
        InputProbe probe(desk.view.viewport());
        const double before = ThreadTime::seconds();
        const Clock::time_point start = Clock::now();
        while (Clock::now() - start < std::chrono::seconds(3))
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
        state.SetIterationTime(probe.sum / probe.count);
        state.counters["worst_ms"] = probe.worst * 1e3;
        state.counters["thread_ms_per_frame"] =
            (ThreadTime::seconds() - before) * 1e3 / std::max(1.0, 3.0 * camera->frameRate());
        state.counters["fps"] = camera->frameRate();
        state.counters["dropped"] = static_cast<double>(camera->droppedFrames());
    }
}

} // namespace

BENCHMARK(selectOne)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(clickAtOne)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(moveOne)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(undoAndRedoOne)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(drawAndRemoveOne)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(liveFrame)->Arg(0)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(liveFrameWhileDragging)->Arg(1000)->Unit(benchmark::kMillisecond);
BENCHMARK(inputWhileFramesCome)
    ->Arg(0)
    ->Arg(1000)
    ->UseManualTime()
    ->Iterations(1)
    ->Unit(benchmark::kMillisecond);
BENCHMARK(panStep)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(zoomStep)->Arg(0)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
