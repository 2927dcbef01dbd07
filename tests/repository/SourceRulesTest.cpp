// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "repository/SourceTree.h"

namespace {

const QString slashLicence = QStringLiteral("// SPDX-License-Identifier: MIT");
const QString hashLicence = QStringLiteral("# SPDX-License-Identifier: MIT");

bool isCpp(const QString &path)
{
    return path.endsWith(QLatin1String(".h")) || path.endsWith(QLatin1String(".cpp"));
}

bool isScript(const QString &path)
{
    return path.endsWith(QLatin1String(".sh")) || path.endsWith(QLatin1String(".cmake")) ||
           SourceTree::fileName(path) == QLatin1String("CMakeLists.txt");
}

/// In the first line, or in the second behind the interpreter's.
bool namesItsLicence(const QString &path, const QString &text)
{
    const QStringList lines = text.split(QLatin1Char('\n'));
    if (isCpp(path))
        return lines.first() == slashLicence;
    const bool startsInterpreter = lines.first().startsWith(QLatin1String("#!"));
    return lines.value(startsInterpreter ? 1 : 0) == hashLicence;
}

bool hasPragmaOnce(const QString &text)
{
    static const QRegularExpression pattern(QStringLiteral("^#pragma once$"),
                                            QRegularExpression::MultilineOption);
    return pattern.match(SourceTree::withoutComments(text)).hasMatch();
}

/// Number of lines from an opening brace to the one that closes it.
int bodyLines(const QString &text, int brace)
{
    int depth = 0;
    int lines = 1;
    for (int i = brace; i < text.size(); ++i) {
        const QChar c = text.at(i);
        if (c == QLatin1Char('{'))
            ++depth;
        else if (c == QLatin1Char('}') && --depth == 0)
            break;
        else if (c == QLatin1Char('\n'))
            ++lines;
    }
    return lines;
}

constexpr int smallStructLines = 25;

/// Our classes that a header defines besides the one it is named after; small structs may stand anywhere.
QStringList strayClasses(const QString &path, const QString &text)
{
    static const QRegularExpression pattern(
        QStringLiteral("(\\benum\\s+)?\\b(class|struct)\\s+(?:[A-Z][A-Z0-9_]*\\s+)?((?:Kv|Zt|iZT)\\w+)(?:\\s+"
                       "final)?\\s*(?::[^;{]*)?\\{"));
    const QString code = SourceTree::withoutComments(text);
    const QString expected = SourceTree::fileName(path).section(QLatin1Char('.'), 0, 0);
    QStringList stray;
    QRegularExpressionMatchIterator it = pattern.globalMatch(code);
    while (it.hasNext()) {
        const QRegularExpressionMatch match = it.next();
        const bool isSmallStruct = match.captured(2) == QLatin1String("struct") &&
                                   bodyLines(code, match.capturedEnd() - 1) <= smallStructLines;
        const bool isEnum = !match.captured(1).isEmpty();
        if (match.captured(3) != expected && !isSmallStruct && !isEnum)
            stray.append(match.captured(3));
    }
    return stray;
}

/// Classes that share another's header for a reason.
const QMap<QString, QString> sharedHeaders{
    // Who reads the log and who writes to it include the same header.
    {QStringLiteral("ZtStatusLog"), QStringLiteral("host/common/ZtAppStatus.h")},
    // An interface and the one implementation that programs use.
    {QStringLiteral("KvBlockTypeList"), QStringLiteral("src/templates/KvBlockRegistry.h")},
    {QStringLiteral("KvMessageBoxes"), QStringLiteral("src/templates/KvUserMessages.h")},
};

/// What belongs to notes about the work and not into the product. In pieces, or this file would hold it all.
const QRegularExpression &workingNotes()
{
    static const QStringList patterns{
        QStringLiteral("\\bTO") + QStringLiteral("DO\\b"),
        QStringLiteral("\\bFIX") + QStringLiteral("ME\\b"),
        QStringLiteral("\\bXX") + QStringLiteral("X\\b"),
        QStringLiteral("\\bHA") + QStringLiteral("CK\\b"),
        QStringLiteral("(?i:\\bst") + QStringLiteral("ub(s|bed)?\\b)"),
        QStringLiteral("(?i:\\bspe") + QStringLiteral("c(s|ification|ifications)?\\b)"),
        QStringLiteral("(?i:\\brul") + QStringLiteral("ings?\\b)"),
        QStringLiteral("(?i:\\bwork") + QStringLiteral(" ?items?\\b)"),
        QStringLiteral("(?i:\\bdeci") + QStringLiteral("sions?\\.md\\b)"),
        QStringLiteral("(?i:\\bissue") + QStringLiteral("s? #?[0-9])"),
        QStringLiteral("\\bPar") + QStringLiteral("ts? [0-9]+\\.[0-9]+"),
        QStringLiteral("/work") + QStringLiteral("/(main|shared)\\b"),
        QStringLiteral("\\.\\./sha") + QStringLiteral("red\\b"),
    };
    static const QRegularExpression pattern(patterns.join(QLatin1Char('|')));
    return pattern;
}

QByteArray lines(const QStringList &texts)
{
    return '\n' + texts.join(QLatin1Char('\n')).toUtf8();
}

} // namespace

class SourceRulesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();

    void seesAMissingLicence_data();
    void seesAMissingLicence();
    void seesAMissingPragma_data();
    void seesAMissingPragma();
    void seesStrayClasses_data();
    void seesStrayClasses();
    void seesWorkingNotes_data();
    void seesWorkingNotes();

    void everySourceNamesItsLicence();
    void everyHeaderHasPragmaOnce();
    void classesAreInTheirOwnHeader();
    void noFileHoldsWorkingNotes();
    void theMakersAreNamedOnce();

private:
    SourceTree::Files m_files;
};

void SourceRulesTest::initTestCase()
{
    m_files = SourceTree::read(sourcePath(QString()), {QString()},
                               {QStringLiteral("*.h"), QStringLiteral("*.cpp"), QStringLiteral("*.cmake"),
                                QStringLiteral("CMakeLists.txt"), QStringLiteral("*.sh"),
                                QStringLiteral("*.ui"), QStringLiteral("*.qrc"), QStringLiteral("*.qss"),
                                QStringLiteral("*.md"), QStringLiteral("*.txt"), QStringLiteral("*.json"),
                                QStringLiteral("*.rtp"), QStringLiteral("*.csv"), QStringLiteral("*.py"),
                                QStringLiteral("*.ts"), QStringLiteral("*.svg"), QStringLiteral("*.in"),
                                QStringLiteral("*.desktop"), QStringLiteral("*.xml")});
    for (const char *path : {"CMakeLists.txt", "cmake/StatReportTargets.cmake", "src/data/KvMeasuredValue.h",
                             "host/kernel/ZtKernelData.cpp", "tests/repository/SourceRulesTest.cpp"})
        QVERIFY2(m_files.contains(QLatin1String(path)), path);
}

void SourceRulesTest::seesAMissingLicence_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("text");
    QTest::addColumn<bool>("named");
    const QString newLine(QLatin1Char('\n'));
    QTest::newRow("header") << QStringLiteral("A.h") << slashLicence + newLine << true;
    QTest::newRow("header, later") << QStringLiteral("A.h") << newLine + slashLicence << false;
    QTest::newRow("source, other comment") << QStringLiteral("A.cpp") << hashLicence << false;
    QTest::newRow("source, other licence")
        << QStringLiteral("A.cpp") << slashLicence + QStringLiteral("-0") << false;
    QTest::newRow("empty source") << QStringLiteral("A.cpp") << QString() << false;
    QTest::newRow("CMake") << QStringLiteral("a/CMakeLists.txt") << hashLicence + newLine << true;
    QTest::newRow("CMake, none") << QStringLiteral("a/CMakeLists.txt") << QStringLiteral("project(a)\n")
                                 << false;
    QTest::newRow("script") << QStringLiteral("a.sh") << QStringLiteral("#!/bin/sh\n") + hashLicence + newLine
                            << true;
    QTest::newRow("script, none") << QStringLiteral("a.sh") << QStringLiteral("#!/bin/sh\nls\n") << false;
}

void SourceRulesTest::seesAMissingLicence()
{
    QFETCH(QString, path);
    QFETCH(QString, text);
    QFETCH(bool, named);
    QCOMPARE(namesItsLicence(path, text), named);
}

void SourceRulesTest::seesAMissingPragma_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<bool>("has");
    QTest::newRow("there") << QStringLiteral("// a\n#pragma once\n\nint a;\n") << true;
    QTest::newRow("not there") << QStringLiteral("#ifndef A_H\n#define A_H\n#endif\n") << false;
    QTest::newRow("commented out") << QStringLiteral("// #pragma once\n/*\n#pragma once\n*/\n") << false;
}

void SourceRulesTest::seesAMissingPragma()
{
    QFETCH(QString, text);
    QFETCH(bool, has);
    QCOMPARE(hasPragmaOnce(text), has);
}

void SourceRulesTest::seesStrayClasses_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QStringList>("stray");
    const QStringList none;
    const QStringList other(QStringLiteral("KvOther"));
    QTest::newRow("its own") << QStringLiteral("class KvThis : public QObject\n{\n};\n") << none;
    QTest::newRow("exported") << QStringLiteral("class ZT_KERNEL_EXPORT KvThis final\n{\n};\n") << none;
    QTest::newRow("another") << QStringLiteral("class KvThis\n{\n};\nclass KvOther\n{\n};\n") << other;
    QTest::newRow("another, exported")
        << QStringLiteral("class ZT_KERNEL_EXPORT KvOther : public KvThis\n{\n};\n") << other;
    QTest::newRow("another, final") << QStringLiteral(
                                           "class KvOther final : public QObject,\n    public KvThis {\n};\n")
                                    << other;
    QTest::newRow("of the host") << QStringLiteral("class iZTOther\n{\n};\n")
                                 << QStringList(QStringLiteral("iZTOther"));
    QTest::newRow("announced only") << QStringLiteral(
                                           "class KvOther;\nclass KvThis\n{\n    friend class KvOther;\n};\n")
                                    << none;
    QTest::newRow("commented out") << QStringLiteral("// class KvOther {\n/* class KvOther { */\n") << none;
    QTest::newRow("small structs") << QStringLiteral(
                                          "struct KvOther\n{\n    int a;\n};\nstruct KvMore\n{\n};\n")
                                   << none;
    QTest::newRow("large struct") << QStringLiteral("struct KvOther\n{\n") + QString(30, QLatin1Char('\n')) +
                                         QStringLiteral("};\n")
                                  << other;
    QTest::newRow("enumeration") << QStringLiteral("enum class KvOther { A, B };\n") << none;
    QTest::newRow("without a prefix") << QStringLiteral("class Kvass;\nclass Other\n{\n};\n") << none;
}

void SourceRulesTest::seesStrayClasses()
{
    QFETCH(QString, text);
    QFETCH(QStringList, stray);
    QCOMPARE(strayClasses(QStringLiteral("src/a/KvThis.h"), text), stray);
}

void SourceRulesTest::seesWorkingNotes_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<bool>("seen");
    QTest::newRow("to do") << QStringLiteral("// TO") + QStringLiteral("DO: more") << true;
    QTest::newRow("to fix") << QStringLiteral("// FIX") + QStringLiteral("ME") << true;
    QTest::newRow("placeholder") << QStringLiteral("// a st") + QStringLiteral("ub for now") << true;
    QTest::newRow("what to build") << QStringLiteral("// as the spe") + QStringLiteral("cification says")
                                   << true;
    QTest::newRow("its chapter") << QStringLiteral("// see Par") + QStringLiteral("t 6.1") << true;
    QTest::newRow("a note") << QStringLiteral("// by the rul") + QStringLiteral("ing on names") << true;
    QTest::newRow("an issue") << QStringLiteral("// issu") + QStringLiteral("e #12") << true;
    QTest::newRow("a place") << QStringLiteral("\"/work") + QStringLiteral("/main/src\"") << true;
    QTest::newRow("plain words") << QStringLiteral(
                                        "// todos los partes; unspecified, stubborn, special, scheduling")
                                 << false;
    QTest::newRow("a part") << QStringLiteral("// Part of the page, part 6 of 12") << false;
}

void SourceRulesTest::seesWorkingNotes()
{
    QFETCH(QString, text);
    QFETCH(bool, seen);
    QCOMPARE(workingNotes().match(text).hasMatch(), seen);
}

void SourceRulesTest::everySourceNamesItsLicence()
{
    QStringList faults;
    for (auto it = m_files.constBegin(); it != m_files.constEnd(); ++it) {
        if ((isCpp(it.key()) || isScript(it.key())) && !namesItsLicence(it.key(), it.value()))
            faults.append(it.key());
    }
    QVERIFY2(faults.isEmpty(), lines(faults));
}

void SourceRulesTest::everyHeaderHasPragmaOnce()
{
    QStringList faults;
    for (auto it = m_files.constBegin(); it != m_files.constEnd(); ++it) {
        if (it.key().endsWith(QLatin1String(".h")) && !hasPragmaOnce(it.value()))
            faults.append(it.key());
    }
    QVERIFY2(faults.isEmpty(), lines(faults));
}

void SourceRulesTest::classesAreInTheirOwnHeader()
{
    QStringList faults;
    QMap<QString, QString> unused = sharedHeaders;
    for (auto it = m_files.constBegin(); it != m_files.constEnd(); ++it) {
        if (!it.key().endsWith(QLatin1String(".h")))
            continue;
        for (const QString &name : strayClasses(it.key(), it.value())) {
            if (sharedHeaders.value(name) == it.key())
                unused.remove(name);
            else
                faults.append(it.key() + QStringLiteral(" defines ") + name);
        }
    }
    QVERIFY2(faults.isEmpty(), lines(faults));
    QVERIFY2(unused.isEmpty(), lines(unused.keys()));
}

void SourceRulesTest::noFileHoldsWorkingNotes()
{
    QStringList faults;
    for (auto it = m_files.constBegin(); it != m_files.constEnd(); ++it) {
        if (workingNotes().match(it.key()).hasMatch())
            faults.append(it.key() + QStringLiteral(" by its name"));
        const QStringList textLines = it.value().split(QLatin1Char('\n'));
        for (int i = 0; i < textLines.size(); ++i) {
            const QRegularExpressionMatch match = workingNotes().match(textLines.at(i));
            if (match.hasMatch())
                faults.append(QStringLiteral("%1:%2: %3").arg(it.key()).arg(i + 1).arg(match.captured()));
        }
    }
    QVERIFY2(faults.isEmpty(), lines(faults));
}

// A program that says its version says who makes it, by the same constant.
void SourceRulesTest::theMakersAreNamedOnce()
{
    static const QRegularExpression call(QStringLiteral("setProgramInfo\\([^;]*STATREPORT_VERSION[^;]*;"));
    int calls = 0;
    for (auto it = m_files.constBegin(); it != m_files.constEnd(); ++it) {
        const QRegularExpressionMatch match = call.match(it.value());
        if (!match.hasMatch() || !isCpp(it.key()))
            continue;
        ++calls;
        QVERIFY2(match.captured().contains(QStringLiteral("STATREPORT_VENDOR")), qPrintable(it.key()));
    }
    QVERIFY(calls >= 2);
}

STATREPORT_TEST_MAIN(SourceRulesTest)
#include "SourceRulesTest.moc"
