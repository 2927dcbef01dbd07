// SPDX-License-Identifier: MIT
#include "KvDeskValueTableModel.h"

#include "DeskFiles.h"
#include "KvDeskTableView.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnManipulator.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QAbstractItemModelTester>
#include <QRandomGenerator>

namespace {

const QPolygonF diagonal = polygon({QPointF(0, 0), QPointF(3, 4)});

QStringList rowTexts(const KvDeskValueTableModel &model, int row)
{
    QStringList texts;
    for (int column = 0; column < model.columnCount(); ++column)
        texts.append(model.index(row, column).data().toString());
    return texts;
}

} // namespace

class KvDeskValueTableModelTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void headers();
    void numbersAreAlignedRight();
    void demoSession();
    void notesAreNoMeasurements();
    void hiddenValuesAreLeftOut();
    void manyChangesAreOneReset();
    void changedTextsKeepTheRows();
    void followsTheSettings();
    void splitsTexts_data();
    void splitsTexts();
    void oneNewObjectIsInserted();
    void oneRemovedObjectIsTakenOut();
    void changeOfOneObjectTouchesOnlyItsRows();
    void renamedObjectChangesAllColumns();
    void sharesOfAllCountersFollow();
    void sameTypeAgainIsRead();
    void goneObjectHasNoText();
    void namesCanBeEdited_data();
    void namesCanBeEdited();
    void staysInStep();
    void rowsOfAnObject();
    void rowOfAValue();
    void tenThousandRows();
    void importedDigitsAreShortened();
    void gapsAndUnitsOfATable();

private:
    static void change(int type, int id, const QPolygonF &points);
    static void rename(int type, int id, const QString &name);
    void happen(int type, int id, QRandomGenerator *random);

    std::unique_ptr<ZtMeasuringDocument> m_document;
    ZtFault m_fault;
};

void KvDeskValueTableModelTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    m_document = std::make_unique<ZtMeasuringDocument>();
}

void KvDeskValueTableModelTest::cleanup()
{
    m_document.reset();
    StatReportTest::cleanup();
}

void KvDeskValueTableModelTest::headers()
{
    const KvDeskValueTableModel model;
    const QStringList titles{QStringLiteral("Type"), QStringLiteral("Object"), QStringLiteral("Value name"),
                             QStringLiteral("Value")};
    QCOMPARE(model.columnCount(), titles.size());
    for (int i = 0; i < titles.size(); ++i)
        QCOMPARE(model.headerData(i, Qt::Horizontal).toString(), titles.at(i));
}

void KvDeskValueTableModelTest::numbersAreAlignedRight()
{
    m_document->addObject(ZtDrawnType::Line, diagonal);
    const KvDeskValueTableModel model;
    const auto alignment = [&model](int column) {
        return Qt::Alignment(model.index(0, column).data(Qt::TextAlignmentRole).toInt());
    };
    QVERIFY(alignment(KvDeskValueTableModel::TypeColumn) & Qt::AlignLeft);
    QVERIFY(alignment(KvDeskValueTableModel::ValueColumn) & Qt::AlignRight);
    QVERIFY(alignment(KvDeskValueTableModel::ValueColumn) & Qt::AlignAbsolute);
}

void KvDeskValueTableModelTest::demoSession()
{
    KvDeskValueTableModel model;
    const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    QVERIFY(m_document->loadSession(DeskFiles::demoSession(), &m_fault));
    model.flush();
    // 6 rectangles, 4 lines, 2 arcs, 1 polygon, 1 polyline, 2 distances, 2 counters, 15 circles
    QCOMPARE(model.rowCount(), 6 * 3 + 4 + 2 * 2 + 2 + 1 + 2 + 2 * 2 + 15 * 2);
    QCOMPARE(rowTexts(model, 0), QStringList({QStringLiteral("Rectangle"), QStringLiteral("Rectangle 1"),
                                              QStringLiteral("Width"), QStringLiteral("1.072 mm")}));
    QCOMPARE(rowTexts(model, 2), QStringList({QStringLiteral("Rectangle"), QStringLiteral("Rectangle 1"),
                                              QStringLiteral("Area"), QStringLiteral("466562.8 μm²")}));
    QCOMPARE(rowTexts(model, 64).mid(0, 3),
             QStringList({QStringLiteral("Circle"), QStringLiteral("Circle 15"), QStringLiteral("Area")}));
    const KvDeskValueRow &counter = model.row(31);
    QCOMPARE(model.text(31, KvDeskValueTableModel::ObjectColumn), QStringLiteral("Holes"));
    QCOMPARE(counter.value, 15.0);
    QCOMPARE(counter.kind, static_cast<int>(ZtGsManipulator::Count));
}

void KvDeskValueTableModelTest::notesAreNoMeasurements()
{
    m_document->addObject(ZtDrawnType::TextNote, polygon({QPointF(1, 1)}), QString(),
                          QStringLiteral("Hello"));
    m_document->addObject(ZtDrawnType::ScaleBar, diagonal);
    QCOMPARE(KvDeskValueTableModel().rowCount(), 0);
}

void KvDeskValueTableModelTest::hiddenValuesAreLeftOut()
{
    const int id = m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    KvDeskValueTableModel model;
    QCOMPARE(model.rowCount(), 3);
    ZtKernelData *const kernel = ZtKernelData::getInstance();
    auto *const manipulator =
        static_cast<ZtDrawnManipulator *>(kernel->getGsManipulator(ZtDrawnType::Rectangle));
    auto *const object = static_cast<ZtDrawnObjectData *>(kernel->object(ZtDrawnType::Rectangle, id));
    manipulator->setValueShown(object, 1, false);
    kernel->notifyObjectChanged(ZtDrawnType::Rectangle, id);
    model.flush();
    QCOMPARE(model.rowCount(), 2);
    QCOMPARE(model.text(1, KvDeskValueTableModel::NameColumn), QStringLiteral("Area"));
}

void KvDeskValueTableModelTest::manyChangesAreOneReset()
{
    KvDeskValueTableModel model;
    QSignalSpy resets(&model, SIGNAL(modelReset()));
    for (int i = 0; i < 200; ++i)
        m_document->addObject(ZtDrawnType::Line, diagonal);
    QCOMPARE(model.rowCount(), 0);
    QVERIFY(resets.wait(5000));
    QCOMPARE(resets.count(), 1);
    QCOMPARE(model.rowCount(), 200);
}

void KvDeskValueTableModelTest::changedTextsKeepTheRows()
{
    const int id = m_document->addObject(ZtDrawnType::Line, diagonal);
    KvDeskValueTableModel model;
    QCOMPARE(rowTexts(model, 0).last(), QStringLiteral("5.0 px"));
    QSignalSpy resets(&model, SIGNAL(modelReset()));
    QSignalSpy changes(&model, SIGNAL(dataChanged(QModelIndex,QModelIndex,QVector<int>)));
    auto *const object =
        static_cast<ZtDrawnObjectData *>(ZtKernelData::getInstance()->object(ZtDrawnType::Line, id));
    object->setPoints(polygon({QPointF(0, 0), QPointF(6, 8)}));
    ZtKernelData::getInstance()->notifyObjectChanged(ZtDrawnType::Line, id);
    model.flush();
    QCOMPARE(resets.count(), 0);
    QCOMPARE(changes.count(), 1);
    QCOMPARE(rowTexts(model, 0).last(), QStringLiteral("10.0 px"));
}

void KvDeskValueTableModelTest::followsTheSettings()
{
    m_document->setCalibration(ZtCalibration(1000.0));
    m_document->addObject(ZtDrawnType::Line, diagonal);
    KvDeskValueTableModel model;
    ZtAppSettings::beginGroup(QStringLiteral("Measurement"));
    ZtAppSettings::setValue(QStringLiteral("LengthUnit"), QStringLiteral("cm"));
    ZtAppSettings::setValue(QStringLiteral("MeasurementLabelsSignDigits"), 2U);
    ZtAppSettings::endGroup();
    model.flush();
    QCOMPARE(rowTexts(model, 0).last(), QStringLiteral("0.50 cm"));
}

void KvDeskValueTableModelTest::splitsTexts_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("number");
    QTest::addColumn<QString>("unit");
    const auto row = [](const char *text, const char *number, const char *unit) {
        QTest::newRow(text) << QString::fromUtf8(text) << QString::fromUtf8(number)
                            << QString::fromUtf8(unit);
    };
    row("1.072 mm", "1.072", "mm");
    row("-3 μm²", "-3", "μm²");
    row("1e-07 kg / m", "1e-07", "kg / m");
    row("42", "42", "");
    row("", "", "");
    row("not a number", "not a number", "");
}

void KvDeskValueTableModelTest::splitsTexts()
{
    QFETCH(QString, text);
    QFETCH(QString, number);
    QFETCH(QString, unit);
    QCOMPARE(KvDeskValueTableModel::numberOf(text), number);
    QCOMPARE(KvDeskValueTableModel::unitOf(text), unit);
}

void KvDeskValueTableModelTest::oneNewObjectIsInserted()
{
    m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    m_document->addObject(ZtDrawnType::Circle, diagonal);
    KvDeskValueTableModel model;
    const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    const QSignalSpy resets(&model, SIGNAL(modelReset()));
    QSignalSpy insertions(&model, SIGNAL(rowsInserted(QModelIndex,int,int)));
    m_document->addObject(ZtDrawnType::Line, diagonal);
    model.flush();
    QCOMPARE(resets.count(), 0);
    QCOMPARE(insertions.count(), 1);
    QCOMPARE(insertions.first().at(1).toInt(), 3);
    QCOMPARE(insertions.first().at(2).toInt(), 3);
    QCOMPARE(rowTexts(model, 3).first(), QStringLiteral("Line"));
    QCOMPARE(rowTexts(model, 4).first(), QStringLiteral("Circle"));
    QCOMPARE(model.rowsOf({ZtDrawnType::Circle, 1}).first, 4);
}

void KvDeskValueTableModelTest::oneRemovedObjectIsTakenOut()
{
    for (int i = 0; i < 3; ++i)
        m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    KvDeskValueTableModel model;
    const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    const QSignalSpy resets(&model, SIGNAL(modelReset()));
    QSignalSpy removals(&model, SIGNAL(rowsRemoved(QModelIndex,int,int)));
    ZtKernelData::getInstance()->removeObject(ZtDrawnType::Rectangle, 2);
    model.flush();
    QCOMPARE(resets.count(), 0);
    QCOMPARE(removals.count(), 1);
    QCOMPARE(removals.first().at(1).toInt(), 3);
    QCOMPARE(removals.first().at(2).toInt(), 5);
    QCOMPARE(model.rowCount(), 6);
    QCOMPARE(model.rowsOf({ZtDrawnType::Rectangle, 2}).count, 0);
    QCOMPARE(model.rowsOf({ZtDrawnType::Rectangle, 3}).first, 3);
}

void KvDeskValueTableModelTest::changeOfOneObjectTouchesOnlyItsRows()
{
    for (int i = 0; i < 3; ++i)
        m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    KvDeskValueTableModel model;
    QSignalSpy rows(&model, SIGNAL(signalRowsChanged(QVector<int>,bool)));
    QSignalSpy changes(&model, SIGNAL(dataChanged(QModelIndex,QModelIndex,QVector<int>)));
    change(ZtDrawnType::Rectangle, 2, polygon({QPointF(0, 0), QPointF(6, 8)}));
    model.flush();
    QCOMPARE(rows.count(), 1);
    QCOMPARE(rows.first().at(0).value<QVector<int>>(), QVector<int>({3, 4, 5}));
    QCOMPARE(rows.first().at(1).toBool(), false);
    QCOMPARE(changes.count(), 1);
    QCOMPARE(changes.first().at(0).toModelIndex(), model.index(3, KvDeskValueTableModel::ValueColumn));
    QCOMPARE(changes.first().at(1).toModelIndex(), model.index(5, KvDeskValueTableModel::ValueColumn));
    QCOMPARE(model.row(3).value, 6.0);
}

void KvDeskValueTableModelTest::renamedObjectChangesAllColumns()
{
    m_document->addObject(ZtDrawnType::Line, diagonal);
    m_document->addObject(ZtDrawnType::Line, diagonal);
    KvDeskValueTableModel model;
    QVERIFY(model.compareTexts(0, 1, KvDeskValueTableModel::ObjectColumn) < 0);
    QSignalSpy rows(&model, SIGNAL(signalRowsChanged(QVector<int>,bool)));
    rename(ZtDrawnType::Line, 1, QStringLiteral("Zebra"));
    model.flush();
    QCOMPARE(rows.first().at(1).toBool(), true);
    QCOMPARE(rowTexts(model, 0).at(KvDeskValueTableModel::ObjectColumn), QStringLiteral("Zebra"));
    QVERIFY(model.compareTexts(0, 1, KvDeskValueTableModel::ObjectColumn) > 0);
}

void KvDeskValueTableModelTest::sharesOfAllCountersFollow()
{
    m_document->addObject(ZtDrawnType::Counter, diagonal);
    m_document->addObject(ZtDrawnType::Counter, diagonal);
    KvDeskValueTableModel model;
    QCOMPARE(model.row(1).value, 50.0);
    QCOMPARE(model.row(3).value, 50.0);
    change(
        ZtDrawnType::Counter, 1,
        polygon({QPointF(0, 0), QPointF(1, 1), QPointF(2, 2), QPointF(3, 3), QPointF(4, 4), QPointF(5, 5)}));
    model.flush();
    QCOMPARE(model.row(1).value, 75.0);
    QCOMPARE(model.row(3).value, 25.0);
    m_document->addObject(ZtDrawnType::Counter, diagonal);
    model.flush();
    QCOMPARE(model.row(1).value, 60.0);
    QCOMPARE(model.row(3).value, 20.0);
    ZtKernelData::getInstance()->removeObject(ZtDrawnType::Counter, 1);
    model.flush();
    QCOMPARE(model.row(1).value, 50.0);
}

// As many objects as before, but others: announced by one of them.
void KvDeskValueTableModelTest::sameTypeAgainIsRead()
{
    const QString first = DeskFiles::text(QStringLiteral("first.csv"), "Object,Mass [g]\nA,1\nB,2\nC,3\n");
    const QString second = DeskFiles::text(QStringLiteral("second.csv"), "Object,Mass [g]\nD,4\nE,5\nF,6\n");
    QVERIFY(m_document->importTable(first, ZtTableImportOptions(), &m_fault));
    KvDeskValueTableModel model;
    m_document->clear();
    QVERIFY(m_document->importTable(second, ZtTableImportOptions(), &m_fault));
    model.flush();
    QCOMPARE(model.rowCount(), 3);
    QCOMPARE(model.row(2).value, 6.0);
    QCOMPARE(model.text(2, KvDeskValueTableModel::ObjectColumn), QStringLiteral("F"));
}

void KvDeskValueTableModelTest::goneObjectHasNoText()
{
    m_document->addObject(ZtDrawnType::Line, diagonal);
    KvDeskValueTableModel model;
    ZtKernelData::getInstance()->removeObject(ZtDrawnType::Line, 1);
    QCOMPARE(rowTexts(model, 0), QStringList({QStringLiteral("Line"), QStringLiteral("Line 1"),
                                              QStringLiteral("Length"), QString()}));
    m_document.reset();
    QCOMPARE(rowTexts(model, 0), QStringList({QString(), QStringLiteral("Line 1"), QString(), QString()}));
}

void KvDeskValueTableModelTest::namesCanBeEdited_data()
{
    QTest::addColumn<QString>("written");
    QTest::addColumn<QStringList>("asked");
    QTest::newRow("another name") << QStringLiteral(" New  name ") << QStringList(QStringLiteral("New name"));
    QTest::newRow("no name") << QString() << QStringList(QString());
    QTest::newRow("same name") << QStringLiteral("Line 1") << QStringList();
}

void KvDeskValueTableModelTest::namesCanBeEdited()
{
    QFETCH(QString, written);
    QFETCH(QStringList, asked);
    m_document->addObject(ZtDrawnType::Line, diagonal);
    KvDeskValueTableModel model;
    const QModelIndex name = model.index(0, KvDeskValueTableModel::ObjectColumn);
    const QModelIndex value = model.index(0, KvDeskValueTableModel::ValueColumn);
    QVERIFY(model.flags(name) & Qt::ItemIsEditable);
    QVERIFY(!(model.flags(value) & Qt::ItemIsEditable));
    QCOMPARE(name.data(Qt::EditRole).toString(), QStringLiteral("Line 1"));
    QSignalSpy spy(&model, SIGNAL(signalRenamed(int,int,QString)));
    QVERIFY(model.setData(name, written));
    QVERIFY(!model.setData(value, written));
    QStringList names;
    for (const QList<QVariant> &arguments : qAsConst(spy)) {
        QCOMPARE(arguments.at(0).toInt(), static_cast<int>(ZtDrawnType::Line));
        QCOMPARE(arguments.at(1).toInt(), 1);
        names.append(arguments.at(2).toString());
    }
    QCOMPARE(names, asked);
}

// Whatever happens, the model shows what one that is made now shows.
void KvDeskValueTableModelTest::staysInStep()
{
    const QVector<int> types{ZtDrawnType::Line, ZtDrawnType::Rectangle, ZtDrawnType::Counter,
                             ZtDrawnType::TextNote};
    KvDeskValueTableModel model;
    const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    QRandomGenerator random(1);
    for (int round = 0; round < 300; ++round) {
        for (int i = random.bounded(1, 12); i > 0; --i)
            happen(types.at(random.bounded(types.size())), random.bounded(1, 8), &random);
        model.flush();
        const KvDeskValueTableModel expected;
        QCOMPARE(model.rowCount(), expected.rowCount());
        for (int row = 0; row < model.rowCount(); ++row) {
            QVERIFY(model.row(row).isSameValue(expected.row(row)));
            QCOMPARE(model.row(row).objectIndex, expected.row(row).objectIndex);
            QCOMPARE(model.row(row).value, expected.row(row).value);
            QCOMPARE(rowTexts(model, row), rowTexts(expected, row));
            QCOMPARE(model.rowOf(model.row(row).object, model.row(row).position), row);
        }
    }
}

void KvDeskValueTableModelTest::happen(int type, int id, QRandomGenerator *random)
{
    ZtKernelData *const kernel = ZtKernelData::getInstance();
    const double size = random->bounded(1, 50);
    const QPolygonF points = polygon({QPointF(0, 0), QPointF(size, size)});
    if (!kernel->object(type, id)) {
        m_document->addObject(type, type == ZtDrawnType::TextNote ? polygon({QPointF(1, 1)}) : points,
                              QString(), QString(), id);
        return;
    }
    auto *const manipulator = static_cast<ZtDrawnManipulator *>(kernel->getGsManipulator(type));
    auto *const object = static_cast<ZtDrawnObjectData *>(kernel->object(type, id));
    switch (random->bounded(4)) {
    case 0:
        kernel->removeObject(type, id);
        break;
    case 1:
        rename(type, id, QString::number(random->bounded(100)));
        break;
    case 2:
        manipulator->setValueShown(object, 0, random->bounded(2) == 0);
        kernel->notifyObjectChanged(type, id);
        break;
    default:
        if (type != ZtDrawnType::TextNote)
            change(type, id, points);
    }
}

void KvDeskValueTableModelTest::change(int type, int id, const QPolygonF &points)
{
    static_cast<ZtDrawnObjectData *>(ZtKernelData::getInstance()->object(type, id))->setPoints(points);
    ZtKernelData::getInstance()->notifyObjectChanged(type, id);
}

void KvDeskValueTableModelTest::rename(int type, int id, const QString &name)
{
    ZtKernelData::getInstance()->getGsManipulator(type)->setObjectName(id, name);
    ZtKernelData::getInstance()->notifyObjectChanged(type, id);
}

void KvDeskValueTableModelTest::rowsOfAnObject()
{
    m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    const int second = m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    const KvDeskValueTableModel model;
    QCOMPARE(model.rowsOf({ZtDrawnType::Rectangle, second}).first, 3);
    QCOMPARE(model.rowsOf({ZtDrawnType::Rectangle, second}).count, 3);
    QCOMPARE(model.rowsOf({ZtDrawnType::Rectangle, 99}).count, 0);
}

void KvDeskValueTableModelTest::rowOfAValue()
{
    m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    const int second = m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    const KvDeskValueTableModel model;
    QCOMPARE(model.rowOf({ZtDrawnType::Rectangle, second}, 2), 5);
    QCOMPARE(model.rowOf({ZtDrawnType::Rectangle, second}, 3), -1);
    QCOMPARE(model.rowOf({ZtDrawnType::Line, 1}, 0), -1);
}

void KvDeskValueTableModelTest::tenThousandRows()
{
    QByteArray table("Object,Length [mm]\n");
    for (int i = 0; i < 10000; ++i)
        table += "Bolt " + QByteArray::number(i) + ',' + QByteArray::number(i) + ".5\n";
    KvDeskValueTableModel model;
    QVERIFY(m_document->importTable(DeskFiles::text(QStringLiteral("large.csv"), table),
                                    ZtTableImportOptions(), &m_fault));
    model.flush();
    QCOMPARE(model.rowCount(), 10000);
    QCOMPARE(model.text(9999, KvDeskValueTableModel::ObjectColumn), QStringLiteral("Bolt 9999"));
    QCOMPARE(model.row(9999).value, 9999500.0);
}

void KvDeskValueTableModelTest::importedDigitsAreShortened()
{
    const QByteArray table(
        "Object,Length [mm],Mass [g],Cells [pcs]\nA,1.23456789,0.00000123456,12\nB,5,0,1\n");
    QVERIFY(m_document->importTable(DeskFiles::text(QStringLiteral("digits.csv"), table),
                                    ZtTableImportOptions(), &m_fault));
    const KvDeskValueTableModel model;
    const QStringList shown{QStringLiteral("1.235 mm"), QStringLiteral("0.00000123 g"),
                            QStringLiteral("12 pcs"),   QStringLiteral("5 mm"),
                            QStringLiteral("0 g"),      QStringLiteral("1 pcs")};
    for (int row = 0; row < shown.size(); ++row)
        QCOMPARE(model.text(row, KvDeskValueTableModel::ValueColumn), shown.at(row));
    const QModelIndex length = model.index(0, KvDeskValueTableModel::ValueColumn);
    QCOMPARE(length.data(KvDeskTableView::CopyRole).toString(), QStringLiteral("1.23456789 mm"));
    QVERIFY(!model.index(0, 0).data(KvDeskTableView::CopyRole).isValid());
    QCOMPARE(model.row(0).value, 1234.56789);
}

void KvDeskValueTableModelTest::gapsAndUnitsOfATable()
{
    const QByteArray table("Object,Length [mm],Area [mm2],Mass [g]\nA,1,,3\nB,,,\nC,,2,\n");
    QVERIFY(m_document->importTable(DeskFiles::text(QStringLiteral("gaps.csv"), table),
                                    ZtTableImportOptions(), &m_fault));
    const KvDeskValueTableModel model;
    QCOMPARE(model.rowCount(), 3);
    const int positions[] = {0, 2, 1};
    const int kinds[] = {ZtGsManipulator::Length, ZtGsManipulator::NoKind, ZtGsManipulator::Area};
    for (int row = 0; row < 3; ++row) {
        QCOMPARE(model.row(row).position, positions[row]);
        QCOMPARE(model.row(row).kind, kinds[row]);
    }
    QCOMPARE(model.row(2).value, 2e6);
}

STATREPORT_TEST_MAIN(KvDeskValueTableModelTest)
#include "KvDeskValueTableModelTest.moc"
