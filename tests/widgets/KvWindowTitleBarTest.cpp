// SPDX-License-Identifier: MIT
#include "widgets/KvWindowTitleBar.h"
#include "support/BracketTranslator.h"
#include "support/StatReportTest.h"

#include <QLabel>
#include <QMouseEvent>
#include <QToolButton>
#include <QVBoxLayout>

namespace {

/** A frameless window with a title bar at its top. */
class Window : public QWidget
{
public:
    Window()
        : QWidget(nullptr, Qt::Window | Qt::FramelessWindowHint)
        , bar(new KvWindowTitleBar(this))
    {
        auto *column = new QVBoxLayout(this);
        column->setContentsMargins(0, 0, 0, 0);
        column->addWidget(bar);
        column->addStretch(1);
        setMinimumHeight(120);
        setGeometry(50, 100, 300, 200);
        show();
    }

    /** Sends what a mouse sends when it goes to a point of the screen. */
    void mouse(QEvent::Type type, const QPoint &global, Qt::MouseButton button = Qt::LeftButton)
    {
        const bool isPlainMove = type == QEvent::MouseMove && button == Qt::NoButton;
        const Qt::MouseButton changed = type == QEvent::MouseMove ? Qt::NoButton : button;
        const Qt::MouseButtons held =
            isPlainMove || type == QEvent::MouseButtonRelease ? Qt::MouseButtons() : Qt::MouseButtons(button);
        QMouseEvent event(type, bar->mapFromGlobal(global), global, changed, held, Qt::NoModifier);
        QCoreApplication::sendEvent(bar, &event);
    }

    KvWindowTitleBar *const bar;
};

} // namespace

class KvWindowTitleBarTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void showsItsTitle();
    void closeButtonEmits();
    void closeButtonHasAnIconAndAName();
    void isTranslated();
    void dragMovesTheWindow();
    void otherButtonsDoNotMove();
    void releaseEndsTheDrag();
    void topEdgeResizes_data();
    void topEdgeResizes();
    void resizeComesBackFromItsLimit();
    void cursorTellsTheTopEdge_data();
    void cursorTellsTheTopEdge();
};

void KvWindowTitleBarTest::showsItsTitle()
{
    KvWindowTitleBar bar;
    bar.setTitle(QStringLiteral("Report template editor - [new]"));
    QCOMPARE(bar.title(), QStringLiteral("Report template editor - [new]"));
    QCOMPARE(bar.findChild<QLabel *>()->text(), bar.title());
    QVERIFY(bar.hasMouseTracking());
}

void KvWindowTitleBarTest::closeButtonEmits()
{
    KvWindowTitleBar bar;
    QSignalSpy closed(&bar, SIGNAL(closeClicked()));
    QTest::mouseClick(bar.findChild<QToolButton *>(), Qt::LeftButton);
    QCOMPARE(closed.count(), 1);
}

void KvWindowTitleBarTest::closeButtonHasAnIconAndAName()
{
    const KvWindowTitleBar bar;
    const auto *button = bar.findChild<QToolButton *>();
    QCOMPARE(button->iconSize(), QSize(36, 24));
    QVERIFY(!button->icon().isNull());
    QCOMPARE(button->toolTip(), QStringLiteral("Close"));
    QCOMPARE(button->accessibleName(), QStringLiteral("Close"));
    QCOMPARE(bar.focusProxy(), button);
}

void KvWindowTitleBarTest::isTranslated()
{
    KvWindowTitleBar bar;
    const BracketTranslator translator(QStringLiteral("KvWindowTitleBar"));
    QTRY_COMPARE(bar.findChild<QToolButton *>()->toolTip(), QStringLiteral("[Close]"));
}

void KvWindowTitleBarTest::dragMovesTheWindow()
{
    Window window;
    window.mouse(QEvent::MouseButtonPress, QPoint(150, 120));
    window.mouse(QEvent::MouseMove, QPoint(160, 115));
    QCOMPARE(window.geometry(), QRect(60, 95, 300, 200));
    window.mouse(QEvent::MouseMove, QPoint(130, 150));
    QCOMPARE(window.geometry(), QRect(30, 130, 300, 200));
}

void KvWindowTitleBarTest::otherButtonsDoNotMove()
{
    Window window;
    window.mouse(QEvent::MouseButtonPress, QPoint(150, 120), Qt::RightButton);
    window.mouse(QEvent::MouseMove, QPoint(160, 115), Qt::RightButton);
    QCOMPARE(window.geometry(), QRect(50, 100, 300, 200));
}

void KvWindowTitleBarTest::releaseEndsTheDrag()
{
    Window window;
    window.mouse(QEvent::MouseButtonPress, QPoint(150, 120));
    window.mouse(QEvent::MouseButtonRelease, QPoint(150, 120));
    window.mouse(QEvent::MouseMove, QPoint(160, 115), Qt::NoButton);
    QCOMPARE(window.geometry(), QRect(50, 100, 300, 200));
}

void KvWindowTitleBarTest::topEdgeResizes_data()
{
    QTest::addColumn<int>("pressY");
    QTest::addColumn<int>("moveBy");
    QTest::addColumn<QRect>("geometry");
    QTest::newRow("up, first pixel") << 0 << -30 << QRect(50, 70, 300, 230);
    QTest::newRow("down, third pixel") << 2 << 40 << QRect(50, 140, 300, 160);
    QTest::newRow("not below the minimum") << 1 << 150 << QRect(50, 180, 300, 120);
    QTest::newRow("fourth pixel moves") << 3 << 40 << QRect(50, 140, 300, 200);
}

void KvWindowTitleBarTest::topEdgeResizes()
{
    QFETCH(int, pressY);
    QFETCH(int, moveBy);
    QFETCH(QRect, geometry);
    Window window;
    window.mouse(QEvent::MouseButtonPress, QPoint(150, 100 + pressY));
    window.mouse(QEvent::MouseMove, QPoint(150, 100 + pressY + moveBy));
    QCOMPARE(window.geometry(), geometry);
}

void KvWindowTitleBarTest::resizeComesBackFromItsLimit()
{
    Window window;
    window.mouse(QEvent::MouseButtonPress, QPoint(150, 100));
    window.mouse(QEvent::MouseMove, QPoint(150, 400));
    window.mouse(QEvent::MouseMove, QPoint(150, 90));
    QCOMPARE(window.geometry(), QRect(50, 90, 300, 210));
}

void KvWindowTitleBarTest::cursorTellsTheTopEdge_data()
{
    QTest::addColumn<int>("y");
    QTest::addColumn<Qt::CursorShape>("shape");
    QTest::newRow("top") << 0 << Qt::SizeVerCursor;
    QTest::newRow("third pixel") << 2 << Qt::SizeVerCursor;
    QTest::newRow("fourth pixel") << 3 << Qt::ArrowCursor;
}

void KvWindowTitleBarTest::cursorTellsTheTopEdge()
{
    QFETCH(int, y);
    QFETCH(Qt::CursorShape, shape);
    Window window;
    window.mouse(QEvent::MouseMove, QPoint(150, 100), Qt::NoButton);
    QCOMPARE(window.bar->cursor().shape(), Qt::SizeVerCursor);
    window.mouse(QEvent::MouseMove, QPoint(150, 100 + y), Qt::NoButton);
    QCOMPARE(window.bar->cursor().shape(), shape);
}

STATREPORT_TEST_MAIN(KvWindowTitleBarTest)
#include "KvWindowTitleBarTest.moc"
