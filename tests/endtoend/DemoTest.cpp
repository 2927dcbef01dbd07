// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "endtoend/StatReportProgram.h"
#include "endtoend/TemplateFile.h"

#include <QDirIterator>

namespace {

QStringList filesBelow(const QString &folder)
{
    QStringList files;
    QDirIterator it(folder, QDir::Files, QDirIterator::Subdirectories);
    while (it.hasNext())
        files.append(QDir(folder).relativeFilePath(it.next()));
    files.sort();
    return files;
}

QString examples(const QString &path = QString())
{
    return StatReportTest::sourcePath(QStringLiteral("examples/") + path);
}

} // namespace

class DemoTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void examplesAreWhatTheScriptMakes();
    void everyTemplateIsFaultless();
    void everyExampleCanBeRead();
};

void DemoTest::examplesAreWhatTheScriptMakes()
{
    const QString python = QStandardPaths::findExecutable(QStringLiteral("python3"));
    const QStringList files = filesBelow(examples());
    QVERIFY(files.size() >= 9);
    if (python.isEmpty()) {
        qInfo("python3 is not installed: only whether the examples can be read is tested");
        return;
    }
    const QTemporaryDir copy;
    QVERIFY(QDir(copy.path()).mkdir(QStringLiteral("scripts")));
    const QString script = copy.filePath(QStringLiteral("scripts/make_examples.py"));
    QVERIFY(QFile::copy(sourcePath(QStringLiteral("scripts/make_examples.py")), script));
    const ProgramResult made = StatReportProgram::runProgram(python, {script});
    QVERIFY2(made.exitCode == 0, qPrintable(made.errors));
    const QString madeFolder = copy.filePath(QStringLiteral("examples"));
    QCOMPARE(filesBelow(madeFolder), files);
    for (const QString &file : files)
        QVERIFY2(TemplateFile::read(madeFolder + QLatin1Char('/') + file) ==
                     TemplateFile::read(examples(file)),
                 qPrintable(file));
}

void DemoTest::everyTemplateIsFaultless()
{
    const QStringList templates = filesBelow(examples(QStringLiteral("templates")));
    QVERIFY(!templates.isEmpty());
    for (const QString &name : templates) {
        const ProgramResult result =
            StatReportProgram::run({QStringLiteral("check"), examples(QStringLiteral("templates/") + name)});
        QCOMPARE(result.errors, QString());
        QCOMPARE(result.exitCode, 0);
        QVERIFY2(result.output.contains("block \""), qPrintable(name));
        QVERIFY2(!result.output.contains("warning"), result.output.constData());
    }
}

void DemoTest::everyExampleCanBeRead()
{
    QVERIFY(!QImage(examples(QStringLiteral("pictures/plate.png"))).isNull());
    QStringList sources;
    for (const QString &name : filesBelow(examples(QStringLiteral("tables"))))
        sources << QStringLiteral("--table=") + examples(QStringLiteral("tables/") + name);
    for (const QString &name : filesBelow(examples(QStringLiteral("sessions"))))
        sources << QStringLiteral("--session=") + examples(QStringLiteral("sessions/") + name);
    QVERIFY(sources.size() >= 4);
    for (const QString &source : qAsConst(sources)) {
        const ProgramResult result =
            StatReportProgram::run({QStringLiteral("stats"), source, QStringLiteral("--format=json")});
        QCOMPARE(result.errors, QString());
        QCOMPARE(result.exitCode, 0);
        const QJsonObject root = QJsonDocument::fromJson(result.output).object();
        QVERIFY2(!root.value(QStringLiteral("groups")).toArray().isEmpty(), qPrintable(source));
    }
}

STATREPORT_TEST_MAIN(DemoTest)
#include "DemoTest.moc"
