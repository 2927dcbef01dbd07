// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "PanelProbe.h"
#include "blocks/common/KvRotationOptionsRow.h"
#include "gui/QtAdvancedStylesheet.h"
#include "resources/KvReportResources.h"

#include <QComboBox>

class KvRotationOptionsRowTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase() { KvReportResources::ensure(); }
    void offersQuarterTurns();
    void settingEmitsNothing_data();
    void settingEmitsNothing();
    void choosingEmits();
    void theIconFollowsTheTheme();
    void isExplained();
};

void KvRotationOptionsRowTest::offersQuarterTurns()
{
    const KvRotationOptionsRow row;
    const auto *box = row.findChild<QComboBox *>();
    QVERIFY(box);
    const QStringList texts{QStringLiteral("0°"), QStringLiteral("90°"), QStringLiteral("180°"),
                            QStringLiteral("270°")};
    QCOMPARE(box->count(), 4);
    for (int i = 0; i < 4; ++i) {
        QCOMPARE(box->itemText(i), texts.at(i));
        QCOMPARE(box->itemData(i), QVariant(90 * i));
    }
    QCOMPARE(box->currentIndex(), 0);
    QCOMPARE(row.angle(), 0);
}

void KvRotationOptionsRowTest::settingEmitsNothing_data()
{
    QTest::addColumn<int>("angle");
    QTest::addColumn<int>("index");
    QTest::newRow("0") << 0 << 0;
    QTest::newRow("90") << 90 << 1;
    QTest::newRow("180") << 180 << 2;
    QTest::newRow("270") << 270 << 3;
    QTest::newRow("45") << 45 << 0;
    QTest::newRow("360") << 360 << 0;
    QTest::newRow("-90") << -90 << 0;
}

void KvRotationOptionsRowTest::settingEmitsNothing()
{
    QFETCH(int, angle);
    QFETCH(int, index);
    KvRotationOptionsRow row;
    row.setAngle(180);
    row.setAngle(270);
    QSignalSpy chosen(&row, SIGNAL(signalAngleIndexChanged()));
    row.setAngle(angle);
    QCOMPARE(row.findChild<QComboBox *>()->currentIndex(), index);
    QCOMPARE(row.angle(), 90 * index);
    QCOMPARE(chosen.count(), 0);
}

void KvRotationOptionsRowTest::choosingEmits()
{
    KvRotationOptionsRow row;
    QVERIFY(PanelProbe::show(&row));
    QSignalSpy chosen(&row, SIGNAL(signalAngleIndexChanged()));
    auto *box = row.findChild<QComboBox *>();
    for (int i = 1; i < 4; ++i) {
        QTest::keyClick(box, Qt::Key_Down);
        QCOMPARE(chosen.count(), i);
        QCOMPARE(row.angle(), 90 * i);
    }
    QTest::keyClick(box, Qt::Key_Down); // the last already
    QCOMPARE(chosen.count(), 3);
    QTest::keyClick(box, Qt::Key_Home);
    QCOMPARE(row.angle(), 0);
    QCOMPARE(chosen.count(), 4);
}

void KvRotationOptionsRowTest::theIconFollowsTheTheme()
{
    auto *themes = acss::QtAdvancedStylesheet::getInstance();
    const KvRotationOptionsRow row;
    const auto *icon = row.findChild<QLabel *>();
    QVERIFY(icon);
    QCOMPARE(icon->size(), QSize(24, 24));
    const QImage dark = icon->pixmap(Qt::ReturnByValue).toImage();
    QVERIFY(!dark.isNull());
    QVERIFY(themes->setCurrentTheme(QStringLiteral("Light")));
    const QImage light = icon->pixmap(Qt::ReturnByValue).toImage();
    QVERIFY(themes->setCurrentTheme(QStringLiteral("Dark")));
    QVERIFY(light != dark);
    QCOMPARE(icon->pixmap(Qt::ReturnByValue).toImage(), dark);
}

void KvRotationOptionsRowTest::isExplained()
{
    const KvRotationOptionsRow row;
    const auto *box = row.findChild<QComboBox *>();
    QVERIFY(!box->toolTip().isEmpty());
    QVERIFY(!box->accessibleName().isEmpty());
}

STATREPORT_TEST_MAIN(KvRotationOptionsRowTest)
#include "KvRotationOptionsRowTest.moc"
