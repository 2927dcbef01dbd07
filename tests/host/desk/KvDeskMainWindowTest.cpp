// SPDX-License-Identifier: MIT
#include "KvDeskMainWindow.h"

#include "DeskFiles.h"
#include "FakeCamera.h"
#include "GalleryFolder.h"
#include "KvDeskActions.h"
#include "KvDeskAutosave.h"
#include "KvDeskFileCommands.h"
#include "KvDeskGallery.h"
#include "KvDeskGalleryModel.h"
#include "KvDeskGallerySettings.h"
#include "KvDeskGalleryView.h"
#include "KvDeskImageView.h"
#include "KvDeskInlineEditor.h"
#include "KvDeskLiveBar.h"
#include "KvDeskObjectEditor.h"
#include "KvDeskPanelHeader.h"
#include "KvDeskRecentFiles.h"
#include "KvDeskRecoveryBar.h"
#include "KvDeskSelection.h"
#include "KvDeskSession.h"
#include "KvDeskSourceCommands.h"
#include "KvDeskSourceMenu.h"
#include "KvDeskStatusBar.h"
#include "KvDeskStatusLog.h"
#include "KvDeskTableView.h"
#include "KvDeskTheme.h"
#include "KvDeskToolColumn.h"
#include "KvDeskValueTable.h"
#include "KvDeskValueTableModel.h"
#include "gui/KvToolBase.h"
#include "gui/QtAdvancedStylesheet.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtFrameSourceCatalogue.h"
#include "measuring/ZtMeasuringDocument.h"
#include "support/MessageBoxAnswerer.h"
#include "support/RightToLeft.h"

#include <QLineEdit>

#include <functional>

namespace {

const QPolygonF diagonal = polygon({QPointF(0, 0), QPointF(10, 10)});

/// A window of a plug-in that may refuse to close.
class WindowThatStays : public QWidget
{
public:
    explicit WindowThatStays(QWidget *parent)
        : QWidget(parent, Qt::Window)
    {}
    bool isWilling = false;

protected:
    void closeEvent(QCloseEvent *event) override { event->setAccepted(isWilling); }
};

bool drop(QWidget *window, const QList<QUrl> &urls)
{
    QMimeData data;
    data.setUrls(urls);
    QDragEnterEvent enter(QPoint(10, 10), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    enter.ignore();
    QApplication::sendEvent(window, &enter);
    if (!enter.isAccepted())
        return false;
    QDropEvent event(QPointF(10, 10), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(window, &event);
    return event.isAccepted();
}

} // namespace

namespace {

using Work = std::function<void(KvDeskMainWindow *)>;

/// Clicks at the middle of the image, shifted by so many pixels.
void click(KvDeskMainWindow *window, const QPoint &shift)
{
    QWidget *const viewport = window->imageView()->viewport();
    QTest::mouseClick(viewport, Qt::LeftButton, Qt::NoModifier, viewport->rect().center() + shift);
}

void choose(KvDeskMainWindow *window, KvDeskActions::Id tool)
{
    window->actions()->action(tool)->trigger();
}

void makeHistory(KvDeskMainWindow *window)
{
    for (int i = 0; i < 3; ++i)
        window->objectEditor()->create(ZtDrawnType::Line, diagonal);
    window->objectEditor()->slotUndo();
}

} // namespace

Q_DECLARE_METATYPE(Work)

class KvDeskMainWindowTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void titleNamesTheSession();
    void closingAsks_data();
    void closingAsks();
    void endIsAnnouncedOnce();
    void endIsAnnouncedWhileEverythingLives();
    void pluginWindowCanHoldTheProgramBack();
    void pluginWindowsAreClosed();
    void sessionIsReplacedOnlyWhenAllowed();
    void dropsOpenFiles_data();
    void dropsOpenFiles();
    void dropsOfOtherThingsAreRefused();
    void droppedFolderIsShownInTheGallery();
    void droppedTablesCanBeUndone_data();
    void droppedTablesCanBeUndone();
    void toolsOpenFilesOfTheirKinds();
    void unknownFileIsALineOfTheLog();
    void unsavedWorkIsOfferedAfterACrash();
    void unsavedWorkStaysUntilTheEnd_data();
    void unsavedWorkStaysUntilTheEnd();
    void panelsDoNotTakeDrops();
    void windowIsRemembered();
    void panelsAreShownAndHidden();
    void galleryIsShownAndRemembered();
    void snapshotOpensTheGallery();
    void galleryOpensImages();
    void sourcesInTheMenuAndTheToolBar();
    void toolsComeIntoTheColumn();
    void firstToolIsActiveAtFirst();
    void activeToolsAreRemembered();
    void selectionGoesBothWays();
    void everyStepOfMeasuring();
    void statusBarFollowsTheImage();
    void warningForThePanelOpensIt();
    void messageForABoxIsShown();
    void recentSessions();
    void namesOfFilesKeepTheirDirection();
    void missingRecentSessionIsForgotten();
    void toggledTheme();
    void everyButtonIsExplained();
    void fitsIntoSmallScreens();
    void endsInTheMiddleOfAnything_data();
    void endsInTheMiddleOfAnything();
    void whatIsBeingWrittenIsKept();

private:
    void open();
    QAction *action(KvDeskActions::Id id) const { return m_window->actions()->action(id); }
    void restart();

    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskMainWindow> m_window;
};

void KvDeskMainWindowTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    ZtStatusLog::getInstance()->clear();
    restart();
}

void KvDeskMainWindowTest::cleanup()
{
    m_window.reset();
    m_document.reset();
    StatReportTest::cleanup();
}

void KvDeskMainWindowTest::restart()
{
    m_window.reset();
    m_document.reset();
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_window = std::make_unique<KvDeskMainWindow>(m_document.get());
    m_window->show();
}

void KvDeskMainWindowTest::open()
{
    QVERIFY(m_window->files()->openSession(DeskFiles::demoSession()));
    m_window->valueTable()->model()->flush();
    m_window->imageView()->flush();
}

void KvDeskMainWindowTest::titleNamesTheSession()
{
    QCOMPARE(m_window->windowTitle(), QStringLiteral("Untitled session[*] - Measuring Desk"));
    open();
    QCOMPARE(m_window->windowTitle(), QStringLiteral("demo.json[*] - Measuring Desk"));
    QVERIFY(!m_window->isWindowModified());
    m_document->addObject(ZtDrawnType::Line, diagonal);
    QVERIFY(m_window->isWindowModified());
}

void KvDeskMainWindowTest::closingAsks_data()
{
    QTest::addColumn<bool>("isModified");
    QTest::addColumn<int>("answer");
    QTest::addColumn<bool>("isClosed");
    QTest::newRow("unmodified") << false << static_cast<int>(QMessageBox::Cancel) << true;
    QTest::newRow("save") << true << static_cast<int>(QMessageBox::Save) << true;
    QTest::newRow("discard") << true << static_cast<int>(QMessageBox::Discard) << true;
    QTest::newRow("cancel") << true << static_cast<int>(QMessageBox::Cancel) << false;
}

void KvDeskMainWindowTest::closingAsks()
{
    QFETCH(bool, isModified);
    QFETCH(int, answer);
    QFETCH(bool, isClosed);
    QVERIFY(m_window->files()->saveSession(temporaryPath(QStringLiteral("closing.json"))));
    if (isModified)
        m_document->addObject(ZtDrawnType::Line, diagonal);
    QSignalSpy about(ZtSignalCenter::getInstance(), SIGNAL(signalAppAboutToClose()));
    QSignalSpy closed(m_window.get(), SIGNAL(signalClosed()));
    const MessageBoxAnswerer answerer(static_cast<QMessageBox::StandardButton>(answer));
    QCOMPARE(m_window->close(), isClosed);
    QCOMPARE(answerer.boxes().size(), isModified ? 1 : 0);
    QCOMPARE(about.count(), isClosed ? 1 : 0);
    QCOMPARE(closed.count(), isClosed ? 1 : 0);
    QCOMPARE(m_window->isVisible(), !isClosed);
}

void KvDeskMainWindowTest::endIsAnnouncedOnce()
{
    QSignalSpy about(ZtSignalCenter::getInstance(), SIGNAL(signalAppAboutToClose()));
    action(KvDeskActions::Quit)->trigger();
    QVERIFY(!m_window->isVisible());
    QCOMPARE(about.count(), 1);
    m_window->close();
    m_window.reset();
    QCOMPARE(about.count(), 1);
}

void KvDeskMainWindowTest::endIsAnnouncedWhileEverythingLives()
{
    open();
    int objects = 0;
    bool isVisible = false;
    QObject receiver;
    connect(ZtSignalCenter::getInstance(), &ZtSignalCenter::signalAppAboutToClose, &receiver, [&]() {
        objects = m_window->session()->objectCount();
        isVisible = m_window->isVisible();
    });
    m_window->close();
    QCOMPARE(objects, 33);
    QVERIFY(isVisible);
}

void KvDeskMainWindowTest::pluginWindowCanHoldTheProgramBack()
{
    WindowThatStays editor(m_window.get());
    editor.show();
    QSignalSpy about(ZtSignalCenter::getInstance(), SIGNAL(signalAppAboutToClose()));
    QVERIFY(!m_window->close());
    QVERIFY(m_window->isVisible());
    QCOMPARE(about.count(), 0);
    editor.isWilling = true;
    QVERIFY(m_window->close());
    QCOMPARE(about.count(), 1);
}

void KvDeskMainWindowTest::pluginWindowsAreClosed()
{
    QWidget statistics(m_window.get(), Qt::Window);
    statistics.show();
    QWidget hidden(m_window.get(), Qt::Window);
    QVERIFY(m_window->close());
    QVERIFY(!statistics.isVisible());
}

void KvDeskMainWindowTest::sessionIsReplacedOnlyWhenAllowed()
{
    m_document->addObject(ZtDrawnType::Line, diagonal);
    {
        const MessageBoxAnswerer answerer(QMessageBox::Cancel);
        QVERIFY(drop(m_window.get(), {QUrl::fromLocalFile(DeskFiles::demoSession())}));
        // The program that the file comes from is let go first.
        QCOMPARE(answerer.boxes().size(), 0);
        QTRY_COMPARE(answerer.boxes().size(), 1);
        QCOMPARE(m_window->session()->objectCount(), 1);
    }
    const MessageBoxAnswerer answerer(QMessageBox::Discard);
    QVERIFY(drop(m_window.get(), {QUrl::fromLocalFile(DeskFiles::demoSession())}));
    QTRY_COMPARE(m_window->session()->objectCount(), 33);
}

void KvDeskMainWindowTest::dropsOpenFiles_data()
{
    QTest::addColumn<QStringList>("files");
    QTest::addColumn<int>("objects");
    QTest::addColumn<bool>("hasImage");
    const QString image = DeskFiles::image(QStringLiteral("dropped image.png"));
    const QString table = DeskFiles::table(QStringLiteral("dropped.csv"));
    QTest::newRow("session") << QStringList(DeskFiles::demoSession()) << 33 << true;
    QTest::newRow("image") << QStringList(image) << 0 << true;
    QTest::newRow("table") << QStringList(table) << 2 << false;
    QTest::newRow("both") << QStringList({image, table}) << 2 << true;
    QTest::newRow("session after a table") << QStringList({table, DeskFiles::demoSession()}) << 35 << true;
}

void KvDeskMainWindowTest::dropsOpenFiles()
{
    QFETCH(QStringList, files);
    QFETCH(int, objects);
    QFETCH(bool, hasImage);
    QList<QUrl> urls;
    for (const QString &file : qAsConst(files))
        urls.append(QUrl::fromLocalFile(file));
    QVERIFY(drop(m_window.get(), urls));
    QTRY_COMPARE(m_window->session()->objectCount(), objects);
    QTRY_COMPARE(!m_window->imageView()->frame().isNull(), hasImage);
}

void KvDeskMainWindowTest::dropsOfOtherThingsAreRefused()
{
    QVERIFY(!drop(m_window.get(), {}));
    QVERIFY(!drop(m_window.get(), {QUrl(QStringLiteral("https://example.org/a.png"))}));
}

void KvDeskMainWindowTest::droppedTablesCanBeUndone_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QByteArray>("bytes");
    QTest::newRow("separated") << QStringLiteral("two.csv") << QByteArray("name,Length\nA,1\nB,2\n");
    QTest::newRow("records") << QStringLiteral("two.json") << QByteArray(R"([{"Length":1},{"Length":2}])");
    QTest::newRow("exported values")
        << QStringLiteral("values.json")
        << QByteArray(R"({"format":"statreport-values","version":1,"objects":[)"
                      R"({"type":"Line","index":1,"name":"A","values":[]},{"type":"Line","values":[]}]})");
}

void KvDeskMainWindowTest::droppedTablesCanBeUndone()
{
    QFETCH(QString, name);
    QFETCH(QByteArray, bytes);
    m_window->objectEditor()->create(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}}));
    QVERIFY(drop(m_window.get(), {QUrl::fromLocalFile(DeskFiles::text(name, bytes))}));
    QTRY_COMPARE(m_window->session()->objectCount(), 3);
    QVERIFY(action(KvDeskActions::Undo)->text().contains(name));
    action(KvDeskActions::Undo)->trigger();
    QCOMPARE(m_window->session()->objectCount(), 1);
    QVERIFY(action(KvDeskActions::Redo)->text().contains(name));
    action(KvDeskActions::Redo)->trigger();
    QCOMPARE(m_window->session()->objectCount(), 3);
}

void KvDeskMainWindowTest::droppedFolderIsShownInTheGallery()
{
    const QString folder = temporaryPath(QStringLiteral("pictures"));
    QDir().mkpath(folder);
    DeskFiles::image(QStringLiteral("pictures/a.png"));
    QVERIFY(!m_window->gallery()->isVisible());
    QVERIFY(drop(m_window.get(), {QUrl::fromLocalFile(folder)}));
    QTRY_VERIFY(m_window->gallery()->isVisible());
    QTRY_COMPARE(m_window->gallery()->model()->rowCount(), 1);
    QCOMPARE(m_window->session()->objectCount(), 0);
}

void KvDeskMainWindowTest::toolsOpenFilesOfTheirKinds()
{
    auto *const tool =
        new KvToolBase(m_window.get(), QIcon(), QStringLiteral("Reports"), QStringLiteral("reports"), false);
    tool->setFileSuffixes({QStringLiteral("rtp")});
    QSignalSpy given(tool, SIGNAL(fileGiven(QString)));
    const QString path = DeskFiles::text(QStringLiteral("a.rtp"), QByteArray("{}"));
    QVERIFY(drop(m_window.get(), {QUrl::fromLocalFile(path), QUrl::fromLocalFile(DeskFiles::table())}));
    QTRY_COMPARE(m_window->session()->objectCount(), 2);
    QCOMPARE(given, QList<QVariantList>({{path}}));
    QVERIFY(tool->isActivated());
}

void KvDeskMainWindowTest::unknownFileIsALineOfTheLog()
{
    const QString path = DeskFiles::text(QStringLiteral("report.pdf"), QByteArray("%PDF\0\1", 6));
    const MessageBoxAnswerer answerer;
    QVERIFY(drop(m_window.get(), {QUrl::fromLocalFile(path), QUrl::fromLocalFile(DeskFiles::table())}));
    QTRY_COMPARE(m_window->session()->objectCount(), 2);
    QCOMPARE(m_window->deskStatusBar()->message(),
             QStringLiteral("Neither a session, an image nor a table: report.pdf"));
    QCOMPARE(answerer.boxes().size(), 0);
}

void KvDeskMainWindowTest::unsavedWorkIsOfferedAfterACrash()
{
    const QString folder = temporaryPath(QStringLiteral("crash"));
    QVERIFY(!m_window->recoveryBar());
    m_window->startRecovery(folder);
    QVERIFY(!m_window->recoveryBar()->isVisible());
    m_window->autosave()->setDelay(10);
    open();
    m_document->addObject(ZtDrawnType::Line, diagonal);
    QTRY_VERIFY(QFileInfo::exists(m_window->autosave()->file()));
    // Nobody was asked.
    restart();
    m_window->startRecovery(folder);
    QVERIFY(m_window->recoveryBar()->isVisible());
    QVERIFY(m_window->recoveryBar()->mapTo(m_window.get(), QPoint()).y() <
            m_window->imageView()->mapTo(m_window.get(), QPoint()).y());
    m_window->recoveryBar()->restoreButton()->click();
    QCOMPARE(m_window->session()->objectCount(), 34);
    QCOMPARE(m_window->windowTitle(), QStringLiteral("demo.json[*] - Measuring Desk"));
    QVERIFY(m_window->isWindowModified());
    QVERIFY(!m_window->recoveryBar()->isVisible());
    const MessageBoxAnswerer answerer(QMessageBox::Discard);
    QVERIFY(m_window->close());
}

void KvDeskMainWindowTest::unsavedWorkStaysUntilTheEnd_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<bool>("stays");
    QTest::newRow("discard") << static_cast<int>(QMessageBox::Discard) << false;
    QTest::newRow("cancel") << static_cast<int>(QMessageBox::Cancel) << true;
}

void KvDeskMainWindowTest::unsavedWorkStaysUntilTheEnd()
{
    QFETCH(int, answer);
    QFETCH(bool, stays);
    const QString folder = temporaryPath(QStringLiteral("end") + QString::number(answer));
    m_window->startRecovery(folder);
    m_window->autosave()->setDelay(10);
    m_document->addObject(ZtDrawnType::Line, diagonal);
    QTRY_VERIFY(QFileInfo::exists(m_window->autosave()->file()));
    const MessageBoxAnswerer answerer(static_cast<QMessageBox::StandardButton>(answer));
    QCOMPARE(m_window->close(), !stays);
    QCOMPARE(QDir(folder).entryList({QStringLiteral("*.recovery")}, QDir::Files).size(), stays ? 1 : 0);
}

void KvDeskMainWindowTest::panelsDoNotTakeDrops()
{
    // Who takes drops keeps them from the window.
    for (const QWidget *const widget : m_window->findChildren<QWidget *>())
        QVERIFY2(!widget->acceptDrops() || widget->isWindow(), widget->metaObject()->className());
}

void KvDeskMainWindowTest::windowIsRemembered()
{
    m_window->resize(900, 600);
    m_window->move(30, 40);
    auto *const splitter = m_window->valueTable()->parentWidget();
    qobject_cast<QSplitter *>(splitter)->setSizes({500, 400});
    action(KvDeskActions::ShowLog)->setChecked(true);
    action(KvDeskActions::ShowLabels)->setChecked(false);
    action(KvDeskActions::ShowRulers)->setChecked(false);
    QCoreApplication::processEvents();
    const QSize size = m_window->size();
    const int width = m_window->valueTable()->width();
    QVERIFY(m_window->close());

    ZtAppSettings::beginGroupAbsolute(QStringLiteral("DeskWindow"));
    QVERIFY(!ZtAppSettings::value(QStringLiteral("geometry")).toByteArray().isEmpty());
    QVERIFY(!ZtAppSettings::value(QStringLiteral("state")).toByteArray().isEmpty());
    ZtAppSettings::endGroup();

    restart();
    QTRY_COMPARE(m_window->size(), size);
    QTRY_COMPARE(m_window->valueTable()->width(), width);
    QVERIFY(m_window->statusLog()->isVisible());
    QVERIFY(action(KvDeskActions::ShowLog)->isChecked());
    QVERIFY(!m_window->imageView()->areLabelsVisible());
    QVERIFY(!action(KvDeskActions::ShowLabels)->isChecked());
    QVERIFY(!m_window->imageView()->areRulersVisible());
    QVERIFY(!action(KvDeskActions::ShowRulers)->isChecked());
}

void KvDeskMainWindowTest::panelsAreShownAndHidden()
{
    QVERIFY(m_window->valueTable()->isVisible());
    QVERIFY(!m_window->statusLog()->isVisible());
    action(KvDeskActions::ShowValues)->trigger();
    QVERIFY(!m_window->valueTable()->isVisible());
    action(KvDeskActions::ShowLog)->trigger();
    QVERIFY(m_window->statusLog()->isVisible());
    m_window->statusLog()->header()->closeButton()->click();
    QVERIFY(!m_window->statusLog()->isVisible());
    QVERIFY(!action(KvDeskActions::ShowLog)->isChecked());
    action(KvDeskActions::ShowValues)->trigger();
    m_window->valueTable()->header()->closeButton()->click();
    QVERIFY(!action(KvDeskActions::ShowValues)->isChecked());
}

void KvDeskMainWindowTest::galleryIsShownAndRemembered()
{
    QVERIFY(!m_window->gallery()->isVisible());
    action(KvDeskActions::ShowGallery)->trigger();
    QVERIFY(m_window->gallery()->isVisible());
    QVERIFY(m_window->close());
    restart();
    QVERIFY(m_window->gallery()->isVisible());
    QVERIFY(action(KvDeskActions::ShowGallery)->isChecked());
    m_window->gallery()->header()->closeButton()->click();
    QVERIFY(!m_window->gallery()->isVisible());
    QVERIFY(!action(KvDeskActions::ShowGallery)->isChecked());
}

void KvDeskMainWindowTest::snapshotOpensTheGallery()
{
    const GalleryFolder folder;
    KvDeskGallerySettings::setSnapshotsFolder(folder.path);
    QVERIFY(!action(KvDeskActions::TakeSnapshot)->isEnabled());
    open();
    QVERIFY(action(KvDeskActions::TakeSnapshot)->isEnabled());
    action(KvDeskActions::TakeSnapshot)->trigger();
    QTRY_VERIFY_WITH_TIMEOUT(m_window->gallery()->isVisible(), 20000);
    QTRY_COMPARE(m_window->gallery()->view()->selectedRows().size(), 1);
    QCOMPARE(folder.names(), QStringList(m_window->gallery()->view()->currentIndex().data().toString()));
}

void KvDeskMainWindowTest::galleryOpensImages()
{
    const GalleryFolder folder;
    const QString path = folder.add(QStringLiteral("a.png"), QSize(50, 40));
    KvDeskGallerySettings::setSnapshotsFolder(folder.path);
    action(KvDeskActions::ShowGallery)->trigger();
    m_window->gallery()->slotShowFile(path);
    QTRY_VERIFY(m_window->gallery()->view()->currentIndex().isValid());
    m_window->gallery()->slotOpen();
    QTRY_COMPARE(m_document->imagePath(), path);
    QCOMPARE(m_window->imageView()->frame().image().size(), QSize(50, 40));
}

void KvDeskMainWindowTest::sourcesInTheMenuAndTheToolBar()
{
    QAction *const menuAction = m_window->sourceMenu()->menuAction();
    const QList<QMenu *> menus =
        m_window->menuBar()->findChildren<QMenu *>() + m_window->findChildren<QMenu *>();
    QVERIFY(std::any_of(menus.begin(), menus.end(),
                        [menuAction](const QMenu *menu) { return menu->actions().contains(menuAction); }));
    const QList<QToolButton *> buttons = m_window->findChildren<QToolButton *>();
    QVERIFY(std::any_of(buttons.begin(), buttons.end(), [this](const QToolButton *button) {
        return button->menu() == m_window->sourceMenu() && !button->accessibleName().isEmpty();
    }));
    QVERIFY(!m_window->liveBar()->isVisible());
    const GalleryFolder folder;
    folder.add(QStringLiteral("a.png"), QSize(50, 40));
    QVERIFY(m_window->sources()->open(ZtFrameSourceCatalogue::infoOfPath(folder.path)));
    QVERIFY(m_window->liveBar()->isVisible());
    QTRY_COMPARE(m_window->imageView()->frame().image().size(), QSize(50, 40));
    QVERIFY(action(KvDeskActions::TakeSnapshot)->isEnabled());
    QVERIFY(m_window->minimumSizeHint().width() <= 1024);
}

void KvDeskMainWindowTest::toolsComeIntoTheColumn()
{
    QVERIFY(!m_window->toolColumn()->isVisible());
    const auto *const tool =
        new KvToolBase(m_window.get(), QIcon(), QStringLiteral("Report"), QStringLiteral("report"), false);
    QVERIFY(m_window->toolColumn()->isVisible());
    QVERIFY(m_window->toolColumn()->isAncestorOf(tool->getToolButton()));
    QVERIFY(m_window->toolColumn()->isAncestorOf(tool->panel()));
}

void KvDeskMainWindowTest::firstToolIsActiveAtFirst()
{
    const auto *const first =
        new KvToolBase(m_window.get(), QIcon(), QStringLiteral("A"), QStringLiteral("a"), false);
    const auto *const second =
        new KvToolBase(m_window.get(), QIcon(), QStringLiteral("B"), QStringLiteral("b"), false);
    QSignalSpy spy(first, SIGNAL(toolActivated(bool)));
    m_window->restoreTools();
    QVERIFY(first->isActivated());
    QVERIFY(!second->isActivated());
    QCOMPARE(spy.count(), 1);
    QVERIFY(first->panel()->isVisible());
}

void KvDeskMainWindowTest::activeToolsAreRemembered()
{
    const auto addTools = [this]() {
        QVector<KvToolBase *> tools;
        for (const char *name : {"a", "b", "c"})
            tools.append(
                new KvToolBase(m_window.get(), QIcon(), QLatin1String(name), QLatin1String(name), false));
        return tools;
    };
    QVector<KvToolBase *> tools = addTools();
    tools.at(1)->getToolButton()->setChecked(true);
    QVERIFY(m_window->close());
    restart();
    tools = addTools();
    m_window->restoreTools();
    QVERIFY(!tools.at(0)->isActivated());
    QVERIFY(tools.at(1)->isActivated());
    QVERIFY(!tools.at(2)->isActivated());
}

void KvDeskMainWindowTest::selectionGoesBothWays()
{
    open();
    m_window->valueTable()->view()->selectRow(0);
    QCOMPARE(m_window->imageView()->selectedObject(), (KvDeskObjectId{ZtDrawnType::Rectangle, 1}));
    const QPoint rim = m_window->imageView()->mapFromScene(QPointF(217.8, 575));
    QTest::mouseClick(m_window->imageView()->viewport(), Qt::LeftButton, Qt::NoModifier, rim);
    QCOMPARE(m_window->selection()->current(), (KvDeskObjectId{ZtDrawnType::Rectangle, 2}));
    QCOMPARE(m_window->valueTable()->view()->selectionModel()->selectedRows().size(), 3);
}

void KvDeskMainWindowTest::everyStepOfMeasuring()
{
    QVERIFY(m_window->files()->openImage(DeskFiles::image(QStringLiteral("measured.png"), QSize(400, 300))));
    KvDeskImageView *const view = m_window->imageView();
    action(KvDeskActions::LineTool)->trigger();
    const QPoint middle = view->viewport()->rect().center();
    QTest::mouseClick(view->viewport(), Qt::LeftButton, Qt::NoModifier, middle);
    QTest::mouseClick(view->viewport(), Qt::LeftButton, Qt::NoModifier, middle + QPoint(80, 0));
    QCOMPARE(m_window->session()->objectCount(), 1);
    QCOMPARE(m_window->selection()->current(), (KvDeskObjectId{ZtDrawnType::Line, 1}));
    QVERIFY(m_window->isWindowModified());
    QCOMPARE(action(KvDeskActions::Undo)->text(), QStringLiteral("&Undo drawing of Line 1"));
    action(KvDeskActions::Undo)->trigger();
    QCOMPARE(m_window->session()->objectCount(), 0);
    action(KvDeskActions::Redo)->trigger();
    QCOMPARE(m_window->session()->objectCount(), 1);
    action(KvDeskActions::Delete)->trigger();
    QCOMPARE(m_window->session()->objectCount(), 0);
}

void KvDeskMainWindowTest::statusBarFollowsTheImage()
{
    QCOMPARE(m_window->deskStatusBar()->imageText(), QString());
    open();
    QCOMPARE(m_window->deskStatusBar()->imageText(), QStringLiteral("960 × 720 px, 12.5 μm/px"));
    action(KvDeskActions::ZoomActual)->trigger();
    QCOMPARE(m_window->deskStatusBar()->zoomText(), QStringLiteral("100 %"));
    QCOMPARE(m_window->deskStatusBar()->message(),
             QStringLiteral("Session opened: demo.json (33 object(s))"));
    m_document->clear();
    QCOMPARE(m_window->deskStatusBar()->imageText(), QString());
}

void KvDeskMainWindowTest::warningForThePanelOpensIt()
{
    ZtAppStatus information(ZtAppStatus::Information);
    information.setPreferredDestination(ZtAppStatus::StatusPanel);
    information.setAndLogStatus(ZtAppStatus::Information, 0, QStringLiteral("Fine"), QString());
    QVERIFY(!m_window->statusLog()->isVisible());
    ZtAppStatus warning(2, 0);
    warning.setPreferredDestination(4);
    warning.setAndLogStatus(2, 0, QStringLiteral("No report template selected."), QString());
    QVERIFY(m_window->statusLog()->isVisible());
}

void KvDeskMainWindowTest::messageForABoxIsShown()
{
    const MessageBoxAnswerer answerer;
    ZtAppStatus error(ZtAppStatus::Error);
    error.setPreferredDestination(ZtAppStatus::MessageBox);
    error.setAndLogStatus(ZtAppStatus::Error, 0, QStringLiteral("It broke"), QString());
    QTRY_COMPARE(answerer.boxes().size(), 1);
    QCOMPARE(answerer.boxes().first().text, QStringLiteral("It broke"));
}

void KvDeskMainWindowTest::recentSessions()
{
    emit m_window->recentMenu()->aboutToShow();
    QCOMPARE(m_window->recentMenu()->actions().size(), 1);
    QCOMPARE(m_window->recentMenu()->actions().first()->text(), QStringLiteral("None yet"));
    QVERIFY(!m_window->recentMenu()->actions().first()->isEnabled());
    open();
    m_window->session()->clear();
    KvDeskRecentFiles::add(QStringLiteral("/x/this & that.json"));
    emit m_window->recentMenu()->aboutToShow();
    QCOMPARE(m_window->recentMenu()->actions().at(0)->text(), QStringLiteral("this && that.json"));
    m_window->recentMenu()->actions().at(1)->trigger();
    QCOMPARE(m_window->session()->path(), DeskFiles::demoSession());
}

void KvDeskMainWindowTest::namesOfFilesKeepTheirDirection()
{
    const RightToLeft arabic;
    const QString name = RightToLeft::isolated(QStringLiteral("demo.json"));
    open();
    QCOMPARE(m_window->windowTitle(), name + QStringLiteral("[*] - Measuring Desk"));
    QVERIFY2(m_window->deskStatusBar()->message().contains(name),
             qPrintable(m_window->deskStatusBar()->message()));
    emit m_window->recentMenu()->aboutToShow();
    const QAction *const recent = m_window->recentMenu()->actions().first();
    QCOMPARE(recent->text(), name);
    QCOMPARE(recent->toolTip(), RightToLeft::isolated(DeskFiles::demoSession()));
    // What is opened and remembered is the file itself.
    QCOMPARE(recent->data().toString(), DeskFiles::demoSession());
    QCOMPARE(KvDeskRecentFiles::paths(), QStringList(DeskFiles::demoSession()));
    QCOMPARE(m_window->session()->path(), DeskFiles::demoSession());
}

void KvDeskMainWindowTest::missingRecentSessionIsForgotten()
{
    KvDeskRecentFiles::add(QStringLiteral("/none/gone.json"));
    emit m_window->recentMenu()->aboutToShow();
    const MessageBoxAnswerer answerer;
    m_window->recentMenu()->actions().first()->trigger();
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(KvDeskRecentFiles::paths(), QStringList());
}

void KvDeskMainWindowTest::toggledTheme()
{
    KvDeskTheme::apply(QStringLiteral("Dark"));
    action(KvDeskActions::ToggleTheme)->trigger();
    QCOMPARE(acss::QtAdvancedStylesheet::getInstance()->currentTheme(), QStringLiteral("Light"));
    QCOMPARE(KvDeskTheme::stored(), QStringLiteral("Light"));
    KvDeskTheme::apply(QStringLiteral("Dark"));
}

void KvDeskMainWindowTest::everyButtonIsExplained()
{
    int count = 0;
    for (const QToolButton *const button : m_window->findChildren<QToolButton *>()) {
        if (!button->isVisible())
            continue;
        ++count;
        QVERIFY2(!button->toolTip().isEmpty(), qPrintable(button->objectName() + button->text()));
        QVERIFY(!button->icon().isNull());
    }
    QVERIFY(count >= 12);
}

void KvDeskMainWindowTest::fitsIntoSmallScreens()
{
    new KvToolBase(m_window.get(), QIcon(), QStringLiteral("Report & Statistic"), QStringLiteral("report"),
                   true);
    action(KvDeskActions::ShowLog)->setChecked(true);
    open();
    QVERIFY(m_window->minimumSizeHint().width() <= 1024);
    QVERIFY(m_window->minimumSizeHint().height() <= 640);
}

void KvDeskMainWindowTest::endsInTheMiddleOfAnything_data()
{
    QTest::addColumn<bool>("isClosedFirst");
    QTest::addColumn<Work>("work");
    const auto row = [](const char *name, const Work &work) {
        QTest::addRow("%s, closed", name) << true << work;
        QTest::addRow("%s, deleted at once", name) << false << work;
    };
    row("history", [](KvDeskMainWindow *w) { makeHistory(w); });
    row("running source", [](KvDeskMainWindow *w) {
        auto camera = std::make_unique<FakeCamera>();
        FakeCamera *const running = camera.get();
        w->session()->showSource(std::move(camera));
        running->start();
        running->deliver();
        QTRY_COMPARE(w->imageView()->frame().image().size(), QSize(7, 5));
        running->deliver(Qt::blue); // still on its way
    });
    row("open plug-in panel", [](KvDeskMainWindow *w) {
        auto *const tool = new KvToolBase(w, QIcon(), QStringLiteral("A"), QStringLiteral("a"), true);
        tool->setGuiWidget(new QLineEdit);
        tool->guiWidget()->setFocus();
        makeHistory(w);
    });
    row("half-drawn line", [](KvDeskMainWindow *w) {
        choose(w, KvDeskActions::LineTool);
        click(w, QPoint());
    });
    row("half-drawn polygon", [](KvDeskMainWindow *w) {
        choose(w, KvDeskActions::PolygonTool);
        click(w, QPoint());
        click(w, QPoint(40, 0));
        click(w, QPoint(40, 40));
    });
    row("object being dragged", [](KvDeskMainWindow *w) {
        makeHistory(w);
        QWidget *const viewport = w->imageView()->viewport();
        const QPoint place = w->imageView()->viewportTransform().map(QPointF(5, 5)).toPoint();
        QTest::mousePress(viewport, Qt::LeftButton, Qt::NoModifier, place);
        QMouseEvent move(QEvent::MouseMove, QPointF(place + QPoint(30, 10)), Qt::NoButton, Qt::LeftButton,
                         Qt::NoModifier);
        QApplication::sendEvent(viewport, &move);
    });
    row("name being written", [](KvDeskMainWindow *w) {
        makeHistory(w);
        w->imageView()->inlineEditor()->rename({ZtDrawnType::Line, 1});
        QTest::keyClicks(w->imageView()->inlineEditor(), QStringLiteral("Edge"));
    });
    row("note being written", [](KvDeskMainWindow *w) {
        choose(w, KvDeskActions::NoteTool);
        click(w, QPoint());
        QTest::keyClicks(w->imageView()->inlineEditor(), QStringLiteral("Look"));
    });
    row("counting", [](KvDeskMainWindow *w) {
        choose(w, KvDeskActions::CounterTool);
        click(w, QPoint());
        click(w, QPoint(30, 0));
    });
    row("calibrating", [](KvDeskMainWindow *w) {
        w->files()->openImage(DeskFiles::image(QStringLiteral("calibrated.png"), QSize(400, 300)));
        w->objectEditor()->setCalibration(ZtCalibration(3.0));
        makeHistory(w);
    });
}

void KvDeskMainWindowTest::endsInTheMiddleOfAnything()
{
    QFETCH(bool, isClosedFirst);
    QFETCH(Work, work);
    QVERIFY(m_window->files()->openImage(DeskFiles::image(QStringLiteral("ended.png"), QSize(400, 300))));
    m_window->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
    work(m_window.get());
    if (isClosedFirst) {
        MessageBoxAnswerer answerer(QMessageBox::Discard);
        QVERIFY(m_window->close());
    }
    const QPointer<KvDeskObjectEditor> editor = m_window->objectEditor();
    const int objects = m_window->session()->objectCount();
    m_window.reset();
    QVERIFY(!editor);
    QCoreApplication::processEvents();
    // The end of the window changes nothing of what was measured, and the document goes on without it.
    QCOMPARE(KvDeskSession(m_document.get()).objectCount(), objects);
    QVERIFY(m_document->addObject(ZtDrawnType::Line, diagonal) > 0);
    m_document->setCalibration(ZtCalibration(4.0));
    m_document->clear();
}

void KvDeskMainWindowTest::whatIsBeingWrittenIsKept()
{
    QVERIFY(m_window->files()->openImage(DeskFiles::image(QStringLiteral("noted.png"), QSize(400, 300))));
    ZtFault fault;
    QVERIFY(m_window->session()->save(temporaryPath(QStringLiteral("noted.json")), &fault));
    choose(m_window.get(), KvDeskActions::NoteTool);
    click(m_window.get(), QPoint());
    QTest::keyClicks(m_window->imageView()->inlineEditor(), QStringLiteral("Look"));
    MessageBoxAnswerer answerer(QMessageBox::Cancel);
    QVERIFY(!m_window->close());
    QCOMPARE(answerer.boxes().size(), 1);
    QCOMPARE(m_window->session()->objectCount(), 1);
    QVERIFY(m_window->isWindowModified());
}

STATREPORT_TEST_MAIN(KvDeskMainWindowTest)
#include "KvDeskMainWindowTest.moc"
