// SPDX-License-Identifier: MIT
#include "KvDeskInlineEditor.h"

#include "DeskView.h"

class KvDeskInlineEditorTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void enterRenames();
    void escapeRenamesNothing();
    void goingElsewhereRenames();
    void emptyNameGivesTheStandardOneBack();
    void textsAreChangedInPlace();
    void emptyTextChangesNothing();
    void staysInsideTheView();
    void nothingToRename();

private:
    KvDeskInlineEditor *field() const { return m_desk->view.inlineEditor(); }

    std::unique_ptr<DeskView> m_desk;
    KvDeskObjectId m_line;
};

void KvDeskInlineEditorTest::init()
{
    StatReportTest::init();
    m_desk = std::make_unique<DeskView>();
    m_line = m_desk->line({50, 100}, {150, 100});
    QVERIFY(!field()->isVisible());
    m_desk->view.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&m_desk->view));
}

void KvDeskInlineEditorTest::cleanup()
{
    m_desk.reset();
    StatReportTest::cleanup();
}

void KvDeskInlineEditorTest::enterRenames()
{
    field()->rename(m_line);
    QVERIFY(field()->isVisible());
    QVERIFY(field()->hasFocus());
    QCOMPARE(field()->accessibleName(), QStringLiteral("Name"));
    QCOMPARE(field()->selectedText(), QStringLiteral("Line 1"));
    QTest::keyClicks(field(), QStringLiteral("Vlp"));
    QTest::keyClick(field(), Qt::Key_Return);
    QVERIFY(!field()->isVisible());
    QCOMPARE(m_desk->name(m_line), QStringLiteral("Vlp"));
    QCOMPARE(m_desk->steps(), 1);
    QVERIFY(m_desk->view.hasFocus());
}

void KvDeskInlineEditorTest::escapeRenamesNothing()
{
    field()->rename(m_line);
    QTest::keyClicks(field(), QStringLiteral("No"));
    QTest::keyClick(field(), Qt::Key_Escape);
    QVERIFY(!field()->isVisible());
    QCOMPARE(m_desk->name(m_line), QStringLiteral("Line 1"));
    QCOMPARE(m_desk->steps(), 0);
}

void KvDeskInlineEditorTest::goingElsewhereRenames()
{
    field()->rename(m_line);
    QTest::keyClicks(field(), QStringLiteral("Edge"));
    m_desk->view.setFocus();
    QVERIFY(!field()->isVisible());
    QCOMPARE(m_desk->name(m_line), QStringLiteral("Edge"));
    QCOMPARE(m_desk->steps(), 1);
}

void KvDeskInlineEditorTest::emptyNameGivesTheStandardOneBack()
{
    m_desk->editor.rename(m_line, QStringLiteral("Edge"));
    field()->rename(m_line);
    field()->clear();
    QTest::keyClick(field(), Qt::Key_Enter);
    QCOMPARE(m_desk->name(m_line), QStringLiteral("Line 1"));
}

void KvDeskInlineEditorTest::textsAreChangedInPlace()
{
    const KvDeskObjectId note =
        m_desk->editor.create(ZtDrawnType::TextNote, polygon({{80, 80}}), QString(), QStringLiteral("Old"));
    field()->edit(note);
    QCOMPARE(field()->text(), QStringLiteral("Old"));
    QTest::keyClicks(field(), QStringLiteral("New"));
    QTest::keyClick(field(), Qt::Key_Return);
    QCOMPARE(KvDeskObjectState::of(note).text, QStringLiteral("New"));
    m_desk->editor.slotUndo();
    QCOMPARE(KvDeskObjectState::of(note).text, QStringLiteral("Old"));
    // What has no text has a name.
    field()->edit(m_line);
    QCOMPARE(field()->text(), QStringLiteral("Line 1"));
}

void KvDeskInlineEditorTest::emptyTextChangesNothing()
{
    const KvDeskObjectId note =
        m_desk->editor.create(ZtDrawnType::TextNote, polygon({{80, 80}}), QString(), QStringLiteral("Old"));
    field()->edit(note);
    field()->clear();
    QTest::keyClick(field(), Qt::Key_Return);
    QCOMPARE(KvDeskObjectState::of(note).text, QStringLiteral("Old"));
}

void KvDeskInlineEditorTest::staysInsideTheView()
{
    m_desk->view.resize(320, 240);
    QCoreApplication::processEvents();
    for (const QPointF &place : {QPointF(0, 0), QPointF(399, 299), QPointF(399, 0)}) {
        field()->writeNote(place);
        QVERIFY(m_desk->view.viewport()->rect().contains(field()->geometry()));
        field()->slotCancel();
    }
}

void KvDeskInlineEditorTest::nothingToRename()
{
    field()->rename({ZtDrawnType::Line, 9});
    QVERIFY(!field()->isVisible());
    // Nothing is open that could be taken.
    field()->slotAccept();
    QCOMPARE(m_desk->steps(), 0);
}

STATREPORT_TEST_MAIN(KvDeskInlineEditorTest)
#include "KvDeskInlineEditorTest.moc"
