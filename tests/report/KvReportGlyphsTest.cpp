// SPDX-License-Identifier: MIT
#include "report/KvReportGlyphs.h"

#include "common/ZtAppStatus.h"
#include "support/StatReportTest.h"
#include "templates/KvPageSectionsCfg.h"
#include "templates/KvTemplateModel.h"

class KvReportGlyphsTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();

    void namesWhatIsMissing_data();
    void namesWhatIsMissing();
    void saysItOncePerReport();
    void namesTheFirstOfMany();

private:
    static QStringList warnings()
    {
        QStringList texts;
        for (const ZtStatusEntry &entry : ZtStatusLog::getInstance()->entries()) {
            if (entry.category == ZtAppStatus::Warning)
                texts.append(entry.message);
        }
        return texts;
    }
};

void KvReportGlyphsTest::init()
{
    StatReportTest::init();
    ZtStatusLog::getInstance()->clear();
}

void KvReportGlyphsTest::namesWhatIsMissing_data()
{
    QTest::addColumn<QString>("header");
    QTest::addColumn<QString>("footer");
    QTest::addColumn<QStringList>("expected");
    const QString sentence =
        QStringLiteral("No installed font has these characters, the report leaves them out: ");
    // Characters for private use, which no font of the test machine has.
    QTest::newRow("nothing") << QStringLiteral("<p>Length</p>") << QString() << QStringList();
    QTest::newRow("header") << QStringLiteral("<p>\uF8F0</p>") << QString()
                            << QStringList(sentence + QStringLiteral("\uF8F0"));
    QTest::newRow("named by its number") << QStringLiteral("<p>A &#xF8F0; B</p>") << QString()
                                         << QStringList(sentence + QStringLiteral("\uF8F0"));
    QTest::newRow("in a tag") << QStringLiteral("<p style=\"x:\uF8F0\">A</p>") << QString() << QStringList();
    QTest::newRow("picture") << QStringLiteral("<p>A<img src=\"none.png\"/></p>") << QString()
                             << QStringList();
    QTest::newRow("both") << QStringLiteral("\uF8F1") << QStringLiteral("\uF8F0\uF8F1")
                          << QStringList(sentence + QStringLiteral("\uF8F0\uF8F1"));
}

void KvReportGlyphsTest::namesWhatIsMissing()
{
    QFETCH(QString, header);
    QFETCH(QString, footer);
    KvTemplateModel model(nullptr, nullptr);
    model.header()->setText(header);
    model.footer()->setText(footer);
    KvReportGlyphs::logMissing(model);
    QTEST(warnings(), "expected");
}

void KvReportGlyphsTest::saysItOncePerReport()
{
    KvTemplateModel model(nullptr, nullptr);
    model.header()->setText(QStringLiteral("\uF8F0"));
    model.setHeaderEnabled(true);
    QCOMPARE(model.print(temporaryPath(QStringLiteral("out.pdf"))), 1);
    QCOMPARE(warnings().size(), 1);
}

void KvReportGlyphsTest::namesTheFirstOfMany()
{
    QString text;
    for (ushort code = 0xE000; code < 0xE100; ++code)
        text.append(QChar(code));
    KvTemplateModel model(nullptr, nullptr);
    model.header()->setText(text);
    KvReportGlyphs::logMissing(model);
    QCOMPARE(warnings().size(), 1);
    QVERIFY(warnings().first().size() < 120);
    QVERIFY(warnings().first().endsWith(text.left(40)));
}

STATREPORT_TEST_MAIN(KvReportGlyphsTest)
#include "KvReportGlyphsTest.moc"
