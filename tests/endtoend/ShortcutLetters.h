// SPDX-License-Identifier: MIT
#pragma once

#include <QAbstractButton>
#include <QAction>
#include <QKeySequence>
#include <QLabel>
#include <QMap>
#include <QMenu>
#include <QMenuBar>
#include <QStringList>
#include <QWidget>

/** Looks for letters that stand for two things at once: keys typed with Alt, or alone in an open menu. */
class ShortcutLetters
{
public:
    /** A line for each letter that two items of one menu of \a window have. */
    static QStringList clashesInMenus(QWidget *window)
    {
        QStringList clashes;
        for (const QMenu *menu : window->findChildren<QMenu *>()) {
            QStringList texts;
            for (const QAction *action : menu->actions()) {
                if (!action->isSeparator())
                    texts.append(action->text());
            }
            clashes += clashesOf(texts);
        }
        return clashes;
    }

    /** A line for each letter that two of the menus, buttons and labels of \a window have. */
    static QStringList clashesInWindow(QWidget *window)
    {
        QStringList texts;
        for (const QMenuBar *bar : window->findChildren<QMenuBar *>()) {
            for (const QAction *action : bar->actions())
                texts.append(action->text());
        }
        for (const QWidget *widget : window->findChildren<QWidget *>()) {
            if (widget->window() == window && widget->isVisibleTo(window))
                texts.append(textOf(widget));
        }
        return clashesOf(texts);
    }

private:
    static QString textOf(const QWidget *widget)
    {
        const auto *const label = qobject_cast<const QLabel *>(widget);
        if (label)
            return label->buddy() ? label->text() : QString();
        const auto *const button = qobject_cast<const QAbstractButton *>(widget);
        // The button of a command has the menu's text, but not its letter: it shows its picture.
        const bool isPicture = button && button->inherits("QToolButton");
        return button && !isPicture ? button->text() : QString();
    }

    static QStringList clashesOf(const QStringList &texts)
    {
        QMap<QString, QString> owners;
        QStringList clashes;
        for (const QString &text : texts) {
            const QString letter = QKeySequence::mnemonic(text).toString();
            if (letter.isEmpty())
                continue;
            if (owners.contains(letter))
                clashes.append(
                    QStringLiteral("%1: \"%2\" and \"%3\"").arg(letter, owners.value(letter), text));
            owners.insert(letter, text);
        }
        return clashes;
    }
};
