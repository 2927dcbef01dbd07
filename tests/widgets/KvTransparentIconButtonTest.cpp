// SPDX-License-Identifier: MIT
#include "widgets/KvTransparentIconButton.h"
#include "gui/QtAdvancedStylesheet.h"
#include "support/StatReportTest.h"
#include "widgets/SvgFile.h"

class KvTransparentIconButtonTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void isFlatAndNotCheckable();
    void hasAFixedSize_data();
    void hasAFixedSize();
    void showsWhatIsBehind();
    void clicks();
};

void KvTransparentIconButtonTest::cleanup()
{
    qApp->setStyleSheet(QString());
    StatReportTest::cleanup();
}

void KvTransparentIconButtonTest::isFlatAndNotCheckable()
{
    const SvgFile svg(QStringLiteral("#ffffff"));
    const KvTransparentIconButton button(svg.path());
    QVERIFY(button.isFlat());
    QVERIFY(!button.isCheckable());
    QVERIFY(!button.autoFillBackground());
}

void KvTransparentIconButtonTest::hasAFixedSize_data()
{
    QTest::addColumn<QString>("styleSheet");
    QTest::newRow("plain") << QString();
    QTest::newRow("application's style") << acss::QtAdvancedStylesheet::getInstance()->styleSheet();
}

void KvTransparentIconButtonTest::hasAFixedSize()
{
    QFETCH(QString, styleSheet);
    qApp->setStyleSheet(styleSheet);
    const SvgFile svg(QStringLiteral("#ffffff"));
    KvTransparentIconButton button(svg.path());
    button.ensurePolished();
    QCOMPARE(button.minimumSize(), QSize(22, 22));
    QCOMPARE(button.maximumSize(), QSize(22, 22));
    button.show();
    QVERIFY(QTest::qWaitForWindowExposed(&button));
    QCOMPARE(button.size(), QSize(22, 22));
}

void KvTransparentIconButtonTest::showsWhatIsBehind()
{
    qApp->setStyleSheet(acss::QtAdvancedStylesheet::getInstance()->styleSheet());
    QWidget page;
    page.setPalette(QPalette(Qt::green));
    page.setAutoFillBackground(true);
    const SvgFile svg(QStringLiteral("#ffffff"), QStringLiteral("0"));
    auto *button = new KvTransparentIconButton(svg.path(), &page);
    button->move(4, 4);
    page.resize(40, 40);
    page.show();
    QVERIFY(QTest::qWaitForWindowExposed(&page));
    button->clearFocus();
    const QImage picture = page.grab().toImage();
    QCOMPARE(picture.pixelColor(5, 5), picture.pixelColor(1, 1));
    QCOMPARE(picture.pixelColor(15, 15), picture.pixelColor(1, 1));
}

void KvTransparentIconButtonTest::clicks()
{
    const SvgFile svg(QStringLiteral("#ffffff"));
    KvTransparentIconButton button(svg.path());
    QSignalSpy clicked(&button, SIGNAL(clicked(bool)));
    QTest::mouseClick(&button, Qt::LeftButton);
    QCOMPARE(clicked.count(), 1);
    QCOMPARE(clicked.first().first().toBool(), false);
}

STATREPORT_TEST_MAIN(KvTransparentIconButtonTest)
#include "KvTransparentIconButtonTest.moc"
