// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "endtoend/StatReportProgram.h"
#include "endtoend/TemplateFile.h"

#include <QDirIterator>

#include <algorithm>

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

/// What the script makes: all but the example programs.
QStringList madeFilesBelow(const QString &folder)
{
    QStringList files = filesBelow(folder);
    const auto isWritten = [](const QString &file) {
        return file.startsWith(QLatin1String("minimalhost/")) || file == QLatin1String("CMakeLists.txt");
    };
    files.erase(std::remove_if(files.begin(), files.end(), isWritten), files.end());
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
    void everyTemplateIsRendered();
    void certificateHasAllKeywords();
    void everyExampleCanBeRead();
};

void DemoTest::examplesAreWhatTheScriptMakes()
{
    const QString python = QStandardPaths::findExecutable(QStringLiteral("python3"));
    const QStringList files = madeFilesBelow(examples());
    QVERIFY(files.size() >= 9);
    if (python.isEmpty()) {
        qInfo("python3 is not installed: only whether the examples can be read is tested");
        return;
    }
    const QTemporaryDir copy;
    QVERIFY(QDir(copy.path()).mkdir(QStringLiteral("scripts")));
    for (const char *const name : {"scripts/make_examples.py", "scripts/example_pictures.py"})
        QVERIFY(QFile::copy(sourcePath(QLatin1String(name)), copy.filePath(QLatin1String(name))));
    const QString script = copy.filePath(QStringLiteral("scripts/make_examples.py"));
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

void DemoTest::everyTemplateIsRendered()
{
    const QTemporaryDir folder;
    const ProgramResult result =
        StatReportProgram::runProgram(sourcePath(QStringLiteral("scripts/render_examples")),
                                      {QStringLiteral(STATREPORT_PROGRAM), folder.path()});
    QCOMPARE(result.errors, QString());
    QCOMPARE(result.exitCode, 0);
    const QStringList printed = QString::fromUtf8(result.output).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    QCOMPARE(printed.size(), filesBelow(examples(QStringLiteral("templates"))).size());
    for (const QString &path : printed)
        QVERIFY2(TemplateFile::read(path).startsWith("%PDF-"), qPrintable(path));
}

void DemoTest::certificateHasAllKeywords()
{
    const QByteArray text = TemplateFile::read(examples(QStringLiteral("templates/certificate.rtp")));
    for (const char *const keyword : {"${CREATION_DATE_ISO}", "${CREATION_DATE_TEXT}", "${CREATION_TIME}",
                                      "${PROGRAM_NAME}", "${PROGRAM_VERSION}", "${PROGRAM_VENDOR}"})
        QVERIFY2(text.contains(keyword), keyword);
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
        // Nothing was measured on the coin: that is left to the user.
        QVERIFY2(root.value(QStringLiteral("groups")).toArray().isEmpty() ==
                     source.endsWith(QLatin1String("coin.json")),
                 qPrintable(source));
    }
}

STATREPORT_TEST_MAIN(DemoTest)
#include "DemoTest.moc"
