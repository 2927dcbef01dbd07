// SPDX-License-Identifier: MIT
#pragma once

#include <QList>
#include <QObject>
#include <QRegularExpression>
#include <QStringList>
#include <QTemporaryDir>
#include <QtTest>

/**
 * Base of every test object: a Qt warning that the test did not announce fails it.
 *
 * Test classes that have an init() or cleanup() of their own call the base's. The settings of a test program live in
 * memory, so that no test sees another's.
 */
class StatReportTest : public QObject
{
    Q_OBJECT
public:
    StatReportTest();
    ~StatReportTest() override;

    /** Announces one warning of this test function; it must come, else the test fails. */
    static void expectWarning(const QRegularExpression &pattern);

    /** Warnings that came unannounced since the program started. */
    static int unexpectedWarningCount();

    /** A folder of the test program's own, deleted at its end. */
    static QString temporaryPath(const QString &fileName);

    /** Absolute path of a file of the source tree. */
    static QString sourcePath(const QString &relativePath);

protected slots:
    void init();
    void cleanup();
};

/** Runs a test object in a QApplication set up as the programs set up theirs. */
int runStatReportTest(int argc, char **argv, StatReportTest *(*create)());

#define STATREPORT_TEST_MAIN(TestClass)                                                                        \
    int main(int argc, char **argv)                                                                            \
    {                                                                                                          \
        return runStatReportTest(argc, argv, []() -> StatReportTest * { return new TestClass; });              \
    }
