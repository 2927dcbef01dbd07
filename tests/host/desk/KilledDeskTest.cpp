// SPDX-License-Identifier: MIT
#include "DeskFiles.h"
#include "KvDeskRecoveryFile.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtLoadedSession.h"

#include <QProcess>

namespace {

constexpr int timeoutMs = 60000;

/// The last number that the program printed after a word; 0 when there is none.
int lastCount(const QByteArray &output, const QByteArray &word)
{
    const int start = output.lastIndexOf(word + ' ');
    const int end = output.indexOf('\n', start);
    return start < 0 || end < 0 ? 0
                                : output.mid(start + word.size() + 1, end - start - word.size() - 1).toInt();
}

int objectsOf(const ZtSession &session)
{
    int count = session.objects.size();
    for (const ZtSessionTable &table : session.tables)
        count += table.rows.size();
    return count;
}

} // namespace

/** Programs that are killed without any warning, at any moment. */
class KilledDeskTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();

    void programLosesNothingThatIsOlder();
    void programOffersNothingAfterAnOrderlyEnd();
    void measuring();
    void saving_data();
    void saving();

private:
    static QProcessEnvironment environment(const QString &recoveryFolder);
    void start(QProcess *process, const QString &program, const QStringList &arguments);
    /** Reads on until the program has printed a word with a count of at least \a count. */
    bool waitFor(QProcess *process, const QByteArray &word, int count);
    QStringList copies() const
    {
        return QDir(m_folder).entryList({QStringLiteral("*.recovery")}, QDir::Files);
    }
    int copiedObjects() const;
    int savedObjects() const;

    QString m_folder;
    QString m_session;
    QByteArray m_output;
};

void KilledDeskTest::init()
{
    StatReportTest::init();
    const QString name =
        QString::fromLatin1(QTest::currentTestFunction()) + QString::fromLatin1(QTest::currentDataTag());
    m_folder = temporaryPath(name + QStringLiteral(" recovery"));
    m_session = DeskFiles::text(name + QStringLiteral(".json"),
                                "{\"format\": \"statreport-session\", \"version\": 1, \"objects\": []}");
    m_output.clear();
}

QProcessEnvironment KilledDeskTest::environment(const QString &recoveryFolder)
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("offscreen"));
    environment.insert(QStringLiteral("STATREPORT_SETTINGS"), temporaryPath(QStringLiteral("settings.ini")));
    environment.insert(QStringLiteral("STATREPORT_RECOVERY_DIR"), recoveryFolder);
    return environment;
}

void KilledDeskTest::start(QProcess *process, const QString &program, const QStringList &arguments)
{
    process->setProcessEnvironment(environment(m_folder));
    process->start(program, arguments);
    QVERIFY(process->waitForStarted(timeoutMs));
}

bool KilledDeskTest::waitFor(QProcess *process, const QByteArray &word, int count)
{
    QElapsedTimer clock;
    clock.start();
    while (lastCount(m_output, word) < count && clock.elapsed() < timeoutMs) {
        process->waitForReadyRead(100);
        m_output += process->readAllStandardOutput();
    }
    return lastCount(m_output, word) >= count;
}

int KilledDeskTest::copiedObjects() const
{
    ZtLoadedSession loaded;
    ZtFault fault;
    const bool isRead =
        copies().size() == 1 &&
        KvDeskRecoveryFile::read(QDir(m_folder).filePath(copies().first()), &loaded, &fault, nullptr);
    return isRead ? objectsOf(loaded.session) : -1;
}

int KilledDeskTest::savedObjects() const
{
    ZtSession session;
    ZtFault fault;
    return ZtSession::load(m_session, &session, &fault) ? objectsOf(session) : -1;
}

void KilledDeskTest::programLosesNothingThatIsOlder()
{
    const QByteArray before = DeskFiles::bytes(m_session);
    QProcess process;
    start(&process, QStringLiteral(MEASURING_DESK),
          {QStringLiteral("--session"), m_session, QStringLiteral("--table"), DeskFiles::table()});
    QTRY_COMPARE_WITH_TIMEOUT(copies().size(), 1, timeoutMs);
    QVERIFY(copies().first().startsWith(QString::number(process.processId()) + QLatin1Char('-')));
    process.kill();
    QVERIFY(process.waitForFinished(timeoutMs));
    QCOMPARE(process.exitStatus(), QProcess::CrashExit);
    QCOMPARE(copiedObjects(), 2);
    QCOMPARE(DeskFiles::bytes(m_session), before);
    KvDeskRecoveryFile header;
    QVERIFY(header.readHeader(QDir(m_folder).filePath(copies().first())));
    QCOMPARE(header.sessionPath, m_session);
}

void KilledDeskTest::programOffersNothingAfterAnOrderlyEnd()
{
    QProcess process;
    QProcessEnvironment closing = environment(m_folder);
    closing.insert(QStringLiteral("FAKE_PLUGIN_CLOSES"), QStringLiteral("1"));
    process.setProcessEnvironment(closing);
    process.start(QStringLiteral(MEASURING_DESK),
                  {QStringLiteral("--plugins"), QStringLiteral(FAKE_PLUGINS "/GoodPlugin"), m_session});
    QVERIFY(process.waitForFinished(timeoutMs));
    QCOMPARE(process.exitCode(), 0);
    QCOMPARE(QDir(m_folder).entryList(QDir::Files), QStringList());
}

void KilledDeskTest::measuring()
{
    const QByteArray before = DeskFiles::bytes(m_session);
    QProcess process;
    start(&process, QStringLiteral(STEADY_MEASURING), {m_session, m_folder, QStringLiteral("measure")});
    QVERIFY(waitFor(&process, "copied", 50));
    process.kill();
    QVERIFY(process.waitForFinished(timeoutMs));
    m_output += process.readAllStandardOutput();
    // Each copy has what was measured before it was begun, so at least what the one before it told.
    const int firstTold = m_output.indexOf("copied ");
    const int lastTold = m_output.lastIndexOf("copied ");
    const int atLeast = firstTold == lastTold ? 1 : lastCount(m_output.left(lastTold), "copied");
    QVERIFY(copiedObjects() >= atLeast);
    QVERIFY(copiedObjects() <= lastCount(m_output, "measured") + 1);
    QCOMPARE(DeskFiles::bytes(m_session), before);
}

void KilledDeskTest::saving_data()
{
    QTest::addColumn<int>("extraMs");
    for (const int extra : {0, 3, 7, 13, 29, 61})
        QTest::addRow("%d ms", extra) << extra;
}

void KilledDeskTest::saving()
{
    QFETCH(int, extraMs);
    QProcess process;
    start(&process, QStringLiteral(STEADY_MEASURING), {m_session, m_folder, QStringLiteral("save")});
    QVERIFY(waitFor(&process, "saved", 20));
    // Somewhere in the middle of the next ones.
    QTest::qWait(extraMs);
    process.kill();
    QVERIFY(process.waitForFinished(timeoutMs));
    m_output += process.readAllStandardOutput();
    QVERIFY2(savedObjects() >= lastCount(m_output, "saved"), qPrintable(QString::number(savedObjects())));
    QVERIFY(savedObjects() <= lastCount(m_output, "measured") + 1);
    QVERIFY(copies().size() <= 1);
    if (!copies().isEmpty())
        QVERIFY(copiedObjects() >= 0);
}

STATREPORT_TEST_MAIN(KilledDeskTest)
#include "KilledDeskTest.moc"
