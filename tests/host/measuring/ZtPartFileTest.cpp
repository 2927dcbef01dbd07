// SPDX-License-Identifier: MIT
#include "measuring/ZtPartFile.h"

#include "measuring/ZtFault.h"
#include "measuring/ZtSafeFile.h"
#include "support/StatReportTest.h"

#include <QDir>

namespace {

constexpr qint64 largestProcess = 9999999999; ///< no system has so many

} // namespace

class ZtPartFileTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void takesThePlace();
    void goesWithoutCommit();
    void keepsPermissions();
    void tellsFaults();
    void removesWhatIsStale_data();
    void removesWhatIsStale();
    void keepsWhatHasAProcess();
    void keepsTheContentsWhenItIsKilled();
    void cleansUpThroughLinks();

private:
    QStringList names() const { return QDir(m_folder).entryList(QDir::Files | QDir::Hidden, QDir::Name); }
    // A file that was written some seconds ago.
    void add(const QString &name, int seconds) const;

    QString m_folder;
    QString m_path;
};

void ZtPartFileTest::init()
{
    StatReportTest::init();
    m_folder = temporaryPath(
        QString::fromLatin1(QTest::currentTestFunction()) + QLatin1Char('_') +
        QString::fromLatin1(QTest::currentDataTag()).replace(QLatin1Char(' '), QLatin1Char('_')));
    QVERIFY(QDir().mkpath(m_folder));
    m_path = m_folder + QStringLiteral("/x.json");
}

void ZtPartFileTest::add(const QString &name, int seconds) const
{
    QFile file(m_folder + QLatin1Char('/') + name);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write("{");
    file.flush();
    QVERIFY(
        file.setFileTime(QDateTime::currentDateTime().addSecs(-seconds), QFileDevice::FileModificationTime));
}

void ZtPartFileTest::takesThePlace()
{
    add(QStringLiteral("x.json"), 0);
    ZtPartFile part(m_path);
    QVERIFY(part.open());
    QCOMPARE(names().size(), 2);
    const QRegularExpression pattern(
        QStringLiteral("^x\\.json\\.%1-[a-z]{6}\\.part$").arg(QCoreApplication::applicationPid()));
    QCOMPARE(names().filter(pattern).size(), 1);
    part.file()->write("new");
    QVERIFY(part.commit());
    QCOMPARE(names(), QStringList(QStringLiteral("x.json")));
    QFile file(m_path);
    QVERIFY(file.open(QIODevice::ReadOnly));
    QCOMPARE(file.readAll(), QByteArray("new"));
}

void ZtPartFileTest::goesWithoutCommit()
{
    {
        ZtPartFile part(m_path);
        QVERIFY(part.open());
        part.file()->write("new");
    }
    QCOMPARE(names(), QStringList());
}

void ZtPartFileTest::keepsPermissions()
{
    add(QStringLiteral("x.json"), 0);
    const QFile::Permissions permissions = QFile::ReadOwner | QFile::WriteOwner | QFile::ReadOther;
    QVERIFY(QFile::setPermissions(m_path, permissions));
    ZtPartFile part(m_path);
    QVERIFY(part.open() && part.commit());
    const QFile::Permissions users = QFile::ReadUser | QFile::WriteUser | QFile::ExeUser;
    QCOMPARE(QFile::permissions(m_path) & ~users, permissions);
}

void ZtPartFileTest::tellsFaults()
{
    ZtPartFile nowhere(m_folder + QStringLiteral("/none/x.json"));
    QVERIFY(!nowhere.open());
    QCOMPARE(nowhere.errorString(), QStringLiteral("No such file or directory"));
    ZtPartFile folder(m_folder);
    QVERIFY(!folder.open());
    QCOMPARE(folder.errorString(), QStringLiteral("Is a directory"));
    // Something takes the file's place while it is written.
    ZtPartFile late(m_path);
    QVERIFY(late.open());
    QVERIFY(QDir().mkpath(m_path + QStringLiteral("/inside")));
    QVERIFY(!late.commit());
    QCOMPARE(late.errorString(), QStringLiteral("Is a directory"));
}

void ZtPartFileTest::removesWhatIsStale_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("seconds");
    QTest::addColumn<bool>("isRemoved");
    const QString part = QStringLiteral("x.json.%1-abcdef.part").arg(largestProcess);
    QTest::newRow("stale") << part << 120 << true;
    QTest::newRow("fresh") << part << 10 << false;
    QTest::newRow("of the future") << part << -600 << false;
    QTest::newRow("of another file") << "y.json.9999999999-abcdef.part" << 120 << false;
    QTest::newRow("of a longer name") << "xx.json.9999999999-abcdef.part" << 120 << false;
    QTest::newRow("point for any letter") << "x_json.9999999999-abcdef.part" << 120 << false;
    QTest::newRow("no process") << "x.json.abcdef.part" << 120 << false;
    QTest::newRow("five letters") << "x.json.9999999999-abcde.part" << 120 << false;
    QTest::newRow("upper case") << "x.json.9999999999-ABCDEF.part" << 120 << false;
    QTest::newRow("longer") << "x.json.9999999999-abcdef.part.bak" << 120 << false;
    QTest::newRow("six letters alone") << "x.json.backup" << 120 << false;
    QTest::newRow("the file itself") << "x.json" << 120 << false;
}

void ZtPartFileTest::removesWhatIsStale()
{
    QFETCH(QString, name);
    QFETCH(int, seconds);
    QFETCH(bool, isRemoved);
    add(name, seconds);
    ZtPartFile::removeStale(m_path);
    QCOMPARE(names(), isRemoved ? QStringList() : QStringList(name));
}

void ZtPartFileTest::keepsWhatHasAProcess()
{
    const QString mine = QStringLiteral("x.json.%1-abcdef.part").arg(QCoreApplication::applicationPid());
    add(mine, 2 * ZtPartFile::staleSeconds);
    ZtPartFile::removeStale(m_path);
    QCOMPARE(names(), QStringList(mine));
    // Another process may have got the id since.
    add(mine, 2 * ZtPartFile::forgottenSeconds);
    ZtPartFile::removeStale(m_path);
    QCOMPARE(names(), QStringList());
}

void ZtPartFileTest::keepsTheContentsWhenItIsKilled()
{
    // What a process leaves that was killed: the next that writes the file, and only then, cleans up.
    ZtFault fault;
    QVERIFY(ZtSafeFile::write(m_path, "old", &fault));
    add(QStringLiteral("x.json.%1-zyxwvu.part").arg(largestProcess), 120);
    QCOMPARE(names().size(), 2);
    QVERIFY(!ZtSafeFile::write(m_folder, "new", &fault));
    QCOMPARE(names().size(), 2);
    QVERIFY(ZtSafeFile::write(m_path, "new", &fault));
    QCOMPARE(names(), QStringList(QStringLiteral("x.json")));
}

void ZtPartFileTest::cleansUpThroughLinks()
{
    const QString link = m_folder + QStringLiteral("/link.json");
    add(QStringLiteral("x.json"), 0);
    QVERIFY(QFile::link(m_path, link));
    add(QStringLiteral("x.json.%1-abcdef.part").arg(largestProcess), 120);
    ZtFault fault;
    QVERIFY(ZtSafeFile::write(link, "new", &fault));
    QCOMPARE(names(), QStringList({QStringLiteral("link.json"), QStringLiteral("x.json")}));
}

STATREPORT_TEST_MAIN(ZtPartFileTest)
#include "ZtPartFileTest.moc"
