// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvRichTextGuard.h"
#include "support/StatReportTest.h"

#include <QElapsedTimer>
#include <QTextDocument>

class KvRichTextGuardTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void keepsOrdinaryText_data();
    void keepsOrdinaryText();
    void flattensDeepTables();
    void breaksOverlongWords();
    void keepsEntitiesWhole();
    void endsInTime_data();
    void endsInTime();
};

void KvRichTextGuardTest::keepsOrdinaryText_data()
{
    QTest::addColumn<QString>("html");
    QTest::newRow("empty") << QString();
    QTest::newRow("plain") << QStringLiteral("5 < 7 and 8 > 3");
    QTest::newRow("unclosed tag") << QStringLiteral("<p>text <b");
    QTest::newRow("tables") << QStringLiteral("<table><tr><td>a</td></tr></table>").repeated(50);
    QTest::newRow("eight levels") << QStringLiteral("<table><tr><td>").repeated(8) + QLatin1Char('x');
    QTest::newRow("long picture")
        << QStringLiteral("<img src=\"data:image/png;base64, %1\"/>").arg(QString(100000, QLatin1Char('A')));
    QTest::newRow("longest word") << QString(KvRichTextGuard::LongestWord, QLatin1Char('a'));
    QTest::newRow("word of a table's name") << QStringLiteral("<tablecloth>").repeated(20);
}

void KvRichTextGuardTest::keepsOrdinaryText()
{
    QFETCH(QString, html);
    QCOMPARE(KvRichTextGuard::tamed(html), html);
}

void KvRichTextGuardTest::flattensDeepTables()
{
    const QString html = QStringLiteral("<TABLE><tr><td>in").repeated(20) + QStringLiteral("most") +
                         QStringLiteral("</td></tr></table>").repeated(20) +
                         QStringLiteral("<table><tr><td>after</td></tr></table>");
    const QString tamed = KvRichTextGuard::tamed(html);
    QCOMPARE(tamed.count(QStringLiteral("<TABLE>")), KvRichTextGuard::DeepestTable);
    QCOMPARE(tamed.count(QStringLiteral("</table>")), KvRichTextGuard::DeepestTable + 1);
    QCOMPARE(tamed.count(QStringLiteral("in")), 20);
    QVERIFY(tamed.contains(QStringLiteral("most")));
    QVERIFY(tamed.endsWith(QStringLiteral("<table><tr><td>after</td></tr></table>")));
}

void KvRichTextGuardTest::breaksOverlongWords()
{
    const QString word(KvRichTextGuard::LongestWord + 1, QLatin1Char('a'));
    const QString tamed = KvRichTextGuard::tamed(QStringLiteral("<p>") + word + QStringLiteral("</p>"));
    QCOMPARE(tamed.count(QChar(0x200B)), 20);
    QCOMPARE(QString(tamed).remove(QChar(0x200B)), QStringLiteral("<p>") + word + QStringLiteral("</p>"));
}

void KvRichTextGuardTest::keepsEntitiesWhole()
{
    const QString word = QStringLiteral("&amp;").repeated(KvRichTextGuard::LongestWord);
    const QString tamed = KvRichTextGuard::tamed(word);
    QTextDocument document;
    document.setHtml(tamed);
    QCOMPARE(document.toPlainText().remove(QChar(0x200B)),
             QString(KvRichTextGuard::LongestWord, QLatin1Char('&')));
}

void KvRichTextGuardTest::endsInTime_data()
{
    QTest::addColumn<QString>("html");
    QTest::newRow("tables") << QStringLiteral("<table><tr><td>").repeated(3000) + QLatin1Char('x');
    QTest::newRow("word") << QString(1000000, QLatin1Char('a'));
}

void KvRichTextGuardTest::endsInTime()
{
    QFETCH(QString, html);
    QElapsedTimer timer;
    timer.start();
    QTextDocument document;
    document.setTextWidth(724);
    document.setHtml(KvRichTextGuard::tamed(html));
    QVERIFY(document.size().height() > 0);
    // Without the guard this takes minutes.
    QVERIFY2(timer.elapsed() < 30000, qPrintable(QString::number(timer.elapsed())));
}

STATREPORT_TEST_MAIN(KvRichTextGuardTest)
#include "KvRichTextGuardTest.moc"
