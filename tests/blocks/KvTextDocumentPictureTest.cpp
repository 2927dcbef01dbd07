// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "blocks/textdocument/KvTextDocumentPicture.h"

#include <QPixmap>

class KvTextDocumentPictureTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void writesAnImageElement();
    void keepsThreeTimesTheWidth_data();
    void keepsThreeTimesTheWidth();
    void givesUpOnNoPicture_data();
    void givesUpOnNoPicture();

private:
    static QPixmap picture(const QSize &size)
    {
        QPixmap pixmap(size);
        pixmap.fill(QColor(10, 200, 30));
        return pixmap;
    }
    /** Decodes the base64 text of an element. */
    static QImage decoded(const QString &html)
    {
        const QString marker = QStringLiteral("base64, ");
        const int begin = html.indexOf(marker) + marker.size();
        const int end = html.indexOf(QLatin1Char('"'), begin);
        return QImage::fromData(QByteArray::fromBase64(html.mid(begin, end - begin).toLatin1()), "PNG");
    }
};

void KvTextDocumentPictureTest::writesAnImageElement()
{
    const QString html =
        KvTextDocumentPicture::html(picture(QSize(20, 10)), 181, QStringLiteral("style=\"float:left;\""));
    QVERIFY2(html.startsWith(QStringLiteral(
                 "<img width=\"181\" style=\"float:left;\" src=\"data:image/png;base64, iVBOR")),
             qPrintable(html.left(100)));
    QVERIFY(html.endsWith(QStringLiteral("\" />")));
    QCOMPARE(html.count(QLatin1Char('<')), 1);
    const QImage image = decoded(html);
    QCOMPARE(image.size(), QSize(20, 10));
    QCOMPARE(image.pixelColor(3, 3), QColor(10, 200, 30));
    QCOMPARE(QLatin1String(KvTextDocumentPicture::NotFloating), QLatin1String("style=\"float:none;\""));
}

void KvTextDocumentPictureTest::keepsThreeTimesTheWidth_data()
{
    QTest::addColumn<QSize>("size");
    QTest::addColumn<int>("width");
    QTest::addColumn<QSize>("kept");
    QTest::newRow("small") << QSize(50, 40) << 181 << QSize(50, 40);
    QTest::newRow("three times") << QSize(300, 100) << 100 << QSize(300, 100);
    QTest::newRow("a pixel more") << QSize(301, 301) << 100 << QSize(300, 300);
    QTest::newRow("large") << QSize(1200, 600) << 100 << QSize(300, 150);
    QTest::newRow("tall") << QSize(600, 1200) << 100 << QSize(300, 600);
}

void KvTextDocumentPictureTest::keepsThreeTimesTheWidth()
{
    QFETCH(QSize, size);
    QFETCH(int, width);
    const QString html = KvTextDocumentPicture::html(picture(size), width, QString());
    QTEST(decoded(html).size(), "kept");
    QVERIFY(html.contains(QStringLiteral("width=\"%1\"").arg(width)));
}

void KvTextDocumentPictureTest::givesUpOnNoPicture_data()
{
    QTest::addColumn<QSize>("size");
    QTest::addColumn<int>("width");
    QTest::newRow("null") << QSize() << 100;
    QTest::newRow("no width") << QSize(10, 10) << 0;
}

void KvTextDocumentPictureTest::givesUpOnNoPicture()
{
    QFETCH(QSize, size);
    QFETCH(int, width);
    const QPixmap pixmap = size.isEmpty() ? QPixmap() : picture(size);
    QCOMPARE(KvTextDocumentPicture::html(pixmap, width, QString()), QString());
}

STATREPORT_TEST_MAIN(KvTextDocumentPictureTest)
#include "KvTextDocumentPictureTest.moc"
