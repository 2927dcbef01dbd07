// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "common/ZtAppStatus.h"
#include "gui/QtAdvancedStylesheet.h"
#include "gui/acss.h"

#include <QFile>
#include <QPainter>

using acss::QtAdvancedStylesheet;

namespace {

constexpr int toolMode = 6;
const QSize iconSize(24, 24);

/// The test icon fills the middle half of its square.
QImage imageOf(const QIcon &icon, QIcon::Mode mode, QIcon::State state, const QSize &size = iconSize)
{
    return icon.pixmap(size, mode, state).toImage().convertToFormat(QImage::Format_ARGB32);
}

bool isNear(const QColor &a, const QColor &b)
{
    // Premultiplied pixels round.
    const auto near = [](int x, int y) { return qAbs(x - y) <= 2; };
    return near(a.red(), b.red()) && near(a.green(), b.green()) && near(a.blue(), b.blue()) &&
           near(a.alpha(), b.alpha());
}

QIcon testIcon(int styleMode = toolMode)
{
    return acss::createIcon(styleMode, QStringLiteral("Icons/test-block"), iconSize);
}

} // namespace

class AcssTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void findsSvgFiles_data();
    void findsSvgFiles();
    void findsFilesOutsideTheResources();
    void searchPathsAreAdded();
    void tintsByState_data();
    void tintsByState();
    void otherModesAreTheSame_data();
    void otherModesAreTheSame();
    void followsTheTheme();
    void isSharpAtAnySize();
    void keepsItsProportions();
    void announcesItsSize();
    void paintsInPlace();
    void anEmptySizeGivesNothing();
    void pixmapsAreTheNormalState();
    void aMissingIconIsReportedOnce();
};

void AcssTest::init()
{
    StatReportTest::init();
    QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Dark"));
    ZtStatusLog::getInstance()->clear();
}

void AcssTest::findsSvgFiles_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("expected");
    const QString found = QStringLiteral(":/Icons/test-block.svg");
    QTest::newRow("without suffix") << QStringLiteral("Icons/test-block") << found;
    QTest::newRow("with suffix") << QStringLiteral("Icons/test-block.svg") << found;
    QTest::newRow("absolute") << QStringLiteral(":/Icons/test-block") << found;
    QTest::newRow("absolute with suffix") << found << found;
    QTest::newRow("missing") << QStringLiteral("Icons/no-such-icon") << QString();
    QTest::newRow("missing absolute") << QStringLiteral(":/Icons/no-such-icon.svg") << QString();
    QTest::newRow("folder") << QStringLiteral("Icons") << QString();
    QTest::newRow("empty") << QString() << QString();
}

void AcssTest::findsSvgFiles()
{
    QFETCH(QString, path);
    const QString found = acss::getPathSVG(path);
    QTEST(found, "expected");
}

void AcssTest::findsFilesOutsideTheResources()
{
    const QString file = temporaryPath(QStringLiteral("own.svg"));
    QVERIFY(QFile::copy(QStringLiteral(":/Icons/test-block.svg"), file));
    QCOMPARE(acss::getPathSVG(file), file);
    QVERIFY(!acss::createIcon(toolMode, file, iconSize).isNull());
}

void AcssTest::searchPathsAreAdded()
{
    QCOMPARE(acss::getPathSVG(QStringLiteral("Icons/test-elsewhere")), QString());
    acss::addIconSearchPath(QStringLiteral(":/elsewhere"));
    acss::addIconSearchPath(QStringLiteral(":/elsewhere/"));
    acss::addIconSearchPath(QString());
    QCOMPARE(acss::getPathSVG(QStringLiteral("Icons/test-elsewhere")),
             QStringLiteral(":/elsewhere/Icons/test-elsewhere.svg"));
    // Those that were there first come first.
    QCOMPARE(acss::getPathSVG(QStringLiteral("Icons/test-block")), QStringLiteral(":/Icons/test-block.svg"));
}

void AcssTest::tintsByState_data()
{
    QTest::addColumn<QString>("theme");
    QTest::addColumn<int>("mode");
    QTest::addColumn<int>("state");
    QTest::addColumn<QColor>("expected");
    const auto row = [](const char *name, const char *theme, QIcon::Mode mode, QIcon::State state,
                        const char *color) {
        QTest::newRow(name) << QString::fromLatin1(theme) << int(mode) << int(state)
                            << QColor(QLatin1String(color));
    };
    row("dark", "Dark", QIcon::Normal, QIcon::Off, "#f0f0f1");
    row("dark active", "Dark", QIcon::Active, QIcon::Off, "#f0f0f1");
    row("dark selected", "Dark", QIcon::Selected, QIcon::Off, "#ffffff");
    row("dark disabled", "Dark", QIcon::Disabled, QIcon::Off, "#66f0f0f1");
    row("dark on", "Dark", QIcon::Normal, QIcon::On, "#ffffff");
    row("dark on, disabled", "Dark", QIcon::Disabled, QIcon::On, "#66ffffff");
    row("light", "Light", QIcon::Normal, QIcon::Off, "#141414");
    row("light active", "Light", QIcon::Active, QIcon::Off, "#141414");
    row("light selected", "Light", QIcon::Selected, QIcon::Off, "#ffffff");
    row("light disabled", "Light", QIcon::Disabled, QIcon::Off, "#66141414");
    row("light on", "Light", QIcon::Active, QIcon::On, "#ffffff");
    row("light on, disabled", "Light", QIcon::Disabled, QIcon::On, "#66ffffff");
}

void AcssTest::tintsByState()
{
    QFETCH(QString, theme);
    QFETCH(int, mode);
    QFETCH(int, state);
    QFETCH(QColor, expected);
    QtAdvancedStylesheet::getInstance()->setCurrentTheme(theme);
    const QImage image =
        imageOf(testIcon(), static_cast<QIcon::Mode>(mode), static_cast<QIcon::State>(state));
    QCOMPARE(image.size(), iconSize);
    QVERIFY2(isNear(image.pixelColor(12, 12), expected),
             qPrintable(image.pixelColor(12, 12).name(QColor::HexArgb)));
    QCOMPARE(image.pixelColor(2, 2).alpha(), 0);
}

void AcssTest::otherModesAreTheSame_data()
{
    QTest::addColumn<int>("styleMode");
    for (const int mode : {-1, 0, 1, 5, 7, 1000})
        QTest::addRow("%d", mode) << mode;
}

void AcssTest::otherModesAreTheSame()
{
    QFETCH(int, styleMode);
    for (const QIcon::State state : {QIcon::Off, QIcon::On})
        QCOMPARE(imageOf(testIcon(styleMode), QIcon::Normal, state),
                 imageOf(testIcon(), QIcon::Normal, state));
}

void AcssTest::followsTheTheme()
{
    const QIcon icon = testIcon();
    const QIcon copy = icon;
    QVERIFY(isNear(imageOf(icon, QIcon::Normal, QIcon::Off).pixelColor(12, 12), QColor("#f0f0f1")));
    QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Light"));
    QVERIFY(isNear(imageOf(icon, QIcon::Normal, QIcon::Off).pixelColor(12, 12), QColor("#141414")));
    QVERIFY(isNear(imageOf(copy, QIcon::Normal, QIcon::Off).pixelColor(12, 12), QColor("#141414")));
}

void AcssTest::isSharpAtAnySize()
{
    const QImage image = imageOf(testIcon(), QIcon::Normal, QIcon::Off, QSize(96, 96));
    QCOMPARE(image.size(), QSize(96, 96));
    QCOMPARE(image.pixelColor(23, 48).alpha(), 0);
    QCOMPARE(image.pixelColor(24, 48).alpha(), 255);
    QCOMPARE(image.pixelColor(71, 48).alpha(), 255);
    QCOMPARE(image.pixelColor(72, 48).alpha(), 0);
}

void AcssTest::keepsItsProportions()
{
    const QImage image = imageOf(testIcon(), QIcon::Normal, QIcon::Off, QSize(32, 24));
    QCOMPARE(image.size(), QSize(32, 24));
    QCOMPARE(image.pixelColor(9, 12).alpha(), 0);
    QCOMPARE(image.pixelColor(10, 12).alpha(), 255);
    QCOMPARE(image.pixelColor(21, 12).alpha(), 255);
    QCOMPARE(image.pixelColor(22, 12).alpha(), 0);
    QCOMPARE(image.pixelColor(16, 5).alpha(), 0);
    QCOMPARE(image.pixelColor(16, 6).alpha(), 255);
}

void AcssTest::announcesItsSize()
{
    const QIcon icon = acss::createIcon(toolMode, QStringLiteral("Icons/test-block"), QSize(32, 24));
    QCOMPARE(icon.availableSizes(), QList<QSize>{QSize(32, 24)});
    QCOMPARE(acss::createIcon(toolMode, QStringLiteral("Icons/test-block"), QSize()).availableSizes(),
             QList<QSize>());
}

void AcssTest::paintsInPlace()
{
    QImage canvas(40, 40, QImage::Format_RGB32);
    canvas.fill(Qt::black);
    QPainter painter(&canvas);
    testIcon().paint(&painter, QRect(10, 10, 24, 24));
    painter.end();
    QCOMPARE(canvas.pixelColor(15, 22), QColor(Qt::black));
    QCOMPARE(canvas.pixelColor(16, 22), QColor("#f0f0f1"));
}

void AcssTest::anEmptySizeGivesNothing()
{
    QVERIFY(testIcon().pixmap(QSize(0, 10)).isNull());
    QVERIFY(acss::createPixmap(toolMode, QStringLiteral("Icons/test-block"), QSize()).isNull());
}

void AcssTest::pixmapsAreTheNormalState()
{
    const QPixmap pixmap = acss::createPixmap(toolMode, QStringLiteral("Icons/test-block"), iconSize);
    QCOMPARE(pixmap.size() / pixmap.devicePixelRatio(), iconSize);
    QVERIFY(isNear(pixmap.toImage().pixelColor(pixmap.width() / 2, pixmap.height() / 2), QColor("#f0f0f1")));
}

void AcssTest::aMissingIconIsReportedOnce()
{
    const QString path = QStringLiteral("Icons/absent");
    QVERIFY(acss::createIcon(toolMode, path, iconSize).isNull());
    QVERIFY(acss::createIcon(toolMode, path, iconSize).isNull());
    QVERIFY(acss::createPixmap(toolMode, path, iconSize).isNull());
    const QVector<ZtStatusEntry> entries = ZtStatusLog::getInstance()->entries();
    QCOMPARE(entries.size(), 1);
    QCOMPARE(entries.constFirst().category, int(ZtAppStatus::Warning));
    QVERIFY(entries.constFirst().message.contains(path));
}

STATREPORT_TEST_MAIN(AcssTest)
#include "AcssTest.moc"
