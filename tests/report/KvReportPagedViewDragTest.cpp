// SPDX-License-Identifier: MIT
#include "PagedViewDrag.h"
#include "PagedViewTools.h"
#include "blocks/textdocument/KvTextDocumentNodeWidget.h"
#include "report/KvReportPage.h"
#include "support/FakeReport.h"
#include "support/StatReportTest.h"

#include <QDataStream>
#include <QDrag>
#include <QGraphicsRectItem>
#include <QGraphicsScene>
#include <QJsonArray>
#include <QJsonObject>
#include <QScrollBar>
#include <QUrl>

using namespace PagedViewTools;

namespace {

using Said = QVector<KvBaseDisplayWidget *>;
using DuringDrag = std::function<void(QDrag *)>;

const char kImagePath[] = "/pictures/cell.png";

/** A view whose drags do what the test says, instead of waiting for a mouse. */
class DragView : public KvReportPagedView
{
public:
    void setDuringDrag(const DuringDrag &during) { m_during = during; }
    int drags() const { return m_drags; }

protected:
    void runDrag(QDrag *drag) override
    {
        ++m_drags;
        // A copy: the test may delete the view with its drag.
        const DuringDrag during = m_during;
        const QPointer<QDrag> guard(drag);
        if (during)
            during(drag);
        delete guard;
    }

private:
    DuringDrag m_during;
    int m_drags = 0;
};

/** A shown view of a report, with what it says of its selection. Pages have the default width. */
class DragReport
{
public:
    DragReport()
        : m_view(std::make_unique<DragView>())
    {
        QObject::connect(m_view.get(), &KvReportPagedView::signalSelectionChanged, m_view.get(),
                         [this](KvBaseDisplayWidget *widget) { m_said.append(widget); });
        m_view->setModel(m_report.model());
    }

    FakeReport &report() { return m_report; }
    KvTemplateModel *model() { return m_report.model(); }
    DragView &view() { return *m_view; }
    void deleteView() { m_view.reset(); }
    bool hasView() const { return m_view != nullptr; }

    void show(int height = 900)
    {
        showView(*m_view, QSize(952 + 40 + m_view->verticalScrollBar()->sizeHint().width(), height));
        QCOMPARE(model()->pageWidth(), 952);
        save();
    }
    /** Makes the template unmodified. */
    void save() { QVERIFY(model()->save(StatReportTest::temporaryPath(QStringLiteral("dragged.rtp")))); }
    Said said() { return std::exchange(m_said, {}); }

    KvReportProxyWidgetItem *item(int index) const { return m_view->pieceItems().at(index); }
    QGraphicsRectItem *mark() const
    {
        for (QGraphicsItem *item : m_view->scene()->items()) {
            if (auto *rect = qgraphicsitem_cast<QGraphicsRectItem *>(item); rect && !rect->parentItem())
                return rect;
        }
        return nullptr;
    }
    QRectF markRect() const { return mark() ? mark()->mapRectToScene(mark()->rect()) : QRectF(); }

    /** Presses on an item and moves the mouse by some pixels. */
    void pressAndMove(const KvReportProxyWidgetItem *item, const QPoint &by)
    {
        const QPoint point = m_view->mapFromScene(item->scenePos() + QPointF(5, item->size().height() / 2));
        QTest::mousePress(m_view->viewport(), Qt::LeftButton, {}, point);
        moveWithLeftButton(*m_view, point + by);
    }
    /** Runs a whole drag of a block, with what happens meanwhile. */
    void dragBlock(int index, const DuringDrag &during)
    {
        m_view->setDuringDrag(during);
        pressAndMove(m_view->pieceItems().at(index), QPoint(0, QApplication::startDragDistance() + 1));
    }

private:
    FakeReport m_report;
    Said m_said;
    std::unique_ptr<DragView> m_view;
};

QMimeData *withFormat(const char *format, const QByteArray &bytes)
{
    auto *data = new QMimeData;
    data->setData(QLatin1String(format), bytes);
    return data;
}

QByteArray streamed(const std::function<void(QDataStream &)> &write)
{
    QByteArray bytes;
    QDataStream stream(&bytes, QIODevice::WriteOnly);
    write(stream);
    return bytes;
}

QMimeData *newBlock(const QString &type)
{
    return withFormat("application/x-KvEditorToolsListModeldatalist",
                      streamed([&](QDataStream &stream) { stream << QStringLiteral("nodeType") << type; }));
}

QMimeData *movedBlock(int index)
{
    return withFormat("application/x-meeditorpreviewlistmodeldatalist", streamed([&](QDataStream &stream) {
                          stream << QStringLiteral("nodeIndex") << static_cast<qint32>(index);
                      }));
}

QMimeData *galleryFile(const QString &path)
{
    auto *data = new QMimeData;
    data->setData(QStringLiteral("GalleryDrag"), QByteArray());
    data->setUrls({QUrl::fromLocalFile(path)});
    return data;
}

QMimeData *copyOf(const QMimeData *data)
{
    auto *copy = new QMimeData;
    for (const QString &format : data->formats())
        copy->setData(format, data->data(format));
    return copy;
}

/** A point of the first page, as an offset from its content's top. */
QPointF onPage(qreal y)
{
    return QPointF(400, contentTop(0) + y);
}

/** A block that notes the object that it reads, and has keys of its own. */
class NotingCfg : public FakeBlockCfg
{
public:
    using FakeBlockCfg::FakeBlockCfg;

    bool toJson(QJsonObject &config) const override
    {
        config[QStringLiteral("imgPath")] = QStringLiteral("/old.png");
        config[QStringLiteral("alignment")] = QStringLiteral("2");
        config[QStringLiteral("own")] = 17;
        if (!config.contains(QStringLiteral("imgData")))
            config[QStringLiteral("imgData")] = QStringLiteral("AAAA");
        return FakeBlockCfg::toJson(config);
    }
    bool fromJson(const QJsonObject &config) override
    {
        m_read.append(config);
        m_cursors.append(QApplication::overrideCursor() ? QApplication::overrideCursor()->shape()
                                                        : Qt::ArrowCursor);
        return FakeBlockCfg::fromJson(config);
    }

    const QVector<QJsonObject> &read() const { return m_read; }
    const QVector<Qt::CursorShape> &cursors() const { return m_cursors; }

private:
    QVector<QJsonObject> m_read;
    QVector<Qt::CursorShape> m_cursors;
};

class NotingFactory : public FakeBlockFactory
{
public:
    using FakeBlockFactory::FakeBlockFactory;
    KvBaseEditorNodeCfg *createConfig(KvTemplateContext *context) override { return new NotingCfg(context); }
};

NotingCfg *notingCfg(KvReportNode *node)
{
    return static_cast<NotingCfg *>(node->config());
}

} // namespace

class KvReportPagedViewDragTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void aDragBeginsAfterSomeDistance_data();
    void aDragBeginsAfterSomeDistance();
    void onlyBlocksAreDragged();
    void aSelectedTextIsDraggedByItsMargin();
    void aDragCarriesTheBlocksIndex();
    void theDraggedBlockIsLeftOut();
    void aClickAfterADragSelects();
    void movesABlock_data();
    void movesABlock();
    void aMovedBlockModifiesTheTemplate();
    void aBlockOnItsOwnPlaceChangesNothing_data();
    void aBlockOnItsOwnPlaceChangesNothing();
    void movesTheBlockWhereverItIsNow();
    void aDraggedBlockMayDie_data();
    void aDraggedBlockMayDie();
    void theModelMayDieDuringADrag();
    void theViewMayDieDuringADrag();
    void rebuildsDuringADrag();
    void marksWhereItWouldDrop_data();
    void marksWhereItWouldDrop();
    void aCursorInTheMarkChangesNothing();
    void theMarkClosesEditors();
    void refusesDropsOffThePages_data();
    void refusesDropsOffThePages();
    void mayComeInBesideThePages();
    void leavingRemovesTheMark();
    void takesTheProposedAction();
    void scrollsNearTheEdges();
    void goesOnScrollingWhileADragRests();
    void stopsScrolling_data();
    void stopsScrolling();
    void dropsNewBlocks_data();
    void dropsNewBlocks();
    void dropsBehindABlockOfSeveralPieces();
    void ignoresOtherDrops_data();
    void ignoresOtherDrops();
    void ignoresUnusableDrops_data();
    void ignoresUnusableDrops();
    void aGalleryImageIsMarkedBetweenBlocksOnly();
    void aGalleryImageBecomesANewBlock();
    void aGalleryImageReplacesTheBlocksImage();
    void aGalleryImageReplacesWhatIsUnderTheMouse();
    void aGalleryImageClosesOpenOptionsFirst();
    void aGalleryImageShowsTheWaitCursor();
    void ignoresFilesThatAreNoImages_data();
    void ignoresFilesThatAreNoImages();
    void dropsCostOneLayout_data();
    void dropsCostOneLayout();
    void dropsOnAViewWithoutAModel();
    void keepsTheScrollPosition();
};

// ---- dragging a block ----

void KvReportPagedViewDragTest::aDragBeginsAfterSomeDistance_data()
{
    QTest::addColumn<QPoint>("by");
    QTest::addColumn<bool>("drags");
    const int distance = QApplication::startDragDistance();
    QVERIFY(distance > 2);
    QTest::newRow("not at all") << QPoint() << false;
    QTest::newRow("just not far enough") << QPoint(0, distance) << false;
    QTest::newRow("just not far enough, sideways") << QPoint(-(distance - 1), -1) << false;
    QTest::newRow("just far enough") << QPoint(0, distance + 1) << true;
    QTest::newRow("just far enough, both ways") << QPoint(distance, -1) << true;
    QTest::newRow("far") << QPoint(100, 100) << true;
}

void KvReportPagedViewDragTest::aDragBeginsAfterSomeDistance()
{
    QFETCH(QPoint, by);
    QFETCH(bool, drags);
    DragReport shown;
    shown.report().addFake({100});
    shown.show();
    shown.pressAndMove(shown.item(0), by);
    QCOMPARE(shown.view().drags(), drags ? 1 : 0);
}

void KvReportPagedViewDragTest::onlyBlocksAreDragged()
{
    DragReport shown;
    shown.model()->header()->setText(QStringLiteral("header"));
    shown.model()->setHeaderEnabled(true);
    shown.model()->setPageNumberingEnabled(true);
    shown.report().addFake({100});
    shown.show(1450);
    for (const QPointF &point :
         {QPointF(300, 48), QPointF(971 - 42, 1365 - 32), QPointF(300, 700), QPointF(5, 5)}) {
        const QPoint press = shown.view().mapFromScene(point);
        QTest::mousePress(shown.view().viewport(), Qt::LeftButton, {}, press);
        moveWithLeftButton(shown.view(), press + QPoint(80, 80));
        QTest::mouseRelease(shown.view().viewport(), Qt::LeftButton, {}, press + QPoint(80, 80));
        shown.view().slotCloseAllEditors();
    }
    // Nor with another button.
    const QPoint onBlock = shown.view().mapFromScene(shown.item(0)->scenePos() + QPointF(5, 50));
    for (const Qt::MouseButton button : {Qt::RightButton, Qt::MiddleButton}) {
        QTest::mousePress(shown.view().viewport(), button, {}, onBlock);
        QMouseEvent move(QEvent::MouseMove, onBlock + QPoint(80, 80), Qt::NoButton, button, Qt::NoModifier);
        QApplication::sendEvent(shown.view().viewport(), &move);
        QTest::mouseRelease(shown.view().viewport(), button, {}, onBlock + QPoint(80, 80));
    }
    QCOMPARE(shown.view().drags(), 0);
}

void KvReportPagedViewDragTest::aSelectedTextIsDraggedByItsMargin()
{
    DragReport shown;
    KvReportNode *node = shown.report().addText(QStringLiteral("some words to select"));
    shown.show();
    const QPoint onText = shown.view().mapFromScene(shown.item(0)->scenePos() + QPointF(130, 8));
    const auto dragFrom = [&shown](const QPoint &point) {
        const int before = shown.view().drags();
        QTest::mousePress(shown.view().viewport(), Qt::LeftButton, {}, point);
        moveWithLeftButton(shown.view(), point + QPoint(60, 0));
        QTest::mouseRelease(shown.view().viewport(), Qt::LeftButton, {}, point + QPoint(60, 0));
        return shown.view().drags() - before;
    };
    QCOMPARE(dragFrom(onText), 1);
    // While it is edited the mouse selects in it.
    shown.view().selectNode(node);
    const std::unique_ptr<QWidget> options(node->displayWidget()->createOptionsWidget(nullptr, true));
    QCOMPARE(dragFrom(onText), 0);
    auto *text = dynamic_cast<KvTextDocumentNodeWidget *>(node->displayWidget());
    QVERIFY(text->textCursor().hasSelection());
    QCOMPARE(shown.view().selectedNode(), node);
    QCOMPARE(dragFrom(shown.view().mapFromScene(shown.item(0)->scenePos() + QPointF(10, 8))), 1);
}

void KvReportPagedViewDragTest::aDragCarriesTheBlocksIndex()
{
    DragReport shown;
    shown.report().addFake({100, 30});
    KvReportNode *second = shown.report().addFake({50});
    shown.show();
    bool wasSeen = false;
    shown.dragBlock(2, [&](QDrag *drag) {
        wasSeen = true;
        QCOMPARE(drag->mimeData()->formats(),
                 QStringList(QStringLiteral("application/x-meeditorpreviewlistmodeldatalist")));
        const QByteArray bytes =
            drag->mimeData()->data(QStringLiteral("application/x-meeditorpreviewlistmodeldatalist"));
        const std::unique_ptr<QMimeData> expected(movedBlock(1));
        QCOMPARE(bytes, expected->data(QStringLiteral("application/x-meeditorpreviewlistmodeldatalist")));
        QCOMPARE(drag->source(), &shown.view());
        QCOMPARE(drag->pixmap().toImage(), second->factory()->dragPixmap().toImage());
    });
    QVERIFY(wasSeen);
}

void KvReportPagedViewDragTest::theDraggedBlockIsLeftOut()
{
    DragReport shown;
    shown.report().addFake({100});
    KvReportNode *dragged = shown.report().addFake({50, 60});
    KvReportNode *last = shown.report().addFake({30});
    shown.show();
    bool wasSeen = false;
    shown.dragBlock(2, [&](QDrag *) {
        wasSeen = true;
        QCOMPARE(placesOf(shown.view()), QVector<QPoint>({QPoint(20, 40), QPoint(20, 141)}));
        QCOMPARE(shown.item(1)->node(), last);
        QVERIFY(!shown.mark());
        QCOMPARE(shown.model()->node(1), dragged);
    });
    QVERIFY(wasSeen);
    QCOMPARE(shown.view().pieceItems().size(), 4);
    QVERIFY(showsAllPieces(shown.view()));
    QVERIFY(!shown.model()->isModified());
    QVERIFY(!shown.view().findChild<QDrag *>());
}

void KvReportPagedViewDragTest::aClickAfterADragSelects()
{
    DragReport shown;
    KvReportNode *node = shown.report().addFake({100});
    shown.show();
    shown.dragBlock(0, {});
    QCOMPARE(shown.view().drags(), 1);
    // The drag has taken the release: a move without a button, or another one, drags nothing.
    QTest::mouseMove(shown.view().viewport(), QPoint(500, 500));
    QCOMPARE(shown.view().drags(), 1);
    QVERIFY(!shown.view().selectedItem());
    QTest::mouseClick(shown.view().viewport(), Qt::LeftButton, {}, shown.view().mapFromScene(onPage(50)));
    QCOMPARE(shown.view().selectedNode(), node);
}

// ---- moving ----

void KvReportPagedViewDragTest::movesABlock_data()
{
    QTest::addColumn<int>("from");
    QTest::addColumn<double>("y");
    QTest::addColumn<QVector<int>>("order");
    // Blocks of 100 pixels; without the dragged one the others stand at 0, 101 and 202.
    QTest::newRow("first to the second") << 0 << 110.0 << QVector<int>{1, 0, 2, 3};
    QTest::newRow("first to the end") << 0 << 290.0 << QVector<int>{1, 2, 3, 0};
    QTest::newRow("first below the end") << 0 << 800.0 << QVector<int>{1, 2, 3, 0};
    QTest::newRow("second to the first") << 1 << 20.0 << QVector<int>{1, 0, 2, 3};
    QTest::newRow("second to the third") << 1 << 190.0 << QVector<int>{0, 2, 1, 3};
    QTest::newRow("last to the first") << 3 << 20.0 << QVector<int>{3, 0, 1, 2};
    QTest::newRow("last to the lower half of the first") << 3 << 60.0 << QVector<int>{0, 3, 1, 2};
}

void KvReportPagedViewDragTest::movesABlock()
{
    QFETCH(int, from);
    QFETCH(double, y);
    QFETCH(QVector<int>, order);
    DragReport shown;
    for (int i = 0; i < 4; ++i)
        shown.report().addFake({100});
    const QVector<KvReportNode *> before = shown.model()->nodes();
    shown.show();
    bool isTaken = false;
    shown.dragBlock(from, [&](QDrag *drag) {
        PagedViewDrag over(&shown.view(), copyOf(drag->mimeData()), Qt::MoveAction);
        isTaken = over.run(onPage(y));
    });
    QVERIFY(isTaken);
    QVector<KvReportNode *> expected;
    for (const int index : qAsConst(order))
        expected.append(before.at(index));
    QCOMPARE(shown.model()->nodes(), expected);
    for (int i = 0; i < 4; ++i)
        QCOMPARE(shown.item(i)->node(), expected.at(i));
    QVERIFY(!shown.mark());
    QCOMPARE(shown.view().dropIndex(), -1);
}

void KvReportPagedViewDragTest::aMovedBlockModifiesTheTemplate()
{
    DragReport shown;
    shown.report().addFake({10});
    shown.report().addFake({20});
    shown.show();
    QVERIFY(!shown.model()->isModified());
    const QSignalSpy list(shown.model(), SIGNAL(signalListChanged()));
    const QSignalSpy modified(shown.model()->context(), SIGNAL(signalTemplateModified()));
    const QSignalSpy status(shown.model(), SIGNAL(signalTemplateStatusChanged(QString,bool)));
    shown.dragBlock(0, [&](QDrag *drag) {
        PagedViewDrag(&shown.view(), copyOf(drag->mimeData()), Qt::MoveAction).run(onPage(400));
    });
    QCOMPARE(list.count(), 1);
    QCOMPARE(modified.count(), 1);
    QCOMPARE(status.count(), 1);
    QVERIFY(shown.model()->isModified());
    // The new order is the one that is saved.
    QJsonArray nodes;
    for (const KvReportNode *node : shown.model()->nodes())
        QVERIFY(node->toJson(nodes));
    const auto heightOf = [&nodes](int index) {
        return nodes.at(index)
            .toObject()
            .value(QStringLiteral("config"))
            .toObject()
            .value(QStringLiteral("heights"))
            .toArray()
            .first()
            .toInt();
    };
    QCOMPARE(heightOf(0), 20);
    QCOMPARE(heightOf(1), 10);
    // A moved block is not selected.
    QVERIFY(!shown.view().selectedItem());
}

void KvReportPagedViewDragTest::aBlockOnItsOwnPlaceChangesNothing_data()
{
    QTest::addColumn<int>("from");
    QTest::addColumn<double>("y");
    QTest::newRow("first") << 0 << 10.0;
    QTest::newRow("second") << 1 << 90.0;
    QTest::newRow("third, at the end") << 2 << 500.0;
}

void KvReportPagedViewDragTest::aBlockOnItsOwnPlaceChangesNothing()
{
    QFETCH(int, from);
    QFETCH(double, y);
    DragReport shown;
    for (int i = 0; i < 3; ++i)
        shown.report().addFake({100});
    const QVector<KvReportNode *> before = shown.model()->nodes();
    shown.show();
    bool isTaken = false;
    shown.dragBlock(from, [&](QDrag *drag) {
        isTaken = PagedViewDrag(&shown.view(), copyOf(drag->mimeData()), Qt::MoveAction).run(onPage(y));
    });
    QVERIFY(isTaken);
    QCOMPARE(shown.model()->nodes(), before);
    QVERIFY(!shown.model()->isModified());
    QCOMPARE(shown.view().pieceItems().size(), 3);
    QVERIFY(showsAllPieces(shown.view()));
    QVERIFY(!shown.mark());
}

void KvReportPagedViewDragTest::movesTheBlockWhereverItIsNow()
{
    DragReport shown;
    shown.report().addFake({100});
    KvReportNode *dragged = shown.report().addFake({100});
    KvReportNode *third = shown.report().addFake({100});
    shown.show();
    KvReportNode *added = nullptr;
    shown.dragBlock(1, [&](QDrag *drag) {
        // The list changes under the drag: the index that it carries is another block's.
        added = shown.model()->createNode(QStringLiteral("Fake"), 0);
        PagedViewDrag(&shown.view(), copyOf(drag->mimeData()), Qt::MoveAction).run(onPage(600));
    });
    QVERIFY(added);
    QCOMPARE(shown.model()->node(0), added);
    QCOMPARE(shown.model()->node(2), third);
    QCOMPARE(shown.model()->node(3), dragged);
}

// ---- trouble during a drag ----

void KvReportPagedViewDragTest::aDraggedBlockMayDie_data()
{
    QTest::addColumn<bool>("marked");
    QTest::addColumn<bool>("all");
    QTest::newRow("before it is marked") << false << false;
    QTest::newRow("while it is marked") << true << false;
    QTest::newRow("all blocks") << true << true;
}

void KvReportPagedViewDragTest::aDraggedBlockMayDie()
{
    QFETCH(bool, marked);
    QFETCH(bool, all);
    DragReport shown;
    shown.report().addFake({100});
    KvReportNode *dragged = shown.report().addFake({100});
    shown.report().addFake({100});
    shown.report().addFake({100});
    shown.show();
    QVector<KvReportNode *> left;
    shown.dragBlock(1, [&](QDrag *drag) {
        PagedViewDrag over(&shown.view(), copyOf(drag->mimeData()), Qt::MoveAction);
        if (marked)
            over.enter(onPage(250));
        if (all)
            shown.model()->clearNodes();
        else
            shown.model()->removeNode(dragged);
        left = shown.model()->nodes();
        shown.save();
        over.run(onPage(10));
    });
    // Not the block that has its index now.
    QCOMPARE(shown.model()->nodes(), left);
    QCOMPARE(left.size(), all ? 0 : 3);
    QVERIFY(!shown.model()->isModified());
    QCOMPARE(shown.view().pieceItems().size(), left.size());
    QVERIFY(!shown.mark());
    QVERIFY(!shown.view().selectedItem());
    QVERIFY(!shown.view().grab().isNull());
}

void KvReportPagedViewDragTest::theModelMayDieDuringADrag()
{
    DragReport shown;
    shown.report().addFake({100});
    shown.report().addText(QStringLiteral("text"));
    shown.show();
    shown.dragBlock(0, [&](QDrag *drag) {
        PagedViewDrag over(&shown.view(), copyOf(drag->mimeData()), Qt::MoveAction);
        over.enter(onPage(250));
        shown.report().deleteModel();
        QVERIFY(!over.move(onPage(10)));
        over.drop(onPage(10));
    });
    QCOMPARE(shown.view().pages().size(), 0);
    QCOMPARE(shown.view().scene()->items().size(), 0);
}

void KvReportPagedViewDragTest::theViewMayDieDuringADrag()
{
    DragReport shown;
    shown.report().addFake({100});
    shown.report().addFake({100});
    shown.show();
    // Away from the view's own events: these would go on in the dead view.
    shown.dragBlock(0, [&](QDrag *drag) {
        PagedViewDrag over(&shown.view(), copyOf(drag->mimeData()), Qt::MoveAction);
        over.enter(onPage(250));
        over.move(onPage(50));
        shown.deleteView();
    });
    QVERIFY(!shown.hasView());
    QCOMPARE(FakePiece::alive(), 2);
    QCOMPARE(shown.model()->nodeCount(), 2);
}

void KvReportPagedViewDragTest::rebuildsDuringADrag()
{
    DragReport shown;
    KvReportNode *dragged = shown.report().addFake({100});
    KvReportNode *other = shown.report().addFake({100});
    shown.report().addText(QStringLiteral("text"));
    shown.show();
    shown.dragBlock(0, [&](QDrag *drag) {
        PagedViewDrag over(&shown.view(), copyOf(drag->mimeData()), Qt::MoveAction);
        over.enter(onPage(10));
        QCOMPARE(shown.view().dropIndex(), 0);
        // As when measured values come in.
        emit other->displayWidget()->displaySignals()->signalSubWidgetsChanged();
        deliverQueuedCalls();
        QCOMPARE(shown.view().pieceItems().size(), 2);
        QCOMPARE(shown.view().dropIndex(), 0);
        QCOMPARE(shown.markRect(), QRectF(20, 40, 912, 40));
        shown.model()->setHeaderEnabled(true);
        over.move(onPage(300));
        QCOMPARE(shown.view().dropIndex(), 2);
        emit dragged->displayWidget()->displaySignals()->signalWidgetChanged();
        over.drop(onPage(300));
    });
    QCOMPARE(shown.model()->node(2), dragged);
    QCOMPARE(shown.view().pieceItems().size(), 3);
    QVERIFY(showsAllPieces(shown.view()));
}

// ---- the mark ----

void KvReportPagedViewDragTest::marksWhereItWouldDrop_data()
{
    QTest::addColumn<double>("y");
    QTest::addColumn<int>("index");
    QTest::addColumn<double>("mark");
    // Blocks of 100, 200 and 50 pixels at 0, 101 and 302.
    QTest::newRow("upper half of the first") << 20.0 << 0 << 0.0;
    QTest::newRow("lower half of the first") << 70.0 << 1 << 101.0;
    QTest::newRow("upper half of the second") << 190.0 << 1 << 101.0;
    QTest::newRow("lower half of the second") << 230.0 << 2 << 302.0;
    QTest::newRow("lower half of the last") << 340.0 << 3 << 353.0;
    QTest::newRow("below the last") << 600.0 << 3 << 353.0;
    QTest::newRow("above the content") << -10.0 << 0 << 0.0;
}

void KvReportPagedViewDragTest::marksWhereItWouldDrop()
{
    QFETCH(double, y);
    QFETCH(int, index);
    QFETCH(double, mark);
    DragReport shown;
    shown.report().addFake({100});
    shown.report().addFake({200});
    shown.report().addFake({50});
    shown.show();
    PagedViewDrag drag(&shown.view(), newBlock(QStringLiteral("Fake")));
    QVERIFY(drag.enter(onPage(y)));
    QCOMPARE(shown.view().dropIndex(), index);
    QCOMPARE(shown.markRect(), QRectF(20, 40 + mark, 912, 40));
    QCOMPARE(shown.mark()->pen(), QPen(QColor(0x00, 0x65, 0x9d)));
    QVERIFY(qAbs(shown.mark()->brush().color().alphaF() - 0.3) < 0.001);
    for (int i = 0; i < 3; ++i) {
        const int top = QVector<int>{0, 101, 302}.at(i) + (i >= index ? 40 : 0);
        QCOMPARE(shown.item(i)->scenePos(), QPointF(20, 40 + top));
    }
    QVERIFY(!shown.model()->isModified());
    drag.leave();
}

void KvReportPagedViewDragTest::aCursorInTheMarkChangesNothing()
{
    DragReport shown;
    shown.report().addFake({30});
    shown.report().addFake({30});
    shown.show();
    PagedViewDrag drag(&shown.view(), newBlock(QStringLiteral("Fake")));
    drag.enter(onPage(5));
    QCOMPARE(shown.view().dropIndex(), 0);
    // Every row of the mark, although the middle of the first block is now further down.
    for (int y = 0; y < 40; ++y) {
        QVERIFY(drag.move(onPage(y)));
        QCOMPARE(shown.view().dropIndex(), 0);
    }
    drag.move(onPage(60));
    QCOMPARE(shown.view().dropIndex(), 1);
    QCOMPARE(shown.markRect().top(), 40.0 + 31);
    // Again: now the second block's place is under the mark.
    for (int y = 31; y < 71; ++y) {
        QVERIFY(drag.move(onPage(y)));
        QCOMPARE(shown.view().dropIndex(), 1);
    }
    drag.leave();
}

void KvReportPagedViewDragTest::theMarkClosesEditors()
{
    DragReport shown;
    KvReportNode *node = shown.report().addFake({100});
    shown.show();
    shown.view().selectNode(node);
    shown.said();
    PagedViewDrag drag(&shown.view(), newBlock(QStringLiteral("Fake")));
    drag.enter(QPointF(5, 5));
    QCOMPARE(shown.said(), Said());
    drag.move(onPage(300));
    QCOMPARE(shown.said(), Said({nullptr}));
    QVERIFY(!shown.view().selectedItem());
    drag.move(onPage(20));
    QCOMPARE(shown.said(), Said());
    drag.leave();
}

void KvReportPagedViewDragTest::refusesDropsOffThePages_data()
{
    QTest::addColumn<QPointF>("point");
    QTest::newRow("left") << QPointF(10, 300);
    QTest::newRow("right") << QPointF(980, 300);
    QTest::newRow("above") << QPointF(400, 10);
    QTest::newRow("between pages") << QPointF(400, 1376);
    QTest::newRow("below") << QPointF(400, 2745);
}

void KvReportPagedViewDragTest::refusesDropsOffThePages()
{
    QFETCH(QPointF, point);
    DragReport shown;
    shown.report().addFake({100, 1250});
    shown.show();
    QCOMPARE(shown.view().pages().size(), 2);
    shown.view().verticalScrollBar()->setValue(static_cast<int>(point.y()) - 400);
    for (const auto &make : QVector<std::function<QMimeData *()>>{
             []() { return newBlock(QStringLiteral("Fake")); }, []() { return movedBlock(0); },
             []() { return galleryFile(QLatin1String(kImagePath)); }}) {
        PagedViewDrag drag(&shown.view(), make());
        drag.enter(point.y() < 1000 ? onPage(1200) : QPointF(400, 1450));
        QVERIFY(!drag.move(point));
        QCOMPARE(shown.view().dropIndex(), -1);
        QVERIFY(!shown.mark());
        QVERIFY(!drag.drop(point));
    }
    QCOMPARE(shown.model()->nodeCount(), 1);
    QVERIFY(!shown.model()->isModified());
}

void KvReportPagedViewDragTest::mayComeInBesideThePages()
{
    DragReport shown;
    shown.report().addFake({100});
    shown.show();
    // The window system tells a view of no moves of a drag that it has refused as it came in.
    PagedViewDrag drag(&shown.view(), newBlock(QStringLiteral("Fake")));
    QVERIFY(drag.enterAt(QPoint(1, 300)));
    QVERIFY(!shown.mark());
    QVERIFY(!drag.moveAt(QPoint(10, 300)));
    QVERIFY(drag.move(onPage(200)));
    QCOMPARE(shown.view().dropIndex(), 1);
    QVERIFY(drag.drop(onPage(200)));
    QCOMPARE(shown.model()->nodeCount(), 2);
    // What is nothing for pages is refused at once.
    PagedViewDrag foreign(&shown.view(), withFormat("text/plain", "text"));
    QVERIFY(!foreign.enterAt(QPoint(1, 300)));
}

void KvReportPagedViewDragTest::leavingRemovesTheMark()
{
    DragReport shown;
    shown.report().addFake({100});
    shown.show();
    const QVector<QPoint> places = placesOf(shown.view());
    PagedViewDrag drag(&shown.view(), newBlock(QStringLiteral("Fake")));
    drag.enter(onPage(10));
    QVERIFY(shown.mark());
    drag.leave();
    QVERIFY(!shown.mark());
    QCOMPARE(shown.view().dropIndex(), -1);
    QCOMPARE(placesOf(shown.view()), places);
}

void KvReportPagedViewDragTest::takesTheProposedAction()
{
    DragReport shown;
    shown.show();
    for (const Qt::DropAction action : {Qt::CopyAction, Qt::MoveAction}) {
        const std::unique_ptr<QMimeData> data(newBlock(QStringLiteral("Fake")));
        const QPoint point = shown.view().mapFromScene(onPage(300));
        QDragEnterEvent enter(point, action, data.get(), Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(shown.view().viewport(), &enter);
        QVERIFY(enter.isAccepted());
        QCOMPARE(enter.dropAction(), action);
        QDropEvent drop(point, action, data.get(), Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(shown.view().viewport(), &drop);
        QVERIFY(drop.isAccepted());
        QCOMPARE(drop.dropAction(), action);
    }
}

// ---- scrolling ----

void KvReportPagedViewDragTest::scrollsNearTheEdges()
{
    DragReport shown;
    shown.report().addFake({1300, 1300, 1300});
    shown.show(600);
    QScrollBar *bar = shown.view().verticalScrollBar();
    const int height = shown.view().viewport()->height();
    PagedViewDrag drag(&shown.view(), newBlock(QStringLiteral("Fake")));
    bar->setValue(1000);
    drag.enterAt(QPoint(400, height / 2));
    QCOMPARE(bar->value(), 1000);
    // The cursor, 30 pixels around it and 50 more stay in view.
    drag.moveAt(QPoint(400, height - 82));
    QCOMPARE(bar->value(), 1000);
    drag.moveAt(QPoint(400, height - 40));
    QVERIFY2(qAbs(bar->value() - 1040) <= 2, qPrintable(QString::number(bar->value())));
    bar->setValue(1000);
    drag.moveAt(QPoint(400, 82));
    QCOMPARE(bar->value(), 1000);
    drag.moveAt(QPoint(400, 40));
    QVERIFY2(qAbs(bar->value() - 960) <= 2, qPrintable(QString::number(bar->value())));
    // Also over the gap between two pages, where nothing can be dropped.
    bar->setValue(1376 - height + 20);
    QVERIFY(!drag.moveAt(QPoint(400, height - 20)));
    QVERIFY(bar->value() > 1376 - height + 40);
    drag.leave();
}

void KvReportPagedViewDragTest::goesOnScrollingWhileADragRests()
{
    DragReport shown;
    shown.report().addFake({1300, 1300, 1300});
    shown.show(600);
    QScrollBar *bar = shown.view().verticalScrollBar();
    PagedViewDrag drag(&shown.view(), newBlock(QStringLiteral("Fake")));
    drag.enterAt(QPoint(400, shown.view().viewport()->height() - 20));
    const int once = bar->value();
    QVERIFY(once > 0);
    QTRY_VERIFY(bar->value() >= once + 100);
    drag.leave();
}

void KvReportPagedViewDragTest::stopsScrolling_data()
{
    QTest::addColumn<QString>("end");
    for (const char *end : {"leave", "drop", "foreign", "cancelled"})
        QTest::newRow(end) << QString::fromLatin1(end);
}

void KvReportPagedViewDragTest::stopsScrolling()
{
    QFETCH(QString, end);
    DragReport shown;
    shown.report().addFake({100});
    shown.report().addFake({1300, 1300, 1300});
    shown.show(600);
    QScrollBar *bar = shown.view().verticalScrollBar();
    const QPoint nearTheEdge(400, shown.view().viewport()->height() - 20);
    if (end == QLatin1String("cancelled")) {
        // The window system may end a drag without a word to the view.
        shown.dragBlock(0, [&](QDrag *mouse) {
            PagedViewDrag(&shown.view(), copyOf(mouse->mimeData())).enterAt(nearTheEdge);
        });
        QCOMPARE(shown.view().drags(), 1);
    } else {
        PagedViewDrag drag(&shown.view(), newBlock(QStringLiteral("Fake")));
        drag.enterAt(nearTheEdge);
        if (end == QLatin1String("leave"))
            drag.leave();
        else if (end == QLatin1String("drop"))
            drag.dropAt(nearTheEdge);
        else
            PagedViewDrag(&shown.view(), withFormat("text/plain", "text")).enterAt(nearTheEdge);
    }
    const int value = bar->value();
    // Three times the interval of the scrolling.
    QTest::qWait(300);
    QCOMPARE(bar->value(), value);
}

// ---- drops ----

void KvReportPagedViewDragTest::dropsNewBlocks_data()
{
    QTest::addColumn<double>("y");
    QTest::addColumn<int>("index");
    QTest::newRow("upper half of the first") << 20.0 << 0;
    QTest::newRow("lower half of the first") << 70.0 << 1;
    QTest::newRow("upper half of the second") << 110.0 << 1;
    QTest::newRow("lower half of the last") << 190.0 << 2;
    QTest::newRow("below the last") << 600.0 << 2;
}

void KvReportPagedViewDragTest::dropsNewBlocks()
{
    QFETCH(double, y);
    QFETCH(int, index);
    DragReport shown;
    shown.report().addFake({100});
    shown.report().addFake({100});
    shown.show();
    const QVector<KvReportNode *> before = shown.model()->nodes();
    PagedViewDrag drag(&shown.view(), newBlock(QStringLiteral("Text Document")));
    QVERIFY(drag.run(onPage(y)));
    QCOMPARE(shown.model()->nodeCount(), 3);
    KvReportNode *node = shown.model()->node(index);
    QVERIFY(!before.contains(node));
    QCOMPARE(node->typeName(), QStringLiteral("Text Document"));
    // It is selected when it is on the pages.
    QCOMPARE(shown.view().selectedNode(), node);
    QCOMPARE(shown.said(), Said({node->displayWidget()}));
    QVERIFY(shown.model()->isModified());
    QCOMPARE(shown.view().dropIndex(), -1);
    QVERIFY(!shown.mark());
    QVERIFY(showsAllPieces(shown.view()));
}

void KvReportPagedViewDragTest::dropsBehindABlockOfSeveralPieces()
{
    DragReport shown;
    KvReportNode *table = shown.report().addFake({100, 100, 100});
    KvReportNode *last = shown.report().addFake({50});
    shown.show();
    // The pieces are counted: 3 is beyond the two blocks, which means the end.
    QVERIFY(PagedViewDrag(&shown.view(), newBlock(QStringLiteral("Fake"))).run(onPage(310)));
    QCOMPARE(shown.model()->nodeCount(), 3);
    QCOMPARE(shown.model()->node(0), table);
    QCOMPARE(shown.model()->node(1), last);
    QCOMPARE(shown.view().selectedNode(), shown.model()->node(2));
    shown.save();
    // A block cannot be moved there at all.
    const QVector<KvReportNode *> before = shown.model()->nodes();
    shown.dragBlock(3, [&](QDrag *drag) {
        PagedViewDrag(&shown.view(), copyOf(drag->mimeData()), Qt::MoveAction).run(onPage(360));
    });
    QCOMPARE(shown.model()->nodes(), before);
    QVERIFY(!shown.model()->isModified());
    // The middle of the table means the place behind its first piece's block.
    QVERIFY(PagedViewDrag(&shown.view(), newBlock(QStringLiteral("Fake"))).run(onPage(60)));
    QCOMPARE(shown.model()->node(0), table);
    QCOMPARE(shown.model()->node(2), last);
}

void KvReportPagedViewDragTest::ignoresOtherDrops_data()
{
    QTest::addColumn<QString>("format");
    QTest::addColumn<QByteArray>("bytes");
    const auto row = [](const char *name, const char *format, const QByteArray &bytes) {
        QTest::newRow(name) << QString::fromLatin1(format) << bytes;
    };
    const QByteArray type =
        streamed([](QDataStream &stream) { stream << QStringLiteral("nodeType") << QStringLiteral("Fake"); });
    const QByteArray index =
        streamed([](QDataStream &stream) { stream << QStringLiteral("nodeIndex") << qint32(1); });
    row("text", "text/plain", "some text");
    row("file manager", "text/uri-list", "file:///pictures/cell.png");
    row("gallery without a file", "GalleryDrag", "file:///pictures/cell.png");
    row("new: empty", "application/x-KvEditorToolsListModeldatalist", QByteArray());
    row("new: short", "application/x-KvEditorToolsListModeldatalist", type.left(type.size() - 1));
    row("new: garbage", "application/x-KvEditorToolsListModeldatalist", QByteArray(50, '\xee'));
    row("new: an index", "application/x-KvEditorToolsListModeldatalist", index);
    row("moved: empty", "application/x-meeditorpreviewlistmodeldatalist", QByteArray());
    row("moved: short", "application/x-meeditorpreviewlistmodeldatalist", index.left(index.size() - 1));
    row("moved: garbage", "application/x-meeditorpreviewlistmodeldatalist", QByteArray(50, '\xee'));
    row("moved: a type", "application/x-meeditorpreviewlistmodeldatalist", type);
}

void KvReportPagedViewDragTest::ignoresOtherDrops()
{
    QFETCH(QString, format);
    QFETCH(QByteArray, bytes);
    DragReport shown;
    shown.report().addFake({100});
    shown.report().addFake({100});
    const QVector<KvReportNode *> before = shown.model()->nodes();
    shown.show();
    const QVector<QPoint> places = placesOf(shown.view());
    PagedViewDrag drag(&shown.view(), withFormat(format.toLatin1().constData(), bytes));
    QVERIFY(!drag.enter(onPage(20)));
    QVERIFY(!shown.mark());
    // Sent all the same, after the mark of another drag.
    PagedViewDrag(&shown.view(), newBlock(QStringLiteral("Fake"))).enter(onPage(20));
    QVERIFY(shown.mark());
    QVERIFY(!drag.drop(onPage(20)));
    QCOMPARE(shown.model()->nodes(), before);
    QVERIFY(!shown.model()->isModified());
    QVERIFY(!shown.mark());
    QCOMPARE(shown.view().dropIndex(), -1);
    QCOMPARE(placesOf(shown.view()), places);
    QVERIFY(showsAllPieces(shown.view()));
}

void KvReportPagedViewDragTest::ignoresUnusableDrops_data()
{
    QTest::addColumn<bool>("moves");
    QTest::addColumn<QString>("type");
    QTest::addColumn<int>("index");
    QTest::newRow("unknown type") << false << QStringLiteral("Pony") << 0;
    QTest::newRow("a title") << false << QStringLiteral("Fake title") << 0;
    QTest::newRow("no type") << false << QString() << 0;
    for (const int index :
         {-1, -2, 2, 3, 1000000, std::numeric_limits<int>::min(), std::numeric_limits<int>::max()})
        QTest::addRow("index %d", index) << true << QString() << index;
}

void KvReportPagedViewDragTest::ignoresUnusableDrops()
{
    QFETCH(bool, moves);
    QFETCH(QString, type);
    QFETCH(int, index);
    DragReport shown;
    shown.report().addFake({100});
    shown.report().addFake({100});
    const QVector<KvReportNode *> before = shown.model()->nodes();
    shown.show();
    const QVector<QPoint> places = placesOf(shown.view());
    const QSignalSpy list(shown.model(), SIGNAL(signalListChanged()));
    PagedViewDrag drag(&shown.view(), moves ? movedBlock(index) : newBlock(type));
    drag.run(onPage(20));
    QCOMPARE(shown.model()->nodes(), before);
    QVERIFY(!shown.model()->isModified());
    QCOMPARE(list.count(), 0);
    QVERIFY(!shown.mark());
    QCOMPARE(shown.view().dropIndex(), -1);
    QCOMPARE(placesOf(shown.view()), places);
    QVERIFY(!shown.view().selectedItem());
}

// ---- gallery ----

void KvReportPagedViewDragTest::aGalleryImageIsMarkedBetweenBlocksOnly()
{
    DragReport shown;
    shown.report().addFake({100});
    shown.report().addFake({100});
    shown.show();
    PagedViewDrag drag(&shown.view(), galleryFile(QLatin1String(kImagePath)));
    QVERIFY(drag.enter(onPage(20)));
    QCOMPARE(shown.view().dropIndex(), -1);
    QVERIFY(!shown.mark());
    QVERIFY(drag.move(onPage(400)));
    QCOMPARE(shown.view().dropIndex(), 2);
    QCOMPARE(shown.markRect(), QRectF(20, 40 + 202, 912, 40));
    QVERIFY(drag.move(onPage(150)));
    QCOMPARE(shown.view().dropIndex(), -1);
    QVERIFY(!shown.mark());
    // Above the first block, still on the page.
    QVERIFY(drag.move(onPage(-10)));
    QCOMPARE(shown.view().dropIndex(), 0);
    drag.leave();
}

void KvReportPagedViewDragTest::aGalleryImageBecomesANewBlock()
{
    FakeMeasurements measurements;
    KvBlockTypeList types;
    types.registerFactory(std::make_unique<NotingFactory>(QStringLiteral("Image View")));
    types.registerFactory(std::make_unique<FakeBlockFactory>());
    KvTemplateModel model(nullptr, measurements.kernelData());
    model.setFactories(&types);
    FakeReport::fakeCfg(model.createNode(QStringLiteral("Fake"), -1))->setHeights({1250});
    model.createNode(QStringLiteral("Fake"), -1);
    KvReportPagedView view;
    view.setModel(&model);
    QVector<KvReportNode *> selected;
    connect(&view, &KvReportPagedView::signalSelectionChanged, this,
            [&](KvBaseDisplayWidget *) { selected.append(view.selectedNode()); });
    showView(view, QSize(952 + 40 + view.verticalScrollBar()->sizeHint().width(), 1450));

    // At the end of the first page: the next block is on the second one.
    QVERIFY(PagedViewDrag(&view, galleryFile(QLatin1String(kImagePath))).run(onPage(1290)));
    QCOMPARE(model.nodeCount(), 3);
    KvReportNode *node = model.node(1);
    QCOMPARE(node->typeName(), QStringLiteral("Image View"));
    QCOMPARE(
        notingCfg(node)->read(),
        QVector<QJsonObject>({QJsonObject{{QStringLiteral("imgPath"), QStringLiteral("/pictures/cell.png")},
                                          {QStringLiteral("alignment"), QStringLiteral("132")},
                                          {QStringLiteral("widthPercent"), QStringLiteral("75")}}}));
    QCOMPARE(selected, QVector<KvReportNode *>({node}));
    QCOMPARE(view.dropIndex(), -1);
    QVERIFY(model.isModified());
}

void KvReportPagedViewDragTest::aGalleryImageReplacesTheBlocksImage()
{
    FakeMeasurements measurements;
    KvBlockTypeList types;
    types.registerFactory(std::make_unique<NotingFactory>(QStringLiteral("Image View")));
    KvTemplateModel model(nullptr, measurements.kernelData());
    model.setFactories(&types);
    model.createNode(QStringLiteral("Image View"), -1);
    KvReportNode *node = model.createNode(QStringLiteral("Image View"), -1);
    notingCfg(node)->setHeights({100, 50});
    KvReportPagedView view;
    view.setModel(&model);
    showView(view, QSize(1000, 900));
    QVERIFY(model.save(temporaryPath(QStringLiteral("image.rtp"))));
    const QSignalSpy modified(model.context(), SIGNAL(signalTemplateModified()));
    const int widgets = static_cast<FakeBlockFactory *>(node->factory())->widgetsMade();
    QVector<KvReportNode *> selected;
    connect(&view, &KvReportPagedView::signalSelectionChanged, this,
            [&](KvBaseDisplayWidget *) { selected.append(view.selectedNode()); });

    // On its second piece.
    QVERIFY(PagedViewDrag(&view, galleryFile(QLatin1String(kImagePath))).run(onPage(101 + 101 + 20)));
    QCOMPARE(model.nodeCount(), 2);
    QCOMPARE(
        notingCfg(node)->read(),
        QVector<QJsonObject>({QJsonObject{{QStringLiteral("imgPath"), QStringLiteral("/pictures/cell.png")},
                                          {QStringLiteral("alignment"), QStringLiteral("2")},
                                          {QStringLiteral("own"), 17},
                                          {QStringLiteral("heights"), QJsonArray{100, 50}}}}));
    QCOMPARE(notingCfg(model.node(0))->read().size(), 0);
    QCOMPARE(modified.count(), 1);
    QVERIFY(model.isModified());
    // Its widget is a new one, which shows the new picture.
    QCOMPARE(static_cast<FakeBlockFactory *>(node->factory())->widgetsMade(), widgets + 1);
    QCOMPARE(FakePiece::alive(), 3);
    QCOMPARE(view.pieceItems().size(), 3);
    QVERIFY(showsAllPieces(view));
    QCOMPARE(selected, QVector<KvReportNode *>({node}));
    QCOMPARE(view.selectedItem(), view.pieceItems().at(1));
}

void KvReportPagedViewDragTest::aGalleryImageReplacesWhatIsUnderTheMouse()
{
    FakeMeasurements measurements;
    KvBlockTypeList types;
    types.registerFactory(std::make_unique<NotingFactory>(QStringLiteral("Image View")));
    KvTemplateModel model(nullptr, measurements.kernelData());
    model.setFactories(&types);
    for (int i = 0; i < 3; ++i)
        notingCfg(model.createNode(QStringLiteral("Image View"), -1))->setHeights({30});
    KvReportPagedView view;
    view.setModel(&model);
    showView(view, QSize(1000, 900));
    // The mark before the first block has moved the last one down. It goes as the image is dropped on that
    // block, which moves up then, away from the mouse.
    PagedViewDrag drag(&view, galleryFile(QLatin1String(kImagePath)));
    QVERIFY(drag.enter(onPage(-10)));
    QCOMPARE(view.dropIndex(), 0);
    QCOMPARE(placesOf(view).last().y(), 40 + 62 + 40);
    QVERIFY(drag.drop(onPage(62 + 40 + 15)));
    QCOMPARE(model.nodeCount(), 3);
    QCOMPARE(notingCfg(model.node(2))->read().size(), 1);
    QCOMPARE(view.selectedNode(), model.node(2));
}

void KvReportPagedViewDragTest::aGalleryImageClosesOpenOptionsFirst()
{
    DragReport shown;
    KvReportNode *node = shown.report().addFake({100});
    shown.show();
    shown.view().selectNode(node);
    const KvBaseDisplayWidget *before = node->displayWidget();
    QVector<const KvBaseDisplayWidget *> alive;
    connect(&shown.view(), &KvReportPagedView::signalSelectionChanged, this,
            [&](KvBaseDisplayWidget *) { alive.append(node->displayWidget()); });
    // Straight onto the block: no mark has come and gone.
    QVERIFY(PagedViewDrag(&shown.view(), galleryFile(QLatin1String(kImagePath))).run(onPage(20)));
    // The panel is closed while the widget lives that it belongs to; then the new one is selected.
    QCOMPARE(alive.size(), 2);
    QCOMPARE(alive.first(), before);
    QCOMPARE(shown.said(), Said({const_cast<KvBaseDisplayWidget *>(before), nullptr, node->displayWidget()}));
}

void KvReportPagedViewDragTest::aGalleryImageShowsTheWaitCursor()
{
    FakeMeasurements measurements;
    KvBlockTypeList types;
    types.registerFactory(std::make_unique<NotingFactory>(QStringLiteral("Image View")));
    KvTemplateModel model(nullptr, measurements.kernelData());
    model.setFactories(&types);
    KvReportPagedView view;
    view.setModel(&model);
    showView(view, QSize(1000, 900));
    QVERIFY(PagedViewDrag(&view, galleryFile(QLatin1String(kImagePath))).run(onPage(200)));
    QCOMPARE(notingCfg(model.node(0))->cursors(), QVector<Qt::CursorShape>({Qt::WaitCursor}));
    QVERIFY(!QApplication::overrideCursor());
    QVERIFY(PagedViewDrag(&view, galleryFile(QLatin1String(kImagePath))).run(onPage(20)));
    QCOMPARE(notingCfg(model.node(0))->cursors(), QVector<Qt::CursorShape>({Qt::WaitCursor, Qt::WaitCursor}));
    QVERIFY(!QApplication::overrideCursor());
}

void KvReportPagedViewDragTest::ignoresFilesThatAreNoImages_data()
{
    QTest::addColumn<QString>("path");
    for (const char *path : {"/films/cell.mp4", "/notes.txt", "/no suffix", "/"})
        QTest::newRow(path) << QString::fromLatin1(path);
}

void KvReportPagedViewDragTest::ignoresFilesThatAreNoImages()
{
    QFETCH(QString, path);
    DragReport shown;
    shown.report().addFake({100});
    shown.show();
    for (const QPointF &point : {onPage(20), onPage(300)}) {
        PagedViewDrag drag(&shown.view(), galleryFile(path));
        QVERIFY(!drag.enter(point));
        QVERIFY(!shown.mark());
        // Dropped all the same, after another drag.
        PagedViewDrag(&shown.view(), newBlock(QStringLiteral("Fake"))).enter(onPage(300));
        QVERIFY(shown.mark());
        QVERIFY(!drag.drop(point));
        QVERIFY(!shown.mark());
    }
    QCOMPARE(shown.model()->nodeCount(), 1);
    QVERIFY(!shown.model()->isModified());
}

// ---- cost and corner cases ----

void KvReportPagedViewDragTest::dropsCostOneLayout_data()
{
    QTest::addColumn<QString>("kind");
    for (const char *kind : {"new", "moved", "own", "image between", "image over", "nothing"})
        QTest::newRow(kind) << QString::fromLatin1(kind);
}

void KvReportPagedViewDragTest::dropsCostOneLayout()
{
    QFETCH(QString, kind);
    DragReport shown;
    KvReportNode *watched = shown.report().addFake({100});
    shown.report().addFake({100});
    shown.model()->setHeaderEnabled(true);
    shown.show();
    const FakeBlockWidget *widget = FakeReport::fakeWidget(watched);
    int before = widget->pieceRequests();
    const auto rebuilds = [&]() {
        deliverQueuedCalls();
        const int all = widget->pieceRequests();
        return all - std::exchange(before, all);
    };
    if (kind == QLatin1String("own")) {
        int during = 0;
        shown.dragBlock(1, [&](QDrag *drag) {
            during = rebuilds();
            PagedViewDrag(&shown.view(), copyOf(drag->mimeData()), Qt::MoveAction).run(onPage(10));
            QCOMPARE(rebuilds(), 0);
        });
        QCOMPARE(during, 1);
        QCOMPARE(rebuilds(), 1);
        return;
    }
    QMimeData *data = kind == QLatin1String("new")       ? newBlock(QStringLiteral("Text Document"))
                      : kind == QLatin1String("moved")   ? movedBlock(1)
                      : kind == QLatin1String("nothing") ? withFormat("text/plain", "text")
                                                         : galleryFile(QLatin1String(kImagePath));
    const QPointF point = onPage(kind == QLatin1String("image over") ? 150 : 600);
    PagedViewDrag drag(&shown.view(), data);
    // A drop that was refused comes only after another drag.
    if (!drag.enter(point))
        PagedViewDrag(&shown.view(), newBlock(QStringLiteral("Fake"))).enter(point);
    drag.move(point);
    QCOMPARE(rebuilds(), 0);
    drag.drop(point);
    QCOMPARE(rebuilds(), 1);
}

void KvReportPagedViewDragTest::dropsOnAViewWithoutAModel()
{
    KvReportPagedView view;
    showView(view, QSize(600, 400));
    for (QMimeData *data :
         {newBlock(QStringLiteral("Fake")), movedBlock(0), galleryFile(QLatin1String(kImagePath))}) {
        PagedViewDrag drag(&view, data);
        drag.enterAt(QPoint(100, 100));
        QVERIFY(!drag.moveAt(QPoint(110, 100)));
        QVERIFY(!drag.dropAt(QPoint(110, 100)));
    }
    QCOMPARE(view.scene()->items().size(), 0);
    QCOMPARE(view.dropIndex(), -1);
}

void KvReportPagedViewDragTest::keepsTheScrollPosition()
{
    DragReport shown;
    shown.report().addFake({1300});
    shown.report().addFake({1300});
    shown.report().addFake({1300});
    shown.show(600);
    shown.view().verticalScrollBar()->setValue(1500);
    PagedViewDrag drag(&shown.view(), newBlock(QStringLiteral("Fake")));
    drag.enterAt(QPoint(400, 300));
    drag.dropAt(QPoint(400, 300));
    QCOMPARE(shown.model()->nodeCount(), 4);
    QCOMPARE(shown.view().verticalScrollBar()->value(), 1500);
}

STATREPORT_TEST_MAIN(KvReportPagedViewDragTest)
#include "KvReportPagedViewDragTest.moc"
