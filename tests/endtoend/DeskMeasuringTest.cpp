// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "DeskUser.h"
#include "KvDeskActions.h"
#include "KvDeskCalibrationCommands.h"
#include "KvDeskCalibrationDialog.h"
#include "KvDeskCalibrationHistory.h"
#include "KvDeskCounterBar.h"
#include "KvDeskImageView.h"
#include "KvDeskKnownDistance.h"
#include "KvDeskNumberBox.h"
#include "KvDeskObjectState.h"
#include "KvDeskSelection.h"
#include "KvDeskSession.h"
#include "KvDeskStatusBar.h"
#include "KvDeskTableView.h"
#include "KvDeskValueTable.h"
#include "KvDeskValueTableModel.h"
#include "RunningDesk.h"
#include "host/desk/DeskFiles.h"
#include "host/desk/ExportDialogAnswerer.h"
#include "host/measuring/Polygon.h"
#include "kernel/ZtAppSettings.h"
#include "kernel/ZtKernelData.h"
#include "measuring/ZtDrawnType.h"
#include "measuring/ZtKernelImage.h"
#include "measuring/ZtTableExport.h"
#include "support/FileDialogAnswerer.h"
#include "support/MessageBoxAnswerer.h"

#include <QAction>
#include <QClipboard>
#include <QHeaderView>
#include <QTableView>

namespace {

using A = KvDeskActions;

const KvDeskObjectId line1{ZtDrawnType::Line, 1};
const KvDeskObjectId polygon1{ZtDrawnType::Polygon, 1};
const KvDeskObjectId circle1{ZtDrawnType::Circle, 1};
const KvDeskObjectId counter1{ZtDrawnType::Counter, 1};
const KvDeskObjectId counter2{ZtDrawnType::Counter, 2};

QPolygonF points(const KvDeskObjectId &object)
{
    return KvDeskObjectState::of(object).points;
}

bool exists(const KvDeskObjectId &object)
{
    return KvDeskObjectState::of(object).exists;
}

// All of them, in the order of types and ids.
QVector<KvDeskObjectState> objects()
{
    QVector<KvDeskObjectState> states;
    const QMap<int, ZtObjectMap> all = ZtKernelData::getInstance()->objects();
    for (auto type = all.constBegin(); type != all.constEnd(); ++type) {
        for (const int id : type->keys())
            states.append(KvDeskObjectState::of({type.key(), id}));
    }
    return states;
}

QVector<QStringList> rowsOf(const QAbstractItemModel *model)
{
    QVector<QStringList> rows;
    for (int row = 0; row < model->rowCount(); ++row) {
        rows.append(QStringList());
        for (int column = 0; column < model->columnCount(); ++column)
            rows.last().append(model->index(row, column).data().toString());
    }
    return rows;
}

QVector<QStringList> tableIn(const QWidget *widget)
{
    const QTableView *const view = widget ? widget->findChild<QTableView *>() : nullptr;
    return view ? rowsOf(view->model()) : QVector<QStringList>();
}

bool hasText(const QVector<QStringList> &rows, const char *text)
{
    return std::any_of(rows.begin(), rows.end(),
                       [text](const QStringList &row) { return row.contains(QString::fromUtf8(text)); });
}

} // namespace

/**
 * Measuring from the calibration to the report, as a person does it: off-screen and, with real mouse and
 * keys, under an X server. The image is shown one to one, so that places on it are whole pixels.
 */
class DeskMeasuringTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void calibratesByAKnownDistance();
    void drawsAndGoesBack();
    void undoTakesTheDraftBackFirst();
    void changesByMouseAndKeys();
    void countsClasses();
    void tableAndImageSelectTheSame();
    void tableSortsFiltersAndCopies();
    void exportsAndImportsAgain();
    void savesAndReopens();
    void reportAndStatisticsFollow();

private:
    void start();
    void choose(Qt::Key key, A::Id tool);
    QPoint at(double x, double y) const { return view()->mapFromScene(QPointF(x, y)); }
    void click(double x, double y) { m_user.click(view()->viewport(), at(x, y)); }
    void stroke(const QPointF &from, const QPointF &to)
    {
        m_user.stroke(view()->viewport(), at(from.x(), from.y()), at(to.x(), to.y()));
    }
    void drawLine();
    void drawCircle();
    void drawPolygon();
    void drawAll();
    void undo() { m_user.press(Qt::Key_Z, Qt::ControlModifier); }
    void redo() { m_user.press(Qt::Key_Y, Qt::ControlModifier); }
    void calibrate();
    void openEditorWithTable();
    void openStatistics();

    KvDeskMainWindow *window() const { return m_desk->window(); }
    KvDeskImageView *view() const { return window()->imageView(); }
    KvDeskSelection *selection() const { return window()->selection(); }
    KvDeskTableView *table() const { return window()->valueTable()->view(); }
    const QAbstractItemModel *shown() const { return table()->model(); }
    void clickRow(int row, int column)
    {
        m_user.click(table()->viewport(), table()->visualRect(shown()->index(row, column)).center());
    }
    void clickHeader(int column, int offset = 0);
    QString value(const char *object, const char *name) const;
    QStringList selectedRows() const
    {
        return table()->selectedText().split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    }
    QVector<QStringList> tableOnPage() const
    {
        const QVector<QGraphicsProxyWidget *> pieces = m_desk->pieces();
        return pieces.isEmpty() ? QVector<QStringList>() : tableIn(pieces.first()->widget());
    }
    QVector<QStringList> statistics() const { return tableIn(m_desk->statisticsWindow()); }
    /** Of the first row below the headings. */
    QString average() const { return statistics().value(1).value(4).trimmed(); }

    std::unique_ptr<RunningDesk> m_desk;
    DeskUser m_user;
};

void DeskMeasuringTest::init()
{
    StatReportTest::init();
    ZtAppSettings::getInstance()->setStoragePath(QString());
    start();
    QVERIFY(window()->files()->openImage(
        DeskFiles::image(QStringLiteral("plate.png"), QSize(400, 300), Qt::darkGray)));
    m_user.press(Qt::Key_1, Qt::ControlModifier);
    QTRY_COMPARE(view()->zoom(), 1.0);
    click(390, 290);
    QTRY_VERIFY(view()->hasFocus());
}

void DeskMeasuringTest::cleanup()
{
    m_desk.reset();
    StatReportTest::cleanup();
}

void DeskMeasuringTest::start()
{
    m_desk = std::make_unique<RunningDesk>();
    window()->move(0, 0);
    window()->resize(1280, 800);
    QVERIFY(QTest::qWaitForWindowExposed(window()));
    m_user.activate(window());
}

void DeskMeasuringTest::choose(Qt::Key key, A::Id tool)
{
    m_user.press(key);
    QTRY_VERIFY(window()->actions()->action(tool)->isChecked());
}

// 200 pixels.
void DeskMeasuringTest::drawLine()
{
    choose(Qt::Key_L, A::LineTool);
    stroke({60, 60}, {260, 60});
    QTRY_VERIFY(exists(line1));
}

// A radius of 50 pixels.
void DeskMeasuringTest::drawCircle()
{
    choose(Qt::Key_C, A::CircleTool);
    stroke({100, 160}, {150, 160});
    QTRY_VERIFY(exists(circle1));
}

// A square with sides of 80 pixels.
void DeskMeasuringTest::drawPolygon()
{
    choose(Qt::Key_G, A::PolygonTool);
    for (const QPoint &corner : {QPoint(220, 120), QPoint(300, 120), QPoint(300, 200), QPoint(220, 200)})
        click(corner.x(), corner.y());
    m_user.press(Qt::Key_Return);
    QTRY_VERIFY(exists(polygon1));
}

void DeskMeasuringTest::drawAll()
{
    drawLine();
    drawCircle();
    drawPolygon();
}

QString DeskMeasuringTest::value(const char *object, const char *name) const
{
    for (const QStringList &row : rowsOf(shown())) {
        if (row.at(KvDeskValueTableModel::ObjectColumn) == QLatin1String(object) &&
            row.at(KvDeskValueTableModel::NameColumn) == QLatin1String(name))
            return row.at(KvDeskValueTableModel::ValueColumn);
    }
    return QString();
}

void DeskMeasuringTest::clickHeader(int column, int offset)
{
    QHeaderView *const header = table()->horizontalHeader();
    m_user.click(header->viewport(),
                 QPoint(header->sectionViewportPosition(column) + 12 + offset, header->height() / 2));
}

// The selected line is 2 mm long.
void DeskMeasuringTest::calibrate()
{
    m_user.press(Qt::Key_K, Qt::ControlModifier);
    QTRY_VERIFY(window()->calibrationCommands()->dialog());
    KvDeskCalibrationDialog *const dialog = window()->calibrationCommands()->dialog();
    QVERIFY(QTest::qWaitForWindowExposed(dialog));
    m_user.activate(dialog);
    m_user.click(dialog->objectiveBox()->lineEdit());
    m_user.type(QStringLiteral("10x"));
    m_user.click(dialog->knownDistance()->lengthBox());
    m_user.type(QStringLiteral("2"));
    QTRY_COMPARE(dialog->resultText(), QStringLiteral("New pixel size: 10 μm"));
    m_user.click(dialog->calibrateButton());
    QTRY_VERIFY(m_desk->document()->calibration().isCalibrated());
}

void DeskMeasuringTest::calibratesByAKnownDistance()
{
    drawLine();
    QTRY_COMPARE(value("Line 1", "Length"), QStringLiteral("200.0 px"));
    calibrate();
    KvDeskCalibrationDialog *const dialog = window()->calibrationCommands()->dialog();
    QTRY_COMPARE(value("Line 1", "Length"), QStringLiteral("2.000 mm"));
    QCOMPARE(dialog->history()->rowCount(), 1);
    QCOMPARE(dialog->history()->calibration(0).micrometresPerPixel(), 10.0);
    QCOMPARE(dialog->history()->calibration(0).objective(), QStringLiteral("10x"));
    QVERIFY2(dialog->currentText().startsWith(QStringLiteral("10 μm, 10x, Known distance")),
             qPrintable(dialog->currentText()));
    m_user.press(Qt::Key_Escape);
    QTRY_VERIFY(!window()->calibrationCommands()->dialog());

    m_user.activate(window());
    const auto *const statusBar = window()->findChild<KvDeskStatusBar *>();
    undo();
    QTRY_COMPARE(value("Line 1", "Length"), QStringLiteral("200.0 px"));
    QCOMPARE(statusBar->message(), QStringLiteral("Not calibrated"));
    redo();
    QTRY_COMPARE(value("Line 1", "Length"), QStringLiteral("2.000 mm"));
    QCOMPARE(statusBar->message(), QStringLiteral("Calibrated: 10x, 10 μm per pixel"));
}

void DeskMeasuringTest::undoTakesTheDraftBackFirst()
{
    const QAction *const undoAction = window()->actions()->action(A::Undo);
    QVERIFY(!undoAction->isEnabled());
    drawLine();
    choose(Qt::Key_P, A::PolylineTool);
    for (const QPoint &place : {QPoint(100, 150), QPoint(150, 150), QPoint(150, 200)})
        click(place.x(), place.y());
    QTRY_COMPARE(undoAction->text(), QStringLiteral("&Undo"));
    undo();
    undo();
    QVERIFY(exists(line1));
    QVERIFY(!window()->actions()->action(A::Redo)->isEnabled());
    undo();
    QTRY_COMPARE(undoAction->text(), QStringLiteral("&Undo drawing of Line 1"));
    QVERIFY(exists(line1));
    undo();
    QTRY_VERIFY(!exists(line1));
    QVERIFY(!undoAction->isEnabled());
    redo();
    QTRY_VERIFY(exists(line1));
}

void DeskMeasuringTest::drawsAndGoesBack()
{
    drawAll();
    QCOMPARE(points(line1), polygon({{60, 60}, {260, 60}}));
    QCOMPARE(points(circle1), polygon({{100, 160}, {150, 160}}));
    QCOMPARE(points(polygon1), polygon({{220, 120}, {300, 120}, {300, 200}, {220, 200}}));
    QTRY_COMPARE(value("Line 1", "Length"), QStringLiteral("200.0 px"));
    QCOMPARE(value("Circle 1", "Diameter"), QStringLiteral("100.0 px"));
    QCOMPARE(value("Polygon 1", "Area"), QStringLiteral("6400.0 px²"));

    const QVector<KvDeskObjectState> drawn = objects();
    const QVector<QStringList> rows = rowsOf(shown());
    for (const KvDeskObjectId &last : {polygon1, circle1, line1}) {
        QVERIFY(exists(last));
        undo();
        QTRY_VERIFY(!exists(last));
    }
    QTRY_COMPARE(shown()->rowCount(), 0);
    for (const KvDeskObjectId &next : {line1, circle1, polygon1}) {
        redo();
        QTRY_VERIFY(exists(next));
    }
    QVERIFY(objects() == drawn);
    QTRY_COMPARE(rowsOf(shown()), rows);
}

void DeskMeasuringTest::changesByMouseAndKeys()
{
    drawLine();
    choose(Qt::Key_V, A::SelectTool);
    click(360, 260);
    QTRY_VERIFY(selection()->isEmpty());
    click(160, 60);
    QTRY_COMPARE(selection()->current(), line1);

    // By its end.
    stroke({260, 60}, {160, 60});
    QTRY_COMPARE(points(line1), polygon({{60, 60}, {160, 60}}));
    QTRY_COMPARE(value("Line 1", "Length"), QStringLiteral("100.0 px"));
    undo();
    QTRY_COMPARE(points(line1), polygon({{60, 60}, {260, 60}}));
    QTRY_COMPARE(value("Line 1", "Length"), QStringLiteral("200.0 px"));
    redo();
    QTRY_COMPARE(points(line1), polygon({{60, 60}, {160, 60}}));

    m_user.press(Qt::Key_Right);
    m_user.press(Qt::Key_Right);
    m_user.press(Qt::Key_Down, Qt::ShiftModifier);
    QTRY_COMPARE(points(line1), polygon({{62, 70}, {162, 70}}));
    QTRY_COMPARE(value("Line 1", "Length"), QStringLiteral("100.0 px"));
    undo();
    QTRY_COMPARE(points(line1), polygon({{60, 60}, {160, 60}}));
    redo();
    QTRY_COMPARE(points(line1), polygon({{62, 70}, {162, 70}}));

    m_user.press(Qt::Key_Delete);
    QTRY_VERIFY(!exists(line1));
    QTRY_COMPARE(shown()->rowCount(), 0);
    undo();
    QTRY_COMPARE(points(line1), polygon({{62, 70}, {162, 70}}));
    QTRY_COMPARE(value("Line 1", "Length"), QStringLiteral("100.0 px"));
    redo();
    QTRY_VERIFY(!exists(line1));
}

void DeskMeasuringTest::countsClasses()
{
    choose(Qt::Key_N, A::CounterTool);
    for (int i = 0; i < 3; ++i)
        click(80 + 40 * i, 160);
    QTRY_COMPARE(points(counter1).size(), 3);
    QTRY_COMPARE(value("Counter 1", "Count"), QStringLiteral("3 pcs"));
    QCOMPARE(value("Counter 1", "Share"), QStringLiteral("100.00 %"));

    m_user.click(view()->findChild<KvDeskCounterBar *>()->newClassButton());
    QTRY_COMPARE(selection()->current(), counter2);
    click(240, 160);
    QTRY_COMPARE(points(counter2).size(), 1);
    QTRY_COMPARE(value("Counter 2", "Count"), QStringLiteral("1 pcs"));
    QCOMPARE(value("Counter 2", "Share"), QStringLiteral("25.000 %"));
    QCOMPARE(value("Counter 1", "Share"), QStringLiteral("75.000 %"));
    undo();
    QTRY_COMPARE(value("Counter 1", "Share"), QStringLiteral("100.00 %"));
    QCOMPARE(points(counter1).size(), 3);
}

void DeskMeasuringTest::tableAndImageSelectTheSame()
{
    drawAll();
    QTRY_COMPARE(shown()->index(0, 1).data().toString(), QStringLiteral("Line 1"));
    clickRow(0, 0);
    QTRY_COMPARE(selection()->current(), line1);
    QCOMPARE(selection()->objects().size(), 1);
    QCOMPARE(selectedRows(), QStringList(QStringLiteral("Line\tLine 1\tLength\t200.0 px")));

    click(380, 280);
    choose(Qt::Key_V, A::SelectTool);
    click(150, 160);
    QTRY_COMPARE(selection()->current(), circle1);
    QTRY_VERIFY(selectedRows().size() > 1);
    for (const QString &row : selectedRows())
        QVERIFY2(row.startsWith(QLatin1String("Circle\tCircle 1\t")), qPrintable(row));
}

void DeskMeasuringTest::tableSortsFiltersAndCopies()
{
    drawAll();
    // Which is drawn last.
    QTRY_VERIFY(!value("Polygon 1", "Area").isEmpty());
    const int all = shown()->rowCount();
    clickHeader(KvDeskValueTableModel::TypeColumn);
    QTRY_COMPARE(shown()->index(0, 0).data().toString(), QStringLiteral("Circle"));
    QCOMPARE(shown()->index(all - 1, 0).data().toString(), QStringLiteral("Polygon"));
    // Elsewhere, lest it be a double click.
    clickHeader(KvDeskValueTableModel::TypeColumn, 20);
    QTRY_COMPARE(shown()->index(0, 0).data().toString(), QStringLiteral("Polygon"));

    m_user.press(Qt::Key_F, Qt::ControlModifier);
    QTRY_VERIFY(window()->valueTable()->filterField()->hasFocus());
    m_user.type(QStringLiteral("circle dia"));
    QTRY_COMPARE(shown()->rowCount(), 1);
    QCOMPARE(value("Circle 1", "Diameter"), QStringLiteral("100.0 px"));
    m_user.press(Qt::Key_Return);
    QTRY_VERIFY(table()->hasFocus());
    clickRow(0, 0);
    QTRY_COMPARE(selection()->current(), circle1);
    m_user.press(Qt::Key_C, Qt::ControlModifier);
    QTRY_COMPARE(QGuiApplication::clipboard()->text(),
                 QStringLiteral("Type\tObject\tValue name\tValue\nCircle\tCircle 1\tDiameter\t100.0 px\n"));

    m_user.press(Qt::Key_F, Qt::ControlModifier);
    QTRY_VERIFY(window()->valueTable()->filterField()->hasFocus());
    m_user.press(Qt::Key_Escape);
    QTRY_COMPARE(shown()->rowCount(), all);
}

void DeskMeasuringTest::exportsAndImportsAgain()
{
    drawAll();
    QTRY_VERIFY(!value("Polygon 1", "Area").isEmpty());
    const QVector<QStringList> before = rowsOf(shown());
    const QString path = temporaryPath(QStringLiteral("values.csv"));
    const ExportDialogAnswerer exportDialog(ZtTableExport::TidyCsv);
    const FileDialogAnswerer dialogs({path, path});
    m_user.press(Qt::Key_E, Qt::ControlModifier);
    QTRY_VERIFY(QFile::exists(path));
    const QList<QByteArray> lines = DeskFiles::bytes(path).trimmed().split('\n');
    QCOMPARE(lines.size(), before.size() + 1);

    m_user.activate(window());
    m_user.press(Qt::Key_I, Qt::ControlModifier);
    QTRY_COMPARE(shown()->rowCount(), 2 * before.size());
    QCOMPARE(window()->session()->objectCount(), 6);
    QCOMPARE(dialogs.dialogs().size(), 2);
    // Those of the file come last; all digits that it has are kept.
    const KvDeskValueTableModel *const model = window()->valueTable()->model();
    for (int row = 0; row < before.size(); ++row) {
        const int imported = row + before.size();
        for (const int column : {KvDeskValueTableModel::TypeColumn, KvDeskValueTableModel::ObjectColumn,
                                 KvDeskValueTableModel::NameColumn})
            QCOMPARE(model->text(imported, column), model->text(row, column));
        QCOMPARE(KvDeskValueTableModel::unitOf(model->text(imported, KvDeskValueTableModel::ValueColumn)),
                 KvDeskValueTableModel::unitOf(model->text(row, KvDeskValueTableModel::ValueColumn)));
        QCOMPARE(model->row(imported).value, model->row(row).value);
        QVERIFY(model->row(imported).object != model->row(row).object);
    }
}

void DeskMeasuringTest::savesAndReopens()
{
    drawAll();
    choose(Qt::Key_V, A::SelectTool);
    click(160, 60);
    QTRY_COMPARE(selection()->current(), line1);
    calibrate();
    m_user.press(Qt::Key_Escape);
    QTRY_VERIFY(!window()->calibrationCommands()->dialog());
    m_user.activate(window());
    QTRY_COMPARE(value("Line 1", "Length"), QStringLiteral("2.000 mm"));
    const QVector<KvDeskObjectState> saved = objects();
    const QVector<QStringList> rows = rowsOf(shown());
    const ZtCalibration calibration = m_desk->document()->calibration();
    QCOMPARE(saved.size(), 3);
    QVERIFY(window()->session()->isModified());

    const QString path = temporaryPath(QStringLiteral("plate.json"));
    const FileDialogAnswerer dialogs({path, path});
    const MessageBoxAnswerer boxes(QMessageBox::Cancel);
    m_user.press(Qt::Key_S, Qt::ControlModifier);
    QTRY_COMPARE(window()->session()->path(), path);
    QTRY_VERIFY(!window()->session()->isModified());
    QVERIFY(window()->close());
    m_desk.reset();
    start();
    QCOMPARE(window()->session()->objectCount(), 0);

    m_user.press(Qt::Key_O, Qt::ControlModifier | Qt::ShiftModifier);
    QTRY_COMPARE(window()->session()->path(), path);
    QVERIFY(objects() == saved);
    QCOMPARE(m_desk->document()->calibration(), calibration);
    QTRY_COMPARE(rowsOf(shown()), rows);
    QCOMPARE(m_desk->document()->kernelImage()->frame().size(), QSize(400, 300));
    QVERIFY(!window()->session()->isModified());
    QVERIFY(boxes.boxes().isEmpty());
}

void DeskMeasuringTest::openEditorWithTable()
{
    m_user.click(m_desk->button("theEditorButton"));
    QVERIFY(m_desk->placeEditor());
    m_user.activate(m_desk->editor());
    const QList<QWidget *> palette = m_desk->palette();
    QCOMPARE(palette.size(), 8);
    if (!palette.at(3)->isVisible())
        m_user.click(m_desk->paletteGroup(), QPoint(40, 12));
    QTRY_VERIFY(palette.at(3)->isVisible());
    QTest::qWait(100);
    m_user.drag(palette.at(3), palette.at(3)->rect().center(), m_desk->pages()->viewport(), QPoint(150, 100));
    QTRY_COMPARE(m_desk->pieces().size(), 1);
}

void DeskMeasuringTest::openStatistics()
{
    m_user.activate(window());
    m_user.click(m_desk->button("theStatisticsButton"));
    QTRY_VERIFY(m_desk->statisticsWindow() && m_desk->statisticsWindow()->isVisible());
    QVERIFY(QTest::qWaitForWindowExposed(m_desk->statisticsWindow()));
    m_desk->statisticsWindow()->move(860, 400);
    m_user.activate(m_desk->statisticsWindow());
    QTest::qWait(100);
    for (QWidget *const widget : m_desk->statisticsWindow()->findChildren<QWidget *>()) {
        if (widget->inherits("KvStatisticsToolIconButton")) {
            m_user.click(widget);
            break;
        }
    }
    QTRY_VERIFY(!statistics().isEmpty());
}

void DeskMeasuringTest::reportAndStatisticsFollow()
{
    window()->actions()->action(A::ShowValues)->setChecked(false);
    window()->resize(860, 700);
    drawLine();
    openEditorWithTable();
    QTRY_VERIFY(hasText(tableOnPage(), "Line 1"));
    openStatistics();
    QTRY_COMPARE(average(), QStringLiteral("200.000"));
    const QVector<QStringList> onPage = tableOnPage();
    const QVector<QStringList> inWindow = statistics();

    m_user.activate(window());
    choose(Qt::Key_L, A::LineTool);
    stroke({60, 120}, {160, 120});
    QTRY_VERIFY(hasText(tableOnPage(), "Line 2"));
    QCOMPARE(tableOnPage().size(), onPage.size() + 1);
    QTRY_COMPARE(average(), QStringLiteral("150.000"));
    QCOMPARE(statistics().size(), inWindow.size());

    undo();
    QTRY_COMPARE(tableOnPage(), onPage);
    QTRY_COMPARE(statistics(), inWindow);
    redo();
    QTRY_VERIFY(hasText(tableOnPage(), "Line 2"));
}

STATREPORT_TEST_MAIN(DeskMeasuringTest)
#include "DeskMeasuringTest.moc"
