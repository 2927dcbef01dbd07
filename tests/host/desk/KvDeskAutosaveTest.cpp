// SPDX-License-Identifier: MIT
#include "KvDeskAutosave.h"

#include "DeskFiles.h"
#include "DeskLog.h"
#include "KvDeskRecoveryFile.h"
#include "KvDeskSession.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtLoadedSession.h"
#include "measuring/ZtMeasuringDocument.h"

namespace {

const QPolygonF diagonal = polygon({QPointF(0, 0), QPointF(10, 10)});
constexpr int quickDelayMs = 20;
constexpr int timeoutMs = 60000; // disks may be slow

} // namespace

class KvDeskAutosaveTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void cleanup();

    void standardDelay();
    void copiesAfterAChange();
    void opensNothingToLose();
    void copiesWhatWasChangedBefore();
    void steadyChangesDoNotPutItOff();
    void laterChangesAreCopied();
    void tablesAreCopiedAsTheyAre();
    void copyGoes_data();
    void copyGoes();
    void copyDoesNotComeBack();
    void staysWhenItEndsOtherwise();
    void nothingStaysOfASavedSession();
    void ownerHoldsTheLock();
    void folderIsPrivate();
    void faultIsToldOnce();

private:
    void measure() { m_document->addObject(ZtDrawnType::Line, diagonal); }
    void startAutosave(const QString &folder);
    int copiedObjects() const;
    QStringList files() const { return QDir(m_folder).entryList(QDir::Files); }

    QString m_folder;
    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskSession> m_session;
    std::unique_ptr<KvDeskAutosave> m_autosave;
    ZtFault m_fault;
};

void KvDeskAutosaveTest::init()
{
    StatReportTest::init();
    ZtStatusLog::getInstance()->clear();
    m_folder = temporaryPath(QString::fromLatin1(QTest::currentTestFunction()) +
                             QString::fromLatin1(QTest::currentDataTag()));
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_session = std::make_unique<KvDeskSession>(m_document.get());
    startAutosave(m_folder);
}

void KvDeskAutosaveTest::startAutosave(const QString &folder)
{
    m_autosave = std::make_unique<KvDeskAutosave>(m_session.get(), folder);
    m_autosave->setDelay(quickDelayMs);
}

void KvDeskAutosaveTest::cleanup()
{
    m_autosave.reset();
    m_session.reset();
    m_document.reset();
    StatReportTest::cleanup();
}

int KvDeskAutosaveTest::copiedObjects() const
{
    ZtLoadedSession loaded;
    ZtFault fault;
    const bool isRead = KvDeskRecoveryFile::read(m_autosave->file(), &loaded, &fault, nullptr);
    return isRead ? loaded.session.objects.size() : -1;
}

void KvDeskAutosaveTest::standardDelay()
{
    QCOMPARE(KvDeskAutosave::standardDelayMs, 3000);
    m_autosave->setDelay(KvDeskAutosave::standardDelayMs);
    measure();
    QTest::qWait(200);
    QVERIFY(!QFileInfo::exists(m_folder));
}

void KvDeskAutosaveTest::copiesAfterAChange()
{
    const QString path = temporaryPath(QStringLiteral("copied.json"));
    QVERIFY(m_session->save(path, &m_fault));
    QSignalSpy spy(m_autosave.get(), SIGNAL(signalWritten()));
    measure();
    QTRY_COMPARE_WITH_TIMEOUT(spy.count(), 1, timeoutMs);
    QCOMPARE(copiedObjects(), 1);
    KvDeskRecoveryFile header;
    QVERIFY(header.readHeader(m_autosave->file()));
    QCOMPARE(header.sessionPath, path);
    QVERIFY(header.sessionStamp == KvDeskFileStamp::of(path));
    QCOMPARE(header.objectCount, 1);
    QVERIFY(qAbs(header.time.secsTo(QDateTime::currentDateTimeUtc())) < 60);
    QVERIFY(QFileInfo(m_autosave->file())
                .fileName()
                .startsWith(QString::number(qApp->applicationPid()) + QLatin1Char('-')));
    QVERIFY(m_session->isModified());
}

void KvDeskAutosaveTest::opensNothingToLose()
{
    QVERIFY(m_session->open(DeskFiles::demoSession(), false, &m_fault));
    QTest::qWait(10 * quickDelayMs);
    QVERIFY(!QFileInfo::exists(m_folder));
}

void KvDeskAutosaveTest::copiesWhatWasChangedBefore()
{
    m_autosave.reset();
    measure();
    startAutosave(m_folder);
    QTRY_COMPARE_WITH_TIMEOUT(copiedObjects(), 1, timeoutMs);
}

void KvDeskAutosaveTest::steadyChangesDoNotPutItOff()
{
    QSignalSpy spy(m_autosave.get(), SIGNAL(signalWritten()));
    QTimer timer;
    connect(&timer, &QTimer::timeout, this, [this]() { measure(); });
    timer.start(quickDelayMs / 4);
    QTRY_VERIFY_WITH_TIMEOUT(spy.count() >= 3, timeoutMs);
    timer.stop();
    QTRY_COMPARE_WITH_TIMEOUT(copiedObjects(), m_session->objectCount(), timeoutMs);
}

void KvDeskAutosaveTest::laterChangesAreCopied()
{
    measure();
    QTRY_COMPARE_WITH_TIMEOUT(copiedObjects(), 1, timeoutMs);
    measure();
    QTRY_COMPARE_WITH_TIMEOUT(copiedObjects(), 2, timeoutMs);
    ZtKernelData::getInstance()->removeObject(ZtDrawnType::Line, 1);
    QTRY_COMPARE_WITH_TIMEOUT(copiedObjects(), 1, timeoutMs);
}

void KvDeskAutosaveTest::tablesAreCopiedAsTheyAre()
{
    const auto copied = [this]() {
        ZtLoadedSession loaded;
        ZtFault fault;
        KvDeskRecoveryFile::read(m_autosave->file(), &loaded, &fault, nullptr);
        QStringList rows;
        for (const ZtSessionTable &table : qAsConst(loaded.session.tables)) {
            for (const ZtSessionRow &row : table.rows)
                rows.append(row.name);
        }
        return rows.join(QLatin1Char(','));
    };
    QStringList notes;
    QVERIFY(m_session->importTable(DeskFiles::table(), &m_fault, &notes));
    QTRY_COMPARE_WITH_TIMEOUT(copied(), QStringLiteral("Bolt A,Bolt B"), timeoutMs);
    const int type = m_document->importedTypes().first();
    ZtKernelData::getInstance()->getGsManipulator(type)->setObjectName(2, QStringLiteral("Nut"));
    ZtKernelData::getInstance()->notifyObjectChanged(type, 2);
    QTRY_COMPARE_WITH_TIMEOUT(copied(), QStringLiteral("Bolt A,Nut"), timeoutMs);
    ZtKernelData::getInstance()->removeObject(type, 1);
    QTRY_COMPARE_WITH_TIMEOUT(copied(), QStringLiteral("Nut"), timeoutMs);
    QVERIFY(m_session->importTable(DeskFiles::table(), &m_fault, &notes));
    QTRY_COMPARE_WITH_TIMEOUT(copied(), QStringLiteral("Nut,Bolt A,Bolt B"), timeoutMs);
    // The types of another session may have the same numbers.
    m_session->clear();
    const QString other = DeskFiles::text(QStringLiteral("other.csv"), "Object,Mass [g]\nWasher,1\n");
    QVERIFY(m_session->importTable(other, &m_fault, &notes));
    QTRY_COMPARE_WITH_TIMEOUT(copied(), QStringLiteral("Washer"), timeoutMs);
}

void KvDeskAutosaveTest::copyGoes_data()
{
    QTest::addColumn<int>("way");
    QTest::newRow("saved") << 0;
    QTest::newRow("new session") << 1;
    QTest::newRow("another session") << 2;
    QTest::newRow("all undone") << 3;
    QTest::newRow("end") << 4;
}

void KvDeskAutosaveTest::copyGoes()
{
    QFETCH(int, way);
    measure();
    QTRY_COMPARE_WITH_TIMEOUT(copiedObjects(), 1, timeoutMs);
    if (way == 0)
        QVERIFY(m_session->save(temporaryPath(QStringLiteral("gone.json")), &m_fault));
    else if (way == 1)
        m_session->clear();
    else if (way == 2)
        QVERIFY(m_session->open(DeskFiles::demoSession(), false, &m_fault));
    else if (way == 3)
        m_session->setUnmodified();
    else
        m_autosave->end();
    QCOMPARE(files(), QStringList());
    QTest::qWait(10 * quickDelayMs);
    QCOMPARE(files(), QStringList());
}

void KvDeskAutosaveTest::copyDoesNotComeBack()
{
    for (int i = 0; i < 20; ++i) {
        measure();
        QVERIFY(QMetaObject::invokeMethod(m_autosave.get(), "slotWrite"));
        QVERIFY(m_autosave->isWriting());
        m_session->setUnmodified();
        QCOMPARE(QFileInfo::exists(m_autosave->file()), false);
    }
    QTRY_COMPARE_WITH_TIMEOUT(files(), QStringList(), timeoutMs);
    QTest::qWait(5 * quickDelayMs);
    QCOMPARE(files(), QStringList());
}

void KvDeskAutosaveTest::staysWhenItEndsOtherwise()
{
    measure();
    QTRY_COMPARE_WITH_TIMEOUT(copiedObjects(), 1, timeoutMs);
    // Not copied yet.
    measure();
    const QString file = m_autosave->file();
    m_autosave.reset();
    ZtLoadedSession loaded;
    QVERIFY2(KvDeskRecoveryFile::read(file, &loaded, &m_fault, nullptr), qPrintable(m_fault.text()));
    QCOMPARE(loaded.session.objects.size(), 2);
    QCOMPARE(files(), QStringList(QFileInfo(file).fileName()));
}

void KvDeskAutosaveTest::nothingStaysOfASavedSession()
{
    measure();
    QTRY_COMPARE_WITH_TIMEOUT(copiedObjects(), 1, timeoutMs);
    QVERIFY(m_session->save(temporaryPath(QStringLiteral("kept.json")), &m_fault));
    m_autosave.reset();
    QCOMPARE(files(), QStringList());
}

void KvDeskAutosaveTest::ownerHoldsTheLock()
{
    measure();
    QTRY_COMPARE_WITH_TIMEOUT(copiedObjects(), 1, timeoutMs);
    QLockFile lock(m_autosave->file() + QStringLiteral(".lock"));
    lock.setStaleLockTime(0);
    QVERIFY(!lock.tryLock(0));
    qint64 owner = 0;
    QString host;
    QString program;
    QVERIFY(lock.getLockInfo(&owner, &host, &program));
    QCOMPARE(owner, qApp->applicationPid());
}

void KvDeskAutosaveTest::folderIsPrivate()
{
    measure();
    QTRY_COMPARE_WITH_TIMEOUT(copiedObjects(), 1, timeoutMs);
    const QFile::Permissions others = QFile::ReadGroup | QFile::WriteGroup | QFile::ExeGroup |
                                      QFile::ReadOther | QFile::WriteOther | QFile::ExeOther;
    QVERIFY((QFile::permissions(m_folder) & others) == 0);
}

void KvDeskAutosaveTest::faultIsToldOnce()
{
    DeskFiles::text(QStringLiteral("no folder"), "");
    startAutosave(temporaryPath(QStringLiteral("no folder")));
    measure();
    QTRY_COMPARE_WITH_TIMEOUT(DeskLog::messages(ZtAppStatus::Warning).size(), 1, timeoutMs);
    QVERIFY(DeskLog::messages(ZtAppStatus::Warning)
                .first()
                .startsWith(QStringLiteral("Unsaved changes are not being copied: the folder \"")));
    measure();
    QTest::qWait(5 * quickDelayMs);
    QCOMPARE(DeskLog::messages(ZtAppStatus::Warning).size(), 1);
    QCOMPARE(m_session->objectCount(), 2);
}

STATREPORT_TEST_MAIN(KvDeskAutosaveTest)
#include "KvDeskAutosaveTest.moc"
