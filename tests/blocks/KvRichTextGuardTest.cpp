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
    void breaksOverlongPlainWords();
    void keepsEntitiesWhole();
    void flattensDeepElements();
    void cutsHugeNumbers_data();
    void cutsHugeNumbers();
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
    QTest::newRow("colours") << QStringLiteral("<p style=\"color:#999999; background:#123456\">1234567</p>");
    QTest::newRow("no tag at all") << QStringLiteral("5 < 1234567 > 3 <b>and 1234567</b> < 7654321");
    QTest::newRow("numbers of five digits") << QStringLiteral("<img width=\"99999\" height='12345'/>");
    QTest::newRow("long fractions") << QStringLiteral("<p style=\"font-size:11.99999999pt\">a</p>");
    QTest::newRow("addresses of digits") << QStringLiteral(
        "<img src=\"data:image/png;base64, 123456789/1234567+000000=\" /><a href='1234567'>a</a>");
    QTest::newRow("as deep as can be") << QStringLiteral("<span>").repeated(KvRichTextGuard::DeepestElement);
    QTest::newRow("one after the other") << QStringLiteral("<div><b>a</b></div>").repeated(2000);
    QTest::newRow("paragraphs without end") << QStringLiteral("<p>a<br>").repeated(2000);
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

void KvRichTextGuardTest::breaksOverlongPlainWords()
{
    const QString ordinary = QStringLiteral("<p>5 &lt; 7</p> ").repeated(5000);
    QCOMPARE(KvRichTextGuard::tamedPlain(ordinary), ordinary);
    const QString tag = QLatin1Char('<') + QString(KvRichTextGuard::LongestWord, QLatin1Char('a'));
    const QString tamed = KvRichTextGuard::tamedPlain(tag);
    QCOMPARE(tamed.count(QChar(0x200B)), 20);
    QCOMPARE(QString(tamed).remove(QChar(0x200B)), tag);
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

void KvRichTextGuardTest::flattensDeepElements()
{
    const int depth = 2 * KvRichTextGuard::DeepestElement;
    const QString html = QStringLiteral("<DIV>in").repeated(depth) + QStringLiteral("most") +
                         QStringLiteral("</div>").repeated(depth) + QStringLiteral("<b>after</b>");
    const QString tamed = KvRichTextGuard::tamed(html);
    QCOMPARE(tamed.count(QStringLiteral("<DIV>")), KvRichTextGuard::DeepestElement);
    QCOMPARE(tamed.count(QStringLiteral("</div>")), KvRichTextGuard::DeepestElement);
    QCOMPARE(tamed.count(QStringLiteral("in")), depth);
    QVERIFY(tamed.contains(QStringLiteral("most")));
    QVERIFY(tamed.endsWith(QStringLiteral("<b>after</b>")));
}

void KvRichTextGuardTest::cutsHugeNumbers_data()
{
    QTest::addColumn<QString>("html");
    QTest::addColumn<QString>("tamed");
    QTest::newRow("attribute") << "<table cellpadding=2000000000 border=\"1\">1000000"
                               << "<table cellpadding=32767 border=\"1\">1000000";
    QTest::newRow("beside a picture") << "<img src=\"data:image/png;base64, 1234567\" height=\"100000\" />"
                                      << "<img src=\"data:image/png;base64, 1234567\" height=\"32767\" />";
    QTest::newRow("before a picture") << "<img width='1000000' SRC='1234567' height='1000000'>"
                                      << "<img width='32767' SRC='1234567' height='32767'>";
    QTest::newRow("style") << "<p style=\"margin-top:-999999999px; color:#123456\">"
                           << "<p style=\"margin-top:-32767px; color:#123456\">";
}

void KvRichTextGuardTest::cutsHugeNumbers()
{
    QFETCH(QString, html);
    QTEST(KvRichTextGuard::tamed(html), "tamed");
}

void KvRichTextGuardTest::endsInTime_data()
{
    QTest::addColumn<QString>("html");
    QTest::newRow("tables") << QStringLiteral("<table><tr><td>").repeated(3000) + QLatin1Char('x');
    QTest::newRow("word") << QString(1000000, QLatin1Char('a'));
    QTest::newRow("elements") << QStringLiteral("<div>").repeated(200000) + QLatin1Char('x');
    QTest::newRow("formats") << QStringLiteral("<b><i>").repeated(100000) + QLatin1Char('x');
    QTest::newRow("padding") << QStringLiteral("<table cellpadding=\"2000000000\"><tr><td>x");
    QTest::newRow("numbers") << QStringLiteral("<p ") + QStringLiteral("a=1000000 ").repeated(200000) +
                                    QStringLiteral(">x");
    QTest::newRow("picture") << QStringLiteral("<img height=\"20000000\" />x");
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
