// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include <QDir>
#include <QFile>
#include <QProcess>

namespace {

constexpr int longestRun = 60000; ///< milliseconds

struct Run
{
    int exitCode = -1;
    QString output;
    QString errors;
};

Run runHost(const QStringList &arguments)
{
    QProcess host;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("STATREPORT_SETTINGS"), QString()); // in memory
    environment.insert(QStringLiteral("QT_FATAL_WARNINGS"), QStringLiteral("1"));
    host.setProcessEnvironment(environment);
    host.start(QStringLiteral(STATREPORT_MINIMAL_HOST), arguments);
    if (!host.waitForFinished(longestRun) || host.exitStatus() != QProcess::NormalExit)
        return {-1, host.errorString(), QString::fromLocal8Bit(host.readAllStandardError())};
    return {host.exitCode(), QString::fromLocal8Bit(host.readAllStandardOutput()),
            QString::fromLocal8Bit(host.readAllStandardError())};
}

/// The code blocks of a guide, each as its lines without indentation.
QVector<QStringList> codeBlocks(const QString &markdown)
{
    static const QRegularExpression pattern(QStringLiteral("```cpp\n(.*?)```"),
                                            QRegularExpression::DotMatchesEverythingOption);
    QVector<QStringList> blocks;
    QRegularExpressionMatchIterator it = pattern.globalMatch(markdown);
    while (it.hasNext()) {
        QStringList lines;
        for (const QString &line : it.next().captured(1).split(QLatin1Char('\n'), Qt::SkipEmptyParts))
            lines.append(line.trimmed());
        blocks.append(lines);
    }
    return blocks;
}

QString textOf(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

QStringList linesOfTheExample()
{
    QStringList lines;
    for (const char *name : {"main.cpp", "ScratchImage.h", "ScratchManipulator.h"}) {
        const QString text =
            textOf(StatReportTest::sourcePath(QStringLiteral("examples/minimalhost/") + QLatin1String(name)));
        for (const QString &line : text.split(QLatin1Char('\n')))
            lines.append(line.trimmed());
    }
    return lines;
}

} // namespace

/** The example program of the host SDK, run as its users run it. */
class MinimalHostTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void findsTheToolOfThePlugin_data();
    void findsTheToolOfThePlugin();
    void failsWithoutPlugins();
    void passesOverOtherFiles();
    void isWhatTheGuideShows();
};

void MinimalHostTest::findsTheToolOfThePlugin_data()
{
    QTest::addColumn<QStringList>("arguments");
    const QString check = QStringLiteral("--check");
    const QString folder = QStringLiteral(STATREPORT_PLUGIN_FOLDER);
    QTest::newRow("folder of its own") << QStringList{check};
    QTest::newRow("folder named") << QStringList{check, folder};
    QTest::newRow("option last") << QStringList{folder, check};
}

void MinimalHostTest::findsTheToolOfThePlugin()
{
    QFETCH(QStringList, arguments);
    const Run run = runHost(arguments);
    QCOMPARE(run.errors, QString());
    QCOMPARE(run.output, QStringLiteral("Report & Statistic\n"));
    QCOMPARE(run.exitCode, 0);
}

void MinimalHostTest::failsWithoutPlugins()
{
    const QString folder = temporaryPath(QStringLiteral("empty"));
    QVERIFY(QDir().mkpath(folder));
    const Run run = runHost({QStringLiteral("--check"), folder});
    QCOMPARE(run.output, QString());
    QCOMPARE(run.exitCode, 1);
}

void MinimalHostTest::passesOverOtherFiles()
{
    const QString folder = temporaryPath(QStringLiteral("others"));
    QVERIFY(QDir().mkpath(folder));
    QFile text(folder + QStringLiteral("/notes.txt"));
    QVERIFY(text.open(QIODevice::WriteOnly) && text.write("no library") > 0);
    text.close();
    const Run run = runHost({QStringLiteral("--check"), folder});
    QVERIFY2(run.errors.startsWith(QLatin1String("notes.txt: ")), qPrintable(run.errors));
    QCOMPARE(run.exitCode, 1);
}

void MinimalHostTest::isWhatTheGuideShows()
{
    const QVector<QStringList> blocks = codeBlocks(textOf(sourcePath(QStringLiteral("docs/host-sdk.md"))));
    QStringList example = linesOfTheExample();
    example.append(QStringLiteral("...")); // stands for what an excerpt leaves out
    int shown = 0;
    for (const QStringList &block : blocks) {
        // Of hosts that open files of tools; the example has no files.
        if (block.join(QLatin1Char(' ')).contains(QLatin1String("opensFile")))
            continue;
        for (const QString &line : block)
            QVERIFY2(example.contains(line), qPrintable(line));
        ++shown;
    }
    QVERIFY(shown >= 6);
}

STATREPORT_TEST_MAIN(MinimalHostTest)
#include "MinimalHostTest.moc"
