// SPDX-License-Identifier: MIT
#pragma once

#include <QApplication>
#include <QTimer>
#include <QWidget>
#include <QtTest>

#include <functional>

/** Does something that runs a modal window, visits that window, and closes it. False when none came. */
inline bool visitModal(const std::function<void()> &open, const std::function<void(QWidget *)> &visit)
{
    bool isVisited = false;
    QTimer timer;
    QObject::connect(&timer, &QTimer::timeout, &timer, [&]() {
        QWidget *const modal = QApplication::activeModalWidget();
        if (!modal || !modal->isVisible())
            return;
        timer.stop();
        visit(modal);
        isVisited = true;
        modal->close();
    });
    timer.start(5);
    open();
    return QTest::qWaitFor([&isVisited]() { return isVisited; });
}
