// SPDX-License-Identifier: MIT
#include "PagedViewDrag.h"
#include "PagedViewTools.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "report/KvReportPage.h"
#include "support/FakeReport.h"
#include "support/StatReportTest.h"

#include <QDataStream>
#include <QDrag>
#include <QGraphicsScene>
#include <QHBoxLayout>
#include <QPointer>
#include <QPushButton>
#include <QRandomGenerator>

using namespace PagedViewTools;

namespace {

/** A view whose drags are driven by the test. */
class DrivenView : public KvReportPagedView
{
public:
    using Driver = std::function<void(const QMimeData *)>;
    void setDriver(const Driver &driver) { m_driver = driver; }

protected:
    void runDrag(QDrag *drag) override
    {
        const QPointer<QDrag> guard(drag);
        m_driver(drag->mimeData());
        delete guard;
    }

private:
    Driver m_driver;
};

/**
 * Uses a report in no sensible order: everything that a user, the template and the program around them can
 * do, picked by chance. The same seed does the same.
 */
class RandomUser
{
public:
    explicit RandomUser(quint32 seed)
        : m_random(seed)
    {
        open();
    }
    ~RandomUser()
    {
        qApp->setStyleSheet(QString());
        close();
    }
    Q_DISABLE_COPY(RandomUser)

    /** Does something; its name. */
    QString act()
    {
        const Act &act = acts().at(below(acts().size()));
        (this->*act.run)();
        if (below(3) == 0)
            m_view->grab();
        if (below(2) == 0)
            deliverQueuedCalls();
        return QString::fromLatin1(act.name);
    }

    /** What is wrong with the view; empty while all is well. */
    QString complaint() const
    {
        for (const QWidget *widget : QApplication::topLevelWidgets()) {
            const QGraphicsProxyWidget *item = widget->graphicsProxyWidget();
            if (item && item->scene() != m_view->scene())
                return QStringLiteral("a widget lives on outside of the scene");
        }
        for (const KvReportProxyWidgetItem *item : m_view->pieceItems()) {
            if (!m_report->model()->nodes().contains(item->node()))
                return QStringLiteral("an item shows a block that is gone");
        }
        const KvReportProxyWidgetItem *selected = m_view->selectedItem();
        if (selected && selected->belongsToBlock() &&
            std::count(m_view->pieceItems().begin(), m_view->pieceItems().end(), selected) != 1)
            return QStringLiteral("an item is selected that is not shown");
        if (m_view->dropIndex() != -1)
            return QStringLiteral("a mark is left over");
        return showsAllPieces(*m_view) || !m_view->isVisible() ? QString()
                                                               : QStringLiteral("a piece is not shown");
    }

private:
    struct Act
    {
        const char *name;
        void (RandomUser::*run)();
    };
    static const QVector<Act> &acts()
    {
        static const QVector<Act> acts{
            {"insert a block", &RandomUser::insertBlock},
            {"insert a block", &RandomUser::insertBlock},
            {"remove a block", &RandomUser::removeBlock},
            {"click", &RandomUser::click},
            {"click", &RandomUser::click},
            {"double click", &RandomUser::doubleClick},
            {"select", &RandomUser::select},
            {"close editors", &RandomUser::closeEditors},
            {"delete the selected", &RandomUser::deleteSelected},
            {"type", &RandomUser::type},
            {"type", &RandomUser::type},
            {"press tab", &RandomUser::pressTab},
            {"press tab", &RandomUser::pressTab},
            {"move the focus", &RandomUser::moveFocus},
            {"switch a section", &RandomUser::switchSection},
            {"switch a section", &RandomUser::switchSection},
            {"change pieces", &RandomUser::changePieces},
            {"resize", &RandomUser::resize},
            {"hide and show", &RandomUser::hideAndShow},
            {"change the style", &RandomUser::changeStyle},
            {"print", &RandomUser::print},
            {"start over", &RandomUser::startOver},
            {"drag a block", &RandomUser::dragBlock},
            {"drag from elsewhere", &RandomUser::dragFromElsewhere},
            {"close and open", &RandomUser::closeAndOpen},
        };
        return acts;
    }

    int below(int bound) { return static_cast<int>(m_random.bounded(bound)); }
    KvTemplateModel *model() { return m_report->model(); }
    KvReportNode *anyNode()
    {
        return model()->nodeCount() > 0 ? model()->node(below(model()->nodeCount())) : nullptr;
    }
    /** Now and then on a section's edge, mostly on a piece. */
    QPoint anyPoint()
    {
        const QList<KvReportProxyWidgetItem *> &items = m_view->pieceItems();
        if (below(4) == 0) {
            const KvReportPage *page = m_view->pages().at(below(m_view->pages().size()));
            m_view->ensureVisible(page->pageRect());
            const int y = below(2) == 0 ? page->contentRect().top() - 8 : page->contentRect().bottom() + 8;
            return m_view->mapFromScene(page->pageRect().left() + 100, y);
        }
        if (items.isEmpty() || below(4) == 0)
            return QPoint(below(m_view->viewport()->width()), below(m_view->viewport()->height()));
        const KvReportProxyWidgetItem *item = items.at(below(items.size()));
        const QPointF point = item->scenePos() + QPointF(item->size().width() * below(100) / 100,
                                                         item->size().height() * below(100) / 100);
        if (below(2) == 0)
            m_view->ensureVisible(QRectF(point, QSizeF(1, 1)));
        return m_view->mapFromScene(point);
    }
    QWidget *keyReceiver()
    {
        QWidget *focus = QApplication::focusWidget();
        return focus && below(4) > 0 ? focus : m_view->viewport();
    }

    void open()
    {
        m_report = std::make_unique<FakeReport>();
        m_report->setRowCount(30);
        m_window = std::make_unique<QWidget>();
        auto *layout = new QHBoxLayout(m_window.get());
        m_before = new QPushButton;
        m_view = new DrivenView;
        m_after = new QPushButton;
        for (QWidget *widget : {static_cast<QWidget *>(m_before), static_cast<QWidget *>(m_view),
                                static_cast<QWidget *>(m_after)})
            layout->addWidget(widget);
        m_view->setDriver([this](const QMimeData *data) { drive(data); });
        m_view->setModel(model());
        m_window->resize(1100, 800);
        m_window->show();
        m_window->activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
    }
    void close()
    {
        if (below(2) == 0)
            m_report.reset();
        m_window.reset();
        m_report.reset();
    }
    void closeAndOpen()
    {
        if (below(3) > 0)
            return;
        close();
        open();
    }

    void insertBlock()
    {
        if (model()->nodeCount() > 12)
            return;
        static const QStringList types{"Text Document", "Measurement table", "Statistics Table", "Counters",
                                       "Trend",         "Image View"};
        switch (below(3)) {
        case 0:
            model()->createNode(types.at(below(types.size())), below(6) - 1);
            break;
        case 1:
            m_report->addText(QStringLiteral("some words ").repeated(1 + below(100)));
            break;
        default:
            m_report->addFake({1 + below(500), 1 + below(1300), 1 + below(50)});
        }
    }
    void removeBlock()
    {
        if (KvReportNode *node = anyNode())
            model()->removeNode(node);
    }
    void click() { QTest::mouseClick(m_view->viewport(), Qt::LeftButton, {}, anyPoint()); }
    void doubleClick()
    {
        const QPoint point = anyPoint();
        QTest::mouseDClick(m_view->viewport(), Qt::LeftButton, {}, point);
        QTest::mouseRelease(m_view->viewport(), Qt::LeftButton, {}, point);
    }
    void select()
    {
        if (KvReportNode *node = anyNode())
            m_view->selectNode(node);
    }
    void closeEditors() { m_view->slotCloseAllEditors(); }
    void deleteSelected() { m_view->slotDeleteButtonClicked(); }
    void type()
    {
        switch (below(3)) {
        case 0:
            QTest::keyClick(keyReceiver(), Qt::Key_A, Qt::ControlModifier);
            QTest::keyClick(keyReceiver(), Qt::Key_Delete);
            break;
        case 1:
            QTest::keyClick(keyReceiver(), Qt::Key_Return);
            break;
        default:
            QTest::keyClicks(keyReceiver(), QStringLiteral("abc"));
        }
    }
    void pressTab()
    {
        if (below(2) == 0)
            QTest::keyClick(keyReceiver(), Qt::Key_Tab);
        else
            QTest::keyClick(keyReceiver(), Qt::Key_Backtab, Qt::ShiftModifier);
    }
    void moveFocus()
    {
        QWidget *const receiver = QVector<QWidget *>{m_before, m_view, m_after}.at(below(3));
        const Qt::FocusReason reason =
            QVector<Qt::FocusReason>{Qt::TabFocusReason, Qt::BacktabFocusReason, Qt::OtherFocusReason}.at(
                below(3));
        receiver->setFocus(reason);
    }
    void switchSection()
    {
        const bool isOn = below(2) == 0;
        switch (below(3)) {
        case 0:
            model()->setHeaderEnabled(isOn);
            break;
        case 1:
            model()->setFooterEnabled(isOn);
            break;
        default:
            model()->setPageNumberingEnabled(isOn);
        }
    }
    void changePieces()
    {
        KvReportNode *node = anyNode();
        if (!node || node->typeName() != QLatin1String("Fake"))
            return;
        FakeReport::fakeCfg(node)->setHeights(QVector<int>(below(4), 1 + below(900)));
        emit node->displayWidget()->displaySignals()->signalSubWidgetsChanged();
    }
    void resize() { m_window->resize(700 + below(600), 400 + below(500)); }
    void hideAndShow()
    {
        m_view->hide();
        deliverQueuedCalls();
        m_view->show();
    }
    void changeStyle()
    {
        static const QStringList styles{
            QString(), QStringLiteral("QPushButton { padding: 3px }"),
            QStringLiteral("QScrollBar { width: 30px } QWidget { font-size: 14px }")};
        qApp->setStyleSheet(styles.at(below(styles.size())));
    }
    void print()
    {
        QCOMPARE(model()->print(StatReportTest::temporaryPath(QStringLiteral("random.pdf"))), 1);
        if (below(2) == 0)
            click(); // while the pieces are away
        model()->notifyListChanged();
    }
    void startOver()
    {
        if (below(3) == 0)
            model()->newTemplate();
    }

    static QMimeData *withBytes(const char *format, const QString &key, const QVariant &value)
    {
        QByteArray bytes;
        QDataStream stream(&bytes, QIODevice::WriteOnly);
        stream << key;
        if (value.type() == QVariant::String)
            stream << value.toString();
        else
            stream << static_cast<qint32>(value.toInt());
        auto *data = new QMimeData;
        data->setData(QLatin1String(format), bytes);
        return data;
    }
    void drive(const QMimeData *data)
    {
        auto *copy = new QMimeData;
        for (const QString &format : data->formats())
            copy->setData(format, data->data(format));
        moveAbout(copy, true);
    }
    /** Ends with a drop, or beside the pages; in between the report may change. */
    void moveAbout(QMimeData *data, bool mayChange)
    {
        PagedViewDrag drag(m_view, data);
        drag.enterAt(anyPoint());
        for (int moves = below(5); moves > 0; --moves) {
            drag.moveAt(anyPoint());
            if (mayChange && below(3) == 0)
                (this->*QVector<void (RandomUser::*)()>{&RandomUser::insertBlock, &RandomUser::removeBlock,
                                                        &RandomUser::switchSection, &RandomUser::resize,
                                                        &RandomUser::changePieces}
                            .at(below(5)))();
            if (below(3) == 0)
                deliverQueuedCalls();
        }
        if (below(3) == 0)
            drag.leave();
        else
            drag.dropAt(anyPoint());
    }
    void dragBlock()
    {
        const QPoint point = anyPoint();
        const QPoint away(QApplication::startDragDistance() + 1, 0);
        QTest::mousePress(m_view->viewport(), Qt::LeftButton, {}, point);
        moveWithLeftButton(*m_view, point + away);
        QTest::mouseRelease(m_view->viewport(), Qt::LeftButton, {}, point + away);
    }
    void dragFromElsewhere()
    {
        if (model()->nodeCount() > 12)
            return;
        moveAbout(below(2) == 0 ? withBytes("application/x-KvEditorToolsListModeldatalist",
                                            QStringLiteral("nodeType"), QStringLiteral("Text Document"))
                                : withBytes("application/x-meeditorpreviewlistmodeldatalist",
                                            QStringLiteral("nodeIndex"), below(6)),
                  false);
    }

    QRandomGenerator m_random;
    std::unique_ptr<FakeReport> m_report;
    std::unique_ptr<QWidget> m_window;
    QPushButton *m_before = nullptr; ///< Tab stops around the view; the window's
    QPushButton *m_after = nullptr;
    DrivenView *m_view = nullptr; ///< the window's
};

} // namespace

class KvReportPagedViewRandomUseTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void survives_data();
    void survives();
};

void KvReportPagedViewRandomUseTest::survives_data()
{
    QTest::addColumn<quint32>("seed");
    // STATREPORT_RANDOM_SEEDS="1000 50" tries 50 seeds from 1000 on instead.
    const QStringList range = qEnvironmentVariable("STATREPORT_RANDOM_SEEDS").split(QLatin1Char(' '));
    const quint32 first = range.value(0).toUInt();
    const quint32 count = range.size() > 1 ? range.at(1).toUInt() : 12;
    for (quint32 seed = first; seed < first + count; ++seed)
        QTest::addRow("seed %u", seed) << seed;
}

void KvReportPagedViewRandomUseTest::survives()
{
    QFETCH(quint32, seed);
    RandomUser user(seed);
    for (int step = 0; step < 80; ++step) {
        const QString act = user.act();
        const QString complaint = user.complaint();
        QVERIFY2(complaint.isEmpty(),
                 qPrintable(QStringLiteral("step %1, %2: %3").arg(step).arg(act, complaint)));
    }
}

STATREPORT_TEST_MAIN(KvReportPagedViewRandomUseTest)
#include "KvReportPagedViewRandomUseTest.moc"
