// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvImageSamples.h"
#include "blocks/image/KvImageNodeCfg.h"
#include "common/ZtAppStatus.h"
#include "templates/KvTemplateContext.h"

#include <QElapsedTimer>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

using KvImageSamples::pixels;

namespace {

QString text(const char *latin)
{
    return QString::fromLatin1(latin);
}

/// A configuration with a blue picture of 3 x 2 at the right, 40 %, upside down.
void fill(KvImageNodeCfg &cfg)
{
    cfg.setPlacement({Qt::AlignRight, 40, 180});
    cfg.setImage(text("/old.png"), KvImageSamples::plain(QSize(3, 2), Qt::blue));
}

QJsonObject embedded(const QJsonValue &data, const char *path = "/gone.png")
{
    return {{"imgPath", text(path)}, {"alignment", "1"}, {"widthPercent", "50"}, {"imgData", data}};
}

} // namespace

class KvImageNodeCfgTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void knowsItsContext();
    void newBlocksAreWritten();
    void everyKeyIsWritten();
    void anyValueKeepsThePictureOut_data();
    void anyValueKeepsThePictureOut();
    void everyWidthSurvives();
    void picturesSurviveLosslessly();
    void aMissingKeyChangesNothing_data();
    void aMissingKeyChangesNothing();
    void readsEachKey_data();
    void readsEachKey();
    void theEmbeddedPictureComesFirst();
    void withoutItTheFileIsRead();
    void dataOfAnotherTypeIsNone_data();
    void dataOfAnotherTypeIsNone();
    void damagedDataShowsNothing_data();
    void damagedDataShowsNothing();
    void blanksInTheDataAreSkipped();
    void anyPictureFormatIsDecoded_data();
    void anyPictureFormatIsDecoded();
    void anUnreadableFileIsReported();
    void largePicturesArePossible();
    void anotherPictureIsEncodedAnew();
    void otherFormatsAreSavedAsPng();
};

void KvImageNodeCfgTest::knowsItsContext()
{
    KvTemplateContext context(nullptr);
    const KvImageNodeCfg cfg(&context);
    QCOMPARE(cfg.context(), &context);
    QCOMPARE(cfg.imagePath(), QString());
    QVERIFY(cfg.image().isNull());
}

void KvImageNodeCfgTest::newBlocksAreWritten()
{
    QJsonObject config;
    QVERIFY(KvImageNodeCfg(nullptr).toJson(config));
    QCOMPARE(config, QJsonObject({{"imgPath", ""},
                                  {"alignment", "132"},
                                  {"widthPercent", "75"},
                                  {"rotationAngles", "0"},
                                  {"imgData", ""}}));
}

void KvImageNodeCfgTest::everyKeyIsWritten()
{
    KvImageNodeCfg cfg(nullptr);
    fill(cfg);
    QJsonObject config{{"other", true}};
    QVERIFY(cfg.toJson(config));
    QCOMPARE(config.keys(),
             QStringList({"alignment", "imgData", "imgPath", "other", "rotationAngles", "widthPercent"}));
    QCOMPARE(config.value("imgPath"), QJsonValue("/old.png"));
    QCOMPARE(config.value("alignment"), QJsonValue("2"));
    QCOMPARE(config.value("widthPercent"), QJsonValue("40"));
    QCOMPARE(config.value("rotationAngles"), QJsonValue("180"));
    QVERIFY(config.value("imgData").isString());
    const QByteArray bytes = QByteArray::fromBase64(config.value("imgData").toString().toLatin1());
    QVERIFY(bytes.startsWith("\x89PNG"));
    QPixmap image;
    QVERIFY(image.loadFromData(bytes, "PNG"));
    QCOMPARE(image.size(), QSize(3, 2));
}

void KvImageNodeCfgTest::anyValueKeepsThePictureOut_data()
{
    QTest::addColumn<QJsonValue>("value");
    QTest::newRow("text") << QJsonValue("-");
    QTest::newRow("empty text") << QJsonValue("");
    QTest::newRow("number") << QJsonValue(0);
    QTest::newRow("null") << QJsonValue(QJsonValue::Null);
}

void KvImageNodeCfgTest::anyValueKeepsThePictureOut()
{
    QFETCH(QJsonValue, value);
    KvImageNodeCfg cfg(nullptr);
    fill(cfg);
    QJsonObject config{{"imgData", value}};
    QVERIFY(cfg.toJson(config));
    QCOMPARE(config.value("imgData"), value);
    QCOMPARE(config.value("imgPath"), QJsonValue("/old.png"));
}

void KvImageNodeCfgTest::everyWidthSurvives()
{
    for (int percent = 1; percent <= 100; ++percent) {
        KvImageNodeCfg cfg(nullptr);
        cfg.setPlacement({Qt::AlignLeft, percent, 0});
        QJsonObject config;
        QVERIFY(cfg.toJson(config));
        QCOMPARE(config.value("widthPercent"), QJsonValue(QString::number(percent)));
        KvImageNodeCfg read(nullptr);
        QVERIFY(read.fromJson(config));
        QCOMPARE(read.placement().widthPercent, percent);
    }
}

void KvImageNodeCfgTest::picturesSurviveLosslessly()
{
    const QPixmap noise = KvImageSamples::noise(QSize(60, 41));
    KvImageNodeCfg cfg(nullptr);
    cfg.setImage(text("/gone.png"), noise);
    QJsonObject config;
    QVERIFY(cfg.toJson(config));
    const QByteArray file = QJsonDocument(config).toJson();
    KvImageNodeCfg read(nullptr);
    QVERIFY(read.fromJson(QJsonDocument::fromJson(file).object()));
    QCOMPARE(pixels(read.image()), pixels(noise));
    QCOMPARE(read.imagePath(), text("/gone.png"));
}

void KvImageNodeCfgTest::aMissingKeyChangesNothing_data()
{
    QTest::addColumn<QString>("key");
    QTest::newRow("imgPath") << text("imgPath");
    QTest::newRow("alignment") << text("alignment");
    QTest::newRow("widthPercent") << text("widthPercent");
}

void KvImageNodeCfgTest::aMissingKeyChangesNothing()
{
    QFETCH(QString, key);
    KvImageNodeCfg cfg(nullptr);
    fill(cfg);
    QJsonObject config = embedded("");
    config.insert(text("rotationAngles"), text("90"));
    config.remove(key);
    QVERIFY(!cfg.fromJson(config));
    QCOMPARE(cfg.imagePath(), text("/old.png"));
    QVERIFY(cfg.placement() == (KvPicturePlacement{Qt::AlignRight, 40, 180}));
    QCOMPARE(cfg.image().size(), QSize(3, 2));
}

void KvImageNodeCfgTest::readsEachKey_data()
{
    QTest::addColumn<QJsonObject>("config");
    QTest::addColumn<bool>("isRead");
    QTest::addColumn<QString>("path");
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("width");
    QTest::addColumn<int>("rotation");
    QTest::addColumn<bool>("isOldPicture");
    const auto add = [](const char *name, const QJsonValue &path, const QJsonValue &alignment,
                        const QJsonValue &width) -> QTestData & {
        return QTest::newRow(name) << QJsonObject{{"imgPath", path},
                                                  {"alignment", alignment},
                                                  {"widthPercent", width},
                                                  {"rotationAngles", "270"},
                                                  {"imgData", ""}};
    };
    add("all", "/new.png", "1", "50") << true << text("/new.png") << 1 << 50 << 270 << false;
    add("path is a number", 5, "1", "50") << true << text("/old.png") << 1 << 50 << 270 << false;
    add("path is null", QJsonValue::Null, "1", "50") << true << text("/old.png") << 1 << 50 << 270 << false;
    add("path is empty", "", "1", "50") << true << QString() << 1 << 50 << 270 << false;
    add("alignment is a number", "/new.png", 1, "50") << true << text("/new.png") << 2 << 50 << 270 << false;
    add("width is a number", "/new.png", "1", 50) << true << text("/new.png") << 1 << 40 << 270 << false;
    // The path was taken before the fault was found.
    add("alignment is a word", "/new.png", "left", "50")
        << false << text("/new.png") << 0 << 40 << 180 << true;
    add("width is a word", "/new.png", "1", "wide") << false << text("/new.png") << 1 << 0 << 180 << true;
}

void KvImageNodeCfgTest::readsEachKey()
{
    QFETCH(QJsonObject, config);
    QFETCH(bool, isOldPicture);
    KvImageNodeCfg cfg(nullptr);
    fill(cfg);
    QTEST(cfg.fromJson(config), "isRead");
    QTEST(cfg.imagePath(), "path");
    QTEST(int(cfg.placement().alignment), "alignment");
    QTEST(cfg.placement().widthPercent, "width");
    QTEST(cfg.placement().rotation, "rotation");
    QCOMPARE(!cfg.image().isNull(), isOldPicture);
}

void KvImageNodeCfgTest::theEmbeddedPictureComesFirst()
{
    const QString path = temporaryPath(text("file.png"));
    QVERIFY(KvImageSamples::plain(QSize(9, 9)).save(path));
    const QString data = KvImageSamples::base64(KvImageSamples::plain(QSize(5, 4), Qt::green));
    for (const QString &file : {path, text("/gone.png")}) {
        KvImageNodeCfg cfg(nullptr);
        QVERIFY(cfg.fromJson(embedded(data, file.toLatin1().constData())));
        QCOMPARE(cfg.image().size(), QSize(5, 4));
        QVERIFY(KvImageSamples::isLike(pixels(cfg.image()).pixel(2, 2), Qt::green));
        QCOMPARE(cfg.imagePath(), file);
    }
}

void KvImageNodeCfgTest::withoutItTheFileIsRead()
{
    const QString path = temporaryPath(text("file.png"));
    QVERIFY(KvImageSamples::plain(QSize(9, 8)).save(path));
    QJsonObject config = embedded("", path.toLatin1().constData());
    config.remove(text("imgData"));
    KvImageNodeCfg cfg(nullptr);
    fill(cfg);
    QVERIFY(cfg.fromJson(config));
    QCOMPARE(cfg.image().size(), QSize(9, 8));
}

void KvImageNodeCfgTest::dataOfAnotherTypeIsNone_data()
{
    QTest::addColumn<QJsonValue>("data");
    QTest::newRow("null") << QJsonValue(QJsonValue::Null);
    QTest::newRow("number") << QJsonValue(5);
    QTest::newRow("list") << QJsonValue(QJsonArray{"iVBOR"});
    QTest::newRow("object") << QJsonValue(QJsonObject());
    QTest::newRow("false") << QJsonValue(false);
}

void KvImageNodeCfgTest::dataOfAnotherTypeIsNone()
{
    QFETCH(QJsonValue, data);
    const QString path = temporaryPath(text("file.png"));
    QVERIFY(KvImageSamples::plain(QSize(9, 8)).save(path));
    KvImageNodeCfg cfg(nullptr);
    QVERIFY(cfg.fromJson(embedded(data, path.toLatin1().constData())));
    QCOMPARE(cfg.image().size(), QSize(9, 8));
}

void KvImageNodeCfgTest::damagedDataShowsNothing_data()
{
    QTest::addColumn<QString>("data");
    QTest::addColumn<bool>("isReported");
    QTest::newRow("empty") << QString() << false;
    QTest::newRow("no base64") << text("%%%%") << false; // which are no bytes at all
    QTest::newRow("a text in base64") << text(QByteArray("no picture").toBase64().constData()) << true;
    QTest::newRow("half a picture's head")
        << KvImageSamples::base64(KvImageSamples::noise(QSize(40, 30))).left(40) << true;
    QTest::newRow("letters of another script") << QStringLiteral("\u0444\u0444\u0444\u0444") << false;
    QTest::newRow("a very long text") << QString(40000000, QLatin1Char('Q')) << true;
}

void KvImageNodeCfgTest::damagedDataShowsNothing()
{
    QFETCH(QString, data);
    QFETCH(bool, isReported);
    ZtStatusLog::getInstance()->clear();
    const QString path = temporaryPath(text("file.png"));
    QVERIFY(KvImageSamples::plain(QSize(9, 8)).save(path));
    KvImageNodeCfg cfg(nullptr);
    fill(cfg);
    QVERIFY(cfg.fromJson(embedded(data, path.toLatin1().constData())));
    QVERIFY(cfg.image().isNull()); // and the file is not asked
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), isReported ? 1 : 0);

    // Saved as it is, and empty when it is read again.
    QJsonObject config;
    QVERIFY(cfg.toJson(config));
    QCOMPARE(config.value("imgData"), QJsonValue(""));
    KvImageNodeCfg read(nullptr);
    QVERIFY(read.fromJson(config));
    QVERIFY(read.image().isNull());
}

void KvImageNodeCfgTest::blanksInTheDataAreSkipped()
{
    QString data = KvImageSamples::base64(KvImageSamples::noise(QSize(20, 10)));
    for (int i = 60; i < data.size(); i += 60)
        data.insert(i, text("\r\n "));
    KvImageNodeCfg cfg(nullptr);
    QVERIFY(cfg.fromJson(embedded(data)));
    QCOMPARE(pixels(cfg.image()), pixels(KvImageSamples::noise(QSize(20, 10))));
    QJsonObject config;
    QVERIFY(cfg.toJson(config));
    QCOMPARE(config["imgData"].toString(), data.remove(text("\r\n ")));
}

void KvImageNodeCfgTest::anyPictureFormatIsDecoded_data()
{
    QTest::addColumn<QByteArray>("format");
    QTest::newRow("jpg") << QByteArray("JPG");
    QTest::newRow("bmp") << QByteArray("BMP");
}

void KvImageNodeCfgTest::anyPictureFormatIsDecoded()
{
    QFETCH(QByteArray, format);
    KvImageNodeCfg cfg(nullptr);
    QVERIFY(cfg.fromJson(
        embedded(KvImageSamples::base64(KvImageSamples::plain(QSize(16, 8)), format.constData()))));
    QCOMPARE(cfg.image().size(), QSize(16, 8));
}

void KvImageNodeCfgTest::anUnreadableFileIsReported()
{
    ZtStatusLog::getInstance()->clear();
    QJsonObject config = embedded("", "/no/such/file.png");
    config.remove(text("imgData"));
    KvImageNodeCfg cfg(nullptr);
    fill(cfg);
    QVERIFY(cfg.fromJson(config));
    QVERIFY(cfg.image().isNull());
    QCOMPARE(cfg.imagePath(), text("/no/such/file.png"));
    QCOMPARE(ZtStatusLog::getInstance()->entries().size(), 1);
    QVERIFY(ZtStatusLog::getInstance()->entries().first().message.contains(text("/no/such/file.png")));
}

void KvImageNodeCfgTest::largePicturesArePossible()
{
    // Twelve megapixels, as a camera makes them.
    KvImageNodeCfg cfg(nullptr);
    cfg.setImage(text("/large.png"), KvImageSamples::plain(QSize(4000, 3000)));
    QJsonObject config;
    QVERIFY(cfg.toJson(config));
    KvImageNodeCfg read(nullptr);
    QVERIFY(read.fromJson(config));
    QCOMPARE(read.image().size(), QSize(4000, 3000));
}

void KvImageNodeCfgTest::anotherPictureIsEncodedAnew()
{
    const auto savedColor = [](const KvImageNodeCfg &cfg) {
        QJsonObject config;
        cfg.toJson(config);
        QPixmap image;
        image.loadFromData(QByteArray::fromBase64(config.value("imgData").toString().toLatin1()), "PNG");
        return image.isNull() ? QColor() : image.toImage().pixelColor(0, 0);
    };
    KvImageNodeCfg cfg(nullptr);
    QVERIFY(cfg.fromJson(embedded(KvImageSamples::base64(KvImageSamples::plain(QSize(5, 4), Qt::green)))));
    QCOMPARE(savedColor(cfg), QColor(Qt::green));
    cfg.setImage(text("/a.png"), KvImageSamples::plain(QSize(5, 4), Qt::blue));
    QCOMPARE(savedColor(cfg), QColor(Qt::blue));
    QCOMPARE(savedColor(cfg), QColor(Qt::blue));
    QVERIFY(cfg.fromJson(embedded(KvImageSamples::base64(KvImageSamples::plain(QSize(5, 4), Qt::red)))));
    QCOMPARE(savedColor(cfg), QColor(Qt::red));
    QVERIFY(cfg.fromJson(embedded("")));
    QCOMPARE(savedColor(cfg), QColor());
}

void KvImageNodeCfgTest::otherFormatsAreSavedAsPng()
{
    KvImageNodeCfg cfg(nullptr);
    QVERIFY(cfg.fromJson(embedded(KvImageSamples::base64(KvImageSamples::plain(QSize(5, 4)), "BMP"))));
    QJsonObject config;
    QVERIFY(cfg.toJson(config));
    QVERIFY(QByteArray::fromBase64(config.value("imgData").toString().toLatin1()).startsWith("\x89PNG"));
}

STATREPORT_TEST_MAIN(KvImageNodeCfgTest)
#include "KvImageNodeCfgTest.moc"
