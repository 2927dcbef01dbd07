// SPDX-License-Identifier: MIT
#include "report/KvSelectionOverlay.h"
#include "report/KvReportProxyWidgetItem.h"
#include "support/FakeReport.h"
#include "support/StatReportTest.h"
#include "widgets/KvTransparentIconButton.h"

#include <QGraphicsProxyWidget>
#include <QGraphicsScene>
#include <QPen>

namespace {

const QColor kAccent(0x00, 0x65, 0x9d);

/** Stands for the view: counts the clicks on the delete button. */
class DeleteReceiver : public QObject
{
    Q_OBJECT
public:
    int calls() const { return m_calls; }

public slots:
    void slotDeleteButtonClicked() { ++m_calls; }

private:
    int m_calls = 0;
};

/** An item in a scene, selected. */
class SelectedItem
{
public:
    enum class Kind { Block, Section };

    explicit SelectedItem(Kind kind)
    {
        KvReportNode *node = m_report.addFake({200});
        m_item = KvReportProxyWidgetItem::createForPiece(node, 0);
        if (kind == Kind::Section)
            m_item->setNode(nullptr);
        m_item->setPos(20, 300);
        m_scene.addItem(m_item);
        m_overlay = new KvSelectionOverlay(m_item, &m_receiver);
        m_scene.addItem(m_overlay);
    }

    KvReportProxyWidgetItem *item() { return m_item; }
    KvSelectionOverlay *overlay() { return m_overlay; }
    DeleteReceiver &receiver() { return m_receiver; }
    QGraphicsScene &scene() { return m_scene; }

    QVector<QGraphicsRectItem *> rects() const
    {
        QVector<QGraphicsRectItem *> found;
        for (QGraphicsItem *child : m_overlay->childItems()) {
            if (auto *rect = qgraphicsitem_cast<QGraphicsRectItem *>(child))
                found.append(rect);
        }
        return found;
    }
    QGraphicsProxyWidget *buttonItem() const
    {
        for (QGraphicsItem *child : m_overlay->childItems()) {
            if (auto *proxy = qgraphicsitem_cast<QGraphicsProxyWidget *>(child))
                return proxy;
        }
        return nullptr;
    }
    KvTransparentIconButton *button() const
    {
        return buttonItem() ? qobject_cast<KvTransparentIconButton *>(buttonItem()->widget()) : nullptr;
    }

private:
    FakeReport m_report;
    DeleteReceiver m_receiver;
    QGraphicsScene m_scene;
    KvReportProxyWidgetItem *m_item = nullptr;
    KvSelectionOverlay *m_overlay = nullptr;
};

QRectF sceneRectOf(const QGraphicsRectItem *rect)
{
    return rect->mapRectToScene(rect->rect());
}

} // namespace

class KvSelectionOverlayTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void framesTheItem();
    void hasFourHandles();
    void offersToDeleteBlocks();
    void sectionsCannotBeDeleted();
    void paintsTheButtonInItsColours();
    void followsTheItem();
    void deletesFromTheEventLoop();
    void takesNoEventsOfItsChildren();
    void leavesTheItemAlone();
};

void KvSelectionOverlayTest::framesTheItem()
{
    SelectedItem selected(SelectedItem::Kind::Block);
    const QGraphicsRectItem *frame = selected.rects().first();
    QCOMPARE(selected.item()->size(), QSizeF(952, 200));
    QCOMPARE(frame->scenePos(), QPointF(20, 300));
    QCOMPARE(frame->rect(), QRectF(0, 0, 952, 200));
    QCOMPARE(frame->pen(), QPen(kAccent));
    QCOMPARE(frame->brush().style(), Qt::NoBrush);
    QCOMPARE(frame->zValue(), 1.0);
}

void KvSelectionOverlayTest::hasFourHandles()
{
    SelectedItem selected(SelectedItem::Kind::Block);
    QVector<QGraphicsRectItem *> handles = selected.rects();
    handles.removeFirst();
    QVector<QRectF> rects;
    for (const QGraphicsRectItem *handle : qAsConst(handles)) {
        rects.append(sceneRectOf(handle));
        QCOMPARE(handle->brush(), QBrush(kAccent));
        QCOMPARE(handle->pen().style(), Qt::NoPen);
        QCOMPARE(handle->zValue(), 2.0);
    }
    QCOMPARE(rects, QVector<QRectF>({QRectF(17, 298, 6, 4), QRectF(969, 298, 6, 4), QRectF(17, 498, 6, 4),
                                     QRectF(969, 498, 6, 4)}));
}

void KvSelectionOverlayTest::offersToDeleteBlocks()
{
    SelectedItem selected(SelectedItem::Kind::Block);
    const KvTransparentIconButton *button = selected.button();
    QVERIFY(button);
    QCOMPARE(button->iconPath(), QStringLiteral("Icons/IconTrash.svg"));
    QCOMPARE(selected.buttonItem()->size(), QSizeF(22, 22));
    QCOMPARE(selected.buttonItem()->scenePos(), QPointF(20 + (952 - 22 - 10), 300 + (200 - 22) * 0.5));
    QCOMPARE(selected.overlay()->deleteButtonRect(), QRectF(940, 389, 22, 22));
    QCOMPARE(button->toolTip(), QStringLiteral("Delete block (Del)"));
    QCOMPARE(button->accessibleName(), QStringLiteral("Delete block"));
    QCOMPARE(button->focusPolicy(), Qt::NoFocus);
}

void KvSelectionOverlayTest::sectionsCannotBeDeleted()
{
    SelectedItem selected(SelectedItem::Kind::Section);
    QCOMPARE(selected.rects().size(), 5);
    QVERIFY(!selected.buttonItem());
    QVERIFY(selected.overlay()->deleteButtonRect().isNull());
    QVERIFY(!selected.overlay()->deleteButtonRect().contains(QPointF(0, 0)));
    selected.overlay()->update();
    QCOMPARE(selected.rects().first()->scenePos(), QPointF(20, 300));
}

void KvSelectionOverlayTest::paintsTheButtonInItsColours()
{
    SelectedItem selected(SelectedItem::Kind::Block);
    KvTransparentIconButton *button = selected.button();
    const auto shows = [button](const QColor &color) {
        QImage image(button->size(), QImage::Format_ARGB32);
        image.fill(Qt::transparent);
        button->render(&image, QPoint(), QRegion(), QWidget::DrawChildren);
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x) {
                if (image.pixelColor(x, y) == color)
                    return true;
            }
        }
        return false;
    };
    QVERIFY(shows(QColor(0xf0, 0xb1, 0xb5)));
    QVERIFY(!shows(QColor(0xe8, 0x47, 0x49)));
    button->setDown(true);
    QVERIFY(shows(QColor(0xe8, 0x47, 0x49)));
    button->setDown(false);
    button->setAttribute(Qt::WA_UnderMouse);
    QVERIFY(shows(QColor(0xa6, 0x1d, 0x24)));
    button->setEnabled(false);
    QVERIFY(shows(QColor(0x4d, 0x4d, 0x4d)));
}

void KvSelectionOverlayTest::followsTheItem()
{
    SelectedItem selected(SelectedItem::Kind::Block);
    selected.item()->setPos(5, 7);
    selected.item()->setMinimumSize(0, 0);
    selected.item()->resize(500, 11);
    const QSizeF size = selected.item()->size();
    selected.overlay()->update();
    const QVector<QGraphicsRectItem *> rects = selected.rects();
    QCOMPARE(sceneRectOf(rects.at(0)), QRectF(QPointF(5, 7), size));
    QCOMPARE(sceneRectOf(rects.at(4)), QRectF(5 + size.width() - 3, 7 + size.height() - 2, 6, 4));
    QCOMPARE(selected.overlay()->deleteButtonRect(),
             QRectF(5 + (size.width() - 32), 7 + (size.height() - 22) * 0.5, 22, 22));
}

void KvSelectionOverlayTest::deletesFromTheEventLoop()
{
    SelectedItem selected(SelectedItem::Kind::Block);
    selected.button()->click();
    QCOMPARE(selected.receiver().calls(), 0);
    QCoreApplication::processEvents();
    QCOMPARE(selected.receiver().calls(), 1);
}

void KvSelectionOverlayTest::takesNoEventsOfItsChildren()
{
    SelectedItem selected(SelectedItem::Kind::Block);
    QVERIFY(!selected.overlay()->handlesChildEvents());
    QCOMPARE(selected.overlay()->zValue(), 1.0);
    QVERIFY(selected.overlay()->zValue() > selected.item()->zValue());
    for (const QGraphicsItem *child : selected.overlay()->childItems())
        QCOMPARE(child->group(), selected.overlay());
    // The button is on top.
    const QList<QGraphicsItem *> found = selected.scene().items(QPointF(950, 400));
    QCOMPARE(found.first(), static_cast<QGraphicsItem *>(selected.buttonItem()));
}

void KvSelectionOverlayTest::leavesTheItemAlone()
{
    SelectedItem selected(SelectedItem::Kind::Block);
    delete selected.overlay();
    QCOMPARE(selected.item()->scene(), &selected.scene());
    QCOMPARE(selected.scene().items().size(), 1);
}

STATREPORT_TEST_MAIN(KvSelectionOverlayTest)
#include "KvSelectionOverlayTest.moc"
