// SPDX-License-Identifier: MIT
#include "KvDeskToolColumn.h"

#include "gui/KvGuiMainWindowBase.h"
#include "gui/KvToolBase.h"
#include "support/StatReportTest.h"

class KvDeskToolColumnTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void panelIsShownWhileTheToolIsActive();
    void panelsComeInOrder();
    void widthFitsTheWidestPanel();
    void widthStaysWhenPanelsHide();
    void scrollBarHasRoom();
    void survivesTheEndOfATool();

private:
    static KvToolBase *addTool(KvDeskToolColumn *column, KvGuiMainWindowBase *window, const QString &name,
                               const QSize &size = QSize(158, 100))
    {
        auto *const tool = new KvToolBase(window, QIcon(), name, name, false);
        auto *const widget = new QWidget;
        widget->setFixedSize(size);
        tool->setGuiWidget(widget);
        column->addTool(tool);
        return tool;
    }
};

void KvDeskToolColumnTest::panelIsShownWhileTheToolIsActive()
{
    KvGuiMainWindowBase window;
    KvDeskToolColumn column;
    KvToolBase *const tool = addTool(&column, &window, QStringLiteral("report"));
    column.show();
    QVERIFY(tool->getToolButton()->isVisible());
    QVERIFY(!tool->panel()->isVisible());
    tool->getToolButton()->click();
    QVERIFY(tool->panel()->isVisible());
    QVERIFY(tool->guiWidget()->isVisible());
    tool->getToolButton()->click();
    QVERIFY(!tool->panel()->isVisible());
}

void KvDeskToolColumnTest::panelsComeInOrder()
{
    KvGuiMainWindowBase window;
    KvDeskToolColumn column;
    QVector<KvToolBase *> tools;
    for (int i = 0; i < 6; ++i) {
        tools.append(addTool(&column, &window, QString::number(i)));
        tools.last()->getToolButton()->setChecked(true);
    }
    column.resize(column.sizeHint().width(), 1200);
    column.show();
    for (int i = 1; i < tools.size(); ++i) {
        const auto top = [&](int tool) { return tools.at(tool)->panel()->mapTo(&column, QPoint()).y(); };
        QVERIFY(top(i) > top(i - 1));
    }
    // Four buttons a row.
    const auto place = [&](int tool) { return tools.at(tool)->getToolButton()->pos(); };
    QCOMPARE(place(3).y(), place(0).y());
    QVERIFY(place(4).y() > place(0).y());
    QCOMPARE(place(4).x(), place(0).x());
}

void KvDeskToolColumnTest::widthFitsTheWidestPanel()
{
    KvGuiMainWindowBase window;
    KvDeskToolColumn column;
    addTool(&column, &window, QStringLiteral("a"), QSize(200, 50));
    KvToolBase *const tool = addTool(&column, &window, QStringLiteral("b"), QSize(260, 50));
    tool->getToolButton()->setChecked(true);
    column.resize(column.sizeHint().width(), 600);
    column.show();
    QCOMPARE(tool->guiWidget()->visibleRegion().boundingRect().width(), 260);
}

void KvDeskToolColumnTest::widthStaysWhenPanelsHide()
{
    KvGuiMainWindowBase window;
    KvDeskToolColumn column;
    KvToolBase *const tool = addTool(&column, &window, QStringLiteral("a"), QSize(220, 50));
    const int width = column.sizeHint().width();
    tool->getToolButton()->setChecked(true);
    QCOMPARE(column.sizeHint().width(), width);
    QVERIFY(width >= 220);
}

void KvDeskToolColumnTest::scrollBarHasRoom()
{
    KvGuiMainWindowBase window;
    QWidget parent;
    auto *const layout = new QHBoxLayout(&parent);
    auto *const column = new KvDeskToolColumn;
    layout->addWidget(column);
    layout->addWidget(new QWidget, 1);
    KvToolBase *const tool = addTool(column, &window, QStringLiteral("a"), QSize(158, 900));
    parent.resize(600, 300);
    parent.show();
    const int width = column->width();
    tool->getToolButton()->setChecked(true);
    QTRY_VERIFY(column->width() > width);
    QTRY_COMPARE(tool->guiWidget()->visibleRegion().boundingRect().width(), 158);
}

void KvDeskToolColumnTest::survivesTheEndOfATool()
{
    KvGuiMainWindowBase window;
    KvDeskToolColumn column;
    KvToolBase *const tool = addTool(&column, &window, QStringLiteral("a"));
    addTool(&column, &window, QStringLiteral("b"));
    delete tool;
    column.show();
    QCOMPARE(column.findChildren<QToolButton *>(QStringLiteral("a")).size(), 0);
    QCOMPARE(column.findChildren<QToolButton *>(QStringLiteral("b")).size(), 1);
}

STATREPORT_TEST_MAIN(KvDeskToolColumnTest)
#include "KvDeskToolColumnTest.moc"
