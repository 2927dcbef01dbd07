// SPDX-License-Identifier: MIT
#include "KvDeskObjectsCommand.h"

#include "host/measuring/Polygon.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtMeasuringDocument.h"
#include "support/StatReportTest.h"

#include <QUndoStack>

class KvDeskObjectsCommandTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void goesBackAndForth();
    void bringsObjectsAndTakesThem();
    void stepsOfAGestureBecomeOne();
    void otherStepsStayApart_data();
    void otherStepsStayApart();
    void gestureBackToItsBeginningIsNoStep();

private:
    /// Moves a line to another place.
    void push(const KvDeskObjectId &line, double x, int gesture, const QString &text = QStringLiteral("move"))
    {
        const KvDeskObjectState before = KvDeskObjectState::of(line);
        KvDeskObjectState after = before;
        after.points = at(x);
        m_stack->push(new KvDeskObjectsCommand(text, {before}, {after}, gesture));
    }
    static QPolygonF at(double x) { return polygon({{x, 0}, {x + 10, 0}}); }
    static QPolygonF points(const KvDeskObjectId &object) { return KvDeskObjectState::of(object).points; }

    ZtMeasuringDocument m_document;
    std::unique_ptr<QUndoStack> m_stack;
    KvDeskObjectId m_line;
    KvDeskObjectId m_other;
};

void KvDeskObjectsCommandTest::init()
{
    StatReportTest::init();
    m_stack = std::make_unique<QUndoStack>();
    m_line = {ZtDrawnType::Line, m_document.addObject(ZtDrawnType::Line, at(0))};
    m_other = {ZtDrawnType::Line, m_document.addObject(ZtDrawnType::Line, at(0))};
}

void KvDeskObjectsCommandTest::cleanup()
{
    m_stack.reset();
    m_document.clear();
    StatReportTest::cleanup();
}

void KvDeskObjectsCommandTest::goesBackAndForth()
{
    push(m_line, 7, 0);
    QCOMPARE(points(m_line), at(7));
    QCOMPARE(m_stack->undoText(), QStringLiteral("move"));
    m_stack->undo();
    QCOMPARE(points(m_line), at(0));
    m_stack->redo();
    QCOMPARE(points(m_line), at(7));
    QCOMPARE(points(m_other), at(0));
}

void KvDeskObjectsCommandTest::bringsObjectsAndTakesThem()
{
    const QVector<KvDeskObjectState> before{KvDeskObjectState::of(m_line), KvDeskObjectState::of(m_other)};
    m_stack->push(
        new KvDeskObjectsCommand(QStringLiteral("deletion"), before,
                                 {KvDeskObjectState::missing(m_line), KvDeskObjectState::missing(m_other)}));
    QVERIFY(!ZtKernelData::getInstance()->objects().contains(ZtDrawnType::Line));
    m_stack->undo();
    // Under the ids that they had.
    QVERIFY(KvDeskObjectState::of(m_line) == before.at(0));
    QVERIFY(KvDeskObjectState::of(m_other) == before.at(1));
}

void KvDeskObjectsCommandTest::stepsOfAGestureBecomeOne()
{
    for (int x = 1; x <= 20; ++x)
        push(m_line, x, 5);
    QCOMPARE(m_stack->count(), 1);
    m_stack->undo();
    QCOMPARE(points(m_line), at(0));
    m_stack->redo();
    QCOMPARE(points(m_line), at(20));
}

void KvDeskObjectsCommandTest::otherStepsStayApart_data()
{
    QTest::addColumn<bool>("isSameObject");
    QTest::addColumn<int>("gesture");
    QTest::addColumn<QString>("text");
    QTest::newRow("of another gesture") << true << 6 << QStringLiteral("move");
    QTest::newRow("on another object") << false << 5 << QStringLiteral("move");
    QTest::newRow("of another kind") << true << 5 << QStringLiteral("change");
    QTest::newRow("of no gesture") << true << 0 << QStringLiteral("move");
}

void KvDeskObjectsCommandTest::otherStepsStayApart()
{
    QFETCH(bool, isSameObject);
    QFETCH(int, gesture);
    QFETCH(QString, text);
    push(m_line, 3, 5);
    push(isSameObject ? m_line : m_other, 9, gesture, text);
    QCOMPARE(m_stack->count(), 2);
    m_stack->undo();
    QCOMPARE(points(m_line), at(3));
    QCOMPARE(points(m_other), at(0));
}

void KvDeskObjectsCommandTest::gestureBackToItsBeginningIsNoStep()
{
    push(m_line, 3, 5);
    push(m_line, 0, 5);
    QCOMPARE(m_stack->count(), 0);
    QVERIFY(!m_stack->canUndo());
    QCOMPARE(points(m_line), at(0));
}

STATREPORT_TEST_MAIN(KvDeskObjectsCommandTest)
#include "KvDeskObjectsCommandTest.moc"
