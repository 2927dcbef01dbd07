// SPDX-License-Identifier: MIT
#include "KvDeskGalleryView.h"

#include "GalleryFolder.h"
#include "KvDeskGalleryDelegate.h"
#include "KvDeskGalleryModel.h"
#include "KvDeskResources.h"
#include "KvDeskTheme.h"
#include "gui/QtAdvancedStylesheet.h"

#include <QAction>
#include <QDrag>
#include <QMimeData>

namespace {

/// Notes what is dragged: off-screen, drags end as soon as they begin.
class DragWatcher : public QObject
{
public:
    DragWatcher() { qApp->installEventFilter(this); }

    bool eventFilter(QObject *object, QEvent *event) override
    {
        auto *const drag = event->type() == QEvent::DeferredDelete ? qobject_cast<QDrag *>(object) : nullptr;
        if (drag) {
            urls = drag->mimeData()->urls();
            formats = drag->mimeData()->formats();
            pixmap = drag->pixmap();
            ++count;
        }
        return false;
    }

    QList<QUrl> urls;
    QStringList formats;
    QPixmap pixmap;
    int count = 0;
};

} // namespace

class KvDeskGalleryViewTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void showsPictures();
    void brokenPictureHasASign();
    void selectionAndFocusAreSeen();
    void keys();
    void keysWinOverTheWindow();
    void doubleClickOpens();
    void severalCanBeSelected();
    void dragTakesTheSelected();
    void draggedPictureComesFirst();
    void brokenOnesAreNotDragged();
    void noDrops();
    void onlyVisibleOnesAreLoaded();

private:
    void open();
    QPoint centre(int row) const { return m_view->visualRect(m_model->index(row)).center(); }
    QImage shown(int row) const
    {
        return m_view->viewport()->grab(m_view->visualRect(m_model->index(row))).toImage();
    }
    void drag(int row);
    static bool contains(const QImage &image, const QColor &color);

    std::unique_ptr<GalleryFolder> m_folder;
    std::unique_ptr<KvDeskGalleryModel> m_model;
    std::unique_ptr<KvDeskGalleryView> m_view;
};

void KvDeskGalleryViewTest::init()
{
    StatReportTest::init();
    KvDeskResources::ensure();
    KvDeskTheme::apply(QStringLiteral("Dark"));
    m_folder = std::make_unique<GalleryFolder>();
    m_model = std::make_unique<KvDeskGalleryModel>();
    m_view = std::make_unique<KvDeskGalleryView>();
    m_view->setModel(m_model.get());
    m_view->resize(600, 300);
}

void KvDeskGalleryViewTest::cleanup()
{
    m_view.reset();
    m_model.reset();
    StatReportTest::cleanup();
}

void KvDeskGalleryViewTest::open()
{
    QSignalSpy spy(m_model.get(), SIGNAL(signalFolderRead()));
    m_model->setFolder(m_folder->path);
    QVERIFY(spy.wait());
    m_view->show();
    m_view->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_view.get()));
}

bool KvDeskGalleryViewTest::contains(const QImage &image, const QColor &color)
{
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (image.pixelColor(x, y) == color)
                return true;
        }
    }
    return false;
}

void KvDeskGalleryViewTest::showsPictures()
{
    m_folder->add(QStringLiteral("red.png"), QSize(800, 600), Qt::red);
    m_folder->add(QStringLiteral("tall.png"), QSize(60, 600), Qt::green);
    open();
    QTRY_VERIFY(contains(shown(0), Qt::red));
    QTRY_VERIFY(contains(shown(1), Qt::green));
    QCOMPARE(m_view->visualRect(m_model->index(0)).size(), KvDeskGalleryDelegate::cell);
    QCOMPARE(m_view->visualRect(m_model->index(1)).top(), m_view->visualRect(m_model->index(0)).top());
    // The picture stands in the middle of its card and keeps its proportions.
    const QImage card = shown(1);
    QCOMPARE(card.pixelColor(card.width() / 2, 50), QColor(Qt::green));
    QVERIFY(card.pixelColor(card.width() / 2 - 10, 50) != QColor(Qt::green));
}

void KvDeskGalleryViewTest::brokenPictureHasASign()
{
    m_folder->addBroken(QStringLiteral("a.png"));
    open();
    QTRY_VERIFY(!m_model->index(0).data(KvDeskGalleryModel::FaultRole).toString().isEmpty());
    // The sign is in the colour of texts, the name is muted.
    const auto *const style = acss::QtAdvancedStylesheet::getInstance();
    QVERIFY(contains(shown(0).copy(0, 0, 144, 100), style->color(QStringLiteral("text"))));
    const QImage before = shown(0);
    KvDeskTheme::apply(QStringLiteral("Light"));
    QVERIFY(shown(0) != before);
    KvDeskTheme::apply(QStringLiteral("Dark"));
}

void KvDeskGalleryViewTest::selectionAndFocusAreSeen()
{
    m_folder->add(QStringLiteral("a.png"));
    m_folder->add(QStringLiteral("b.png"));
    open();
    const QColor accent = acss::QtAdvancedStylesheet::getInstance()->color(QStringLiteral("accent"));
    QVERIFY(!contains(shown(1), accent));
    m_view->setCurrentIndex(m_model->index(1));
    QVERIFY(contains(shown(1), accent));
    QVERIFY(!contains(shown(0), accent));
    // The ring of what has the keyboard, without being selected.
    m_view->selectionModel()->setCurrentIndex(m_model->index(0), QItemSelectionModel::NoUpdate);
    QVERIFY(contains(shown(0), accent));
}

void KvDeskGalleryViewTest::keys()
{
    for (const char *name : {"a.png", "b.png", "c.png"})
        m_folder->add(QLatin1String(name));
    open();
    QSignalSpy opened(m_view.get(), SIGNAL(signalOpenRequested(QModelIndex)));
    QSignalSpy removed(m_view.get(), SIGNAL(signalRemoveRequested()));
    // Nothing is there to be opened.
    m_view->selectionModel()->clear();
    QTest::keyClick(m_view.get(), Qt::Key_Return);
    QCOMPARE(opened.count(), 0);
    m_view->setCurrentIndex(m_model->index(0));
    QTest::keyClick(m_view.get(), Qt::Key_Right);
    QCOMPARE(m_view->currentIndex().row(), 1);
    QTest::keyClick(m_view.get(), Qt::Key_Return);
    QTest::keyClick(m_view.get(), Qt::Key_Enter, Qt::KeypadModifier);
    QCOMPARE(opened.count(), 2);
    QCOMPARE(opened.first().first().toModelIndex().row(), 1);
    QTest::keyClick(m_view.get(), Qt::Key_Delete);
    QCOMPARE(removed.count(), 1);
    // There is nothing to be renamed.
    QTest::keyClick(m_view.get(), Qt::Key_F2);
    QVERIFY(!m_view->findChild<QLineEdit *>());
    QTest::keyClick(m_view.get(), Qt::Key_A, Qt::ControlModifier);
    QCOMPARE(m_view->selectedRows().size(), 3);
}

void KvDeskGalleryViewTest::keysWinOverTheWindow()
{
    m_folder->add(QStringLiteral("a.png"));
    open();
    QAction others;
    others.setShortcut(Qt::Key_Delete);
    m_view->window()->addAction(&others);
    QSignalSpy triggered(&others, SIGNAL(triggered(bool)));
    QSignalSpy removed(m_view.get(), SIGNAL(signalRemoveRequested()));
    QTest::keyClick(m_view->window()->windowHandle(), Qt::Key_Delete);
    QCOMPARE(removed.count(), 1);
    QCOMPARE(triggered.count(), 0);
}

void KvDeskGalleryViewTest::doubleClickOpens()
{
    m_folder->add(QStringLiteral("a.png"));
    open();
    QSignalSpy opened(m_view.get(), SIGNAL(signalOpenRequested(QModelIndex)));
    QTest::mouseDClick(m_view->viewport(), Qt::LeftButton, {}, QPoint(500, 250));
    QCOMPARE(opened.count(), 0);
    QTest::mouseDClick(m_view->viewport(), Qt::LeftButton, {}, centre(0));
    QCOMPARE(opened.count(), 1);
}

void KvDeskGalleryViewTest::severalCanBeSelected()
{
    for (const char *name : {"a.png", "b.png", "c.png"})
        m_folder->add(QLatin1String(name));
    open();
    QTest::mouseClick(m_view->viewport(), Qt::LeftButton, {}, centre(2));
    QTest::mouseClick(m_view->viewport(), Qt::LeftButton, Qt::ControlModifier, centre(0));
    const QModelIndexList rows = m_view->selectedRows();
    QCOMPARE(rows, QModelIndexList({m_model->index(0), m_model->index(2)}));
}

void KvDeskGalleryViewTest::drag(int row)
{
    const QPoint start = centre(row);
    QTest::mousePress(m_view->viewport(), Qt::LeftButton, {}, start);
    for (int i = 1; i <= 3; ++i) {
        const QPoint to = start + QPoint(i * QApplication::startDragDistance(), 0);
        QMouseEvent move(QEvent::MouseMove, to, Qt::NoButton, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(m_view->viewport(), &move);
    }
    QTest::mouseRelease(m_view->viewport(), Qt::LeftButton, {}, start);
}

void KvDeskGalleryViewTest::dragTakesTheSelected()
{
    const QString a = m_folder->add(QStringLiteral("a.png"), QSize(800, 600), Qt::red);
    m_folder->add(QStringLiteral("b.png"));
    open();
    QTRY_VERIFY(contains(shown(0), Qt::red));
    DragWatcher watcher;
    drag(0);
    QTRY_COMPARE(watcher.count, 1);
    QCOMPARE(watcher.urls, QList<QUrl>({QUrl::fromLocalFile(a)}));
    QVERIFY(watcher.formats.contains(QStringLiteral("GalleryDrag")));
    QVERIFY(watcher.pixmap.width() > 100);
    QVERIFY(QFile::exists(a));
}

void KvDeskGalleryViewTest::draggedPictureComesFirst()
{
    const QString a = m_folder->add(QStringLiteral("a.png"));
    const QString b = m_folder->add(QStringLiteral("b.png"));
    const QString c = m_folder->add(QStringLiteral("c.png"));
    open();
    QTest::mouseClick(m_view->viewport(), Qt::LeftButton, {}, centre(0));
    QTest::mouseClick(m_view->viewport(), Qt::LeftButton, Qt::ShiftModifier, centre(2));
    const QImage alone = m_view->dragPixmap({m_model->index(0)}).toImage();
    DragWatcher watcher;
    drag(1);
    QTRY_COMPARE(watcher.count, 1);
    QCOMPARE(watcher.urls,
             QList<QUrl>({QUrl::fromLocalFile(b), QUrl::fromLocalFile(a), QUrl::fromLocalFile(c)}));
    // A badge says how many there are.
    QVERIFY(m_view->dragPixmap(m_view->draggedRows()).toImage() != alone);
}

void KvDeskGalleryViewTest::brokenOnesAreNotDragged()
{
    m_folder->addBroken(QStringLiteral("a.png"));
    const QString b = m_folder->add(QStringLiteral("b.png"));
    open();
    QTRY_VERIFY(!m_model->index(0).data(KvDeskGalleryModel::FaultRole).toString().isEmpty());
    DragWatcher watcher;
    drag(0);
    QCoreApplication::processEvents();
    QCOMPARE(watcher.count, 0);
    m_view->selectAll();
    QCOMPARE(m_view->draggedRows(), QModelIndexList({m_model->index(1)}));
}

void KvDeskGalleryViewTest::noDrops()
{
    QVERIFY(!m_view->acceptDrops());
    QVERIFY(!m_view->viewport()->acceptDrops());
}

void KvDeskGalleryViewTest::onlyVisibleOnesAreLoaded()
{
    for (int i = 0; i < 40; ++i)
        m_folder->add(QStringLiteral("%1.png").arg(i));
    QSignalSpy changed(m_model.get(), SIGNAL(dataChanged(QModelIndex,QModelIndex,QVector<int>)));
    open();
    // 600 x 300 pixels are four columns and three rows, the last in part.
    QTRY_COMPARE(changed.count(), 12);
    QVERIFY(!changed.wait(100));
    m_view->scrollToBottom();
    QTRY_COMPARE(changed.count(), 24);
}

STATREPORT_TEST_MAIN(KvDeskGalleryViewTest)
#include "KvDeskGalleryViewTest.moc"
