// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "PanelProbe.h"
#include "blocks/common/KvAlignmentOptionsRow.h"
#include "gui/QtAdvancedStylesheet.h"
#include "gui/acss.h"

#include <QPainter>
#include <QPushButton>

namespace {

/** What an icon covers of its square. */
QRect strokesOf(const QImage &icon)
{
    QRect strokes;
    for (int y = 0; y < icon.height(); ++y) {
        for (int x = 0; x < icon.width(); ++x) {
            if (icon.pixelColor(x, y).alpha() > 0)
                strokes |= QRect(x, y, 1, 1);
        }
    }
    return strokes;
}

/** The button as it is without its icon, and the whole of \a icon drawn on it. */
QImage drawnByHand(QPushButton *button, const QPixmap &icon)
{
    const QIcon own = button->icon();
    button->setIcon(QIcon());
    QImage image = button->grab().toImage();
    button->setIcon(own);
    QPainter(&image).drawPixmap(0, 0, icon);
    return image;
}

} // namespace

class KvAlignmentOptionsRowTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();
    void hasThreeButtonsWithTheirIcons();
    void checksTheButtonOfAnAlignment_data();
    void checksTheButtonOfAnAlignment();
    void clicksAreForwarded_data();
    void clicksAreForwarded();
    void iconsAreWhole_data();
    void iconsAreWhole();
};

void KvAlignmentOptionsRowTest::initTestCase()
{
    acss::addIconSearchPath(QStringLiteral(":/blocktest"));
}

void KvAlignmentOptionsRowTest::hasThreeButtonsWithTheirIcons()
{
    KvAlignmentOptionsRow row;
    row.show();
    QVERIFY(QTest::qWaitForWindowExposed(&row));
    const auto buttons = PanelProbe::controls<QPushButton>(&row);
    QCOMPARE(buttons.size(), 3);
    const QStringList paths{QStringLiteral("Icons/IconAlignLeft.svg"),
                            QStringLiteral("Icons/IconAlignCenter.svg"),
                            QStringLiteral("Icons/IconAlignRight.svg")};
    const QSize size(24, 24);
    QList<QImage> images;
    for (int i = 0; i < 3; ++i) {
        QVERIFY(buttons.at(i)->isCheckable());
        QCOMPARE(buttons.at(i)->iconSize(), size);
        QVERIFY(!buttons.at(i)->toolTip().isEmpty());
        const QImage image = buttons.at(i)->icon().pixmap(size).toImage();
        QVERIFY(!image.isNull());
        QCOMPARE(image, acss::createIcon(6, paths.at(i), size).pixmap(size).toImage());
        QVERIFY(!images.contains(image));
        images.append(image);
    }
}

void KvAlignmentOptionsRowTest::checksTheButtonOfAnAlignment_data()
{
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("checked");
    QTest::newRow("left") << 1 << 0;
    QTest::newRow("right") << 2 << 2;
    QTest::newRow("centred") << 4 << 1;
    QTest::newRow("centred both ways") << 132 << 1;
    QTest::newRow("left, vertically centred") << 129 << 0;
    QTest::newRow("right, vertically centred") << 130 << 2;
    QTest::newRow("centred wins") << 7 << 1;
    QTest::newRow("none") << 128 << -1;
    QTest::newRow("nothing at all") << 0 << -1;
}

void KvAlignmentOptionsRowTest::checksTheButtonOfAnAlignment()
{
    QFETCH(int, alignment);
    QFETCH(int, checked);
    KvAlignmentOptionsRow row;
    QSignalSpy left(&row, SIGNAL(signalLeftClicked()));
    QSignalSpy center(&row, SIGNAL(signalCenterClicked()));
    QSignalSpy right(&row, SIGNAL(signalRightClicked()));
    row.setAlignment(Qt::AlignRight);
    row.setAlignment(Qt::AlignLeft);
    row.setAlignment(Qt::Alignment(alignment));
    const auto buttons = row.findChildren<QPushButton *>();
    for (int i = 0; i < 3; ++i)
        QCOMPARE(buttons.at(i)->isChecked(), i == checked);
    QCOMPARE(left.count() + center.count() + right.count(), 0);
}

void KvAlignmentOptionsRowTest::clicksAreForwarded_data()
{
    QTest::addColumn<int>("button");
    QTest::newRow("left") << 0;
    QTest::newRow("centre") << 1;
    QTest::newRow("right") << 2;
}

void KvAlignmentOptionsRowTest::clicksAreForwarded()
{
    QFETCH(int, button);
    KvAlignmentOptionsRow row;
    QVERIFY(PanelProbe::show(&row));
    QSignalSpy left(&row, SIGNAL(signalLeftClicked()));
    QSignalSpy center(&row, SIGNAL(signalCenterClicked()));
    QSignalSpy right(&row, SIGNAL(signalRightClicked()));
    PanelProbe::click(PanelProbe::controls<QPushButton>(&row).at(button));
    QCOMPARE(left.count(), button == 0 ? 1 : 0);
    QCOMPARE(center.count(), button == 1 ? 1 : 0);
    QCOMPARE(right.count(), button == 2 ? 1 : 0);
}

void KvAlignmentOptionsRowTest::iconsAreWhole_data()
{
    QTest::addColumn<QString>("theme");
    QTest::addColumn<bool>("focused");
    for (const QString &theme : acss::QtAdvancedStylesheet::getInstance()->themes()) {
        QTest::addRow("%s", qPrintable(theme)) << theme << false;
        QTest::addRow("%s, focused", qPrintable(theme)) << theme << true;
    }
}

void KvAlignmentOptionsRowTest::iconsAreWhole()
{
    QFETCH(QString, theme);
    QFETCH(bool, focused);
    auto *themes = acss::QtAdvancedStylesheet::getInstance();
    themes->setCurrentTheme(theme);
    themes->applyTo(qApp);
    {
        KvAlignmentOptionsRow row;
        QVERIFY(PanelProbe::show(&row));
        row.activateWindow();
        for (QPushButton *button : PanelProbe::controls<QPushButton>(&row)) {
            QCOMPARE(button->size(), QSize(24, 24));
            if (focused)
                button->setFocus();
            else
                button->clearFocus();
            QTRY_COMPARE(button->hasFocus(), focused);
            const QPixmap icon =
                button->icon().pixmap(button->size(), focused ? QIcon::Active : QIcon::Normal);
            QCOMPARE(button->grab().toImage(), drawnByHand(button, icon));
            // Frame and focus ring stay clear of its strokes.
            const QRect strokes = strokesOf(icon.toImage());
            QVERIFY(!strokes.isEmpty());
            QVERIFY(button->rect().adjusted(2, 2, -2, -2).contains(strokes));
        }
    }
    themes->setCurrentTheme(QStringLiteral("Dark"));
    qApp->setStyleSheet(QString());
}

STATREPORT_TEST_MAIN(KvAlignmentOptionsRowTest)
#include "KvAlignmentOptionsRowTest.moc"
