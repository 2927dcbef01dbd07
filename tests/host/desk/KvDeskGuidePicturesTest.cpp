// SPDX-License-Identifier: MIT
#include "KvDeskGuidePictures.h"

#include "GuideFile.h"

#include <QPainter>
#include <QTextDocument>
#include <QTextImageFormat>

class KvDeskGuidePicturesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();
    void neverWiderThanTheText_data();
    void neverWiderThanTheText();
    void missingPictureTakesNoRoom();
    void isDrawn();

private:
    static QTextImageFormat format(const QString &name);

    QString m_folder;
};

void KvDeskGuidePicturesTest::initTestCase()
{
    m_folder = QFileInfo(GuideFile::create()).absolutePath();
}

QTextImageFormat KvDeskGuidePicturesTest::format(const QString &name)
{
    QTextImageFormat image;
    image.setName(name);
    return image;
}

void KvDeskGuidePicturesTest::neverWiderThanTheText_data()
{
    QTest::addColumn<int>("pageWidth");
    QTest::addColumn<QSizeF>("size");
    QTest::newRow("narrow") << 424 << QSizeF(400, 200);
    QTest::newRow("exactly") << 2024 << QSizeF(2000, 1000);
    QTest::newRow("wide") << 5000 << QSizeF(2000, 1000);
    QTest::newRow("not laid out yet") << -1 << QSizeF(2000, 1000);
}

void KvDeskGuidePicturesTest::neverWiderThanTheText()
{
    QFETCH(int, pageWidth);
    QFETCH(QSizeF, size);
    QTextDocument document;
    document.setDocumentMargin(10);
    document.setPageSize(QSizeF(pageWidth, -1));
    KvDeskGuidePictures pictures(m_folder);
    QCOMPARE(pictures.intrinsicSize(&document, 0, format(QStringLiteral("pictures/wide.png"))), size);
}

void KvDeskGuidePicturesTest::missingPictureTakesNoRoom()
{
    QTextDocument document;
    KvDeskGuidePictures pictures(m_folder);
    QCOMPARE(pictures.intrinsicSize(&document, 0, format(QStringLiteral("pictures/none.png"))), QSizeF(0, 0));
}

void KvDeskGuidePicturesTest::isDrawn()
{
    QTextDocument document;
    QImage paper(100, 100, QImage::Format_RGB32);
    paper.fill(Qt::white);
    QPainter painter(&paper);
    KvDeskGuidePictures pictures(m_folder);
    pictures.drawObject(&painter, QRectF(20, 20, 40, 20), &document, 0,
                        format(QStringLiteral("pictures/wide.png")));
    painter.end();
    QCOMPARE(paper.pixelColor(40, 30), QColor(Qt::red));
    QCOMPARE(paper.pixelColor(40, 50), QColor(Qt::white));
}

STATREPORT_TEST_MAIN(KvDeskGuidePicturesTest)
#include "KvDeskGuidePicturesTest.moc"
