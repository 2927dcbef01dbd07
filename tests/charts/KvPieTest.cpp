// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "SceneItems.h"
#include "charts/KvChartThemes.h"
#include "charts/KvPie.h"
#include <QGraphicsTextItem>

using namespace kvCharts;

class KvPieTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void pens_data();
    void pens();
    void draws();
    void labelColors_data();
    void labelColors();
};

void KvPieTest::pens_data()
{
    QTest::addColumn<QColor>("outline");
    QTest::addColumn<QColor>("expected");
    QTest::newRow("given") << QColor(Qt::blue) << QColor(Qt::blue);
    QTest::newRow("invalid") << QColor() << QColor(Qt::white);
}

void KvPieTest::pens()
{
    QFETCH(QColor, outline);
    QFETCH(QColor, expected);
    const KvPie pie(QStringLiteral("a - 1"), {10.0, 20.0}, outline, Qt::green);
    QCOMPARE(pie.pen().color(), expected);
    QCOMPARE(pie.pen().widthF(), 2.0);
    QVERIFY(pie.pen().isCosmetic());
    QCOMPARE(pie.brush(), QBrush(Qt::green, Qt::SolidPattern));
    QCOMPARE(pie.startAngle(), 10.0);
    QCOMPARE(pie.spanAngle(), 20.0);
    QCOMPARE(pie.text(), QStringLiteral("a - 1"));
}

void KvPieTest::draws()
{
    const KvChartThemes themes;
    QGraphicsScene scene;
    KvPie pie(QStringLiteral("Grain - 5"), {0.0, 360.0}, QColor(), Qt::green);
    pie.draw(&scene, &themes);
    const QGraphicsPathItem *slice = itemsOf<QGraphicsPathItem>(&scene).first();
    QCOMPARE(slice->path(), KvPieGeometry::slicePath({0.0, 360.0}));
    QCOMPARE(slice->brush(), pie.brush());
    QCOMPARE(slice->pen(), pie.pen());
    const QGraphicsTextItem *label = itemsOf<QGraphicsTextItem>(&scene).first();
    QCOMPARE(label->toPlainText(), QStringLiteral("Grain - 5"));
    QCOMPARE(label->font().family(), QStringLiteral("Segoe UI"));
    QCOMPARE(label->font().pointSizeF(), 12.0);
    QCOMPARE(label->zValue(), 1.0);
    QCOMPARE(label->pos(), QPointF());
    // Half-way out towards 9 o'clock: the middle of a full circle is at 180 degrees.
    const QSizeF size = label->boundingRect().size();
    const QPointF expected(500 - (450 - size.width()) / 2, 500 + size.height() / 2);
    QVERIFY((label->mapToScene(QPointF(0, 0)) - expected).manhattanLength() < 1e-6);
}

void KvPieTest::labelColors_data()
{
    QTest::addColumn<int>("theme");
    QTest::addColumn<QString>("color");
    QTest::newRow("dark") << 0 << QStringLiteral("#ffffff");
    QTest::newRow("light") << 1 << QStringLiteral("#313131");
}

void KvPieTest::labelColors()
{
    QFETCH(int, theme);
    QFETCH(QString, color);
    KvChartThemes themes;
    themes.setTheme(static_cast<KvChartThemes::ThemeType>(theme));
    QGraphicsScene scene;
    KvPie(QStringLiteral("a - 1"), {0.0, 90.0}, QColor(), Qt::green).draw(&scene, &themes);
    QCOMPARE(itemsOf<QGraphicsTextItem>(&scene).first()->defaultTextColor().name(), color);
}

STATREPORT_TEST_MAIN(KvPieTest)
#include "KvPieTest.moc"
