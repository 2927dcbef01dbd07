// SPDX-License-Identifier: MIT
#include "PagedViewTools.h"
#include "blocks/textdocument/KvTextDocumentNodeWidget.h"
#include "report/KvPageSectionWidget.h"
#include "report/KvPrintProgress.h"
#include "report/KvReportPage.h"
#include "report/KvSelectionOverlay.h"
#include "support/FakeReport.h"
#include "support/MetaMethods.h"
#include "support/StatReportTest.h"

#include <QGraphicsScene>
#include <QHBoxLayout>
#include <QPushButton>
#include <QScopeGuard>
#include <QScrollBar>
#include <QSpinBox>
#include <QWheelEvent>

using namespace PagedViewTools;

namespace {

using Act = std::function<void(KvTemplateModel *)>;

const char kBigText[] = "<p style='font-size:40px'>Text</p>";

/** Shows the options of what is selected, as the templates editor does. */
class OptionsFrame : public QWidget
{
    Q_OBJECT
public:
    explicit OptionsFrame(KvReportPagedView *view)
    {
        connect(view, SIGNAL(signalSelectionChanged(KvBaseDisplayWidget*)), this,
                             SLOT(slotSelectionChanged(KvBaseDisplayWidget*)));
    }

    QWidget *panel() const { return findChild<QWidget *>(QString(), Qt::FindDirectChildrenOnly); }

public slots:
    void slotSelectionChanged(KvBaseDisplayWidget *aSelectedWidget)
    {
        qDeleteAll(findChildren<QWidget *>(QString(), Qt::FindDirectChildrenOnly));
        if (aSelectedWidget)
            aSelectedWidget->createOptionsWidget(this, true);
    }
};

/** A shown view of a report, with what it says of its selection. */
class ShownReport
{
public:
    ShownReport()
        : m_view(std::make_unique<KvReportPagedView>())
        , m_options(m_view.get())
    {
        QObject::connect(m_view.get(), &KvReportPagedView::signalSelectionChanged, m_view.get(),
                         [this](KvBaseDisplayWidget *widget) { m_said.append(widget); });
        m_view->setModel(m_report.model());
    }

    FakeReport &report() { return m_report; }
    KvTemplateModel *model() { return m_report.model(); }
    KvReportPagedView &view() { return *m_view; }
    OptionsFrame &options() { return m_options; }
    void deleteView() { m_view.reset(); }

    /** Gives the view the width at which pages have the default one. */
    void show(int height = 900)
    {
        m_view->resize(952 + 40 + m_view->verticalScrollBar()->sizeHint().width(), height);
        m_view->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_view.get()));
        m_view->activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(m_view.get()));
        deliverQueuedCalls();
        QCOMPARE(model()->pageWidth(), 952);
    }
    /** What signalSelectionChanged() told since the last call. */
    QVector<KvBaseDisplayWidget *> said() { return std::exchange(m_said, {}); }

    KvReportProxyWidgetItem *item(int index) const { return m_view->pieceItems().at(index); }
    QPoint middleOf(const KvReportProxyWidgetItem *item) const
    {
        return m_view->mapFromScene(item->scenePos() +
                                    QPointF(item->size().width() / 2, item->size().height() / 2));
    }
    void click(const QPoint &point) { QTest::mouseClick(m_view->viewport(), Qt::LeftButton, {}, point); }
    void click(const KvReportProxyWidgetItem *item) { click(middleOf(item)); }
    void clickScene(const QPointF &point) { click(m_view->mapFromScene(point)); }

    KvSelectionOverlay *overlay() const
    {
        for (QGraphicsItem *item : m_view->scene()->items()) {
            if (auto *overlay = dynamic_cast<KvSelectionOverlay *>(item))
                return overlay;
        }
        return nullptr;
    }

private:
    FakeReport m_report;
    QVector<KvBaseDisplayWidget *> m_said;
    std::unique_ptr<KvReportPagedView> m_view;
    OptionsFrame m_options;
};

using Said = QVector<KvBaseDisplayWidget *>;

KvTextDocumentNodeWidget *textOf(KvReportNode *node)
{
    return dynamic_cast<KvTextDocumentNodeWidget *>(node->displayWidget());
}

QRectF rectOf(const KvReportProxyWidgetItem *item)
{
    return QRectF(item->scenePos(), item->size());
}

/** How often the layout asked for a fake block's size since the last call. */
class SizeRequests
{
public:
    explicit SizeRequests(KvReportNode *node)
        : m_piece(FakeReport::fakeWidget(node)->piece(0))
    {
        taken();
    }
    int taken()
    {
        const int all = m_piece->sizeRequests();
        return all - std::exchange(m_before, all);
    }

private:
    FakePiece *m_piece;
    int m_before = 0;
};

} // namespace

Q_DECLARE_METATYPE(Act)

class KvReportPagedViewInteractionTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void declaresSignalsAndSlotsInOrder();
    void clicksSelect_data();
    void clicksSelect();
    void clicksOnNothingClearTheSelection_data();
    void clicksOnNothingClearTheSelection();
    void aSecondClickChangesNothing();
    void selectsTheSecondPieceOfABlock();
    void selectsSections_data();
    void selectsSections();
    void selectsWhatIsOnTop();
    void otherButtonsSelectNothing();
    void aReleaseElsewhereSelectsWhatIsThere();
    void marksTheSelection();
    void theMarkFollowsSizeChanges();
    void theDeleteButtonDeletes();
    void theDeleteButtonIsNotTheBlock();
    void deletesOnlyBlocks();
    void closingEditorsClearsTheSelection();
    void closingEditorsSaysNothingWithoutASelection();
    void rebuildsClearTheSelection_data();
    void rebuildsClearTheSelection();
    void deletingTheSelectedBlockClearsTheSelection();
    void deletingAnotherBlockClearsTheSelection();
    void selectsANodeAtOnce();
    void selectsANodeAfterTheRebuild();
    void forgetsTheNodeToSelect();
    void selectingFocusesTheItem();
    void focusItemChangesAreOnlyNoted();
    void focusGoesBackToThePages();
    void unselectedTextsTakeNoKeys();
    void tabLeavesThePages();
    void clicksPlaceTheTextCursor();
    void theMarginOfATextIsNotTheText();
    void doubleClicksSelectWords();
    void editsTheHeader();
    void clickingAwayCommitsTheText();
    void theWheelScrollsThePages_data();
    void theWheelScrollsThePages();
    void keystrokesCostOneLayout();
    void headerKeystrokesCostOneLayout();
    void optionsCostOneLayout();
    void optionsThatChangeThePiecesDropTheSelection();
    void aPageWithTheEditedHeaderMayGo();
    void anotherStyleDeletesNothingAtOnce_data();
    void anotherStyleDeletesNothingAtOnce();
    void rebuildsUnderAPressedButton();
    void aRebuildEndsTheFocusOfAnInactiveWindow();
    void aPressThatIsNeverReleased();
    void survivesTheModelWhileSelected_data();
    void survivesTheModelWhileSelected();
    void diesWhileSelected_data();
    void diesWhileSelected();
    void printingClosesTheSelection();
    void keepsItsHandsOffWhilePrinting();
    void clicksOnTextsThatArePrinted_data();
    void clicksOnTextsThatArePrinted();
    void hidingAndShowing();
    void contextMenusAreTheTextsOnly();
};

void KvReportPagedViewInteractionTest::declaresSignalsAndSlotsInOrder()
{
    const QMetaObject &metaObject = KvReportPagedView::staticMetaObject;
    QCOMPARE(ownMethods(metaObject, QMetaMethod::Signal),
             QStringList(QStringLiteral("signalSelectionChanged(KvBaseDisplayWidget*)")));
    QStringList slotsOfView;
    for (int i = metaObject.methodOffset(); i < metaObject.methodCount(); ++i) {
        const QMetaMethod method = metaObject.method(i);
        if (method.methodType() == QMetaMethod::Slot && method.access() == QMetaMethod::Public)
            slotsOfView.append(QString::fromLatin1(method.methodSignature()));
    }
    QCOMPARE(slotsOfView,
             QStringList(
                 {QStringLiteral("slotCloseAllEditors()"), QStringLiteral("slotWidgetsListChanged()"),
                  QStringLiteral("slotFocusItemChanged(QGraphicsItem*,QGraphicsItem*,Qt::FocusReason)"),
                  QStringLiteral("slotUpdateSceneWithSizes()"),
                  QStringLiteral("slotBeforeDeleteNode(KvReportNode*)"),
                  QStringLiteral("slotDeleteButtonClicked()"), QStringLiteral("slotFocusBackToPageView()")}));
    const int first = metaObject.indexOfSignal("signalSelectionChanged(KvBaseDisplayWidget*)");
    QCOMPARE(first, metaObject.methodOffset());
    QCOMPARE(metaObject.method(first).parameterNames(), QList<QByteArray>({"aSelectedWidget"}));
    for (int i = 0; i < slotsOfView.size(); ++i)
        QCOMPARE(metaObject.indexOfSlot(slotsOfView.at(i).toLatin1().constData()), first + 1 + i);
}

// ---- selecting ----

void KvReportPagedViewInteractionTest::clicksSelect_data()
{
    QTest::addColumn<QPointF>("offset");
    QTest::addColumn<int>("selected");
    // Blocks of 100 and 50, one pixel apart; -1 for none. Offsets are from the top left of the page's
    // content.
    QTest::newRow("first") << QPointF(400, 50) << 0;
    QTest::newRow("first's margin") << QPointF(3, 50) << 0;
    QTest::newRow("first's last row") << QPointF(400, 99) << 0;
    QTest::newRow("second") << QPointF(400, 125) << 1;
    QTest::newRow("second's first row") << QPointF(400, 101) << 1;
    QTest::newRow("page below") << QPointF(400, 300) << -1;
    QTest::newRow("above the content") << QPointF(400, -10) << -1;
    QTest::newRow("beside the page") << QPointF(-10, 50) << -1;
}

void KvReportPagedViewInteractionTest::clicksSelect()
{
    QFETCH(QPointF, offset);
    QFETCH(int, selected);
    ShownReport shown;
    shown.report().addFake({100});
    shown.report().addFake({50});
    shown.show();
    shown.clickScene(QPointF(20, 40) + offset);
    QCOMPARE(shown.view().selectedItem(), selected < 0 ? nullptr : shown.item(selected));
    KvReportNode *node = shown.model()->node(selected);
    QCOMPARE(shown.view().selectedNode(), node);
    QCOMPARE(shown.said(), selected < 0 ? Said() : Said({node->displayWidget()}));
    QCOMPARE(shown.overlay() != nullptr, selected >= 0);
}

void KvReportPagedViewInteractionTest::clicksOnNothingClearTheSelection_data()
{
    QTest::addColumn<QPointF>("point");
    QTest::newRow("page") << QPointF(400, 500);
    QTest::newRow("background") << QPointF(5, 60);
}

void KvReportPagedViewInteractionTest::clicksOnNothingClearTheSelection()
{
    QFETCH(QPointF, point);
    ShownReport shown;
    shown.report().addFake({100});
    shown.show();
    shown.click(shown.item(0));
    QVERIFY(shown.view().selectedItem());
    shown.said();
    shown.clickScene(point);
    QVERIFY(!shown.view().selectedItem());
    QVERIFY(!shown.overlay());
    QVERIFY(!shown.view().scene()->focusItem());
    QCOMPARE(shown.said(), Said({nullptr}));
    shown.clickScene(point);
    QCOMPARE(shown.said(), Said());
}

void KvReportPagedViewInteractionTest::aSecondClickChangesNothing()
{
    ShownReport shown;
    KvReportNode *first = shown.report().addFake({100});
    KvReportNode *second = shown.report().addFake({100});
    shown.show();
    shown.click(shown.item(0));
    const KvSelectionOverlay *overlay = shown.overlay();
    shown.click(shown.item(0));
    QCOMPARE(shown.said(), Said({first->displayWidget()}));
    QCOMPARE(shown.overlay(), overlay);
    // From one to the other at once, with no null in between.
    shown.click(shown.item(1));
    QCOMPARE(shown.said(), Said({second->displayWidget()}));
    QCOMPARE(shown.view().selectedNode(), second);
}

void KvReportPagedViewInteractionTest::selectsTheSecondPieceOfABlock()
{
    ShownReport shown;
    KvReportNode *node = shown.report().addFake({100, 150, 80});
    shown.show();
    shown.click(shown.item(1));
    QCOMPARE(shown.view().selectedItem(), shown.item(1));
    QCOMPARE(shown.view().selectedNode(), node);
    QCOMPARE(shown.said(), Said({node->displayWidget()}));
    QCOMPARE(shown.overlay()->childItems().first()->scenePos(), shown.item(1)->scenePos());
    // Another piece of the same block is another selection.
    shown.click(shown.item(0));
    QCOMPARE(shown.view().selectedItem(), shown.item(0));
    QCOMPARE(shown.said(), Said({node->displayWidget()}));
}

void KvReportPagedViewInteractionTest::selectsSections_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name : {"Header", "Footer", "Page count"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void KvReportPagedViewInteractionTest::selectsSections()
{
    QFETCH(QString, name);
    ShownReport shown;
    shown.model()->header()->setText(QLatin1String(kBigText));
    shown.model()->footer()->setText(QLatin1String(kBigText));
    shown.model()->setHeaderEnabled(true);
    shown.model()->setFooterEnabled(true);
    shown.model()->setPageNumberingEnabled(true);
    shown.report().addFake({100});
    shown.show(1450);
    const KvReportPage *page = shown.view().pages().first();
    QPointF point(971 - 42, 1365 - 32);
    if (name == QLatin1String("Header"))
        point = QPointF(300, page->contentRect().top() - 10);
    else if (name == QLatin1String("Footer"))
        point = QPointF(300, page->contentRect().bottom() + 10);
    shown.clickScene(point);
    const KvReportProxyWidgetItem *item = shown.view().selectedItem();
    QVERIFY(item);
    QCOMPARE(item->displayWidget()->displayName(), name);
    QVERIFY(!item->belongsToBlock());
    QVERIFY(!shown.view().selectedNode());
    QCOMPARE(shown.said(), Said({item->displayWidget()}));
    QVERIFY(shown.overlay());
    QVERIFY(shown.overlay()->deleteButtonRect().isNull());
    QCOMPARE(shown.overlay()->childItems().size(), 5);
    QCOMPARE(shown.overlay()->childItems().first()->scenePos(), item->scenePos());
}

void KvReportPagedViewInteractionTest::selectsWhatIsOnTop()
{
    ShownReport shown;
    shown.model()->header()->setText(QLatin1String(kBigText));
    shown.model()->setHeaderEnabled(true);
    shown.report().addFake({3000});
    shown.report().addFake({10});
    shown.show();
    shown.view().verticalScrollBar()->setValue(2700);
    // The piece overflows the second page and covers the third one's header.
    shown.clickScene(QPointF(300, shown.view().pages().last()->pageRect().top() + 30));
    QCOMPARE(shown.view().selectedItem(), shown.item(0));
}

void KvReportPagedViewInteractionTest::otherButtonsSelectNothing()
{
    ShownReport shown;
    shown.report().addFake({100});
    shown.show();
    for (const Qt::MouseButton button : {Qt::RightButton, Qt::MiddleButton}) {
        QTest::mouseClick(shown.view().viewport(), button, {}, shown.middleOf(shown.item(0)));
        QVERIFY(!shown.view().selectedItem());
    }
    shown.click(shown.item(0));
    QTest::mouseClick(shown.view().viewport(), Qt::RightButton, {}, shown.view().mapFromScene(300, 500));
    QVERIFY(shown.view().selectedItem());
    QCOMPARE(shown.said().size(), 1);
}

void KvReportPagedViewInteractionTest::aReleaseElsewhereSelectsWhatIsThere()
{
    ShownReport shown;
    shown.report().addFake({100});
    KvReportNode *second = shown.report().addFake({50});
    shown.show();
    // Not far enough for a drag, but over the edge.
    const QPoint press = shown.view().mapFromScene(400, 40 + 99);
    QTest::mousePress(shown.view().viewport(), Qt::LeftButton, {}, press);
    QTest::mouseRelease(shown.view().viewport(), Qt::LeftButton, {}, press + QPoint(0, 4));
    QCOMPARE(shown.view().selectedNode(), second);
}

// ---- the mark of the selection ----

void KvReportPagedViewInteractionTest::marksTheSelection()
{
    ShownReport shown;
    shown.report().addFake({100});
    shown.report().addFake({60});
    shown.show();
    shown.click(shown.item(1));
    const KvSelectionOverlay *overlay = shown.overlay();
    QVERIFY(overlay);
    auto *frame = qgraphicsitem_cast<QGraphicsRectItem *>(overlay->childItems().first());
    QVERIFY(frame);
    QCOMPARE(frame->mapRectToScene(frame->rect()), QRectF(20, 141, 952, 60));
    QCOMPARE(overlay->deleteButtonRect(), QRectF(20 + 952 - 32, 141 + 19, 22, 22));
    // Painted: the frame's line and the handles in the corners.
    const QImage image = shown.view().grab().toImage();
    const auto colorAt = [&](qreal x, qreal y) {
        return image.pixelColor(shown.view().mapFromScene(QPointF(x, y)));
    };
    const QColor accent(0x00, 0x65, 0x9d);
    for (const QPointF &corner : {QPointF(20, 141), QPointF(972, 141), QPointF(20, 201), QPointF(972, 201)})
        QCOMPARE(colorAt(corner.x() - 2, corner.y() - 1), accent);
    QVERIFY(colorAt(500, 141) != QColor(Qt::white));
    QCOMPARE(colorAt(500, 90), QColor(Qt::white));
    // Only one at a time.
    shown.click(shown.item(0));
    int overlays = 0;
    for (QGraphicsItem *item : shown.view().scene()->items())
        overlays += dynamic_cast<KvSelectionOverlay *>(item) ? 1 : 0;
    QCOMPARE(overlays, 1);
}

void KvReportPagedViewInteractionTest::theMarkFollowsSizeChanges()
{
    ShownReport shown;
    KvReportNode *first = shown.report().addFake({100});
    shown.report().addFake({60});
    shown.show();
    shown.click(shown.item(1));
    shown.said();
    FakeReport::fakeWidget(first)->piece(0)->setHeightHint(200);
    emit first->displayWidget()->displaySignals()->signalWidgetChanged();
    QCOMPARE(shown.said(), Said());
    QCOMPARE(shown.overlay()->childItems().first()->scenePos(), QPointF(20, 241));
    QCOMPARE(shown.overlay()->deleteButtonRect(), QRectF(940, 260, 22, 22));
}

void KvReportPagedViewInteractionTest::theDeleteButtonDeletes()
{
    ShownReport shown;
    shown.report().addFake({100});
    KvReportNode *second = shown.report().addFake({60});
    shown.report().addFake({30});
    shown.show();
    shown.click(shown.item(1));
    shown.said();
    const QPoint button = shown.view().mapFromScene(shown.overlay()->deleteButtonRect().center());
    QTest::mouseMove(shown.view().viewport(), button);
    QTest::mousePress(shown.view().viewport(), Qt::LeftButton, {}, button);
    QTest::mouseRelease(shown.view().viewport(), Qt::LeftButton, {}, button);
    // Queued: the button goes with the block.
    QCOMPARE(shown.model()->nodeCount(), 3);
    QCOMPARE(shown.view().selectedNode(), second);
    deliverQueuedCalls();
    QCOMPARE(shown.model()->nodeCount(), 2);
    QVERIFY(!shown.model()->nodes().contains(second));
    QCOMPARE(shown.said(), Said({nullptr}));
    QVERIFY(!shown.view().selectedItem());
    QVERIFY(!shown.overlay());
    QCOMPARE(placesOf(shown.view()), QVector<QPoint>({QPoint(20, 40), QPoint(20, 141)}));
    QCOMPARE(FakePiece::alive(), 2);
}

void KvReportPagedViewInteractionTest::theDeleteButtonIsNotTheBlock()
{
    ShownReport shown;
    shown.report().addFake({100});
    shown.show();
    shown.click(shown.item(0));
    const QPoint button = shown.view().mapFromScene(shown.overlay()->deleteButtonRect().center());
    // Pressed, and let go elsewhere: neither deleted nor dragged.
    QTest::mousePress(shown.view().viewport(), Qt::LeftButton, {}, button);
    moveWithLeftButton(shown.view(), button - QPoint(200, 0));
    QTest::mouseRelease(shown.view().viewport(), Qt::LeftButton, {}, button - QPoint(200, 0));
    deliverQueuedCalls();
    QCOMPARE(shown.model()->nodeCount(), 1);
    QCOMPARE(shown.view().selectedItem(), shown.item(0));
    QCOMPARE(shown.said().size(), 1);
}

void KvReportPagedViewInteractionTest::deletesOnlyBlocks()
{
    ShownReport shown;
    shown.model()->setHeaderEnabled(true);
    shown.report().addFake({100});
    shown.show();
    shown.view().slotDeleteButtonClicked();
    QCOMPARE(shown.model()->nodeCount(), 1);
    shown.clickScene(QPointF(300, 45));
    QVERIFY(shown.view().selectedItem());
    shown.view().slotDeleteButtonClicked();
    QCOMPARE(shown.model()->nodeCount(), 1);
    QVERIFY(shown.view().selectedItem());
    KvReportPagedView withoutModel;
    withoutModel.slotDeleteButtonClicked();
}

// ---- end of the selection ----

void KvReportPagedViewInteractionTest::closingEditorsClearsTheSelection()
{
    ShownReport shown;
    KvReportNode *text = shown.report().addText(QStringLiteral("text"));
    shown.show();
    shown.click(shown.item(0));
    QVERIFY(textOf(text)->isEditing());
    QVERIFY(shown.view().scene()->focusItem());
    shown.said();
    emit shown.model()->signalCloseAllEditors();
    QCOMPARE(shown.said(), Said({nullptr}));
    QVERIFY(!shown.view().selectedItem());
    QVERIFY(!shown.view().selectedNode());
    QVERIFY(!shown.view().scene()->focusItem());
    QVERIFY(!shown.view().isEditingText());
    QVERIFY(!shown.overlay());
    QVERIFY(!textOf(text)->isEditing());
}

void KvReportPagedViewInteractionTest::closingEditorsSaysNothingWithoutASelection()
{
    ShownReport shown;
    shown.report().addFake({100});
    shown.show();
    shown.view().slotCloseAllEditors();
    emit shown.model()->signalCloseAllEditors();
    QCOMPARE(shown.said(), Said());
}

void KvReportPagedViewInteractionTest::rebuildsClearTheSelection_data()
{
    QTest::addColumn<Act>("act");
    QTest::newRow("list") << Act([](KvTemplateModel *model) { model->notifyListChanged(); });
    QTest::newRow("header") << Act([](KvTemplateModel *model) { model->setHeaderEnabled(true); });
    QTest::newRow("footer") << Act([](KvTemplateModel *model) { model->setFooterEnabled(true); });
    QTest::newRow("page number") << Act([](KvTemplateModel *model) { model->setPageNumberingEnabled(true); });
    QTest::newRow("another block") << Act(
        [](KvTemplateModel *model) { model->createNode(QStringLiteral("Fake"), -1); });
    QTest::newRow("clear") << Act([](KvTemplateModel *model) { model->clearNodes(); });
    QTest::newRow("new") << Act([](KvTemplateModel *model) { model->newTemplate(); });
}

void KvReportPagedViewInteractionTest::rebuildsClearTheSelection()
{
    QFETCH(Act, act);
    ShownReport shown;
    shown.report().addFake({100});
    shown.show();
    shown.click(shown.item(0));
    shown.said();
    act(shown.model());
    QCOMPARE(shown.said(), Said({nullptr}));
    QVERIFY(!shown.view().selectedItem());
    QVERIFY(!shown.overlay());
    QVERIFY(!shown.view().scene()->focusItem());
}

void KvReportPagedViewInteractionTest::deletingTheSelectedBlockClearsTheSelection()
{
    ShownReport shown;
    KvReportNode *node = shown.report().addText(QStringLiteral("text"));
    shown.show();
    shown.click(shown.item(0));
    KvBaseDisplayWidget *widget = node->displayWidget();
    QCOMPARE(shown.said(), Said({widget}));
    // When it is told the block still lives.
    bool wasAlive = false;
    connect(&shown.view(), &KvReportPagedView::signalSelectionChanged, this,
            [&]() { wasAlive = shown.model()->nodes().contains(node) && node->displayWidget() == widget; });
    shown.model()->removeNode(node);
    QVERIFY(wasAlive);
    QCOMPARE(shown.said(), Said({nullptr}));
    QVERIFY(!shown.overlay());
    QVERIFY(!shown.options().panel());
}

void KvReportPagedViewInteractionTest::deletingAnotherBlockClearsTheSelection()
{
    ShownReport shown;
    shown.report().addFake({100});
    KvReportNode *other = shown.report().addFake({50});
    shown.show();
    shown.click(shown.item(0));
    shown.said();
    // The items go, the selection stays, until the list has changed.
    shown.view().slotBeforeDeleteNode(other);
    QCOMPARE(shown.view().pieceItems().size(), 1);
    QVERIFY(shown.view().selectedItem());
    QCOMPARE(shown.said(), Said());
    shown.model()->removeNode(other);
    QCOMPARE(shown.said(), Said({nullptr}));
}

void KvReportPagedViewInteractionTest::selectsANodeAtOnce()
{
    ShownReport shown;
    shown.report().addFake({100});
    KvReportNode *node = shown.report().addFake({50, 60});
    shown.show();
    shown.view().selectNode(node);
    QCOMPARE(shown.view().selectedItem(), shown.item(1));
    QCOMPARE(shown.said(), Said({node->displayWidget()}));
    QVERIFY(shown.overlay());
    // Not once more by the next rebuild.
    shown.model()->notifyListChanged();
    QVERIFY(!shown.view().selectedItem());
}

void KvReportPagedViewInteractionTest::selectsANodeAfterTheRebuild()
{
    ShownReport shown;
    KvReportNode *node = shown.report().addFake({});
    shown.report().addFake({1300, 1300});
    shown.show();
    shown.view().verticalScrollBar()->setValue(700);
    shown.view().selectNode(node);
    QVERIFY(!shown.view().selectedItem());
    QCOMPARE(shown.said(), Said());
    FakeReport::fakeCfg(node)->setHeights({10, 20});
    shown.model()->notifyListChanged();
    QCOMPARE(shown.view().selectedItem(), shown.item(0));
    QCOMPARE(shown.view().scene()->focusItem(), static_cast<QGraphicsItem *>(shown.item(0)));
    QCOMPARE(shown.said(), Said({node->displayWidget()}));
    QVERIFY(shown.overlay());
    QCOMPARE(shown.view().verticalScrollBar()->value(), 700);
    // The mark is gone.
    shown.model()->notifyListChanged();
    QCOMPARE(shown.said(), Said({nullptr}));
}

void KvReportPagedViewInteractionTest::forgetsTheNodeToSelect()
{
    ShownReport shown;
    KvReportNode *node = shown.report().addFake({});
    shown.show();
    shown.view().selectNode(node);
    shown.model()->removeNode(node);
    shown.report().addFake({10});
    QVERIFY(!shown.view().selectedItem());
    // A block without pieces cannot be selected, and does not wait for ever.
    KvReportNode *empty = shown.report().addFake({});
    shown.view().selectNode(empty);
    shown.model()->notifyListChanged();
    FakeReport::fakeCfg(empty)->setHeights({10});
    shown.model()->notifyListChanged();
    QCOMPARE(shown.said(), Said());
}

// ---- focus and texts ----

void KvReportPagedViewInteractionTest::selectingFocusesTheItem()
{
    ShownReport shown;
    QWidget other;
    other.show();
    shown.report().addFake({100});
    KvReportNode *text = shown.report().addText(QStringLiteral("text"));
    shown.show();
    shown.view().clearFocus();
    qRegisterMetaType<Qt::FocusReason>();
    const QSignalSpy focus(shown.view().scene(),
                           SIGNAL(focusItemChanged(QGraphicsItem*,QGraphicsItem*,Qt::FocusReason)));
    shown.view().selectNode(shown.model()->node(0));
    QCOMPARE(shown.view().scene()->focusItem(), static_cast<QGraphicsItem *>(shown.item(0)));
    QVERIFY(shown.view().hasFocus());
    QCOMPARE(focus.last().at(2).value<Qt::FocusReason>(), Qt::OtherFocusReason);
    QVERIFY(!shown.view().isEditingText());

    shown.view().selectNode(text);
    QCOMPARE(shown.view().scene()->focusItem(), static_cast<QGraphicsItem *>(shown.item(1)));
    QVERIFY(shown.view().isEditingText());
    QVERIFY(shown.view().hasFocus() || textOf(text)->hasFocus());
    QTest::keyClicks(shown.view().viewport(), QStringLiteral("a"));
    QCOMPARE(textOf(text)->toPlainText(), QStringLiteral("atext"));
}

void KvReportPagedViewInteractionTest::focusItemChangesAreOnlyNoted()
{
    ShownReport shown;
    KvReportNode *text = shown.report().addText(QStringLiteral("text"));
    shown.report().addFake({100});
    shown.show();
    shown.view().selectNode(text);
    shown.said();
    const KvSelectionOverlay *overlay = shown.overlay();
    QVERIFY(shown.view().isEditingText());
    shown.view().slotFocusItemChanged(shown.item(1), shown.item(0), Qt::MouseFocusReason);
    QCOMPARE(shown.view().selectedItem(), shown.item(0));
    QCOMPARE(shown.overlay(), overlay);
    QCOMPARE(shown.said(), Said());
    QVERIFY(!shown.view().isEditingText());
    shown.view().slotFocusItemChanged(shown.item(0), nullptr, Qt::MouseFocusReason);
    QVERIFY(shown.view().isEditingText());
}

void KvReportPagedViewInteractionTest::focusGoesBackToThePages()
{
    ShownReport shown;
    KvReportNode *node = shown.report().addFake({100});
    shown.show();
    shown.view().selectNode(node);
    shown.view().scene()->setFocusItem(nullptr);
    shown.view().clearFocus();
    shown.said();
    emit node->displayWidget()->displaySignals()->signalFocusBackToPageView();
    QCOMPARE(shown.view().scene()->focusItem(), static_cast<QGraphicsItem *>(shown.item(0)));
    QVERIFY(shown.view().hasFocus());
    QCOMPARE(shown.said(), Said());

    shown.view().slotCloseAllEditors();
    shown.view().clearFocus();
    shown.view().slotFocusBackToPageView();
    QVERIFY(shown.view().hasFocus());
    QVERIFY(!shown.view().scene()->focusItem());
}

void KvReportPagedViewInteractionTest::unselectedTextsTakeNoKeys()
{
    ShownReport shown;
    KvReportNode *first = shown.report().addText(QStringLiteral("first"));
    shown.report().addFake({50});
    KvReportNode *second = shown.report().addText(QStringLiteral("second"));
    shown.model()->header()->setText(QStringLiteral("header"));
    shown.model()->setHeaderEnabled(true);
    shown.show();
    const auto typeAway = [&shown]() {
        QWidget *receiver =
            QApplication::focusWidget() ? QApplication::focusWidget() : shown.view().viewport();
        QTest::keyClick(receiver, Qt::Key_X);
    };
    const auto isUntouched = [&]() {
        return textOf(first)->toPlainText() == QLatin1String("first") &&
               textOf(second)->toPlainText() == QLatin1String("second") &&
               shown.view().pages().first()->headerWidget()->toPlainText() == QLatin1String("header");
    };
    // Wherever Tab gets to.
    shown.view().setFocus(Qt::TabFocusReason);
    for (int i = 0; i < 6; ++i) {
        typeAway();
        QVERIFY(isUntouched());
        QTest::keyClick(shown.view().viewport(), Qt::Key_Tab);
    }
    // The text that was edited before the editors were closed while the keyboard was elsewhere.
    shown.view().selectNode(first);
    shown.view().clearFocus();
    emit shown.model()->signalCloseAllEditors();
    shown.view().setFocus(Qt::OtherFocusReason);
    typeAway();
    QVERIFY(isUntouched());
    shown.clickScene(QPointF(400, 700));
    typeAway();
    QVERIFY(isUntouched());
    QVERIFY(!shown.view().selectedItem());
}

void KvReportPagedViewInteractionTest::tabLeavesThePages()
{
    ShownReport shown;
    for (int i = 0; i < 20; ++i)
        shown.report().addFake({20});
    shown.report().addText(QStringLiteral("text"));
    shown.model()->setHeaderEnabled(true);
    shown.model()->setPageNumberingEnabled(true);
    QWidget window;
    QHBoxLayout layout(&window);
    QPushButton before;
    QPushButton after;
    layout.addWidget(&before);
    layout.addWidget(&shown.view());
    layout.addWidget(&after);
    const auto takeOut = qScopeGuard([&shown]() { shown.view().setParent(nullptr); });
    window.show();
    window.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&window));
    for (const bool selected : {false, true}) {
        if (selected)
            shown.view().selectNode(shown.model()->node(3));
        before.setFocus();
        QTest::keyClick(&before, Qt::Key_Tab);
        QVERIFY(shown.view().hasFocus());
        QTest::keyClick(&shown.view(), Qt::Key_Tab);
        QVERIFY(after.hasFocus());
        QTest::keyClick(&after, Qt::Key_Backtab);
        QVERIFY(shown.view().hasFocus());
        QTest::keyClick(&shown.view(), Qt::Key_Backtab);
        QVERIFY(before.hasFocus());
    }
}

void KvReportPagedViewInteractionTest::clicksPlaceTheTextCursor()
{
    ShownReport shown;
    KvReportNode *node = shown.report().addText(QStringLiteral("hello world"));
    shown.show();
    KvTextDocumentNodeWidget *text = textOf(node);
    QTextCursor cursor(text->document());
    cursor.setPosition(5);
    const QPoint behindHello = text->cursorRect(cursor).center();
    const QPointF origin = shown.item(0)->scenePos() + text->mapTo(shown.item(0)->widget(), QPoint(0, 0));
    // One click selects the block and places the cursor.
    shown.clickScene(origin + behindHello);
    QVERIFY(text->isEditing());
    QCOMPARE(text->textCursor().position(), 5);
    QTest::keyClicks(shown.view().viewport(), QStringLiteral(", my"));
    QCOMPARE(text->toPlainText(), QStringLiteral("hello, my world"));
    // The next one is the text's own.
    shown.clickScene(origin + QPointF(0, behindHello.y()));
    QCOMPARE(text->textCursor().position(), 0);
    QCOMPARE(shown.said().size(), 1);
    QTest::keyClick(shown.view().viewport(), Qt::Key_Delete);
    QCOMPARE(text->toPlainText(), QStringLiteral("ello, my world"));
    QCOMPARE(shown.model()->nodeCount(), 1);
}

void KvReportPagedViewInteractionTest::theMarginOfATextIsNotTheText()
{
    ShownReport shown;
    KvReportNode *node = shown.report().addText(QStringLiteral("hello world"));
    shown.show();
    const QPoint margin = shown.view().mapFromScene(shown.item(0)->scenePos() + QPointF(10, 5));
    shown.click(margin);
    QVERIFY(textOf(node)->isEditing());
    QVERIFY(shown.view().isEditingText());
    textOf(node)->moveCursor(QTextCursor::End);
    shown.click(margin);
    QCOMPARE(textOf(node)->textCursor().position(), 11);
    QVERIFY(shown.view().isEditingText());
    QCOMPARE(shown.said().size(), 1);
}

void KvReportPagedViewInteractionTest::doubleClicksSelectWords()
{
    ShownReport shown;
    KvReportNode *node = shown.report().addText(QStringLiteral("hello world"));
    shown.show();
    const KvTextDocumentNodeWidget *text = textOf(node);
    const QPointF origin = shown.item(0)->scenePos() + text->mapTo(shown.item(0)->widget(), QPoint(0, 0));
    const QPoint point = shown.view().mapFromScene(origin + QPointF(8, 8));
    shown.click(point);
    QTest::mouseDClick(shown.view().viewport(), Qt::LeftButton, {}, point);
    QCOMPARE(text->textCursor().selectedText(), QStringLiteral("hello"));
    // On anything else it is two clicks.
    shown.view().slotCloseAllEditors();
    shown.said();
    shown.report().addFake({100});
    const QPoint block = shown.middleOf(shown.item(1));
    QTest::mouseDClick(shown.view().viewport(), Qt::LeftButton, {}, block);
    QTest::mouseRelease(shown.view().viewport(), Qt::LeftButton, {}, block);
    QCOMPARE(shown.view().selectedItem(), shown.item(1));
    QCOMPARE(shown.said().size(), 1);
}

void KvReportPagedViewInteractionTest::editsTheHeader()
{
    ShownReport shown;
    shown.model()->header()->setText(QStringLiteral("head"));
    shown.model()->setHeaderEnabled(true);
    shown.report().addFake({1200, 1200});
    shown.show();
    KvPageSectionWidget *header = shown.view().pages().first()->headerWidget();
    shown.clickScene(QPointF(25, 48));
    QVERIFY(header->isEditing());
    QVERIFY(shown.view().isEditingText());
    QTest::keyClick(shown.view().viewport(), Qt::Key_Home);
    QTest::keyClicks(shown.view().viewport(), QStringLiteral("a"));
    QCOMPARE(header->toPlainText(), QStringLiteral("ahead"));
    QCOMPARE(shown.view().pages().last()->headerWidget()->toPlainText(), QStringLiteral("ahead"));
    QCOMPARE(shown.view().selectedItem()->widget(), header);
}

void KvReportPagedViewInteractionTest::clickingAwayCommitsTheText()
{
    ShownReport shown;
    KvReportNode *node = shown.report().addText(QStringLiteral("${CREATION_DATE_ISO}"));
    shown.report().addFake({100});
    shown.show();
    const QString date = QDate::currentDate().toString(Qt::ISODate);
    QCOMPARE(textOf(node)->toPlainText(), date);
    shown.click(shown.item(0));
    QCOMPARE(textOf(node)->toPlainText(), QStringLiteral("${CREATION_DATE_ISO}"));
    QTest::keyClick(shown.view().viewport(), Qt::Key_End);
    QTest::keyClicks(shown.view().viewport(), QStringLiteral("!"));
    shown.click(shown.item(1));
    QCOMPARE(textOf(node)->toPlainText(), date + QLatin1Char('!'));
    QVERIFY(static_cast<KvTextDocumentNodeCfg *>(node->config())
                ->text()
                .contains(QStringLiteral("${CREATION_DATE_ISO}!")));
}

void KvReportPagedViewInteractionTest::theWheelScrollsThePages_data()
{
    QTest::addColumn<bool>("selected");
    QTest::addColumn<Qt::KeyboardModifiers>("modifiers");
    for (const bool selected : {false, true}) {
        QTest::addRow("%s", selected ? "selected" : "not selected") << selected << Qt::KeyboardModifiers();
        QTest::addRow("%s, Ctrl", selected ? "selected" : "not selected")
            << selected << Qt::KeyboardModifiers(Qt::ControlModifier);
    }
}

void KvReportPagedViewInteractionTest::theWheelScrollsThePages()
{
    QFETCH(bool, selected);
    QFETCH(Qt::KeyboardModifiers, modifiers);
    ShownReport shown;
    KvReportNode *text = shown.report().addText(QStringLiteral("some words ").repeated(300));
    shown.report().setRowCount(50);
    shown.model()->beginLiveUpdates();
    shown.report().addTable();
    shown.report().addFake({1000});
    shown.show(500);
    deliverQueuedCalls();
    if (selected)
        shown.view().selectNode(text);
    const QFont font = textOf(text)->font();
    for (int i = 0; i < 2; ++i) {
        shown.view().verticalScrollBar()->setValue(rectOf(shown.item(i)).toRect().top() - 40);
        const int before = shown.view().verticalScrollBar()->value();
        const QPoint point(400, 80);
        QVERIFY(shown.view().items(point).contains(shown.item(i)));
        QWheelEvent event(point, shown.view().viewport()->mapToGlobal(point), QPoint(), QPoint(0, -120),
                          Qt::NoButton, modifiers, Qt::NoScrollPhase, false);
        QApplication::sendEvent(shown.view().viewport(), &event);
        QVERIFY(shown.view().verticalScrollBar()->value() > before);
    }
    QCOMPARE(textOf(text)->font(), font);
    shown.model()->endLiveUpdates();
}

// ---- the cost of an edit ----

void KvReportPagedViewInteractionTest::keystrokesCostOneLayout()
{
    ShownReport shown;
    KvReportNode *text = shown.report().addText(QStringLiteral("text"));
    KvReportNode *below = shown.report().addFake({100});
    shown.model()->setHeaderEnabled(true);
    shown.show();
    shown.view().selectNode(text);
    deliverQueuedCalls();
    SizeRequests requests(below);
    shown.view().slotUpdateSceneWithSizes();
    const int once = requests.taken();
    QVERIFY(once > 0);
    const int rebuilds = FakeReport::fakeWidget(below)->pieceRequests();
    // A line more moves what is below, once.
    const QPoint before = placesOf(shown.view()).last();
    QTest::keyClick(shown.view().viewport(), Qt::Key_Return);
    deliverQueuedCalls();
    QVERIFY(placesOf(shown.view()).last().y() > before.y());
    QCOMPARE(requests.taken(), once);
    // One that leaves the height alone costs nothing.
    QTest::keyClick(shown.view().viewport(), Qt::Key_X);
    deliverQueuedCalls();
    QCOMPARE(requests.taken(), 0);
    QCOMPARE(FakeReport::fakeWidget(below)->pieceRequests(), rebuilds);
    QCOMPARE(shown.view().selectedNode(), text);
}

void KvReportPagedViewInteractionTest::headerKeystrokesCostOneLayout()
{
    ShownReport shown;
    shown.model()->setHeaderEnabled(true);
    KvReportNode *block = shown.report().addFake({600, 600, 600, 600, 600});
    shown.show();
    QCOMPARE(shown.view().pages().size(), 3);
    shown.clickScene(QPointF(300, 45));
    QVERIFY(shown.view().isEditingText());
    deliverQueuedCalls();
    SizeRequests requests(block);
    shown.view().slotUpdateSceneWithSizes();
    const int once = requests.taken();
    const int rebuilds = FakeReport::fakeWidget(block)->pieceRequests();
    QTest::keyClick(shown.view().viewport(), Qt::Key_Return);
    deliverQueuedCalls();
    QCOMPARE(requests.taken(), once);
    QTest::keyClick(shown.view().viewport(), Qt::Key_X);
    deliverQueuedCalls();
    QCOMPARE(requests.taken(), 0);
    QCOMPARE(FakeReport::fakeWidget(block)->pieceRequests(), rebuilds);
    for (const KvReportPage *page : shown.view().pages())
        QCOMPARE(page->headerWidget()->toPlainText(), QStringLiteral("\nx"));
}

void KvReportPagedViewInteractionTest::optionsCostOneLayout()
{
    ShownReport shown;
    shown.report().setRowCount(3);
    shown.model()->beginLiveUpdates();
    KvReportNode *table = shown.report().addTable();
    KvReportNode *below = shown.report().addFake({100});
    shown.show();
    deliverQueuedCalls();
    shown.view().selectNode(table);
    deliverQueuedCalls();
    auto *width = shown.options().findChild<QSpinBox *>();
    QVERIFY(width);
    SizeRequests requests(below);
    shown.view().slotUpdateSceneWithSizes();
    const int once = requests.taken();
    const int rebuilds = FakeReport::fakeWidget(below)->pieceRequests();
    width->setValue(width->value() > 50 ? 40 : 60);
    deliverQueuedCalls();
    const int cost = requests.taken();
    QVERIFY2(cost == 0 || cost == once, qPrintable(QString::number(cost)));
    QCOMPARE(FakeReport::fakeWidget(below)->pieceRequests(), rebuilds);
    QCOMPARE(shown.view().selectedNode(), table);
    QVERIFY(shown.model()->isModified());
    shown.model()->endLiveUpdates();
}

void KvReportPagedViewInteractionTest::optionsThatChangeThePiecesDropTheSelection()
{
    ShownReport shown;
    KvReportNode *node = shown.report().addFake({100});
    shown.show();
    shown.click(shown.item(0));
    QVERIFY(shown.options().panel());
    shown.said();
    FakeReport::fakeCfg(node)->setHeights({100, 30});
    emit node->displayWidget()->displaySignals()->signalSubWidgetsChanged();
    QVERIFY(shown.view().selectedItem());
    deliverQueuedCalls();
    QCOMPARE(shown.said(), Said({nullptr}));
    QVERIFY(!shown.options().panel());
    QCOMPARE(shown.view().pieceItems().size(), 2);
}

// ---- trouble ----

void KvReportPagedViewInteractionTest::aPageWithTheEditedHeaderMayGo()
{
    ShownReport shown;
    shown.model()->header()->setText(QLatin1String(kBigText) + QLatin1String(kBigText));
    shown.model()->setHeaderEnabled(true);
    shown.report().addFake({1000, 230});
    shown.show();
    QCOMPARE(shown.view().pages().size(), 2);
    const QPointer<KvPageSectionWidget> header = shown.view().pages().last()->headerWidget();
    shown.view().verticalScrollBar()->setValue(1300);
    shown.clickScene(QPointF(300, shown.view().pages().last()->pageRect().top() + 30));
    QCOMPARE(shown.view().selectedItem()->widget(), header.data());
    shown.said();
    // The whole header is deleted with one key; then its page is needed no more.
    QTest::keyClick(shown.view().viewport(), Qt::Key_A, Qt::ControlModifier);
    QTest::keyClick(shown.view().viewport(), Qt::Key_Delete);
    QCOMPARE(shown.view().pages().size(), 1);
    // The header lives on while it handles the key.
    QVERIFY(header);
    QVERIFY(!shown.overlay() || !shown.overlay()->isVisible());
    deliverQueuedCalls();
    QVERIFY(!header);
    QCOMPARE(shown.said(), Said({nullptr}));
    QVERIFY(!shown.view().selectedItem());
    QVERIFY(!shown.overlay());
    QVERIFY(!shown.options().panel());
    QCOMPARE(shown.view().pages().first()->headerWidget()->toPlainText(), QString());
    QCOMPARE(shown.model()->header()->text(), QString());
    QVERIFY(!shown.view().grab().isNull());
}

void KvReportPagedViewInteractionTest::anotherStyleDeletesNothingAtOnce_data()
{
    survivesTheModelWhileSelected_data();
}

void KvReportPagedViewInteractionTest::anotherStyleDeletesNothingAtOnce()
{
    QFETCH(QPointF, point);
    ShownReport shown;
    shown.model()->header()->setText(QLatin1String(kBigText));
    shown.model()->setHeaderEnabled(true);
    shown.model()->setPageNumberingEnabled(true);
    shown.report().addText(QLatin1String(kBigText));
    shown.report().addFake({300});
    shown.show();
    shown.clickScene(point);
    shown.said();
    deliverQueuedCalls();
    // Qt goes through all widgets, in an order that changes from run to run: who deletes one that is yet to
    // come crashes now and then.
    int deaths = 0;
    const QWidgetList widgets = QApplication::allWidgets();
    for (const QWidget *widget : widgets)
        connect(widget, &QObject::destroyed, &shown.view(), [&deaths]() { ++deaths; });
    const auto restoreStyle = qScopeGuard([]() { qApp->setStyleSheet(QString()); });
    const int widthBefore = shown.view().viewport()->width();
    qApp->setStyleSheet(QStringLiteral("QScrollBar:vertical { width: 40px; }"));
    QCOMPARE(deaths, 0);
    QVERIFY(shown.view().viewport()->width() < widthBefore);
    // The pages follow, which ends the selection.
    deliverQueuedCalls();
    QVERIFY(deaths > 0);
    QCOMPARE(shown.model()->pageWidth(), shown.view().viewport()->width() - 40);
    QVERIFY(!shown.view().selectedItem());
    QVERIFY(!shown.options().panel());
    QVERIFY(showsAllPieces(shown.view()));
}

void KvReportPagedViewInteractionTest::aRebuildEndsTheFocusOfAnInactiveWindow()
{
    ShownReport shown;
    shown.report().addText(QStringLiteral("hello world"));
    shown.show();
    shown.click(shown.item(0));
    QCOMPARE(shown.view().scene()->focusItem(), shown.item(0));
    QWidget other;
    other.show();
    other.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&other));
    // As when records come in while the user measures in the main window.
    shown.model()->notifyListChanged();
    QVERIFY(!shown.view().selectedItem());
    shown.view().activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&shown.view()));
    shown.view().setFocus(Qt::OtherFocusReason);
    deliverQueuedCalls();
    // What is not selected gets no keys.
    QVERIFY(!shown.view().scene()->focusItem());
    QTest::keyClicks(shown.view().viewport(), QStringLiteral("x"));
    QCOMPARE(textOf(shown.model()->node(0))->toPlainText(), QStringLiteral("hello world"));
}

void KvReportPagedViewInteractionTest::rebuildsUnderAPressedButton()
{
    ShownReport shown;
    KvReportNode *first = shown.report().addFake({100});
    KvReportNode *text = shown.report().addText(QStringLiteral("hello world"));
    shown.show();
    // On a block: the click still counts, for what is there now.
    QTest::mousePress(shown.view().viewport(), Qt::LeftButton, {}, shown.middleOf(shown.item(0)));
    shown.model()->notifyListChanged();
    moveWithLeftButton(shown.view(), shown.middleOf(shown.item(0)) + QPoint(100, 0));
    QTest::mouseRelease(shown.view().viewport(), Qt::LeftButton, {}, shown.middleOf(shown.item(0)));
    QCOMPARE(shown.view().selectedNode(), first);
    // On a text that is edited.
    shown.view().selectNode(text);
    QTest::mousePress(shown.view().viewport(), Qt::LeftButton, {}, shown.middleOf(shown.item(1)));
    shown.model()->notifyListChanged();
    moveWithLeftButton(shown.view(), shown.middleOf(shown.item(1)) + QPoint(50, 0));
    QTest::mouseRelease(shown.view().viewport(), Qt::LeftButton, {}, shown.middleOf(shown.item(1)));
    QVERIFY(!shown.view().selectedItem());
    // On the delete button.
    shown.view().selectNode(first);
    const QPoint button = shown.view().mapFromScene(shown.overlay()->deleteButtonRect().center());
    QTest::mousePress(shown.view().viewport(), Qt::LeftButton, {}, button);
    shown.model()->notifyListChanged();
    QTest::mouseRelease(shown.view().viewport(), Qt::LeftButton, {}, button);
    deliverQueuedCalls();
    QCOMPARE(shown.model()->nodeCount(), 2);
    // On a block that goes.
    QTest::mousePress(shown.view().viewport(), Qt::LeftButton, {}, shown.middleOf(shown.item(0)));
    shown.model()->removeNode(first);
    moveWithLeftButton(shown.view(), QPoint(300, 300));
    QTest::mouseRelease(shown.view().viewport(), Qt::LeftButton, {}, QPoint(300, 300));
    QVERIFY(!shown.view().selectedItem());
    QCOMPARE(shown.model()->nodeCount(), 1);
}

void KvReportPagedViewInteractionTest::aPressThatIsNeverReleased()
{
    ShownReport shown;
    KvReportNode *node = shown.report().addFake({100});
    shown.show();
    const QPoint point = shown.middleOf(shown.item(0));
    QTest::mousePress(shown.view().viewport(), Qt::LeftButton, {}, point);
    // A message box popped up and got the release. Moves without a button drag nothing then.
    QMouseEvent move(QEvent::MouseMove, point + QPoint(100, 0), Qt::NoButton, Qt::NoButton, Qt::NoModifier);
    QApplication::sendEvent(shown.view().viewport(), &move);
    QVERIFY(!shown.view().findChild<QDrag *>());
    QMouseEvent release(QEvent::MouseButtonRelease, point, Qt::LeftButton, Qt::NoButton, Qt::NoModifier);
    QApplication::sendEvent(shown.view().viewport(), &release);
    QVERIFY(!shown.view().selectedItem());
    shown.click(shown.item(0));
    QCOMPARE(shown.view().selectedNode(), node);
}

void KvReportPagedViewInteractionTest::survivesTheModelWhileSelected_data()
{
    QTest::addColumn<QPointF>("point");
    QTest::newRow("nothing") << QPointF(400, 800);
    QTest::newRow("header") << QPointF(300, 48);
    QTest::newRow("text") << QPointF(300, 108);
    QTest::newRow("block") << QPointF(300, 300);
}

void KvReportPagedViewInteractionTest::survivesTheModelWhileSelected()
{
    QFETCH(QPointF, point);
    ShownReport shown;
    shown.model()->header()->setText(QLatin1String(kBigText));
    shown.model()->setHeaderEnabled(true);
    shown.report().addText(QLatin1String(kBigText));
    shown.report().addFake({300});
    shown.show();
    shown.clickScene(point);
    const bool isSelected = shown.view().selectedItem();
    QCOMPARE(isSelected, point.y() < 800);
    if (shown.view().isEditingText())
        QTest::keyClicks(shown.view().viewport(), QStringLiteral("x"));
    shown.said();
    shown.report().deleteModel();
    QCOMPARE(shown.said(), isSelected ? Said({nullptr}) : Said());
    QVERIFY(!shown.view().selectedItem());
    QVERIFY(!shown.view().selectedNode());
    QCOMPARE(shown.view().pages().size(), 0);
    QCOMPARE(shown.view().scene()->items().size(), 0);
    QVERIFY(!shown.options().panel());
    shown.clickScene(point);
    QTest::keyClicks(shown.view().viewport(), QStringLiteral("x"));
    shown.view().slotDeleteButtonClicked();
    shown.view().slotFocusBackToPageView();
    shown.view().slotCloseAllEditors();
    deliverQueuedCalls();
    QVERIFY(!shown.view().grab().isNull());
}

void KvReportPagedViewInteractionTest::diesWhileSelected_data()
{
    survivesTheModelWhileSelected_data();
}

void KvReportPagedViewInteractionTest::diesWhileSelected()
{
    QFETCH(QPointF, point);
    ShownReport shown;
    shown.model()->header()->setText(QLatin1String(kBigText));
    shown.model()->setHeaderEnabled(true);
    KvReportNode *text = shown.report().addText(QLatin1String(kBigText));
    KvReportNode *fake = shown.report().addFake({300});
    // Pieces that are let go tell of it; nobody must listen any more.
    class Teller : public QObject
    {
    public:
        explicit Teller(KvBaseDisplayWidget *widget)
            : m_widget(widget)
        {}
        bool eventFilter(QObject *, QEvent *event) override
        {
            if (event->type() == QEvent::ParentChange || event->type() == QEvent::Hide) {
                emit m_widget->displaySignals()->signalWidgetChanged();
                emit m_widget->displaySignals()->signalFocusBackToPageView();
            }
            return false;
        }

    private:
        KvBaseDisplayWidget *m_widget;
    };
    shown.show();
    shown.clickScene(point);
    shown.said();
    Teller fakeTeller(fake->displayWidget());
    FakeReport::fakeWidget(fake)->piece(0)->installEventFilter(&fakeTeller);
    Teller textTeller(text->displayWidget());
    textOf(text)->installEventFilter(&textTeller);
    shown.deleteView();
    QCOMPARE(shown.said(), Said());
    QCOMPARE(FakePiece::alive(), 1);
    QVERIFY(textOf(text));
}

void KvReportPagedViewInteractionTest::printingClosesTheSelection()
{
    ShownReport shown;
    KvReportNode *text = shown.report().addText(QStringLiteral("${CREATION_DATE_ISO}"));
    shown.report().addFake({100});
    shown.show();
    shown.click(shown.item(0));
    QVERIFY(textOf(text)->isEditing());
    shown.said();
    QCOMPARE(shown.model()->print(temporaryPath(QStringLiteral("selected.pdf"))), 1);
    QCOMPARE(shown.said(), Said({nullptr}));
    QVERIFY(!textOf(text)->isEditing());
    QVERIFY(!shown.view().selectedItem());
    shown.model()->notifyListChanged();
    QVERIFY(showsAllPieces(shown.view()));
    shown.click(shown.item(0));
    QCOMPARE(shown.view().selectedNode(), text);
}

void KvReportPagedViewInteractionTest::keepsItsHandsOffWhilePrinting()
{
    // Tries at each page what a program that goes on running does to the view.
    class Meddler : public KvPrintProgress
    {
    public:
        explicit Meddler(ShownReport *shown)
            : m_shown(shown)
        {}
        void pageWritten(int, int) override
        {
            const KvReportNode *node = m_shown->model()->node(0);
            emit m_shown->model()->node(0)->displayWidget()->displaySignals()->signalSubWidgetsChanged();
            emit m_shown->model()->node(0)->displayWidget()->displaySignals()->signalWidgetChanged();
            m_shown->view().slotWidgetsListChanged();
            m_shown->view().slotUpdateSceneWithSizes();
            QCoreApplication::processEvents();
            const QWidget *piece = m_shown->model()->node(0)->displayWidget()->subWidgetAt(0);
            m_tookPieces |= m_shown->item(0)->widget() == piece->parentWidget();
            m_isPrinting &= node->context()->isPrinting();
        }
        bool tookPieces() const { return m_tookPieces; }
        bool isPrintingAllTheTime() const { return m_isPrinting; }

    private:
        ShownReport *m_shown;
        bool m_tookPieces = false;
        bool m_isPrinting = true;
    };
    ShownReport shown;
    shown.report().addFake({1000, 1000, 1000});
    shown.show();
    const QList<KvReportProxyWidgetItem *> items = shown.view().pieceItems();
    Meddler meddler(&shown);
    QCOMPARE(shown.model()->print(temporaryPath(QStringLiteral("meddled.pdf")), &meddler), 1);
    QVERIFY(!meddler.tookPieces());
    QVERIFY(meddler.isPrintingAllTheTime());
    QVERIFY(!shown.model()->context()->isPrinting());
    QCOMPARE(shown.view().pieceItems(), items);
    shown.model()->notifyListChanged();
    QVERIFY(showsAllPieces(shown.view()));
}

void KvReportPagedViewInteractionTest::clicksOnTextsThatArePrinted_data()
{
    QTest::addColumn<bool>("during");
    QTest::newRow("during the print") << true;
    QTest::newRow("before the next layout") << false;
}

void KvReportPagedViewInteractionTest::clicksOnTextsThatArePrinted()
{
    QFETCH(bool, during);
    // Clicks once all texts are on the printer's pages, and types.
    class Clicker : public KvPrintProgress
    {
    public:
        explicit Clicker(ShownReport *shown)
            : m_shown(shown)
        {}
        void pageWritten(int done, int) override
        {
            if (done == 0)
                clickAndType(*m_shown);
        }
        static void clickAndType(ShownReport &shown)
        {
            for (int i = 0; i < 2; ++i)
                shown.click(shown.item(0));
            QTest::keyClicks(shown.view().viewport(), QStringLiteral("x"));
        }

    private:
        ShownReport *m_shown;
    };
    ShownReport shown;
    KvReportNode *node = shown.report().addText(QStringLiteral("text"));
    shown.show();
    Clicker clicker(&shown);
    QCOMPARE(shown.model()->print(temporaryPath(QStringLiteral("away.pdf")), during ? &clicker : nullptr), 1);
    if (!during)
        Clicker::clickAndType(shown);
    QCOMPARE(shown.view().selectedNode(), node);
    QVERIFY(!shown.view().isEditingText());
    QCOMPARE(textOf(node)->toPlainText(), QStringLiteral("text"));
    // The text comes back with the next layout.
    shown.model()->notifyListChanged();
    QVERIFY(showsAllPieces(shown.view()));
    shown.click(shown.item(0));
    QVERIFY(shown.view().isEditingText());
    QTest::keyClicks(shown.view().viewport(), QStringLiteral("x"));
    QVERIFY(textOf(node)->toPlainText().contains(QLatin1Char('x')));
}

void KvReportPagedViewInteractionTest::hidingAndShowing()
{
    ShownReport shown;
    KvReportNode *text = shown.report().addText(QStringLiteral("text"));
    shown.report().addFake({100});
    shown.show();
    shown.click(shown.item(0));
    shown.said();
    shown.view().hide();
    deliverQueuedCalls();
    QCOMPARE(shown.said(), Said());
    shown.view().show();
    QVERIFY(QTest::qWaitForWindowExposed(&shown.view()));
    deliverQueuedCalls();
    // Showing lays out anew, which ends the selection.
    QCOMPARE(shown.said(), Said({nullptr}));
    QVERIFY(!shown.view().selectedItem());
    QVERIFY(!textOf(text)->isEditing());
    QVERIFY(showsAllPieces(shown.view()));
    shown.click(shown.item(1));
    QCOMPARE(shown.view().selectedItem(), shown.item(1));
}

void KvReportPagedViewInteractionTest::contextMenusAreTheTextsOnly()
{
    ShownReport shown;
    shown.report().addFake({100});
    shown.show();
    shown.click(shown.item(0));
    class MenuCounter : public QObject
    {
    public:
        bool eventFilter(QObject *, QEvent *event) override
        {
            m_menus += event->type() == QEvent::ContextMenu ? 1 : 0;
            return false;
        }
        int menus() const { return m_menus; }

    private:
        int m_menus = 0;
    };
    MenuCounter counter;
    FakeReport::fakeWidget(shown.model()->node(0))->piece(0)->installEventFilter(&counter);
    const QPoint point = shown.middleOf(shown.item(0));
    QContextMenuEvent event(QContextMenuEvent::Mouse, point, shown.view().viewport()->mapToGlobal(point));
    QApplication::sendEvent(shown.view().viewport(), &event);
    QCOMPARE(counter.menus(), 0);
    QVERIFY(shown.view().selectedItem());
}

STATREPORT_TEST_MAIN(KvReportPagedViewInteractionTest)
#include "KvReportPagedViewInteractionTest.moc"
