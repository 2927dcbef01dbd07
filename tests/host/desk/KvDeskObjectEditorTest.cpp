// SPDX-License-Identifier: MIT
#include "KvDeskObjectEditor.h"

#include "DeskFiles.h"
#include "KvDeskObjectState.h"
#include "KvDeskSelection.h"
#include "KvDeskSession.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtKernelData.h"
#include "kernel/ZtSignalCenter.h"
#include "measuring/ZtCalibration.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QClipboard>
#include <QMimeData>
#include <QUndoStack>

#include <functional>

namespace {

const QPolygonF diagonal = polygon({{0, 0}, {10, 10}});
const KvDeskObjectId line1{ZtDrawnType::Line, 1};
const KvDeskObjectId line2{ZtDrawnType::Line, 2};
const KvDeskObjectId counter1{ZtDrawnType::Counter, 1};

using Objects = QVector<KvDeskObjectState>;
using Operation = std::function<void(KvDeskObjectEditor *)>;

} // namespace

Q_DECLARE_METATYPE(Operation)

class KvDeskObjectEditorTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void everyOperationIsOneStep_data();
    void everyOperationIsOneStep();
    void whatCannotBeDoneIsNoStep_data();
    void whatCannotBeDoneIsNoStep();
    void idsStayOverUndoAndRedo();
    void createdObjectIsSelected();
    void movesMergeUntilTheGestureEnds();
    void movesOfOthersDoNotMerge();
    void movesAfterUndoDoNotMerge();
    void moveBackIsNoStep();
    void placesOfCounters();
    void undoSelectsWhatItChanged();
    void deletionIsAnnouncedOnce();
    void pastesFurtherEachTime();
    void pastesNothingDamaged();
    void objectsOfTablesCanBeRemoved();
    void historyEndsWithTheSession();
    void otherChangesEndTheHistory();
    void undoneChangesLeaveTheSessionUnmodified();
    void otherChangesKeepTheSessionModified();
    void historyIsLimited();

private:
    Objects all() const;

    std::unique_ptr<ZtMeasuringDocument> m_document;
    std::unique_ptr<KvDeskSession> m_session;
    std::unique_ptr<KvDeskSelection> m_selection;
    std::unique_ptr<KvDeskObjectEditor> m_editor;
};

/// Two lines, a counter of two places, a text note.
void KvDeskObjectEditorTest::init()
{
    StatReportTest::init();
    m_document = std::make_unique<ZtMeasuringDocument>();
    m_document->addObject(ZtDrawnType::Line, diagonal);
    m_document->addObject(ZtDrawnType::Line, polygon({{5, 5}, {50, 5}}), QStringLiteral("Edge"));
    m_document->addObject(ZtDrawnType::Counter, polygon({{1, 1}, {2, 2}}));
    m_document->addObject(ZtDrawnType::TextNote, polygon({{3, 3}}), QString(), QStringLiteral("Note"));
    m_session = std::make_unique<KvDeskSession>(m_document.get());
    m_selection = std::make_unique<KvDeskSelection>();
    m_editor = std::make_unique<KvDeskObjectEditor>(m_session.get(), m_selection.get());
}

void KvDeskObjectEditorTest::cleanup()
{
    m_editor.reset();
    m_selection.reset();
    m_session.reset();
    m_document.reset();
    StatReportTest::cleanup();
}

Objects KvDeskObjectEditorTest::all() const
{
    Objects states;
    const QMap<int, ZtObjectMap> objects = ZtKernelData::getInstance()->objects();
    for (auto type = objects.constBegin(); type != objects.constEnd(); ++type) {
        for (auto it = type->constBegin(); it != type->constEnd(); ++it)
            states.append(KvDeskObjectState::of({type.key(), it.key()}));
    }
    return states;
}

void KvDeskObjectEditorTest::everyOperationIsOneStep_data()
{
    QTest::addColumn<Operation>("operation");
    QTest::addColumn<QString>("text");
    const auto row = [](const char *text, const Operation &operation) {
        QTest::newRow(text) << operation << QString::fromLatin1(text);
    };
    using E = KvDeskObjectEditor;
    row("drawing of Line 3", [](E *e) { e->create(ZtDrawnType::Line, diagonal); });
    row("drawing of Rim", [](E *e) { e->create(ZtDrawnType::Circle, diagonal, QStringLiteral(" Rim ")); });
    row("drawing of Text note 2", [](E *e) {
        e->create(ZtDrawnType::TextNote, polygon({{1, 1}}), QString(), QStringLiteral("Here"));
    });
    row("change of Line 1", [](E *e) { e->setPoints(line1, polygon({{1, 2}, {3, 4}})); });
    row("move of Edge", [](E *e) { e->moveBy({line2}, QPointF(3, 4)); });
    row("move of 2 objects", [](E *e) { e->moveBy({line1, line2}, QPointF(3, 4)); });
    row("renaming of Line 1", [](E *e) { e->rename(line1, QStringLiteral("Bolt & nut")); });
    row("renaming of Edge", [](E *e) { e->rename(line2, QString()); });
    row("text of Text note 1", [](E *e) {
        e->setText({ZtDrawnType::TextNote, 1}, QStringLiteral("Another"));
    });
    row("hiding of Length of Line 1", [](E *e) { e->setValueShown(line1, 0, false); });
    row("deletion of Line 1", [](E *e) { e->remove({line1}); });
    row("deletion of 3 objects", [](E *e) { e->remove({line1, line2, counter1}); });
    row("place of Counter 1", [](E *e) { e->addPlace(counter1, QPointF(9, 9)); });
    row("deletion of a place of Counter 1", [](E *e) { e->removePlace(counter1, 0); });
    row("pasting of Line 3", [](E *e) {
        e->copy({line1});
        e->paste();
    });
    row("pasting of 2 objects", [](E *e) {
        e->copy({line1, counter1});
        e->paste();
    });
}

void KvDeskObjectEditorTest::everyOperationIsOneStep()
{
    QFETCH(Operation, operation);
    QFETCH(QString, text);
    const Objects before = all();
    operation(m_editor.get());
    const Objects after = all();
    QVERIFY(before != after);
    QCOMPARE(m_editor->undoStack()->count(), 1);
    QCOMPARE(m_editor->undoStack()->undoText(), text);
    for (int i = 0; i < 2; ++i) {
        m_editor->slotUndo();
        QVERIFY(all() == before);
        QVERIFY(!m_editor->undoStack()->canUndo());
        m_editor->slotRedo();
        QVERIFY(all() == after);
    }
}

void KvDeskObjectEditorTest::whatCannotBeDoneIsNoStep_data()
{
    QTest::addColumn<Operation>("operation");
    const auto row = [](const char *name, const Operation &operation) { QTest::newRow(name) << operation; };
    using E = KvDeskObjectEditor;
    const KvDeskObjectId none{ZtDrawnType::Line, 77};
    row("too few points", [](E *e) { QVERIFY(e->create(ZtDrawnType::Line, polygon({{0, 0}})).isNull()); });
    row("unknown type", [](E *e) { QVERIFY(e->create(1, diagonal).isNull()); });
    row("points that the type refuses", [](E *e) { e->setPoints(line1, polygon({{0, 0}})); });
    row("points as they are", [](E *e) { e->setPoints(line1, diagonal); });
    row("points of nothing", [none](E *e) { e->setPoints(none, diagonal); });
    row("move of nothing", [none](E *e) { e->moveBy({none}, QPointF(1, 1)); });
    row("move by nothing", [](E *e) { e->moveBy({line1}, QPointF()); });
    row("move out of all pictures", [](E *e) { e->moveBy({line1}, QPointF(2e9, 0)); });
    row("name as it is", [](E *e) { e->rename(line2, QStringLiteral("Edge")); });
    row("the name that it has by itself", [](E *e) { e->rename(line1, QStringLiteral("Line 1")); });
    row("name of nothing", [none](E *e) { e->rename(none, QStringLiteral("x")); });
    row("text of nothing", [none](E *e) { e->setText(none, QStringLiteral("x")); });
    row("value that is shown", [](E *e) { e->setValueShown(line1, 0, true); });
    row("no such value", [](E *e) { e->setValueShown(line1, 1, false); });
    row("deletion of nothing", [none](E *e) { e->remove({none}); });
    row("place of a line", [](E *e) { e->addPlace(line1, QPointF(1, 1)); });
    row("no such place", [](E *e) { e->removePlace(counter1, 2); });
}

void KvDeskObjectEditorTest::whatCannotBeDoneIsNoStep()
{
    QFETCH(Operation, operation);
    const Objects before = all();
    operation(m_editor.get());
    QVERIFY(all() == before);
    QCOMPARE(m_editor->undoStack()->count(), 0);
}

void KvDeskObjectEditorTest::idsStayOverUndoAndRedo()
{
    const KvDeskObjectId created = m_editor->create(ZtDrawnType::Line, diagonal);
    QCOMPARE(created, (KvDeskObjectId{ZtDrawnType::Line, 3}));
    m_editor->rename(created, QStringLiteral("Third"));
    m_editor->remove({line2});
    for (int i = 0; i < 3; ++i)
        m_editor->slotUndo();
    QVERIFY(!KvDeskObjectState::of(created).exists);
    QCOMPARE(KvDeskObjectEditor::describe({line2}), QStringLiteral("Edge"));
    for (int i = 0; i < 3; ++i)
        m_editor->slotRedo();
    QCOMPARE(KvDeskObjectEditor::describe({created}), QStringLiteral("Third"));
    QVERIFY(!KvDeskObjectState::of(line2).exists);
}

void KvDeskObjectEditorTest::createdObjectIsSelected()
{
    const KvDeskObjectId created = m_editor->create(ZtDrawnType::Line, diagonal);
    QCOMPARE(m_selection->objects(), QSet<KvDeskObjectId>{created});
}

void KvDeskObjectEditorTest::movesMergeUntilTheGestureEnds()
{
    for (int i = 0; i < 5; ++i)
        m_editor->moveBy({line1}, QPointF(1, 0));
    QCOMPARE(m_editor->undoStack()->count(), 1);
    m_editor->slotFinishGesture();
    m_editor->moveBy({line1}, QPointF(1, 0));
    QCOMPARE(m_editor->undoStack()->count(), 2);
    QCOMPARE(KvDeskObjectState::of(line1).points, diagonal.translated(6, 0));
    m_editor->slotUndo();
    QCOMPARE(KvDeskObjectState::of(line1).points, diagonal.translated(5, 0));
    m_editor->slotUndo();
    QCOMPARE(KvDeskObjectState::of(line1).points, diagonal);
}

void KvDeskObjectEditorTest::movesOfOthersDoNotMerge()
{
    m_editor->moveBy({line1}, QPointF(1, 0));
    m_editor->moveBy({line1, line2}, QPointF(1, 0));
    m_editor->setPoints(line1, polygon({{0, 0}, {1, 1}}));
    QCOMPARE(m_editor->undoStack()->count(), 3);
    m_selection->select(line1);
    m_editor->setPoints(line1, polygon({{0, 0}, {2, 2}}));
    QCOMPARE(m_editor->undoStack()->count(), 4);
}

void KvDeskObjectEditorTest::movesAfterUndoDoNotMerge()
{
    m_editor->moveBy({line1}, QPointF(1, 0));
    m_editor->moveBy({line2}, QPointF(1, 0));
    m_editor->slotUndo();
    m_editor->moveBy({line1}, QPointF(1, 0));
    QCOMPARE(m_editor->undoStack()->count(), 2);
}

void KvDeskObjectEditorTest::moveBackIsNoStep()
{
    m_editor->moveBy({line1}, QPointF(1, 0));
    m_editor->moveBy({line1}, QPointF(-1, 0));
    QCOMPARE(m_editor->undoStack()->count(), 0);
}

void KvDeskObjectEditorTest::placesOfCounters()
{
    m_editor->addPlace(counter1, QPointF(3, 3));
    m_editor->removePlace(counter1, 1);
    QCOMPARE(KvDeskObjectState::of(counter1).points, polygon({{1, 1}, {3, 3}}));
    m_editor->slotUndo();
    QCOMPARE(KvDeskObjectState::of(counter1).points, polygon({{1, 1}, {2, 2}, {3, 3}}));
    m_editor->slotUndo();
    QCOMPARE(KvDeskObjectState::of(counter1).points, polygon({{1, 1}, {2, 2}}));
}

void KvDeskObjectEditorTest::undoSelectsWhatItChanged()
{
    m_editor->moveBy({line1}, QPointF(1, 0));
    m_editor->remove({line2});
    m_selection->select(counter1);
    m_editor->slotUndo();
    QCOMPARE(m_selection->objects(), QSet<KvDeskObjectId>{line2});
    m_editor->slotUndo();
    QCOMPARE(m_selection->objects(), QSet<KvDeskObjectId>{line1});
}

void KvDeskObjectEditorTest::deletionIsAnnouncedOnce()
{
    m_selection->set({line1, line2, counter1}, line1);
    QSignalSpy selected(m_selection.get(), SIGNAL(signalSelectionChanged()));
    QSignalSpy removed(ZtSignalCenter::getInstance(), SIGNAL(signalObjectRemoved(int,int)));
    m_editor->remove({line1, line2});
    QCOMPARE(selected.count(), 1);
    QCOMPARE(removed.count(), 2);
    QCOMPARE(m_selection->objects(), QSet<KvDeskObjectId>{counter1});
}

void KvDeskObjectEditorTest::pastesFurtherEachTime()
{
    m_editor->setValueShown(line2, 0, false);
    m_editor->copy({line2});
    QVERIFY(m_editor->canPaste());
    QVERIFY(QGuiApplication::clipboard()->mimeData()->hasText());
    const QSet<KvDeskObjectId> first = m_editor->paste(QPointF(4, 5));
    QCOMPARE(first, (QSet<KvDeskObjectId>{{ZtDrawnType::Line, 3}}));
    QCOMPARE(m_selection->objects(), first);
    const KvDeskObjectState pasted = KvDeskObjectState::of(*first.begin());
    QCOMPARE(pasted.points, polygon({{9, 10}, {54, 10}}));
    QCOMPARE(pasted.name, QStringLiteral("Edge"));
    QCOMPARE(pasted.hiddenValues, QVector<int>{0});
    const QSet<KvDeskObjectId> second = m_editor->paste(QPointF(4, 5));
    QCOMPARE(KvDeskObjectState::of(*second.begin()).points, polygon({{13, 15}, {58, 15}}));
    m_editor->cut({line1});
    QVERIFY(!KvDeskObjectState::of(line1).exists);
    const QSet<KvDeskObjectId> third = m_editor->paste(QPointF());
    QCOMPARE(KvDeskObjectState::of(*third.begin()).points, diagonal);
}

void KvDeskObjectEditorTest::pastesNothingDamaged()
{
    auto *const data = new QMimeData;
    data->setData(QStringLiteral("application/x-measuringdesk-objects+json"), "{\"format\": 1");
    QGuiApplication::clipboard()->setMimeData(data);
    QVERIFY(m_editor->paste().isEmpty());
    QGuiApplication::clipboard()->setText(QStringLiteral("text"));
    QVERIFY(!m_editor->canPaste());
    QVERIFY(m_editor->paste().isEmpty());
    QCOMPARE(m_editor->undoStack()->count(), 0);
}

void KvDeskObjectEditorTest::objectsOfTablesCanBeRemoved()
{
    ZtFault fault;
    QStringList notes;
    QVERIFY(m_session->importTable(DeskFiles::table(), &fault, &notes));
    const int type = m_document->importedTypes().first();
    const KvDeskObjectId bolt{type, 1};
    const ZtGsManipulator *const manipulator = ZtKernelData::getInstance()->getGsManipulator(type);
    const auto length = [&]() {
        return manipulator->valueText(manipulator->getValueNames().first(),
                                      ZtKernelData::getInstance()->object(type, 1));
    };
    const QString before = length();
    QVERIFY(!before.isEmpty());
    m_editor->rename(bolt, QStringLiteral("Mine"));
    m_editor->setValueShown(bolt, 1, false);
    m_editor->remove({bolt});
    QCOMPARE(length(), QString());
    m_editor->slotUndo();
    QCOMPARE(length(), before);
    QCOMPARE(KvDeskObjectEditor::describe({bolt}), QStringLiteral("Mine"));
    QCOMPARE(KvDeskObjectState::of(bolt).hiddenValues, QVector<int>{1});
    m_editor->slotUndo();
    m_editor->slotUndo();
    QCOMPARE(KvDeskObjectEditor::describe({bolt}), QStringLiteral("Bolt A"));
}

void KvDeskObjectEditorTest::historyEndsWithTheSession()
{
    m_editor->moveBy({line1}, QPointF(1, 0));
    m_selection->select(line1);
    m_session->clear();
    QCOMPARE(m_editor->undoStack()->count(), 0);
    QVERIFY(m_selection->isEmpty());
    m_editor->create(ZtDrawnType::Line, diagonal);
    ZtFault fault;
    QVERIFY(m_session->open(DeskFiles::demoSession(), false, &fault));
    QCOMPARE(m_editor->undoStack()->count(), 0);
    QVERIFY(m_selection->isEmpty());
    QVERIFY(!m_session->isModified());
}

void KvDeskObjectEditorTest::otherChangesEndTheHistory()
{
    m_editor->create(ZtDrawnType::Line, diagonal);
    m_editor->slotUndo();
    // This one takes the id that the step would give again.
    m_document->addObject(ZtDrawnType::Line, diagonal);
    QVERIFY(!m_editor->undoStack()->canRedo());
    QVERIFY(!m_editor->undoStack()->canUndo());
}

void KvDeskObjectEditorTest::undoneChangesLeaveTheSessionUnmodified()
{
    ZtFault fault;
    QVERIFY(m_session->save(temporaryPath(QStringLiteral("clean.json")), &fault));
    QVERIFY(!m_session->isModified());
    m_editor->moveBy({line1}, QPointF(1, 0));
    QVERIFY(m_session->isModified());
    m_editor->slotUndo();
    QVERIFY(!m_session->isModified());
    m_editor->slotRedo();
    QVERIFY(m_session->isModified());
    QVERIFY(m_session->save(temporaryPath(QStringLiteral("clean.json")), &fault));
    m_editor->slotUndo();
    QVERIFY(m_session->isModified());
    m_editor->slotRedo();
    QVERIFY(!m_session->isModified());
}

void KvDeskObjectEditorTest::otherChangesKeepTheSessionModified()
{
    ZtFault fault;
    QVERIFY(m_session->save(temporaryPath(QStringLiteral("clean.json")), &fault));
    m_editor->moveBy({line1}, QPointF(1, 0));
    m_document->setCalibration(ZtCalibration(2.5));
    m_editor->slotUndo();
    QVERIFY(m_session->isModified());
}

void KvDeskObjectEditorTest::historyIsLimited()
{
    for (int i = 0; i < KvDeskObjectEditor::maximumSteps + 10; ++i) {
        m_editor->slotFinishGesture();
        m_editor->moveBy({line1}, QPointF(1, 0));
    }
    QCOMPARE(m_editor->undoStack()->count(), KvDeskObjectEditor::maximumSteps);
}

STATREPORT_TEST_MAIN(KvDeskObjectEditorTest)
#include "KvDeskObjectEditorTest.moc"
