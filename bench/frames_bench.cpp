// SPDX-License-Identifier: MIT
// What frames of 12 megapixels at 25 per second cost the GUI thread, on their way from a camera's buffer to a
// window.
#include "BenchCamera.h"
#include "FrameViewer.h"
#include "ThreadTime.h"
#include "measuring/ZtKernelImage.h"

#include <benchmark/benchmark.h>

#include <QGuiApplication>

#include <algorithm>

namespace {

constexpr double framesPerSecond = 25.0;
constexpr int framesPerRun = 50;

/// Plays one run; per frame: processor time of this thread, copies after the one out of the camera's buffer.
void play(benchmark::State &state, const ZtRawFormat &format, bool isDrawing)
{
    double worst = 0.0;
    double copies = 0.0;
    double frames = 0.0;
    double dropped = 0.0;
    double worker = 0.0;
    double rate = 0.0;
    for (auto _ : state) {
        BenchCamera camera(format, framesPerSecond);
        ZtKernelImage image;
        image.setSource(&camera);
        const FrameViewer viewer(&image, isDrawing);
        camera.start();
        double total = 0.0;
        while (viewer.frameCount() < framesPerRun) {
            const int before = viewer.frameCount();
            const double start = ThreadTime::seconds();
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
            const double used = ThreadTime::seconds() - start;
            total += used;
            if (viewer.frameCount() == before)
                continue;
            worst = std::max(worst, used);
            frames += 1.0;
            // The next frame may be there already: then nobody can tell.
            copies += viewer.image().constBits() != camera.newestPixels() && camera.droppedFrames() == 0
                          ? 1.0
                          : 0.0;
        }
        rate = camera.frameRate();
        dropped += static_cast<double>(camera.droppedFrames());
        worker = camera.workerSecondsPerFrame();
        state.SetIterationTime(total / framesPerRun);
    }
    state.counters["worst_ms"] = worst * 1e3;
    state.counters["copies"] = copies / frames;
    state.counters["dropped"] = dropped;
    state.counters["worker_ms"] = worker * 1e3;
    state.counters["fps"] = rate;
}

void deliver(benchmark::State &state)
{
    play(state, {ZtRawFormat::Mono, 8}, false);
}

void deliverAndDraw(benchmark::State &state)
{
    play(state, {ZtRawFormat::Mono, 8}, true);
}

void deliverAndDrawColours(benchmark::State &state)
{
    play(state, {ZtRawFormat::BayerRg, 8}, true);
}

} // namespace

BENCHMARK(deliver)->UseManualTime()->Iterations(2)->Unit(benchmark::kMillisecond);
BENCHMARK(deliverAndDraw)->UseManualTime()->Iterations(2)->Unit(benchmark::kMillisecond);
BENCHMARK(deliverAndDrawColours)->UseManualTime()->Iterations(2)->Unit(benchmark::kMillisecond);

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QGuiApplication app(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
