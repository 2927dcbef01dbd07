// SPDX-License-Identifier: MIT
// What the user waits for on the Desk's image: many objects, large frames. A step counts with the drawing
// that shows it. Floor: 16 ms for a step, 20 ms for a frame.
#include "KvDeskImageView.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskSelection.h"
#include "KvDeskSession.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFrameSource.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QApplication>
#include <QPainter>

#include <benchmark/benchmark.h>

#include <random>

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

} // namespace

BENCHMARK(selectOne)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(clickAtOne)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(moveOne)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(undoAndRedoOne)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(drawAndRemoveOne)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(liveFrame)->Arg(0)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);
BENCHMARK(liveFrameWhileDragging)->Arg(1000)->Unit(benchmark::kMillisecond);
BENCHMARK(zoomStep)->Arg(1000)->Arg(100000)->Unit(benchmark::kMillisecond);

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
