// SPDX-License-Identifier: MIT
#include "KvDeskRecoveryFile.h"

#include "DeskFiles.h"
#include "measuring/ZtLoadedSession.h"

#include <QStandardPaths>

namespace {

ZtSession demo()
{
    ZtSession session;
    ZtFault fault;
    ZtSession::load(DeskFiles::demoSession(), &session, &fault);
    return session;
}

KvDeskRecoveryFile header()
{
    KvDeskRecoveryFile header;
    header.sessionPath = QString::fromUtf8("/folder/Schräge \"Namen\".json");
    header.sessionStamp = {123456789012, QDateTime::fromMSecsSinceEpoch(1700000000123, Qt::UTC)};
    header.time = QDateTime::fromMSecsSinceEpoch(1700000001234, Qt::UTC);
    header.objectCount = 33;
    return header;
}

} // namespace

class KvDeskRecoveryFileTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void folder();
    void keepsAll();
    void keepsASessionWithoutAFile();
    void refusesOtherFiles_data();
    void refusesOtherFiles();
    void refusesEveryBeginning();
    void refusesNewerSessions();
};

void KvDeskRecoveryFileTest::folder()
{
    qputenv("STATREPORT_RECOVERY_DIR", "/some/folder");
    QCOMPARE(KvDeskRecoveryFile::standardFolder(), QStringLiteral("/some/folder"));
    qunsetenv("STATREPORT_RECOVERY_DIR");
    QCOMPARE(KvDeskRecoveryFile::standardFolder(),
             QStandardPaths::writableLocation(QStandardPaths::AppLocalDataLocation) +
                 QStringLiteral("/Recovery"));
}

void KvDeskRecoveryFileTest::keepsAll()
{
    const QString file = temporaryPath(QStringLiteral("all.recovery"));
    ZtFault fault;
    QVERIFY2(header().write(file, demo(), &fault, nullptr), qPrintable(fault.text()));
    KvDeskRecoveryFile read;
    QVERIFY(read.readHeader(file));
    QCOMPARE(read.sessionPath, header().sessionPath);
    QVERIFY(read.sessionStamp == header().sessionStamp);
    QCOMPARE(read.time, header().time);
    QCOMPARE(read.objectCount, 33);
    ZtLoadedSession loaded;
    QVERIFY2(KvDeskRecoveryFile::read(file, &loaded, &fault, nullptr), qPrintable(fault.text()));
    // The image is found from another folder than the session's, too.
    QVERIFY(loaded.image);
    QCOMPARE(loaded.session.imagePath, demo().imagePath);
    QCOMPARE(loaded.session.toJson(DeskFiles::demoSession()), demo().toJson(DeskFiles::demoSession()));
}

void KvDeskRecoveryFileTest::keepsASessionWithoutAFile()
{
    const QString file = temporaryPath(QStringLiteral("none.recovery"));
    ZtFault fault;
    KvDeskRecoveryFile untitled;
    untitled.time = QDateTime::currentDateTimeUtc();
    QVERIFY(untitled.write(file, ZtSession(), &fault, nullptr));
    KvDeskRecoveryFile read = header();
    QVERIFY(read.readHeader(file));
    QCOMPARE(read.sessionPath, QString());
    QVERIFY(!read.sessionStamp.exists());
    QCOMPARE(read.objectCount, 0);
}

void KvDeskRecoveryFileTest::refusesOtherFiles_data()
{
    QTest::addColumn<QString>("file");
    QTest::newRow("none") << QStringLiteral("/none.recovery");
    QTest::newRow("empty") << DeskFiles::text(QStringLiteral("e.recovery"), "");
    QTest::newRow("rubbish") << DeskFiles::text(QStringLiteral("r.recovery"), QByteArray(100000, '\1'));
    QTest::newRow("session") << DeskFiles::demoSession();
    QTest::newRow("no time") << DeskFiles::text(QStringLiteral("t.recovery"),
                                                "{\"format\":\"statreport-recovery\",\"objects\":1}\n{}");
}

void KvDeskRecoveryFileTest::refusesOtherFiles()
{
    QFETCH(QString, file);
    KvDeskRecoveryFile read;
    QVERIFY(!read.readHeader(file));
}

void KvDeskRecoveryFileTest::refusesEveryBeginning()
{
    const QString whole = temporaryPath(QStringLiteral("whole.recovery"));
    ZtFault fault;
    QVERIFY(header().write(whole, demo(), &fault, nullptr));
    const QByteArray bytes = DeskFiles::bytes(whole);
    for (int size = 0; size < bytes.size() - 1; size += 97) {
        const QString file = DeskFiles::text(QStringLiteral("beginning.recovery"), bytes.left(size));
        ZtLoadedSession loaded;
        QVERIFY(!KvDeskRecoveryFile::read(file, &loaded, &fault, nullptr));
        QVERIFY(!fault.isNull());
    }
}

void KvDeskRecoveryFileTest::refusesNewerSessions()
{
    const QString file = DeskFiles::text(QStringLiteral("newer.recovery"),
                                         "{\"format\":\"statreport-recovery\"}\n"
                                         "{\"format\":\"statreport-session\",\"version\":1000}");
    ZtLoadedSession loaded;
    ZtFault fault;
    QVERIFY(!KvDeskRecoveryFile::read(file, &loaded, &fault, nullptr));
    QVERIFY2(fault.message.startsWith(QStringLiteral("The session is of the newer version 1000")),
             qPrintable(fault.text()));
}

STATREPORT_TEST_MAIN(KvDeskRecoveryFileTest)
#include "KvDeskRecoveryFileTest.moc"
