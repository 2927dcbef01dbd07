// SPDX-License-Identifier: MIT
#pragma once

#include <QProcess>

/** A program that ran to its end. */
struct FinishedProcess
{
    int exitCode = -1; ///< -1 when it could not be started, crashed, or took more than two minutes
    QString output;    ///< of both channels

    static FinishedProcess
    run(const QString &program, const QStringList &arguments,
        const QProcessEnvironment &environment = QProcessEnvironment::systemEnvironment())
    {
        QProcess process;
        process.setProcessChannelMode(QProcess::MergedChannels);
        process.setProcessEnvironment(environment);
        process.start(program, arguments);
        FinishedProcess result;
        if (process.waitForFinished(120000) && process.exitStatus() == QProcess::NormalExit)
            result.exitCode = process.exitCode();
        result.output = QString::fromUtf8(process.readAll());
        if (process.error() == QProcess::FailedToStart)
            result.output = program + QStringLiteral(" could not be started");
        return result;
    }
};
