// SPDX-License-Identifier: MIT
#include "editor/KvEditorToolWidget.h"
#include "support/BracketTranslator.h"
#include "support/FakeBlock.h"
#include "support/StatReportTest.h"

#include <QApplication>
#include <QDataStream>
#include <QDrag>
#include <QLabel>
#include <QMimeData>
#include <QMouseEvent>

namespace {

/** What a drag carried. */
struct SeenDrag
{
    QStringList formats;
    QByteArray data;
    QPixmap pixmap;
    QPoint hotSpot;
};

/** Notes drags instead of running them, which needs a mouse. */
class DragNotingTool : public KvEditorToolWidget
{
public:
    using KvEditorToolWidget::KvEditorToolWidget;

    const QVector<SeenDrag> &drags() const { return m_drags; }

    void sendMouse(QEvent::Type type, const QPoint &position, Qt::MouseButton button = Qt::LeftButton)
    {
        QMouseEvent event(type, position, mapToGlobal(position), button, button, Qt::NoModifier);
        QCoreApplication::sendEvent(this, &event);
    }

protected:
    void runDrag(QDrag *drag) override
    {
        const QString format = drag->mimeData()->formats().value(0);
        m_drags.append(
            {drag->mimeData()->formats(), drag->mimeData()->data(format), drag->pixmap(), drag->hotSpot()});
        delete drag;
    }

private:
    QVector<SeenDrag> m_drags;
};

} // namespace

class KvEditorToolWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void showsDots();
    void looksDraggable();
    void isTranslated();
    void movingFarStartsADrag_data();
    void movingFarStartsADrag();
    void dragCarriesTheType();
    void dragShowsTheTool();
    void onePressIsOneDrag();
    void otherButtonsDoNotDrag();
    void moveWithoutPressDoesNotDrag();
    void activationNamesTheType_data();
    void activationNamesTheType();
    void aSingleClickDoesNothing();
};

void KvEditorToolWidgetTest::showsDots()
{
    FakeBlockFactory factory;
    const KvEditorToolWidget tool(&factory);
    QCOMPARE(tool.factory(), &factory);
    QCOMPARE(tool.markPath(), QStringLiteral("Icons/ToolIconDots.svg"));
    QVERIFY(!tool.findChildren<QLabel *>().last()->pixmap(Qt::ReturnByValue).isNull());
}

void KvEditorToolWidgetTest::looksDraggable()
{
    FakeBlockFactory factory;
    const KvEditorToolWidget tool(&factory);
    QCOMPARE(tool.cursor().shape(), Qt::OpenHandCursor);
    QCOMPARE(tool.toolTip(), QStringLiteral("Drag onto the page, or press Enter to append"));
}

void KvEditorToolWidgetTest::isTranslated()
{
    FakeBlockFactory factory;
    const KvEditorToolWidget tool(&factory);
    const BracketTranslator translator(QStringLiteral("KvEditorToolWidget"));
    QTRY_COMPARE(tool.toolTip(), QStringLiteral("[Drag onto the page, or press Enter to append]"));
}

void KvEditorToolWidgetTest::movingFarStartsADrag_data()
{
    QTest::addColumn<int>("distance");
    QTest::addColumn<int>("drags");
    const int start = QApplication::startDragDistance();
    QTest::newRow("near") << start - 1 << 0;
    QTest::newRow("far") << start << 1;
    QTest::newRow("farther") << 3 * start << 1;
}

void KvEditorToolWidgetTest::movingFarStartsADrag()
{
    QFETCH(int, distance);
    FakeBlockFactory factory;
    DragNotingTool tool(&factory);
    tool.sendMouse(QEvent::MouseButtonPress, QPoint(20, 10));
    tool.sendMouse(QEvent::MouseMove, QPoint(20 + distance, 10));
    QTEST(tool.drags().size(), "drags");
}

void KvEditorToolWidgetTest::dragCarriesTheType()
{
    FakeBlockFactory factory(QStringLiteral("Text Document"));
    DragNotingTool tool(&factory);
    tool.sendMouse(QEvent::MouseButtonPress, QPoint(20, 10));
    tool.sendMouse(QEvent::MouseMove, QPoint(80, 10));
    QCOMPARE(tool.drags().size(), 1);
    const SeenDrag drag = tool.drags().first();
    QCOMPARE(drag.formats, QStringList(QStringLiteral("application/x-KvEditorToolsListModeldatalist")));
    QDataStream stream(drag.data);
    QString tag;
    QString name;
    stream >> tag >> name;
    QCOMPARE(stream.status(), QDataStream::Ok);
    QVERIFY(stream.atEnd());
    QCOMPARE(tag, QStringLiteral("nodeType"));
    QCOMPARE(name, QStringLiteral("Text Document"));
}

void KvEditorToolWidgetTest::dragShowsTheTool()
{
    FakeBlockFactory factory;
    DragNotingTool tool(&factory);
    tool.sendMouse(QEvent::MouseButtonPress, QPoint(23, 7));
    tool.sendMouse(QEvent::MouseMove, QPoint(23, 60));
    const SeenDrag drag = tool.drags().value(0);
    QCOMPARE(drag.hotSpot, QPoint(23, 7));
    QCOMPARE(drag.pixmap.cacheKey(), factory.dragPixmap().cacheKey());
    QVERIFY(!drag.pixmap.isNull());
}

void KvEditorToolWidgetTest::onePressIsOneDrag()
{
    FakeBlockFactory factory;
    DragNotingTool tool(&factory);
    tool.sendMouse(QEvent::MouseButtonPress, QPoint(20, 10));
    tool.sendMouse(QEvent::MouseMove, QPoint(80, 10));
    tool.sendMouse(QEvent::MouseMove, QPoint(140, 10));
    QCOMPARE(tool.drags().size(), 1);
    tool.sendMouse(QEvent::MouseButtonPress, QPoint(20, 10));
    tool.sendMouse(QEvent::MouseMove, QPoint(80, 10));
    QCOMPARE(tool.drags().size(), 2);
}

void KvEditorToolWidgetTest::otherButtonsDoNotDrag()
{
    FakeBlockFactory factory;
    DragNotingTool tool(&factory);
    tool.sendMouse(QEvent::MouseButtonPress, QPoint(20, 10), Qt::RightButton);
    tool.sendMouse(QEvent::MouseMove, QPoint(80, 10), Qt::RightButton);
    QCOMPARE(tool.drags().size(), 0);
}

void KvEditorToolWidgetTest::moveWithoutPressDoesNotDrag()
{
    FakeBlockFactory factory;
    DragNotingTool tool(&factory);
    tool.sendMouse(QEvent::MouseButtonPress, QPoint(20, 10));
    tool.sendMouse(QEvent::MouseButtonRelease, QPoint(20, 10));
    tool.sendMouse(QEvent::MouseMove, QPoint(80, 10));
    QCOMPARE(tool.drags().size(), 0);
}

void KvEditorToolWidgetTest::activationNamesTheType_data()
{
    QTest::addColumn<bool>("byMouse");
    QTest::newRow("double click") << true;
    QTest::newRow("enter") << false;
}

void KvEditorToolWidgetTest::activationNamesTheType()
{
    QFETCH(bool, byMouse);
    FakeBlockFactory factory(QStringLiteral("Trend"));
    KvEditorToolWidget tool(&factory);
    QSignalSpy activated(&tool, SIGNAL(signalToolActivated(QString)));
    if (byMouse)
        QTest::mouseDClick(&tool, Qt::LeftButton);
    else
        QTest::keyClick(&tool, Qt::Key_Return);
    QCOMPARE(activated.count(), 1);
    QCOMPARE(activated.first().first().toString(), QStringLiteral("Trend"));
}

void KvEditorToolWidgetTest::aSingleClickDoesNothing()
{
    FakeBlockFactory factory;
    KvEditorToolWidget tool(&factory);
    QSignalSpy activated(&tool, SIGNAL(signalToolActivated(QString)));
    QTest::mouseClick(&tool, Qt::LeftButton);
    QCOMPARE(activated.count(), 0);
}

STATREPORT_TEST_MAIN(KvEditorToolWidgetTest)
#include "KvEditorToolWidgetTest.moc"
