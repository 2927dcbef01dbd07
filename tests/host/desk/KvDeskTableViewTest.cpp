// SPDX-License-Identifier: MIT
#include "KvDeskTableView.h"

#include "support/StatReportTest.h"

class KvDeskTableViewTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void copiesWholeRowsInOrder();
    void copiesByShortcut();
    void nothingSelectedKeepsTheClipboard();
    void viewWithoutModelHasNoText();

private:
    static void fill(QStandardItemModel *model)
    {
        for (int row = 0; row < 3; ++row) {
            const QString number = QString::number(row);
            model->appendRow({new QStandardItem(QStringLiteral("a") + number),
                              new QStandardItem(QStringLiteral("b") + number)});
        }
    }
};

void KvDeskTableViewTest::copiesWholeRowsInOrder()
{
    QStandardItemModel model;
    fill(&model);
    KvDeskTableView view;
    view.setModel(&model);
    view.selectionModel()->select(model.index(2, 1), QItemSelectionModel::Select | QItemSelectionModel::Rows);
    view.selectionModel()->select(model.index(0, 0), QItemSelectionModel::Select | QItemSelectionModel::Rows);
    QCOMPARE(view.selectedText(), QStringLiteral("a0\tb0\na2\tb2\n"));
}

void KvDeskTableViewTest::copiesByShortcut()
{
    QStandardItemModel model;
    fill(&model);
    KvDeskTableView view;
    view.setModel(&model);
    view.show();
    view.setFocus();
    view.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&view));
    view.selectRow(1);
    QTest::keySequence(&view, QKeySequence::Copy);
    QCOMPARE(QGuiApplication::clipboard()->text(), QStringLiteral("a1\tb1\n"));
}

void KvDeskTableViewTest::nothingSelectedKeepsTheClipboard()
{
    QGuiApplication::clipboard()->setText(QStringLiteral("before"));
    QStandardItemModel model;
    fill(&model);
    KvDeskTableView view;
    view.setModel(&model);
    view.slotCopy();
    QCOMPARE(QGuiApplication::clipboard()->text(), QStringLiteral("before"));
}

void KvDeskTableViewTest::viewWithoutModelHasNoText()
{
    QCOMPARE(KvDeskTableView().selectedText(), QString());
}

STATREPORT_TEST_MAIN(KvDeskTableViewTest)
#include "KvDeskTableViewTest.moc"
