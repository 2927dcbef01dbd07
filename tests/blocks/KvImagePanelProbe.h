// SPDX-License-Identifier: MIT
#pragma once

#include "PanelProbe.h"

#include <QComboBox>
#include <QPushButton>
#include <QSpinBox>

/** What the panels of all blocks with a picture have in common, seen and used as by a user. */
namespace KvImagePanelProbe {

inline QSpinBox *widthBox(const QWidget *panel)
{
    return panel->findChild<QSpinBox *>();
}

inline QComboBox *angleBox(const QWidget *panel)
{
    return panel->findChild<QComboBox *>();
}

inline QList<QPushButton *> alignmentButtons(const QWidget *panel)
{
    QList<QPushButton *> buttons;
    for (QPushButton *button : PanelProbe::controls<QPushButton>(panel)) {
        if (button->isCheckable())
            buttons.append(button);
    }
    return buttons;
}

/** "40% 90° left", with the checked alignments. */
inline QString shownPlacement(const QWidget *panel)
{
    const QStringList names{QStringLiteral("left"), QStringLiteral("centre"), QStringLiteral("right")};
    QStringList parts{widthBox(panel)->text(), angleBox(panel)->currentText()};
    const auto buttons = panel->findChildren<QPushButton *>();
    for (int i = 0; i < 3; ++i) {
        if (buttons.at(i)->isChecked())
            parts.append(names.at(i));
    }
    return parts.join(QLatin1Char(' '));
}

/** Rows of "placement" (alignment, width, rotation) and what is "shown" of it. */
inline void addPlacementRows()
{
    QTest::addColumn<QVector<int>>("placement");
    QTest::addColumn<QString>("shown");
    QTest::newRow("new") << QVector<int>{132, 75, 0} << QStringLiteral("75% 0° centre");
    QTest::newRow("left") << QVector<int>{1, 1, 90} << QStringLiteral("1% 90° left");
    QTest::newRow("right") << QVector<int>{2, 100, 180} << QStringLiteral("100% 180° right");
    QTest::newRow("three quarters") << QVector<int>{4, 53, 270} << QStringLiteral("53% 270° centre");
    QTest::newRow("an eighth") << QVector<int>{132, 59, 45} << QStringLiteral("59% 0° centre");
    QTest::newRow("no alignment") << QVector<int>{0, 59, -90} << QStringLiteral("59% 0°");
}

/** What a click on each alignment button announces, twice each, and what is checked then: "1 left". */
inline QStringList clickAlignments(QWidget *panel)
{
    QSignalSpy chosen(panel, SIGNAL(signalAlignmentChanged(Qt::Alignment)));
    QStringList seen;
    for (QPushButton *button : alignmentButtons(panel)) {
        for (int i = 0; i < 2; ++i) {
            PanelProbe::click(button);
            const int alignment =
                chosen.isEmpty() ? -1 : int(chosen.takeLast().first().value<Qt::Alignment>());
            seen.append(QStringLiteral("%1 %2").arg(QString::number(alignment),
                                                    shownPlacement(panel).section(QLatin1Char(' '), 2)));
        }
    }
    return seen;
}

/** The same for a panel that does all of it right. */
inline QStringList properAlignments()
{
    return {QStringLiteral("1 left"),     QStringLiteral("1 left"),  QStringLiteral("132 centre"),
            QStringLiteral("132 centre"), QStringLiteral("2 right"), QStringLiteral("2 right")};
}

/** The widgets that the Tab key visits from the panel's first control on, once around. */
inline QList<QWidget *> tabChain(QWidget *panel)
{
    panel->activateWindow();
    if (!QTest::qWaitForWindowActive(panel))
        return {};
    widthBox(panel)->setFocus();
    QList<QWidget *> chain;
    while (!chain.contains(panel->focusWidget())) {
        chain.append(panel->focusWidget());
        QTest::keyClick(panel->focusWidget(), Qt::Key_Tab);
    }
    return chain;
}

/** Heights of width and angle box and of the buttons below them. */
inline QList<int> controlHeights(QWidget *panel)
{
    QList<int> heights{widthBox(panel)->height(), angleBox(panel)->height()};
    for (const QPushButton *button : PanelProbe::controls<QPushButton>(panel))
        heights.append(button->height());
    return heights;
}

} // namespace KvImagePanelProbe
