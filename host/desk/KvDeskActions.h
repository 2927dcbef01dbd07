// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

class QAction;

/** The commands of the program, with texts, icons and shortcuts. Tool tips name the shortcut. */
class KvDeskActions : public QObject
{
    Q_OBJECT
public:
    enum Id {
        NewSession,
        OpenImage,
        OpenSession,
        ImportTable,
        SaveSession,
        SaveSessionAs,
        Quit,
        ZoomIn,
        ZoomOut,
        ZoomFit,
        ZoomActual,
        ShowValues,
        ShowLog,
        ToggleTheme,
        Settings,
        About,
        Count
    };

    explicit KvDeskActions(QObject *parent = nullptr);

    QAction *action(Id id) const { return m_actions[id]; }

private:
    QAction *m_actions[Count] = {};
};
