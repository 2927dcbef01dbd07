// SPDX-License-Identifier: MIT
#include "KvDeskValueCommands.h"

#include "DeskValues.h"
#include "KvDeskObjectState.h"

#include <QAction>
#include <QLineEdit>
#include <QUndoStack>

class KvDeskValueCommandsTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void nothingSelected();
    void renamesInTheTable();
    void escapeKeepsTheName();
    void deletesByKey();
    void hidesAndShowsValues();
    void hidingOfManyIsOneStep();
    void contextMenu();

private:
    void select(int row);
    KvDeskValueCommands *commands() const { return m_values->table.commands(); }
    KvDeskTableView *view() const { return m_values->table.view(); }
    QString cell(int row, int column) const { return view()->model()->index(row, column).data().toString(); }

    std::unique_ptr<DeskValues> m_values;
    KvDeskObjectId m_first;
    KvDeskObjectId m_second;
};

void KvDeskValueCommandsTest::init()
{
    StatReportTest::init();
    m_values = std::make_unique<DeskValues>();
    m_first = m_values->add(ZtDrawnType::Rectangle);
    m_second = m_values->add(ZtDrawnType::Rectangle);
    view()->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&m_values->table));
    view()->setFocus();
}

void KvDeskValueCommandsTest::cleanup()
{
    m_values.reset();
    StatReportTest::cleanup();
}

void KvDeskValueCommandsTest::select(int row)
{
    view()->selectRow(row);
    QVERIFY(!m_values->selection.isEmpty());
}

void KvDeskValueCommandsTest::nothingSelected()
{
    for (QAction *const action : {commands()->renameAction(), commands()->deleteAction(),
                                  commands()->hideAction(), commands()->showAction()}) {
        QVERIFY2(!action->isEnabled(), qPrintable(action->text()));
        QVERIFY(action->toolTip().startsWith(action->text() + QLatin1Char('\n')));
    }
    select(0);
    for (QAction *const action :
         {commands()->renameAction(), commands()->deleteAction(), commands()->hideAction()})
        QVERIFY2(action->isEnabled(), qPrintable(action->text()));
    QVERIFY(!commands()->showAction()->isEnabled());
    view()->selectAll();
    QVERIFY(!commands()->renameAction()->isEnabled());
    QVERIFY(commands()->deleteAction()->isEnabled());
}

void KvDeskValueCommandsTest::renamesInTheTable()
{
    select(4);
    QTest::keyClick(view(), Qt::Key_F2);
    auto *const field = view()->viewport()->findChild<QLineEdit *>();
    QVERIFY(field);
    QCOMPARE(field->text(), QStringLiteral("Rectangle 2"));
    field->selectAll();
    QTest::keyClicks(field, QStringLiteral("Washer"));
    QTest::keyClick(field, Qt::Key_Return);
    QTRY_COMPARE(KvDeskObjectState::of(m_second).name, QStringLiteral("Washer"));
    m_values->table.model()->flush();
    QCOMPARE(cell(4, KvDeskValueTableModel::ObjectColumn), QStringLiteral("Washer"));
    m_values->editor.slotUndo();
    m_values->table.model()->flush();
    QCOMPARE(cell(4, KvDeskValueTableModel::ObjectColumn), QStringLiteral("Rectangle 2"));
}

void KvDeskValueCommandsTest::escapeKeepsTheName()
{
    select(0);
    QTest::keyClick(view(), Qt::Key_F2);
    auto *const field = view()->viewport()->findChild<QLineEdit *>();
    QVERIFY(field);
    QTest::keyClicks(field, QStringLiteral("x"));
    QTest::keyClick(field, Qt::Key_Escape);
    QCOMPARE(m_values->editor.undoStack()->count(), 0);
}

void KvDeskValueCommandsTest::deletesByKey()
{
    select(0);
    QTest::keyClick(view(), Qt::Key_Delete);
    m_values->table.model()->flush();
    QCOMPARE(m_values->table.model()->rowCount(), 3);
    QVERIFY(!KvDeskObjectState::of(m_first).exists);
    m_values->editor.slotUndo();
    m_values->table.model()->flush();
    QCOMPARE(m_values->table.model()->rowCount(), 6);
}

void KvDeskValueCommandsTest::hidesAndShowsValues()
{
    select(1);
    commands()->hideAction()->trigger();
    m_values->table.model()->flush();
    QCOMPARE(m_values->table.model()->rowCount(), 5);
    QCOMPARE(cell(1, KvDeskValueTableModel::NameColumn), QStringLiteral("Area"));
    QCOMPARE(m_values->editor.undoStack()->count(), 1);
    m_values->selection.select(m_first);
    QVERIFY(commands()->showAction()->isEnabled());
    commands()->showAction()->trigger();
    m_values->table.model()->flush();
    QCOMPARE(m_values->table.model()->rowCount(), 6);
    QVERIFY(!commands()->showAction()->isEnabled());
}

void KvDeskValueCommandsTest::hidingOfManyIsOneStep()
{
    view()->selectAll();
    commands()->hideAction()->trigger();
    m_values->table.model()->flush();
    QCOMPARE(m_values->table.model()->rowCount(), 0);
    QCOMPARE(m_values->editor.undoStack()->count(), 1);
    m_values->editor.slotUndo();
    m_values->table.model()->flush();
    QCOMPARE(m_values->table.model()->rowCount(), 6);
}

void KvDeskValueCommandsTest::contextMenu()
{
    QStringList texts;
    for (const QAction *const action : view()->actions())
        texts.append(action->text());
    QCOMPARE(view()->contextMenuPolicy(), Qt::ActionsContextMenu);
    QCOMPARE(texts,
             QStringList({QStringLiteral("Copy"), QStringLiteral("Rename"), QStringLiteral("Delete object"),
                          QStringLiteral("Hide value"), QStringLiteral("Show all values of the object")}));
}

STATREPORT_TEST_MAIN(KvDeskValueCommandsTest)
#include "KvDeskValueCommandsTest.moc"
