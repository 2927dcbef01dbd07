// SPDX-License-Identifier: MIT
#include "KvDeskDataFolder.h"

#include "support/StatReportTest.h"

#include <QDir>

class KvDeskDataFolderTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void foundBesideTheProgram_data();
    void foundBesideTheProgram();
    void installedOneComesFirst();
};

namespace {

QString find(const QString &programFolder)
{
    return KvDeskDataFolder::find(QStringLiteral("doc/program"), QStringLiteral("docs"),
                                  QStringLiteral("guide.md"), programFolder);
}

void createGuide(const QString &folder)
{
    QVERIFY(QDir().mkpath(folder));
    QFile file(folder + QStringLiteral("/guide.md"));
    QVERIFY(file.open(QIODevice::WriteOnly));
}

} // namespace

void KvDeskDataFolderTest::foundBesideTheProgram_data()
{
    QTest::addColumn<QString>("program");
    QTest::addColumn<QString>("folder");
    QTest::newRow("installed") << QStringLiteral("usr/lib/statreport/bin")
                               << QStringLiteral("usr/share/doc/program");
    QTest::newRow("build tree") << QStringLiteral("source/build/dev/bin") << QStringLiteral("source/docs");
}

void KvDeskDataFolderTest::foundBesideTheProgram()
{
    QFETCH(QString, program);
    QFETCH(QString, folder);
    const QString programFolder = temporaryPath(program);
    const QString expected = temporaryPath(folder);
    QVERIFY(QDir().mkpath(programFolder));
    QCOMPARE(find(programFolder), QString());
    // A folder of that name without the entry is another one.
    QVERIFY(QDir().mkpath(expected));
    QCOMPARE(find(programFolder), QString());
    createGuide(expected);
    QCOMPARE(find(programFolder), expected);
}

void KvDeskDataFolderTest::installedOneComesFirst()
{
    const QString program = temporaryPath(QStringLiteral("both/lib/statreport/bin"));
    QVERIFY(QDir().mkpath(program));
    createGuide(temporaryPath(QStringLiteral("both/docs")));
    createGuide(temporaryPath(QStringLiteral("both/share/doc/program")));
    QCOMPARE(find(program), temporaryPath(QStringLiteral("both/share/doc/program")));
}

STATREPORT_TEST_MAIN(KvDeskDataFolderTest)
#include "KvDeskDataFolderTest.moc"
