// SPDX-License-Identifier: MIT
#include "KvDeskRecovery.h"

#include "DeskLog.h"
#include "KvDeskAutosave.h"
#include "KvDeskFileCommands.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskSelection.h"
#include "KvDeskSession.h"
#include "RecoveryCopies.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtMeasuringDocument.h"
#include "support/MessageBoxAnswerer.h"

#include <QUndoStack>

class KvDeskRecoveryTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void cleanup();

    void findsNothing();
    void findsTheNewestFirst();
    void copiesOfRunningProgramsAreTheirs();
    void eachCopyIsOfferedOnce();
    void copyOfADeadProgramIsFound();
    void leftoversAreClearedAway();
    void otherFilesStay();
    void restores();
    void restoredCopyGoes_data();
    void restoredCopyGoes();
    void restoredCopyStaysWithoutADecision();
    void undoingIsNotSaving();
    void restoringAsksForTheSessionThatIsOpen();
    void secondRestoredCopyTakesThePlaceOfTheFirst();
    void fileThatWasWrittenSinceIsAskedFor();
    void missingImageIsNoFault();
    void damagedCopyStays();
    void discards();

private:
    QStringList files() const { return QDir(m_folder).entryList(QDir::Files); }
    QString path(const char *name) const { return m_folder + QLatin1Char('/') + QLatin1String(name); }
    void write(const char *name, const QByteArray &bytes) const
    {
        DeskFiles::text(QFileInfo(m_folder).fileName() + QLatin1Char('/') + QLatin1String(name), bytes);
    }
    void find() { m_recovery->find(m_folder); }

    QString m_folder;
    QWidget m_window;
    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskSession> m_session;
    std::unique_ptr<KvDeskFileCommands> m_files;
    std::unique_ptr<KvDeskRecovery> m_recovery;
};

void KvDeskRecoveryTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtStatusLog::getInstance()->clear();
    m_folder = temporaryPath(QString::fromLatin1(QTest::currentTestFunction()) +
                             QString::fromLatin1(QTest::currentDataTag()));
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_session = std::make_unique<KvDeskSession>(m_document.get());
    m_files = std::make_unique<KvDeskFileCommands>(m_session.get(), &m_window);
    m_recovery = std::make_unique<KvDeskRecovery>(m_session.get(), m_files.get());
}

void KvDeskRecoveryTest::cleanup()
{
    m_recovery.reset();
    m_files.reset();
    m_session.reset();
    m_document.reset();
    StatReportTest::cleanup();
}

void KvDeskRecoveryTest::findsNothing()
{
    QSignalSpy spy(m_recovery.get(), SIGNAL(signalChanged()));
    find();
    QCOMPARE(m_recovery->count(), 0);
    QCOMPARE(spy.count(), 1);
    QVERIFY(!QFileInfo::exists(m_folder));
}

void KvDeskRecoveryTest::findsTheNewestFirst()
{
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 1, 10);
    RecoveryCopies::add(m_folder, QStringLiteral("b"), 2, 1, QStringLiteral("/x/coins.json"));
    RecoveryCopies::add(m_folder, QStringLiteral("c"), 3, 5);
    find();
    QCOMPARE(m_recovery->count(), 3);
    QCOMPARE(m_recovery->describe(0), QStringLiteral("coins.json (2 object(s))"));
    QCOMPARE(m_recovery->describe(1), QStringLiteral("Untitled session (3 object(s))"));
    QCOMPARE(m_recovery->describe(2), QStringLiteral("Untitled session (1 object(s))"));
}

void KvDeskRecoveryTest::copiesOfRunningProgramsAreTheirs()
{
    KvDeskAutosave autosave(m_session.get(), m_folder);
    autosave.setDelay(10);
    m_document->addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(1, 1)}));
    QTRY_VERIFY(QFileInfo::exists(autosave.file()));
    find();
    QCOMPARE(m_recovery->count(), 0);
    QVERIFY(QFileInfo::exists(autosave.file()));
    autosave.end();
}

void KvDeskRecoveryTest::eachCopyIsOfferedOnce()
{
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 1, 1);
    find();
    {
        KvDeskRecovery another(m_session.get(), m_files.get());
        another.find(m_folder);
        QCOMPARE(another.count(), 0);
    }
    // Who ends without a decision leaves it to the next.
    m_recovery = std::make_unique<KvDeskRecovery>(m_session.get(), m_files.get());
    find();
    QCOMPARE(m_recovery->count(), 1);
}

void KvDeskRecoveryTest::copyOfADeadProgramIsFound()
{
    const QString file = RecoveryCopies::add(m_folder, QStringLiteral("a"), 1, 1);
    // A process that is gone for certain.
    QProcess process;
    process.start(QStringLiteral("true"), QStringList());
    QVERIFY(process.waitForStarted());
    const qint64 id = process.processId();
    QVERIFY(process.waitForFinished());
    QFile lock(file + QStringLiteral(".lock"));
    QVERIFY(lock.open(QIODevice::WriteOnly));
    lock.write(QByteArray::number(id) + "\nmeasuringdesk\n" + QSysInfo::machineHostName().toLocal8Bit() +
               '\n');
    lock.close();
    find();
    QCOMPARE(m_recovery->count(), 1);
}

void KvDeskRecoveryTest::leftoversAreClearedAway()
{
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 1, 1);
    write("a.recovery.AbCdEf", "beginning of a copy");
    write("gone.recovery.AbCdEf", "beginning of a copy");
    find();
    QCOMPARE(m_recovery->count(), 1);
    QCOMPARE(files(), QStringList({QStringLiteral("a.recovery"), QStringLiteral("a.recovery.lock")}));
}

void KvDeskRecoveryTest::otherFilesStay()
{
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 1, 1);
    write("notes.txt", "mine");
    write("rubbish.recovery", "rubbish");
    find();
    QCOMPARE(m_recovery->count(), 1);
    QVERIFY(files().contains(QStringLiteral("notes.txt")));
    QVERIFY(files().contains(QStringLiteral("rubbish.recovery")));
}

void KvDeskRecoveryTest::restores()
{
    const QString session = DeskFiles::text(QStringLiteral("restored.json"), "{}");
    const QString file = RecoveryCopies::add(m_folder, QStringLiteral("a"), 2, 1, session);
    find();
    QVERIFY(m_recovery->restore(0));
    QCOMPARE(m_recovery->count(), 0);
    QCOMPARE(m_session->objectCount(), 2);
    QCOMPARE(m_session->path(), session);
    QVERIFY(m_session->isModified());
    QVERIFY(!m_session->isChangedOnDisk());
    QVERIFY(QFileInfo::exists(file));
    QCOMPARE(DeskFiles::bytes(session), QByteArray("{}"));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information),
             QStringList(QStringLiteral("Measurements restored: restored.json (2 object(s))")));
}

void KvDeskRecoveryTest::restoredCopyGoes_data()
{
    QTest::addColumn<int>("way");
    QTest::newRow("saved") << 0;
    QTest::newRow("new session") << 1;
    QTest::newRow("another session") << 2;
    QTest::newRow("end") << 3;
}

void KvDeskRecoveryTest::restoredCopyGoes()
{
    QFETCH(int, way);
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 2, 1);
    find();
    QVERIFY(m_recovery->restore(0));
    ZtFault fault;
    const MessageBoxAnswerer answerer(QMessageBox::Discard);
    if (way == 0)
        QVERIFY(m_session->save(temporaryPath(QStringLiteral("a.json")), &fault));
    else if (way == 1)
        m_files->slotNewSession();
    else if (way == 2)
        QVERIFY(m_files->openSession(DeskFiles::demoSession()));
    else
        m_recovery->end();
    QCOMPARE(files(), QStringList());
}

void KvDeskRecoveryTest::restoredCopyStaysWithoutADecision()
{
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 2, 1);
    find();
    QVERIFY(m_recovery->restore(0));
    m_document->addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(1, 1)}));
    m_recovery = std::make_unique<KvDeskRecovery>(m_session.get(), m_files.get());
    find();
    QCOMPARE(m_recovery->count(), 1);
}

void KvDeskRecoveryTest::undoingIsNotSaving()
{
    KvDeskSelection selection;
    KvDeskObjectEditor editor(m_session.get(), &selection);
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 2, 1);
    find();
    QVERIFY(m_recovery->restore(0));
    editor.create(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(1, 1)}));
    editor.slotUndo();
    QCOMPARE(m_session->objectCount(), 2);
    QVERIFY(m_session->isModified());
    QVERIFY(files().contains(QStringLiteral("a.recovery")));
}

void KvDeskRecoveryTest::restoringAsksForTheSessionThatIsOpen()
{
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 2, 1);
    find();
    for (int i = 0; i < 3; ++i)
        m_document->addObject(ZtDrawnType::Line, polygon({QPointF(0, 0), QPointF(1, 1)}));
    const MessageBoxAnswerer answerer(QMessageBox::Cancel);
    QVERIFY(!m_recovery->restore(0));
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(m_session->objectCount(), 3);
    QCOMPARE(m_recovery->count(), 1);
}

void KvDeskRecoveryTest::secondRestoredCopyTakesThePlaceOfTheFirst()
{
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 1, 1);
    RecoveryCopies::add(m_folder, QStringLiteral("b"), 2, 2);
    find();
    const MessageBoxAnswerer answerer(QMessageBox::Discard);
    QVERIFY(m_recovery->restore(0));
    QCOMPARE(answerer.boxes().size(), 0);
    QVERIFY(m_recovery->restore(0));
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(m_session->objectCount(), 2);
    QVERIFY(m_session->isModified());
    QCOMPARE(files(), QStringList({QStringLiteral("b.recovery"), QStringLiteral("b.recovery.lock")}));
}

void KvDeskRecoveryTest::fileThatWasWrittenSinceIsAskedFor()
{
    const QString session = DeskFiles::text(QStringLiteral("since.json"), "{}");
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 2, 1, session);
    DeskFiles::text(QStringLiteral("since.json"), "{\"by\": \"another program\"}");
    find();
    QVERIFY(m_recovery->restore(0));
    QVERIFY(m_session->isChangedOnDisk());
}

void KvDeskRecoveryTest::missingImageIsNoFault()
{
    ZtSession session;
    session.imagePath = QStringLiteral("/none/gone.png");
    KvDeskRecoveryFile header;
    header.time = QDateTime::currentDateTimeUtc();
    QDir().mkpath(m_folder);
    ZtFault fault;
    QVERIFY(header.write(path("a.recovery"), session, &fault, nullptr));
    find();
    const MessageBoxAnswerer answerer;
    QVERIFY(m_recovery->restore(0));
    QCOMPARE(answerer.boxes().size(), 0);
    QCOMPARE(m_document->imagePath(), QStringLiteral("/none/gone.png"));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Warning),
             QStringList(QStringLiteral("/none/gone.png: The picture does not exist")));
}

void KvDeskRecoveryTest::damagedCopyStays()
{
    const QString file = RecoveryCopies::add(m_folder, QStringLiteral("a"), 2, 1);
    const QByteArray bytes = DeskFiles::bytes(file);
    QFile damaged(file);
    QVERIFY(damaged.open(QIODevice::ReadWrite));
    QVERIFY(damaged.resize(bytes.size() - 10));
    damaged.close();
    find();
    const MessageBoxAnswerer answerer;
    QVERIFY(!m_recovery->restore(0));
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(answerer.boxes().first().text, QStringLiteral("The measurements were not restored."));
    QCOMPARE(m_recovery->count(), 1);
    QVERIFY(QFileInfo::exists(file));
    QVERIFY(!m_session->isModified());
}

void KvDeskRecoveryTest::discards()
{
    RecoveryCopies::add(m_folder, QStringLiteral("a"), 2, 1);
    RecoveryCopies::add(m_folder, QStringLiteral("b"), 3, 2);
    find();
    QSignalSpy spy(m_recovery.get(), SIGNAL(signalChanged()));
    m_recovery->discard(0);
    QCOMPARE(spy.count(), 1);
    QCOMPARE(m_recovery->count(), 1);
    QCOMPARE(m_recovery->at(0).objectCount, 3);
    QCOMPARE(files(), QStringList({QStringLiteral("b.recovery"), QStringLiteral("b.recovery.lock")}));
}

STATREPORT_TEST_MAIN(KvDeskRecoveryTest)
#include "KvDeskRecoveryTest.moc"
