// SPDX-License-Identifier: MIT
#pragma once

#include <QAbstractButton>
#include <QLabel>
#include <QtTest>

#include <algorithm>

/** Finds and clicks the controls of an options panel as a user does: by what they look like and where they
 * are. */
namespace PanelProbe {

/** Controls of one type, top to bottom and left to right. */
template <typename Control>
QList<Control *> controls(const QWidget *panel)
{
    QList<Control *> found = panel->findChildren<Control *>();
    std::sort(found.begin(), found.end(), [panel](const Control *a, const Control *b) {
        const QPoint left = a->mapTo(panel, QPoint(0, 0));
        const QPoint right = b->mapTo(panel, QPoint(0, 0));
        return left.y() != right.y() ? left.y() < right.y() : left.x() < right.x();
    });
    return found;
}

inline QStringList labelTexts(const QWidget *panel)
{
    QStringList texts;
    for (const QLabel *label : controls<QLabel>(panel))
        texts.append(label->text());
    return texts;
}

template <typename Button>
QStringList buttonTexts(const QWidget *panel)
{
    QStringList texts;
    for (const Button *button : controls<Button>(panel))
        texts.append(button->text());
    return texts;
}

template <typename Button>
Button *button(const QWidget *panel, const QString &text)
{
    for (Button *candidate : controls<Button>(panel)) {
        if (candidate->text() == text)
            return candidate;
    }
    return nullptr;
}

/** Clicks where check boxes and radio buttons have their mark. */
inline void click(QAbstractButton *button)
{
    QTest::mouseClick(button, Qt::LeftButton, Qt::NoModifier, QPoint(8, button->height() / 2));
}

/** Shows a panel at a size of its own choosing and waits until it can be clicked. */
inline bool show(QWidget *panel)
{
    panel->show();
    return QTest::qWaitForWindowExposed(panel);
}

} // namespace PanelProbe
