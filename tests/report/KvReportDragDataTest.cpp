// SPDX-License-Identifier: MIT
#include "report/KvReportDragData.h"
#include "support/FakeReport.h"
#include "support/StatReportTest.h"

#include <QDataStream>
#include <QDir>
#include <QMimeData>
#include <QUrl>

#include <functional>
#include <limits>

namespace {

using Kind = KvReportDragData::Kind;

const QString kNewBlock = QStringLiteral("application/x-KvEditorToolsListModeldatalist");
const QString kMovedBlock = QStringLiteral("application/x-meeditorpreviewlistmodeldatalist");
const QString kGallery = QStringLiteral("GalleryDrag");
const QString kUriList = QStringLiteral("text/uri-list");

QByteArray streamed(const std::function<void(QDataStream &)> &write)
{
    QByteArray bytes;
    QDataStream stream(&bytes, QIODevice::WriteOnly);
    write(stream);
    return bytes;
}

QByteArray newBlockBytes(const QString &tag, const QString &type)
{
    return streamed([&](QDataStream &stream) { stream << tag << type; });
}

QByteArray movedBlockBytes(const QString &tag, qint32 index)
{
    return streamed([&](QDataStream &stream) { stream << tag << index; });
}

KvReportDragData read(const QVector<QPair<QString, QByteArray>> &formats)
{
    QMimeData data;
    for (const QPair<QString, QByteArray> &format : formats)
        data.setData(format.first, format.second);
    return KvReportDragData::fromMimeData(&data);
}

KvReportDragData readGallery(const QByteArray &uriList)
{
    return read({{kGallery, QByteArray()}, {kUriList, uriList}});
}

// Whether nothing was taken from it.
bool isNothing(const KvReportDragData &data)
{
    return data.kind() == Kind::Nothing;
}

} // namespace

class KvReportDragDataTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void isNothingAtFirst();
    void namesTheGalleryFormat();
    void readsNewBlocks_data();
    void readsNewBlocks();
    void readsWhatFactoriesWrite();
    void readsMovedBlocks_data();
    void readsMovedBlocks();
    void readsWhatNodesWrite();
    void refusesDamagedBlocks_data();
    void refusesDamagedBlocks();
    void refusesEveryShortStream();
    void readsGalleryImages_data();
    void readsGalleryImages();
    void readsUrlsOfThePlatform();
    void refusesOtherUris_data();
    void refusesOtherUris();
    void refusesForeignFormats_data();
    void refusesForeignFormats();
    void takesTheFirstOfItsFormats();
};

void KvReportDragDataTest::isNothingAtFirst()
{
    for (const KvReportDragData &data :
         {KvReportDragData(), KvReportDragData::fromMimeData(nullptr), read({})}) {
        QCOMPARE(data.kind(), Kind::Nothing);
        QCOMPARE(data.typeName(), QString());
        QCOMPARE(data.nodeIndex(), -1);
        QCOMPARE(data.imagePath(), QString());
    }
}

void KvReportDragDataTest::namesTheGalleryFormat()
{
    QCOMPARE(QLatin1String(KvReportDragData::GalleryFormat), QLatin1String("GalleryDrag"));
}

void KvReportDragDataTest::readsNewBlocks_data()
{
    QTest::addColumn<QString>("type");
    QTest::newRow("known") << QStringLiteral("Text Document");
    QTest::newRow("unknown") << QStringLiteral("Pony");
    QTest::newRow("empty") << QString();
    QTest::newRow("not Latin") << QStringLiteral("\u8868\u683c");
    QTest::newRow("long") << QString(100000, QLatin1Char('x'));
}

void KvReportDragDataTest::readsNewBlocks()
{
    QFETCH(QString, type);
    const KvReportDragData data = read({{kNewBlock, newBlockBytes(QStringLiteral("nodeType"), type)}});
    QCOMPARE(data.kind(), Kind::NewBlock);
    QCOMPARE(data.typeName(), type);
    QCOMPARE(data.nodeIndex(), -1);
    QCOMPARE(data.imagePath(), QString());
}

void KvReportDragDataTest::readsWhatFactoriesWrite()
{
    const FakeBlockFactory factory(QStringLiteral("Some block"));
    const std::unique_ptr<QMimeData> mime(factory.mimeData());
    const KvReportDragData data = KvReportDragData::fromMimeData(mime.get());
    QCOMPARE(data.kind(), Kind::NewBlock);
    QCOMPARE(data.typeName(), QStringLiteral("Some block"));
}

void KvReportDragDataTest::readsMovedBlocks_data()
{
    QTest::addColumn<int>("index");
    for (const int index : {0, 1, 17, -1, std::numeric_limits<int>::max(), std::numeric_limits<int>::min()})
        QTest::addRow("%d", index) << index;
}

void KvReportDragDataTest::readsMovedBlocks()
{
    QFETCH(int, index);
    const KvReportDragData data = read({{kMovedBlock, movedBlockBytes(QStringLiteral("nodeIndex"), index)}});
    QCOMPARE(data.kind(), Kind::MovedBlock);
    QCOMPARE(data.nodeIndex(), index);
    QCOMPARE(data.typeName(), QString());
    QCOMPARE(data.imagePath(), QString());
}

void KvReportDragDataTest::readsWhatNodesWrite()
{
    FakeReport report;
    const KvReportNode *node = report.addFake({10});
    const std::unique_ptr<QMimeData> mime(node->mimeData(5));
    const KvReportDragData data = KvReportDragData::fromMimeData(mime.get());
    QCOMPARE(data.kind(), Kind::MovedBlock);
    QCOMPARE(data.nodeIndex(), 5);
}

void KvReportDragDataTest::refusesDamagedBlocks_data()
{
    QTest::addColumn<QString>("format");
    QTest::addColumn<QByteArray>("bytes");
    const auto raw = [](const char *tag, const char *value) {
        return streamed([=](QDataStream &stream) { stream << tag << value; });
    };
    QTest::newRow("new: empty") << kNewBlock << QByteArray();
    QTest::newRow("new: text") << kNewBlock << QByteArrayLiteral("nodeType");
    QTest::newRow("new: zeros") << kNewBlock << QByteArray(64, '\0');
    QTest::newRow("new: ones") << kNewBlock << QByteArray(64, '\xff');
    QTest::newRow("new: endless text") << kNewBlock << QByteArray::fromHex("7ffffffe0061");
    QTest::newRow("new: odd length") << kNewBlock << QByteArray::fromHex("00000003006100");
    QTest::newRow("new: other tag") << kNewBlock
                                    << newBlockBytes(QStringLiteral("nodeIndex"), QStringLiteral("Fake"));
    QTest::newRow("new: tag in other case")
        << kNewBlock << newBlockBytes(QStringLiteral("NodeType"), QStringLiteral("Fake"));
    QTest::newRow("new: no wide characters") << kNewBlock << raw("nodeType", "Fake");
    QTest::newRow("new: an index") << kNewBlock << movedBlockBytes(QStringLiteral("nodeType"), 1);

    QTest::newRow("moved: empty") << kMovedBlock << QByteArray();
    QTest::newRow("moved: text") << kMovedBlock << QByteArrayLiteral("nodeIndex0000");
    QTest::newRow("moved: zeros") << kMovedBlock << QByteArray(64, '\0');
    QTest::newRow("moved: ones") << kMovedBlock << QByteArray(64, '\xff');
    QTest::newRow("moved: other tag") << kMovedBlock << movedBlockBytes(QStringLiteral("nodeType"), 0);
    QTest::newRow("moved: no index") << kMovedBlock << streamed([](QDataStream &stream) {
        stream << QStringLiteral("nodeIndex");
    });
    QTest::newRow("moved: 16 bits") << kMovedBlock << streamed([](QDataStream &stream) {
        stream << QStringLiteral("nodeIndex") << qint16(1);
    });
}

void KvReportDragDataTest::refusesDamagedBlocks()
{
    QFETCH(QString, format);
    QFETCH(QByteArray, bytes);
    QVERIFY(isNothing(read({{format, bytes}})));
}

void KvReportDragDataTest::refusesEveryShortStream()
{
    const QByteArray newBlock = newBlockBytes(QStringLiteral("nodeType"), QStringLiteral("Fake"));
    for (int length = 0; length < newBlock.size(); ++length)
        QVERIFY2(isNothing(read({{kNewBlock, newBlock.left(length)}})), qPrintable(QString::number(length)));
    QVERIFY(!isNothing(read({{kNewBlock, newBlock}})));

    const QByteArray movedBlock = movedBlockBytes(QStringLiteral("nodeIndex"), 1);
    for (int length = 0; length < movedBlock.size(); ++length)
        QVERIFY2(isNothing(read({{kMovedBlock, movedBlock.left(length)}})),
                 qPrintable(QString::number(length)));
    QVERIFY(!isNothing(read({{kMovedBlock, movedBlock}})));
}

void KvReportDragDataTest::readsGalleryImages_data()
{
    QTest::addColumn<QByteArray>("uriList");
    QTest::addColumn<QString>("path");
    for (const char *suffix : {"png", "jpg", "jpeg", "tif", "tiff", "bmp", "gif", "PNG", "JpG"})
        QTest::addRow("%s", suffix) << QByteArray("file:///some/where/cell.") + suffix
                                    << QStringLiteral("/some/where/cell.") + QLatin1String(suffix);
    const auto row = [](const char *name, const char *uriList, const char *path) {
        QTest::newRow(name) << QByteArray(uriList) << QString::fromUtf8(path);
    };
    row("line end", "file:///a/b.png\n", "/a/b.png");
    row("line ends of a list", "file:///a/b.png\r\nfile:///a/c.png\r\n", "/a/b.png");
    row("comments and blank lines", "# from the gallery\r\n\r\n  file:///a/b.png\r\n", "/a/b.png");
    row("escaped", "file:///a/b%20c/%C3%A4.png", "/a/b c/\xc3\xa4.png");
    row("not escaped", "file:///a/b c/\xc3\xa4.png", "/a/b c/\xc3\xa4.png");
    row("several dots", "file:///a.mp4/b.tar.png", "/a.mp4/b.tar.png");
    row("dots on the way", "file:///a/../b/./c.png", "/a/../b/./c.png");
    row("the second is no image", "file:///a/b.png\nfile:///a/b.txt", "/a/b.png");
}

void KvReportDragDataTest::readsGalleryImages()
{
    QFETCH(QByteArray, uriList);
    QFETCH(QString, path);
    const KvReportDragData data = readGallery(uriList);
    QCOMPARE(data.kind(), Kind::GalleryImage);
    QCOMPARE(QDir::cleanPath(data.imagePath()), QDir::cleanPath(path));
    QCOMPARE(data.typeName(), QString());
    QCOMPARE(data.nodeIndex(), -1);
    // Without the gallery's own format it is any file manager's drag.
    QVERIFY(isNothing(read({{kUriList, uriList}})));
}

void KvReportDragDataTest::readsUrlsOfThePlatform()
{
    QMimeData mime;
    mime.setData(kGallery, QByteArrayLiteral("x"));
    mime.setUrls(
        {QUrl::fromLocalFile(QStringLiteral("/a/b c.png")), QUrl::fromLocalFile(QStringLiteral("/d.txt"))});
    const KvReportDragData data = KvReportDragData::fromMimeData(&mime);
    QCOMPARE(data.kind(), Kind::GalleryImage);
    QCOMPARE(data.imagePath(), QStringLiteral("/a/b c.png"));
}

void KvReportDragDataTest::refusesOtherUris_data()
{
    QTest::addColumn<QByteArray>("uriList");
    for (const char *name :
         {"a.mp4", "a.avi", "a.txt", "a.svg", "a.rtp", "a", "a.", "png", ".", "a.png.txt", "a.png/"})
        QTest::addRow("%s", name) << QByteArray("file:///some/") + name;
    QTest::newRow("nothing") << QByteArray();
    QTest::newRow("blank lines") << QByteArrayLiteral("\r\n \n");
    QTest::newRow("comment") << QByteArrayLiteral("# file:///a/b.png");
    QTest::newRow("of the web") << QByteArrayLiteral("https://example.org/b.png");
    QTest::newRow("no scheme") << QByteArrayLiteral("/a/b.png");
    QTest::newRow("the second is the image") << QByteArrayLiteral("file:///a/b.txt\nfile:///a/b.png");
    QTest::newRow("garbage") << QByteArray(100, '\xff');
    QTest::newRow("zeros") << QByteArray(100, '\0');
}

void KvReportDragDataTest::refusesOtherUris()
{
    QFETCH(QByteArray, uriList);
    const KvReportDragData data = readGallery(uriList);
    QVERIFY(isNothing(data));
    QCOMPARE(data.imagePath(), QString());
}

void KvReportDragDataTest::refusesForeignFormats_data()
{
    QTest::addColumn<QString>("format");
    for (const char *format :
         {"text/plain", "text/html", "image/png", "application/x-qabstractitemmodeldatalist", "GalleryDrag"})
        QTest::newRow(format) << QString::fromLatin1(format);
}

void KvReportDragDataTest::refusesForeignFormats()
{
    QFETCH(QString, format);
    for (const QByteArray &bytes :
         {QByteArray("file:///a/b.png"), newBlockBytes(QStringLiteral("nodeType"), QStringLiteral("Fake")),
          movedBlockBytes(QStringLiteral("nodeIndex"), 0)})
        QVERIFY(isNothing(read({{format, bytes}})));
}

void KvReportDragDataTest::takesTheFirstOfItsFormats()
{
    const QByteArray newBlock = newBlockBytes(QStringLiteral("nodeType"), QStringLiteral("Fake"));
    const QByteArray movedBlock = movedBlockBytes(QStringLiteral("nodeIndex"), 3);
    const QByteArray image = QByteArrayLiteral("file:///a/b.png");
    QCOMPARE(
        read({{kUriList, image}, {kGallery, {}}, {kMovedBlock, movedBlock}, {kNewBlock, newBlock}}).kind(),
        Kind::NewBlock);
    QCOMPARE(read({{kUriList, image}, {kGallery, {}}, {kMovedBlock, movedBlock}}).kind(), Kind::MovedBlock);
    QCOMPARE(read({{kUriList, image}, {kGallery, {}}, {QStringLiteral("text/plain"), image}}).kind(),
             Kind::GalleryImage);
    // What cannot be read does not turn into something else.
    QVERIFY(isNothing(read({{kUriList, image}, {kGallery, {}}, {kNewBlock, QByteArray("x")}})));
}

STATREPORT_TEST_MAIN(KvReportDragDataTest)
#include "KvReportDragDataTest.moc"
