// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvDeskAutosave.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskSession.h"
#include "RunningDesk.h"
#include "SteadyCamera.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "support/FileDialogAnswerer.h"

#include <QRandomGenerator>
#include <QUndoStack>

#include <algorithm>

namespace {

constexpr double kShortMinutes = 1.0 / 3;
constexpr int kStepInterval = 20;    ///< ms between two changes of objects
constexpr int kMostObjects = 150;    ///< then more are removed than drawn
constexpr int kPulse = 5;            ///< ms between two looks whether the user interface lives
constexpr double kMostGrowth = 32.0; ///< MB that the memory may vary by after the warm-up
constexpr qint64 kLongestGap = 5000; ///< ms; far more than there should be, for machines that are busy
constexpr double kLeastFrameShare =
    0.05; ///< of the camera's frames that are shown, on machines that are busy

double residentMegabytes()
{
    QFile status(QStringLiteral("/proc/self/status"));
    if (!status.open(QIODevice::ReadOnly))
        return 0.0;
    for (const QByteArray &line : status.readAll().split('\n')) {
        if (line.startsWith("VmRSS:"))
            return line.mid(6).simplified().split(' ').first().toDouble() / 1024.0;
    }
    return 0.0;
}

double minutes()
{
    bool isNumber = false;
    const double wanted = qEnvironmentVariable("STATREPORT_SOAK_MINUTES").toDouble(&isNumber);
    return isNumber && wanted > 0.0 ? wanted : kShortMinutes;
}

// Sanitizers keep memory that was freed, so as to know when it is used.
constexpr bool isMemoryMeaningful()
{
#ifdef __SANITIZE_ADDRESS__
    return false;
#else
    return true;
#endif
}

/// Draws, changes, removes, undoes and redoes, in the manner of a user who cannot decide.
class RestlessUser
{
public:
    explicit RestlessUser(KvDeskMainWindow *window)
        : m_editor(window->objectEditor())
    {}

    void step()
    {
        m_editor->slotFinishGesture();
        switch (m_random.bounded(10)) {
        case 0:
        case 1:
        case 2:
            draw();
            break;
        case 3:
            m_editor->moveBy({any()}, QPointF(m_random.bounded(20) - 10, m_random.bounded(20) - 10));
            break;
        case 4:
            m_editor->rename(any(), QStringLiteral("Object %1").arg(m_random.bounded(1000)));
            break;
        case 5:
            m_editor->setValueShown(any(), 0, m_random.bounded(2) == 0);
            break;
        case 6:
            if (m_editor->canPaste() && all().size() < kMostObjects)
                m_editor->paste();
            else
                m_editor->copy({any()});
            break;
        case 7:
            if (all().size() > kMostObjects / 2)
                m_editor->remove({any(), any()});
            break;
        case 8:
            m_editor->slotUndo();
            break;
        default:
            m_editor->slotRedo();
            break;
        }
        while (all().size() > kMostObjects)
            m_editor->remove({any()});
    }

private:
    void draw()
    {
        static const QVector<int> types{ZtDrawnType::Line, ZtDrawnType::Circle, ZtDrawnType::Rectangle};
        const QPointF start(m_random.bounded(SteadyCamera::width), m_random.bounded(SteadyCamera::height));
        const QPointF end = start + QPointF(5 + m_random.bounded(200), 5 + m_random.bounded(200));
        m_editor->create(types.at(m_random.bounded(types.size())), QPolygonF(QVector<QPointF>{start, end}));
    }

    QVector<KvDeskObjectId> all() const
    {
        QVector<KvDeskObjectId> objects;
        const QMap<int, ZtObjectMap> &types = ZtKernelData::getInstance()->objects();
        for (auto type = types.constBegin(); type != types.constEnd(); ++type) {
            for (auto object = type->constBegin(); object != type->constEnd(); ++object)
                objects.append({type.key(), object.key()});
        }
        return objects;
    }

    KvDeskObjectId any()
    {
        const QVector<KvDeskObjectId> objects = all();
        return objects.isEmpty() ? KvDeskObjectId() : objects.at(m_random.bounded(objects.size()));
    }

    KvDeskObjectEditor *m_editor;
    QRandomGenerator m_random{11};
};

} // namespace

/**
 * A day's work in short: a live image, objects that come, change and go all the time, and the report editor
 * and the statistics open beside them. Memory has to stay where it is, and the user interface alive.
 *
 * STATREPORT_SOAK_MINUTES makes it as long as one likes.
 */
class DeskSoakTest : public StatReportTest
{
    Q_OBJECT

public:
    DeskSoakTest()
    {
        // The test library ends what takes longer than five minutes.
        const int patience = static_cast<int>((minutes() + 5.0) * 60.0 * 1000.0);
        qputenv("QTEST_FUNCTION_TIMEOUT", QByteArray::number(patience));
    }

private slots:
    void init();
    void cleanup();

    void staysFlatAndAlive();

private:
    void openWindows();

    std::unique_ptr<RunningDesk> m_desk;
    SteadyCamera *m_camera = nullptr;
};

void DeskSoakTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    m_desk = std::make_unique<RunningDesk>();
    m_desk->window()->startRecovery(temporaryPath(QStringLiteral("recovery")));
    m_desk->window()->autosave()->setDelay(1000);
    auto camera = std::make_unique<SteadyCamera>();
    m_camera = camera.get();
    m_desk->window()->session()->showSource(std::move(camera));
    m_camera->start();
    openWindows();
}

void DeskSoakTest::cleanup()
{
    m_desk.reset();
    StatReportTest::cleanup();
}

void DeskSoakTest::openWindows()
{
    m_desk->button("theEditorButton")->click();
    QTRY_VERIFY(m_desk->editor() && m_desk->editor()->isVisible());
    const FileDialogAnswerer dialogs(sourcePath(QStringLiteral("examples/templates/every-block.rtp")));
    m_desk->editorButton("openButton")->click();
    QTRY_VERIFY(m_desk->pieces().size() >= 5);
    m_desk->button("theStatisticsButton")->click();
    QTRY_VERIFY(m_desk->statisticsWindow() && m_desk->statisticsWindow()->isVisible());
}

void DeskSoakTest::staysFlatAndAlive()
{
    const double start = residentMegabytes();
    QVERIFY(start > 0.0);
    RestlessUser user(m_desk->window());
    // A history that is still filling would be taken for a leak.
    QUndoStack *const history = m_desk->window()->objectEditor()->undoStack();
    QVERIFY(history->undoLimit() > 0);
    for (int i = 0; i < 50 * KvDeskObjectEditor::maximumSteps && history->count() < history->undoLimit(); ++i)
        user.step();
    QVERIFY(history->count() >= history->undoLimit() - 100);

    int frames = 0;
    qint64 steps = 0;
    qint64 longestGap = 0;
    QElapsedTimer clock;
    QElapsedTimer pulseClock;
    QTimer stepTimer;
    QTimer pulse;
    pulse.setTimerType(Qt::PreciseTimer);
    connect(m_camera, &ZtFrameSource::signalFrameReady, this, [&]() { ++frames; });
    connect(&stepTimer, &QTimer::timeout, this, [&]() {
        user.step();
        ++steps;
    });
    connect(&pulse, &QTimer::timeout, this, [&]() { longestGap = qMax(longestGap, pulseClock.restart()); });
    stepTimer.start(kStepInterval);

    const auto whole = static_cast<qint64>(minutes() * 60.0 * 1000.0);
    const qint64 warmUp = qBound<qint64>(8000, whole / 5, 60000);
    QTest::qWait(static_cast<int>(warmUp));
    const double warm = residentMegabytes();
    double highest = warm;
    frames = 0;
    steps = 0;
    const quint64 droppedBefore = m_camera->droppedFrames();
    pulseClock.start();
    pulse.start(kPulse);
    clock.start();
    for (int second = 1; clock.elapsed() < whole - warmUp; ++second) {
        QTest::qWait(1000);
        highest = qMax(highest, residentMegabytes());
        if (second % 60 == 0)
            qInfo("%.1f MB", residentMegabytes());
    }
    stepTimer.stop();
    pulse.stop();
    const double seconds = static_cast<double>(clock.elapsed()) / 1000.0;
    const quint64 dropped = m_camera->droppedFrames() - droppedBefore;
    const double end = residentMegabytes();
    qInfo("memory in MB: %.1f at the start, %.1f after the warm-up, %.1f at most, %.1f at the end", start,
          warm, highest, end);
    qInfo("in %.0f s: %d frames shown, %llu dropped, %lld changes; longest gap between events %lld ms",
          seconds, frames, dropped, steps, longestGap);

    QVERIFY(history->count() <= history->undoLimit());
    QVERIFY(steps > 0);
    QVERIFY2(frames > kLeastFrameShare * seconds * 1000.0 / SteadyCamera::interval,
             qPrintable(QString::number(frames)));
    QVERIFY2(longestGap < kLongestGap, qPrintable(QString::number(longestGap)));
    if (isMemoryMeaningful())
        QVERIFY2(end - warm < kMostGrowth, qPrintable(QString::number(end - warm)));
}

STATREPORT_TEST_MAIN(DeskSoakTest)
#include "DeskSoakTest.moc"
