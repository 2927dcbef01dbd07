// SPDX-License-Identifier: MIT
#include "measuring/ZtFileFault.h"

#include "support/StatReportTest.h"
#include "support/UnprivilegedUser.h"

#include <QDir>
#include <QSaveFile>
#include <QTranslator>

#include <cerrno>

namespace {

/** A language in which the texts of files stand in angle brackets. */
class BracketsTranslator : public QTranslator
{
public:
    bool isEmpty() const override { return false; }
    QString translate(const char *context, const char *sourceText, const char *disambiguation,
                      int n) const override
    {
        Q_UNUSED(disambiguation)
        Q_UNUSED(n)
        const bool isOwn = QLatin1String(context) == QLatin1String("ZtFileFault");
        return isOwn ? QLatin1Char('<') + QLatin1String(sourceText) + QLatin1Char('>') : QString();
    }
};

} // namespace

class ZtFileFaultTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void cleanup();
    void namesTheCause_data();
    void namesTheCause();
    void namesWhatIsForbidden();
    void namesAFullDisk();
    void namesABrokenDevice();
    void namesWhatASafeWriteRanInto();
    void otherCausesReadAsTheSystemHasThem();
    void numbers_data();
    void numbers();

private:
    QString m_folder;
    BracketsTranslator m_language;
};

void ZtFileFaultTest::init()
{
    StatReportTest::init();
    m_folder = temporaryPath(QStringLiteral("faults"));
    QVERIFY(QDir().mkpath(m_folder));
    QFile file(m_folder + QStringLiteral("/file"));
    QVERIFY(file.open(QIODevice::WriteOnly));
    QCoreApplication::installTranslator(&m_language);
}

void ZtFileFaultTest::cleanup()
{
    QCoreApplication::removeTranslator(&m_language);
    StatReportTest::cleanup();
}

void ZtFileFaultTest::namesTheCause_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("mode");
    QTest::addColumn<QString>("text");
    const auto row = [](const QString &name, int mode, const char *text) {
        QTest::newRow(text) << name << mode << QString::fromLatin1(text);
    };
    row(QStringLiteral("none"), QIODevice::ReadOnly, "<No such file or directory>");
    row(QStringLiteral("."), QIODevice::ReadOnly, "<Is a directory>");
    row(QStringLiteral("file/x"), QIODevice::WriteOnly, "<Not a directory>");
    row(QString(300, QLatin1Char('x')), QIODevice::WriteOnly, "<File name too long>");
}

void ZtFileFaultTest::namesTheCause()
{
    QFETCH(QString, name);
    QFETCH(int, mode);
    QFile file(m_folder + QLatin1Char('/') + name);
    QVERIFY(!file.open(QIODevice::OpenMode(mode)));
    QTEST(ZtFileFault::text(file), "text");
}

void ZtFileFaultTest::namesWhatIsForbidden()
{
    QFile file(m_folder + QStringLiteral("/file"));
    QVERIFY(file.setPermissions(QFileDevice::Permissions()));
    const UnprivilegedUser user;
    QVERIFY2(user.isUnprivileged(), "needs a user whom permissions stop");
    QVERIFY(!file.open(QIODevice::ReadOnly));
    QCOMPARE(ZtFileFault::text(file), QStringLiteral("<Permission denied>"));
}

void ZtFileFaultTest::namesAFullDisk()
{
    QFile file(QStringLiteral("/dev/full"));
    QVERIFY(file.open(QIODevice::WriteOnly | QIODevice::Unbuffered));
    QCOMPARE(file.write("x"), -1);
    QCOMPARE(ZtFileFault::text(file), QStringLiteral("<No space left on device>"));
}

void ZtFileFaultTest::namesABrokenDevice()
{
    // Nothing is mapped at the address 0.
    QFile file(QStringLiteral("/proc/self/mem"));
    QVERIFY(file.open(QIODevice::ReadOnly | QIODevice::Unbuffered));
    char byte = 0;
    QVERIFY(file.read(&byte, 1) <= 0);
    QCOMPARE(ZtFileFault::text(file), QStringLiteral("<Input/output error>"));
}

void ZtFileFaultTest::namesWhatASafeWriteRanInto()
{
    QSaveFile folder(m_folder);
    QVERIFY(!folder.open(QIODevice::WriteOnly));
    QCOMPARE(ZtFileFault::text(folder), QStringLiteral("<Is a directory>"));
    QSaveFile nowhere(m_folder + QStringLiteral("/none/x"));
    QVERIFY(!nowhere.open(QIODevice::WriteOnly));
    QCOMPARE(ZtFileFault::text(nowhere), QStringLiteral("<No such file or directory>"));
}

void ZtFileFaultTest::otherCausesReadAsTheSystemHasThem()
{
    const QString path = m_folder + QStringLiteral("/loop");
    QVERIFY(QFile::link(path, path));
    QFile file(path);
    QVERIFY(!file.open(QIODevice::ReadOnly));
    QCOMPARE(ZtFileFault::text(file), qt_error_string(ELOOP));
    QVERIFY(!ZtFileFault::text(file).contains(QLatin1Char('<')));
}

void ZtFileFaultTest::numbers_data()
{
    QTest::addColumn<int>("number");
    QTest::addColumn<QString>("text");
    QTest::newRow("known") << ENOSPC << "<No space left on device>";
    QTest::newRow("read-only") << EROFS << "<Read-only file system>";
    QTest::newRow("rare") << ELOOP << qt_error_string(ELOOP);
}

void ZtFileFaultTest::numbers()
{
    QFETCH(int, number);
    QTEST(ZtFileFault::text(number), "text");
    // English is what the system says.
    QCoreApplication::removeTranslator(&m_language);
    QCOMPARE(ZtFileFault::text(number), qt_error_string(number));
}

STATREPORT_TEST_MAIN(ZtFileFaultTest)
#include "ZtFileFaultTest.moc"
