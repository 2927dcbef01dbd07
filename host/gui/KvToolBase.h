// SPDX-License-Identifier: MIT
#pragma once

#include "gui/ZtGuiGlobal.h"

#include <QIcon>
#include <QObject>
#include <QPointer>
#include <QString>
#include <QStringList>

class KvGuiMainWindowBase;
class QToolButton;
class QVBoxLayout;
class QWidget;

/**
 * One tool of the main window: a checkable button, and a panel with the tool's title, a reset button and the
 * tool's own widget. The tool is active while its button is checked.
 *
 * The main window places button and panel (KvGuiMainWindowBase::placeTool()). Both live as long as the tool,
 * which is a child of the main window.
 */
class ZT_GUI_EXPORT KvToolBase : public QObject
{
    Q_OBJECT
public:
    /**
     * Makes a tool and adds it to \a mainWindow.
     * \param title     translated: the panel's title and the button's tool tip
     * \param name      untranslated: the object name of tool and button
     * \param activated whether the tool starts active
     */
    KvToolBase(KvGuiMainWindowBase *mainWindow, const QIcon &icon, const QString &title, const QString &name,
               bool activated);
    ~KvToolBase() override;

    QString title() const { return m_title; }     ///< translated, as given
    QString name() const { return objectName(); } ///< untranslated, as given

    QToolButton *getToolButton() const;  ///< null once it was deleted
    void setToolIcon(const QIcon &icon); ///< the icon of the button

    /** Title row and, below it, the tool's widget. */
    QWidget *panel() const;
    /**
     * Puts the tool's widget into the panel and takes it over; the one before is deleted. Null takes it
     * away.
     */
    void setGuiWidget(QWidget *widget);
    QWidget *guiWidget() const; ///< null when there is none

    /** Whether the panel offers the reset button; it does at first. */
    void setResetVisible(bool visible);
    bool isResetVisible() const;         ///< also while the panel is hidden
    QToolButton *getResetButton() const; ///< null once it was deleted

    /**
     * Lets the user have the tool or not. A tool that is not enabled is not active; one that is enabled
     * becomes active with \a activate and stays as it is without.
     */
    void setEnabled(bool enabled, bool activate);
    bool isEnabled() const;   ///< whether the user may have the tool
    bool isActivated() const; ///< whether the button is checked

    /**
     * Kinds of files that the tool opens when the user gives one to the program, by a double click or a drop:
     * suffixes without a dot, compared without regard to case. None at first.
     */
    void setFileSuffixes(const QStringList &suffixes) { m_fileSuffixes = suffixes; }
    QStringList fileSuffixes() const { return m_fileSuffixes; } ///< as they were set
    bool opensFile(const QString &path) const;                  ///< whether the file is of the tool's kinds
    /** Has the tool open a file (fileGiven()); it becomes active. A tool that is not enabled does nothing. */
    void openFile(const QString &path);

signals:
    void toolActivated(bool anActivated); ///< the button was checked or unchecked, by the user or by code
    void resetClicked();                  ///< the user wants the tool's values back at their defaults
    void fileGiven(const QString &aPath); ///< the user gave the program a file of the tool's kinds

private:
    void createButton(const QIcon &icon, bool activated);
    void createPanel();

    QString m_title;
    QStringList m_fileSuffixes;
    QPointer<QToolButton> m_button;
    QPointer<QToolButton> m_resetButton;
    QPointer<QWidget> m_panel;
    QPointer<QWidget> m_guiWidget;
    QVBoxLayout *m_panelLayout = nullptr; ///< of the panel
};
