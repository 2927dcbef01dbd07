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

STATREPORT_TEST_MAIN(MinimalHostTest)
#include "MinimalHostTest.moc"
