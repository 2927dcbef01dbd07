// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvDeskActions.h"
#include "KvDeskElidedLabel.h"
#include "KvDeskEmptyState.h"
#include "KvDeskFileCommands.h"
#include "KvDeskGallery.h"
#include "KvDeskLiveBar.h"
#include "KvDeskMainWindow.h"
#include "KvDeskProgress.h"
#include "KvDeskSession.h"
#include "KvDeskSourceCommands.h"
#include "KvDeskTheme.h"
#include "host/desk/DeskFiles.h"
#include "host/desk/DeskLog.h"
#include "host/measuring/TiffFile.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtFrameSourceCatalogue.h"
#include "measuring/ZtKernelImage.h"
#include "measuring/ZtMeasuringDocument.h"
#include "support/FileDialogAnswerer.h"
#include "support/MessageBoxAnswerer.h"

#include <QAction>
#include <QBuffer>
#include <QDir>
#include <QDropEvent>
#include <QMimeData>
#include <QPushButton>
#include <QRandomGenerator>
#include <QUrl>
#include <QtEndian>

namespace {

constexpr qint64 kTwoGigabytes = 2LL * 1024 * 1024 * 1024 + 1;
constexpr int kHugeSide = 12000;
constexpr int kPatience = 20000; ///< ms that a file may take, whatever is in it

QByteArray randomBytes(int count)
{
    QByteArray bytes(count, '\0');
    QRandomGenerator random(7);
    for (char &byte : bytes)
        byte = static_cast<char>(random.bounded(256));
    return bytes;
}

QByteArray encoded(const char *format)
{
    QImage image(200, 150, QImage::Format_RGB32);
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            image.setPixel(x, y, qRgb(x, y, x ^ y));
    }
    QBuffer buffer;
    image.save(&buffer, format);
    return buffer.data();
}

// Its picture has a next directory that is the first one again.
QByteArray cyclicTiff()
{
    TiffFile tiff(QSize(8, 8), 8);
    tiff.setPixels(QByteArray(64, '\x40'));
    const QByteArray once = tiff.bytes();
    tiff.setNextDirectory(qFromLittleEndian<quint32>(once.constData() + 4));
    return tiff.bytes();
}

QByteArray tiffOf(const QSize &size, int bits = 8)
{
    TiffFile tiff(size, bits);
    tiff.setPixels(QByteArray(64, '\x40'));
    return tiff.bytes();
}

QByteArray tiffWith(int tag, quint32 value)
{
    TiffFile tiff(QSize(8, 8), 8);
    tiff.setPixels(QByteArray(64, '\x40'));
    tiff.setLong(tag, value);
    return tiff.bytes();
}

// Its list of tags is said to begin where it ends.
QByteArray tiffWithoutDirectory()
{
    QByteArray bytes("II*\0", 4);
    const quint32 offset = qToLittleEndian<quint32>(0x7ffffff0U);
    bytes.append(reinterpret_cast<const char *>(&offset), sizeof offset);
    return bytes + QByteArray(100, '\0');
}

} // namespace

/** Files that are not what they seem to be, opened in each of the ways a user has. */
class DeskBadFilesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void isToldOnce_data();
    void isToldOnce();
    void oddTiffIsRead_data();
    void oddTiffIsRead();
    void folderWithoutImages_data();
    void folderWithoutImages();
    void videoThatIsNone_data();
    void videoThatIsNone();
    void hugeImageIsReadInTheBackground();
    void longWorkCanBeCancelled_data();
    void longWorkCanBeCancelled();

private:
    enum Way { Menu, Drop, CommandLine };

    void open(Way way, const QString &path, KvDeskActions::Id action);
    void drop(const QString &path);
    void checkNothingIsLost();
    void cancelSoon(QTimer *timer);
    static QString hugeImage(int side);
    static QString millionRows();
    KvDeskSession *session() const { return m_window->session(); }
    KvDeskProgress *progress() const { return m_window->files()->progress(); }

    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskMainWindow> m_window;
    QImage m_frame; ///< that was there before
};

void DeskBadFilesTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    KvDeskTheme::apply(KvDeskTheme::stored());
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_window = std::make_unique<KvDeskMainWindow>(m_document.get());
    m_window->show();
    m_window->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
    QVERIFY(m_window->files()->openSession(DeskFiles::demoSession()));
    m_frame = m_document->kernelImage()->frame();
    QVERIFY(!m_frame.isNull());
    ZtStatusLog::getInstance()->clear();
}

void DeskBadFilesTest::cleanup()
{
    m_window.reset();
    m_document.reset();
    m_frame = QImage();
    StatReportTest::cleanup();
}

void DeskBadFilesTest::drop(const QString &path)
{
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(path)});
    QDragEnterEvent enter(QPoint(10, 10), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(m_window.get(), &enter);
    QVERIFY(enter.isAccepted());
    QDropEvent event(QPointF(10, 10), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(m_window.get(), &event);
}

void DeskBadFilesTest::open(Way way, const QString &path, KvDeskActions::Id action)
{
    if (way == Menu) {
        const FileDialogAnswerer dialogs(path);
        m_window->actions()->action(action)->trigger();
        QCOMPARE(dialogs.dialogs().size(), 1);
    } else if (way == Drop) {
        drop(path);
    } else {
        m_window->openPath(path);
    }
}

void DeskBadFilesTest::checkNothingIsLost()
{
    QCOMPARE(session()->path(), DeskFiles::demoSession());
    QCOMPARE(session()->objectCount(), 33);
    QVERIFY(!session()->isModified());
    QCOMPARE(m_document->kernelImage()->frame(), m_frame);
    QVERIFY(!QGuiApplication::overrideCursor());
    // And the next file is opened.
    ZtStatusLog::getInstance()->clear();
    m_window->openPath(DeskFiles::image(QStringLiteral("good.png")));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information),
             QStringList(QStringLiteral("Image opened: good.png")));
}

void DeskBadFilesTest::isToldOnce_data()
{
    QTest::addColumn<int>("way");
    QTest::addColumn<QString>("name");
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<qint64>("size"); // of the file, which goes on with zeros
    QTest::addColumn<int>("action");
    QTest::addColumn<QString>("reason");

    struct Row
    {
        QByteArray title;
        QString name;
        QByteArray bytes;
        qint64 size;
        KvDeskActions::Id action;
        QString reason;
    };
    QVector<Row> rows;
    const auto add = [&rows](const QByteArray &title, const char *name, const QByteArray &bytes,
                             const char *reason, KvDeskActions::Id action = KvDeskActions::OpenImage,
                             qint64 size = 0) {
        rows.append({title, QString::fromLatin1(name), bytes, qMax<qint64>(size, bytes.size()), action,
                     QString::fromLatin1(reason)});
    };
    const QByteArray session = DeskFiles::bytes(DeskFiles::demoSession());
    const char undecodable[] = "The picture cannot be decoded (";
    for (const char *name : {"empty.png", "empty.tif", "empty.jpg", "empty.bmp"})
        add(name, name, QByteArray(), "the file is empty");
    add("empty session", "empty.json", QByteArray(), "The file is empty", KvDeskActions::OpenSession);
    add("empty table", "empty.csv", QByteArray(), "The file is empty", KvDeskActions::ImportTable);
    for (const char *name : {"huge.png", "huge.tif", "huge.jpg", "huge.bmp"})
        add(name, name, QByteArray(), undecodable, KvDeskActions::OpenImage, kTwoGigabytes);
    add("huge session", "huge.json", QByteArray(), "The file is too large for a session",
        KvDeskActions::OpenSession, kTwoGigabytes);
    add("huge table", "huge.csv", QByteArray(), "The file is larger than 512 MB", KvDeskActions::ImportTable,
        kTwoGigabytes);
    for (const char *name : {"noise.png", "noise.tif", "noise.jpg", "noise.bmp"})
        add(name, name, randomBytes(5000), undecodable);
    add("noise that begins as PNG", "begin.png", encoded("png").left(8) + randomBytes(5000), undecodable);
    add("noise that begins as JPEG", "begin.jpg", encoded("jpg").left(3) + randomBytes(5000), undecodable);
    add("noise that begins as BMP", "begin.bmp", encoded("bmp").left(2) + randomBytes(5000), undecodable);
    add("noise that begins as TIFF", "begin.tif", QByteArray("II*\0", 4) + randomBytes(5000), undecodable);
    add("huge file that begins as PNG", "hugebegin.png", encoded("png").left(encoded("png").size() / 2),
        undecodable, KvDeskActions::OpenImage, kTwoGigabytes);
    add("truncated PNG", "cut.png", encoded("png").left(encoded("png").size() / 2), undecodable);
    add("truncated BMP", "cut.bmp", encoded("bmp").left(20000), "the file is too short for its picture");
    add("TIFF of a million pixels each way", "wide.tif", tiffOf(QSize(1000000, 1000000)),
        "has 1000000 x 1000000 pixels, which is too many");
    add("TIFF of the largest size there is", "widest.tif", tiffOf(QSize(-1, -1)),
        "The picture cannot be decoded");
    add("TIFF with more pixels than bytes", "long.tif", tiffOf(QSize(20000, 20000)),
        "the file is too short for its picture");
    add("deep TIFF with more pixels than bytes", "deep.tif", tiffOf(QSize(20000, 20000), 16),
        "the file is too short for its picture");
    add("TIFF without size", "sizeless.tif", tiffOf(QSize(0, 0)), undecodable);
    add("TIFF with pixels behind the end", "behind.tif", tiffWith(TiffFile::StripOffsets, 0x7ffffff0U),
        undecodable);
    add("TIFF with a directory behind the end", "nowhere.tif", tiffWithoutDirectory(), undecodable);
    for (const int percent : {1, 30, 60, 99})
        add("session cut at " + QByteArray::number(percent) + " %", "cut.json",
            session.left(session.size() * percent / 100), "cut.json", KvDeskActions::OpenSession);
    add("session of noise", "noise.json", randomBytes(5000), "noise.json", KvDeskActions::OpenSession);
    add("table of noise", "noise.csv", randomBytes(5000), "noise.csv", KvDeskActions::ImportTable);

    const QVector<QPair<Way, QByteArray>> ways{{Menu, "menu"}, {Drop, "drop"}, {CommandLine, "command line"}};
    for (const auto &way : ways) {
        for (const Row &row : qAsConst(rows))
            QTest::newRow((way.second + ", " + row.title).constData())
                << static_cast<int>(way.first) << row.name << row.bytes << row.size
                << static_cast<int>(row.action) << row.reason;
    }
}

void DeskBadFilesTest::isToldOnce()
{
    QFETCH(int, way);
    QFETCH(QString, name);
    QFETCH(QByteArray, bytes);
    QFETCH(qint64, size);
    QFETCH(int, action);
    QFETCH(QString, reason);
    // Zeros take no room on the disk: nobody writes them.
    QFile file(DeskFiles::text(name, bytes));
    QVERIFY(file.resize(size));
    if (name == QStringLiteral("begin.jpg"))
        expectWarning(QRegularExpression(QStringLiteral("^Unsupported marker type")));
    const MessageBoxAnswerer boxes;
    QElapsedTimer clock;
    clock.start();
    open(static_cast<Way>(way), file.fileName(), static_cast<KvDeskActions::Id>(action));
    QTRY_COMPARE_WITH_TIMEOUT(boxes.boxes().size(), 1, kPatience);
    QVERIFY2(clock.elapsed() < kPatience, qPrintable(QString::number(clock.elapsed())));
    QVERIFY2(boxes.boxes().first().text.contains(name), qPrintable(boxes.boxes().first().text));
    const QStringList errors = DeskLog::messages(ZtAppStatus::Error);
    QCOMPARE(errors.size(), 1);
    QVERIFY2(errors.first().contains(reason), qPrintable(errors.first()));
    QFile::remove(file.fileName());
    checkNothingIsLost();
    QCOMPARE(boxes.boxes().size(), 1);
}

void DeskBadFilesTest::oddTiffIsRead_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("directories in a circle") << cyclicTiff();
    QTest::newRow("more bytes in the strip than in the file")
        << tiffWith(TiffFile::StripByteCounts, 0x7ffffff0U);
}

// All that is wrong with it lies behind its picture.
void DeskBadFilesTest::oddTiffIsRead()
{
    QFETCH(QByteArray, bytes);
    m_window->openPath(DeskFiles::text(QStringLiteral("odd.tif"), bytes));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information),
             QStringList(QStringLiteral("Image opened: odd.tif")));
    QCOMPARE(m_document->kernelImage()->frame().size(), QSize(8, 8));
}

void DeskBadFilesTest::folderWithoutImages_data()
{
    QTest::addColumn<int>("way");
    QTest::newRow("drop") << static_cast<int>(Drop);
    QTest::newRow("command line") << static_cast<int>(CommandLine);
}

void DeskBadFilesTest::folderWithoutImages()
{
    QFETCH(int, way);
    const QString folder = temporaryPath(QStringLiteral("no pictures"));
    QVERIFY(QDir().mkpath(folder));
    DeskFiles::text(QStringLiteral("no pictures/readme.txt"), "text");
    // As what the gallery says: there may be images in it later.
    open(static_cast<Way>(way), folder, KvDeskActions::OpenImage);
    QTRY_VERIFY(m_window->gallery()->isVisible());
    const auto says = [this](const QString &text) {
        for (const KvDeskEmptyState *state : m_window->gallery()->findChildren<KvDeskEmptyState *>()) {
            if (state->isVisible() && state->text() == text)
                return true;
        }
        return false;
    };
    QTRY_VERIFY(says(QStringLiteral("There are no images in ") + folder));
    checkNothingIsLost();
}

void DeskBadFilesTest::videoThatIsNone_data()
{
    QTest::addColumn<int>("way");
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<bool>("isShown"); // as a source without pictures: nobody knew before it was played
    for (const Way way : {Drop, CommandLine}) {
        const QByteArray name = way == Drop ? "drop" : "command line";
        QTest::newRow((name + ", noise").constData()) << static_cast<int>(way) << randomBytes(5000) << true;
        QTest::newRow((name + ", empty").constData()) << static_cast<int>(way) << QByteArray() << false;
    }
}

void DeskBadFilesTest::videoThatIsNone()
{
    QFETCH(int, way);
    QFETCH(QByteArray, bytes);
    QFETCH(bool, isShown);
    if (!ZtFrameSourceCatalogue::isAvailable(ZtFrameSourceInfo::VideoFile))
        QSKIP("needs Qt Multimedia");
    const QString path = DeskFiles::text(QStringLiteral("none.mp4"), bytes);
    // Said by Qt's player beside its error.
    if (isShown)
        expectWarning(QRegularExpression(QStringLiteral("^Error: ")));
    const MessageBoxAnswerer boxes;
    open(static_cast<Way>(way), path, KvDeskActions::OpenImage);
    const auto problems = []() {
        return DeskLog::messages(ZtAppStatus::Warning) + DeskLog::messages(ZtAppStatus::Error);
    };
    QTRY_COMPARE_WITH_TIMEOUT(problems().size(), 1, kPatience);
    QVERIFY2(problems().first().contains(QLatin1String("none.mp4")), qPrintable(problems().first()));
    QCOMPARE(boxes.boxes().size(), isShown ? 0 : 1);
    QCOMPARE(m_window->liveBar()->isVisible(), isShown);
    QCOMPARE(session()->objectCount(), 33);
    if (!isShown) {
        checkNothingIsLost();
        return;
    }
    QTRY_COMPARE(m_window->liveBar()->status()->text(), QStringLiteral("none.mp4 delivers no pictures"));
    m_window->openPath(DeskFiles::image(QStringLiteral("good.png")));
    QVERIFY(!m_window->liveBar()->isVisible());
    QCOMPARE(problems().size(), 1);
}

// A bitmap of black pixels that takes no room on the disk.
QString DeskBadFilesTest::hugeImage(int side)
{
    QImage small(4, 4, QImage::Format_RGB888);
    small.fill(Qt::black);
    QBuffer buffer;
    small.save(&buffer, "bmp");
    QByteArray header = buffer.data().left(54);
    const quint32 extent = qToLittleEndian(static_cast<quint32>(side));
    header.replace(18, 4, reinterpret_cast<const char *>(&extent), 4);
    header.replace(22, 4, reinterpret_cast<const char *>(&extent), 4);
    QFile file(DeskFiles::text(QStringLiteral("huge.bmp"), header));
    if (!file.resize(header.size() + 3LL * side * side))
        qWarning("The file cannot be made.");
    return file.fileName();
}

QString DeskBadFilesTest::millionRows()
{
    constexpr int rows = 1000000;
    QByteArray table("Name,Length [mm],Mass [g]\n");
    table.reserve(rows * 16);
    for (int i = 0; i < rows; ++i)
        table += "Bolt,1.5,2.25\n";
    return DeskFiles::text(QStringLiteral("million.csv"), table);
}

void DeskBadFilesTest::hugeImageIsReadInTheBackground()
{
    const QString path = hugeImage(kHugeSide);
    QElapsedTimer clock;
    qint64 longestGap = 0;
    int ticks = 0;
    QTimer timer;
    connect(&timer, &QTimer::timeout, this, [&]() {
        longestGap = qMax(longestGap, clock.restart());
        ticks += progress()->isRunning() ? 1 : 0;
    });
    timer.start(5);
    clock.start();
    m_window->openPath(path);
    QCOMPARE(m_document->kernelImage()->frame().size(), QSize(kHugeSide, kHugeSide));
    // With what it takes to show it.
    QTest::qWait(1000);
    qInfo("longest wait for the user interface: %lld ms", longestGap);
    QVERIFY(ticks > 5);
    QFile::remove(path);
}

void DeskBadFilesTest::cancelSoon(QTimer *timer)
{
    connect(timer, &QTimer::timeout, this, [this]() {
        if (progress()->isRunning())
            progress()->cancelButton()->click();
    });
    timer->start(20);
}

void DeskBadFilesTest::longWorkCanBeCancelled_data()
{
    QTest::addColumn<int>("way");
    QTest::addColumn<bool>("isTable");
    for (const bool isTable : {false, true}) {
        const QByteArray name = isTable ? "million rows" : "huge image";
        QTest::newRow((name + ", menu").constData()) << static_cast<int>(Menu) << isTable;
        QTest::newRow((name + ", drop").constData()) << static_cast<int>(Drop) << isTable;
        QTest::newRow((name + ", command line").constData()) << static_cast<int>(CommandLine) << isTable;
    }
}

void DeskBadFilesTest::longWorkCanBeCancelled()
{
    QFETCH(int, way);
    QFETCH(bool, isTable);
    const QString path = isTable ? millionRows() : hugeImage(kHugeSide);
    QTimer timer;
    // As soon as there is somebody to hear it: fast machines are done before anything is shown.
    cancelSoon(&timer);
    const MessageBoxAnswerer boxes;
    open(static_cast<Way>(way), path, isTable ? KvDeskActions::ImportTable : KvDeskActions::OpenImage);
    QTRY_COMPARE_WITH_TIMEOUT(DeskLog::messages(ZtAppStatus::Information).size(), 1, kPatience);
    timer.stop();
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information).first(),
             isTable ? QStringLiteral("The table \"million.csv\" was not imported.")
                     : QStringLiteral("The image \"huge.bmp\" was not opened."));
    QCOMPARE(boxes.boxes().size(), 0);
    QFile::remove(path);
    checkNothingIsLost();
}

STATREPORT_TEST_MAIN(DeskBadFilesTest)
#include "DeskBadFilesTest.moc"
