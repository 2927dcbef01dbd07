// SPDX-License-Identifier: MIT
#include "KvDeskStartPage.h"

#include "DeskFiles.h"
#include "KvDeskActionButton.h"
#include "KvDeskActions.h"
#include "KvDeskEmptyState.h"
#include "KvDeskFileCommands.h"
#include "KvDeskImageView.h"
#include "KvDeskMainWindow.h"
#include "KvDeskRecentFiles.h"
#include "KvDeskResources.h"
#include "KvDeskSession.h"
#include "KvDeskTheme.h"
#include "gui/QtAdvancedStylesheet.h"
#include "kernel/ZtAppSettings.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QMenu>

class KvDeskStartPageTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void threeSteps();
    void laterStepsWaitForAnImage();
    void namesForScreenReaders();
    void examplesStandInARow();
    void noExamples();
    void recentSessions();
    void shownWhileNothingIsOpen();
    void exampleOpensAsACopy();
    void shownOverTheImage();
    void toolHidesIt();
    void hidesWhatLiesBelow();
    void everythingByKeys();
    void looksRightInBothThemes();

private:
    void openWindow();
    KvDeskEmptyState *state() const { return m_window->imageView()->emptyState(); }
    KvDeskActionButton *button(const char *text) const;

    KvDeskActions *m_actions = nullptr;
    std::unique_ptr<QMenu> m_menu;
    std::unique_ptr<KvDeskStartPage> m_page;
    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskMainWindow> m_window;
};

void KvDeskStartPageTest::init()
{
    StatReportTest::init();
    KvDeskResources::ensure();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    m_actions = new KvDeskActions(this);
    m_menu = std::make_unique<QMenu>();
    m_page =
        std::make_unique<KvDeskStartPage>(m_actions, m_menu.get(), sourcePath(QStringLiteral("examples")));
    m_page->resize(632, 600);
}

void KvDeskStartPageTest::cleanup()
{
    m_window.reset();
    m_document.reset();
    m_page.reset();
    delete m_actions;
    StatReportTest::cleanup();
}

// The program of a test lies elsewhere; it finds the examples all the same.
void KvDeskStartPageTest::openWindow()
{
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_window = std::make_unique<KvDeskMainWindow>(m_document.get());
    m_window->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_window.get()));
    QVERIFY(m_window->startPage()->isVisible());
}

KvDeskActionButton *KvDeskStartPageTest::button(const char *text) const
{
    for (KvDeskActionButton *const button : m_page->findChildren<KvDeskActionButton *>()) {
        if (button->text() == QLatin1String(text))
            return button;
    }
    return nullptr;
}

void KvDeskStartPageTest::threeSteps()
{
    m_page->setAnythingOpen(true);
    using A = KvDeskActions;
    for (const A::Id id : {A::OpenImage, A::Calibrate, A::LineTool}) {
        QAction *const action = m_actions->action(id);
        QSignalSpy spy(action, SIGNAL(triggered()));
        KvDeskActionButton *const found = button(qPrintable(action->iconText()));
        QVERIFY2(found, qPrintable(action->iconText()));
        found->click();
        QCOMPARE(spy.count(), 1);
    }
    QVERIFY(button("Open image")->isDefault());
}

void KvDeskStartPageTest::laterStepsWaitForAnImage()
{
    for (const char *const name : {"Calibration", "Line"}) {
        m_page->setAnythingOpen(false);
        QVERIFY(!button(name)->isEnabled());
        QVERIFY(button(name)->toolTip().endsWith(QStringLiteral("\nOpen an image first")));
        m_page->setAnythingOpen(true);
        QVERIFY(button(name)->isEnabled());
    }
    QVERIFY(button("Open image")->isEnabled());
}

void KvDeskStartPageTest::namesForScreenReaders()
{
    KvDeskRecentFiles::add(DeskFiles::demoSession());
    m_page->show();
    const QList<QAbstractButton *> buttons = m_page->findChildren<QAbstractButton *>();
    QVERIFY(buttons.size() >= 10);
    for (const QAbstractButton *const each : buttons) {
        QVERIFY2(!each->accessibleName().isEmpty() || !each->text().isEmpty(),
                 each->metaObject()->className());
        QVERIFY2(!each->toolTip().isEmpty(), qPrintable(each->text()));
        QVERIFY2(each->focusPolicy() & Qt::TabFocus, qPrintable(each->text()));
    }
}

void KvDeskStartPageTest::examplesStandInARow()
{
    m_page->show();
    const QList<QToolButton *> examples = m_page->exampleButtons();
    QCOMPARE(examples.size(), 4);
    QTRY_COMPARE(examples.last()->y(), examples.first()->y());
    for (const QToolButton *const example : examples)
        QVERIFY2(!example->icon().isNull(), qPrintable(example->text()));
    m_page->resize(340, 600);
    QTRY_COMPARE(examples.at(2)->x(), examples.at(0)->x());
    QTRY_VERIFY(examples.at(2)->y() > examples.at(0)->y());
    QSignalSpy spy(m_page.get(), SIGNAL(signalExampleChosen(QString)));
    examples.first()->click();
    QCOMPARE(spy.value(0).value(0).toString(), sourcePath(QStringLiteral("examples/sessions/coin.json")));
}

void KvDeskStartPageTest::noExamples()
{
    KvDeskStartPage page(m_actions, m_menu.get(), QString());
    page.show();
    QCOMPARE(page.exampleButtons().size(), 0);
    for (const QLabel *const label : page.findChildren<QLabel *>())
        QVERIFY(!label->isVisible() || label->text() != QStringLiteral("Examples to try"));
}

void KvDeskStartPageTest::recentSessions()
{
    m_page->show();
    QCOMPARE(m_page->recentButtons().size(), 0);
    m_page->hide();
    KvDeskRecentFiles::add(temporaryPath(QStringLiteral("gone.json")));
    KvDeskRecentFiles::add(DeskFiles::demoSession());
    m_page->show();
    QCOMPARE(m_page->recentButtons().size(), 1);
    QCOMPARE(m_page->recentButtons().first()->text(), QStringLiteral("demo.json"));
    QSignalSpy spy(m_page.get(), SIGNAL(signalRecentChosen(QString)));
    m_page->recentButtons().first()->click();
    QCOMPARE(spy.value(0).value(0).toString(), DeskFiles::demoSession());
}

void KvDeskStartPageTest::shownWhileNothingIsOpen()
{
    openWindow();
    QVERIFY(!m_window->startPage()->backButton()->isVisible());
    m_window->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    QVERIFY(m_window->startPage()->isAncestorOf(QApplication::focusWidget()));
    QVERIFY(m_window->files()->openImage(DeskFiles::image(QStringLiteral("a.png"))));
    QTRY_VERIFY(!state()->isVisible());
    QVERIFY(m_window->imageView()->hasFocus());
    m_window->actions()->action(KvDeskActions::NewSession)->trigger();
    QTRY_VERIFY(state()->isVisible());
}

void KvDeskStartPageTest::exampleOpensAsACopy()
{
    openWindow();
    const QString path = sourcePath(QStringLiteral("examples/sessions/demo.json"));
    const QByteArray before = DeskFiles::bytes(path);
    emit m_window->startPage()->signalExampleChosen(path);
    QVERIFY(m_window->session()->objectCount() > 0);
    QCOMPARE(m_window->session()->path(), QString());
    QCOMPARE(m_window->session()->displayName(), QStringLiteral("Untitled session"));
    QVERIFY(!m_window->session()->isModified());
    QCOMPARE(KvDeskRecentFiles::paths(), QStringList());
    QTRY_VERIFY(!state()->isVisible());
    QCOMPARE(DeskFiles::bytes(path), before);
}

void KvDeskStartPageTest::shownOverTheImage()
{
    openWindow();
    QVERIFY(m_window->files()->openSession(DeskFiles::demoSession()));
    QTRY_VERIFY(!state()->isVisible());
    m_window->actions()->action(KvDeskActions::StartPage)->trigger();
    QVERIFY(state()->isVisible());
    QVERIFY(m_window->startPage()->backButton()->isVisible());
    m_window->startPage()->backButton()->click();
    QVERIFY(!state()->isVisible());
    m_window->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
    m_window->actions()->action(KvDeskActions::StartPage)->trigger();
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
    QVERIFY(!state()->isVisible());
    QVERIFY(m_window->imageView()->hasFocus());
    m_window->actions()->action(KvDeskActions::StartPage)->trigger();
    m_window->startPage()->exampleButtons().first()->setFocus();
    QTest::keyClick(m_window->startPage()->exampleButtons().first(), Qt::Key_Escape);
    QVERIFY(!state()->isVisible());
    m_window->actions()->action(KvDeskActions::StartPage)->trigger();
    QVERIFY(m_window->files()->openImage(DeskFiles::image(QStringLiteral("b.png"))));
    QTRY_VERIFY(!state()->isVisible());
}

void KvDeskStartPageTest::toolHidesIt()
{
    openWindow();
    QVERIFY(m_window->files()->openSession(DeskFiles::demoSession()));
    m_window->actions()->action(KvDeskActions::StartPage)->trigger();
    QVERIFY(state()->isVisible());
    m_window->actions()->action(KvDeskActions::LineTool)->trigger();
    QVERIFY(!state()->isVisible());
}

// A drag over the page draws nothing on the image below it, and its rulers would measure the page.
void KvDeskStartPageTest::hidesWhatLiesBelow()
{
    openWindow();
    m_window->actions()->action(KvDeskActions::LineTool)->trigger();
    QVERIFY(state()->isVisible());
    QWidget *const page = m_window->startPage();
    QTest::mousePress(page, Qt::LeftButton, Qt::NoModifier, QPoint(5, 5));
    QTest::mouseMove(page, QPoint(60, 60));
    QTest::mouseRelease(page, Qt::LeftButton, Qt::NoModifier, QPoint(90, 90));
    m_window->imageView()->flush();
    QCOMPARE(m_window->session()->objectCount(), 0);
    QVERIFY(m_window->actions()->action(KvDeskActions::ShowRulers)->isChecked());
    for (const QWidget *const ruler : m_window->imageView()->findChildren<QWidget *>()) {
        if (ruler->inherits("KvDeskRuler"))
            QVERIFY(!ruler->isVisible());
    }
}

void KvDeskStartPageTest::everythingByKeys()
{
    m_page->setAnythingOpen(true);
    m_page->show();
    m_page->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_page.get()));
    QSet<QWidget *> reached;
    for (int i = 0; i < 20; ++i) {
        QTest::keyClick(m_page.get(), Qt::Key_Tab);
        reached.insert(QApplication::focusWidget());
    }
    for (QAbstractButton *const each : m_page->findChildren<QAbstractButton *>())
        QVERIFY2(reached.contains(each), qPrintable(each->toolTip()));
    QSignalSpy spy(m_page.get(), SIGNAL(signalExampleChosen(QString)));
    QTest::keyClick(m_page->exampleButtons().at(1), Qt::Key_Space);
    QCOMPARE(spy.count(), 1);
}

void KvDeskStartPageTest::looksRightInBothThemes()
{
    openWindow();
    for (const char *const theme : {"Dark", "Light"}) {
        KvDeskTheme::apply(QLatin1String(theme));
        const QColor window = acss::QtAdvancedStylesheet::getInstance()->color(QStringLiteral("window"));
        QCOMPARE(state()->grab().toImage().pixelColor(2, 2), window);
        for (QLabel *const label : m_window->startPage()->findChildren<QLabel *>()) {
            if (label->isVisible())
                QTRY_VERIFY2(label->heightForWidth(label->width()) <= label->height(),
                             qPrintable(label->text()));
        }
    }
    KvDeskTheme::apply(QStringLiteral("Dark"));
}

STATREPORT_TEST_MAIN(KvDeskStartPageTest)
#include "KvDeskStartPageTest.moc"
