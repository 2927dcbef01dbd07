// SPDX-License-Identifier: MIT
#include "gui/ZtFontCoverage.h"
#include "support/StatReportTest.h"

class ZtFontCoverageTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void findsMissing_data();
    void findsMissing();
    void sortsAndMentionsEachOnce();
    void namesPackages_data();
    void namesPackages();
};

void ZtFontCoverageTest::findsMissing_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("missing");
    // The test machine has Open Sans, DejaVu Sans and a fallback for East Asian scripts.
    QTest::newRow("nothing") << QString() << QString();
    QTest::newRow("Latin") << QStringLiteral("Length 12 \u00B5m\u00B2 \u00B0") << QString();
    QTest::newRow("Greek and Cyrillic") << QStringLiteral("\u03BC \u0416") << QString();
    QTest::newRow("Hebrew and Arabic") << QStringLiteral("\u05D0 \u0627") << QString();
    QTest::newRow("Chinese") << QStringLiteral("\u957F\u5EA6") << QString();
    QTest::newRow("blanks and controls") << QStringLiteral("a\u00A0b\u200B\u2028\n\u0085") << QString();
    QTest::newRow("private use") << QStringLiteral("a\uF8F0b") << QStringLiteral("\uF8F0");
}

void ZtFontCoverageTest::findsMissing()
{
    QFETCH(QString, text);
    QFETCH(QString, missing);
    ZtFontCoverage coverage(QFont(QStringLiteral("Segoe UI")));
    coverage.addText(text);
    QCOMPARE(coverage.missingCharacters(), missing);
}

void ZtFontCoverageTest::sortsAndMentionsEachOnce()
{
    ZtFontCoverage coverage(QFont(QStringLiteral("Segoe UI")));
    for (const QString &text :
         {QStringLiteral("\uF8F1x"), QStringLiteral("\uF8F1x"), QStringLiteral("\uF8F0\uF8F1")})
        coverage.addText(text);
    QCOMPARE(coverage.missingCharacters(), QStringLiteral("\uF8F0\uF8F1"));
}

void ZtFontCoverageTest::namesPackages_data()
{
    QTest::addColumn<QString>("characters");
    QTest::addColumn<QStringList>("packages");
    const QString cjk = QStringLiteral("fonts-noto-cjk");
    const QString core = QStringLiteral("fonts-noto-core");
    QTest::newRow("none") << QString() << QStringList();
    QTest::newRow("private use") << QStringLiteral("\uF8F0") << QStringList();
    QTest::newRow("Chinese") << QStringLiteral("\u957F\u5EA6") << QStringList(cjk);
    QTest::newRow("Japanese and Korean") << QStringLiteral("\u3042\u30AB\uAC00") << QStringList(cjk);
    QTest::newRow("Arabic") << QStringLiteral("\u0642") << QStringList(core);
    QTest::newRow("emoji") << QString::fromUtf8("\xF0\x9F\x98\x80")
                           << QStringList(QStringLiteral("fonts-symbola"));
    QTest::newRow("several") << QStringLiteral("\u957F\u0E01\uF8F0") << QStringList({cjk, core});
}

void ZtFontCoverageTest::namesPackages()
{
    QFETCH(QString, characters);
    QTEST(ZtFontCoverage::packagesWith(characters), "packages");
}

STATREPORT_TEST_MAIN(ZtFontCoverageTest)
#include "ZtFontCoverageTest.moc"
