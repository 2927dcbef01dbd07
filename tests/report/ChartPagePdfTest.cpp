// SPDX-License-Identifier: MIT
#include "PagedViewTools.h"
#include "PdfFile.h"
#include "blocks/ChartBlocks.h"
#include "blocks/ChartMeasurements.h"
#include "blocks/KvReportBlocks.h"
#include "blocks/table/KvStatisticSubTable.h"
#include "charts/KvTextMeasure.h"
#include "charts/KvTextRunItem.h"
#include "report/KvReportNode.h"
#include "report/KvReportPage.h"
#include "support/StatReportTest.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvTemplateModel.h"

#include <QGraphicsScene>
#include <QGraphicsTextItem>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QPainter>
#include <QScrollBar>
#include <QTableView>

using namespace PagedViewTools;

namespace {

constexpr int kPageWidth = 952;                                      // pixels
constexpr double kPointsPerPixel = 4960 / 600.0 * 72.0 / kPageWidth; // A4 in whole pixels of 600 dpi

const char kStatisticsTable[] = "Statistics Table";

/** A text on the page and the place of its first letter's left edge, in the middle of its height. */
struct PageText
{
    QString text;
    QPointF place; ///< in points from the page's top left corner
};

/** How much two pictures of a page differ, once both are blurred to a quarter of the page's width. */
struct Difference
{
    double mean = 0;  ///< over all pixels of the block, of 255
    double share = 0; ///< of the block's pixels that differ clearly
};

constexpr int kBlurredWidth = kPageWidth / 4;
constexpr int kClear = 48; // of 255, in the channel that differs most

QImage blurred(const QImage &page)
{
    return page.scaledToWidth(kBlurredWidth, Qt::SmoothTransformation).convertToFormat(QImage::Format_RGB32);
}

/** \a part is in pixels of the page. */
Difference differenceOf(const QImage &first, const QImage &second, const QRect &part)
{
    const QImage a = blurred(first);
    const QImage b = blurred(second);
    const QRect rect = QRect(part.topLeft() / 4, part.size() / 4) & a.rect() & b.rect();
    double sum = 0;
    int clear = 0;
    for (int y = rect.top(); y <= rect.bottom(); ++y) {
        for (int x = rect.left(); x <= rect.right(); ++x) {
            const QRgb p = a.pixel(x, y);
            const QRgb q = b.pixel(x, y);
            const int difference =
                std::max({qAbs(qRed(p) - qRed(q)), qAbs(qGreen(p) - qGreen(q)), qAbs(qBlue(p) - qBlue(q))});
            sum += difference;
            clear += difference > kClear ? 1 : 0;
        }
    }
    const int pixels = rect.width() * rect.height();
    return {sum / pixels, static_cast<double>(clear) / pixels};
}

/** Empty when a difference is within its limits. */
QString misfit(const Difference &difference, const Difference &limit)
{
    if (difference.mean < limit.mean && difference.share < limit.share)
        return QString();
    return QStringLiteral("mean %1, share %2").arg(difference.mean).arg(difference.share);
}

QJsonObject blockOf(const QString &name, const QString &theme, int percent)
{
    QJsonObject config{{"theme", theme}, {"alignment", 132}, {"widthPercent", percent}};
    if (name == QLatin1String(kStatisticsTable)) {
        config[QStringLiteral("alignment")] = 4;
        config[QStringLiteral("columns")] = QStringLiteral("Min;Max;Average;Sigma");
    }
    if (name != QLatin1String("Counters"))
        config[QStringLiteral("groupBy")] = 1;
    return {{"name", name}, {"config", config}};
}

QVector<ChartObject> objects()
{
    QVector<ChartObject> objects;
    for (const double length : {11.0, 13.5, 17.25, 12.0, 19.75})
        objects.append(ChartMeasurements::line(QStringLiteral("edge"), length));
    for (const double diameter : {4.5, 6.25, 9.0})
        objects.append(ChartMeasurements::circle(QStringLiteral("hole"), diameter));
    objects.append(ChartMeasurements::counter(QStringLiteral("cells"), 3));
    objects.append(ChartMeasurements::counter(QStringLiteral("pores"), 7));
    objects.append(ChartMeasurements::counter(QStringLiteral("grains"), 12));
    return objects;
}

} // namespace

/** Charts and statistics tables look alike on the pages of the view and on paper. */
class ChartPagePdfTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void initTestCase() { registerReportBlocks(m_blocks); }
    void init();
    void cleanup();
    void pageAndPaperAgree_data() { addRows(); }
    void pageAndPaperAgree();
    void textsStandWhereTheyAreShown_data() { addRows(); }
    void textsStandWhereTheyAreShown();
    void paperHoldsNoPictures_data() { addRows(); }
    void paperHoldsNoPictures();
    void aShiftWouldBeNoticed();

private:
    static void addRows()
    {
        QTest::addColumn<QString>("block");
        QTest::addColumn<QString>("theme");
        QTest::addColumn<int>("percent");
        for (const QString &block : ChartBlocks::names() + QStringList(QLatin1String(kStatisticsTable))) {
            for (const QString &theme : {QStringLiteral("Light"), QStringLiteral("Dark")}) {
                for (const int percent : {30, 75, 100}) {
                    QTest::addRow("%s, %s, %d %%", qPrintable(block), qPrintable(theme), percent)
                        << block << theme << percent;
                }
            }
        }
    }

    /** Loads a report of the row's block, shows it, and takes pictures of its page. */
    void showBlock();
    void print();
    QPointF pagePoints(const QPointF &scenePoint) const
    {
        return (scenePoint - m_view->pages().first()->pageRect().topLeft()) * kPointsPerPixel;
    }
    /** The block's piece on its page, in pixels of the page. */
    QRect pieceRect() const
    {
        const KvReportProxyWidgetItem *item = m_view->pieceItems().first();
        return QRectF(item->scenePos() - m_view->pages().first()->pageRect().topLeft(), item->size())
            .toAlignedRect();
    }
    QImage grabbedPage() const;
    /** The page as the view would show it twice as large. */
    QImage magnifiedPage() const;
    QVector<PageText> chartTexts() const;
    void compareTableTexts(const QVector<PdfWord> &words) const;
    /** Scene point of a point of a widget that stands in the block's item. */
    QPointF scenePointOf(const QWidget *widget, const QPointF &point) const
    {
        const KvReportProxyWidgetItem *item = m_view->pieceItems().first();
        return item->scenePos() + widget->mapTo(item->widget(), QPoint(0, 0)) + point;
    }

    KvBlockTypeList m_blocks;
    std::unique_ptr<ChartMeasurements> m_host;
    std::unique_ptr<KvTemplateModel> m_model;
    std::unique_ptr<KvReportPagedView> m_view;
    QString m_pdfPath;
};

void ChartPagePdfTest::init()
{
    StatReportTest::init();
    m_host = std::make_unique<ChartMeasurements>();
    m_model = std::make_unique<KvTemplateModel>(nullptr, m_host->kernelData());
    m_model->setFactories(&m_blocks);
    m_view = std::make_unique<KvReportPagedView>();
    m_view->setModel(m_model.get());
    m_pdfPath = temporaryPath(QStringLiteral("page.pdf"));
}

void ChartPagePdfTest::cleanup()
{
    m_view.reset();
    m_model.reset();
    m_host.reset();
    StatReportTest::cleanup();
}

void ChartPagePdfTest::showBlock()
{
    QFETCH(QString, block);
    QFETCH(QString, theme);
    QFETCH(int, percent);
    m_host->setObjects(objects());
    const QString path = temporaryPath(QStringLiteral("block.rtp"));
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(QJsonDocument(QJsonObject{{"config", QJsonObject{{"pageWidth", kPageWidth}}},
                                         {"nodes", QJsonArray{blockOf(block, theme, percent)}}})
                   .toJson());
    file.close();
    QVERIFY(m_model->load(path));
    // All of the page, at one pixel of the screen for each of its own.
    showView(*m_view, QSize(kPageWidth + 40 + m_view->verticalScrollBar()->sizeHint().width(), 1400));
    QCOMPARE(m_model->pageWidth(), kPageWidth);
    QCOMPARE(m_view->pages().size(), 1);
    QCOMPARE(m_view->pieceItems().size(), 1);
    QVERIFY(m_view->pieceItems().first()->size().height() > 60);
}

void ChartPagePdfTest::print()
{
    m_model->beginLiveUpdates();
    const int printed = m_model->print(m_pdfPath);
    m_model->endLiveUpdates();
    QCOMPARE(printed, 1);
    m_model->notifyListChanged();
}

QImage ChartPagePdfTest::grabbedPage() const
{
    const QRect page = m_view->pages().first()->pageRect();
    return m_view->viewport()->grab(QRect(m_view->mapFromScene(page.topLeft()), page.size())).toImage();
}

QImage ChartPagePdfTest::magnifiedPage() const
{
    const QRect page = m_view->pages().first()->pageRect();
    QImage image(page.size() * 2, QImage::Format_RGB32);
    image.fill(Qt::white);
    QPainter painter(&image);
    painter.setRenderHints(m_view->renderHints());
    m_view->scene()->render(&painter, image.rect(), page);
    return image;
}

void ChartPagePdfTest::pageAndPaperAgree()
{
    showBlock();
    const QImage grabbed = grabbedPage();
    const QImage magnified = magnifiedPage();
    const QRect part = pieceRect();
    print();
    // About two and a half pixels of paper for each of the page.
    const QImage paper = PdfFile(m_pdfPath).rendered(0, 288);
    QVERIFY(!paper.isNull());
    // Lines of charts are a pixel or two wide on any device, thinner on paper than on screen.
    const QString grabbedFigures = misfit(differenceOf(grabbed, paper, part), {2.0, 0.02});
    QVERIFY2(grabbedFigures.isEmpty(), qPrintable(grabbedFigures));
    const QString magnifiedFigures = misfit(differenceOf(magnified, paper, part), {1.2, 0.001});
    QVERIFY2(magnifiedFigures.isEmpty(), qPrintable(magnifiedFigures));
    // The view shows the same as before once it has its pieces back.
    QCOMPARE(grabbedPage(), grabbed);
}

QVector<PageText> ChartPagePdfTest::chartTexts() const
{
    const auto *chart = dynamic_cast<KvStatisticsChartWidget *>(m_model->node(0)->displayWidget());
    QVector<PageText> texts;
    const auto add = [&](const QString &text, const QPointF &left) {
        const QPointF inView = chart->chartView()->viewportTransform().map(left);
        texts.append({text, pagePoints(scenePointOf(chart->chartView()->viewport(), inView))});
    };
    constexpr qreal margin = kvCharts::KvTextMeasure::Margin;
    for (const QGraphicsItem *item : chart->chartView()->scene()->items()) {
        if (const auto *run = dynamic_cast<const kvCharts::KvTextRunItem *>(item)) {
            for (const kvCharts::KvPlacedText &text : run->texts())
                add(text.text,
                    run->mapToScene(text.topLeft + QPointF(margin, text.extent.size.height() / 2)));
        } else if (const auto *document = qgraphicsitem_cast<const QGraphicsTextItem *>(item)) {
            add(document->toPlainText(), document->mapToScene(margin, document->boundingRect().height() / 2));
        }
    }
    return texts;
}

void ChartPagePdfTest::compareTableTexts(const QVector<PdfWord> &words) const
{
    const auto *piece = qobject_cast<KvStatisticSubTable *>(pieceOf(m_view->pieceItems().first()));
    const QTableView *table = piece->tableView();
    int whole = 0;
    for (int row = 0; row < table->model()->rowCount(); ++row) {
        for (int column = 0; column < table->model()->columnCount(); ++column) {
            const QModelIndex index = table->model()->index(row, column);
            const QRectF cell = table->visualRect(index);
            const QRectF onPaper(pagePoints(scenePointOf(table->viewport(), cell.topLeft())),
                                 cell.size() * kPointsPerPixel);
            QStringList printed;
            for (const PdfWord &word : words) {
                if (!onPaper.contains(word.rect.center()))
                    continue;
                printed.append(word.text);
                QVERIFY(onPaper.adjusted(-0.5, -0.5, 0.5, 0.5).contains(word.rect));
            }
            // A narrow column shows the beginning of its texts.
            QString text = printed.join(QLatin1Char(' '));
            const QString shown = index.data().toString();
            whole += text == shown ? 1 : 0;
            if (text.endsWith(QChar(0x2026)))
                text.chop(1);
            QVERIFY2(!printed.isEmpty() && shown.startsWith(text.trimmed()),
                     qPrintable(shown + " is " + text));
        }
    }
    QVERIFY(whole > 0);
}

void ChartPagePdfTest::textsStandWhereTheyAreShown()
{
    QFETCH(QString, block);
    showBlock();
    print();
    const QVector<PdfWord> words = PdfFile(m_pdfPath).wordsOf(0);
    if (block == QLatin1String(kStatisticsTable)) {
        compareTableTexts(words);
        return;
    }
    const QVector<PageText> texts = chartTexts();
    QVERIFY(texts.size() >= 4);
    int letters = 0;
    for (const PageText &text : texts) {
        const QString first = text.text.simplified().section(QLatin1Char(' '), 0, 0);
        double nearest = 1e6;
        for (const PdfWord &word : words) {
            const QPointF away = QPointF(word.rect.left(), word.rect.center().y()) - text.place;
            if (word.text == first)
                nearest = std::min(nearest, std::max(qAbs(away.x()), qAbs(away.y())));
        }
        QVERIFY2(nearest < 1.0,
                 qPrintable(QStringLiteral("%1 is %2 points away").arg(text.text).arg(nearest)));
        letters += text.text.simplified().remove(QLatin1Char(' ')).size();
    }
    // Nothing else is printed.
    for (const PdfWord &word : words)
        letters -= word.text.size();
    QCOMPARE(letters, 0);
}

void ChartPagePdfTest::paperHoldsNoPictures()
{
    showBlock();
    print();
    const PdfFile pdf(m_pdfPath);
    QVERIFY(pdf.isSound());
    QVERIFY(pdf.pictures().isEmpty());
    QVERIFY(!pdf.fonts().isEmpty());
    for (const PdfFont &font : pdf.fonts())
        QVERIFY(font.isEmbedded);
}

void ChartPagePdfTest::aShiftWouldBeNoticed()
{
    // The tolerances are for edges and letters, not for places.
    QImage page(kPageWidth, kPageWidth, QImage::Format_RGB32);
    page.fill(Qt::white);
    QPainter painter(&page);
    for (int y = 20; y < kPageWidth; y += 40)
        painter.fillRect(40, y, kPageWidth - 80, 20, Qt::darkBlue);
    painter.end();
    const Difference none = differenceOf(page, page, page.rect());
    QCOMPARE(none.mean, 0.0);
    QCOMPARE(none.share, 0.0);
    const Difference shifted = differenceOf(page, page.copy(0, 2, kPageWidth, kPageWidth), page.rect());
    QVERIFY(shifted.mean > 2.0);
    QVERIFY(shifted.share > 0.02);
}

STATREPORT_TEST_MAIN(ChartPagePdfTest)
#include "ChartPagePdfTest.moc"
