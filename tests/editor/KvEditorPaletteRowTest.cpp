// SPDX-License-Identifier: MIT
#include "editor/KvEditorPaletteRow.h"
#include "gui/QtAdvancedStylesheet.h"
#include "gui/acss.h"
#include "support/StatReportTest.h"

#include <QLabel>

namespace {

QColor themeColor(const char *name)
{
    return acss::QtAdvancedStylesheet::getInstance()->color(QLatin1String(name));
}

QImage pictureOf(const QLabel *label)
{
    return label->pixmap(Qt::ReturnByValue).toImage();
}

/// Icon, name and mark.
QList<QLabel *> labelsOf(const KvEditorPaletteRow &row)
{
    return row.findChildren<QLabel *>();
}

bool holdsColor(const QImage &image, const QColor &color)
{
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (image.pixelColor(x, y) == color)
                return true;
        }
    }
    return false;
}

} // namespace

class KvEditorPaletteRowTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();

    void showsTextAndName();
    void showsIconAndMark();
    void iconsFollowTheTheme();
    void keysActivate_data();
    void keysActivate();
    void aHeldKeyActivatesOnce();
    void aClickActivates();
    void aReleaseOutsideDoesNot();
    void otherButtonsDoNot();
    void hoverIsVisible();
    void focusIsVisibleAndNotTakenByTheMouse();
};

void KvEditorPaletteRowTest::cleanup()
{
    acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Dark"));
    StatReportTest::cleanup();
}

void KvEditorPaletteRowTest::showsTextAndName()
{
    KvEditorPaletteRow row;
    row.setText(QStringLiteral("Image View"));
    QCOMPARE(row.text(), QStringLiteral("Image View"));
    QCOMPARE(row.accessibleName(), QStringLiteral("Image View"));
    QCOMPARE(labelsOf(row).at(1)->text(), QStringLiteral("Image View"));
}

void KvEditorPaletteRowTest::showsIconAndMark()
{
    KvEditorPaletteRow row;
    row.setIcon(acss::createIcon(6, QStringLiteral("Icons/ToolIconText.svg"), QSize(24, 24)));
    row.setMark(QStringLiteral("Icons/arrow-down"), QSize(11, 7));
    QCOMPARE(row.markPath(), QStringLiteral("Icons/arrow-down"));
    const QImage icon = pictureOf(labelsOf(row).at(0));
    QCOMPARE(icon.size(), QSize(24, 24) * row.devicePixelRatioF());
    QVERIFY(holdsColor(icon, themeColor("text")));
    const QImage mark = pictureOf(labelsOf(row).at(2));
    QCOMPARE(mark.size(), QSize(11, 7) * row.devicePixelRatioF());
    row.setIcon(QIcon());
    QVERIFY(pictureOf(labelsOf(row).at(0)).isNull());
}

void KvEditorPaletteRowTest::iconsFollowTheTheme()
{
    KvEditorPaletteRow row;
    row.setIcon(acss::createIcon(6, QStringLiteral("Icons/ToolIconText.svg"), QSize(24, 24)));
    row.setMark(QStringLiteral("Icons/ToolIconDots.svg"), QSize(24, 24));
    acss::QtAdvancedStylesheet::getInstance()->setCurrentTheme(QStringLiteral("Light"));
    QVERIFY(holdsColor(pictureOf(labelsOf(row).at(0)), themeColor("text")));
    QCOMPARE(pictureOf(labelsOf(row).at(2)), acss::createPixmap(6, row.markPath(), QSize(24, 24)).toImage());
}

void KvEditorPaletteRowTest::keysActivate_data()
{
    QTest::addColumn<int>("key");
    QTest::addColumn<int>("activations");
    QTest::newRow("space") << int(Qt::Key_Space) << 1;
    QTest::newRow("return") << int(Qt::Key_Return) << 1;
    QTest::newRow("enter") << int(Qt::Key_Enter) << 1;
    QTest::newRow("letter") << int(Qt::Key_A) << 0;
    QTest::newRow("escape") << int(Qt::Key_Escape) << 0;
}

void KvEditorPaletteRowTest::keysActivate()
{
    QFETCH(int, key);
    KvEditorPaletteRow row;
    QSignalSpy activated(&row, SIGNAL(signalActivated()));
    QTest::keyClick(&row, static_cast<Qt::Key>(key));
    QTEST(activated.count(), "activations");
}

void KvEditorPaletteRowTest::aHeldKeyActivatesOnce()
{
    KvEditorPaletteRow row;
    QSignalSpy activated(&row, SIGNAL(signalActivated()));
    for (const bool isRepeat : {false, true, true}) {
        QKeyEvent event(QEvent::KeyPress, Qt::Key_Return, Qt::NoModifier, QString(), isRepeat);
        QCoreApplication::sendEvent(&row, &event);
    }
    QCOMPARE(activated.count(), 1);
}

void KvEditorPaletteRowTest::aClickActivates()
{
    KvEditorPaletteRow row;
    row.resize(200, 32);
    QSignalSpy activated(&row, SIGNAL(signalActivated()));
    QTest::mousePress(&row, Qt::LeftButton);
    QCOMPARE(activated.count(), 0);
    QTest::mouseRelease(&row, Qt::LeftButton);
    QCOMPARE(activated.count(), 1);
}

void KvEditorPaletteRowTest::aReleaseOutsideDoesNot()
{
    KvEditorPaletteRow row;
    row.resize(200, 32);
    QSignalSpy activated(&row, SIGNAL(signalActivated()));
    QTest::mousePress(&row, Qt::LeftButton);
    QTest::mouseRelease(&row, Qt::LeftButton, Qt::NoModifier, QPoint(100, 60));
    QCOMPARE(activated.count(), 0);
}

void KvEditorPaletteRowTest::otherButtonsDoNot()
{
    KvEditorPaletteRow row;
    row.resize(200, 32);
    QSignalSpy activated(&row, SIGNAL(signalActivated()));
    QTest::mouseClick(&row, Qt::RightButton);
    QTest::mouseClick(&row, Qt::MiddleButton);
    QCOMPARE(activated.count(), 0);
}

void KvEditorPaletteRowTest::hoverIsVisible()
{
    KvEditorPaletteRow row;
    row.resize(200, 32);
    QVERIFY(row.grab().toImage().pixelColor(100, 16) != themeColor("raised-hover"));
    row.setAttribute(Qt::WA_UnderMouse);
    QCOMPARE(row.grab().toImage().pixelColor(100, 16), themeColor("raised-hover"));
    QVERIFY2(row.testAttribute(Qt::WA_Hover), "repainted when the mouse comes and goes");
}

void KvEditorPaletteRowTest::focusIsVisibleAndNotTakenByTheMouse()
{
    KvEditorPaletteRow row;
    row.resize(200, 32);
    row.show();
    row.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&row));
    row.clearFocus();
    QTest::mouseClick(&row, Qt::LeftButton);
    QVERIFY(!row.hasFocus());
    QVERIFY(row.focusPolicy() & Qt::TabFocus);
    row.setFocus(Qt::TabFocusReason);
    QTRY_VERIFY(row.hasFocus());
    QCOMPARE(row.grab().toImage().pixelColor(100, 0), themeColor("accent"));
}

STATREPORT_TEST_MAIN(KvEditorPaletteRowTest)
#include "KvEditorPaletteRowTest.moc"
