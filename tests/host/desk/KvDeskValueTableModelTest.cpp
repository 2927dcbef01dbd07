// SPDX-License-Identifier: MIT
#include "KvDeskValueTableModel.h"

#include "DeskFiles.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnManipulator.h"
#include "measuring/ZtDrawnObjectData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtFault.h"
#include "measuring/ZtMeasuringDocument.h"

#include <QAbstractItemModelTester>

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
    void unitsAndLongestNumber();
    void rowsOfAnObject();
    void tenThousandRows();

private:
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
    QCOMPARE(counter.objectName, QStringLiteral("Holes"));
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
    QCOMPARE(model.row(1).valueName, QStringLiteral("Area"));
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

void KvDeskValueTableModelTest::unitsAndLongestNumber()
{
    m_document->addObject(ZtDrawnType::Rectangle, polygon({QPointF(0, 0), QPointF(2000, 1000)}));
    const KvDeskValueTableModel model;
    QStringList units = model.units();
    units.sort();
    QCOMPARE(units, QStringList({QStringLiteral("px"), QStringLiteral("px²")}));
    QCOMPARE(model.longestNumber(), QStringLiteral("2000000.0"));
}

void KvDeskValueTableModelTest::rowsOfAnObject()
{
    m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    const int second = m_document->addObject(ZtDrawnType::Rectangle, diagonal);
    const KvDeskValueTableModel model;
    QCOMPARE(model.rowsOf({ZtDrawnType::Rectangle, second}), QVector<int>({3, 4, 5}));
    QCOMPARE(model.rowsOf({ZtDrawnType::Rectangle, 99}), QVector<int>());
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
    QCOMPARE(model.row(9999).objectName, QStringLiteral("Bolt 9999"));
    QCOMPARE(model.row(9999).value, 9999500.0);
}

STATREPORT_TEST_MAIN(KvDeskValueTableModelTest)
#include "KvDeskValueTableModelTest.moc"
