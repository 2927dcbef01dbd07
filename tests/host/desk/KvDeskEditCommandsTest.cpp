// SPDX-License-Identifier: MIT
#include "KvDeskEditCommands.h"

#include "DeskView.h"
#include "KvDeskActions.h"
#include "KvDeskDrawTool.h"
#include "KvDeskInlineEditor.h"
#include "KvDeskResources.h"

#include <QAction>
#include <QClipboard>

class KvDeskEditCommandsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase() { KvDeskResources::ensure(); }
    void init();
    void cleanup();

    void undoNamesTheStep();
    void disabledCommandsSayWhy();
    void keysWorkOnTheImage();
    void keysDoNotWorkInFields();
    void copiesAndPastes();
    void pastesBesideAtAnyZoom();
    void undoTakesPointsOfTheDraftFirst();
    void draftCanBeUndoneWithoutSteps();
    void undoDuringADragDrawsNothing();
    void undoDuringADragOfObjectsCancelsIt();
    void undoDuringADragOfAPointCancelsIt();
    void undoDuringABandCancelsIt();
    void nothingIsRedoneDuringADraft();
    void undoBelongsToTheTextThatIsWritten();

private:
    QAction *action(KvDeskActions::Id id) const { return m_actions->action(id); }
    void key(Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier) const
    {
        QTest::keyClick(&m_desk->view, key, modifiers);
    }

    void use(int type);
    void undoByKey() const { key(Qt::Key_Z, Qt::ControlModifier); }
    bool canUndo() const { return action(KvDeskActions::Undo)->isEnabled(); }

    std::unique_ptr<DeskView> m_desk;
    std::unique_ptr<KvDeskDrawTool> m_tool;
    std::unique_ptr<KvDeskActions> m_actions;
    std::unique_ptr<KvDeskEditCommands> m_commands;
    KvDeskObjectId m_line;
};

void KvDeskEditCommandsTest::init()
{
    StatReportTest::init();
    QGuiApplication::clipboard()->clear();
    m_desk = std::make_unique<DeskView>();
    m_line = m_desk->line({50, 50}, {150, 50});
    m_actions = std::make_unique<KvDeskActions>();
    m_commands = std::make_unique<KvDeskEditCommands>(m_actions.get(), &m_desk->view, &m_desk->editor);
    // In the main window they are in its menus.
    m_desk->view.addAction(action(KvDeskActions::Undo));
    m_desk->view.addAction(action(KvDeskActions::Redo));
    m_desk->view.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&m_desk->view));
}

void KvDeskEditCommandsTest::cleanup()
{
    m_desk->view.setTool(nullptr);
    m_tool.reset();
    m_commands.reset();
    m_actions.reset();
    m_desk.reset();
    StatReportTest::cleanup();
}

void KvDeskEditCommandsTest::use(int type)
{
    m_desk->view.setTool(nullptr);
    m_tool = std::make_unique<KvDeskDrawTool>(&m_desk->view, type);
    m_desk->view.setTool(m_tool.get());
}

void KvDeskEditCommandsTest::undoNamesTheStep()
{
    QCOMPARE(action(KvDeskActions::Undo)->text(), QStringLiteral("&Undo"));
    m_desk->editor.rename(m_line, QStringLiteral("Nut & bolt"));
    m_desk->editor.moveBy({m_line}, QPointF(1, 1));
    QCOMPARE(action(KvDeskActions::Undo)->text(), QStringLiteral("&Undo move of Nut && bolt"));
    m_desk->editor.slotUndo();
    QCOMPARE(action(KvDeskActions::Undo)->text(), QStringLiteral("&Undo renaming of Line 1"));
    QCOMPARE(action(KvDeskActions::Redo)->text(), QStringLiteral("&Redo move of Nut && bolt"));
}

void KvDeskEditCommandsTest::disabledCommandsSayWhy()
{
    using A = KvDeskActions;
    for (const A::Id id : {A::Undo, A::Redo, A::Cut, A::Copy, A::Paste, A::Delete, A::Rename}) {
        QVERIFY(!action(id)->isEnabled());
        QCOMPARE(action(id)->toolTip().count(QLatin1Char('\n')), 1);
    }
    QVERIFY(action(A::SelectAll)->isEnabled());
    QCOMPARE(action(A::Delete)->toolTip(),
             QStringLiteral("Delete the selected objects (Del)\nSelect an object first"));
    m_desk->selection.select(m_line);
    for (const A::Id id : {A::Cut, A::Copy, A::Delete, A::Rename})
        QVERIFY(action(id)->isEnabled());
    QCOMPARE(action(A::Delete)->toolTip(), QStringLiteral("Delete the selected objects (Del)"));
    m_desk->selection.toggle(m_desk->line({0, 0}, {9, 9}));
    QVERIFY(!action(A::Rename)->isEnabled());
    QVERIFY(action(A::Delete)->isEnabled());
}

void KvDeskEditCommandsTest::keysWorkOnTheImage()
{
    m_desk->line({50, 150}, {150, 150});
    key(Qt::Key_A, Qt::ControlModifier);
    QCOMPARE(m_desk->selection.objects().size(), 2);
    key(Qt::Key_Delete);
    QCOMPARE(m_desk->count(ZtDrawnType::Line), 0);
    key(Qt::Key_Z, Qt::ControlModifier);
    QCOMPARE(m_desk->count(ZtDrawnType::Line), 2);
    key(Qt::Key_Z, Qt::ControlModifier | Qt::ShiftModifier);
    QCOMPARE(m_desk->count(ZtDrawnType::Line), 0);
    key(Qt::Key_Z, Qt::ControlModifier);
    m_desk->selection.select(m_line);
    key(Qt::Key_F2);
    QVERIFY(m_desk->view.inlineEditor()->isVisible());
}

void KvDeskEditCommandsTest::keysDoNotWorkInFields()
{
    m_desk->selection.select(m_line);
    key(Qt::Key_F2);
    KvDeskInlineEditor *const field = m_desk->view.inlineEditor();
    field->setCursorPosition(0);
    QTest::keyClick(field, Qt::Key_Delete);
    QCOMPARE(field->text(), QStringLiteral("ine 1"));
    QTest::keyClick(field, Qt::Key_Z, Qt::ControlModifier);
    QCOMPARE(field->text(), QStringLiteral("Line 1"));
    QCOMPARE(m_desk->count(ZtDrawnType::Line), 1);
    QCOMPARE(m_desk->steps(), 0);
}

void KvDeskEditCommandsTest::copiesAndPastes()
{
    m_desk->selection.select(m_line);
    key(Qt::Key_C, Qt::ControlModifier);
    QVERIFY(action(KvDeskActions::Paste)->isEnabled());
    QCOMPARE(QGuiApplication::clipboard()->text(),
             QStringLiteral("Type\tObject\tValue name\tValue\nLine\tLine 1\tLength\t100.0 px\n"));
    key(Qt::Key_V, Qt::ControlModifier);
    QCOMPARE(m_desk->points({ZtDrawnType::Line, 2}), polygon({{66, 66}, {166, 66}}));
    key(Qt::Key_X, Qt::ControlModifier);
    QCOMPARE(m_desk->count(ZtDrawnType::Line), 1);
    QCOMPARE(m_desk->steps(), 2);
}

void KvDeskEditCommandsTest::pastesBesideAtAnyZoom()
{
    m_desk->selection.select(m_line);
    action(KvDeskActions::Copy)->trigger();
    m_desk->view.slotZoomIn();
    action(KvDeskActions::Paste)->trigger();
    const QPointF moved = m_desk->points({ZtDrawnType::Line, 2}).first() - QPointF(50, 50);
    QCOMPARE(moved, QPointF(16.0 / 1.25, 16.0 / 1.25));
}

void KvDeskEditCommandsTest::undoTakesPointsOfTheDraftFirst()
{
    use(ZtDrawnType::Line);
    m_desk->drag({20, 200}, {120, 200});
    QCOMPARE(m_desk->count(ZtDrawnType::Line), 2);
    QCOMPARE(action(KvDeskActions::Undo)->text(), QStringLiteral("&Undo drawing of Line 2"));
    use(ZtDrawnType::Polyline);
    m_desk->click({200, 100});
    m_desk->click({240, 100});
    m_desk->click({280, 140});
    QCOMPARE(action(KvDeskActions::Undo)->text(), QStringLiteral("&Undo"));
    for (int left = 2; left >= 0; --left) {
        QVERIFY(canUndo());
        undoByKey();
        QCOMPARE(m_tool->points().size(), left);
        QCOMPARE(m_desk->count(ZtDrawnType::Line), 2);
    }
    QCOMPARE(action(KvDeskActions::Undo)->text(), QStringLiteral("&Undo drawing of Line 2"));
    undoByKey();
    QCOMPARE(m_desk->count(ZtDrawnType::Line), 1);
}

void KvDeskEditCommandsTest::draftCanBeUndoneWithoutSteps()
{
    using A = KvDeskActions;
    QVERIFY(!canUndo());
    use(ZtDrawnType::Polyline);
    m_desk->click({200, 100});
    QVERIFY(canUndo());
    QCOMPARE(action(A::Undo)->toolTip(), QStringLiteral("Undo the last step (Ctrl+Z)"));
    undoByKey();
    QVERIFY(m_tool->points().isEmpty());
    QVERIFY(!canUndo());
    for (const Qt::Key end : {Qt::Key_Escape, Qt::Key_Backspace}) {
        m_desk->click({200, 100});
        QVERIFY(canUndo());
        m_desk->key(end);
        QVERIFY(!canUndo());
    }
    m_desk->click({200, 100});
    m_desk->view.setTool(nullptr);
    QVERIFY(!canUndo());
}

void KvDeskEditCommandsTest::undoDuringADragDrawsNothing()
{
    use(ZtDrawnType::Polyline);
    m_desk->click({200, 100});
    m_desk->press({240, 100});
    m_desk->move({280, 140}, Qt::LeftButton);
    undoByKey();
    QCOMPARE(m_tool->points().size(), 1);
    m_desk->move({290, 140}, Qt::LeftButton);
    m_desk->release({290, 140});
    QCOMPARE(m_tool->points().size(), 1);
}

void KvDeskEditCommandsTest::undoDuringADragOfObjectsCancelsIt()
{
    m_desk->editor.rename(m_line, QStringLiteral("Width"));
    const QPolygonF before = m_desk->points(m_line);
    m_desk->press({100, 50});
    m_desk->move({100, 70}, Qt::LeftButton);
    m_desk->move({100, 90}, Qt::LeftButton);
    QVERIFY(m_desk->points(m_line) != before);
    undoByKey();
    QCOMPARE(m_desk->points(m_line), before);
    m_desk->move({100, 120}, Qt::LeftButton);
    m_desk->release({100, 120});
    QCOMPARE(m_desk->points(m_line), before);
    QCOMPARE(m_desk->name(m_line), QStringLiteral("Width"));
    undoByKey();
    QCOMPARE(m_desk->name(m_line), QStringLiteral("Line 1"));
}

void KvDeskEditCommandsTest::undoDuringADragOfAPointCancelsIt()
{
    m_desk->editor.rename(m_line, QStringLiteral("Width"));
    m_desk->selection.select(m_line);
    const QPolygonF before = m_desk->points(m_line);
    m_desk->press({150, 50});
    m_desk->move({150, 90}, Qt::LeftButton);
    QVERIFY(m_desk->points(m_line) != before);
    undoByKey();
    m_desk->move({150, 120}, Qt::LeftButton);
    m_desk->release({150, 120});
    QCOMPARE(m_desk->points(m_line), before);
    QCOMPARE(m_desk->name(m_line), QStringLiteral("Width"));
}

void KvDeskEditCommandsTest::undoDuringABandCancelsIt()
{
    m_desk->editor.rename(m_line, QStringLiteral("Width"));
    m_desk->selection.clear();
    m_desk->press({20, 20});
    m_desk->move({200, 100}, Qt::LeftButton);
    undoByKey();
    m_desk->release({200, 100});
    QVERIFY(m_desk->selection.isEmpty());
    QCOMPARE(m_desk->name(m_line), QStringLiteral("Width"));
}

void KvDeskEditCommandsTest::nothingIsRedoneDuringADraft()
{
    using A = KvDeskActions;
    m_desk->editor.rename(m_line, QStringLiteral("Width"));
    undoByKey();
    QVERIFY(action(A::Redo)->isEnabled());
    use(ZtDrawnType::Polyline);
    m_desk->click({200, 100});
    QVERIFY(!action(A::Redo)->isEnabled());
    QCOMPARE(action(A::Redo)->toolTip(),
             QStringLiteral("Redo what was undone (Ctrl+Shift+Z)\nFinish or cancel "
                            "what you have begun first"));
    key(Qt::Key_Z, Qt::ControlModifier | Qt::ShiftModifier);
    QCOMPARE(m_desk->name(m_line), QStringLiteral("Line 1"));
    undoByKey();
    QVERIFY(action(A::Redo)->isEnabled());
    key(Qt::Key_Z, Qt::ControlModifier | Qt::ShiftModifier);
    QCOMPARE(m_desk->name(m_line), QStringLiteral("Width"));
}

// As from the tool bar, which does not take the keyboard.
void KvDeskEditCommandsTest::undoBelongsToTheTextThatIsWritten()
{
    using A = KvDeskActions;
    m_desk->editor.rename(m_line, QStringLiteral("Width"));
    use(ZtDrawnType::TextNote);
    m_desk->click({200, 100});
    KvDeskInlineEditor *const field = m_desk->view.inlineEditor();
    QVERIFY(field->isVisible());
    QVERIFY(!canUndo());
    QVERIFY(!action(A::Redo)->isEnabled());
    QTest::keyClicks(field, QStringLiteral("pore"));
    QVERIFY(canUndo());
    action(A::Undo)->trigger();
    QCOMPARE(field->text(), QString());
    QVERIFY(!canUndo());
    undoByKey();
    QCOMPARE(m_desk->name(m_line), QStringLiteral("Width"));
    QTest::keyClick(field, Qt::Key_Escape);
    QVERIFY(canUndo());
    undoByKey();
    QCOMPARE(m_desk->name(m_line), QStringLiteral("Line 1"));
}

STATREPORT_TEST_MAIN(KvDeskEditCommandsTest)
#include "KvDeskEditCommandsTest.moc"
