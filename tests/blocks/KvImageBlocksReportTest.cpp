// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvCameraImageSource.h"
#include "KvImageSamples.h"
#include "blocks/KvReportBlocks.h"
#include "data/KvReportKernelData.h"
#include "report/KvReportNode.h"
#include "report/KvReportPagedView.h"
#include "report/KvReportPrinter.h"
#include "report/PdfFile.h"
#include "templates/KvBaseEditorNodeFactory.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvTemplateModel.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

using KvImageSamples::areaOf;
using KvImageSamples::pixels;

namespace {

QJsonObject imageBlock(const QPixmap &picture, int alignment, int percent, int rotation)
{
    const QJsonObject config{{"imgPath", "/gone.png"},
                             {"alignment", QString::number(alignment)},
                             {"widthPercent", QString::number(percent)},
                             {"rotationAngles", QString::number(rotation)},
                             {"imgData", KvImageSamples::base64(picture)}};
    return {{"name", "Image View"}, {"config", config}};
}

QJsonObject cameraBlock(bool renderMeasurements, int percent)
{
    const QJsonObject config{{"alignment", "1"},
                             {"widthPercent", QString::number(percent)},
                             {"renderMeasurements", renderMeasurements},
                             {"rotationAngles", "0"}};
    return {{"name", "Camera Image View"}, {"config", config}};
}

QString templateFile(const QJsonArray &nodes)
{
    QFile file(StatReportTest::temporaryPath(QStringLiteral("pictures.rtp")));
    file.open(QIODevice::WriteOnly);
    file.write(
        QJsonDocument(QJsonObject{{"config", QJsonObject{{"pageWidth", 1000}}}, {"nodes", nodes}}).toJson());
    return file.fileName();
}

QJsonArray savedNodes(const QString &path)
{
    QFile file(path);
    file.open(QIODevice::ReadOnly);
    return QJsonDocument::fromJson(file.readAll()).object().value(QStringLiteral("nodes")).toArray();
}

QString pdfPath()
{
    return StatReportTest::temporaryPath(QStringLiteral("pictures.pdf"));
}

} // namespace

/** Blocks with pictures on their way from the template's file to the PDF, without any window. */
class KvImageBlocksReportTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void blockTypesAreInOrder();
    void picturesArePrintedLosslessly_data();
    void picturesArePrintedLosslessly();
    void picturesStandWhereTheyShould();
    void theCameraIsPrinted_data();
    void theCameraIsPrinted();
    void bothBlocksTogether();
    void theCameraOfASecondPrintIsNew();
    void reloadingKeepsTheWish();
    void savingAndLoadingGivesTheSame();
    void aRefusedBlockStopsTheLoad_data();
    void aRefusedBlockStopsTheLoad();
    void missingPicturesPrintThePlaceholder();
    void aTallPictureFillsAPage();
    void viewsFollowSeveralCameras();

private:
    bool loadAndPrint(const QJsonArray &nodes)
    {
        if (!m_model->load(templateFile(nodes)))
            return false;
        m_model->beginLiveUpdates();
        const bool isPrinted = m_model->print(pdfPath()) == 1;
        m_model->endLiveUpdates();
        return isPrinted;
    }

    std::unique_ptr<KvCameraImageSource> m_camera;
    std::unique_ptr<KvReportKernelData> m_data;
    KvBlockTypeList m_blocks;
    std::unique_ptr<KvTemplateModel> m_model;
};

void KvImageBlocksReportTest::init()
{
    StatReportTest::init();
    if (m_blocks.blockTypes().isEmpty())
        registerReportBlocks(m_blocks);
    m_camera = std::make_unique<KvCameraImageSource>(QSize(64, 48));
    m_data = std::make_unique<KvReportKernelData>();
    m_model = std::make_unique<KvTemplateModel>(nullptr, m_data.get());
    m_model->setFactories(&m_blocks);
}

void KvImageBlocksReportTest::cleanup()
{
    m_model.reset();
    m_data.reset();
    m_camera.reset();
    StatReportTest::cleanup();
}

void KvImageBlocksReportTest::blockTypesAreInOrder()
{
    QStringList names;
    for (const KvBlockType &type : m_blocks.blockTypes()) {
        if (type.group.title.isEmpty())
            names.append(type.factory->name());
    }
    QCOMPARE(names, QStringList({"Image View", "Camera Image View", "Text Document", "Measurement table"}));
}

void KvImageBlocksReportTest::picturesArePrintedLosslessly_data()
{
    QTest::addColumn<int>("rotation");
    QTest::addColumn<int>("percent");
    QTest::addColumn<QSize>("size");
    QTest::newRow("smaller than its pixels") << 0 << 10 << QSize(500, 310);
    QTest::newRow("enlarged") << 0 << 100 << QSize(500, 310);
    QTest::newRow("a quarter turn") << 90 << 10 << QSize(310, 500);
    QTest::newRow("upside down") << 180 << 50 << QSize(500, 310);
}

void KvImageBlocksReportTest::picturesArePrintedLosslessly()
{
    QFETCH(int, rotation);
    QFETCH(int, percent);
    QFETCH(QSize, size);
    const QPixmap noise = KvImageSamples::noise(QSize(500, 310));
    QVERIFY(loadAndPrint({imageBlock(noise, 132, percent, rotation)}));
    const PdfFile pdf(pdfPath());
    QVERIFY(pdf.isSound());
    QCOMPARE(pdf.pageCount(), 1);
    const QVector<PdfPicture> pictures = pdf.pictures();
    QCOMPARE(pictures.size(), 1);
    QCOMPARE(pictures.first().size, size);
    QCOMPARE(pictures.first().encoding, QStringLiteral("image"));
    const QImage expected = noise.toImage().transformed(QTransform().rotate(rotation));
    QCOMPARE(pdf.firstPicture().convertToFormat(QImage::Format_RGB32),
             expected.convertToFormat(QImage::Format_RGB32));
}

void KvImageBlocksReportTest::picturesStandWhereTheyShould()
{
    const QPixmap red = KvImageSamples::plain(QSize(40, 20), Qt::red);
    const QPixmap blue = KvImageSamples::plain(QSize(40, 20), Qt::blue);
    QVERIFY(loadAndPrint({imageBlock(red, 2, 50, 0), imageBlock(blue, 1, 20, 90)}));
    const int dpi = 96;
    const QImage page = PdfFile(pdfPath()).rendered(0, dpi);
    const double scale = page.width() / 1000.0; // of a page of 1000
    const auto isNear = [scale](const QRect &found, const QRect &wanted) {
        return qAbs(found.left() - wanted.left() * scale) < 3 &&
               qAbs(found.top() - wanted.top() * scale) < 3 &&
               qAbs(found.width() - wanted.width() * scale) < 3 &&
               qAbs(found.height() - wanted.height() * scale) < 3;
    };
    QVERIFY(isNear(areaOf(page, Qt::red), QRect(120 + 380, 20, 380, 190)));
    QVERIFY(isNear(areaOf(page, Qt::blue), QRect(120, 20 + 190 + 1, 152, 304)));
}

void KvImageBlocksReportTest::theCameraIsPrinted_data()
{
    QTest::addColumn<bool>("renderMeasurements");
    QTest::newRow("plain") << false;
    QTest::newRow("with measurements") << true;
}

void KvImageBlocksReportTest::theCameraIsPrinted()
{
    QFETCH(bool, renderMeasurements);
    QVERIFY(loadAndPrint({cameraBlock(renderMeasurements, 50)}));
    const PdfFile pdf(pdfPath());
    const QVector<PdfPicture> pictures = pdf.pictures();
    QCOMPARE(pictures.size(), 1);
    QCOMPARE(pictures.first().size, QSize(64, 48));
    QCOMPARE(pictures.first().encoding, QStringLiteral("image"));
    const QImage printed = pdf.firstPicture();
    QCOMPARE(printed.pixelColor(30, 30), QColor(Qt::green));
    QCOMPARE(printed.pixelColor(2, 2), QColor(renderMeasurements ? Qt::red : Qt::green));
}

void KvImageBlocksReportTest::bothBlocksTogether()
{
    QVERIFY(loadAndPrint({cameraBlock(true, 20), imageBlock(KvImageSamples::noise(QSize(30, 20)), 1, 20, 0),
                          cameraBlock(false, 20)}));
    const QVector<PdfPicture> pictures = PdfFile(pdfPath()).pictures();
    QCOMPARE(pictures.size(), 3);
    QCOMPARE(pictures.at(0).size, QSize(64, 48));
    QCOMPARE(pictures.at(1).size, QSize(30, 20));
    QCOMPARE(pictures.at(2).size, QSize(64, 48));
}

void KvImageBlocksReportTest::theCameraOfASecondPrintIsNew()
{
    QVERIFY(loadAndPrint({cameraBlock(true, 50)}));
    m_camera->setPicture(QSize(32, 32), Qt::blue);
    m_model->beginLiveUpdates();
    QCOMPARE(m_model->print(pdfPath()), 1);
    m_model->endLiveUpdates();
    const PdfFile pdf(pdfPath());
    QCOMPARE(pdf.pictures().first().size, QSize(32, 32));
    QCOMPARE(pdf.firstPicture().pixelColor(20, 20), QColor(Qt::blue));
    QCOMPARE(pdf.firstPicture().pixelColor(2, 2), QColor(Qt::red));
}

void KvImageBlocksReportTest::reloadingKeepsTheWish()
{
    QVERIFY(loadAndPrint({cameraBlock(true, 50), cameraBlock(true, 50)}));
    QVERIFY(m_data->isCameraImageWithDataWanted());
    QVERIFY(loadAndPrint({cameraBlock(true, 50)}));
    QVERIFY(m_data->isCameraImageWithDataWanted());
    QVERIFY(loadAndPrint({cameraBlock(false, 50)}));
    QVERIFY(!m_data->isCameraImageWithDataWanted());
}

void KvImageBlocksReportTest::savingAndLoadingGivesTheSame()
{
    const QPixmap noise = KvImageSamples::noise(QSize(30, 20));
    const QJsonArray nodes{imageBlock(noise, 2, 53, 270), cameraBlock(true, 59)};
    QVERIFY(m_model->load(templateFile(nodes)));
    const QString copy = temporaryPath(QStringLiteral("copy.rtp"));
    QVERIFY(m_model->save(copy));
    const QJsonArray saved = savedNodes(copy);
    QCOMPARE(saved.size(), 2);
    QCOMPARE(saved.at(1), nodes.at(1));
    QJsonObject config = saved.at(0).toObject().value("config").toObject();
    QPixmap picture;
    QVERIFY(picture.loadFromData(QByteArray::fromBase64(config.value("imgData").toString().toLatin1())));
    QCOMPARE(pixels(picture), pixels(noise));
    config.remove(QStringLiteral("imgData"));
    QCOMPARE(config, QJsonObject({{"imgPath", "/gone.png"},
                                  {"alignment", "2"},
                                  {"widthPercent", "53"},
                                  {"rotationAngles", "270"}}));
}

void KvImageBlocksReportTest::aRefusedBlockStopsTheLoad_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QJsonObject>("config");
    QTest::newRow("image, no path") << QStringLiteral("Image View")
                                    << QJsonObject{{"alignment", "1"}, {"widthPercent", "5"}};
    QTest::newRow("image, malformed width")
        << QStringLiteral("Image View")
        << QJsonObject{{"imgPath", ""}, {"alignment", "1"}, {"widthPercent", "5%"}};
    QTest::newRow("camera, no switch")
        << QStringLiteral("Camera Image View") << QJsonObject{{"alignment", "1"}, {"widthPercent", "5"}};
}

void KvImageBlocksReportTest::aRefusedBlockStopsTheLoad()
{
    QFETCH(QString, name);
    QFETCH(QJsonObject, config);
    const QJsonObject refused{{"name", name}, {"config", config}};
    QVERIFY(!m_model->load(templateFile({cameraBlock(false, 50), refused, cameraBlock(false, 50)})));
    QCOMPARE(m_model->nodeCount(), 1);
}

void KvImageBlocksReportTest::missingPicturesPrintThePlaceholder()
{
    ZtKernelData::getInstance()->setKernelImage(nullptr);
    QVERIFY(loadAndPrint({imageBlock(QPixmap(), 1, 100, 0), cameraBlock(true, 100)}));
    const QImage page = PdfFile(pdfPath()).rendered(0, 96);
    const double scale = page.width() / 1000.0;
    for (const int top : {20, 20 + 152 + 1}) {
        const QRect place(QPointF(120 * scale, top * scale).toPoint(),
                          QSizeF(152 * scale, 152 * scale).toSize());
        bool isDrawn = false;
        for (int y = place.top(); y <= place.bottom(); ++y) {
            for (int x = place.left(); x <= place.right(); ++x)
                isDrawn = isDrawn || qGray(page.pixel(x, y)) < 200;
        }
        QVERIFY(isDrawn);
    }
}

void KvImageBlocksReportTest::aTallPictureFillsAPage()
{
    QVERIFY(loadAndPrint({imageBlock(KvImageSamples::plain(QSize(10, 1000)), 1, 100, 0)}));
    const PdfFile pdf(pdfPath());
    QCOMPARE(pdf.pageCount(), 1); // exactly as high as there is room
    const QImage page = pdf.rendered(0, 96);
    const double scale = page.width() / 1000.0;
    const QRect red = areaOf(page, Qt::red);
    const int contentHeight = 1414 - 40 - 2;
    QVERIFY(qAbs(red.height() - contentHeight * scale) < 3);
    QVERIFY(qAbs(red.width() - contentHeight / 100.0 * scale) < 3);
}

void KvImageBlocksReportTest::viewsFollowSeveralCameras()
{
    KvReportPagedView view;
    view.resize(1040, 800);
    view.setModel(m_model.get());
    view.show();
    m_model->beginLiveUpdates();
    // Each block asks for a frame when it is made, so those before it change in the middle of a rebuild.
    const QJsonArray cameras{cameraBlock(true, 100), cameraBlock(false, 100), cameraBlock(true, 100)};
    QVERIFY(m_model->load(templateFile(cameras)));
    QTRY_COMPARE(view.pages().size(), 2); // each is 570 high, a page has room for 1372
    m_camera->setPicture(QSize(100, 10), Qt::blue);
    m_camera->deliver();
    QTRY_COMPARE(view.pages().size(), 1);
    m_camera->setPicture(QSize(10, 100), Qt::blue);
    m_camera->deliver();
    QTRY_COMPARE(view.pages().size(), 3);
    m_model->removeNode(m_model->node(1));
    QTRY_COMPARE(view.pages().size(), 2);
    m_model->endLiveUpdates();
}

STATREPORT_TEST_MAIN(KvImageBlocksReportTest)
#include "KvImageBlocksReportTest.moc"
