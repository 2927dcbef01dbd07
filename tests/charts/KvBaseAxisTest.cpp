// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ItemByItem.h"
#include "SceneItems.h"
#include "charts/KvAxisXCategories.h"
#include "charts/KvAxisXValues.h"
#include "charts/KvAxisYCategories.h"
#include "charts/KvAxisYValues.h"
#include "charts/KvChartThemes.h"
#include "support/MetaMethods.h"

using namespace kvCharts;

class KvBaseAxisTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void theOnlySignalOfParts();
    void classTree();
    void nothingToSetInTheBase();
    void drawsItsLine_data();
    void drawsItsLine();
    void autoRangeSetsRangeThenTicks();
};

namespace {

/// Records what autoRange() sets.
class RecordingAxis : public KvBaseAxisX
{
public:
    void setRange(double minimum, double maximum) override
    {
        log.append(QStringLiteral("range %1 %2").arg(minimum).arg(maximum));
    }
    void setTickCount(int count) override { log.append(QStringLiteral("ticks %1").arg(count)); }

    QStringList log;
};

} // namespace

void KvBaseAxisTest::theOnlySignalOfParts()
{
    QCOMPARE(ownMethods(KvBaseChartPart::staticMetaObject, QMetaMethod::Signal),
             QStringList(QStringLiteral("changed()")));
    QCOMPARE(KvAxisXValues().parent(), nullptr);
}

void KvBaseAxisTest::classTree()
{
    const auto basesOf = [](const QMetaObject &metaObject) {
        QStringList names;
        for (const QMetaObject *base = metaObject.superClass(); base; base = base->superClass())
            names.append(QString::fromLatin1(base->className()));
        return names.join(QLatin1Char(' '));
    };
    const QString x =
        QStringLiteral("kvCharts::KvBaseAxisX kvCharts::KvBaseAxis kvCharts::KvBaseChartPart QObject");
    const QString y =
        QStringLiteral("kvCharts::KvBaseAxisY kvCharts::KvBaseAxis kvCharts::KvBaseChartPart QObject");
    QCOMPARE(basesOf(KvAxisXValues::staticMetaObject), x);
    QCOMPARE(basesOf(KvAxisXCategories::staticMetaObject), x);
    QCOMPARE(basesOf(KvAxisYValues::staticMetaObject), y);
    QCOMPARE(basesOf(KvAxisYCategories::staticMetaObject), y);
}

void KvBaseAxisTest::nothingToSetInTheBase()
{
    KvBaseAxisX axis;
    QSignalSpy spy(&axis, SIGNAL(changed()));
    axis.setGridVisible(true);
    axis.setRange(1.0, 2.0);
    axis.setTickCount(3);
    axis.autoRange(0.0, 100.0);
    QCOMPARE(spy.count(), 0);
    QCOMPARE(axis.minimum(), 0.0);
    QCOMPARE(axis.maximum(), 0.0);
}

void KvBaseAxisTest::drawsItsLine_data()
{
    QTest::addColumn<bool>("alongX");
    QTest::addColumn<int>("theme");
    QTest::addColumn<QLineF>("line");
    QTest::addColumn<QString>("color");
    const QLineF x(0, 1000, 1000, 1000);
    const QLineF y(0, 1000, 0, 0);
    QTest::newRow("x dark") << true << 0 << x << QStringLiteral("#dcdcdc");
    QTest::newRow("x light") << true << 1 << x << QStringLiteral("#373737");
    QTest::newRow("y dark") << false << 0 << y << QStringLiteral("#dcdcdc");
    QTest::newRow("y light") << false << 1 << y << QStringLiteral("#373737");
}

void KvBaseAxisTest::drawsItsLine()
{
    QFETCH(bool, alongX);
    QFETCH(int, theme);
    QFETCH(QLineF, line);
    QFETCH(QString, color);
    KvChartThemes themes;
    themes.setTheme(static_cast<KvChartThemes::ThemeType>(theme));
    QGraphicsScene scene;
    KvBaseAxisX x;
    KvBaseAxisY y;
    KvBaseAxis *axis = alongX ? static_cast<KvBaseAxis *>(&x) : &y;
    axis->draw(&scene, &themes);
    QCOMPARE(scene.items().size(), 1);
    const QGraphicsLineItem *item = itemsOf<QGraphicsLineItem>(&scene).first();
    QCOMPARE(item->line(), line);
    QCOMPARE(item->pen().color().name(), color);
    QCOMPARE(item->pen().widthF(), 1.0);
    QVERIFY(item->pen().isCosmetic());
}

void KvBaseAxisTest::autoRangeSetsRangeThenTicks()
{
    RecordingAxis axis;
    axis.autoRange(3.0, 47.0);
    QCOMPARE(axis.log, QStringList({QStringLiteral("range 0 50"), QStringLiteral("ticks 11")}));
}

STATREPORT_TEST_MAIN(KvBaseAxisTest)
#include "KvBaseAxisTest.moc"
