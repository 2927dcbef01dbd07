// SPDX-License-Identifier: MIT
#pragma once

#include <QApplication>
#include <QDrag>
#include <QDropEvent>
#include <QGraphicsView>
#include <QMimeData>
#include <QPointF>
#include <QPointer>
#include <QProcess>
#include <QWindow>
#include <QtTest>

#include <memory>

/**
 * The hands of a user: mouse and keyboard. Under X11 the events are real ones, made by xdotool; on the
 * off-screen platform they enter where those of the window system do.
 *
 * Each gesture returns when its last event is on the way; what follows from it is waited for by the caller.
 */
class DeskUser
{
public:
    static bool isReal() { return QGuiApplication::platformName() == QLatin1String("xcb"); }

    /** Gives a window the keyboard: the X server of the tests has no window manager that would. */
    void activate(QWidget *window)
    {
        m_window = window;
        window->activateWindow();
        if (isReal())
            run({QStringLiteral("windowfocus"), QString::number(window->winId())});
        QVERIFY(QTest::qWaitForWindowActive(window));
        // A window counts as active as soon as one that belongs to it is.
        QTRY_VERIFY(QGuiApplication::focusWindow() == window->windowHandle());
    }

    void click(QWidget *widget) { click(widget, widget->rect().center()); }
    void click(QWidget *widget, const QPoint &point)
    {
        if (isReal())
            run({QStringLiteral("mousemove"), x(widget, point), y(widget, point), QStringLiteral("click"),
                 QStringLiteral("1")});
        else
            QTest::mouseClick(windowOf(widget), Qt::LeftButton, Qt::NoModifier, inWindow(widget, point));
    }
    void clickScene(QGraphicsView *view, const QPointF &scenePoint)
    {
        click(view->viewport(), view->mapFromScene(scenePoint));
    }

    /** Presses at one place, moves to another in small steps, and lets go there. */
    void drag(QWidget *from, const QPoint &start, QWidget *to, const QPoint &end)
    {
        if (isReal())
            dragReally(from->mapToGlobal(start), to->mapToGlobal(end));
        else
            dragOffscreen(from, start, to, end);
    }

    /** The same within one widget that starts no drag and drop, such as for drawing on it. */
    void stroke(QWidget *widget, const QPoint &start, const QPoint &end)
    {
        if (isReal())
            dragReally(widget->mapToGlobal(start), widget->mapToGlobal(end));
        else
            strokeOffscreen(widget, start, end);
    }

    void type(const QString &text)
    {
        if (isReal()) {
            run({QStringLiteral("type"), QStringLiteral("--delay"), QStringLiteral("15"), text});
            return;
        }
        for (const QChar c : text)
            QTest::keyClick(keyWindow(), c.toLatin1());
    }
    void press(int key, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        if (isReal()) {
            run({QStringLiteral("key"), keyName(key, modifiers)});
            return;
        }
        // The key may close the window that gets it.
        const QPointer<QWindow> window = keyWindow();
        QTest::keyPress(window, static_cast<Qt::Key>(key), modifiers);
        if (window)
            QTest::keyRelease(window, static_cast<Qt::Key>(key), modifiers);
    }

private:
    static constexpr int kSteps = 12;
    static constexpr int kTimeout = 20000; // ms

    /** The off-screen platform leaves nobody with the keyboard when a dialog closes. */
    QWindow *keyWindow() const
    {
        if (!QGuiApplication::focusWindow() && m_window) {
            m_window->activateWindow();
            if (!QTest::qWaitForWindowActive(m_window))
                qWarning("The window does not get the keyboard.");
        }
        return QGuiApplication::focusWindow();
    }

    static QWindow *windowOf(QWidget *widget) { return widget->window()->windowHandle(); }
    static QPoint inWindow(QWidget *widget, const QPoint &point)
    {
        return widget->mapTo(widget->window(), point);
    }
    static QString x(QWidget *widget, const QPoint &point)
    {
        return QString::number(widget->mapToGlobal(point).x());
    }
    static QString y(QWidget *widget, const QPoint &point)
    {
        return QString::number(widget->mapToGlobal(point).y());
    }
    static QPoint between(const QPoint &start, const QPoint &end, int step)
    {
        return start + (end - start) * step / kSteps;
    }

    static QString keyName(int key, Qt::KeyboardModifiers modifiers)
    {
        QString name = QKeySequence(key).toString(QKeySequence::PortableText);
        if (key == Qt::Key_Escape)
            name = QStringLiteral("Escape");
        else if (key == Qt::Key_Delete)
            name = QStringLiteral("Delete");
        else if (key == Qt::Key_Backspace)
            name = QStringLiteral("BackSpace");
        else if (name.size() == 1)
            name = name.toLower();
        if (modifiers.testFlag(Qt::ShiftModifier))
            name.prepend(QStringLiteral("shift+"));
        if (modifiers.testFlag(Qt::ControlModifier))
            name.prepend(QStringLiteral("ctrl+"));
        return name;
    }

    /** The program's own events go on while the tool works. */
    static void run(const QStringList &arguments)
    {
        QProcess process;
        process.start(QStringLiteral("xdotool"), arguments);
        QTRY_VERIFY_WITH_TIMEOUT(process.state() == QProcess::NotRunning, kTimeout);
        QCOMPARE(process.exitCode(), 0);
        // The events come through another connection than the tool's end.
        QTest::qWait(50);
    }

    static void dragReally(const QPoint &start, const QPoint &end)
    {
        QStringList arguments{QStringLiteral("mousemove"), QString::number(start.x()),
                              QString::number(start.y()), QStringLiteral("mousedown"), QStringLiteral("1")};
        for (int i = 1; i <= kSteps; ++i) {
            const QPoint point = between(start, end, i);
            arguments << QStringLiteral("sleep") << QStringLiteral("0.03") << QStringLiteral("mousemove")
                      << QString::number(point.x()) << QString::number(point.y());
        }
        arguments << QStringLiteral("sleep") << QStringLiteral("0.2") << QStringLiteral("mouseup")
                  << QStringLiteral("1");
        run(arguments);
    }

    static void strokeOffscreen(QWidget *widget, const QPoint &start, const QPoint &end)
    {
        QWindow *window = windowOf(widget);
        QTest::mousePress(window, Qt::LeftButton, Qt::NoModifier, inWindow(widget, start));
        for (int i = 1; i <= kSteps; ++i)
            QTest::mouseMove(window, inWindow(widget, between(start, end, i)));
        QTest::mouseRelease(window, Qt::LeftButton, Qt::NoModifier, inWindow(widget, end));
    }

    /** Keeps what a drag carries: on the off-screen platform drags end as soon as they begin. */
    class DragCatcher : public QObject
    {
    public:
        DragCatcher() { qApp->installEventFilter(this); }
        QMimeData *data() const { return m_data.get(); }

        bool eventFilter(QObject *object, QEvent *event) override
        {
            auto *drag = event->type() == QEvent::DeferredDelete ? qobject_cast<QDrag *>(object) : nullptr;
            if (drag && drag->mimeData()) {
                m_data = std::make_unique<QMimeData>();
                for (const QString &format : drag->mimeData()->formats())
                    m_data->setData(format, drag->mimeData()->data(format));
            }
            return false;
        }

    private:
        std::unique_ptr<QMimeData> m_data;
    };

    static void dragOffscreen(QWidget *from, const QPoint &start, QWidget *to, const QPoint &end)
    {
        DragCatcher catcher;
        QWindow *window = windowOf(from);
        const QPoint far(2 * QApplication::startDragDistance(), 0);
        QTest::mousePress(window, Qt::LeftButton, Qt::NoModifier, inWindow(from, start));
        QTest::mouseMove(window, inWindow(from, start + far));
        // Lists of Qt's take one move more.
        if (!QTest::qWaitFor([&catcher]() { return catcher.data() != nullptr; }, 100))
            QTest::mouseMove(window, inWindow(from, start + 2 * far));
        QTRY_VERIFY(catcher.data());
        QTest::mouseRelease(window, Qt::LeftButton, Qt::NoModifier, inWindow(from, start + far));
        QDragEnterEvent enter(end, Qt::CopyAction | Qt::MoveAction, catcher.data(), Qt::LeftButton,
                              Qt::NoModifier);
        QCoreApplication::sendEvent(to, &enter);
        QDragMoveEvent move(end, Qt::CopyAction | Qt::MoveAction, catcher.data(), Qt::LeftButton,
                            Qt::NoModifier);
        QCoreApplication::sendEvent(to, &move);
        QDropEvent drop(end, Qt::CopyAction | Qt::MoveAction, catcher.data(), Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(to, &drop);
    }

    QPointer<QWidget> m_window; ///< activated last
};
