// SPDX-License-Identifier: MIT
#pragma once

#include <QCoreApplication>
#include <QString>

struct ZtFault;

/** Where the tool writes: results to standard output, errors and notes to standard error, a line each. */
class KvCliOutput
{
    Q_DECLARE_TR_FUNCTIONS(KvCliOutput)

public:
    void setJsonErrors(bool json) { m_jsonErrors = json; }
    void setQuiet(bool quiet) { m_quiet = quiet; }
    bool isQuiet() const { return m_quiet; }

    /** False, with an error, when standard output does not take all of it. */
    bool result(const QString &text) const;
    bool result(const QByteArray &bytes) const;

    /** Something worth knowing that does not stop the work. */
    void note(const QString &text) const;
    void error(const QString &text) const;
    void error(const ZtFault &fault) const;

    /** What to call standard output in messages. */
    static QString standardOutputName();

    /** Whether standard error is a terminal, so that progress may be shown on it. */
    static bool isTerminal();
    /** Replaces the progress line; an empty text removes it. */
    static void progress(const QString &text);

private:
    bool m_jsonErrors = false;
    bool m_quiet = false;
};
