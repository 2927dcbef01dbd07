// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "DeskUser.h"
#include "KvDeskActions.h"
#include "KvDeskGallery.h"
#include "KvDeskGalleryModel.h"
#include "KvDeskGallerySettings.h"
#include "KvDeskGalleryView.h"
#include "KvDeskStatusLog.h"
#include "RunningDesk.h"
#include "kernel/ZtAppSettings.h"

#include <QAction>
#include <QDir>
#include <QImage>

/**
 * Takes pictures from the Desk's gallery to the pages of a report, as a person would: off-screen and, with
 * real mouse and keys, under an X server.
 */
class DeskGalleryReportTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void pictureBecomesABlock();
    void pictureReplacesThatOfABlock();
    void firstOfSeveralIsTaken();
    void snapshotGoesIntoTheReport();
    void otherFilesAreNotForReports();

private:
    QString add(const QString &name, const QColor &color);
    void openGallery();
    void openEditor();
    void dragToPages(const QString &path, const QPoint &to);
    KvDeskGallery *gallery() const { return m_desk->window()->gallery(); }
    QModelIndex indexOf(const QString &path) const { return gallery()->model()->indexOf(path); }
    /** Whether a block shows a colour in its middle. */
    bool shows(int piece, const QColor &color) const;

    std::unique_ptr<RunningDesk> m_desk;
    DeskUser m_user;
    QString m_folder;
    int m_count = 0;
};

void DeskGalleryReportTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    m_folder = temporaryPath(QStringLiteral("gallery %1").arg(++m_count));
    QVERIFY(QDir().mkpath(m_folder));
    KvDeskGallerySettings::setSnapshotsFolder(m_folder);
    m_desk = std::make_unique<RunningDesk>();
    m_desk->window()->move(0, 0);
    m_desk->window()->resize(900, 700);
    QVERIFY(QTest::qWaitForWindowExposed(m_desk->window()));
    m_user.activate(m_desk->window());
}

void DeskGalleryReportTest::cleanup()
{
    m_desk.reset();
    StatReportTest::cleanup();
}

QString DeskGalleryReportTest::add(const QString &name, const QColor &color)
{
    QImage image(400, 300, QImage::Format_RGB32);
    image.fill(color);
    const QString path = m_folder + QLatin1Char('/') + name;
    return image.save(path) ? path : QString();
}

void DeskGalleryReportTest::openGallery()
{
    QSignalSpy spy(gallery()->model(), SIGNAL(signalFolderRead()));
    m_user.press(Qt::Key_F5);
    QTRY_VERIFY(gallery()->isVisible());
    QTRY_VERIFY(spy.count() > 0);
}

// Beside the main window: both have to be seen.
void DeskGalleryReportTest::openEditor()
{
    m_user.click(m_desk->button("theEditorButton"));
    QTRY_VERIFY(m_desk->editor() && m_desk->editor()->isVisible());
    QVERIFY(QTest::qWaitForWindowExposed(m_desk->editor()));
    m_desk->editor()->move(560, 0);
    m_desk->editor()->resize(1000, 600);
    m_user.activate(m_desk->editor());
    QTest::qWait(100);
    // The gallery's first pictures lie left of the editor, at the bottom of the main window.
    QVERIFY(m_desk->pages());
}

void DeskGalleryReportTest::dragToPages(const QString &path, const QPoint &to)
{
    KvDeskGalleryView *const view = gallery()->view();
    QTRY_VERIFY(indexOf(path).isValid());
    QTRY_VERIFY(!indexOf(path).data(KvDeskGalleryModel::ThumbnailRole).value<QImage>().isNull());
    m_user.drag(view->viewport(), view->visualRect(indexOf(path)).center(), m_desk->pages()->viewport(), to);
}

bool DeskGalleryReportTest::shows(int piece, const QColor &color) const
{
    const QWidget *const widget = m_desk->pieces().at(piece)->widget();
    const QImage shown = const_cast<QWidget *>(widget)->grab().toImage();
    return shown.pixelColor(shown.rect().center()) == color;
}

void DeskGalleryReportTest::pictureBecomesABlock()
{
    const QString red = add(QStringLiteral("red.png"), Qt::red);
    openGallery();
    openEditor();
    dragToPages(red, QPoint(300, 200));
    QTRY_COMPARE(m_desk->pieceClasses(), QStringList(QStringLiteral("KvImageWidget")));
    QTRY_VERIFY(shows(0, Qt::red));
    QTRY_VERIFY(m_desk->options());
    // Copied, not moved.
    QVERIFY(QFile::exists(red));
}

void DeskGalleryReportTest::pictureReplacesThatOfABlock()
{
    const QString blue = add(QStringLiteral("blue.png"), Qt::blue);
    const QString red = add(QStringLiteral("red.png"), Qt::red);
    openGallery();
    openEditor();
    dragToPages(red, QPoint(300, 200));
    QTRY_COMPARE(m_desk->pieces().size(), 1);
    QTRY_VERIFY(shows(0, Qt::red));
    dragToPages(blue, m_desk->pages()->mapFromScene(m_desk->centerOf(m_desk->pieces().first())));
    QTRY_VERIFY(shows(0, Qt::blue));
    QCOMPARE(m_desk->pieces().size(), 1);
}

void DeskGalleryReportTest::firstOfSeveralIsTaken()
{
    const QString blue = add(QStringLiteral("blue.png"), Qt::blue);
    const QString red = add(QStringLiteral("red.png"), Qt::red);
    openGallery();
    openEditor();
    QTRY_VERIFY(indexOf(red).isValid());
    gallery()->view()->selectAll();
    dragToPages(red, QPoint(300, 200));
    QTRY_COMPARE(m_desk->pieceClasses(), QStringList(QStringLiteral("KvImageWidget")));
    QTRY_VERIFY(shows(0, Qt::red));
}

void DeskGalleryReportTest::snapshotGoesIntoTheReport()
{
    QVERIFY(
        m_desk->window()->files()->openSession(sourcePath(QStringLiteral("examples/sessions/demo.json"))));
    m_user.press(Qt::Key_F9);
    // The gallery opens for it and selects it.
    QTRY_VERIFY_WITH_TIMEOUT(gallery()->isVisible(), 20000);
    QTRY_COMPARE(gallery()->view()->selectedRows().size(), 1);
    const QString path = gallery()->view()->currentIndex().data(KvDeskGalleryModel::PathRole).toString();
    QCOMPARE(QImage(path).size(), QSize(960, 720));
    openEditor();
    dragToPages(path, QPoint(300, 200));
    QTRY_COMPARE(m_desk->pieceClasses(), QStringList(QStringLiteral("KvImageWidget")));
}

void DeskGalleryReportTest::otherFilesAreNotForReports()
{
    // A picture to the gallery, but of no format that reports take.
    const QString strange = add(QStringLiteral("a.ppm"), Qt::red);
    QVERIFY(!strange.isEmpty());
    openGallery();
    openEditor();
    dragToPages(strange, QPoint(300, 200));
    QCoreApplication::processEvents();
    QCOMPARE(m_desk->pieces().size(), 0);
}

STATREPORT_TEST_MAIN(DeskGalleryReportTest)
#include "DeskGalleryReportTest.moc"
