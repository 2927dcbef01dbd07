// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "KvDeskCounterBar.h"
#include "KvDeskEmptyState.h"
#include "KvDeskImageView.h"
#include "KvDeskInlineEditor.h"
#include "KvDeskRuler.h"
#include "KvDeskSelection.h"
#include "KvDeskStartPage.h"
#include "KvDeskToolColumn.h"
#include "LanguageWalk.h"
#include "ShortcutLetters.h"
#include "host/desk/RecoveryCopies.h"
#include "measuring/ZtDrawnObjectPainter.h"
#include "measuring/ZtDrawnType.h"

#include <QScrollArea>
#include <QScrollBar>

/** Walks through the main window of the Measuring Desk with the plug-in in it, in every language. */
class DeskLanguagesTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void everyTextHasRoom_data() { LanguageWalk::addLanguages(); }
    void everyTextHasRoom();
    void whatLiesOnTheImageHasRoom_data() { LanguageWalk::addLanguages(); }
    void whatLiesOnTheImageHasRoom();
    void startPageNeverScrollsSideways_data() { LanguageWalk::addLanguages(); }
    void startPageNeverScrollsSideways();
    void lettersAreUnique_data() { LanguageWalk::addLanguages(); }
    void lettersAreUnique();
    void arabicMirrorsTheInterfaceOnly();
    void imagesLookAlikeInArabic();
    void labelsOfObjectsReadAlike();

private:
    QImage viewOfDemo(const QString &language);

    LanguageWalk m_walk;
};

void DeskLanguagesTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
}

void DeskLanguagesTest::cleanup()
{
    m_walk.end();
    StatReportTest::cleanup();
}

/// Empty, with what it offers after a crash, with measurements, and with a live image.
void DeskLanguagesTest::everyTextHasRoom()
{
    QFETCH(QString, language);
    m_walk.start(language);
    const QString copies = temporaryPath(QStringLiteral("copies"));
    RecoveryCopies::add(copies, QStringLiteral("a"), 2, 90);
    RecoveryCopies::add(copies, QStringLiteral("b"), 2, 9000);
    m_walk.window()->startRecovery(copies);
    m_walk.lookAtSizes(m_walk.window(), QStringLiteral("start"));
    m_walk.showAllPanels();
    m_walk.lookAtSizes(m_walk.window(), QStringLiteral("empty"));
    m_walk.openSession();
    m_walk.lookAtSizes(m_walk.window(), QStringLiteral("session"));
    m_walk.showLiveImage();
    m_walk.lookAtSizes(m_walk.window(), QStringLiteral("live"));
    QVERIFY2(m_walk.faults().isEmpty(), m_walk.faults());
}

/// The bar of the counting tool, and the field in which names are written.
void DeskLanguagesTest::whatLiesOnTheImageHasRoom()
{
    QFETCH(QString, language);
    m_walk.start(language);
    m_walk.openSession();
    m_walk.action(KvDeskActions::CounterTool)->trigger();
    KvDeskImageView *const view = m_walk.window()->imageView();
    const auto *const bar = view->viewport()->findChild<KvDeskCounterBar *>();
    QVERIFY(bar && bar->isVisible());
    m_walk.lookAtSizes(m_walk.window(), QStringLiteral("counting"));
    // What the clicks are for is said in full.
    bool isLabelled = false;
    for (const QLabel *const label : bar->findChildren<QLabel *>()) {
        isLabelled = isLabelled || (label->isVisible() && label->text() == bar->classes()->accessibleName() &&
                                    label->width() >= label->sizeHint().width());
    }
    QVERIFY(isLabelled);
    QVERIFY(view->viewport()->rect().contains(bar->geometry()));

    m_walk.action(KvDeskActions::SelectTool)->trigger();
    m_walk.window()->selection()->select({ZtDrawnType::Line, 2});
    m_walk.user()->activate(m_walk.window());
    view->setFocus();
    m_walk.action(KvDeskActions::Rename)->trigger();
    QTRY_VERIFY(view->inlineEditor()->isVisible());
    m_walk.look(m_walk.window(), QStringLiteral("renaming"));
    QVERIFY(view->viewport()->rect().contains(view->inlineEditor()->geometry()));
    const int text = view->inlineEditor()->fontMetrics().horizontalAdvance(view->inlineEditor()->text());
    QVERIFY2(view->inlineEditor()->width() > text, qPrintable(view->inlineEditor()->text()));
    view->inlineEditor()->slotCancel();
    QVERIFY2(m_walk.faults().isEmpty(), m_walk.faults());
}

void DeskLanguagesTest::startPageNeverScrollsSideways()
{
    QFETCH(QString, language);
    m_walk.start(language);
    const auto *const area = m_walk.window()->imageView()->emptyState()->findChild<QScrollArea *>();
    QVERIFY(area);
    const QSize least = m_walk.window()->minimumSize();
    for (const QSize &size : {QSize(1280, 800), QSize(1200, 750), QSize(1000, 600), QSize(800, 560), least}) {
        m_walk.window()->resize(size);
        QTRY_VERIFY2(area->horizontalScrollBar()->maximum() == 0, qPrintable(QString::number(size.width())));
        QTRY_VERIFY(m_walk.window()->startPage()->width() <= area->viewport()->width());
        m_walk.look(m_walk.window(), QString::number(size.width()));
    }
    QVERIFY2(m_walk.faults().isEmpty(), m_walk.faults());
}

void DeskLanguagesTest::lettersAreUnique()
{
    QFETCH(QString, language);
    m_walk.start(language);
    m_walk.openSession();
    m_walk.showLiveImage();
    m_walk.openEditor();
    m_walk.openStatistics();
    m_walk.action(KvDeskActions::Calibrate)->trigger();
    QStringList clashes = ShortcutLetters::clashesInMenus(m_walk.window());
    for (QWidget *window : QApplication::topLevelWidgets()) {
        if (window->isVisible())
            clashes += ShortcutLetters::clashesInMenus(window) + ShortcutLetters::clashesInWindow(window);
    }
    clashes.removeDuplicates();
    QVERIFY2(clashes.isEmpty(), qPrintable(clashes.join(QLatin1Char('\n'))));
}

/// The windows are mirrored; the image, its rulers, the pages of a report and what stands on them, and the
/// statistics views are as in every language.
void DeskLanguagesTest::arabicMirrorsTheInterfaceOnly()
{
    m_walk.start(QStringLiteral("Arabic"));
    m_walk.openSession();
    m_walk.openEditor();
    m_walk.openStatistics();
    m_walk.action(KvDeskActions::Calibrate)->trigger();
    for (const QWidget *window : QApplication::topLevelWidgets()) {
        if (window->isVisible() && !window->graphicsProxyWidget())
            QVERIFY2(window->layoutDirection() == Qt::RightToLeft, window->metaObject()->className());
    }
    const KvDeskMainWindow *const window = m_walk.window();
    const QPoint toolsAt = window->toolColumn()->mapTo(window, QPoint());
    const QPoint imageAt = window->imageView()->mapTo(window, QPoint());
    QVERIFY(toolsAt.x() > imageAt.x());
    QCOMPARE(window->imageView()->layoutDirection(), Qt::LeftToRight);
    const QList<KvDeskRuler *> rulers = window->imageView()->findChildren<KvDeskRuler *>();
    QCOMPARE(rulers.size(), 2);
    for (const KvDeskRuler *const ruler : rulers)
        QCOMPARE(ruler->layoutDirection(), Qt::LeftToRight);

    m_walk.composeAll([]() {});
    QCOMPARE(m_walk.desk()->pages()->layoutDirection(), Qt::LeftToRight);
    for (const QGraphicsProxyWidget *piece : m_walk.desk()->pieces()) {
        QList<QWidget *> parts = piece->widget()->findChildren<QWidget *>();
        parts.prepend(piece->widget());
        for (const QWidget *part : qAsConst(parts))
            QVERIFY2(part->layoutDirection() == Qt::LeftToRight, part->metaObject()->className());
    }
}

/// The image with rulers, scale bar, objects and their values, without the window around it.
QImage DeskLanguagesTest::viewOfDemo(const QString &language)
{
    m_walk.end();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    m_walk.start(language);
    m_walk.openSession();
    KvDeskImageView *const view = m_walk.window()->imageView();
    view->slotSetScaleBarVisible(true);
    // Names of objects differ with the language.
    view->slotSetLabelsVisible(false);
    // The window is as wide as the panels beside the image want, whose texts differ, too.
    view->setFixedSize(500, 400);
    view->slotZoomFit();
    QTest::qWait(200);
    return view->grab().toImage();
}

void DeskLanguagesTest::imagesLookAlikeInArabic()
{
    const QImage english = viewOfDemo(QStringLiteral("English"));
    const QImage arabic = viewOfDemo(QStringLiteral("Arabic"));
    QCOMPARE(arabic.size(), english.size());
    QVERIFY2(arabic == english, "the image view differs");
}

/// What is drawn on images is the same whatever the direction of the interface: the name, the value, its
/// unit.
void DeskLanguagesTest::labelsOfObjectsReadAlike()
{
    const auto label = [](Qt::LayoutDirection direction) {
        QGuiApplication::setLayoutDirection(direction);
        QImage image(300, 40, QImage::Format_RGB32);
        image.fill(Qt::gray);
        QPainter painter(&image);
        const QString text = QStringLiteral("\u062E\u0637 1  2.126 mm");
        ZtDrawnObjectPainter(&painter).drawLabelBox(QRectF(10, 5, 280, 30), text);
        return image;
    };
    QCOMPARE(label(Qt::RightToLeft), label(Qt::LeftToRight));
}

STATREPORT_TEST_MAIN(DeskLanguagesTest)
#include "DeskLanguagesTest.moc"
