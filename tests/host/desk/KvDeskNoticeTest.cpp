// SPDX-License-Identifier: MIT
#include "KvDeskNotice.h"

#include "KvDeskResources.h"
#include "support/StatReportTest.h"

namespace {

/// Counts the clicks that reach it.
class Below : public QWidget
{
public:
    int clicks = 0;

protected:
    void mousePressEvent(QMouseEvent *event) override
    {
        event->accept();
        ++clicks;
    }
};

} // namespace

class KvDeskNoticeTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();

    void showsATextWithItsAction();
    void isHiddenByItsButton();
    void staysAtTheUpperEdge();
    void keepsClicksToItself();
};

void KvDeskNoticeTest::init()
{
    StatReportTest::init();
    KvDeskResources::ensure();
}

void KvDeskNoticeTest::showsATextWithItsAction()
{
    QWidget parent;
    QAction action(QStringLiteral("Do it"), nullptr);
    KvDeskNotice notice(&action, &parent);
    parent.show();
    QVERIFY(!notice.isVisible());
    notice.slotShow(QStringLiteral("Something can be done"));
    QVERIFY(notice.isVisible());
    QCOMPARE(notice.text(), QStringLiteral("Something can be done"));
    QCOMPARE(notice.accessibleName(), notice.text());
    QCOMPARE(notice.actionButton()->text(), QStringLiteral("Do it"));
    QSignalSpy triggered(&action, SIGNAL(triggered()));
    QTest::keyClick(notice.actionButton(), Qt::Key_Space);
    QCOMPARE(triggered.count(), 1);
    notice.slotHide();
    QVERIFY(!notice.isVisible());
}

void KvDeskNoticeTest::isHiddenByItsButton()
{
    QWidget parent;
    QAction action(QStringLiteral("Do it"), nullptr);
    KvDeskNotice notice(&action, &parent);
    parent.show();
    notice.slotShow(QStringLiteral("Text"));
    QCOMPARE(notice.closeButton()->toolTip(), QStringLiteral("Close this message"));
    QTest::mouseClick(notice.closeButton(), Qt::LeftButton);
    QVERIFY(!notice.isVisible());
}

void KvDeskNoticeTest::staysAtTheUpperEdge()
{
    QWidget parent;
    parent.resize(600, 400);
    QAction action(QStringLiteral("Do it"), nullptr);
    KvDeskNotice notice(&action, &parent);
    parent.show();
    notice.slotShow(QStringLiteral("Text"));
    QCOMPARE(notice.pos(), QPoint());
    QCOMPARE(notice.width(), 600);
    parent.resize(300, 400);
    QCOMPARE(notice.width(), 300);
    QVERIFY(notice.rect().contains(notice.closeButton()->geometry()));
}

void KvDeskNoticeTest::keepsClicksToItself()
{
    Below parent;
    parent.resize(600, 400);
    QAction action(QStringLiteral("Do it"), nullptr);
    KvDeskNotice notice(&action, &parent);
    parent.show();
    notice.slotShow(QStringLiteral("Text"));
    QTest::mouseClick(&notice, Qt::LeftButton, {}, QPoint(2, 2));
    QCOMPARE(parent.clicks, 0);
    QTest::mouseClick(&parent, Qt::LeftButton, {}, QPoint(300, 300));
    QCOMPARE(parent.clicks, 1);
}

STATREPORT_TEST_MAIN(KvDeskNoticeTest)
#include "KvDeskNoticeTest.moc"
