// SPDX-License-Identifier: MIT
#pragma once

#include <QCoreApplication>
#include <QString>
#include <QStringList>

/** The command line of the program. */
class KvDeskCommandLine
{
    Q_DECLARE_TR_FUNCTIONS(KvDeskCommandLine)
public:
    /** Reads \a words, the first of which is the program's name. */
    explicit KvDeskCommandLine(const QStringList &words);

    /** What is wrong with the command line, one sentence; empty for a good one. */
    QString fault() const { return m_fault; }
    /** The fault and where to read more; empty for a good command line. */
    QString complaint() const;

    /** The files to open in this order: session, image, table, then those named without an option. */
    QString session() const { return m_session; }
    QString image() const { return m_image; }
    QString table() const { return m_table; }
    const QStringList &files() const { return m_files; }

    /** The theme of this run; empty for the remembered one. */
    QString theme() const { return m_theme; }
    const QStringList &pluginFolders() const { return m_pluginFolders; }

    /**
     * The text that --help or --version among \a words asks for; empty without them. Needs no application, as
     * there may be no display.
     */
    static QString requestedText(const QStringList &words);
    static QString helpText();

private:
    void checkTheme();

    QString m_fault;
    QString m_session;
    QString m_image;
    QString m_table;
    QString m_theme;
    QStringList m_files;
    QStringList m_pluginFolders;
};
