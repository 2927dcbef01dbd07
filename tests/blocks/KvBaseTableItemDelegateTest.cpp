// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "PlainTable.h"
#include "TableProbe.h"
#include "blocks/table/KvBaseTableItemDelegate.h"
#include "blocks/table/KvTableContents.h"
#include "blocks/table/KvTableFonts.h"
#include "charts/KvChartThemes.h"
#include "templates/KvStatisticsThemedNodeCfg.h"
#include "templates/KvTemplateContext.h"

#include <QHelpEvent>
#include <QPainter>
#include <QStandardItemModel>
#include <QTableView>
#include <QToolTip>

using kvCharts::KvChartThemes;

namespace {

constexpr int rowHeight = 32;

/** Letters that fill their whole box: any pixel inside shows the exact text colour. */
QString blocks(int count)
{
    return QString(count, QChar(0x2588));
}

QFont font()
{
    return KvTableFonts::body();
}

/** Paints one cell of the given size by the item view's way of painting. */
QImage paintCell(const KvBaseTableItemDelegate &delegate, const QStandardItemModel &model, const QSize &size)
{
    QImage image(size, QImage::Format_RGB32);
    image.fill(Qt::magenta);
    QPainter painter(&image);
    QStyleOptionViewItem option;
    option.rect = image.rect();
    option.font = font();
    delegate.paint(&painter, option, model.index(0, 0));
    return image;
}

/** Paints all rows of \a contents at (0, 0). */
QImage paintRows(const KvBaseTableItemDelegate &delegate, const std::shared_ptr<KvTableContents> &contents,
                 int width)
{
    KvStatisticsBaseTableWidgetModel model;
    model.setPart(contents, 0, contents->body.rowCount());
    QImage image(width, model.rowCount() * rowHeight, QImage::Format_RGB32);
    image.fill(Qt::magenta);
    KvBaseTableItemDelegate::Geometry geometry;
    geometry.rowHeight = rowHeight;
    geometry.columnEdges = model.columnEdges(0, width);
    QPainter painter(&image);
    delegate.paintRows(&painter, model, geometry, 0, model.rowCount() - 1);
    return image;
}

std::shared_ptr<KvTableContents> makeContents()
{
    auto contents = std::make_shared<KvTableContents>();
    contents->headerFont = font();
    contents->bodyFont = font();
    return contents;
}

bool hasColor(const QImage &image, const QRect &area, const QColor &color)
{
    for (int y = area.top(); y <= area.bottom(); ++y) {
        for (int x = area.left(); x <= area.right(); ++x) {
            if (image.pixelColor(x, y) == color)
                return true;
        }
    }
    return false;
}

bool isOneColor(const QImage &image, const QRect &area, const QColor &color)
{
    for (int y = area.top(); y <= area.bottom(); ++y) {
        for (int x = area.left(); x <= area.right(); ++x) {
            if (image.pixelColor(x, y) != color)
                return false;
        }
    }
    return true;
}

/** What the offscreen platform says of every tool tip. */
void expectRaiseWarning()
{
    StatReportTest::expectWarning(
        QRegularExpression(QStringLiteral("^This plugin does not support raise\\(\\)$")));
}

void addThemes()
{
    QTest::addColumn<int>("theme");
    QTest::addColumn<QColor>("background");
    QTest::addColumn<QColor>("text");
    QTest::newRow("Dark") << 0 << QColor("#4D4D4D") << QColor("#F0F0F1");
    QTest::newRow("Light") << 1 << QColor("#DDDDDD") << QColor("#141414");
}

} // namespace

class KvBaseTableItemDelegateTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void cleanup();
    void invalidColorsTakeTheThemes_data() { addThemes(); }
    void invalidColorsTakeTheThemes();
    void validColorsAreTaken();
    void rowsTakeTheThemesColors_data() { addThemes(); }
    void rowsTakeTheThemesColors();
    void flaggedTextIsRedInBothThemes_data() { addThemes(); }
    void flaggedTextIsRedInBothThemes();
    void coversItsWholeCell();
    void textIsLeftAndVerticallyCentered();
    void wideTextIsShortened();
    void shortenedTextsEndWithAnEllipsis();
    void headerSpansCoverTheColumnsBehind();
    void bodySpansAreNotApplied();
    void paintsOnlyTheRowsAskedFor();
    void nothingToPaint();
    void cellsLeaveRoomForGridLines();
    void fontsOfTheCellsAreUsed();
    void toolTipsShowWhatIsCut();
    void toolTipsShowTextsLiterally();
};

void KvBaseTableItemDelegateTest::cleanup()
{
    QToolTip::hideText();
    StatReportTest::cleanup();
}

void KvBaseTableItemDelegateTest::invalidColorsTakeTheThemes()
{
    QFETCH(int, theme);
    QFETCH(QColor, background);
    QFETCH(QColor, text);
    KvChartThemes themes;
    themes.setTheme(static_cast<KvChartThemes::ThemeType>(theme));
    const KvBaseTableItemDelegate delegate(&themes);

    QStandardItemModel model(1, 1);
    model.setData(model.index(0, 0), blocks(4), Qt::DisplayRole);
    const QImage bare = paintCell(delegate, model, QSize(120, rowHeight)); // no colour roles at all
    model.setData(model.index(0, 0), QColor(), Qt::BackgroundRole);
    model.setData(model.index(0, 0), QColor(), Qt::ForegroundRole);
    const QImage invalid = paintCell(delegate, model, QSize(120, rowHeight)); // invalid colours

    for (const QImage &image : {bare, invalid}) {
        QCOMPARE(image.pixelColor(2, 2), background);
        QCOMPARE(image.pixelColor(118, 30), background);
        QCOMPARE(image.pixelColor(12, 16), text);
    }
}

void KvBaseTableItemDelegateTest::validColorsAreTaken()
{
    KvChartThemes themes;
    const KvBaseTableItemDelegate delegate(&themes);
    QStandardItemModel model(1, 1);
    model.setData(model.index(0, 0), blocks(4), Qt::DisplayRole);
    model.setData(model.index(0, 0), QColor(Qt::green), Qt::BackgroundRole);
    model.setData(model.index(0, 0), QColor(Qt::blue), Qt::ForegroundRole);
    const QImage image = paintCell(delegate, model, QSize(120, rowHeight));
    QCOMPARE(image.pixelColor(2, 2), QColor(Qt::green));
    QCOMPARE(image.pixelColor(12, 16), QColor(Qt::blue));
}

void KvBaseTableItemDelegateTest::rowsTakeTheThemesColors()
{
    QFETCH(int, theme);
    QFETCH(QColor, background);
    QFETCH(QColor, text);
    KvChartThemes themes;
    themes.setTheme(static_cast<KvChartThemes::ThemeType>(theme));
    const KvBaseTableItemDelegate delegate(&themes);
    const std::shared_ptr<KvTableContents> contents = makeContents();
    contents->header.setCell(0, 0, blocks(4), QColor(), 1);
    contents->body.setCell(0, 0, blocks(4), QColor(), 1);
    const QImage image = paintRows(delegate, contents, 120);
    for (const int top : {0, rowHeight}) {
        QCOMPARE(image.pixelColor(2, top + 2), background);
        QCOMPARE(image.pixelColor(12, top + 16), text);
    }
}

void KvBaseTableItemDelegateTest::flaggedTextIsRedInBothThemes()
{
    QFETCH(int, theme);
    QFETCH(QColor, background);
    QFETCH(QColor, text);
    KvTemplateContext context(nullptr);
    KvStatisticsThemedNodeCfg cfg(&context);
    cfg.setTheme(theme);
    for (const bool printing : {false, true}) {
        context.setPrinting(printing);
        PlainTable table(&cfg);
        table.width = 100;
        table.setHeaderCell(0, 0, QString(), 1);
        table.setCell(0, 0, blocks(4), true, 1);
        table.setCell(1, 0, blocks(4), false, 1);
        table.finishUpdate();
        const QImage image = TableProbe::pagePicture(table.subWidgetAt(0), !printing);
        // The page's margin is 8, the piece's own 5.
        QCOMPARE(image.pixelColor(8 + 12, 8 + 5 + 32 + 16), QColor("#A90909"));
        QCOMPARE(image.pixelColor(8 + 12, 8 + 5 + 64 + 16), text);
        QCOMPARE(image.pixelColor(8 + 2, 8 + 5 + 32 + 3), background);
    }
}

void KvBaseTableItemDelegateTest::coversItsWholeCell()
{
    KvChartThemes themes;
    const KvBaseTableItemDelegate delegate(&themes);
    const std::shared_ptr<KvTableContents> contents = makeContents();
    contents->header.setCell(0, 0, QStringLiteral("a"), QColor(), 1);
    contents->body.setCell(2, 2, QStringLiteral("b"), QColor(), 1); // with empty positions before it
    const QImage image = paintRows(delegate, contents, 101);
    QVERIFY(!hasColor(image, image.rect(), Qt::magenta));
    QStandardItemModel model(1, 1);
    QVERIFY(isOneColor(paintCell(delegate, model, QSize(40, 20)), QRect(0, 0, 40, 20), QColor("#4D4D4D")));
}

void KvBaseTableItemDelegateTest::textIsLeftAndVerticallyCentered()
{
    KvChartThemes themes;
    const KvBaseTableItemDelegate delegate(&themes);
    QStandardItemModel model(1, 1);
    model.setData(model.index(0, 0), QStringLiteral("HHH"), Qt::DisplayRole);
    const QImage image = paintCell(delegate, model, QSize(200, rowHeight));
    const QColor background = themes.color(KvChartThemes::TableBackground);
    QRegion ink;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (image.pixelColor(x, y) != background)
                ink += QRect(x, y, 1, 1);
        }
    }
    const QRect text = ink.boundingRect();
    QVERIFY(text.left() >= 4 && text.left() <= 10);
    QVERIFY(text.right() < 60);
    // Capitals stand a little above the middle of the line.
    QVERIFY2(qAbs(text.center().y() - rowHeight / 2) <= 2, qPrintable(QString::number(text.center().y())));
}

void KvBaseTableItemDelegateTest::wideTextIsShortened()
{
    KvChartThemes themes;
    const KvBaseTableItemDelegate delegate(&themes);
    QStandardItemModel model(1, 1);
    model.setData(model.index(0, 0), blocks(400), Qt::DisplayRole);
    const QImage image = paintCell(delegate, model, QSize(100, rowHeight));
    const QColor background = themes.color(KvChartThemes::TableBackground);
    QVERIFY(isOneColor(image, QRect(0, 0, 5, rowHeight), background));
    QVERIFY(isOneColor(image, QRect(96, 0, 4, rowHeight), background));
    QCOMPARE(image.pixelColor(12, 16), themes.color(KvChartThemes::TableText));

    // A cell too narrow for its padding shows no text at all.
    QVERIFY(
        isOneColor(paintCell(delegate, model, QSize(12, rowHeight)), QRect(0, 0, 12, rowHeight), background));
}

void KvBaseTableItemDelegateTest::shortenedTextsEndWithAnEllipsis()
{
    KvChartThemes themes;
    const KvBaseTableItemDelegate delegate(&themes);
    const QString text = QStringLiteral("Rectangle with a very long name");
    const int natural = QFontMetrics(font()).horizontalAdvance(text);
    QVERIFY(!delegate.isShortened(text, font(), natural + 14));
    QVERIFY(delegate.isShortened(text, font(), natural + 8));
    QVERIFY(delegate.isShortened(text, font(), 60));
    QVERIFY(!delegate.isShortened(QString(), font(), 60));

    // The picture of the cut text is that of a shorter text with an ellipsis.
    const QString cut = QFontMetricsF(font()).elidedText(text, Qt::ElideRight, 100 - 12);
    QVERIFY(cut.endsWith(QChar(0x2026)));
    QStandardItemModel model(1, 1);
    model.setData(model.index(0, 0), text, Qt::DisplayRole);
    const QImage shortened = paintCell(delegate, model, QSize(100, rowHeight));
    model.setData(model.index(0, 0), cut, Qt::DisplayRole);
    QCOMPARE(shortened, paintCell(delegate, model, QSize(100, rowHeight)));
    model.setData(model.index(0, 0), QStringLiteral("Rectangle"), Qt::DisplayRole);
    QVERIFY(shortened != paintCell(delegate, model, QSize(100, rowHeight)));
}

void KvBaseTableItemDelegateTest::headerSpansCoverTheColumnsBehind()
{
    KvChartThemes themes;
    const KvBaseTableItemDelegate delegate(&themes);
    const std::shared_ptr<KvTableContents> contents = makeContents();
    contents->header.setCell(0, 0, blocks(100), QColor(), 2);
    contents->header.setCell(0, 2, QString(), QColor(), 1);
    const QImage image = paintRows(delegate, contents, 300);
    const QColor text = themes.color(KvChartThemes::TableText);
    QVERIFY(hasColor(image, QRect(96, 10, 8, 12), text)); // across the first boundary
    QVERIFY(hasColor(image, QRect(150, 10, 8, 12), text));
    QVERIFY(!hasColor(image, QRect(196, 0, 104, rowHeight), text)); // not across the second

    // A cell that another one covers is hidden.
    const std::shared_ptr<KvTableContents> covered = makeContents();
    covered->header.setCell(0, 0, QStringLiteral("a"), QColor(), 2);
    covered->header.setCell(0, 1, blocks(4), QColor(), 1);
    covered->header.setCell(0, 2, QString(), QColor(), 1);
    QVERIFY(!hasColor(paintRows(delegate, covered, 300), QRect(60, 0, 240, rowHeight), text));
}

void KvBaseTableItemDelegateTest::bodySpansAreNotApplied()
{
    KvChartThemes themes;
    const KvBaseTableItemDelegate delegate(&themes);
    const std::shared_ptr<KvTableContents> contents = makeContents();
    contents->body.setCell(0, 0, blocks(100), QColor(), 3);
    contents->body.setCell(0, 1, QString(), QColor(), 1);
    contents->body.setCell(0, 2, blocks(4), QColor(), 1);
    const QImage image = paintRows(delegate, contents, 300);
    const QColor text = themes.color(KvChartThemes::TableText);
    QVERIFY(hasColor(image, QRect(10, 10, 80, 12), text));
    QVERIFY(!hasColor(image, QRect(95, 0, 106, rowHeight), text));
    QVERIFY(hasColor(image, QRect(206, 10, 20, 12), text));
}

void KvBaseTableItemDelegateTest::paintsOnlyTheRowsAskedFor()
{
    KvChartThemes themes;
    const KvBaseTableItemDelegate delegate(&themes);
    const std::shared_ptr<KvTableContents> contents = makeContents();
    for (int row = 0; row < 5; ++row)
        contents->body.setCell(row, 0, blocks(3), QColor(), 1);
    KvStatisticsBaseTableWidgetModel model;
    model.setPart(contents, 0, 5);
    QImage image(100, 5 * rowHeight, QImage::Format_RGB32);
    image.fill(Qt::magenta);
    KvBaseTableItemDelegate::Geometry geometry;
    geometry.rowHeight = rowHeight;
    geometry.columnEdges = {0, 100};
    QPainter painter(&image);
    delegate.paintRows(&painter, model, geometry, 1, 2);
    painter.end();
    QVERIFY(isOneColor(image, QRect(0, 0, 100, rowHeight), Qt::magenta));
    QVERIFY(!hasColor(image, QRect(0, rowHeight, 100, 2 * rowHeight), Qt::magenta));
    QVERIFY(isOneColor(image, QRect(0, 3 * rowHeight, 100, 2 * rowHeight), Qt::magenta));
}

void KvBaseTableItemDelegateTest::nothingToPaint()
{
    KvChartThemes themes;
    const KvBaseTableItemDelegate delegate(&themes);
    const KvStatisticsBaseTableWidgetModel model;
    QImage image(10, 10, QImage::Format_RGB32);
    image.fill(Qt::magenta);
    QPainter painter(&image);
    KvBaseTableItemDelegate::Geometry geometry;
    geometry.rowHeight = rowHeight;
    delegate.paintRows(&painter, model, geometry, 0, 3); // no columns
    geometry.columnEdges = {0, 10};
    delegate.paintRows(&painter, model, geometry, 0, -1); // no rows
    painter.end();
    QVERIFY(isOneColor(image, image.rect(), Qt::magenta));
}

void KvBaseTableItemDelegateTest::cellsLeaveRoomForGridLines()
{
    KvBaseTableItemDelegate::Geometry geometry;
    geometry.columnEdges = {10, 43, 76, 111};
    geometry.top = 5;
    geometry.rowHeight = 32;
    QCOMPARE(geometry.cellRect(0, 0, 1), QRect(10, 5, 32, 31));
    QCOMPARE(geometry.cellRect(2, 1, 1), QRect(43, 69, 32, 31));
    QCOMPARE(geometry.cellRect(1, 0, 2), QRect(10, 37, 65, 31));
    QCOMPARE(geometry.cellRect(0, 1, 9), QRect(43, 5, 67, 31)); // a span ends at the last column
}

void KvBaseTableItemDelegateTest::fontsOfTheCellsAreUsed()
{
    KvChartThemes themes;
    const KvBaseTableItemDelegate delegate(&themes);
    QStandardItemModel model(1, 1);
    model.setData(model.index(0, 0), QStringLiteral("Name"), Qt::DisplayRole);
    const QImage plain = paintCell(delegate, model, QSize(100, rowHeight));
    model.setData(model.index(0, 0), KvTableFonts::header(), Qt::FontRole);
    const QImage heavy = paintCell(delegate, model, QSize(100, rowHeight));
    QVERIFY(plain != heavy);
    // More fonts than a table has are used one after the other, too.
    for (int size = 8; size < 24; ++size) {
        QFont other = font();
        other.setPixelSize(size);
        model.setData(model.index(0, 0), other, Qt::FontRole);
        paintCell(delegate, model, QSize(100, rowHeight));
    }
    model.setData(model.index(0, 0), KvTableFonts::header(), Qt::FontRole);
    QCOMPARE(paintCell(delegate, model, QSize(100, rowHeight)), heavy);
}

void KvBaseTableItemDelegateTest::toolTipsShowWhatIsCut()
{
    const QString longText = QStringLiteral("A name that is a good deal longer than its column is wide");
    KvTemplateContext context(nullptr);
    KvStatisticsThemedNodeCfg cfg(&context);
    PlainTable table(&cfg);
    table.width = 20;
    table.setHeaderCell(0, 0, QStringLiteral("H"), 1);
    table.setCell(0, 0, longText, false, 1);
    table.finishUpdate();
    QWidget *piece = table.subWidgetAt(0);
    QVERIFY(piece);
    piece->show();
    QVERIFY(QTest::qWaitForWindowExposed(piece));
    QTableView *view = TableProbe::piece(piece)->tableView();

    const auto askAt = [view](const QPoint &position) {
        QHelpEvent event(QEvent::ToolTip, position, view->viewport()->mapToGlobal(position));
        QCoreApplication::sendEvent(view->viewport(), &event);
    };
    expectRaiseWarning();
    askAt(QPoint(20, 48));
    QVERIFY(QToolTip::isVisible());
    QCOMPARE(QToolTip::text(), longText);
    askAt(QPoint(20, 16)); // the header's text is whole
    QTRY_VERIFY_WITH_TIMEOUT(!QToolTip::isVisible(), 5000);
}

void KvBaseTableItemDelegateTest::toolTipsShowTextsLiterally()
{
    const QString markup =
        QStringLiteral("<b>Edge</b> 12 < 14 and a good many words after that, and some more");
    KvTemplateContext context(nullptr);
    KvStatisticsThemedNodeCfg cfg(&context);
    PlainTable table(&cfg);
    table.width = 20;
    table.setCell(0, 0, markup, false, 1);
    table.finishUpdate();
    QWidget *piece = table.subWidgetAt(0);
    QVERIFY(piece);
    piece->show();
    QVERIFY(QTest::qWaitForWindowExposed(piece));
    QTableView *view = TableProbe::piece(piece)->tableView();
    expectRaiseWarning();
    QHelpEvent event(QEvent::ToolTip, QPoint(20, 16), view->viewport()->mapToGlobal(QPoint(20, 16)));
    QCoreApplication::sendEvent(view->viewport(), &event);
    QVERIFY(QToolTip::isVisible());
    QTextDocument shown;
    if (Qt::mightBeRichText(QToolTip::text()))
        shown.setHtml(QToolTip::text());
    else
        shown.setPlainText(QToolTip::text());
    QCOMPARE(shown.toPlainText(), markup);
}

STATREPORT_TEST_MAIN(KvBaseTableItemDelegateTest)
#include "KvBaseTableItemDelegateTest.moc"
