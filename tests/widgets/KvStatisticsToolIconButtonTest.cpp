// SPDX-License-Identifier: MIT
#include "widgets/KvStatisticsToolIconButton.h"
#include "gui/QtAdvancedStylesheet.h"
#include "support/StatReportTest.h"
#include "widgets/SvgFile.h"

class KvStatisticsToolIconButtonTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void isCheckable();
    void hasTheSizeOfToolButtons();
    void textBringsItsOwnSizeAndTakesItAway();
    void toolIconIsAProperty();
};

void KvStatisticsToolIconButtonTest::cleanup()
{
    qApp->setStyleSheet(QString());
    StatReportTest::cleanup();
}

void KvStatisticsToolIconButtonTest::isCheckable()
{
    const SvgFile svg(QStringLiteral("#ffffff"));
    KvStatisticsToolIconButton button(svg.path());
    QVERIFY(button.isCheckable());
    QVERIFY(!button.isChecked());
    QTest::mouseClick(&button, Qt::LeftButton);
    QVERIFY(button.isChecked());
}

void KvStatisticsToolIconButtonTest::hasTheSizeOfToolButtons()
{
    qApp->setStyleSheet(acss::QtAdvancedStylesheet::getInstance()->styleSheet());
    const SvgFile svg(QStringLiteral("#ffffff"));
    KvStatisticsToolIconButton button(svg.path());
    button.ensurePolished();
    QCOMPARE(button.minimumSize(), QSize(32, 32));
    QCOMPARE(button.maximumSize(), QSize(32, 32));
}

void KvStatisticsToolIconButtonTest::textBringsItsOwnSizeAndTakesItAway()
{
    const SvgFile svg(QStringLiteral("#ffffff"));
    KvStatisticsToolIconButton button(svg.path());
    button.setText(QStringLiteral("Trend"));
    QCOMPARE(button.maximumSize(),
             QSize(button.fontMetrics().horizontalAdvance(QStringLiteral("Trend")) + 82, 50));
    button.setText(QString());
    QCOMPARE(button.maximumSize(), QSize(32, 32));
}

void KvStatisticsToolIconButtonTest::toolIconIsAProperty()
{
    const SvgFile white(QStringLiteral("#ffffff"));
    const SvgFile red(QStringLiteral("#ff0000"));
    KvStatisticsToolIconButton button(white.path());
    QCOMPARE(button.property("toolIcon").toString(), white.path());
    QVERIFY(button.setProperty("toolIcon", red.path()));
    QCOMPARE(button.iconPath(), red.path());
}

STATREPORT_TEST_MAIN(KvStatisticsToolIconButtonTest)
#include "KvStatisticsToolIconButtonTest.moc"
