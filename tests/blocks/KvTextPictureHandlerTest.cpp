// SPDX-License-Identifier: MIT
#include "blocks/textdocument/KvTextPictureHandler.h"
#include "blocks/textdocument/KvTextDocumentPicture.h"
#include "support/StatReportTest.h"

#include <QAbstractTextDocumentLayout>
#include <QPainter>
#include <QTextDocument>

namespace {

constexpr int kTextWidth = 700;

QPixmap samplePicture(int width, int height)
{
    QPixmap pixmap(width, height);
    pixmap.fill(Qt::blue);
    QPainter painter(&pixmap);
    painter.fillRect(0, 0, width / 2, height / 2, Qt::red);
    return pixmap;
}

QString sampleUrl()
{
    const QString html = KvTextDocumentPicture::html(samplePicture(60, 40), 60, QString());
    return html.section(QLatin1Char('"'), 3, 3);
}

void prepare(QTextDocument &document, const QString &html)
{
    document.documentLayout()->setPaintDevice(nullptr);
    document.setHtml(html);
    document.setTextWidth(kTextWidth);
}

QImage drawn(QTextDocument &document)
{
    QImage image(kTextWidth, 400, QImage::Format_ARGB32);
    image.fill(Qt::white);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    document.drawContents(&painter);
    return image;
}

} // namespace

class KvTextPictureHandlerTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void looksLikeQtsOwn_data();
    void looksLikeQtsOwn();
    void typingBesideALargePictureIsQuick();
};

void KvTextPictureHandlerTest::looksLikeQtsOwn_data()
{
    QTest::addColumn<QString>("html");
    const QString url = sampleUrl();
    QVERIFY(url.startsWith(QStringLiteral("data:image/png;base64, ")));
    QTest::newRow("natural size") << QStringLiteral("<p>a<img src=\"%1\">b</p>").arg(url);
    QTest::newRow("width") << QStringLiteral("<p>a<img width=\"181\" src=\"%1\">b</p>").arg(url);
    QTest::newRow("height") << QStringLiteral("<p>a<img height=\"33\" src=\"%1\">b</p>").arg(url);
    QTest::newRow("both") << QStringLiteral("<p>a<img width=\"50\" height=\"90\" src=\"%1\">b</p>").arg(url);
    QTest::newRow("left")
        << QStringLiteral("<p>a<img width=\"90\" style=\"float:left;\" src=\"%1\">b</p>").arg(url);
    QTest::newRow("right")
        << QStringLiteral("<p>a<img width=\"90\" style=\"float:right;\" src=\"%1\">b</p>").arg(url);
    QTest::newRow("twice") << QStringLiteral("<p><img src=\"%1\"><img width=\"20\" src=\"%1\"></p>").arg(url);
    QTest::newRow("rubbish") << QStringLiteral("<p>a<img src=\"data:image/png;base64, no\">b</p>");
    QTest::newRow("no source") << QStringLiteral("<p>a<img>b</p>");
    QTest::newRow("a file") << QStringLiteral("<p>a<img width=\"200\" src=\"%1\">b</p>")
                                   .arg(sourcePath(QStringLiteral("examples/pictures/plate.png")));
    QTest::newRow("no such file") << QStringLiteral("<p>a<img width=\"200\" src=\"/nowhere/x.png\">b</p>");
}

void KvTextPictureHandlerTest::looksLikeQtsOwn()
{
    QFETCH(QString, html);
    QTextDocument qts;
    prepare(qts, html);
    QTextDocument ours;
    KvTextPictureHandler handler;
    ours.documentLayout()->registerHandler(QTextFormat::ImageObject, &handler);
    prepare(ours, html);
    QCOMPARE(ours.size(), qts.size());
    QCOMPARE(drawn(ours), drawn(qts));
}

void KvTextPictureHandlerTest::typingBesideALargePictureIsQuick()
{
    // Noise does not compress: about a megabyte of text.
    QImage noise(500, 500, QImage::Format_RGB32);
    quint32 state = 1;
    for (int y = 0; y < noise.height(); ++y) {
        for (int x = 0; x < noise.width(); ++x) {
            state = state * 1664525u + 1013904223u;
            noise.setPixel(x, y, qRgb(state >> 24, (state >> 16) & 255, (state >> 8) & 255));
        }
    }
    const QString html = QStringLiteral("<p>a%1b</p>")
                             .arg(KvTextDocumentPicture::html(QPixmap::fromImage(noise), 200, QString()));
    QVERIFY(html.size() > 500000);
    const auto fastestEdit = [&html](QTextDocument &document) {
        prepare(document, html);
        drawn(document);
        qint64 fastest = std::numeric_limits<qint64>::max();
        for (int i = 0; i < 10; ++i) {
            QElapsedTimer timer;
            timer.start();
            QTextCursor(&document).insertText(QStringLiteral("x"));
            document.size();
            fastest = qMin(fastest, timer.nsecsElapsed());
        }
        return fastest;
    };
    QTextDocument qts;
    const qint64 qtsTime = fastestEdit(qts);
    QTextDocument ours;
    KvTextPictureHandler handler;
    ours.documentLayout()->registerHandler(QTextFormat::ImageObject, &handler);
    const qint64 oursTime = fastestEdit(ours);
    QVERIFY2(oursTime * 3 < qtsTime,
             qPrintable(QStringLiteral("%1 against %2 ns").arg(oursTime).arg(qtsTime)));
}

STATREPORT_TEST_MAIN(KvTextPictureHandlerTest)

#include "KvTextPictureHandlerTest.moc"
