// SPDX-License-Identifier: MIT
#include "report/KvReportPrinter.h"
#include "PdfFile.h"
#include "kernel/ZtAppSettings.h"
#include "report/KvPrintProgress.h"
#include "support/FakeReport.h"
#include "support/StatReportTest.h"

#include <QBuffer>
#include <QRandomGenerator>

namespace {

// Points per layout pixel on a page of the default width: the sheet is 4958 dots of 1/600 inch wide.
constexpr double kPointsPerPixel = 4958.0 / 600.0 * 72.0 / 952.0;

class NotedProgress : public KvPrintProgress
{
public:
    void pageWritten(int done, int total) override { m_noted.append({done, total}); }
    const QVector<QPair<int, int>> &noted() const { return m_noted; }

private:
    QVector<QPair<int, int>> m_noted;
};

// Cancels when a number of pages is written, and notes whether the template knew of the print all the time.
class CancellingProgress : public KvPrintProgress
{
public:
    CancellingProgress(const KvTemplateContext *context, int pages)
        : m_context(context)
        , m_pages(pages)
    {}
    void pageWritten(int done, int) override
    {
        m_done = done;
        m_isPrinting &= m_context->isPrinting();
    }
    bool isCancelled() const override { return m_done >= m_pages; }

    int done() const { return m_done; }
    bool wasPrinting() const { return m_isPrinting; }

private:
    const KvTemplateContext *m_context;
    int m_pages;
    int m_done = 0;
    bool m_isPrinting = true;
};

// A piece knows whether it is made for paper.
class PrintAwareBlock : public FakeBlockWidget
{
public:
    explicit PrintAwareBlock(FakeBlockCfg *cfg)
        : FakeBlockWidget(cfg, QStringLiteral("P"))
        , m_context(cfg->context())
    {}
    QWidget *subWidgetAt(int index) override
    {
        m_printing.append(m_context->isPrinting());
        return FakeBlockWidget::subWidgetAt(index);
    }
    const QVector<bool> &printing() const { return m_printing; }

private:
    const KvTemplateContext *m_context;
    QVector<bool> m_printing;
};

class PrintAwareFactory : public FakeBlockFactory
{
public:
    KvBaseDisplayWidget *createDisplayWidget(QWidget *, KvBaseEditorNodeCfg *cfg) override
    {
        return new PrintAwareBlock(static_cast<FakeBlockCfg *>(cfg));
    }
};

QString pdfPath(const char *name)
{
    return StatReportTest::temporaryPath(QLatin1String(name) + QStringLiteral(".pdf"));
}

// Every picture element another colour, which a lossy encoding cannot keep.
QImage noise(const QSize &size, QImage::Format format)
{
    QRandomGenerator random(815);
    QImage image(size, format);
    for (int y = 0; y < size.height(); ++y) {
        for (int x = 0; x < size.width(); ++x)
            image.setPixel(x, y, 0xff000000u | (random.generate() & 0xffffffu));
    }
    return image;
}

QString imageTag(const QImage &image)
{
    QByteArray png;
    QBuffer buffer(&png);
    buffer.open(QIODevice::WriteOnly);
    image.save(&buffer, "PNG");
    return QStringLiteral("<p><img src=\"data:image/png;base64,%1\"></p>").arg(QLatin1String(png.toBase64()));
}

bool hasColor(const QImage &image, const QColor &color)
{
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            const QColor found = image.pixelColor(x, y);
            if (qAbs(found.red() - color.red()) < 40 && qAbs(found.green() - color.green()) < 40 &&
                qAbs(found.blue() - color.blue()) < 40)
                return true;
        }
    }
    return false;
}

void expectFailedPainter()
{
    StatReportTest::expectWarning(
        QRegularExpression(QStringLiteral("^QPainter::begin\\(\\): Returned false$")));
}

} // namespace

class KvReportPrinterTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void anEmptyTemplateIsOnePage();
    void sectionsStandOnEveryPage();
    void pagesAreA4_data();
    void pagesAreA4();
    void flowsBlocks_data();
    void flowsBlocks();
    void placesPiecesAtTheMargin();
    void aPieceTooHighIsClipped();
    void tablesAreComplete_data();
    void tablesAreComplete();
    void textIsText();
    void nothingBecomesAPicture();
    void picturesAreKeptLosslessly_data();
    void picturesAreKeptLosslessly();
    void thereAreNoScreenMarks();
    void unwritableTargets_data();
    void unwritableTargets();
    void replacesAnExistingFile();
    void printsTwice();
    void leavesTheWidgetsToTheirBlocks();
    void tellsItsProgress();
    void stopsWhenCancelled_data();
    void stopsWhenCancelled();
    void tellsThatItPrints();
    void printsWithThePageWidthOfTheFile();
    void survivesOddTemplates_data();
    void survivesOddTemplates();
    void readsFromLeftToRight();
};

void KvReportPrinterTest::anEmptyTemplateIsOnePage()
{
    FakeReport report;
    const QString path = pdfPath("empty");
    KvReportPrinter printer(report.model());
    QCOMPARE(printer.pageCount(), 0);
    QVERIFY(!printer.parent());
    QVERIFY(printer.print(path));
    QCOMPARE(printer.pageCount(), 1);
    const PdfFile pdf(path);
    QVERIFY(pdf.isSound());
    QCOMPARE(pdf.pageCount(), 1);
    QCOMPARE(pdf.pageTexts().first().trimmed(), QString());

    report.model()->header()->setText(QStringLiteral("Top"));
    report.model()->footer()->setText(QStringLiteral("Bottom"));
    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    report.model()->setPageNumberingEnabled(true);
    QVERIFY(KvReportPrinter(report.model()).print(path));
    QCOMPARE(pdf.pageCount(), 1);
    QCOMPARE(pdf.pageTexts().first().simplified(), QStringLiteral("Top 1/1 Bottom"));
}

void KvReportPrinterTest::sectionsStandOnEveryPage()
{
    FakeReport report;
    ZtAppSettings::setProgramInfo(QStringLiteral("Lens"), QString(), QString());
    report.model()->header()->setText(QStringLiteral("Made with ${PROGRAM_NAME}"));
    report.model()->footer()->setText(QStringLiteral("Bottom"));
    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    report.model()->setPageNumberingEnabled(true);
    report.addFake({900, 900, 900});
    const QString path = pdfPath("sections");
    const bool isPrinted = KvReportPrinter(report.model()).print(path);
    ZtAppSettings::setProgramInfo(QString(), QString(), QString());
    QVERIFY(isPrinted);
    const PdfFile pdf(path);
    const QStringList texts = pdf.pageTexts();
    QCOMPARE(texts.size(), 3);
    for (int i = 0; i < 3; ++i)
        QCOMPARE(texts.at(i).simplified(),
                 QStringLiteral("Made with Lens A.%1 %2/3 Bottom").arg(i).arg(i + 1));
    // Header at the top edge, footer near the bottom, number in the right corner.
    QVERIFY(pdf.wordPosition(1, QStringLiteral("Made")).y() < 40);
    QVERIFY(pdf.wordPosition(1, QStringLiteral("Bottom")).y() > 790);
    const QPointF number = pdf.wordPosition(1, QStringLiteral("2/3"));
    QVERIFY(number.x() > 540 && number.x() < 595 - 40 * kPointsPerPixel);
    QVERIFY(number.y() > 780 && number.y() < 842 - 30 * kPointsPerPixel);
}

void KvReportPrinterTest::pagesAreA4_data()
{
    QTest::addColumn<int>("pageWidth");
    for (const int width : {952, 600, 1860})
        QTest::addRow("%d", width) << width;
}

void KvReportPrinterTest::pagesAreA4()
{
    QFETCH(int, pageWidth);
    FakeReport report;
    report.model()->setPageWidth(pageWidth);
    report.addFake({5000, 10});
    const QString path = pdfPath("a4");
    QVERIFY(KvReportPrinter(report.model()).print(path));
    const QVector<QSizeF> boxes = PdfFile(path).mediaBoxes();
    QCOMPARE(boxes.size(), 3);
    for (const QSizeF &box : boxes)
        QCOMPARE(box, QSizeF(595, 842));
}

void KvReportPrinterTest::flowsBlocks_data()
{
    QTest::addColumn<QVector<QVector<int>>>("blocks");
    QTest::addColumn<QStringList>("pages"); // the pieces on them

    using Blocks = QVector<QVector<int>>;
    const auto pages = [](const char *text) { return QString::fromLatin1(text).split(QLatin1Char('|')); };
    QTest::newRow("one") << Blocks{{100}} << pages("A.0");
    QTest::newRow("one page") << Blocks{{100, 100}, {100}} << pages("A.0 A.1 B.0");
    QTest::newRow("just fits") << Blocks{{1304}} << pages("A.0");
    QTest::newRow("one pixel too high") << Blocks{{1305}} << pages("|A.0");
    QTest::newRow("two pages") << Blocks{{1304}, {20}} << pages("A.0|B.0");
    QTest::newRow("too high at first") << Blocks{{2000}, {20}, {20}} << pages("|A.0|B.0 C.0");
    QTest::newRow("too high in between") << Blocks{{20, 2000, 20}} << pages("A.0|A.1|A.2");
    QTest::newRow("null pieces") << Blocks{{-1, 20, -1}, {-1}, {}, {20}} << pages("A.1 D.0");
}

void KvReportPrinterTest::flowsBlocks()
{
    QFETCH(QVector<QVector<int>>, blocks);
    FakeReport report;
    for (const QVector<int> &heights : qAsConst(blocks))
        report.addFake(heights);
    const QString path = pdfPath("flow");
    QVERIFY(KvReportPrinter(report.model()).print(path));
    const PdfFile pdf(path);
    QVERIFY(pdf.isSound());
    QStringList texts;
    for (const QString &text : pdf.pageTexts())
        texts.append(text.simplified());
    QTEST(texts, "pages");
}

void KvReportPrinterTest::placesPiecesAtTheMargin()
{
    FakeReport report;
    report.addFake({100, 1000, 500});
    const QString path = pdfPath("places");
    QVERIFY(KvReportPrinter(report.model()).print(path));
    const PdfFile pdf(path);
    const auto check = [&pdf](int page, const char *word, int y) {
        const QPointF found = pdf.wordPosition(page, QLatin1String(word));
        // Labels stand 4 px from the left of their pieces, with the base line at 14 px; letters are 12 px
        // high.
        QVERIFY2(qAbs(found.x() - (114 + 4) * kPointsPerPixel) < 1.5, word);
        QVERIFY2(qAbs(found.y() - (y + 2) * kPointsPerPixel) < 3.0, word);
    };
    check(0, "A.0", 20);
    check(0, "A.1", 121);
    check(1, "A.2", 20);
}

void KvReportPrinterTest::aPieceTooHighIsClipped()
{
    FakeReport report;
    auto *text = FakeReport::fakeWidget(report.addFake({3000, 20}));
    // Another word below the page's end.
    auto *label = new QLabel(QStringLiteral("below"), text->subWidgetAt(0));
    label->move(0, 1500);
    auto *inside = new QLabel(QStringLiteral("inside"), text->subWidgetAt(0));
    inside->move(0, 1200);
    const QString path = pdfPath("clipped");
    QVERIFY(KvReportPrinter(report.model()).print(path));
    const PdfFile pdf(path);
    QCOMPARE(pdf.pageCount(), 3);
    QCOMPARE(pdf.pageTexts().at(0).trimmed(), QString());
    QVERIFY(pdf.wordPosition(1, QStringLiteral("inside")).y() > 700);
    const QPointF below = pdf.wordPosition(1, QStringLiteral("below"));
    QVERIFY2(below.y() < 0 || below.y() > 842, "it does not fold back onto the page");
    QCOMPARE(pdf.pageTexts().at(2).simplified(), QStringLiteral("A.1"));
}

void KvReportPrinterTest::tablesAreComplete_data()
{
    QTest::addColumn<int>("rows");
    QTest::addColumn<int>("pages");
    // 1304 px of content hold the header and 39 rows of 32 px.
    QTest::newRow("0") << 0 << 1;
    QTest::newRow("1") << 1 << 1;
    QTest::newRow("39") << 39 << 1;
    QTest::newRow("40") << 40 << 2;
    QTest::newRow("100") << 100 << 3;
    QTest::newRow("1000") << 1000 << 26;
}

void KvReportPrinterTest::tablesAreComplete()
{
    QFETCH(int, rows);
    QFETCH(int, pages);
    FakeReport report;
    report.addTable();
    report.model()->setPageNumberingEnabled(true);
    report.setRowCount(rows);
    const QString path = pdfPath("table");
    // As an export does that nobody watches: no event loop between the data and the print.
    report.model()->beginLiveUpdates();
    QCOMPARE(report.model()->print(path), 1);
    report.model()->endLiveUpdates();

    const PdfFile pdf(path);
    QVERIFY(pdf.isSound());
    const QStringList texts = pdf.pageTexts();
    QCOMPARE(texts.size(), pages);
    QStringList expected;
    for (int i = 0; i < rows; ++i)
        expected.append(FakeReport::rowText(i));
    QStringList found;
    for (int i = 0; i < pages; ++i) {
        const QStringList onPage = PdfFile::words(texts.at(i), QStringLiteral("v\\d{5}"));
        QCOMPARE(onPage.size(), qMin(39, rows - i * 39));
        found += onPage;
        QCOMPARE(texts.at(i).count(QStringLiteral("Object Name")), 1);
        QCOMPARE(texts.at(i).count(QStringLiteral("Value Name")), 1);
        QCOMPARE(PdfFile::words(texts.at(i), QStringLiteral("\\d+/\\d+")),
                 QStringList(QStringLiteral("%1/%2").arg(i + 1).arg(pages)));
    }
    QCOMPARE(found, expected);
}

void KvReportPrinterTest::textIsText()
{
    FakeReport report;
    report.setRowCount(3);
    report.model()->header()->setText(QStringLiteral("Über <b>uns</b>"));
    report.model()->setHeaderEnabled(true);
    report.model()->setPageNumberingEnabled(true);
    report.addText(QStringLiteral("<p>Größe 12 µm² <i>schräg</i></p><p align='center'>middle</p>"));
    report.addTable();
    const QString path = pdfPath("text");
    report.model()->beginLiveUpdates();
    QCOMPARE(report.model()->print(path), 1);
    report.model()->endLiveUpdates();
    const PdfFile pdf(path);
    const QString text = pdf.pageTexts().first().simplified();
    for (const char *words : {"Über uns", "Größe 12 µm² schräg", "middle", "v00000", "v00002", "1/1"})
        QVERIFY2(text.contains(QString::fromUtf8(words)), words);
    const QVector<PdfFont> fonts = pdf.fonts();
    QVERIFY(fonts.size() >= 2);
    for (const PdfFont &font : fonts)
        QVERIFY2(font.isEmbedded, qPrintable(font.name));
}

void KvReportPrinterTest::nothingBecomesAPicture()
{
    FakeReport report;
    report.setRowCount(50);
    report.model()->header()->setText(QStringLiteral("Header <a href='http://example.com'>link</a>"));
    report.model()->footer()->setText(QStringLiteral("Footer"));
    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    report.model()->setPageNumberingEnabled(true);
    report.addText(
        QStringLiteral("<ul><li>one</li></ul><table border='1' bgcolor='#ffeecc'><tr><td>cell</td></tr>"
                       "</table><hr><p style='background-color:#ddeeff'>x</p>"));
    report.addTable();
    auto *light = static_cast<KvStatisticsMeasurementsTableNodeCfg *>(report.addTable()->config());
    light->setTheme(kvCharts::KvChartThemes::Light);
    const QString path = pdfPath("pictures");
    report.model()->beginLiveUpdates();
    QCOMPARE(report.model()->print(path), 1);
    report.model()->endLiveUpdates();
    const PdfFile pdf(path);
    QVERIFY(pdf.isSound());
    QVERIFY(pdf.pageCount() >= 4);
    QCOMPARE(pdf.pictures().size(), 0);
}

void KvReportPrinterTest::picturesAreKeptLosslessly_data()
{
    QTest::addColumn<QSize>("size");
    QTest::addColumn<int>("transparency"); // number of masks
    QTest::newRow("small") << QSize(16, 16) << 0;
    QTest::newRow("larger than the paper") << QSize(1500, 300) << 0;
    QTest::newRow("transparent") << QSize(64, 64) << 1;
}

void KvReportPrinterTest::picturesAreKeptLosslessly()
{
    QFETCH(QSize, size);
    QFETCH(int, transparency);
    QImage image = noise(size, transparency ? QImage::Format_ARGB32 : QImage::Format_RGB32);
    if (transparency)
        image.setPixel(0, 0, 0x00000000u);
    FakeReport report;
    report.addText(QStringLiteral("<p>above</p>") + imageTag(image) + QStringLiteral("<p>below</p>"));
    const QString path = pdfPath("lossless");
    QVERIFY(KvReportPrinter(report.model()).print(path));

    const PdfFile pdf(path);
    QVERIFY(pdf.isSound());
    const QVector<PdfPicture> pictures = pdf.pictures();
    QCOMPARE(pictures.size(), 1 + transparency);
    for (const PdfPicture &picture : pictures) {
        QCOMPARE(picture.encoding, QStringLiteral("image"));
        QCOMPARE(picture.size, size);
    }
    QImage kept = pdf.firstPicture().convertToFormat(QImage::Format_RGB32);
    QImage expected = image.convertToFormat(QImage::Format_RGB32);
    if (transparency) {
        kept.setPixel(0, 0, 0);
        expected.setPixel(0, 0, 0);
    }
    QCOMPARE(kept, expected);
}

void KvReportPrinterTest::thereAreNoScreenMarks()
{
    FakeReport report;
    report.model()->setHeaderEnabled(true);
    report.model()->setFooterEnabled(true);
    report.addFake({100});
    const QString path = pdfPath("marks");
    QVERIFY(KvReportPrinter(report.model()).print(path));
    const QImage page = PdfFile(path).rendered(0, 96);
    QVERIFY(!page.isNull());
    QVERIFY2(!hasColor(page, QColor(0x00, 0x65, 0x9d)), "separator lines are for the screen");
    for (const QPoint &corner : {QPoint(2, 2), QPoint(page.width() - 3, 2), QPoint(2, page.height() - 3),
                                 QPoint(page.width() - 3, page.height() - 3)})
        QCOMPARE(page.pixelColor(corner), QColor(Qt::white));
}

void KvReportPrinterTest::unwritableTargets_data()
{
    QTest::addColumn<QString>("path");
    QTest::newRow("missing folder") << temporaryPath(QStringLiteral("none/report.pdf"));
    QTest::newRow("folder") << QDir::tempPath();
    QTest::newRow("read-only file system") << QStringLiteral("/proc/report.pdf");
}

void KvReportPrinterTest::unwritableTargets()
{
    QFETCH(QString, path);
    FakeReport report;
    report.addFake({100, 2000});
    report.addText(QStringLiteral("text"));
    KvBaseDisplayWidget *widget = report.model()->node(1)->displayWidget();
    NotedProgress progress;
    KvReportPrinter printer(report.model());
    printer.setProgress(&progress);
    expectFailedPainter();
    QVERIFY(!printer.print(path));
    QCOMPARE(progress.noted().size(), 0);
    QVERIFY(!QFileInfo(path).isFile());
    expectFailedPainter();
    QCOMPARE(report.model()->print(path), 0);
    QCOMPARE(report.model()->nodeCount(), 2);
    QCOMPARE(report.model()->node(1)->displayWidget(), widget);
    // Nothing stands in the way of the next one.
    QCOMPARE(report.model()->print(pdfPath("after-failure")), 1);
}

void KvReportPrinterTest::replacesAnExistingFile()
{
    const QString path = pdfPath("replaced");
    FakeReport longReport;
    longReport.addFake(QVector<int>(20, 1000));
    QVERIFY(KvReportPrinter(longReport.model()).print(path));
    QCOMPARE(PdfFile(path).pageCount(), 20);
    FakeReport shortReport;
    shortReport.addFake({100});
    QVERIFY(KvReportPrinter(shortReport.model()).print(path));
    QVERIFY(PdfFile(path).isSound());
    QCOMPARE(PdfFile(path).pageCount(), 1);
}

void KvReportPrinterTest::printsTwice()
{
    FakeReport report;
    report.setRowCount(50);
    report.model()->beginLiveUpdates();
    report.addTable();
    report.addText(QStringLiteral("some words"));
    const QString first = pdfPath("first");
    const QString second = pdfPath("second");
    QCOMPARE(report.model()->print(first), 1);
    const int widgets = QApplication::allWidgets().size();
    QCOMPARE(report.model()->print(second), 1);
    QCOMPARE(QApplication::allWidgets().size(), widgets);
    QCOMPARE(PdfFile(second).pageTexts(), PdfFile(first).pageTexts());
    report.model()->endLiveUpdates();
}

void KvReportPrinterTest::leavesTheWidgetsToTheirBlocks()
{
    FakeReport report;
    KvReportNode *node = report.addFake({100, 1300});
    FakeBlockWidget *widget = FakeReport::fakeWidget(node);
    {
        KvReportPrinter printer(report.model());
        QVERIFY(printer.print(pdfPath("left")));
        QVERIFY(widget->piece(0)->window() != widget->piece(0));
    }
    QCOMPARE(FakePiece::alive(), 2);
    QCOMPARE(node->displayWidget(), widget);
    QVERIFY(!widget->piece(0)->parentWidget());
    QVERIFY(!widget->piece(1)->parentWidget());
    report.model()->removeNode(node);
    QCOMPARE(FakePiece::alive(), 0);
}

void KvReportPrinterTest::tellsItsProgress()
{
    FakeReport report;
    report.addFake({1000, 1000, 1000});
    NotedProgress progress;
    QCOMPARE(report.model()->print(pdfPath("progress"), &progress), 1);
    using Step = QPair<int, int>;
    QCOMPARE(progress.noted(), QVector<Step>({Step(0, 3), Step(1, 3), Step(2, 3), Step(3, 3)}));
}

void KvReportPrinterTest::stopsWhenCancelled_data()
{
    QTest::addColumn<int>("after");
    QTest::addColumn<int>("result");
    QTest::addColumn<int>("written");
    QTest::newRow("before the first page") << 0 << 0 << 0;
    QTest::newRow("after the first page") << 1 << 0 << 1;
    QTest::newRow("after the second page") << 2 << 0 << 2;
    // Too late: the file is complete.
    QTest::newRow("after the last page") << 3 << 1 << 3;
    QTest::newRow("never") << 4 << 1 << 3;
}

void KvReportPrinterTest::stopsWhenCancelled()
{
    QFETCH(int, after);
    QFETCH(int, result);
    QFETCH(int, written);
    FakeReport report;
    KvReportNode *node = report.addFake({1000, 1000, 1000});
    CancellingProgress progress(report.model()->context(), after);
    const QString path = pdfPath("cancelled");
    QFile::remove(path);
    QCOMPARE(report.model()->print(path, &progress), result);
    QCOMPARE(progress.done(), written);
    QVERIFY(progress.wasPrinting());
    QVERIFY(!report.model()->context()->isPrinting());
    // What is left behind is a whole file or none, and blocks that can be printed again.
    QCOMPARE(QFile::exists(path), result == 1);
    QCOMPARE(QDir(QFileInfo(path).path()).entryList({QStringLiteral("cancelled*")}).size(), result);
    if (result == 1) {
        QVERIFY(PdfFile(path).isSound());
        QCOMPARE(PdfFile(path).pageCount(), written);
    }
    QCOMPARE(FakePiece::alive(), 3);
    QVERIFY(!FakeReport::fakeWidget(node)->piece(0)->parentWidget());
    QCOMPARE(report.model()->print(path), 1);
    QCOMPARE(PdfFile(path).pageCount(), 3);
}

void KvReportPrinterTest::tellsThatItPrints()
{
    FakeReport report;
    PrintAwareFactory factory;
    auto *node = new KvReportNode(nullptr, &factory, report.model()->context(), report.model());
    static_cast<FakeBlockCfg *>(node->config())->setHeights({10, 2000, 10});
    report.model()->appendNode(node);
    auto *widget = static_cast<PrintAwareBlock *>(node->displayWidget());
    QCOMPARE(report.model()->print(pdfPath("aware")), 1);
    QCOMPARE(widget->printing(), QVector<bool>({true, true, true}));
    QVERIFY(!report.model()->context()->isPrinting());
    expectFailedPainter();
    QCOMPARE(report.model()->print(temporaryPath(QStringLiteral("none/aware.pdf"))), 0);
    QVERIFY(!report.model()->context()->isPrinting());
    report.model()->clearNodes();
}

void KvReportPrinterTest::printsWithThePageWidthOfTheFile()
{
    const QString path = temporaryPath(QStringLiteral("width600.rtp"));
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    // Content of 848 - 40 - 2: one fits, the next goes to another page.
    file.write(
        R"({"config": {"pageWidth": 600}, "nodes": [{"name": "Fake", "config": {"heights": [806, 20, 807]}}]})");
    file.close();
    FakeReport report;
    QVERIFY(report.model()->load(path));
    const QString pdf = pdfPath("width600");
    QCOMPARE(report.model()->print(pdf), 1);
    const QStringList texts = PdfFile(pdf).pageTexts();
    QCOMPARE(texts.size(), 3);
    QCOMPARE(report.model()->pageWidth(), 600);
    // The whole sheet is 600 px wide: margins of 72 px are 12 % of it.
    const double x = PdfFile(pdf).wordPosition(0, QStringLiteral("A.0")).x();
    QVERIFY(qAbs(x - (72 + 4) * kPointsPerPixel * 952 / 600) < 2.0);
}

void KvReportPrinterTest::survivesOddTemplates_data()
{
    QTest::addColumn<int>("pageWidth");
    QTest::addColumn<float>("margin");
    QTest::addColumn<bool>("blocks");
    for (int width = -2; width <= 41; ++width)
        QTest::addRow("width %d", width) << width << 0.12f << true;
    for (const int width : {-2147483647 - 1, -1000, -5, 0, 2147483647}) {
        QTest::addRow("width %d of something", width) << width << 0.12f << true;
        QTest::addRow("width %d of nothing", width) << width << 0.12f << false;
    }
    for (const float margin : {0.5f, 1.0f, 10.0f, 1e30f, -1.0f, -1e30f})
        QTest::addRow("margin %g", static_cast<double>(margin)) << 952 << margin << true;
    QTest::newRow("all margin") << 10 << 1e30f << true;
}

void KvReportPrinterTest::survivesOddTemplates()
{
    QFETCH(int, pageWidth);
    QFETCH(float, margin);
    QFETCH(bool, blocks);
    FakeReport report;
    report.setRowCount(50);
    report.model()->beginLiveUpdates();
    if (blocks) {
        report.addTable();
        report.addText(QStringLiteral("some words"));
        report.addFake({100, 2000});
        report.model()->setHeaderEnabled(true);
        report.model()->setFooterEnabled(true);
        report.model()->setPageNumberingEnabled(true);
    }
    report.model()->setPageWidth(pageWidth);
    report.model()->context()->setMarginWidth(margin);
    const QString path = pdfPath("odd");
    QCOMPARE(report.model()->print(path), 1);
    const PdfFile pdf(path);
    QVERIFY(pdf.isSound());
    QVERIFY(pdf.pageCount() >= 1);
    QCOMPARE(pdf.mediaBoxes().first(), QSizeF(595, 842));
    report.model()->endLiveUpdates();
}

void KvReportPrinterTest::readsFromLeftToRight()
{
    const auto print = [](const QString &path) {
        FakeReport report;
        report.setRowCount(3);
        report.model()->beginLiveUpdates();
        report.model()->header()->setText(QStringLiteral("Header"));
        report.model()->setHeaderEnabled(true);
        report.model()->setPageNumberingEnabled(true);
        report.addText(QStringLiteral("some words"));
        report.addTable();
        const int result = report.model()->print(path);
        report.model()->endLiveUpdates();
        return result;
    };
    const QString left = pdfPath("left-to-right");
    const QString right = pdfPath("right-to-left");
    QCOMPARE(print(left), 1);
    QApplication::setLayoutDirection(Qt::RightToLeft);
    const int result = print(right);
    QApplication::setLayoutDirection(Qt::LeftToRight);
    QCOMPARE(result, 1);
    for (const char *word : {"Header", "some", "Name", "v00001", "1/1"}) {
        const QPointF position = PdfFile(left).wordPosition(0, QLatin1String(word));
        QVERIFY2(position.x() >= 0, word);
        QCOMPARE(PdfFile(right).wordPosition(0, QLatin1String(word)), position);
    }
}

STATREPORT_TEST_MAIN(KvReportPrinterTest)
#include "KvReportPrinterTest.moc"
