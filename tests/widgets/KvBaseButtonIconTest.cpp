// SPDX-License-Identifier: MIT
#include "widgets/KvBaseButtonIcon.h"
#include "gui/QtAdvancedStylesheet.h"
#include "support/StatReportTest.h"
#include "widgets/SvgFile.h"

namespace {

const QColor kNormal(0xf0, 0xb1, 0xb5);
const QColor kHovered(0xa6, 0x1d, 0x24);
const QColor kPressed(0xe8, 0x47, 0x49);
const QColor kDisabled(0x4d, 0x4d, 0x4d);

QColor themeColor(const char *name)
{
    return acss::QtAdvancedStylesheet::getInstance()->color(QLatin1String(name));
}

QColor shownColor(QWidget &widget)
{
    const QImage picture = widget.grab().toImage();
    return picture.pixelColor(picture.rect().center());
}

/// Every pixel is pixel colour * tint, component by component.
QColor multiplied(const QColor &pixel, const QColor &tint)
{
    return QColor(pixel.red() * tint.red() / 255, pixel.green() * tint.green() / 255,
                  pixel.blue() * tint.blue() / 255, pixel.alpha());
}

void enter(QWidget &widget)
{
    QEnterEvent event(QPointF(5, 5), QPointF(5, 5), widget.mapToGlobal(QPoint(5, 5)));
    widget.setAttribute(Qt::WA_UnderMouse);
    QCoreApplication::sendEvent(&widget, &event);
}

} // namespace

class KvBaseButtonIconTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void multipliesEveryPixel_data();
    void multipliesEveryPixel();
    void blackCountsAsWhite();
    void iconIsASquareOfTheIconSize_data();
    void iconIsASquareOfTheIconSize();
    void anUnknownIconIsEmpty();
    void eachStateHasItsColor();
    void withoutColorsTheThemeRules();
    void followsTheTheme();
    void aNewIconIsShown();
    void textMakesTheSize_data();
    void textMakesTheSize();
    void textSizeOutranksTheStyleSheet();
    void textStandsBesideTheIcon();
    void focusIsVisible();
};

void KvBaseButtonIconTest::cleanup()
{
    acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Dark"));
    qApp->setStyleSheet(QString());
    StatReportTest::cleanup();
}

void KvBaseButtonIconTest::multipliesEveryPixel_data()
{
    QTest::addColumn<QString>("fill");
    QTest::addColumn<QString>("opacity");
    QTest::addColumn<QColor>("tint");
    const QString full = QStringLiteral("1");
    QTest::newRow("white becomes the colour") << QStringLiteral("#ffffff") << full << kNormal;
    QTest::newRow("grey is half of it") << QStringLiteral("#808080") << full << kPressed;
    QTest::newRow("red has no blue to tint") << QStringLiteral("#ff0000") << full << QColor(0, 0, 255);
    QTest::newRow("colours mix") << QStringLiteral("#4080c0") << full << QColor(0x20, 0x40, 0xff);
    QTest::newRow("nothing stays") << QStringLiteral("#ffffff") << full << QColor(0, 0, 0);
    QTest::newRow("alpha is kept") << QStringLiteral("#ffffff") << QStringLiteral("0.4") << kHovered;
    // The tint knows no opacity: the colour's own alpha does not count.
    QTest::newRow("alpha of the colour") << QStringLiteral("#ffffff") << full << QColor(10, 20, 30, 40);
}

void KvBaseButtonIconTest::multipliesEveryPixel()
{
    QFETCH(QString, fill);
    QFETCH(QString, opacity);
    QFETCH(QColor, tint);
    const SvgFile svg(fill, opacity);
    const KvBaseButtonIcon button(svg.path());
    const QImage icon = button.tintedIcon(tint);
    QColor pixel(fill);
    pixel.setAlpha(qRound(opacity.toDouble() * 255));
    for (const QPoint &point : {QPoint(0, 0), QPoint(12, 12), QPoint(23, 23)})
        QCOMPARE(icon.pixelColor(point), multiplied(pixel, tint));
}

void KvBaseButtonIconTest::blackCountsAsWhite()
{
    const SvgFile svg(QStringLiteral("#000000"), QStringLiteral("0.4"));
    const KvBaseButtonIcon button(svg.path());
    QColor expected = kNormal;
    expected.setAlpha(102);
    QCOMPARE(button.tintedIcon(kNormal).pixelColor(12, 12), expected);
}

void KvBaseButtonIconTest::iconIsASquareOfTheIconSize_data()
{
    QTest::addColumn<QSize>("iconSize");
    QTest::addColumn<int>("extent");
    QTest::newRow("default") << QSize() << 24;
    QTest::newRow("square") << QSize(18, 18) << 18;
    QTest::newRow("wide") << QSize(36, 24) << 36;
}

void KvBaseButtonIconTest::iconIsASquareOfTheIconSize()
{
    QFETCH(QSize, iconSize);
    QFETCH(int, extent);
    const SvgFile svg(QStringLiteral("#ffffff"));
    KvBaseButtonIcon button(svg.path());
    if (iconSize.isValid())
        button.setIconSize(iconSize);
    const QImage icon = button.tintedIcon(kNormal);
    QCOMPARE(icon.size(), QSize(extent, extent) * button.devicePixelRatioF());
    QCOMPARE(icon.format(), QImage::Format_ARGB32);
}

void KvBaseButtonIconTest::anUnknownIconIsEmpty()
{
    KvBaseButtonIcon button(QStringLiteral("Icons/no-such-icon"));
    const QImage icon = button.tintedIcon(Qt::red);
    QCOMPARE(icon.size(), QSize(24, 24));
    QCOMPARE(qAlpha(icon.pixel(12, 12)), 0);
    button.resize(40, 40);
    QVERIFY(!button.grab().isNull());
}

void KvBaseButtonIconTest::eachStateHasItsColor()
{
    const SvgFile svg(QStringLiteral("#ffffff"));
    KvBaseButtonIcon button(svg.path());
    button.resize(40, 40);
    button.setIconColors(kNormal, kHovered, kPressed, kDisabled);
    QCOMPARE(shownColor(button), kNormal);
    enter(button);
    QCOMPARE(shownColor(button), kHovered);
    button.setDown(true);
    QCOMPARE(shownColor(button), kPressed);
    button.setDown(false);
    button.setEnabled(false);
    QCOMPARE(shownColor(button), kDisabled);
    button.setEnabled(true);
    button.setAttribute(Qt::WA_UnderMouse, false);
    button.setCheckable(true);
    button.setChecked(true);
    QCOMPARE(shownColor(button), kPressed);
}

void KvBaseButtonIconTest::withoutColorsTheThemeRules()
{
    const SvgFile svg(QStringLiteral("#000000"));
    KvBaseButtonIcon button(svg.path());
    button.resize(40, 40);
    button.setCheckable(true);
    QCOMPARE(shownColor(button), themeColor("text"));
    button.setChecked(true);
    QCOMPARE(shownColor(button), themeColor("on-accent"));
    button.setChecked(false);
    button.setEnabled(false);
    const QColor text = themeColor("text");
    const QColor window = themeColor("window");
    // 40 % of the text's colour over the window's.
    QCOMPARE(shownColor(button).red(), (text.red() * 40 + window.red() * 60) / 100);
}

void KvBaseButtonIconTest::followsTheTheme()
{
    const SvgFile svg(QStringLiteral("#000000"));
    KvBaseButtonIcon button(svg.path());
    button.resize(40, 40);
    const QColor dark = shownColor(button);
    acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Light"));
    QCOMPARE(shownColor(button), themeColor("text"));
    QVERIFY(themeColor("text") != dark);
}

void KvBaseButtonIconTest::aNewIconIsShown()
{
    const SvgFile white(QStringLiteral("#ffffff"));
    const SvgFile red(QStringLiteral("#ff0000"));
    KvBaseButtonIcon button(white.path());
    button.resize(40, 40);
    button.setIconColors(Qt::white, Qt::white, Qt::white, Qt::white);
    QCOMPARE(shownColor(button), QColor(Qt::white));
    button.setIconPath(red.path());
    QCOMPARE(button.iconPath(), red.path());
    QCOMPARE(shownColor(button), QColor(Qt::red));
}

void KvBaseButtonIconTest::textMakesTheSize_data()
{
    QTest::addColumn<QString>("text");
    QTest::newRow("short") << QStringLiteral("Pie");
    QTest::newRow("long") << QStringLiteral("Minimum, median and maximum of every measured value");
}

void KvBaseButtonIconTest::textMakesTheSize()
{
    QFETCH(QString, text);
    const SvgFile svg(QStringLiteral("#ffffff"));
    KvBaseButtonIcon button(svg.path());
    button.setText(text);
    const QSize expected(button.fontMetrics().horizontalAdvance(text) + 82, 50);
    QCOMPARE(button.minimumSize(), expected);
    QCOMPARE(button.maximumSize(), expected);
}

void KvBaseButtonIconTest::textSizeOutranksTheStyleSheet()
{
    qApp->setStyleSheet(acss::QtAdvancedStylesheet::getInstance()->styleSheet());
    const SvgFile svg(QStringLiteral("#ffffff"));
    KvBaseButtonIcon button(svg.path());
    button.setText(QStringLiteral("Trend"));
    button.show();
    QVERIFY(QTest::qWaitForWindowExposed(&button));
    QCOMPARE(button.size(), QSize(button.fontMetrics().horizontalAdvance(QStringLiteral("Trend")) + 82, 50));
}

void KvBaseButtonIconTest::textStandsBesideTheIcon()
{
    const SvgFile svg(QStringLiteral("#ffffff"));
    KvBaseButtonIcon button(svg.path());
    button.setFlat(true);
    button.setIconColors(Qt::red, Qt::red, Qt::red, Qt::red);
    button.setText(QStringLiteral("Trend"));
    QPalette palette = button.palette();
    palette.setColor(QPalette::ButtonText, Qt::blue);
    palette.setColor(QPalette::Window, Qt::white);
    button.setPalette(palette);
    button.resize(button.minimumSize());
    const QImage picture = button.grab().toImage();
    int rightmostIcon = 0;
    int leftmostText = picture.width();
    for (int y = 0; y < picture.height(); ++y) {
        for (int x = 0; x < picture.width(); ++x) {
            const QColor color = picture.pixelColor(x, y);
            if (color == QColor(Qt::red))
                rightmostIcon = qMax(rightmostIcon, x);
            else if (color.blue() > 200 && color.red() < 60)
                leftmostText = qMin(leftmostText, x);
        }
    }
    QVERIFY(rightmostIcon > 0);
    QVERIFY(leftmostText < picture.width());
    QVERIFY2(leftmostText > rightmostIcon, "text over the icon");
}

void KvBaseButtonIconTest::focusIsVisible()
{
    const SvgFile svg(QStringLiteral("#ffffff"));
    KvBaseButtonIcon button(svg.path());
    button.setFlat(true);
    button.resize(40, 40);
    button.show();
    button.clearFocus();
    const QImage without = button.grab().toImage();
    button.activateWindow();
    button.setFocus();
    QTRY_VERIFY(button.hasFocus());
    const QImage with = button.grab().toImage();
    QCOMPARE(with.pixelColor(20, 0), themeColor("accent"));
    QVERIFY(without.pixelColor(20, 0) != themeColor("accent"));
}

STATREPORT_TEST_MAIN(KvBaseButtonIconTest)
#include "KvBaseButtonIconTest.moc"
