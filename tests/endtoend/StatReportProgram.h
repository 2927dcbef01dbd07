// SPDX-License-Identifier: MIT
#pragma once

#include <QProcess>
#include <QProcessEnvironment>
#include <QString>
#include <QStringList>

/** How a run of a program ended. */
struct ProgramResult
{
    int exitCode = -1; ///< negative for a program that crashed, hung or does not exist
    QByteArray output;
    QString errors;
};

/** Runs programs as on a machine without a display, in English unless told otherwise. */
class StatReportProgram
{
public:
    static ProgramResult run(const QStringList &arguments, const QByteArray &input = QByteArray(),
                             const QString &folder = QString())
    {
        return runProgram(QStringLiteral(STATREPORT_PROGRAM), arguments, input, folder);
    }

    /** With more variables in the environment, "NAME=value" each. */
    static ProgramResult runWith(const QStringList &variables, const QStringList &arguments,
                                 const QString &folder)
    {
        return runProgram(QStringLiteral(STATREPORT_PROGRAM), arguments, QByteArray(), folder, QString(),
                          variables);
    }

    /** With the standard output going into a file or device. */
    static ProgramResult runInto(const QString &outputFile, const QStringList &arguments)
    {
        return runProgram(QStringLiteral(STATREPORT_PROGRAM), arguments, QByteArray(), QString(), outputFile);
    }

    static ProgramResult runProgram(const QString &program, const QStringList &arguments,
                                    const QByteArray &input = QByteArray(), const QString &folder = QString(),
                                    const QString &outputFile = QString(),
                                    const QStringList &variables = QStringList())
    {
        QProcess process;
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        for (const char *name : {"DISPLAY", "WAYLAND_DISPLAY", "QT_QPA_PLATFORM", "XDG_RUNTIME_DIR"})
            environment.remove(QLatin1String(name));
        environment.remove(QStringLiteral("LANGUAGE"));
        environment.insert(QStringLiteral("LC_ALL"), QStringLiteral("C.UTF-8"));
        for (const QString &variable : variables) {
            const int end = variable.indexOf(QLatin1Char('='));
            environment.insert(variable.left(end), variable.mid(end + 1));
        }
        process.setProcessEnvironment(environment);
        if (!folder.isEmpty())
            process.setWorkingDirectory(folder);
        if (!outputFile.isEmpty())
            process.setStandardOutputFile(outputFile);
        process.start(program, arguments);
        ProgramResult result;
        if (!process.waitForStarted(kTimeout)) {
            result.errors = program + QStringLiteral(" cannot be started: ") + process.errorString();
            return result;
        }
        process.write(input);
        process.closeWriteChannel();
        if (!process.waitForFinished(kTimeout)) {
            process.kill();
            process.waitForFinished(kTimeout);
            result.errors = program + QStringLiteral(" does not end");
            return result;
        }
        if (process.exitStatus() == QProcess::NormalExit)
            result.exitCode = process.exitCode();
        result.output = process.readAllStandardOutput();
        result.errors = QString::fromUtf8(process.readAllStandardError());
        return result;
    }

private:
    static constexpr int kTimeout = 120000;
};
