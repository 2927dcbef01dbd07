// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "kernel/ZtAppSettings.h"
#include "support/BracketTranslator.h"
#include "templates/KvReportKeywords.h"

#include <QDate>
#include <QTime>

namespace {

QString expanded(QString text)
{
    const KvReportKeywords keywords;
    keywords.expand(text);
    return text;
}

} // namespace

class KvReportKeywordsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void theTableIsFixed();
    void labelsAreTranslatedOnce();
    void dates();
    void theTimeIsThatOfTheExpansion();
    void programTexts();
    void programTextsAreReadAtEachExpansion();
    void expands_data();
    void expands();
    void valuesAreNotEscaped();
    void valuesAreExpandedByLaterKeywordsOnly();
    void everyPlaceHasTheSameTime();
};

void KvReportKeywordsTest::init()
{
    StatReportTest::init();
    ZtAppSettings::setProgramInfo(QStringLiteral("Tool"), QStringLiteral("4.5.6"), QStringLiteral("Works"));
}

void KvReportKeywordsTest::theTableIsFixed()
{
    const KvReportKeywords keywords;
    const QStringList names{QStringLiteral("${CREATION_DATE_ISO}"), QStringLiteral("${CREATION_DATE_TEXT}"),
                            QStringLiteral("${CREATION_TIME}"),     QStringLiteral("${PROGRAM_NAME}"),
                            QStringLiteral("${PROGRAM_VERSION}"),   QStringLiteral("${PROGRAM_VENDOR}")};
    const QStringList labels{QStringLiteral("Creation date (ISO)"), QStringLiteral("Creation date (Text)"),
                             QStringLiteral("Creation time"),       QStringLiteral("Program name"),
                             QStringLiteral("Program version"),     QStringLiteral("Program vendor")};
    QStringList actualNames;
    QStringList actualLabels;
    for (const KvReportKeyword &entry : keywords.keywords()) {
        actualNames.append(entry.keyword);
        actualLabels.append(entry.label);
        QVERIFY(entry.value);
    }
    QCOMPARE(actualNames, names);
    QCOMPARE(actualLabels, labels);
}

void KvReportKeywordsTest::labelsAreTranslatedOnce()
{
    const KvReportKeywords before;
    const BracketTranslator translator(QStringLiteral("KvReportKeywords"));
    const KvReportKeywords after;
    QCOMPARE(before.keywords().first().label, QStringLiteral("Creation date (ISO)"));
    for (int i = 0; i < after.keywords().size(); ++i) {
        QCOMPARE(after.keywords().at(i).label,
                 QLatin1Char('[') + before.keywords().at(i).label + QLatin1Char(']'));
        QCOMPARE(after.keywords().at(i).keyword, before.keywords().at(i).keyword);
    }
}

void KvReportKeywordsTest::dates()
{
    // Midnight may pass between two looks at the clock.
    QDate day;
    QString iso;
    QString text;
    do {
        day = QDate::currentDate();
        iso = expanded(QStringLiteral("${CREATION_DATE_ISO}"));
        text = expanded(QStringLiteral("${CREATION_DATE_TEXT}"));
    } while (day != QDate::currentDate());
    QCOMPARE(iso, day.toString(Qt::ISODate));
    QVERIFY(QRegularExpression(QStringLiteral("^\\d{4}-\\d{2}-\\d{2}$")).match(iso).hasMatch());
    QCOMPARE(text, day.toString(QStringLiteral("dd MMM yyyy")));
    QVERIFY(QRegularExpression(QStringLiteral("^\\d{2} \\S+ \\d{4}$")).match(text).hasMatch());
}

void KvReportKeywordsTest::theTimeIsThatOfTheExpansion()
{
    const KvReportKeywords keywords;
    for (int i = 0; i < 2; ++i) {
        QTime time;
        QString text;
        do {
            time = QTime::currentTime();
            text = QStringLiteral("${CREATION_TIME}");
            keywords.expand(text);
        } while (time.second() != QTime::currentTime().second());
        QCOMPARE(text, time.toString(QStringLiteral("h:mm:ss")));
        if (i == 0)
            QTRY_VERIFY_WITH_TIMEOUT(time.second() != QTime::currentTime().second(), 3000);
    }
}

void KvReportKeywordsTest::programTexts()
{
    QCOMPARE(expanded(QStringLiteral("${PROGRAM_NAME}")), QStringLiteral("Tool"));
    QCOMPARE(expanded(QStringLiteral("${PROGRAM_VERSION}")), QStringLiteral("4.5.6"));
    QCOMPARE(expanded(QStringLiteral("${PROGRAM_VENDOR}")), QStringLiteral("Works"));
}

void KvReportKeywordsTest::programTextsAreReadAtEachExpansion()
{
    const KvReportKeywords keywords;
    QCOMPARE(keywords.keywords().at(3).value(), QStringLiteral("Tool"));
    ZtAppSettings::setProgramInfo(QStringLiteral("Other"), QStringLiteral("7"), QStringLiteral("Works"));
    QCOMPARE(keywords.keywords().at(3).value(), QStringLiteral("Other"));
    QString text = QStringLiteral("${PROGRAM_VERSION}");
    keywords.expand(text);
    QCOMPARE(text, QStringLiteral("7"));
}

void KvReportKeywordsTest::expands_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("result");
    QTest::newRow("empty") << QString() << QString();
    QTest::newRow("no keyword") << QStringLiteral("Report") << QStringLiteral("Report");
    QTest::newRow("in a text") << QStringLiteral("by ${PROGRAM_NAME}, ${PROGRAM_VENDOR}.")
                               << QStringLiteral("by Tool, Works.");
    QTest::newRow("side by side") << QStringLiteral("${PROGRAM_NAME}${PROGRAM_NAME}")
                                  << QStringLiteral("ToolTool");
    QTest::newRow("in HTML") << QStringLiteral("<p title=\"${PROGRAM_NAME}\"><b>${PROGRAM_VERSION}</b></p>")
                             << QStringLiteral("<p title=\"Tool\"><b>4.5.6</b></p>");
    const QStringList unchanged{QStringLiteral("${program_name}"),
                                QStringLiteral("${Program_Name}"),
                                QStringLiteral("${creation_time}"),
                                QStringLiteral("${NO_SUCH_KEYWORD}"),
                                QStringLiteral("$PROGRAM_NAME"),
                                QStringLiteral("{PROGRAM_NAME}"),
                                QStringLiteral("${PROGRAM_NAME"),
                                QStringLiteral("${ PROGRAM_NAME }"),
                                QStringLiteral("${}"),
                                QStringLiteral("${<b>PROGRAM</b>_NAME}")};
    for (const QString &text : unchanged)
        QTest::newRow(qPrintable(text)) << text << text;
    // There is no way to say that a keyword is meant as it stands.
    QTest::newRow("backslash") << QStringLiteral("\\${PROGRAM_NAME}") << QStringLiteral("\\Tool");
    QTest::newRow("two dollars") << QStringLiteral("$${PROGRAM_NAME}") << QStringLiteral("$Tool");
}

void KvReportKeywordsTest::expands()
{
    QFETCH(QString, text);
    QFETCH(QString, result);
    QCOMPARE(expanded(text), result);
}

void KvReportKeywordsTest::valuesAreNotEscaped()
{
    ZtAppSettings::setProgramInfo(QStringLiteral("a<b>"), QStringLiteral("1"), QStringLiteral("A & B"));
    QCOMPARE(expanded(QStringLiteral("<i>${PROGRAM_VENDOR}</i>")), QStringLiteral("<i>A & B</i>"));
    QCOMPARE(expanded(QStringLiteral("${PROGRAM_NAME}")), QStringLiteral("a<b>"));
}

void KvReportKeywordsTest::valuesAreExpandedByLaterKeywordsOnly()
{
    ZtAppSettings::setProgramInfo(QStringLiteral("Tool of ${PROGRAM_VENDOR}"),
                                  QStringLiteral("${PROGRAM_VERSION}"),
                                  QStringLiteral("${PROGRAM_NAME} makers"));
    QCOMPARE(expanded(QStringLiteral("${PROGRAM_NAME}")), QStringLiteral("Tool of ${PROGRAM_NAME} makers"));
    QCOMPARE(expanded(QStringLiteral("${PROGRAM_VENDOR}")), QStringLiteral("${PROGRAM_NAME} makers"));
    QCOMPARE(expanded(QStringLiteral("${PROGRAM_VERSION}")), QStringLiteral("${PROGRAM_VERSION}"));
}

void KvReportKeywordsTest::everyPlaceHasTheSameTime()
{
    QString text;
    for (int i = 0; i < 2000; ++i)
        text += QStringLiteral("${CREATION_TIME} ");
    QStringList times = expanded(text).split(QLatin1Char(' '), Qt::SkipEmptyParts);
    QCOMPARE(times.size(), 2000);
    QCOMPARE(times.removeDuplicates(), 1999);
}

STATREPORT_TEST_MAIN(KvReportKeywordsTest)
#include "KvReportKeywordsTest.moc"
