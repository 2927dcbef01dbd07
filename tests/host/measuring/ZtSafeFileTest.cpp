// SPDX-License-Identifier: MIT
#include "measuring/ZtSafeFile.h"

#include "measuring/ZtFault.h"
#include "measuring/ZtProgress.h"
#include "support/StatReportTest.h"
#include "support/UnprivilegedUser.h"

#include <QDir>

namespace {

QByteArray contents(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("(none)");
}

} // namespace

class ZtSafeFileTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void writesAndReplaces();
    void writesNothing();
    void cancelledKeepsTheOldFile();
    void faultKeepsTheOldFile();
    void keepsWriteProtectedFiles();
    void writesThroughLinks();
    void cannotBeCancelledAfterwards();

private:
    QString m_folder;
    QString m_path;
    ZtFault m_fault;
};

void ZtSafeFileTest::init()
{
    StatReportTest::init();
    m_folder = temporaryPath(QString::fromLatin1(QTest::currentTestFunction()));
    QDir().mkpath(m_folder);
    m_path = m_folder + QStringLiteral("/file");
    m_fault = ZtFault();
}

void ZtSafeFileTest::writesAndReplaces()
{
    QVERIFY(ZtSafeFile::write(m_path, "one", &m_fault));
    QCOMPARE(contents(m_path), QByteArray("one"));
    QVERIFY(m_fault.isNull());
    const QByteArray large(3 * 1024 * 1024 + 5, 'x');
    QVERIFY(ZtSafeFile::write(m_path, large, &m_fault));
    QCOMPARE(contents(m_path), large);
    QCOMPARE(QDir(m_folder).entryList(QDir::Files), QStringList(QStringLiteral("file")));
}

void ZtSafeFileTest::writesNothing()
{
    QVERIFY(ZtSafeFile::write(m_path, QByteArray(), &m_fault));
    QCOMPARE(contents(m_path), QByteArray());
}

void ZtSafeFileTest::cancelledKeepsTheOldFile()
{
    QVERIFY(ZtSafeFile::write(m_path, "old", &m_fault));
    ZtProgress progress;
    progress.cancel();
    QVERIFY(!ZtSafeFile::write(m_path, "new", &m_fault, &progress));
    QCOMPARE(m_fault.text(), m_path + QStringLiteral(": Writing was cancelled"));
    QCOMPARE(contents(m_path), QByteArray("old"));
    QCOMPARE(QDir(m_folder).entryList(QDir::Files), QStringList(QStringLiteral("file")));
}

void ZtSafeFileTest::faultKeepsTheOldFile()
{
    const QString path = m_folder + QStringLiteral("/none/file");
    QVERIFY(!ZtSafeFile::write(path, "new", &m_fault));
    QCOMPARE(m_fault.message, QStringLiteral("The file cannot be written (No such file or directory)"));
    QCOMPARE(m_fault.file, path);
}

void ZtSafeFileTest::keepsWriteProtectedFiles()
{
    QVERIFY(ZtSafeFile::write(m_path, "old", &m_fault));
    QFile::setPermissions(m_path, QFile::ReadOwner | QFile::ReadGroup | QFile::ReadOther);
    // The folder alone would allow it.
    QFile::setPermissions(m_folder, QFile::Permissions(0x7777));
    const UnprivilegedUser user;
    QVERIFY2(user.isUnprivileged(), "needs a user whom permissions stop");
    QVERIFY(!ZtSafeFile::write(m_path, "new", &m_fault));
    QCOMPARE(m_fault.message, QStringLiteral("The file is write-protected"));
    QCOMPARE(contents(m_path), QByteArray("old"));
}

void ZtSafeFileTest::writesThroughLinks()
{
    QVERIFY(ZtSafeFile::write(m_path, "old", &m_fault));
    const QString link = m_folder + QStringLiteral("/link");
    QVERIFY(QFile::link(m_path, link));
    QVERIFY(ZtSafeFile::write(link, "new", &m_fault));
    QCOMPARE(contents(m_path), QByteArray("new"));
    QVERIFY(QFileInfo(link).isSymLink());
}

void ZtSafeFileTest::cannotBeCancelledAfterwards()
{
    ZtProgress progress;
    QVERIFY(ZtSafeFile::write(m_path, "new", &m_fault, &progress));
    QVERIFY(!progress.cancel());
    QCOMPARE(progress.fraction(), 1.0);
}

STATREPORT_TEST_MAIN(ZtSafeFileTest)
#include "ZtSafeFileTest.moc"
