// SPDX-License-Identifier: MIT
#include "KvDeskTableCommand.h"

#include "DeskValues.h"
#include "KvDeskFileCommands.h"
#include "KvDeskObjectState.h"
#include "kernel/ZtGsManipulator.h"
#include "kernel/ZtSignalCenter.h"
#include "support/StatReportTest.h"

#include <QElapsedTimer>
#include <QSignalSpy>
#include <QUndoStack>

namespace {

using Objects = QVector<KvDeskObjectState>;

Objects all()
{
    Objects states;
    const QMap<int, ZtObjectMap> &objects = ZtKernelData::getInstance()->objects();
    for (auto type = objects.constBegin(); type != objects.constEnd(); ++type) {
        for (auto it = type->constBegin(); it != type->constEnd(); ++it)
            states.append(KvDeskObjectState::of({type.key(), it.key()}));
    }
    return states;
}

QString manyRows(int rows)
{
    QByteArray bytes = "Name,Length [mm]\n";
    for (int i = 0; i < rows; ++i)
        bytes += "A,1.5\n";
    return DeskFiles::text(QStringLiteral("many.csv"), bytes);
}

} // namespace

/** Importing tables by the user's command, as a step of the history. */
class KvDeskTableCommandTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void isOneStep();
    void keepsTheOrderOfSteps();
    void severalTables();
    void tablesOfSeveralTypes();
    void everyTypeIsAnnouncedOnce();
    void selectionFollows();
    void valueTableFollows();
    void unsavedMarkFollows();
    void tablesWithoutRowsAreNoStep();
    void tableByAnotherWayEndsWhatWasUndone();
    void endsWithTheSession_data();
    void endsWithTheSession();
    void manyRowsTakeNoTime_data();
    void manyRowsTakeNoTime();

private:
    int import(const QString &path)
    {
        return m_files->importTable(path) ? m_desk->document.importedTypes().last() : 0;
    }
    QUndoStack *stack() const { return m_desk->editor.undoStack(); }

    std::unique_ptr<DeskValues> m_desk;
    std::unique_ptr<KvDeskFileCommands> m_files;
};

void KvDeskTableCommandTest::init()
{
    StatReportTest::init();
    m_desk = std::make_unique<DeskValues>();
    m_files = std::make_unique<KvDeskFileCommands>(&m_desk->session, &m_desk->table, &m_desk->editor);
    m_desk->editor.create(ZtDrawnType::Line, polygon({{0, 0}, {3, 4}}));
}

void KvDeskTableCommandTest::cleanup()
{
    m_files.reset();
    m_desk.reset();
    StatReportTest::cleanup();
}

void KvDeskTableCommandTest::isOneStep()
{
    const Objects before = all();
    const int type = import(DeskFiles::table());
    QCOMPARE(stack()->count(), 2);
    QVERIFY(stack()->undoText().startsWith(QStringLiteral("import of ")));
    QVERIFY(stack()->undoText().contains(QStringLiteral("table.csv")));
    const Objects imported = all();
    const ZtKernelObjectData *const kept = ZtKernelData::getInstance()->object(type, 1);
    for (int i = 0; i < 2; ++i) {
        m_desk->editor.slotUndo();
        QCOMPARE(all(), before);
        QVERIFY(m_desk->document.importedTypes().isEmpty());
        QVERIFY(m_desk->document.toSession().tables.isEmpty());
        QVERIFY(!ZtKernelData::getInstance()->getGsManipulator(type));
        m_desk->editor.slotRedo();
        QCOMPARE(all(), imported);
        QCOMPARE(ZtKernelData::getInstance()->object(type, 1), kept);
        QCOMPARE(m_desk->document.toSession().tables.first().rows.size(), 2);
    }
    m_desk->editor.slotUndo();
    m_desk->editor.slotUndo();
    QVERIFY(all().isEmpty());
}

void KvDeskTableCommandTest::keepsTheOrderOfSteps()
{
    KvDeskObjectEditor &editor = m_desk->editor;
    QVector<Objects> states{all()};
    const int type = import(DeskFiles::table());
    const KvDeskObjectId first{type, 1};
    const KvDeskObjectId second{type, 2};
    states.append(all());
    editor.rename(first, QStringLiteral("Mine"));
    states.append(all());
    editor.setValueShown(first, 1, false);
    states.append(all());
    editor.remove({first});
    states.append(all());
    editor.create(ZtDrawnType::Line, polygon({{0, 0}, {6, 8}}));
    states.append(all());
    editor.remove({second});
    states.append(all());
    for (int i = states.size() - 2; i >= 0; --i) {
        editor.slotUndo();
        QCOMPARE(all(), states.at(i));
    }
    for (int i = 1; i < states.size(); ++i) {
        editor.slotRedo();
        QCOMPARE(all(), states.at(i));
    }
    while (stack()->canUndo())
        editor.slotUndo();
    QVERIFY(all().isEmpty());
}

void KvDeskTableCommandTest::severalTables()
{
    const Objects none = all();
    import(DeskFiles::table());
    const Objects one = all();
    const int second = import(DeskFiles::table());
    const Objects two = all();
    QCOMPARE(two.size(), 5);
    m_desk->editor.slotUndo();
    QCOMPARE(all(), one);
    m_desk->editor.slotUndo();
    QCOMPARE(all(), none);
    m_desk->editor.slotRedo();
    m_desk->editor.slotRedo();
    QCOMPARE(all(), two);
    m_desk->editor.slotUndo();
    QCOMPARE(import(DeskFiles::table()), second);
    QCOMPARE(all(), two);
    QVERIFY(!stack()->canRedo());
}

void KvDeskTableCommandTest::tablesOfSeveralTypes()
{
    const Objects before = all();
    import(DeskFiles::text(QStringLiteral("types.csv"), "type,id,Length\nBolt,1,5\nNut,1,6\nBolt,2,7\n"));
    const Objects after = all();
    QCOMPARE(m_desk->document.importedTypes().size(), 2);
    m_desk->editor.slotUndo();
    QCOMPARE(all(), before);
    m_desk->editor.slotRedo();
    QCOMPARE(all(), after);
    QCOMPARE(m_desk->document.importedTypes().size(), 2);
}

void KvDeskTableCommandTest::everyTypeIsAnnouncedOnce()
{
    const int type = import(DeskFiles::table());
    const ZtSignalCenter *const center = ZtSignalCenter::getInstance();
    // Who hears of it asks what kind of objects went.
    bool isKnown = false;
    connect(center, &ZtSignalCenter::signalObjectRemoved, this, [&](int removedType) {
        isKnown = removedType == type && ZtKernelData::getInstance()->getGsManipulator(type);
    });
    QSignalSpy created(center, SIGNAL(signalObjectCreated(int, int, const ZtKernelObjectData *)));
    QSignalSpy removed(center, SIGNAL(signalObjectRemoved(int, int)));
    m_desk->editor.slotUndo();
    QCOMPARE(removed.size(), 1);
    QVERIFY(isKnown);
    center->disconnect(this);
    m_desk->editor.slotRedo();
    QCOMPARE(created.size(), 1);
    QCOMPARE(removed.size(), 1);
}

void KvDeskTableCommandTest::selectionFollows()
{
    const KvDeskObjectId line{ZtDrawnType::Line, 1};
    const int type = import(DeskFiles::table());
    m_desk->selection.set({line, {type, 1}, {type, 2}}, {type, 2});
    m_desk->editor.slotUndo();
    QCOMPARE(m_desk->selection.objects(), QSet<KvDeskObjectId>{line});
    // Not one object for all of the table.
    m_desk->editor.slotRedo();
    QCOMPARE(m_desk->selection.objects(), QSet<KvDeskObjectId>{line});
}

void KvDeskTableCommandTest::valueTableFollows()
{
    m_desk->table.model()->flush();
    const int before = m_desk->table.model()->rowCount();
    QVERIFY(before > 0);
    import(DeskFiles::table());
    m_desk->table.model()->flush();
    QCOMPARE(m_desk->table.model()->rowCount(), before + 4);
    m_desk->editor.slotUndo();
    // Painted before it heard of the change.
    m_desk->table.grab();
    m_desk->table.model()->flush();
    QCOMPARE(m_desk->table.model()->rowCount(), before);
    m_desk->editor.slotRedo();
    m_desk->table.grab();
    m_desk->table.model()->flush();
    QCOMPARE(m_desk->table.model()->rowCount(), before + 4);
}

void KvDeskTableCommandTest::unsavedMarkFollows()
{
    const QString path = temporaryPath(QStringLiteral("saved.json"));
    QVERIFY(m_files->saveSession(path));
    const QByteArray before = DeskFiles::bytes(path);
    import(DeskFiles::table());
    QVERIFY(m_desk->session.isModified());
    m_desk->editor.slotUndo();
    QVERIFY(!m_desk->session.isModified());
    QVERIFY(m_files->saveSession(path));
    QCOMPARE(DeskFiles::bytes(path), before);
    m_desk->editor.slotRedo();
    QVERIFY(m_desk->session.isModified());
    QVERIFY(m_files->saveSession(path));
    m_desk->editor.slotUndo();
    QVERIFY(m_desk->session.isModified());
    m_desk->editor.slotRedo();
    QVERIFY(!m_desk->session.isModified());
}

void KvDeskTableCommandTest::tablesWithoutRowsAreNoStep()
{
    QVERIFY(m_files->importTable(DeskFiles::text(QStringLiteral("none.csv"), "Name,Length\n")));
    QCOMPARE(stack()->count(), 1);
}

void KvDeskTableCommandTest::tableByAnotherWayEndsWhatWasUndone()
{
    import(DeskFiles::table());
    m_desk->editor.slotUndo();
    ZtFault fault;
    QStringList notes;
    QVERIFY(m_desk->session.importTable(DeskFiles::table(), &fault, &notes));
    QVERIFY(!stack()->canRedo());
}

void KvDeskTableCommandTest::endsWithTheSession_data()
{
    QTest::addColumn<bool>("isUndone");
    QTest::newRow("done") << false;
    QTest::newRow("undone") << true;
}

void KvDeskTableCommandTest::endsWithTheSession()
{
    QFETCH(bool, isUndone);
    import(manyRows(20000));
    if (isUndone)
        m_desk->editor.slotUndo();
    m_desk->session.clear();
    QCOMPARE(stack()->count(), 0);
    QVERIFY(all().isEmpty());
    import(DeskFiles::table());
    QCOMPARE(all().size(), 2);
}

void KvDeskTableCommandTest::manyRowsTakeNoTime_data()
{
    QTest::addColumn<int>("rows");
    QTest::newRow("hundred thousand") << 100000;
    QTest::newRow("million") << 1000000;
}

void KvDeskTableCommandTest::manyRowsTakeNoTime()
{
    QFETCH(int, rows);
    const int type = import(manyRows(rows));
    QVERIFY(type != 0);
    m_desk->table.model()->flush();
    const ZtKernelObjectData *const last = ZtKernelData::getInstance()->object(type, rows);
    QElapsedTimer clock;
    clock.start();
    m_desk->editor.slotUndo();
    m_desk->editor.slotRedo();
    // A copy of the objects alone takes longer, however busy the machine is.
    QVERIFY2(clock.elapsed() < 50, qPrintable(QString::number(clock.elapsed())));
    QCOMPARE(ZtKernelData::getInstance()->object(type, rows), last);
    QCOMPARE(m_desk->session.objectCount(), rows + 1);
}

STATREPORT_TEST_MAIN(KvDeskTableCommandTest)

#include "KvDeskTableCommandTest.moc"
