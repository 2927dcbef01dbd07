// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "gui/QtAdvancedStylesheet.h"
#include "templates/KvReportFont.h"

#include <QApplication>
#include <QLabel>

/** Texts on report pages look alike whatever the language of the interface. */
class KvReportFontTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanupTestCase();
    void widgetsKeepTheirFonts();
    void sizesAndWeights();
};

void KvReportFontTest::cleanupTestCase()
{
    acss::QtAdvancedStylesheet::getInstance()->setLanguage(QLocale::c());
}

void KvReportFontTest::widgetsKeepTheirFonts()
{
    auto *const style = acss::QtAdvancedStylesheet::getInstance();
    QWidget page;
    auto *const label = new QLabel(QStringLiteral("\u76F4"), &page);
    label->setFont(KvReportFont::make(KvReportFont::BodyPixelSize));
    for (const QLocale::Language language : {QLocale::English, QLocale::Chinese, QLocale::Japanese}) {
        style->setLanguage(QLocale(language));
        style->applyTo(qApp);
        page.setFont(QApplication::font());
        QCOMPARE(label->font().families(), QStringList(QStringLiteral("Segoe UI")));
        QCOMPARE(label->font().family(), QStringLiteral("Segoe UI"));
        QCOMPARE(label->font().pixelSize(), int(KvReportFont::BodyPixelSize));
    }
}

void KvReportFontTest::sizesAndWeights()
{
    const QFont font = KvReportFont::make(20, QFont::Bold);
    QCOMPARE(font.pixelSize(), 20);
    QCOMPARE(font.weight(), int(QFont::Bold));
    QVERIFY(font.letterSpacing() > 0);
}

STATREPORT_TEST_MAIN(KvReportFontTest)
#include "KvReportFontTest.moc"
