// SPDX-License-Identifier: MIT
#include "KvDeskPanel.h"

#include "KvDeskPanelHeader.h"
#include "KvDeskResources.h"
#include "support/StatReportTest.h"

namespace {

class TextPanel : public KvDeskPanel
{
public:
    TextPanel()
        : KvDeskPanel(QStringLiteral("Title"), QStringLiteral("Hide it"), nullptr)
    {
        setContent(new QTextEdit(this));
    }
};

} // namespace

class KvDeskPanelTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void contentFillsThePanelBelowTheHeader();
    void closing();
};

void KvDeskPanelTest::contentFillsThePanelBelowTheHeader()
{
    KvDeskResources::ensure();
    TextPanel panel;
    panel.resize(300, 200);
    panel.show();
    const QRect header = panel.header()->geometry();
    const QRect content = panel.findChild<QTextEdit *>()->geometry();
    QCOMPARE(header.topLeft(), QPoint(0, 0));
    QCOMPARE(content, QRect(0, header.height(), 300, 200 - header.height()));
}

void KvDeskPanelTest::closing()
{
    KvDeskResources::ensure();
    const TextPanel panel;
    QSignalSpy spy(&panel, SIGNAL(signalCloseClicked()));
    QCOMPARE(panel.header()->closeButton()->toolTip(), QStringLiteral("Hide it"));
    panel.header()->closeButton()->click();
    QCOMPARE(spy.count(), 1);
}

STATREPORT_TEST_MAIN(KvDeskPanelTest)
#include "KvDeskPanelTest.moc"
