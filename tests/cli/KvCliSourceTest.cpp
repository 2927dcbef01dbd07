// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "cli/RedirectedStream.h"

#include "KvCliSource.h"
#include "measuring/ZtFault.h"

#include <cstdio>

#include <fcntl.h>
#include <stdio_ext.h>

class KvCliSourceTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void passesFilesOn();
    void copiesStandardInput_data();
    void copiesStandardInput();
    void saysThatStandardInputCannotBeRead();
};

void KvCliSourceTest::passesFilesOn()
{
    KvCliSource source;
    ZtFault fault;
    // Whether there is such a file is the reader's business.
    QVERIFY(source.open(QStringLiteral("no/such file.csv"), &fault));
    QCOMPARE(source.path(), QStringLiteral("no/such file.csv"));
    QCOMPARE(source.displayName(), QStringLiteral("no/such file.csv"));
    QVERIFY(fault.isNull());
}

void KvCliSourceTest::copiesStandardInput_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("empty") << QByteArray();
    QTest::newRow("text") << QByteArray("a,b\r\n1,2\n");
    QTest::newRow("with zero bytes") << QByteArray("a\0b\0", 4);
    QTest::newRow("several blocks") << QByteArray(200001, 'x');
}

void KvCliSourceTest::copiesStandardInput()
{
    QFETCH(QByteArray, bytes);
    const QString inputPath = temporaryPath(QStringLiteral("input"));
    QFile input(inputPath);
    QVERIFY(input.open(QIODevice::WriteOnly));
    QCOMPARE(input.write(bytes), qint64(bytes.size()));
    input.close();
    QVERIFY(input.open(QIODevice::ReadOnly));

    QString copyPath;
    {
        const RedirectedStream redirected(STDIN_FILENO, input.handle());
        // Not what is left of another file.
        __fpurge(stdin);
        std::clearerr(stdin);
        KvCliSource source;
        ZtFault fault;
        QVERIFY2(source.open(QStringLiteral("-"), &fault), qPrintable(fault.text()));
        QCOMPARE(source.displayName(), QStringLiteral("<standard input>"));
        copyPath = source.path();
        QFile copy(copyPath);
        QVERIFY(copy.open(QIODevice::ReadOnly));
        QCOMPARE(copy.readAll(), bytes);
    }
    QVERIFY(!QFile::exists(copyPath));
}

void KvCliSourceTest::saysThatStandardInputCannotBeRead()
{
    const int folder = open("/", O_RDONLY);
    QVERIFY(folder >= 0);
    const RedirectedStream redirected(STDIN_FILENO, folder);
    std::clearerr(stdin);
    KvCliSource source;
    ZtFault fault;
    QVERIFY(!source.open(QStringLiteral("-"), &fault));
    QCOMPARE(fault.text(), QStringLiteral("<standard input>: cannot be read"));
    std::clearerr(stdin);
    close(folder);
}

STATREPORT_TEST_MAIN(KvCliSourceTest)
#include "KvCliSourceTest.moc"
