// SPDX-License-Identifier: MIT
#include "editor/KvEditorToolCombo.h"
#include "editor/KvEditorPaletteRow.h"
#include "support/BracketTranslator.h"
#include "support/StatReportTest.h"

#include <QLabel>

namespace {

KvEditorPaletteRow *headerOf(const KvEditorToolCombo &combo)
{
    return combo.findChild<KvEditorPaletteRow *>(QStringLiteral("header"));
}

QFrame *contentsOf(const KvEditorToolCombo &combo)
{
    return combo.findChild<QFrame *>(QStringLiteral("contentsFrame"));
}

} // namespace

class KvEditorToolComboTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void startsClosed();
    void headerTogglesIt_data();
    void headerTogglesIt();
    void arrowTellsTheState();
    void takesToolsOver();
    void tellsItsStateToReaders();
    void isTranslated();
};

void KvEditorToolComboTest::startsClosed()
{
    const KvEditorToolCombo combo(QStringLiteral("Statistics"), QStringLiteral("Icons/ToolIconStats.svg"));
    QCOMPARE(combo.title(), QStringLiteral("Statistics"));
    QVERIFY(!headerOf(combo)->icon().isNull());
    QVERIFY(!combo.isOpen());
    QVERIFY(contentsOf(combo)->isHidden());
}

void KvEditorToolComboTest::headerTogglesIt_data()
{
    QTest::addColumn<bool>("byMouse");
    QTest::newRow("click") << true;
    QTest::newRow("space") << false;
}

void KvEditorToolComboTest::headerTogglesIt()
{
    QFETCH(bool, byMouse);
    KvEditorToolCombo combo(QStringLiteral("Statistics"), QString());
    KvEditorPaletteRow *header = headerOf(combo);
    for (const bool isOpen : {true, false, true}) {
        if (byMouse)
            QTest::mouseClick(header, Qt::LeftButton);
        else
            QTest::keyClick(header, Qt::Key_Space);
        QCOMPARE(combo.isOpen(), isOpen);
        QCOMPARE(contentsOf(combo)->isHidden(), !isOpen);
    }
}

void KvEditorToolComboTest::arrowTellsTheState()
{
    KvEditorToolCombo combo(QStringLiteral("Statistics"), QString());
    const QLabel *arrow = headerOf(combo)->findChildren<QLabel *>().last();
    QCOMPARE(headerOf(combo)->markPath(), QStringLiteral("Icons/arrow-down"));
    QCOMPARE(arrow->pixmap(Qt::ReturnByValue).size(), QSize(11, 7) * combo.devicePixelRatioF());
    const QImage closed = arrow->pixmap(Qt::ReturnByValue).toImage();
    combo.setOpen(true);
    QCOMPARE(headerOf(combo)->markPath(), QStringLiteral("Icons/arrow-up"));
    QCOMPARE(arrow->pixmap(Qt::ReturnByValue).size(), QSize(11, 7) * combo.devicePixelRatioF());
    QVERIFY(arrow->pixmap(Qt::ReturnByValue).toImage() != closed);
}

void KvEditorToolComboTest::takesToolsOver()
{
    KvEditorToolCombo combo(QStringLiteral("Statistics"), QString());
    auto *first = new QLabel(QStringLiteral("first"));
    auto *second = new QLabel(QStringLiteral("second"));
    combo.addTool(first);
    combo.addTool(second);
    QCOMPARE(first->parentWidget(), contentsOf(combo));
    combo.setOpen(true);
    combo.show();
    QVERIFY(QTest::qWaitForWindowExposed(&combo));
    QVERIFY(first->isVisible());
    QVERIFY(first->y() < second->y());
}

void KvEditorToolComboTest::tellsItsStateToReaders()
{
    KvEditorToolCombo combo(QStringLiteral("Statistics"), QString());
    QCOMPARE(headerOf(combo)->accessibleName(), QStringLiteral("Statistics"));
    QCOMPARE(headerOf(combo)->accessibleDescription(), QStringLiteral("Group of blocks, closed"));
    QCOMPARE(headerOf(combo)->toolTip(), QStringLiteral("Open the group (Enter)"));
    combo.setOpen(true);
    QCOMPARE(headerOf(combo)->accessibleDescription(), QStringLiteral("Group of blocks, open"));
    QCOMPARE(headerOf(combo)->toolTip(), QStringLiteral("Close the group (Enter)"));
}

void KvEditorToolComboTest::isTranslated()
{
    KvEditorToolCombo combo(QStringLiteral("Statistics"), QString());
    const BracketTranslator translator(QStringLiteral("KvEditorToolCombo"));
    QTRY_COMPARE(headerOf(combo)->toolTip(), QStringLiteral("[Open the group (Enter)]"));
}

STATREPORT_TEST_MAIN(KvEditorToolComboTest)
#include "KvEditorToolComboTest.moc"
