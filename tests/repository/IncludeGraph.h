// SPDX-License-Identifier: MIT
#pragma once

#include "repository/SourceTree.h"

#include <QMap>
#include <QString>
#include <QStringList>
#include <QVector>

/** Which source file includes which, as far as both are in the repository. */
class IncludeGraph
{
public:
    struct Include
    {
        QString from;
        int line = 0;
        QString to;
    };

    /**
     * \param searchFolders where included files are looked for after the includer's own folder
     */
    IncludeGraph(const SourceTree::Files &files, const QStringList &searchFolders);

    const QVector<Include> &includes() const { return m_includes; }
    /** Quoted includes of files that are not there, and files of the repository in angle brackets. */
    const QStringList &faults() const { return m_faults; }
    /** Loops, each as the files on it in the order of inclusion, joined by " -> ". */
    QStringList loops() const;

private:
    void readIncludes(const QString &path, const QString &text);
    QString resolved(const QString &from, const QString &name) const;
    void visit(const QString &path, QStringList *trail, QMap<QString, bool> *done, QStringList *loops) const;

    SourceTree::Files m_files;
    QStringList m_searchFolders;
    QVector<Include> m_includes;
    QMap<QString, QStringList> m_targets;
    QStringList m_faults;
};
