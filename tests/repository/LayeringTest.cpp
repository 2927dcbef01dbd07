// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "repository/IncludeGraph.h"
#include "repository/SourceTree.h"

#include <QSet>

namespace {

struct Target
{
    QString name;
    QStringList sources;
};

/// The targets of a CMake file that list their sources, in the order of the file.
QVector<Target> targetsOf(const QString &cmakeText)
{
    static const QRegularExpression comment(QStringLiteral("#[^\n]*"));
    static const QRegularExpression call(QStringLiteral("\\b\\w+\\s*\\(([^()]*)\\)"));
    static const QRegularExpression keyword(QStringLiteral("^[A-Z_]+$"));
    static const QRegularExpression blanks(QStringLiteral("\\s+"));
    QVector<Target> targets;
    QRegularExpressionMatchIterator it = call.globalMatch(QString(cmakeText).remove(comment));
    while (it.hasNext()) {
        const QStringList words = it.next().captured(1).split(blanks, Qt::SkipEmptyParts);
        const int first = words.indexOf(QStringLiteral("SOURCES")) + 1;
        if (first < 2)
            continue;
        Target target{words.first(), {}};
        for (int i = first; i < words.size() && !keyword.match(words.at(i)).hasMatch(); ++i)
            target.sources.append(words.at(i));
        targets.append(target);
    }
    return targets;
}

/// Which layers a file's layer may use. Files are told apart by folder, those of the plug-in by target.
class Layers
{
public:
    /// \param targets the plug-in's, lowest first
    explicit Layers(const QVector<Target> &targets)
    {
        const QString common = QStringLiteral("host/common");
        const QString image = QStringLiteral("host/image");
        const QString kernel = QStringLiteral("host/kernel");
        const QString gui = QStringLiteral("host/gui");
        const QString measuring = QStringLiteral("host/measuring");
        m_allowed.insert(common, {});
        m_allowed.insert(image, {common});
        m_allowed.insert(kernel, {common, image});
        m_allowed.insert(gui, {common, image, kernel});
        m_allowed.insert(measuring, {common, image, kernel});
        m_allowed.insert(QStringLiteral("host/desk"), {common, image, kernel, gui, measuring});

        QSet<QString> below;
        for (const Target &target : targets) {
            QSet<QString> &allowed = m_allowed[target.name];
            allowed = below;
            if (target.name == QLatin1String("kvcharts")) // a library of its own: the host is unknown to it
                allowed = {QStringLiteral("statreport_data")};
            else if (below.isEmpty()) // the data layer knows no windows
                allowed = {common, image, kernel};
            else
                allowed += {common, image, kernel, gui};
            below.insert(target.name);
            for (const QString &source : target.sources)
                m_targets.insert(QStringLiteral("src/") + source, target.name);
        }
        m_allowed.insert(QStringLiteral("cli"), below + QSet<QString>{common, image, kernel, gui, measuring});
    }

    /// Empty for a file that belongs to none.
    QString layerOf(const QString &path) const
    {
        if (path.startsWith(QLatin1String("src/")))
            return m_targets.value(path);
        const QString layer =
            path.section(QLatin1Char('/'), 0, path.startsWith(QLatin1String("host/")) ? 1 : 0);
        return m_allowed.contains(layer) ? layer : QString();
    }

    QStringList violations(const IncludeGraph &graph) const
    {
        QStringList result;
        for (const IncludeGraph::Include &include : graph.includes()) {
            const QString from = layerOf(include.from);
            const QString to = layerOf(include.to);
            if (from.isEmpty() || to.isEmpty() || (from != to && !m_allowed.value(from).contains(to)))
                result.append(QStringLiteral("%1:%2: %3 (%4) uses %5 (%6)")
                                  .arg(include.from)
                                  .arg(include.line)
                                  .arg(include.from, from, include.to, to));
        }
        return result;
    }

private:
    QMap<QString, QSet<QString>> m_allowed;
    QMap<QString, QString> m_targets;
};

const QStringList searchFolders{QStringLiteral("src"), QStringLiteral("host"), QStringLiteral("cli")};

QByteArray lines(const QStringList &texts)
{
    return '\n' + texts.join(QLatin1Char('\n')).toUtf8();
}

/// A small tree that keeps the rules.
SourceTree::Files madeUpTree()
{
    return {{QStringLiteral("host/common/C.h"), QString()},
            {QStringLiteral("host/image/I.h"), QString()},
            {QStringLiteral("host/kernel/K.h"), QStringLiteral("#include \"image/I.h\"\n")},
            {QStringLiteral("host/gui/G.h"), QStringLiteral("#include \"kernel/K.h\"\n")},
            {QStringLiteral("host/measuring/M.h"), QStringLiteral("#include \"kernel/K.h\"\n")},
            {QStringLiteral("host/desk/W.h"),
             QStringLiteral("#include \"gui/G.h\"\n#include \"measuring/M.h\"\n")},
            {QStringLiteral("src/data/D.h"), QStringLiteral("#include \"kernel/K.h\"\n")},
            {QStringLiteral("src/charts/H.h"), QStringLiteral("#include \"data/D.h\"\n")},
            {QStringLiteral("src/templates/B.h"),
             QStringLiteral("#include \"charts/H.h\"\n#include \"gui/G.h\"\n")},
            {QStringLiteral("src/templates/T.h"), QStringLiteral("#include \"B.h\"\n")},
            {QStringLiteral("src/templates/F.ui"), QString()},
            {QStringLiteral("cli/main.cpp"),
             QStringLiteral("#include \"templates/T.h\"\n#include \"measuring/M.h\"\n")}};
}

const QString madeUpTargets =
    QStringLiteral("statreport_layer(statreport_data SOURCES data/D.h)\n"
                   "statreport_layer(kvcharts SOURCES charts/H.h)\n"
                   "statreport_layer(statreport_blockapi SOURCES templates/B.h)\n"
                   "statreport_layer(statreport_document SOURCES templates/T.h templates/F.ui)\n");

} // namespace

class LayeringTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();

    void readsTargets();
    void seesForbiddenIncludes_data();
    void seesForbiddenIncludes();
    void seesLoops_data();
    void seesLoops();
    void seesIncludesOfNothing_data();
    void seesIncludesOfNothing();

    void theTargetsKeepTheirOrder();
    void everySourceBelongsToOneTarget();
    void dataAndChartsAreFoldersOfTheirOwn();
    void everyHostFolderHasALayer();
    void everyIncludeIsFound();
    void includesFollowTheLayers();
    void noFileIncludesItself();

private:
    SourceTree::Files m_files;
    QVector<Target> m_targets;
};

void LayeringTest::initTestCase()
{
    m_files = SourceTree::read(sourcePath(QString()),
                               {QStringLiteral("src"), QStringLiteral("host"), QStringLiteral("cli")},
                               {QStringLiteral("*.h"), QStringLiteral("*.cpp"), QStringLiteral("*.ui"),
                                QStringLiteral("*.qrc"), QStringLiteral("CMakeLists.txt")});
    m_targets = targetsOf(m_files.value(QStringLiteral("src/CMakeLists.txt")));
    QVERIFY(m_files.contains(QStringLiteral("src/data/KvMeasuredValue.h")));
    QVERIFY(m_files.contains(QStringLiteral("host/kernel/ZtKernelData.h")));
    QVERIFY(m_targets.size() >= 5);
}

void LayeringTest::readsTargets()
{
    const QVector<Target> targets = targetsOf(QStringLiteral(
        "# statreport_layer(none SOURCES x.h)\n"
        "statreport_layer(one\n  SOURCES\n    a/A.cpp a/A.h # both\n    B.ui\n  PUBLIC Qt5::Core)\n"
        "set_target_properties(one PROPERTIES A B)\n"
        "statreport_layer(two PUBLIC one SOURCES C.h)\n"));
    QCOMPARE(targets.size(), 2);
    QCOMPARE(targets.at(0).name, QStringLiteral("one"));
    QCOMPARE(targets.at(0).sources,
             QStringList({QStringLiteral("a/A.cpp"), QStringLiteral("a/A.h"), QStringLiteral("B.ui")}));
    QCOMPARE(targets.at(1).name, QStringLiteral("two"));
    QCOMPARE(targets.at(1).sources, QStringList(QStringLiteral("C.h")));
}

void LayeringTest::seesForbiddenIncludes_data()
{
    QTest::addColumn<QString>("from");
    QTest::addColumn<QString>("include");
    QTest::addColumn<bool>("forbidden");
    const auto row = [](const char *from, const char *include, bool forbidden) {
        QTest::addRow("%s includes %s", from, include)
            << QString::fromLatin1(from) << QString::fromLatin1(include) << forbidden;
    };
    row("host/common/C.h", "image/I.h", true);
    row("host/image/I.h", "common/C.h", false);
    row("host/image/I.h", "kernel/K.h", true);
    row("host/kernel/K.h", "gui/G.h", true);
    row("host/kernel/K.h", "measuring/M.h", true);
    row("host/kernel/K.h", "data/D.h", true);
    row("host/gui/G.h", "measuring/M.h", true);
    row("host/gui/G.h", "image/I.h", false);
    row("host/measuring/M.h", "gui/G.h", true);
    row("host/measuring/M.h", "data/D.h", true);
    row("host/measuring/M.h", "common/C.h", false);
    row("host/desk/W.h", "templates/T.h", true);
    row("src/data/D.h", "gui/G.h", true);
    row("src/data/D.h", "charts/H.h", true);
    row("src/data/D.h", "measuring/M.h", true);
    row("src/charts/H.h", "kernel/K.h", true);
    row("src/charts/H.h", "templates/B.h", true);
    row("src/templates/B.h", "templates/T.h", true); // the same folder, but not the same target
    row("src/templates/B.h", "templates/ui_F.h", true);
    row("src/templates/T.h", "templates/ui_F.h", false);
    row("src/templates/T.h", "data/D.h", false);
    row("src/templates/T.h", "measuring/M.h", true);
    row("src/templates/T.h", "desk/W.h", true);
    row("src/templates/T.h", "../../cli/main.cpp", true);
    row("cli/main.cpp", "gui/G.h", false);
    row("cli/main.cpp", "desk/W.h", true);
}

void LayeringTest::seesForbiddenIncludes()
{
    QFETCH(QString, from);
    QFETCH(QString, include);
    QFETCH(bool, forbidden);
    SourceTree::Files files = madeUpTree();
    const Layers layers(targetsOf(madeUpTargets));
    QCOMPARE(layers.violations(IncludeGraph(files, searchFolders)), QStringList());
    files[from] += QStringLiteral("  # include \"%1\"  // why\n").arg(include);
    const IncludeGraph graph(files, searchFolders);
    QCOMPARE(graph.faults(), QStringList());
    QCOMPARE(layers.violations(graph).size(), forbidden ? 1 : 0);
    // Commented out it is no arrow.
    files = madeUpTree();
    files[from] += QStringLiteral("// #include \"%1\"\n/*\n#include \"%1\"\n*/\n").arg(include);
    QCOMPARE(layers.violations(IncludeGraph(files, searchFolders)), QStringList());
}

void LayeringTest::seesLoops_data()
{
    QTest::addColumn<QString>("a");
    QTest::addColumn<QString>("b");
    QTest::addColumn<QString>("c");
    QTest::addColumn<QStringList>("loops");
    const QString includesA = QStringLiteral("#include \"a.h\"\n");
    const QString includesB = QStringLiteral("#include \"b.h\"\n");
    const QString includesC = QStringLiteral("#include \"c.h\"\n");
    QTest::newRow("a line") << includesB << includesC << QString() << QStringList();
    QTest::newRow("a diamond") << includesB + includesC << includesC << QString() << QStringList();
    QTest::newRow("itself") << includesA << QString() << QString()
                            << QStringList(QStringLiteral("src/a.h -> src/a.h"));
    QTest::newRow("two") << includesB << includesA << QString()
                         << QStringList(QStringLiteral("src/a.h -> src/b.h -> src/a.h"));
    QTest::newRow("three") << includesB << includesC << includesA
                           << QStringList(QStringLiteral("src/a.h -> src/b.h -> src/c.h -> src/a.h"));
    QTest::newRow("behind another") << includesB << includesC << includesB
                                    << QStringList(QStringLiteral("src/b.h -> src/c.h -> src/b.h"));
}

void LayeringTest::seesLoops()
{
    QFETCH(QString, a);
    QFETCH(QString, b);
    QFETCH(QString, c);
    QFETCH(QStringList, loops);
    const IncludeGraph graph(
        {{QStringLiteral("src/a.h"), a}, {QStringLiteral("src/b.h"), b}, {QStringLiteral("src/c.h"), c}},
        searchFolders);
    QCOMPARE(graph.loops(), loops);
}

void LayeringTest::seesIncludesOfNothing_data()
{
    QTest::addColumn<QString>("line");
    QTest::addColumn<int>("faults");
    QTest::newRow("there") << QStringLiteral("#include \"kernel/K.h\"") << 0;
    QTest::newRow("not there") << QStringLiteral("#include \"kernel/L.h\"") << 1;
    QTest::newRow("a form that is not there") << QStringLiteral("#include \"ui_N.h\"") << 1;
    QTest::newRow("of the system") << QStringLiteral("#include <QWidget>") << 0;
    QTest::newRow("ours, in angle brackets") << QStringLiteral("#include <kernel/K.h>") << 1;
    QTest::newRow("made by moc") << QStringLiteral("#include \"T.moc\"") << 0;
}

void LayeringTest::seesIncludesOfNothing()
{
    QFETCH(QString, line);
    QFETCH(int, faults);
    SourceTree::Files files = madeUpTree();
    files[QStringLiteral("src/templates/T.h")] = line;
    QCOMPARE(IncludeGraph(files, searchFolders).faults().size(), faults);
}

void LayeringTest::theTargetsKeepTheirOrder()
{
    const QStringList known{QStringLiteral("statreport_data"), QStringLiteral("kvcharts"),
                            QStringLiteral("statreport_blockapi"), QStringLiteral("statreport_blocks"),
                            QStringLiteral("statreport_document")};
    QStringList names;
    for (const Target &target : qAsConst(m_targets))
        names.append(target.name);
    // Layers that come later stand above all of these.
    QCOMPARE(names.mid(0, known.size()), known);
    QCOMPARE(names.removeDuplicates(), 0);
}

void LayeringTest::everySourceBelongsToOneTarget()
{
    QMap<QString, int> listed;
    for (const Target &target : qAsConst(m_targets)) {
        for (const QString &source : target.sources)
            ++listed[QStringLiteral("src/") + source];
    }
    QStringList faults;
    for (auto it = m_files.constBegin(); it != m_files.constEnd(); ++it) {
        const bool isSource = it.key().startsWith(QLatin1String("src/")) &&
                              SourceTree::fileName(it.key()) != QLatin1String("CMakeLists.txt");
        if (isSource && listed.value(it.key()) != 1)
            faults.append(QStringLiteral("%1 is in %2 targets").arg(it.key()).arg(listed.value(it.key())));
    }
    for (auto it = listed.constBegin(); it != listed.constEnd(); ++it) {
        if (!m_files.contains(it.key()))
            faults.append(QStringLiteral("%1 is listed, but not there").arg(it.key()));
    }
    QVERIFY2(faults.isEmpty(), lines(faults));
}

void LayeringTest::dataAndChartsAreFoldersOfTheirOwn()
{
    const Layers layers(m_targets);
    QStringList faults;
    for (auto it = m_files.constBegin(); it != m_files.constEnd(); ++it) {
        const QString folder = SourceTree::folder(it.key());
        const QString layer = layers.layerOf(it.key());
        if ((folder == QLatin1String("src/data")) != (layer == QLatin1String("statreport_data")) ||
            (folder == QLatin1String("src/charts")) != (layer == QLatin1String("kvcharts")))
            faults.append(it.key() + QStringLiteral(" is in ") + layer);
    }
    QVERIFY2(faults.isEmpty(), lines(faults));
}

void LayeringTest::everyHostFolderHasALayer()
{
    const Layers layers(m_targets);
    QStringList faults;
    for (auto it = m_files.constBegin(); it != m_files.constEnd(); ++it) {
        if (it.key().startsWith(QLatin1String("host/")) && it.key().count(QLatin1Char('/')) > 1 &&
            layers.layerOf(it.key()).isEmpty())
            faults.append(it.key());
    }
    QVERIFY2(faults.isEmpty(), lines(faults));
}

void LayeringTest::everyIncludeIsFound()
{
    const QStringList faults = IncludeGraph(m_files, searchFolders).faults();
    QVERIFY2(faults.isEmpty(), lines(faults));
}

void LayeringTest::includesFollowTheLayers()
{
    const IncludeGraph graph(m_files, searchFolders);
    QVERIFY(graph.includes().size() > 100);
    const QStringList violations = Layers(m_targets).violations(graph);
    QVERIFY2(violations.isEmpty(), lines(violations));
}

void LayeringTest::noFileIncludesItself()
{
    const QStringList loops = IncludeGraph(m_files, searchFolders).loops();
    QVERIFY2(loops.isEmpty(), lines(loops));
}

STATREPORT_TEST_MAIN(LayeringTest)
#include "LayeringTest.moc"
