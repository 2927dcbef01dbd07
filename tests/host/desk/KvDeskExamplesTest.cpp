// SPDX-License-Identifier: MIT
#include "KvDeskExamples.h"

#include "measuring/ZtLoadedSession.h"
#include "support/StatReportTest.h"

#include <QDir>

class KvDeskExamplesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void foundBesideTheProgram_data();
    void foundBesideTheProgram();
    void nowhere();
    void simplestFirst();
    void titles();
    void comeWithTheirPictures();
};

void KvDeskExamplesTest::foundBesideTheProgram_data()
{
    QTest::addColumn<QString>("program");
    QTest::addColumn<QString>("examples");
    QTest::newRow("installed") << QStringLiteral("usr/lib/statreport/bin")
                               << QStringLiteral("usr/share/statreport/examples");
    QTest::newRow("build tree") << QStringLiteral("source/build/dev/bin")
                                << QStringLiteral("source/examples");
}

void KvDeskExamplesTest::foundBesideTheProgram()
{
    QFETCH(QString, program);
    QFETCH(QString, examples);
    const QString programFolder = temporaryPath(program);
    const QString examplesFolder = temporaryPath(examples);
    QVERIFY(QDir().mkpath(programFolder));
    QCOMPARE(KvDeskExamples::folder(programFolder), QString());
    QVERIFY(QDir().mkpath(examplesFolder + QStringLiteral("/sessions")));
    QCOMPARE(KvDeskExamples::folder(programFolder), examplesFolder);
}

void KvDeskExamplesTest::nowhere()
{
    QCOMPARE(KvDeskExamples::sessions(QString()), QStringList());
    QCOMPARE(KvDeskExamples::sessions(temporaryPath(QStringLiteral("missing"))), QStringList());
}

void KvDeskExamplesTest::simplestFirst()
{
    QDir folder(temporaryPath(QStringLiteral("sorted")));
    QVERIFY(folder.mkpath(QStringLiteral("sessions")));
    QVERIFY(folder.cd(QStringLiteral("sessions")));
    for (const char *const name : {"z.json", "cells.json", "b.json", "demo.json", "coin.json", "notes.txt"}) {
        QFile file(folder.filePath(QLatin1String(name)));
        QVERIFY(file.open(QIODevice::WriteOnly));
    }
    QStringList names;
    for (const QString &path : KvDeskExamples::sessions(temporaryPath(QStringLiteral("sorted"))))
        names.append(QFileInfo(path).completeBaseName());
    QCOMPARE(names.join(QLatin1Char(' ')), QStringLiteral("coin demo cells b z"));
}

void KvDeskExamplesTest::titles()
{
    QCOMPARE(KvDeskExamples::title(QStringLiteral("/a/coin.json")), QStringLiteral("Coin: first length"));
    QCOMPARE(KvDeskExamples::title(QStringLiteral("/a/of mine.json")), QStringLiteral("of mine"));
}

void KvDeskExamplesTest::comeWithTheirPictures()
{
    const QStringList paths = KvDeskExamples::sessions(sourcePath(QStringLiteral("examples")));
    QCOMPARE(paths.size(), 4);
    for (const QString &path : paths) {
        QVERIFY2(KvDeskExamples::title(path).contains(QLatin1Char(':')), qPrintable(path));
        ZtLoadedSession loaded;
        ZtFault fault;
        QVERIFY2(loaded.read(path, &fault), qPrintable(fault.text()));
        QVERIFY2(loaded.image, qPrintable(path));
        QVERIFY2(loaded.session.calibration.isCalibrated(), qPrintable(path));
    }
}

STATREPORT_TEST_MAIN(KvDeskExamplesTest)
#include "KvDeskExamplesTest.moc"
