// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ItemByItem.h"
#include "SceneItems.h"
#include "charts/KvTextRunItem.h"
#include "support/RightToLeft.h"
#include <QBuffer>
#include <QGraphicsTextItem>
#include <QGraphicsView>
#include <QPainter>
#include <QPdfWriter>

using kvCharts::KvPlacedText;
using kvCharts::KvTextMeasure;
using kvCharts::KvTextRunItem;

class KvTextRunItemTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void looksLikeTextItems();
    void oneItemForMany();
    void documentsForOtherTexts();
    void nothingForNoTexts();
    void sizeIsTheSameOnAnyDevice_data();
    void sizeIsTheSameOnAnyDevice();
    void staysTextInPdf();
    void looksTheSameFromRightToLeft();
};

namespace {

QVector<KvPlacedText> placed(const QStringList &texts)
{
    KvTextMeasure measure(ItemByItem::font(11.0));
    QVector<KvPlacedText> result;
    for (const QString &text : texts) {
        const double place = 10.25 + 37.75 * result.size(); // in 1/64 unit, to which letters are placed
        result.append({text, QPointF(place, place), measure.measure(text)});
    }
    return result;
}

void addItems(QGraphicsScene *scene, const QVector<KvPlacedText> &texts)
{
    for (const KvPlacedText &text : texts)
        ItemByItem::addText(scene, text.text, text.topLeft, Qt::red);
}

const QStringList &sample()
{
    static const QStringList texts{QStringLiteral("0"),
                                   QStringLiteral("12.5"),
                                   QStringLiteral("Setosa"),
                                   QStringLiteral("AV To ."),
                                   QStringLiteral("L\u00e4nge \u03bc"),
                                   QStringLiteral("\u6f22\u5b57"),
                                   QString(),
                                   QStringLiteral("two\nlines"),
                                   QStringLiteral("\u05e2\u05d1 12")};
    return texts;
}

} // namespace

void KvTextRunItemTest::looksLikeTextItems()
{
    QGraphicsScene combined;
    QGraphicsScene single;
    KvTextRunItem::addTo(&combined, placed(sample()), ItemByItem::font(11.0), Qt::red);
    addItems(&single, placed(sample()));
    QVERIFY(ItemByItem::sameRect(combined.itemsBoundingRect(), single.itemsBoundingRect()));
    for (const QRectF &source : {QRectF(0, 0, 400, 400), QRectF(0, 0, 1100, 1100)}) {
        const QImage picture = ItemByItem::picture(&combined, source);
        QVERIFY(ItemByItem::inkedPixels(picture) > 500);
        QCOMPARE(ItemByItem::difference(picture, ItemByItem::picture(&single, source)), 0);
    }
}

void KvTextRunItemTest::oneItemForMany()
{
    QGraphicsScene scene;
    KvTextRunItem::addTo(&scene, placed({QStringLiteral("a"), QStringLiteral("b")}), ItemByItem::font(11.0),
                         Qt::red);
    QCOMPARE(scene.items().size(), 1);
    QCOMPARE(itemsOf<KvTextRunItem>(&scene).first()->texts().size(), 2);
    QCOMPARE(scene.items().first()->cacheMode(), QGraphicsItem::NoCache);
}

void KvTextRunItemTest::documentsForOtherTexts()
{
    QGraphicsScene scene;
    const auto texts = placed({QStringLiteral("a"), QStringLiteral("two\nlines")});
    KvTextRunItem::addTo(&scene, texts, ItemByItem::font(11.0), Qt::red);
    QCOMPARE(itemsOf<KvTextRunItem>(&scene).size(), 1);
    const auto documents = itemsOf<QGraphicsTextItem>(&scene);
    QCOMPARE(documents.size(), 1);
    QCOMPARE(documents.first()->toPlainText(), QStringLiteral("two\nlines"));
    QCOMPARE(documents.first()->defaultTextColor(), QColor(Qt::red));
    QCOMPARE(documents.first()->pos(), texts.last().topLeft);
}

void KvTextRunItemTest::nothingForNoTexts()
{
    QGraphicsScene scene;
    KvTextRunItem::addTo(&scene, {}, ItemByItem::font(11.0), Qt::red);
    QVERIFY(scene.items().isEmpty());
}

void KvTextRunItemTest::sizeIsTheSameOnAnyDevice_data()
{
    QTest::addColumn<int>("dotsPerMeter");
    QTest::newRow("screen") << 3780;
    QTest::newRow("printer") << 23622;
    QTest::newRow("coarse") << 1500;
}

void KvTextRunItemTest::sizeIsTheSameOnAnyDevice()
{
    QFETCH(int, dotsPerMeter);
    QGraphicsScene scene;
    KvTextRunItem::addTo(&scene, placed(sample()), ItemByItem::font(11.0), Qt::red);
    QImage image(400, 400, QImage::Format_ARGB32_Premultiplied);
    image.setDotsPerMeterX(dotsPerMeter);
    image.setDotsPerMeterY(dotsPerMeter);
    image.fill(Qt::white);
    QPainter painter(&image);
    scene.render(&painter, QRectF(0, 0, 400, 400), QRectF(0, 0, 400, 400));
    painter.end();
    QImage reference(400, 400, QImage::Format_ARGB32_Premultiplied);
    reference.fill(Qt::white);
    QGraphicsScene single;
    addItems(&single, placed(sample()));
    QPainter referencePainter(&reference);
    single.render(&referencePainter, QRectF(0, 0, 400, 400), QRectF(0, 0, 400, 400));
    referencePainter.end();
    QVERIFY(ItemByItem::inkedPixels(reference) > 300);
    // Another resolution hints the letters another way; a size of its own would move them by whole pixels.
    const int inked = ItemByItem::inkedPixels(image);
    QVERIFY(qAbs(inked - ItemByItem::inkedPixels(reference)) * 10 < inked);
}

void KvTextRunItemTest::staysTextInPdf()
{
    QGraphicsScene scene;
    KvTextRunItem::addTo(&scene, placed({QStringLiteral("flow")}), ItemByItem::font(11.0), Qt::red);
    QBuffer buffer;
    QVERIFY(buffer.open(QIODevice::WriteOnly));
    {
        QPdfWriter writer(&buffer);
        QPainter painter(&writer);
        scene.render(&painter);
    }
    QVERIFY(buffer.data().contains("/ToUnicode"));
    QVERIFY(!buffer.data().contains("/Subtype /Image"));
    QVERIFY(buffer.data().contains("/FontFile"));
}

void KvTextRunItemTest::looksTheSameFromRightToLeft()
{
    QGraphicsScene scene;
    KvTextRunItem::addTo(&scene, placed({QStringLiteral("11.421 mm"), QStringLiteral("Length (%)")}),
                         ItemByItem::font(11.0), Qt::red);
    const auto picture = [&scene]() {
        QGraphicsView view(&scene);
        view.setLayoutDirection(Qt::LeftToRight); // where the view itself has to begin
        view.resize(200, 200);
        return view.grab().toImage().convertToFormat(QImage::Format_ARGB32_Premultiplied);
    };
    const QImage expected = picture();
    QVERIFY(ItemByItem::inkedPixels(expected) > 100);
    const RightToLeft program;
    QCOMPARE(picture(), expected);
}

STATREPORT_TEST_MAIN(KvTextRunItemTest)
#include "KvTextRunItemTest.moc"
