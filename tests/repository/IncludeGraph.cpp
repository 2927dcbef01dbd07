// SPDX-License-Identifier: MIT
#include "repository/IncludeGraph.h"

IncludeGraph::IncludeGraph(const SourceTree::Files &files, const QStringList &searchFolders)
    : m_files(files)
    , m_searchFolders(searchFolders)
{
    for (auto it = files.constBegin(); it != files.constEnd(); ++it) {
        if (it.key().endsWith(QLatin1String(".h")) || it.key().endsWith(QLatin1String(".cpp")))
            readIncludes(it.key(), it.value());
    }
}

void IncludeGraph::readIncludes(const QString &path, const QString &text)
{
    static const QRegularExpression pattern(QStringLiteral("^\\s*#\\s*include\\s*([\"<])([^\">]+)[\">]"));
    const QStringList lines = SourceTree::withoutComments(text).split(QLatin1Char('\n'));
    for (int i = 0; i < lines.size(); ++i) {
        const QRegularExpressionMatch match = pattern.match(lines.at(i));
        if (!match.hasMatch())
            continue;
        const bool isQuoted = match.captured(1) == QLatin1String("\"");
        const QString name = match.captured(2);
        if (name.endsWith(QLatin1String(".moc")))
            continue;
        const QString target = resolved(path, name);
        const QString place = QStringLiteral("%1:%2: %3").arg(path).arg(i + 1).arg(name);
        if (target.isEmpty() && isQuoted)
            m_faults.append(place + QStringLiteral(" is not there"));
        if (target.isEmpty())
            continue;
        if (!isQuoted)
            m_faults.append(place + QStringLiteral(" is ours: it belongs in quotes"));
        m_includes.append({path, i + 1, target});
        m_targets[path].append(target);
    }
}

QString IncludeGraph::resolved(const QString &from, const QString &name) const
{
    // What the build makes from a form stands for the form.
    static const QRegularExpression formHeader(QStringLiteral("^(.*/)?ui_(\\w+)\\.h$"));
    const QRegularExpressionMatch form = formHeader.match(name);
    const QString wanted =
        form.hasMatch() ? form.captured(1) + form.captured(2) + QStringLiteral(".ui") : name;
    QStringList folders{SourceTree::folder(from)};
    folders += m_searchFolders;
    for (const QString &folder : folders) {
        const QString path = QDir::cleanPath(folder + QLatin1Char('/') + wanted);
        if (m_files.contains(path))
            return path;
    }
    return QString();
}

QStringList IncludeGraph::loops() const
{
    QStringList loops;
    QMap<QString, bool> done;
    for (auto it = m_targets.constBegin(); it != m_targets.constEnd(); ++it) {
        QStringList trail;
        visit(it.key(), &trail, &done, &loops);
    }
    return loops;
}

void IncludeGraph::visit(const QString &path, QStringList *trail, QMap<QString, bool> *done,
                         QStringList *loops) const
{
    if (done->value(path))
        return;
    const int start = trail->indexOf(path);
    if (start >= 0) {
        loops->append((trail->mid(start) + QStringList(path)).join(QStringLiteral(" -> ")));
        return;
    }
    trail->append(path);
    for (const QString &target : m_targets.value(path))
        visit(target, trail, done, loops);
    trail->removeLast();
    done->insert(path, true);
}
