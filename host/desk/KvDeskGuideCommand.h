// SPDX-License-Identifier: MIT
#pragma once

#include <QCoreApplication>
#include <QObject>

#include <memory>

class KvDeskActions;
class KvDeskGuideWindow;

/** Shows the user guide, in a window that stays the same until the program ends. */
class KvDeskGuideCommand : public QObject
{
    Q_OBJECT
public:
    /** The guide's file that comes with the program: in a language of KvDeskLanguages, in English where there
     * is none in that; empty where there is neither. */
    static QString guide(const QString &language,
                         const QString &programFolder = QCoreApplication::applicationDirPath());

    /** \a actions has to outlive this. Their action for the guide says so when \a path is empty. */
    KvDeskGuideCommand(KvDeskActions *actions, const QString &path, QObject *parent = nullptr);
    ~KvDeskGuideCommand() override;

    KvDeskGuideWindow *window() const { return m_window.get(); } ///< null before the guide was first shown

public slots:
    void slotShow();

private:
    void bringToFront();

    QString m_path;
    std::unique_ptr<KvDeskGuideWindow> m_window; ///< has no parent, so that the main window can be above it
};
