// SPDX-License-Identifier: MIT
#include "KvDeskImageMenu.h"

#include "DeskView.h"
#include "KvDeskActions.h"
#include "KvDeskDrawTool.h"
#include "KvDeskEditCommands.h"
#include "support/RightToLeft.h"

#include <QAction>
#include <QContextMenuEvent>

namespace {

const QPointF onFirst(100, 50);
const QPointF beside(300, 250);

} // namespace

class KvDeskImageMenuTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void init();
    void cleanup();

    void offersWhatCanBeDone();
    void rightClickSelects();
    void rightClickKeepsTheSelection_data();
    void rightClickKeepsTheSelection();
    void comesByKeys_data();
    void comesByKeys();
    void comesInTheMiddleForWhatIsOutOfView();
    void drawingHasNoMenu();
    void draggingHasNoMenu();
    void startPageHasNoMenu();
    void actsOnTheSelection();
    void zooms();
    void readsInTheProgramsDirection();

private:
    void askAt(const QPointF &place) const;
    /// What a menu that appears tells of the platform.
    static void expectMenu();
    bool isShown() const { return m_menu->isVisible(); }

    std::unique_ptr<KvDeskActions> m_actions;
    std::unique_ptr<DeskView> m_desk;
    std::unique_ptr<KvDeskEditCommands> m_commands;
    KvDeskImageMenu *m_menu = nullptr;
    KvDeskObjectId m_first;
    KvDeskObjectId m_second;
};

void KvDeskImageMenuTest::init()
{
    StatReportTest::init();
    m_actions = std::make_unique<KvDeskActions>();
    m_desk = std::make_unique<DeskView>();
    m_commands = std::make_unique<KvDeskEditCommands>(m_actions.get(), &m_desk->view, &m_desk->editor);
    m_menu = new KvDeskImageMenu(m_actions.get(), &m_desk->view);
    m_first = m_desk->line({50, 50}, {150, 50});
    m_second = m_desk->line({50, 150}, {150, 150});
    m_desk->view.flush();
}

void KvDeskImageMenuTest::cleanup()
{
    m_commands.reset();
    m_desk.reset();
    m_actions.reset();
    StatReportTest::cleanup();
}

void KvDeskImageMenuTest::expectMenu()
{
    if (QGuiApplication::platformName() == QLatin1String("offscreen")) {
        expectWarning(QRegularExpression(QStringLiteral("raise")));
        expectWarning(QRegularExpression(QStringLiteral("grabbing the keyboard")));
    }
}

// As a person does, and as the system reports it.
void KvDeskImageMenuTest::askAt(const QPointF &place) const
{
    QWidget *const viewport = m_desk->view.viewport();
    const QPoint at = m_desk->at(place);
    QTest::mousePress(viewport, Qt::RightButton, {}, at);
    QContextMenuEvent event(QContextMenuEvent::Mouse, at, viewport->mapToGlobal(at));
    QApplication::sendEvent(viewport, &event);
    QTest::mouseRelease(viewport, Qt::RightButton, {}, at);
}

void KvDeskImageMenuTest::offersWhatCanBeDone()
{
    expectMenu();
    askAt(onFirst);
    QVERIFY(isShown());
    QStringList texts;
    for (const QAction *const action : m_menu->actions())
        texts.append(action->text());
    QCOMPARE(
        texts.join(QLatin1Char('|')),
        QStringLiteral(
            "Re&name||Cu&t|&Copy|&Paste|&Delete||Select &all||Fit to window\tCtrl+0|Actual size\tCtrl+1"));
    // What is not possible says why.
    QVERIFY(m_menu->toolTipsVisible());
}

void KvDeskImageMenuTest::rightClickSelects()
{
    expectMenu();
    m_desk->selection.select(m_second);
    askAt(onFirst);
    QCOMPARE(m_desk->selection.objects(), QSet<KvDeskObjectId>{m_first});
    QVERIFY(isShown());
    QCOMPARE(m_menu->pos(), m_desk->view.viewport()->mapToGlobal(m_desk->at(onFirst)));
    QCOMPARE(m_desk->steps(), 0);
}

void KvDeskImageMenuTest::rightClickKeepsTheSelection_data()
{
    QTest::addColumn<QPointF>("place");
    QTest::newRow("one of several") << onFirst;
    QTest::newRow("beside them") << beside;
}

void KvDeskImageMenuTest::rightClickKeepsTheSelection()
{
    expectMenu();
    QFETCH(QPointF, place);
    m_desk->selection.set({m_first, m_second}, m_second);
    askAt(place);
    QVERIFY(isShown());
    QCOMPARE(m_desk->selection.objects(), (QSet<KvDeskObjectId>{m_first, m_second}));
}

void KvDeskImageMenuTest::comesByKeys_data()
{
    QTest::addColumn<bool>("isMenuKey");
    QTest::newRow("menu key") << true;
    QTest::newRow("Shift+F10") << false;
}

void KvDeskImageMenuTest::comesByKeys()
{
    expectMenu();
    QFETCH(bool, isMenuKey);
    m_desk->selection.select(m_second);
    QContextMenuEvent event(QContextMenuEvent::Keyboard, QPoint());
    if (isMenuKey)
        QApplication::sendEvent(&m_desk->view, &event);
    else
        m_desk->key(Qt::Key_F10, Qt::ShiftModifier);
    QVERIFY(isShown());
    QCOMPARE(m_menu->pos(), m_desk->view.viewport()->mapToGlobal(m_desk->at(100, 150)));
    QCOMPARE(m_desk->selection.objects(), QSet<KvDeskObjectId>{m_second});
}

void KvDeskImageMenuTest::comesInTheMiddleForWhatIsOutOfView()
{
    expectMenu();
    expectMenu();
    m_desk->key(Qt::Key_F10, Qt::ShiftModifier);
    QWidget *const viewport = m_desk->view.viewport();
    QCOMPARE(m_menu->pos(), viewport->mapToGlobal(viewport->rect().center()));
    m_menu->hide();
    m_desk->selection.select(m_first);
    for (int i = 0; i < 8; ++i)
        m_desk->view.slotZoomIn();
    m_desk->key(Qt::Key_F10, Qt::ShiftModifier);
    const QRect visible(viewport->mapToGlobal(QPoint()), viewport->size());
    QVERIFY(visible.contains(m_menu->pos()));
}

void KvDeskImageMenuTest::drawingHasNoMenu()
{
    KvDeskDrawTool tool(&m_desk->view, ZtDrawnType::Circle);
    m_desk->view.setTool(&tool);
    askAt(onFirst);
    m_desk->key(Qt::Key_F10, Qt::ShiftModifier);
    QVERIFY(!isShown());
    QVERIFY(m_desk->selection.isEmpty());
    m_desk->view.setTool(nullptr);
}

void KvDeskImageMenuTest::draggingHasNoMenu()
{
    m_desk->press(onFirst);
    m_desk->move({130, 70}, Qt::LeftButton);
    askAt({130, 70});
    QVERIFY(!isShown());
    m_desk->release({130, 70});
    QVERIFY(isNear(m_desk->points(m_first).first(), {80, 70}));
}

void KvDeskImageMenuTest::startPageHasNoMenu()
{
    m_desk->view.slotShowStart();
    askAt(onFirst);
    QVERIFY(!isShown());
    QVERIFY(m_desk->selection.isEmpty());
}

void KvDeskImageMenuTest::actsOnTheSelection()
{
    expectMenu();
    expectMenu();
    askAt(onFirst);
    m_menu->hide();
    m_actions->action(KvDeskActions::Delete)->trigger();
    QCOMPARE(m_desk->count(ZtDrawnType::Line), 1);
    // With nothing selected there is nothing to delete.
    askAt(beside);
    QVERIFY(isShown());
    QVERIFY(!m_actions->action(KvDeskActions::Delete)->isEnabled());
    QVERIFY(m_actions->action(KvDeskActions::SelectAll)->isEnabled());
}

void KvDeskImageMenuTest::zooms()
{
    connect(m_actions->action(KvDeskActions::ZoomFit), SIGNAL(triggered()), &m_desk->view,
                                                              SLOT(slotZoomFit()));
    connect(m_actions->action(KvDeskActions::ZoomActual), SIGNAL(triggered()), &m_desk->view,
                                                                 SLOT(slotZoomActual()));
    const QList<QAction *> all = m_menu->actions();
    QVERIFY(!m_desk->view.isFitted());
    all.at(all.size() - 2)->trigger();
    QVERIFY(m_desk->view.isFitted());
    all.last()->trigger();
    QVERIFY(!m_desk->view.isFitted());
    QCOMPARE(m_desk->view.zoom(), 1.0);
}

void KvDeskImageMenuTest::readsInTheProgramsDirection()
{
    const RightToLeft arabic;
    const KvDeskImageMenu *const menu = new KvDeskImageMenu(m_actions.get(), &m_desk->view);
    QCOMPARE(menu->layoutDirection(), Qt::RightToLeft);
    QCOMPARE(m_desk->view.layoutDirection(), Qt::LeftToRight);
}

STATREPORT_TEST_MAIN(KvDeskImageMenuTest)
#include "KvDeskImageMenuTest.moc"
