// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/table/KvTableFonts.h"
#include "blocks/table/KvTextFit.h"

namespace {
const QChar ellipsis(0x2026);
}

class KvTextFitTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void leavesTextsThatFit_data();
    void leavesTextsThatFit();
    void shortensTextsThatDoNotFit_data();
    void shortensTextsThatDoNotFit();
    void agreesWithMeasuringAtEveryWidth_data();
    void agreesWithMeasuringAtEveryWidth();
    void theWidthForTextsSuffices_data();
    void theWidthForTextsSuffices();
    void lineBreaksBecomeBlanks();
    void anEmptyTextStaysEmpty();
    void metricsAreTheFonts();
    void longTextsAreQuick();
};

static void addTexts()
{
    QTest::addColumn<QString>("text");
    QTest::newRow("word") << QStringLiteral("Rectangle 12");
    QTest::newRow("narrow letters") << QString(60, QLatin1Char('i'));
    QTest::newRow("kerning") << QStringLiteral("AVAVAV To Ty Wa Yo LT AVAVAV");
    QTest::newRow("number") << QStringLiteral("1234.567 µm²");
    QTest::newRow("Greek") << QStringLiteral("Αποτελέσματα μέτρησης");
    QTest::newRow("combining marks") << QString::fromUtf8("e\u0301e\u0301e\u0301e\u0301e\u0301");
    QTest::newRow("Cyrillic") << QStringLiteral("Результаты измерений");
    QTest::newRow("Arabic") << QStringLiteral("نتائج القياس في الصورة");
    QTest::newRow("Hebrew and digits") << QStringLiteral("תוצאה 42 של המדידה");
    QTest::newRow("Chinese") << QStringLiteral("测量结果的统计报告");
    QTest::newRow("beyond the basic plane") << QString::fromUtf8("𝔐𝔢𝔞𝔰𝔲𝔯𝔢");
}

void KvTextFitTest::leavesTextsThatFit_data()
{
    addTexts();
}

void KvTextFitTest::leavesTextsThatFit()
{
    QFETCH(QString, text);
    const KvTextFit fit(KvTableFonts::body());
    const qreal width = QFontMetricsF(KvTableFonts::body()).horizontalAdvance(text);
    QCOMPARE(fit.fitted(text, width + 1), text);
    QCOMPARE(fit.fitted(text, 10 * width), text);
}

void KvTextFitTest::shortensTextsThatDoNotFit_data()
{
    addTexts();
}

void KvTextFitTest::shortensTextsThatDoNotFit()
{
    QFETCH(QString, text);
    const KvTextFit fit(KvTableFonts::body());
    const QFontMetricsF metrics(KvTableFonts::body());
    const qreal width = metrics.horizontalAdvance(text) / 2;
    const QString fitted = fit.fitted(text, width);
    QVERIFY(fitted != text);
    QVERIFY(fitted.endsWith(ellipsis));
    QVERIFY(fitted.size() > 1);
    // Qt joins the last letter of a joining script to the next, invisible one, so that it keeps its shape.
    QString kept = fitted.left(fitted.size() - 1);
    kept.remove(QChar(0x200D));
    QVERIFY(text.startsWith(kept));
    QVERIFY(metrics.horizontalAdvance(fitted) <= width + 1);
}

void KvTextFitTest::agreesWithMeasuringAtEveryWidth_data()
{
    addTexts();
}

void KvTextFitTest::agreesWithMeasuringAtEveryWidth()
{
    // The quick answer from single letters must never let a text through that is too wide, nor cut one that
    // fits.
    QFETCH(QString, text);
    for (const QFont &font : {KvTableFonts::body(), KvTableFonts::header()}) {
        const KvTextFit fit(font);
        const qreal natural = QFontMetricsF(font).horizontalAdvance(text);
        for (int width = 1; width < natural + 40; ++width) {
            const bool isWhole = fit.fitted(text, width) == text;
            if (width > natural + 1)
                QVERIFY2(isWhole, qPrintable(QStringLiteral("cut at %1 of %2").arg(width).arg(natural)));
            if (width < natural - 1)
                QVERIFY2(!isWhole, qPrintable(QStringLiteral("whole at %1 of %2").arg(width).arg(natural)));
        }
    }
}

void KvTextFitTest::theWidthForTextsSuffices_data()
{
    addTexts();
}

void KvTextFitTest::theWidthForTextsSuffices()
{
    QFETCH(QString, text);
    const KvTextFit fit(KvTableFonts::body());
    const qreal width = fit.widthFor(text, 10);
    QCOMPARE(fit.fitted(text, width), text);
    QVERIFY(width <= QFontMetricsF(KvTableFonts::body()).horizontalAdvance(text) + 2);
    QCOMPARE(fit.widthFor(text, 2 * width), 2 * width);
}

void KvTextFitTest::lineBreaksBecomeBlanks()
{
    const KvTextFit fit(KvTableFonts::body());
    const QString text = QStringLiteral("a\nb\rc") + QChar(QChar::LineSeparator) + QLatin1Char('d') +
                         QChar(QChar::ParagraphSeparator) + QLatin1Char('e');
    QCOMPARE(fit.fitted(text, 500), QStringLiteral("a b c d e"));
}

void KvTextFitTest::anEmptyTextStaysEmpty()
{
    const KvTextFit fit(KvTableFonts::body());
    QCOMPARE(fit.fitted(QString(), 100), QString());
    QCOMPARE(fit.fitted(QString(), 0), QString());
}

void KvTextFitTest::metricsAreTheFonts()
{
    const QFont font = KvTableFonts::header();
    const KvTextFit fit(font);
    QCOMPARE(fit.font(), font);
    QCOMPARE(fit.ascent(), QFontMetricsF(font).ascent());
    QCOMPARE(fit.height(), QFontMetricsF(font).height());
}

void KvTextFitTest::longTextsAreQuick()
{
    const KvTextFit fit(KvTableFonts::body());
    const QString latin(1000000, QLatin1Char('m'));
    const QString chinese(1000000, QChar(0x6D4B));
    QElapsedTimer stopwatch;
    stopwatch.start();
    for (int i = 0; i < 20; ++i) {
        QVERIFY(fit.fitted(latin, 100).endsWith(ellipsis));
        QVERIFY(fit.fitted(chinese, 100).endsWith(ellipsis));
    }
    QVERIFY2(stopwatch.elapsed() < 5000, "a text is measured to its end although a glance would do");
}

STATREPORT_TEST_MAIN(KvTextFitTest)
#include "KvTextFitTest.moc"
