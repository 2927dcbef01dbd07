// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "PanelProbe.h"
#include "blocks/common/KvAlignmentOptionsRow.h"
#include "gui/QtAdvancedStylesheet.h"
#include "gui/acss.h"

#include <QPushButton>
#include <QStyleOptionButton>

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
        for (QPushButton *button : PanelProbe::controls<QPushButton>(&row)) {
            QCOMPARE(button->size(), QSize(32, 32));
            QStyleOptionButton option;
            option.initFrom(button);
            option.features = QStyleOptionButton::None;
            option.state.setFlag(QStyle::State_HasFocus, focused);
            const QRect contents =
                button->style()->subElementRect(QStyle::SE_PushButtonContents, &option, button);
            QVERIFY(contents.contains(QRect(QPoint(4, 4), QSize(24, 24))));
        }
    }
    themes->setCurrentTheme(QStringLiteral("Dark"));
    qApp->setStyleSheet(QString());
}

STATREPORT_TEST_MAIN(KvAlignmentOptionsRowTest)
#include "KvAlignmentOptionsRowTest.moc"
