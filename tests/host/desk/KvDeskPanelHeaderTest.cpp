// SPDX-License-Identifier: MIT
#include "KvDeskPanelHeader.h"

#include "KvDeskResources.h"
#include "support/StatReportTest.h"

class KvDeskPanelHeaderTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void buttonsAreNamed();
    void closing();
    void note();
};

void KvDeskPanelHeaderTest::buttonsAreNamed()
{
    KvDeskResources::ensure();
    KvDeskPanelHeader header(QStringLiteral("Title"), QStringLiteral("Hide it"), nullptr);
    const QToolButton *const added =
        header.addButton(QStringLiteral("Icons/status-clear"), QStringLiteral("Clear it"));
    for (const QToolButton *const button : {added, static_cast<const QToolButton *>(header.closeButton())}) {
        QVERIFY(!button->icon().isNull());
        QCOMPARE(button->accessibleName(), button->toolTip());
        QVERIFY(!button->toolTip().isEmpty());
    }
    header.resize(400, header.sizeHint().height());
    header.show();
    QVERIFY(added->geometry().right() < header.closeButton()->geometry().left());
}

void KvDeskPanelHeaderTest::closing()
{
    const KvDeskPanelHeader header(QStringLiteral("Title"), QStringLiteral("Hide it"), nullptr);
    QSignalSpy spy(&header, SIGNAL(signalCloseClicked()));
    header.closeButton()->click();
    QCOMPARE(spy.count(), 1);
}

void KvDeskPanelHeaderTest::note()
{
    KvDeskPanelHeader header(QStringLiteral("Title"), QStringLiteral("Hide it"), nullptr);
    QCOMPARE(header.note(), QString());
    header.setNote(QStringLiteral("65"));
    QCOMPARE(header.note(), QStringLiteral("65"));
}

STATREPORT_TEST_MAIN(KvDeskPanelHeaderTest)
#include "KvDeskPanelHeaderTest.moc"
