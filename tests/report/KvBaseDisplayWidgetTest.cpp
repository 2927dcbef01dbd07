// SPDX-License-Identifier: MIT
#include "blocks/MetaMethods.h"
#include "report/KvBaseDisplayWidgetSignals.h"
#include "support/FakeBlock.h"
#include "support/StatReportTest.h"

#include <QLabel>

namespace {

class PlainDisplayWidget
    : public QLabel
    , public KvBaseDisplayWidget
{
public:
    QString displayName() const override { return QStringLiteral("plain"); }
    QWidget *subWidgetAt(int index) override { return index == 0 ? this : nullptr; }
    QWidget *createOptionsWidget(QWidget *, bool) override { return nullptr; }
};

} // namespace

class KvBaseDisplayWidgetTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void hasOnePiece();
    void ownsItsSignals();
    void declaresItsSignalsInOrder();
    void carriesTheConfiguration();
};

void KvBaseDisplayWidgetTest::hasOnePiece()
{
    PlainDisplayWidget widget;
    QCOMPARE(widget.subWidgetCount(), 1);
    QVERIFY(!qobject_cast<QObject *>(&widget)->inherits("KvBaseDisplayWidget"));
}

void KvBaseDisplayWidgetTest::ownsItsSignals()
{
    auto *widget = new PlainDisplayWidget;
    const QPointer<KvBaseDisplayWidgetSignals> displaySignals(widget->displaySignals());
    QVERIFY(displaySignals);
    QVERIFY(!displaySignals->parent());
    const QSignalSpy destroyed(displaySignals, SIGNAL(destroyed(QObject*)));
    // Deleted by its other base, as a parent widget would.
    delete static_cast<QWidget *>(widget);
    QVERIFY(displaySignals.isNull());
    QCOMPARE(destroyed.count(), 1);
}

void KvBaseDisplayWidgetTest::declaresItsSignalsInOrder()
{
    QCOMPARE(ownMethods(KvBaseDisplayWidgetSignals::staticMetaObject, QMetaMethod::Signal),
             QStringList({QStringLiteral("signalWidgetChanged()"),
                          QStringLiteral("signalWidgetConfigChanged(const KvBaseEditorNodeCfg*)"),
                          QStringLiteral("signalSubWidgetsChanged()"),
                          QStringLiteral("signalFocusBackToPageView()")}));
}

void KvBaseDisplayWidgetTest::carriesTheConfiguration()
{
    PlainDisplayWidget widget;
    const FakeBlockCfg cfg(nullptr);
    QSignalSpy spy(widget.displaySignals(), SIGNAL(signalWidgetConfigChanged(const KvBaseEditorNodeCfg*)));
    emit widget.displaySignals()->signalWidgetConfigChanged(&cfg);
    QCOMPARE(spy.count(), 1);
    const auto *argument = static_cast<const KvBaseEditorNodeCfg *const *>(spy.at(0).at(0).constData());
    QCOMPARE(QByteArray(spy.at(0).at(0).typeName()), QByteArray("const KvBaseEditorNodeCfg*"));
    QCOMPARE(*argument, &cfg);
}

STATREPORT_TEST_MAIN(KvBaseDisplayWidgetTest)
#include "KvBaseDisplayWidgetTest.moc"
