// SPDX-License-Identifier: MIT
#include "KvDeskGalleryModel.h"

#include "GalleryFolder.h"
#include "KvDeskGalleryFolder.h"
#include "KvDeskThumbnailLoader.h"

#include <QAbstractItemModelTester>
#include <QMimeData>

class KvDeskGalleryModelTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void emptyWithoutAFolder();
    void listsTheFolder();
    void thumbnailsComeWhenAskedFor();
    void brokenPicturesSayWhy();
    void toolTipIsNoMarkup();
    void followsChanges_data();
    void followsChanges();
    void indexesStayWhereTheirFilesAre();
    void changedFileIsLoadedAnew();
    void anotherFolder();
    void dragCarriesFiles();
    void brokenPicturesAreNotDragged();
    void thousandsOfFiles();

private:
    QString add(const QString &name, const QSize &size = QSize(40, 30))
    {
        return m_pictures->add(name, size);
    }
    void open();
    QStringList names() const
    {
        QStringList names;
        for (int row = 0; row < m_model->rowCount(); ++row)
            names.append(m_model->index(row).data().toString());
        return names;
    }

    std::unique_ptr<GalleryFolder> m_pictures;
    QString m_path;
    std::unique_ptr<KvDeskGalleryModel> m_model;
    std::unique_ptr<QAbstractItemModelTester> m_tester;
};

void KvDeskGalleryModelTest::init()
{
    StatReportTest::init();
    m_pictures = std::make_unique<GalleryFolder>();
    m_path = m_pictures->path;
    m_model = std::make_unique<KvDeskGalleryModel>();
    m_tester = std::make_unique<QAbstractItemModelTester>(
        m_model.get(), QAbstractItemModelTester::FailureReportingMode::QtTest);
}

void KvDeskGalleryModelTest::cleanup()
{
    m_tester.reset();
    m_model.reset();
    StatReportTest::cleanup();
}

void KvDeskGalleryModelTest::open()
{
    QSignalSpy spy(m_model.get(), SIGNAL(signalFolderRead()));
    m_model->setFolder(m_path);
    QVERIFY(spy.wait());
}

void KvDeskGalleryModelTest::emptyWithoutAFolder()
{
    QCOMPARE(m_model->rowCount(), 0);
    m_model->setFolder(QString());
    QCOMPARE(m_model->rowCount(), 0);
}

void KvDeskGalleryModelTest::listsTheFolder()
{
    add(QStringLiteral("b 10.png"));
    add(QStringLiteral("b 9.png"));
    open();
    QCOMPARE(names(), QStringList({QStringLiteral("b 9.png"), QStringLiteral("b 10.png")}));
    QCOMPARE(m_model->index(1).data(KvDeskGalleryModel::PathRole).toString(),
             m_path + QStringLiteral("/b 10.png"));
    QCOMPARE(m_model->indexOf(m_path + QStringLiteral("/b 10.png")), m_model->index(1));
    QVERIFY(!m_model->indexOf(m_path + QStringLiteral("/none.png")).isValid());
    QVERIFY(!m_model->indexOf(temporaryPath(QStringLiteral("b 10.png"))).isValid());
}

void KvDeskGalleryModelTest::thumbnailsComeWhenAskedFor()
{
    add(QStringLiteral("a.png"), QSize(800, 600));
    open();
    QSignalSpy changed(m_model.get(), SIGNAL(dataChanged(QModelIndex,QModelIndex,QVector<int>)));
    QVERIFY(!changed.wait(50));
    QVERIFY(m_model->index(0).data(KvDeskGalleryModel::ThumbnailRole).value<QImage>().isNull());
    QVERIFY(changed.wait());
    QCOMPARE(changed.first().first().toModelIndex(), m_model->index(0));
    QCOMPARE(m_model->index(0).data(KvDeskGalleryModel::ThumbnailRole).value<QImage>().size(),
             QSize(256, 192));
    QVERIFY(m_model->index(0).data(Qt::ToolTipRole).toString().contains(QStringLiteral("800 × 600 px")));
    QCOMPARE(m_model->index(0).data(KvDeskGalleryModel::FaultRole).toString(), QString());
}

void KvDeskGalleryModelTest::brokenPicturesSayWhy()
{
    m_pictures->addBroken(QStringLiteral("broken.png"));
    DeskFiles::text(QFileInfo(m_path).fileName() + QStringLiteral("/empty.png"), "");
    open();
    for (int row = 0; row < 2; ++row) {
        const QModelIndex index = m_model->index(row);
        index.data(KvDeskGalleryModel::ThumbnailRole);
        QTRY_VERIFY(!index.data(KvDeskGalleryModel::FaultRole).toString().isEmpty());
        const QString fault = index.data(KvDeskGalleryModel::FaultRole).toString();
        QVERIFY(fault.startsWith(QStringLiteral("The picture cannot be decoded (")));
        QVERIFY(index.data(Qt::ToolTipRole).toString().contains(fault.toHtmlEscaped()));
        QCOMPARE(index.data(Qt::AccessibleDescriptionRole).toString(), fault);
        QVERIFY(index.data(KvDeskGalleryModel::ThumbnailRole).value<QImage>().isNull());
    }
}

void KvDeskGalleryModelTest::toolTipIsNoMarkup()
{
    add(QStringLiteral("<b>bold.png"));
    open();
    QVERIFY(m_model->index(0).data(Qt::ToolTipRole).toString().contains(QStringLiteral("&lt;b&gt;bold.png")));
}

void KvDeskGalleryModelTest::followsChanges_data()
{
    QTest::addColumn<QStringList>("before");
    QTest::addColumn<QStringList>("after");
    const auto list = [](const char *letters) {
        QStringList names;
        for (const char *letter = letters; *letter; ++letter)
            names.append(QString(QLatin1Char(*letter)) + QStringLiteral(".png"));
        return names;
    };
    const auto row = [&list](const char *before, const char *after) {
        QTest::addRow("%s to %s", before, after) << list(before) << list(after);
    };
    row("", "abc");
    row("abc", "");
    row("b", "abc");
    row("abc", "b");
    row("ace", "abcdef");
    row("abcdef", "bdf");
    row("abc", "def");
    row("bcd", "acde");
    row("abc", "abc");
}

void KvDeskGalleryModelTest::followsChanges()
{
    QFETCH(QStringList, before);
    QFETCH(QStringList, after);
    for (const QString &name : before)
        add(name);
    open();
    QCOMPARE(names(), before);
    QSignalSpy resets(m_model.get(), SIGNAL(modelReset()));
    for (const QString &name : before) {
        if (!after.contains(name))
            QVERIFY(QFile::remove(m_path + QLatin1Char('/') + name));
    }
    for (const QString &name : after) {
        if (!before.contains(name))
            add(name);
    }
    QTRY_COMPARE(names(), after);
    QCOMPARE(resets.count(), 0);
}

void KvDeskGalleryModelTest::indexesStayWhereTheirFilesAre()
{
    for (const char *name : {"b.png", "d.png", "f.png"})
        add(QLatin1String(name));
    open();
    const QPersistentModelIndex d = m_model->index(1);
    const QPersistentModelIndex f = m_model->index(2);
    add(QStringLiteral("a.png"));
    QVERIFY(QFile::remove(m_path + QStringLiteral("/f.png")));
    QTRY_COMPARE(names().size(), 3);
    QTRY_COMPARE(d.row(), 2);
    QCOMPARE(d.data().toString(), QStringLiteral("d.png"));
    QVERIFY(!f.isValid());
}

void KvDeskGalleryModelTest::changedFileIsLoadedAnew()
{
    add(QStringLiteral("a.png"));
    open();
    const QModelIndex index = m_model->index(0);
    QTRY_COMPARE(index.data(KvDeskGalleryModel::ThumbnailRole).value<QImage>().size(), QSize(40, 30));
    add(QStringLiteral("a.png"), QSize(60, 50));
    QTRY_COMPARE(index.data(KvDeskGalleryModel::ThumbnailRole).value<QImage>().size(), QSize(60, 50));
}

void KvDeskGalleryModelTest::anotherFolder()
{
    for (int i = 0; i < 20; ++i)
        add(QStringLiteral("%1.png").arg(i));
    open();
    for (int row = 0; row < 20; ++row)
        m_model->index(row).data(KvDeskGalleryModel::ThumbnailRole);
    QVERIFY(m_model->thumbnails()->wishCount() > 0);
    QSignalSpy resets(m_model.get(), SIGNAL(modelReset()));
    m_model->setFolder(m_path);
    QCOMPARE(resets.count(), 0);
    m_model->setFolder(m_path + QStringLiteral("/none"));
    QCOMPARE(resets.count(), 1);
    QCOMPARE(m_model->rowCount(), 0);
    QCOMPARE(m_model->thumbnails()->wishCount(), 0);
}

void KvDeskGalleryModelTest::dragCarriesFiles()
{
    const QString first = add(QStringLiteral("ä & b 1.png"));
    const QString second = add(QStringLiteral("b 2.png"));
    open();
    QCOMPARE(m_model->mimeTypes(),
             QStringList({QStringLiteral("GalleryDrag"), QStringLiteral("text/uri-list")}));
    QCOMPARE(m_model->supportedDragActions(), Qt::CopyAction);
    const QModelIndex a = m_model->indexOf(first);
    const QModelIndex b = m_model->indexOf(second);
    QVERIFY(m_model->flags(a).testFlag(Qt::ItemIsDragEnabled));
    const std::unique_ptr<QMimeData> data(m_model->mimeData({b, a}));
    QVERIFY(data->hasFormat(QStringLiteral("GalleryDrag")));
    QVERIFY(data->hasFormat(QStringLiteral("text/uri-list")));
    QCOMPARE(data->urls(), QList<QUrl>({QUrl::fromLocalFile(second), QUrl::fromLocalFile(first)}));
    QVERIFY(!m_model->mimeData({}));
}

void KvDeskGalleryModelTest::brokenPicturesAreNotDragged()
{
    m_pictures->addBroken(QStringLiteral("broken.png"));
    open();
    m_model->index(0).data(KvDeskGalleryModel::ThumbnailRole);
    QTRY_VERIFY(!m_model->flags(m_model->index(0)).testFlag(Qt::ItemIsDragEnabled));
    QVERIFY(m_model->flags(m_model->index(0)).testFlag(Qt::ItemIsSelectable));
}

void KvDeskGalleryModelTest::thousandsOfFiles()
{
    const QByteArray bytes = DeskFiles::bytes(add(QStringLiteral("0.png")));
    for (int i = 1; i < 5000; ++i) {
        QFile file(QStringLiteral("%1/%2.png").arg(m_path).arg(i));
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(bytes);
    }
    m_tester.reset();
    QElapsedTimer timer;
    timer.start();
    QSignalSpy spy(m_model.get(), SIGNAL(signalFolderRead()));
    QSignalSpy inserts(m_model.get(), SIGNAL(rowsInserted(QModelIndex,int,int)));
    m_model->setFolder(m_path);
    // Only the start; the folder itself is read elsewhere.
    QVERIFY2(timer.elapsed() < 200, qPrintable(QString::number(timer.elapsed())));
    QVERIFY(spy.wait(20000));
    QCOMPARE(m_model->rowCount(), 5000);
    QCOMPARE(inserts.count(), 1);
    QCOMPARE(m_model->index(4999).data().toString(), QStringLiteral("4999.png"));
    QCOMPARE(m_model->thumbnails()->wishCount(), 0);
}

STATREPORT_TEST_MAIN(KvDeskGalleryModelTest)
#include "KvDeskGalleryModelTest.moc"
