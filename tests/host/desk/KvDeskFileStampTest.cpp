// SPDX-License-Identifier: MIT
#include "KvDeskFileStamp.h"

#include "DeskFiles.h"

class KvDeskFileStampTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void noFileIsNoStamp();
    void differsByTimeAndSize();
};

void KvDeskFileStampTest::noFileIsNoStamp()
{
    QVERIFY(!KvDeskFileStamp().exists());
    QVERIFY(!KvDeskFileStamp::of(QString()).exists());
    QVERIFY(!KvDeskFileStamp::of(temporaryPath(QStringLiteral("none"))).exists());
    QVERIFY(!KvDeskFileStamp::of(QDir::tempPath()).exists());
    QVERIFY(KvDeskFileStamp::of(QString()) == KvDeskFileStamp());
}

void KvDeskFileStampTest::differsByTimeAndSize()
{
    const QString path = DeskFiles::text(QStringLiteral("stamped"), "abc");
    const KvDeskFileStamp stamp = KvDeskFileStamp::of(path);
    QVERIFY(stamp.exists());
    QCOMPARE(stamp.size, 3);
    QVERIFY(stamp == KvDeskFileStamp::of(path));
    QFile file(path);
    QVERIFY(file.open(QIODevice::ReadWrite));
    QVERIFY(file.setFileTime(QDateTime::currentDateTime().addSecs(-60), QFileDevice::FileModificationTime));
    QVERIFY(stamp != KvDeskFileStamp::of(path));
    file.close();
    const KvDeskFileStamp older = KvDeskFileStamp::of(path);
    DeskFiles::text(QStringLiteral("stamped"), "abcd");
    QVERIFY(older != KvDeskFileStamp::of(path));
}

STATREPORT_TEST_MAIN(KvDeskFileStampTest)
#include "KvDeskFileStampTest.moc"
