// SPDX-License-Identifier: MIT
#include "KvDeskTableView.h"

#include "support/StatReportTest.h"

#include <QMimeData>

class KvDeskTableViewTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void copiesWholeRowsInOrder();
    void copiesByShortcut();
    void nothingSelectedKeepsTheClipboard();
    void viewWithoutModelHasNoText();
    void copiesHeadingsAndHtml();
    void textsDoNotBreakTheTable();

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

void KvDeskTableViewTest::copiesHeadingsAndHtml()
{
    QStandardItemModel model;
    fill(&model);
    model.item(1, 0)->setText(QStringLiteral("a<1"));
    model.setHorizontalHeaderLabels({QStringLiteral("A"), QStringLiteral("B")});
    KvDeskTableView view;
    view.setModel(&model);
    view.selectRow(1);
    QVERIFY(!view.selectedData()->html().contains(QLatin1String("<th>")));
    view.setCopiesHeadings(true);
    view.copyAction()->trigger();
    const QMimeData *const copied = QGuiApplication::clipboard()->mimeData();
    QCOMPARE(copied->text(), QStringLiteral("A\tB\na<1\tb1\n"));
    QCOMPARE(copied->html(), QStringLiteral("<table>\n<tr><th>A</th><th>B</th></tr>\n"
                                            "<tr><td>a&lt;1</td><td>b1</td></tr>\n</table>\n"));
}

void KvDeskTableViewTest::textsDoNotBreakTheTable()
{
    QStandardItemModel model;
    model.appendRow(
        {new QStandardItem(QStringLiteral("two\nlines")), new QStandardItem(QStringLiteral("a\tb"))});
    KvDeskTableView view;
    view.setModel(&model);
    view.selectAll();
    QCOMPARE(view.selectedText(), QStringLiteral("two lines\ta b\n"));
}

STATREPORT_TEST_MAIN(KvDeskTableViewTest)
#include "KvDeskTableViewTest.moc"
