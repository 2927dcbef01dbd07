// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "gui/KvGuiMainWindowBase.h"
#include "gui/KvToolBase.h"

#include <QToolBar>
#include <QToolButton>

namespace {

/// A host's window: buttons in a tool bar, panels in the middle.
class PlacingWindow : public KvGuiMainWindowBase
{
public:
    PlacingWindow()
    {
        m_toolBar = addToolBar(QStringLiteral("Tools"));
        setCentralWidget(new QWidget);
    }

    QToolBar *toolBar() const { return m_toolBar; }

    QStringList placed;

protected:
    void placeTool(KvToolBase *tool) override
    {
        placed.append(tool->name());
        m_toolBar->addWidget(tool->getToolButton());
        tool->panel()->setParent(centralWidget());
    }

private:
    QToolBar *m_toolBar = nullptr;
};

KvToolBase *newTool(KvGuiMainWindowBase *window, const char *name)
{
    return new KvToolBase(window, QIcon(), QStringLiteral("Title"), QLatin1String(name), false);
}

} // namespace

class KvGuiMainWindowBaseTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void toolsComeInTheirOrder();
    void aToolIsPlacedOnce();
    void nullIsNoTool();
    void aDeletedToolIsForgotten();
    void theWindowTakesItsToolsAlong();
    void theBasePlacesNothing();
};

void KvGuiMainWindowBaseTest::toolsComeInTheirOrder()
{
    PlacingWindow window;
    KvToolBase *const first = newTool(&window, "first");
    KvToolBase *const second = newTool(&window, "second");
    QCOMPARE(window.tools(), QList<KvToolBase *>({first, second}));
    QCOMPARE(window.placed, QStringList({QStringLiteral("first"), QStringLiteral("second")}));
}

void KvGuiMainWindowBaseTest::aToolIsPlacedOnce()
{
    PlacingWindow window;
    window.addTool(newTool(&window, "tool"));
    QCOMPARE(window.tools().size(), 1);
    QCOMPARE(window.placed.size(), 1);
}

void KvGuiMainWindowBaseTest::nullIsNoTool()
{
    PlacingWindow window;
    window.addTool(nullptr);
    QVERIFY(window.tools().isEmpty());
    QVERIFY(window.placed.isEmpty());
}

void KvGuiMainWindowBaseTest::aDeletedToolIsForgotten()
{
    PlacingWindow window;
    KvToolBase *const first = newTool(&window, "first");
    KvToolBase *const second = newTool(&window, "second");
    const QPointer<QToolButton> button = first->getToolButton();
    const QPointer<QWidget> panel = first->panel();
    delete first;
    QCOMPARE(window.tools(), QList<KvToolBase *>{second});
    QVERIFY(button.isNull());
    QVERIFY(panel.isNull());
}

void KvGuiMainWindowBaseTest::theWindowTakesItsToolsAlong()
{
    auto window = std::make_unique<PlacingWindow>();
    const QPointer<KvToolBase> tool = newTool(window.get(), "tool");
    const QPointer<QToolButton> button = tool->getToolButton();
    auto *const widget = new QWidget;
    const QPointer<QWidget> guiWidget = widget;
    tool->setGuiWidget(widget);
    QCOMPARE(button->window(), window.get());
    window.reset();
    QVERIFY(tool.isNull());
    QVERIFY(button.isNull());
    QVERIFY(guiWidget.isNull());
}

void KvGuiMainWindowBaseTest::theBasePlacesNothing()
{
    KvGuiMainWindowBase window;
    const KvToolBase *const tool = newTool(&window, "tool");
    QVERIFY(tool->getToolButton()->parent() == nullptr);
    QVERIFY(tool->panel()->parent() == nullptr);
}

STATREPORT_TEST_MAIN(KvGuiMainWindowBaseTest)
#include "KvGuiMainWindowBaseTest.moc"
