// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "cli/RedirectedStream.h"

#include "KvCliOutput.h"
#include "KvTerminalProgress.h"

#include <cstdlib>

#include <fcntl.h>

namespace {

/** Both ends of a made-up terminal. */
class Terminal
{
public:
    Terminal()
        : m_screen(posix_openpt(O_RDWR | O_NOCTTY | O_NONBLOCK))
    {
        if (m_screen >= 0 && grantpt(m_screen) == 0 && unlockpt(m_screen) == 0)
            m_program = open(ptsname(m_screen), O_RDWR | O_NOCTTY);
    }
    ~Terminal()
    {
        close(m_program);
        close(m_screen);
    }
    int programEnd() const { return m_program; }

    /** What was written to it since the last call. */
    QByteArray taken() const
    {
        QByteArray bytes(4096, 0);
        const auto size = read(m_screen, bytes.data(), static_cast<std::size_t>(bytes.size()));
        return bytes.left(static_cast<int>(size > 0 ? size : 0));
    }

private:
    int m_screen;
    int m_program = -1;
};

} // namespace

class KvTerminalProgressTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void showsThePageOnATerminal();
    void isSilentWhenQuiet();
    void isSilentWithoutATerminal();
};

void KvTerminalProgressTest::showsThePageOnATerminal()
{
    const Terminal terminal;
    QVERIFY(terminal.programEnd() >= 0);
    const RedirectedStream redirected(STDERR_FILENO, terminal.programEnd());
    KvCliOutput output;
    QElapsedTimer timer;
    timer.start();
    KvTerminalProgress progress(output);
    QByteArray shown;
    const auto shows = [&]() {
        progress.pageWritten(3, 10);
        shown += terminal.taken();
        return !shown.isEmpty();
    };
    QTRY_VERIFY_WITH_TIMEOUT(shows(), 10000);
    // Short prints show nothing at all.
    QVERIFY2(timer.elapsed() >= 500, qPrintable(QString::number(timer.elapsed())));
    QCOMPARE(shown, QByteArray("\r\033[Kpage 3 of 10"));
    progress.finish();
    QCOMPARE(terminal.taken(), QByteArray("\r\033[K"));
    progress.finish();
    QCOMPARE(terminal.taken(), QByteArray());
}

void KvTerminalProgressTest::isSilentWhenQuiet()
{
    const Terminal terminal;
    QVERIFY(terminal.programEnd() >= 0);
    const RedirectedStream redirected(STDERR_FILENO, terminal.programEnd());
    KvCliOutput output;
    output.setQuiet(true);
    KvTerminalProgress progress(output);
    QElapsedTimer timer;
    timer.start();
    while (timer.elapsed() < 700)
        progress.pageWritten(3, 10);
    progress.finish();
    QCOMPARE(terminal.taken(), QByteArray());
}

void KvTerminalProgressTest::isSilentWithoutATerminal()
{
    QFile file(temporaryPath(QStringLiteral("errors")));
    QVERIFY(file.open(QIODevice::ReadWrite));
    {
        const RedirectedStream redirected(STDERR_FILENO, file.handle());
        QVERIFY(!KvCliOutput::isTerminal());
        KvCliOutput output;
        KvTerminalProgress progress(output);
        QElapsedTimer timer;
        timer.start();
        while (timer.elapsed() < 700)
            progress.pageWritten(3, 10);
        progress.finish();
    }
    QCOMPARE(file.size(), 0);
}

STATREPORT_TEST_MAIN(KvTerminalProgressTest)
#include "KvTerminalProgressTest.moc"
