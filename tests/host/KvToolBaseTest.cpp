// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "gui/KvGuiMainWindowBase.h"
#include "gui/KvToolBase.h"

#include <QLabel>
#include <QToolButton>

class KvToolBaseTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void hasWhatItWasGiven();
    void theFlagActivates_data();
    void theFlagActivates();
    void livesWithoutAWindow();
    void theButtonActivates();
    void enabling_data();
    void enabling();
    void enablingAnnouncesChangesOnly();
    void resetIsOfferedAtFirst();
    void resetIsShownInThePanelOnly();
    void resetAsks();
    void takesItsWidgetOver();
    void anotherWidgetReplacesTheFirst();
    void nullTakesTheWidgetAway();
    void theIconCanChange();
    void opensFilesOfItsKinds_data();
    void opensFilesOfItsKinds();
    void openingAFileActivates();
    void outlivesItsWidgets();

private:
    std::unique_ptr<KvGuiMainWindowBase> m_window;
    KvToolBase *m_tool = nullptr; ///< of the window
};

void KvToolBaseTest::init()
{
    StatReportTest::init();
    QPixmap pixmap(8, 8);
    pixmap.fill(Qt::red);
    m_window = std::make_unique<KvGuiMainWindowBase>();
    m_tool = new KvToolBase(m_window.get(), QIcon(pixmap), QStringLiteral("My tool"),
                            QStringLiteral("mytool"), false);
}

void KvToolBaseTest::cleanup()
{
    m_window.reset();
    StatReportTest::cleanup();
}

void KvToolBaseTest::hasWhatItWasGiven()
{
    QCOMPARE(m_tool->parent(), m_window.get());
    QCOMPARE(m_tool->title(), QStringLiteral("My tool"));
    QCOMPARE(m_tool->name(), QStringLiteral("mytool"));
    QCOMPARE(m_window->tools(), QList<KvToolBase *>{m_tool});

    const QToolButton *const button = m_tool->getToolButton();
    QVERIFY(button->isCheckable());
    QVERIFY(!button->icon().isNull());
    QCOMPARE(button->toolTip(), QStringLiteral("My tool"));
    QCOMPARE(m_tool->panel()->findChild<QLabel *>()->text(), QStringLiteral("My tool"));
    QVERIFY(m_tool->isEnabled());
}

void KvToolBaseTest::theFlagActivates_data()
{
    QTest::addColumn<bool>("flag");
    QTest::newRow("inactive") << false;
    QTest::newRow("active") << true;
}

void KvToolBaseTest::theFlagActivates()
{
    QFETCH(bool, flag);
    const KvToolBase tool(m_window.get(), QIcon(), QString(), QString(), flag);
    QCOMPARE(tool.isActivated(), flag);
    QCOMPARE(tool.getToolButton()->isChecked(), flag);
}

void KvToolBaseTest::livesWithoutAWindow()
{
    KvToolBase tool(nullptr, QIcon(), QStringLiteral("t"), QStringLiteral("n"), false);
    tool.setGuiWidget(new QWidget);
    tool.setEnabled(true, true);
    QVERIFY(tool.isActivated());
}

void KvToolBaseTest::theButtonActivates()
{
    QSignalSpy activated(m_tool, SIGNAL(toolActivated(bool)));
    m_tool->getToolButton()->click();
    QVERIFY(m_tool->isActivated());
    m_tool->getToolButton()->setChecked(false);
    QVERIFY(!m_tool->isActivated());
    QCOMPARE(activated.count(), 2);
    QCOMPARE(activated.at(0).at(0).toBool(), true);
    QCOMPARE(activated.at(1).at(0).toBool(), false);
}

void KvToolBaseTest::enabling_data()
{
    QTest::addColumn<bool>("activeBefore");
    QTest::addColumn<bool>("enabled");
    QTest::addColumn<bool>("activate");
    QTest::addColumn<bool>("activeAfter");
    QTest::newRow("enable only") << false << true << false << false;
    QTest::newRow("enable and activate") << false << true << true << true;
    QTest::newRow("enable an active one") << true << true << false << true;
    QTest::newRow("activate an active one") << true << true << true << true;
    QTest::newRow("disable") << true << false << false << false;
    QTest::newRow("disabled is never active") << true << false << true << false;
    QTest::newRow("disable an inactive one") << false << false << true << false;
}

void KvToolBaseTest::enabling()
{
    QFETCH(bool, activeBefore);
    QFETCH(bool, enabled);
    QFETCH(bool, activate);
    m_tool->getToolButton()->setChecked(activeBefore);
    m_tool->setEnabled(enabled, activate);
    QCOMPARE(m_tool->isEnabled(), enabled);
    QCOMPARE(m_tool->getToolButton()->isEnabled(), enabled);
    QCOMPARE(m_tool->panel()->isEnabled(), enabled);
    QTEST(m_tool->isActivated(), "activeAfter");
}

void KvToolBaseTest::enablingAnnouncesChangesOnly()
{
    QSignalSpy activated(m_tool, SIGNAL(toolActivated(bool)));
    m_tool->setEnabled(true, false);
    QCOMPARE(activated.count(), 0);
    m_tool->setEnabled(true, true);
    m_tool->setEnabled(true, true);
    QCOMPARE(activated.count(), 1);
    m_tool->setEnabled(false, false);
    QCOMPARE(activated.count(), 2);
    QCOMPARE(activated.at(1).at(0).toBool(), false);
}

void KvToolBaseTest::resetIsOfferedAtFirst()
{
    QVERIFY(m_tool->isResetVisible());
    m_tool->setResetVisible(false);
    QVERIFY(!m_tool->isResetVisible());
    m_tool->setResetVisible(true);
    QVERIFY(m_tool->isResetVisible());
}

/// Else it would come up as a window of its own.
void KvToolBaseTest::resetIsShownInThePanelOnly()
{
    m_tool->setResetVisible(true);
    QVERIFY(!m_tool->getResetButton()->isVisible());
    QVERIFY(m_tool->panel()->isAncestorOf(m_tool->getResetButton()));
    QVERIFY(m_tool->getResetButton()->isVisibleTo(m_tool->panel()));
}

void KvToolBaseTest::resetAsks()
{
    QSignalSpy reset(m_tool, SIGNAL(resetClicked()));
    m_tool->getResetButton()->click();
    QCOMPARE(reset.count(), 1);
}

void KvToolBaseTest::takesItsWidgetOver()
{
    QVERIFY(m_tool->guiWidget() == nullptr);
    const QPointer<QWidget> widget = new QWidget;
    m_tool->setGuiWidget(widget);
    m_tool->setGuiWidget(widget);
    QCOMPARE(m_tool->guiWidget(), widget.data());
    QVERIFY(m_tool->panel()->isAncestorOf(widget));
    delete m_tool;
    QVERIFY(widget.isNull());
}

void KvToolBaseTest::anotherWidgetReplacesTheFirst()
{
    const QPointer<QWidget> first = new QWidget;
    const QPointer<QWidget> second = new QWidget;
    m_tool->setGuiWidget(first);
    m_tool->setGuiWidget(second);
    QVERIFY(first.isNull());
    QCOMPARE(m_tool->guiWidget(), second.data());
}

void KvToolBaseTest::nullTakesTheWidgetAway()
{
    const QPointer<QWidget> widget = new QWidget;
    m_tool->setGuiWidget(widget);
    m_tool->setGuiWidget(nullptr);
    QVERIFY(widget.isNull());
    QVERIFY(m_tool->guiWidget() == nullptr);
}

void KvToolBaseTest::theIconCanChange()
{
    const qint64 before = m_tool->getToolButton()->icon().cacheKey();
    QPixmap pixmap(8, 8);
    pixmap.fill(Qt::blue);
    m_tool->setToolIcon(QIcon(pixmap));
    QVERIFY(m_tool->getToolButton()->icon().cacheKey() != before);
}

void KvToolBaseTest::opensFilesOfItsKinds_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<bool>("isOpened");
    QTest::newRow("its kind") << QStringLiteral("/a/b.rtp") << true;
    QTest::newRow("in capitals") << QStringLiteral("B.RTP") << true;
    QTest::newRow("more dots") << QStringLiteral("a.b.rtp") << true;
    QTest::newRow("another kind") << QStringLiteral("a.rtp.json") << false;
    QTest::newRow("none") << QStringLiteral("rtp") << false;
    QTest::newRow("nothing") << QString() << false;
}

void KvToolBaseTest::opensFilesOfItsKinds()
{
    QFETCH(QString, path);
    QFETCH(bool, isOpened);
    QVERIFY(!m_tool->opensFile(path));
    m_tool->setFileSuffixes({QStringLiteral("rtp")});
    QCOMPARE(m_tool->opensFile(path), isOpened);
}

void KvToolBaseTest::openingAFileActivates()
{
    m_tool->setEnabled(true, false);
    QSignalSpy given(m_tool, SIGNAL(fileGiven(QString)));
    m_tool->openFile(QStringLiteral("a.rtp"));
    QCOMPARE(given, QList<QVariantList>({{QStringLiteral("a.rtp")}}));
    QVERIFY(m_tool->isActivated());
    m_tool->setEnabled(false, false);
    m_tool->openFile(QStringLiteral("b.rtp"));
    QCOMPARE(given.count(), 1);
    QVERIFY(!m_tool->isActivated());
}

/// A host may put button and panel where they die before the tool.
void KvToolBaseTest::outlivesItsWidgets()
{
    delete m_tool->getToolButton();
    delete m_tool->panel();
    QVERIFY(m_tool->getToolButton() == nullptr);
    QVERIFY(m_tool->panel() == nullptr);
    m_tool->setToolIcon(QIcon());
    m_tool->setResetVisible(true);
    m_tool->setGuiWidget(nullptr);
    m_tool->setEnabled(true, true);
    m_tool->openFile(QStringLiteral("a.rtp"));
    QVERIFY(!m_tool->isEnabled());
    QVERIFY(!m_tool->isActivated());
}

STATREPORT_TEST_MAIN(KvToolBaseTest)
#include "KvToolBaseTest.moc"
