// SPDX-License-Identifier: MIT
#include "KvDeskGallery.h"

#include "DeskLog.h"
#include "FileDialogAnswerer.h"
#include "GalleryFolder.h"
#include "KvDeskActions.h"
#include "KvDeskEmptyState.h"
#include "KvDeskGalleryFolder.h"
#include "KvDeskGalleryModel.h"
#include "KvDeskGallerySettings.h"
#include "KvDeskGalleryView.h"
#include "KvDeskPanelHeader.h"
#include "KvDeskResources.h"
#include "kernel/ZtAppSettings.h"
#include "support/MessageBoxAnswerer.h"
#include "support/UnprivilegedUser.h"

#include <QClipboard>
#include <QComboBox>
#include <QDesktopServices>
#include <QMenu>
#include <QToolButton>

/// Takes the place of the system's file manager.
class FileManager : public QObject
{
    Q_OBJECT
public:
    QList<QUrl> opened;
public slots:
    void slotOpen(const QUrl &aUrl) { opened.append(aUrl); }
};

class KvDeskGalleryTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase();
    void init();
    void cleanup();

    void readsNothingBeforeItIsSeen();
    void showsTheSnapshotsAtFirst();
    void emptyStates();
    void foldersToChooseFrom();
    void choosesAFolder();
    void folderIsRemembered();
    void countsItsImages();
    void opens();
    void showsAFile();
    void showsAFileThatComesLater();
    void menuFollowsTheSelection();
    void showsInFolder();
    void copiesPaths();
    void removes_data();
    void removes();
    void removesSeveral();
    void tellsWhatWasNotRemoved();
    void usesTheFolderForSnapshots();
    void everythingHasAName();

private:
    QAction *menuAction(const QString &text) const;
    void show();
    void select(int row) { m_gallery->view()->setCurrentIndex(m_gallery->model()->index(row)); }

    std::unique_ptr<KvDeskActions> m_actions;
    std::unique_ptr<GalleryFolder> m_folder;
    std::unique_ptr<KvDeskGallery> m_gallery;
};

void KvDeskGalleryTest::initTestCase()
{
    qputenv("XDG_DATA_HOME", temporaryPath(QStringLiteral("data")).toLocal8Bit());
    QVERIFY(QDir().mkpath(temporaryPath(QStringLiteral("data/Trash/files"))));
    QVERIFY(QDir().mkpath(temporaryPath(QStringLiteral("data/Trash/info"))));
}

void KvDeskGalleryTest::init()
{
    StatReportTest::init();
    // Numbers are written as in every language.
    QLocale::setDefault(QLocale(QLocale::Arabic, QLocale::Egypt));
    KvDeskResources::ensure();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtStatusLog::getInstance()->clear();
    m_folder = std::make_unique<GalleryFolder>();
    KvDeskGallerySettings::setSnapshotsFolder(m_folder->path);
    m_actions = std::make_unique<KvDeskActions>();
    m_gallery = std::make_unique<KvDeskGallery>(m_actions.get());
    m_gallery->resize(700, 300);
}

void KvDeskGalleryTest::cleanup()
{
    m_gallery.reset();
    QLocale::setDefault(QLocale::c());
    StatReportTest::cleanup();
}

void KvDeskGalleryTest::show()
{
    QSignalSpy spy(m_gallery->model(), SIGNAL(signalFolderRead()));
    m_gallery->show();
    QVERIFY(spy.wait());
}

QAction *KvDeskGalleryTest::menuAction(const QString &text) const
{
    for (QAction *const action : m_gallery->menu()->actions()) {
        if (action->text() == text)
            return action;
    }
    return nullptr;
}

void KvDeskGalleryTest::readsNothingBeforeItIsSeen()
{
    QCOMPARE(m_gallery->model()->folder()->path(), QString());
    show();
    QCOMPARE(m_gallery->model()->folder()->path(), m_folder->path);
}

void KvDeskGalleryTest::showsTheSnapshotsAtFirst()
{
    m_folder->add(QStringLiteral("a.png"));
    show();
    QCOMPARE(m_gallery->folders()->currentText(), QStringLiteral("Snapshots"));
    QCOMPARE(m_gallery->folders()->toolTip(), m_folder->path);
    QCOMPARE(m_gallery->model()->rowCount(), 1);
    QVERIFY(!m_gallery->emptyState()->isVisible());
}

void KvDeskGalleryTest::emptyStates()
{
    show();
    QVERIFY(m_gallery->emptyState()->isVisible());
    QCOMPARE(
        m_gallery->emptyState()->text(),
        QStringLiteral("Snapshots (F9) and the images of a folder appear here; drag them onto report pages"));
    const QString other = temporaryPath(QStringLiteral("empty folder"));
    QVERIFY(QDir().mkpath(other));
    m_gallery->showFolder(other);
    QVERIFY(!m_gallery->emptyState()->isVisible());
    QTRY_VERIFY(m_gallery->emptyState()->isVisible());
    QCOMPARE(m_gallery->emptyState()->text(), QStringLiteral("There are no images in %1").arg(other));
    m_gallery->showFolder(other + QStringLiteral("/none"));
    QTRY_COMPARE(m_gallery->emptyState()->text(),
                 QStringLiteral("The folder %1/none does not exist").arg(other));
    DeskFiles::image(QStringLiteral("empty folder/a.png"));
    m_gallery->showFolder(other);
    QTRY_COMPARE(m_gallery->model()->rowCount(), 1);
    QVERIFY(!m_gallery->emptyState()->isVisible());
}

void KvDeskGalleryTest::foldersToChooseFrom()
{
    const GalleryFolder other;
    other.add(QStringLiteral("b.png"));
    show();
    QCOMPARE(m_gallery->folders()->count(), 1);
    m_gallery->showFolder(other.path);
    QCOMPARE(m_gallery->folders()->count(), 2);
    QCOMPARE(m_gallery->folders()->currentText(), QFileInfo(other.path).fileName());
    QCOMPARE(m_gallery->folders()->itemData(1, Qt::ToolTipRole).toString(), other.path);
    QTRY_COMPARE(m_gallery->model()->rowCount(), 1);
    // As the user does who picks the first one.
    m_gallery->folders()->setFocus();
    QTest::keyClick(m_gallery->folders(), Qt::Key_Home);
    QCOMPARE(m_gallery->model()->folder()->path(), m_folder->path);
    QCOMPARE(KvDeskGallerySettings::folder(), m_folder->path);
    QCOMPARE(m_gallery->folders()->count(), 2);
}

void KvDeskGalleryTest::choosesAFolder()
{
    const GalleryFolder other;
    other.add(QStringLiteral("b.png"));
    show();
    {
        const FileDialogAnswerer answerer{QString()};
        m_gallery->chooseButton()->click();
        QCOMPARE(answerer.dialogs().size(), 1);
        QCOMPARE(answerer.dialogs().first().title, QStringLiteral("Choose folder"));
        QCOMPARE(m_gallery->model()->folder()->path(), m_folder->path);
    }
    const FileDialogAnswerer answerer(other.path);
    m_gallery->chooseButton()->click();
    QCOMPARE(m_gallery->model()->folder()->path(), other.path);
    QTRY_COMPARE(m_gallery->model()->rowCount(), 1);
}

void KvDeskGalleryTest::folderIsRemembered()
{
    const GalleryFolder other;
    show();
    m_gallery->showFolder(other.path);
    m_gallery = std::make_unique<KvDeskGallery>(m_actions.get());
    show();
    QCOMPARE(m_gallery->model()->folder()->path(), other.path);
    QCOMPARE(m_gallery->folders()->currentIndex(), 1);
}

void KvDeskGalleryTest::countsItsImages()
{
    m_folder->add(QStringLiteral("a.png"));
    show();
    QCOMPARE(m_gallery->header()->note(), QStringLiteral("1"));
    m_folder->add(QStringLiteral("b.png"));
    QTRY_COMPARE(m_gallery->header()->note(), QStringLiteral("2"));
}

void KvDeskGalleryTest::opens()
{
    const QString a = m_folder->add(QStringLiteral("a.png"));
    show();
    QSignalSpy spy(m_gallery.get(), SIGNAL(signalOpenRequested(QString)));
    menuAction(QStringLiteral("&Open image"))->trigger();
    QCOMPARE(spy.count(), 0);
    select(0);
    QTest::keyClick(m_gallery->view(), Qt::Key_Return);
    QCOMPARE(spy.count(), 1);
    QCOMPARE(spy.first().first().toString(), a);
    QTest::mouseDClick(m_gallery->view()->viewport(), Qt::LeftButton, {},
                       m_gallery->view()->visualRect(m_gallery->model()->index(0)).center());
    QCOMPARE(spy.count(), 2);
}

void KvDeskGalleryTest::showsAFile()
{
    const GalleryFolder other;
    for (int i = 0; i < 40; ++i)
        other.add(QStringLiteral("%1.png").arg(i));
    show();
    m_gallery->slotShowFile(other.path + QStringLiteral("/35.png"));
    QTRY_COMPARE(m_gallery->view()->currentIndex().data().toString(), QStringLiteral("35.png"));
    QCOMPARE(m_gallery->view()->selectedRows().size(), 1);
    QVERIFY(m_gallery->view()->viewport()->rect().contains(
        m_gallery->view()->visualRect(m_gallery->view()->currentIndex())));
    QCOMPARE(KvDeskGallerySettings::folder(), other.path);
    m_gallery->slotShowFile(other.path + QStringLiteral("/2.png"));
    QTRY_COMPARE(m_gallery->view()->currentIndex().data().toString(), QStringLiteral("2.png"));
}

void KvDeskGalleryTest::showsAFileThatComesLater()
{
    m_folder->add(QStringLiteral("a.png"));
    show();
    QSignalSpy spy(m_gallery->model(), SIGNAL(signalFolderRead()));
    m_gallery->slotShowFile(m_folder->path + QStringLiteral("/b.png"));
    QVERIFY(spy.wait());
    QVERIFY(!m_gallery->view()->currentIndex().isValid());
    m_folder->add(QStringLiteral("b.png"));
    QTRY_COMPARE(m_gallery->view()->currentIndex().data().toString(), QStringLiteral("b.png"));
    // Once is enough.
    select(0);
    m_gallery->model()->folder()->slotRefresh();
    QVERIFY(spy.wait());
    QCOMPARE(m_gallery->view()->currentIndex().row(), 0);
}

void KvDeskGalleryTest::menuFollowsTheSelection()
{
    m_folder->add(QStringLiteral("a.png"));
    show();
    emit m_gallery->menu()->aboutToShow();
    QAction *const remove = menuAction(QStringLiteral("&Move to trash..."));
    QVERIFY(!remove->isEnabled());
    QCOMPARE(remove->toolTip(), QStringLiteral("Select an image first"));
    QVERIFY(!menuAction(QStringLiteral("Save s&napshots in this folder"))->isEnabled());
    QVERIFY(m_gallery->menu()->actions().contains(m_actions->action(KvDeskActions::SnapshotMeasurements)));
    select(0);
    emit m_gallery->menu()->aboutToShow();
    for (const char *text : {"&Open image", "&Show in folder", "&Copy path", "&Move to trash..."})
        QVERIFY2(menuAction(QLatin1String(text))->isEnabled(), text);
    if (QGuiApplication::platformName() == QLatin1String("offscreen")) {
        expectWarning(QRegularExpression(QStringLiteral("raise")));
        expectWarning(QRegularExpression(QStringLiteral("grabbing the keyboard")));
    }
    QContextMenuEvent event(QContextMenuEvent::Mouse, QPoint(20, 20), m_gallery->mapToGlobal(QPoint(20, 20)));
    QApplication::sendEvent(m_gallery->view()->viewport(), &event);
    QVERIFY(m_gallery->menu()->isVisible());
    m_gallery->menu()->close();
}

void KvDeskGalleryTest::showsInFolder()
{
    m_folder->add(QStringLiteral("a.png"));
    show();
    FileManager manager;
    QDesktopServices::setUrlHandler(QStringLiteral("file"), &manager, "slotOpen");
    menuAction(QStringLiteral("&Show in folder"))->trigger();
    QDesktopServices::unsetUrlHandler(QStringLiteral("file"));
    QCOMPARE(manager.opened, QList<QUrl>({QUrl::fromLocalFile(m_folder->path)}));
}

void KvDeskGalleryTest::copiesPaths()
{
    const QString a = m_folder->add(QStringLiteral("a.png"));
    const QString b = m_folder->add(QStringLiteral("b.png"));
    show();
    m_gallery->view()->selectAll();
    menuAction(QStringLiteral("&Copy path"))->trigger();
    QCOMPARE(QGuiApplication::clipboard()->text(), a + QLatin1Char('\n') + b);
}

void KvDeskGalleryTest::removes_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<QStringList>("left");
    QTest::newRow("no") << static_cast<int>(QMessageBox::Cancel)
                        << QStringList({QStringLiteral("a.png"), QStringLiteral("b.png")});
    QTest::newRow("yes") << static_cast<int>(QMessageBox::Yes) << QStringList(QStringLiteral("a.png"));
}

void KvDeskGalleryTest::removes()
{
    QFETCH(int, answer);
    QFETCH(QStringList, left);
    m_folder->add(QStringLiteral("a.png"));
    m_folder->add(QStringLiteral("b.png"));
    show();
    select(1);
    const MessageBoxAnswerer answerer(static_cast<QMessageBox::StandardButton>(answer));
    QTest::keyClick(m_gallery->view(), Qt::Key_Delete);
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(answerer.boxes().first().text, QStringLiteral("Move \"b.png\" to the trash?"));
    QCOMPARE(m_folder->names(), left);
    QTRY_COMPARE(m_gallery->model()->rowCount(), left.size());
    const QString trash = temporaryPath(QStringLiteral("data/Trash/files"));
    QCOMPARE(QDir(trash).entryList(QDir::Files).filter(QStringLiteral("b")).isEmpty(), left.size() == 2);
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information).size(), left.size() == 1 ? 1 : 0);
}

void KvDeskGalleryTest::removesSeveral()
{
    for (const char *name : {"x.png", "y.png", "z.png"})
        m_folder->add(QLatin1String(name));
    show();
    m_gallery->view()->selectAll();
    const MessageBoxAnswerer answerer(QMessageBox::Yes);
    menuAction(QStringLiteral("&Move to trash..."))->trigger();
    QCOMPARE(answerer.boxes().first().text, QStringLiteral("Move 3 selected image(s) to the trash?"));
    QCOMPARE(m_folder->names(), QStringList());
    QTRY_VERIFY(m_gallery->emptyState()->isVisible());
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information),
             QStringList(QStringLiteral("Moved to the trash: x.png, y.png, z.png")));
}

void KvDeskGalleryTest::tellsWhatWasNotRemoved()
{
    m_folder->add(QStringLiteral("kept.png"));
    m_folder->add(QStringLiteral("gone.png"));
    show();
    m_gallery->view()->selectAll();
    QFile::remove(m_folder->path + QStringLiteral("/gone.png"));
    const QFile::Permissions before = QFile::permissions(m_folder->path);
    QVERIFY(QFile::setPermissions(m_folder->path,
                                  QFile::ReadOwner | QFile::ExeOwner | QFile::ReadOther | QFile::ExeOther));
    const MessageBoxAnswerer answerer(QMessageBox::Yes);
    {
        const UnprivilegedUser user;
        m_gallery->slotRemove();
    }
    QVERIFY(QFile::setPermissions(m_folder->path, before));
    QCOMPARE(answerer.boxes().size(), 2);
    QCOMPARE(m_folder->names(), QStringList(QStringLiteral("kept.png")));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Error),
             QStringList(QStringLiteral("Not moved to the trash: kept.png")));
}

void KvDeskGalleryTest::usesTheFolderForSnapshots()
{
    const GalleryFolder other;
    show();
    m_gallery->showFolder(other.path);
    emit m_gallery->menu()->aboutToShow();
    QAction *const use = menuAction(QStringLiteral("Save s&napshots in this folder"));
    QVERIFY(use->isEnabled());
    use->trigger();
    QCOMPARE(KvDeskGallerySettings::snapshotsFolder(), other.path);
    QCOMPARE(m_gallery->folders()->currentText(), QStringLiteral("Snapshots"));
    QCOMPARE(DeskLog::messages(ZtAppStatus::Information),
             QStringList(QStringLiteral("Snapshots are saved in %1").arg(other.path)));
}

void KvDeskGalleryTest::everythingHasAName()
{
    for (const QToolButton *const button : m_gallery->findChildren<QToolButton *>()) {
        if (!button->parentWidget()->inherits("KvDeskPanelHeader"))
            continue;
        QVERIFY(!button->toolTip().isEmpty());
        QVERIFY(!button->accessibleName().isEmpty());
    }
    QCOMPARE(m_gallery->view()->accessibleName(), QStringLiteral("Gallery"));
    QCOMPARE(m_gallery->folders()->accessibleName(), QStringLiteral("Folder of the gallery"));
    QSignalSpy spy(m_gallery.get(), SIGNAL(signalCloseClicked()));
    m_gallery->header()->closeButton()->click();
    QCOMPARE(spy.count(), 1);
    QCOMPARE(m_gallery->header()->closeButton()->toolTip(), QStringLiteral("Hide the gallery"));
}

STATREPORT_TEST_MAIN(KvDeskGalleryTest)
#include "KvDeskGalleryTest.moc"
