// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "endtoend/StatReportProgram.h"
#include "endtoend/TemplateFile.h"
#include "report/PdfFile.h"

#include <QBuffer>

namespace {

QString text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

const char headText[] = "Headline office";
const char footText[] = "Footline flipper";
constexpr int objectCount = 500;

/** 500 objects of three values each. */
QByteArray wideTable()
{
    QByteArray table("name,length_mm,area_mm2,angle_deg\n");
    for (int i = 0; i < objectCount; ++i) {
        const QByteArray number = QByteArray::number(i);
        table += "N" + number.rightJustified(4, '0') + ',' + number + ".25," + number + ".5," +
                 QByteArray::number(i % 360) + ".75\n";
    }
    return table;
}

/** Number of pixels of one colour in a part of a picture. */
int count(const QImage &image, const QRect &part, QRgb colour)
{
    int found = 0;
    for (int y = part.top(); y <= part.bottom(); ++y) {
        for (int x = part.left(); x <= part.right(); ++x)
            found += image.pixel(x, y) == colour ? 1 : 0;
    }
    return found;
}

/** Smallest rectangle around all pixels of one colour. */
QRect extentOf(const QImage &image, QRgb colour)
{
    QRect extent;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (image.pixel(x, y) == colour)
                extent |= QRect(x, y, 1, 1);
        }
    }
    return extent;
}

} // namespace

class RenderedReportTest : public StatReportTest
{
    Q_OBJECT
private slots:
    void initTestCase();

    void listsEveryRowOnce();
    void repeatsHeaderRowAndSections();
    void isAPrintableFile();
    void hasLigatureWordsAsLetters();
    void drawsTheTable_data();
    void drawsTheTable();
    void keepsPictures();
    void elidesLongCells();
    void drawsAllScripts();
    void printsEveryLanguage();
    void printsShortTables_data();
    void printsShortTables();
    void printsLongTablesSoon();
    void printsAnyPageWidth_data();
    void printsAnyPageWidth();
    void printsTheExamples_data();
    void printsTheExamples();

private:
    /** Renders to out.pdf; what the program said, empty when all went well. */
    QString render(const QByteArray &reportTemplate, const QByteArray &table)
    {
        const QString templatePath = temporaryPath(text("t.rtp"));
        const QString tablePath = temporaryPath(text("t.csv"));
        if (!TemplateFile::write(templatePath, reportTemplate) || !TemplateFile::write(tablePath, table))
            return text("the input cannot be written");
        const ProgramResult result = StatReportProgram::run(
            {text("render"), templatePath, text("--table"), tablePath, text("-o"), outPath()});
        return result.exitCode == 0 ? result.errors
                                    : text("exit code %1: ").arg(result.exitCode) + result.errors;
    }
    static QString outPath() { return temporaryPath(text("out.pdf")); }
    static QByteArray fullTemplate(const QString &theme = text("Light"), int pageWidth = 952)
    {
        return TemplateFile::bytes({TemplateFile::textBlock(text("<p>Before office</p>")),
                                    TemplateFile::tableBlock(theme),
                                    TemplateFile::textBlock(text("<p>After flipper</p>"))},
                                   QStringLiteral("<p>%1</p>").arg(text(headText)),
                                   QStringLiteral("<p>%1</p>").arg(text(footText)), pageWidth);
    }

    QString m_wideReport;
};

void RenderedReportTest::initTestCase()
{
    for (const char *tool : {"pdftotext", "pdffonts", "pdfimages", "pdfinfo", "pdftoppm", "qpdf"})
        QVERIFY2(!QStandardPaths::findExecutable(text(tool)).isEmpty(),
                 qPrintable(text(tool) + text(" is not installed (packages poppler-utils and qpdf)")));
    QCOMPARE(render(fullTemplate(), wideTable()), QString());
    m_wideReport = temporaryPath(text("wide.pdf"));
    QVERIFY(QFile::rename(outPath(), m_wideReport));
}

void RenderedReportTest::listsEveryRowOnce()
{
    QStringList expected;
    for (int i = 0; i < objectCount; ++i) {
        const QString name = QStringLiteral("N%1 Object ").arg(i, 4, 10, QLatin1Char('0'));
        expected << name + QStringLiteral("length %1.25 mm").arg(i)
                 << name + QStringLiteral("area %1.5 mm\u00B2").arg(i)
                 << name + QStringLiteral("angle %1.75 \u00B0").arg(i % 360);
    }
    QStringList rows;
    const QStringList pages = PdfFile(m_wideReport).pageTexts();
    for (const QString &page : pages) {
        for (const QString &line : page.split(QLatin1Char('\n'))) {
            if (line.contains(QLatin1String(" Object ")) && !line.contains(QLatin1String("Object Name")))
                rows.append(line.simplified());
        }
    }
    QCOMPARE(rows.size(), expected.size());
    QCOMPARE(rows, expected);
}

void RenderedReportTest::repeatsHeaderRowAndSections()
{
    const PdfFile pdf(m_wideReport);
    const QStringList pages = pdf.pageTexts();
    QVERIFY(pages.size() > 10);
    QCOMPARE(pages.size(), pdf.pageCount());
    for (int i = 0; i < pages.size(); ++i) {
        const QString page = pages.at(i).simplified();
        QVERIFY2(page.contains(QStringLiteral("%1/%2").arg(i + 1).arg(pages.size())), qPrintable(page));
        QCOMPARE(page.count(text(headText)), 1);
        QCOMPARE(page.count(text(footText)), 1);
        // The last page may hold nothing but the text behind the table.
        const int headerRows = page.contains(QLatin1String(" Object ")) ? 1 : 0;
        QCOMPARE(page.count(text("Object Name Object Type Value Name Value")), headerRows);
        QVERIFY(headerRows == 1 || i == pages.size() - 1);
    }
    QCOMPARE(pages.join(QString()).count(text("Before office")), 1);
    QCOMPARE(pages.first().count(text("Before office")), 1);
    QCOMPARE(pages.join(QString()).count(text("After flipper")), 1);
    QCOMPARE(pages.last().count(text("After flipper")), 1);
}

void RenderedReportTest::isAPrintableFile()
{
    const PdfFile pdf(m_wideReport);
    QVERIFY(pdf.isSound());
    const QVector<PdfFont> fonts = pdf.fonts();
    QVERIFY(!fonts.isEmpty());
    for (const PdfFont &font : fonts)
        QVERIFY2(font.isEmbedded, qPrintable(font.name));
    // Everything is drawn as texts and lines.
    QCOMPARE(pdf.pictures().size(), 0);
    const QVector<QSizeF> boxes = pdf.mediaBoxes();
    QCOMPARE(boxes.size(), pdf.pageCount());
    for (const QSizeF &box : boxes) {
        QVERIFY2(qAbs(box.width() - 595.28) < 1.0, qPrintable(QString::number(box.width())));
        QVERIFY2(qAbs(box.height() - 841.89) < 1.0, qPrintable(QString::number(box.height())));
    }
}

void RenderedReportTest::hasLigatureWordsAsLetters()
{
    const QByteArray table("name,length_mm\nflipper,1\noffice,2\nfirst affluent,3\n");
    QCOMPARE(render(fullTemplate(), table), QString());
    const QString page = PdfFile(outPath()).pageTexts().join(QString());
    for (const char *words : {"Before office", "After flipper", "Headline office", "Footline flipper",
                              "flipper   ", "office   ", "first affluent"})
        QVERIFY2(page.contains(text(words)), qPrintable(text(words) + text(" in: ") + page));
}

void RenderedReportTest::drawsTheTable_data()
{
    QTest::addColumn<QString>("theme");
    QTest::addColumn<QColor>("background");
    QTest::addColumn<bool>("isTextDark");
    QTest::addColumn<int>("objects");
    for (const int objects : {4, 40}) {
        QTest::addRow("Light, %d", objects) << text("Light") << QColor(0xDD, 0xDD, 0xDD) << true << objects;
        QTest::addRow("Dark, %d", objects) << text("Dark") << QColor(0x4D, 0x4D, 0x4D) << false << objects;
    }
}

void RenderedReportTest::drawsTheTable()
{
    QFETCH(QString, theme);
    QFETCH(QColor, background);
    QFETCH(bool, isTextDark);
    QFETCH(int, objects);
    QByteArray table("name,length_mm\n");
    for (int i = 0; i < objects; ++i)
        table += "Name" + QByteArray::number(i) + ",1.5\n";
    // With header and footer on, a text before the table and one after it.
    QCOMPARE(render(fullTemplate(theme), table), QString());
    const PdfFile pdf(outPath());
    const QStringList pages = pdf.pageTexts();
    QCOMPARE(pages.size(), objects > 30 ? 2 : 1);
    for (int page = 0; page < pages.size(); ++page) {
        const QImage image = pdf.rendered(page, 50).convertToFormat(QImage::Format_RGB32);
        QVERIFY(image.width() > 400);
        const QRect area = extentOf(image, background.rgb());
        QVERIFY2(!area.isEmpty(), qPrintable(text("no table on page %1").arg(page + 1)));
        // Margins of 12 % of the page leave three quarters to a table of full width.
        QVERIFY2(area.width() > image.width() * 0.7 && area.width() < image.width() * 0.8,
                 qPrintable(QString::number(area.width())));
        // Rows are about 14 pixels high here, the header row included.
        const int rows = pages.at(page).count(QLatin1String("Object"));
        QVERIFY2(area.height() > rows * 10, qPrintable(QString::number(area.height())));
        QVERIFY(count(image, area, background.rgb()) > area.width() * area.height() * 0.7);
        int textPixels = 0;
        for (int y = area.top(); y <= area.bottom(); ++y) {
            for (int x = area.left(); x <= area.right(); ++x) {
                const int grey = qGray(image.pixel(x, y));
                textPixels += (isTextDark ? grey < 0x90 : grey > 0x90) ? 1 : 0;
            }
        }
        QVERIFY2(textPixels > rows * 15, qPrintable(QString::number(textPixels)));
        // Nothing but paper beside the table.
        const QRect left(0, area.top() + 5, area.left() - 3, area.height() - 10);
        const QRect right(area.right() + 4, area.top() + 5, image.width() - area.right() - 4,
                          area.height() / 2);
        QCOMPARE(count(image, left, qRgb(255, 255, 255)), left.width() * left.height());
        QCOMPARE(count(image, right, qRgb(255, 255, 255)), right.width() * right.height());
        // Header above and footer below are really drawn.
        const QRect above(0, 0, image.width(), area.top());
        const QRect below(0, area.bottom() + 2, image.width(), image.height() - area.bottom() - 2);
        QVERIFY(count(image, above, qRgb(255, 255, 255)) < above.width() * above.height() - 20);
        QVERIFY(count(image, below, qRgb(255, 255, 255)) < below.width() * below.height() - 20);
    }
}

void RenderedReportTest::keepsPictures()
{
    QImage picture(37, 23, QImage::Format_RGB32);
    for (int y = 0; y < picture.height(); ++y) {
        for (int x = 0; x < picture.width(); ++x)
            picture.setPixel(x, y, qRgb(x * 6, y * 11, (x * 31 + y * 17) % 256));
    }
    QByteArray png;
    QBuffer buffer(&png);
    QVERIFY(buffer.open(QIODevice::WriteOnly) && picture.save(&buffer, "PNG"));
    const QString html =
        QStringLiteral("<p><img src=\"data:image/png;base64,%1\" /></p>").arg(QLatin1String(png.toBase64()));
    QCOMPARE(render(TemplateFile::bytes({TemplateFile::textBlock(html), TemplateFile::tableBlock()}),
                    "name,length_mm\nA,1\n"),
             QString());
    const PdfFile pdf(outPath());
    const QVector<PdfPicture> pictures = pdf.pictures();
    QCOMPARE(pictures.size(), 1);
    QCOMPARE(pictures.first().type, text("image"));
    QCOMPARE(pictures.first().size, picture.size());
    QCOMPARE(pictures.first().encoding, text("image"));
    QCOMPARE(pdf.firstPicture().convertToFormat(QImage::Format_RGB32), picture);
}

void RenderedReportTest::elidesLongCells()
{
    const QByteArray table = "name,length_mm\n" + QByteArray(10000, 'x') + ",1\n" +
                             QByteArray("word ").repeated(2000) + ",2\nshort,3\n";
    QCOMPARE(render(fullTemplate(), table), QString());
    const PdfFile pdf(outPath());
    QVERIFY(pdf.isSound());
    const QStringList pages = pdf.pageTexts();
    const QString all = pages.join(QString());
    QVERIFY(pages.size() < 10);
    QVERIFY(all.contains(QLatin1String("xxxxxxxxxx")));
    QVERIFY(all.contains(QLatin1String("word word")));
    for (const char *value : {"1 mm", "2 mm", "3 mm", "short"})
        QCOMPARE(all.count(text(value)), 1);
}

void RenderedReportTest::drawsAllScripts()
{
    QCOMPARE(render(fullTemplate(),
                    "name,length_mm\n\xD7\xA9\xD7\x9C\xD7\x95\xD7\x9D,1\n\xD8\xB3\xD9\x84\xD8\xA7\xD9\x85,2\n"
                    "\xE6\xBC\xA2\xE5\xAD\x97,3\n\xCE\xA9\xCE\xBC\xCE\xAD\xCE\xB3\xCE\xB1,4\n"),
             QString());
    const PdfFile pdf(outPath());
    QVERIFY(pdf.isSound());
    for (const PdfFont &font : pdf.fonts())
        QVERIFY2(font.isEmbedded, qPrintable(font.name));
    // Right-to-left words come between marks of direction, Arabic in the forms in which its letters are
    // drawn.
    QString all = pdf.pageTexts().join(QString()).normalized(QString::NormalizationForm_KC);
    all.remove(QRegularExpression(text("[\xE2\x80\xAA-\xE2\x80\xAE\xE2\x80\x8E\xE2\x80\x8F]")));
    const auto letters = [](QString word) {
        std::sort(word.begin(), word.end());
        return word;
    };
    QStringList found;
    for (const QString &line : all.split(QLatin1Char('\n'))) {
        if (line.contains(QLatin1String(" Object ")) && !line.contains(QLatin1String("Object Name")))
            found.append(letters(line.section(QLatin1String("Object"), 0, 0).remove(QLatin1Char(' '))));
    }
    QCOMPARE(found, QStringList({letters(text("\xD7\xA9\xD7\x9C\xD7\x95\xD7\x9D")),
                                 letters(text("\xD8\xB3\xD9\x84\xD8\xA7\xD9\x85")),
                                 letters(text("\xE6\xBC\xA2\xE5\xAD\x97")),
                                 letters(text("\xCE\xA9\xCE\xBC\xCE\xAD\xCE\xB3\xCE\xB1"))}));
}

/// One text block with a sentence in each language of the interface; no character is lost.
void RenderedReportTest::printsEveryLanguage()
{
    const QStringList sentences{
        text("The quick brown fox jumps over the lazy dog"),
        text("Zw\u00F6lf Boxk\u00E4mpfer jagen Viktor quer \u00FCber den gro\u00DFen Sylter Deich"),
        text("D\u00E8s No\u00EBl, o\u00F9 un z\u00E9phyr ha\u00EF me v\u00EAt de gla\u00E7ons w\u00FCrmiens"),
        text("El ping\u00FCino hizo kil\u00F3metros bajo exhaustiva lluvia y fr\u00EDo, a\u00F1oraba"),
        text("Quel fez sghembo copre davanti, perch\u00E9 cos\u00EC \u00E8 pi\u00F9"),
        text("\u0421\u044A\u0435\u0448\u044C \u0435\u0449\u0451 \u043C\u044F\u0433\u043A\u0438\u0445 "
             "\u0431\u0443\u043B\u043E\u043A \u0436\u044E"),
        text("K\u0155de\u013E \u010Fat\u013Eov u\u010D\u00ED ko\u0148a \u017Era\u0165 k\u00F4ru"),
        text("\u0642\u064A\u0627\u0633 \u0627\u0644\u0637\u0648\u0644 "
             "\u0648\u0627\u0644\u0645\u0633\u0627\u062D\u0629"),
        text("\u3044\u308D\u306F\u306B\u307B\u3078\u3068 \u6E2C\u5B9A\u5024\u3068\u30AB\u30E1\u30E9"),
        text("\uB2E4\uB78C\uC950 \uD5CC \uCCB3\uBC14\uD034\uC5D0 \uCE21\uC815\uAC12"),
        text("\u6D4B\u91CF\u56FE\u50CF\u5BF9\u8C61\u5E76\u663E\u793A"),
        text("\u91CF\u6E2C\u5F71\u50CF\u7269\u4EF6\u4E26\u986F\u793A")};
    const QString html = QStringLiteral("<p>%1</p>").arg(sentences.join(QLatin1String("</p><p>")));
    QCOMPARE(render(TemplateFile::bytes({TemplateFile::textBlock(html)}), "name,length_mm\na,1\n"),
             QString());
    const PdfFile pdf(outPath());
    QVERIFY(pdf.isSound());
    for (const PdfFont &font : pdf.fonts())
        QVERIFY2(font.isEmbedded, qPrintable(font.name));
    const QString all = pdf.pageTexts().join(QString()).normalized(QString::NormalizationForm_KC);
    QString lost;
    for (const QChar letter : sentences.join(QString()).normalized(QString::NormalizationForm_KC)) {
        if (!all.contains(letter) && !lost.contains(letter))
            lost.append(letter);
    }
    QCOMPARE(lost, QString());
}

void RenderedReportTest::printsShortTables_data()
{
    QTest::addColumn<QByteArray>("rows");
    QTest::addColumn<QString>("note");
    QTest::newRow("none") << QByteArray() << QStringLiteral("statreport: note: %1: The table has no rows\n");
    QTest::newRow("one") << QByteArray("A,1.5\n") << QString();
}

void RenderedReportTest::printsShortTables()
{
    QFETCH(QByteArray, rows);
    QFETCH(QString, note);
    note.replace(QLatin1String("%1"), temporaryPath(text("t.csv")));
    QCOMPARE(render(fullTemplate(), "name,length_mm\n" + rows), note);
    const PdfFile pdf(outPath());
    QVERIFY(pdf.isSound());
    const QStringList pages = pdf.pageTexts();
    QCOMPARE(pages.size(), 1);
    const QString page = pages.first().simplified();
    QVERIFY(page.contains(text("Object Name Object Type Value Name Value")));
    QCOMPARE(page.contains(text("A Object length 1.5 mm")), !rows.isEmpty());
    for (const char *words : {"Before office", "After flipper", "1/1", headText, footText})
        QVERIFY2(page.contains(text(words)), words);
}

void RenderedReportTest::printsLongTablesSoon()
{
    constexpr int rowCount = 20000;
    QByteArray table("name,length_mm\n");
    for (int i = 0; i < rowCount; ++i)
        table += "N" + QByteArray::number(i) + ",1.5\n";
    QElapsedTimer timer;
    timer.start();
    QCOMPARE(render(fullTemplate(), table), QString());
    // Two or three seconds; builds with checks take several times that.
    QVERIFY2(timer.elapsed() < 90000, qPrintable(QString::number(timer.elapsed())));
    const QString all = PdfFile(outPath()).pageTexts().join(QString());
    const QStringList names = PdfFile::words(all, text("\\bN\\d+\\b"));
    QCOMPARE(names.size(), rowCount);
    for (int i = 0; i < rowCount; ++i)
        QCOMPARE(names.at(i), QStringLiteral("N%1").arg(i));
}

void RenderedReportTest::printsAnyPageWidth_data()
{
    QTest::addColumn<int>("width");
    for (const int width : {10, 40, 952, 3000})
        QTest::newRow(qPrintable(QString::number(width))) << width;
}

void RenderedReportTest::printsAnyPageWidth()
{
    QFETCH(int, width);
    QCOMPARE(render(fullTemplate(text("Light"), width), "name,length_mm\nA,1.5\nB,2.5\n"), QString());
    const PdfFile pdf(outPath());
    QVERIFY(pdf.isSound());
    QVERIFY(pdf.pageCount() >= 1);
    for (const QSizeF &box : pdf.mediaBoxes())
        QVERIFY(qAbs(box.width() - 595.28) < 1.0 && qAbs(box.height() - 841.89) < 1.0);
    // There is no room for words on the narrow ones.
    if (width >= 952) {
        QCOMPARE(pdf.pageCount(), 1);
        QVERIFY(pdf.pageTexts().first().simplified().contains(text("B Object length 2.5 mm")));
    }
}

void RenderedReportTest::printsTheExamples_data()
{
    QTest::addColumn<QString>("data");
    const QDir folder(sourcePath(text("examples")));
    QStringList sources{QStringLiteral("--session=") + folder.filePath(text("sessions/demo.json"))};
    for (const QString &name : QDir(folder.filePath(text("tables"))).entryList({text("*.csv")}))
        sources << QStringLiteral("--table=") + folder.filePath(text("tables/") + name);
    for (const QString &name : QDir(folder.filePath(text("templates"))).entryList({text("*.rtp")})) {
        for (const QString &source : qAsConst(sources))
            QTest::newRow(qPrintable(name + QLatin1Char(' ') + QFileInfo(source).fileName())) << source;
    }
}

void RenderedReportTest::printsTheExamples()
{
    QFETCH(QString, data);
    const QString name = text(QTest::currentDataTag()).section(QLatin1Char(' '), 0, 0);
    const ProgramResult result = StatReportProgram::run(
        {text("render"), sourcePath(text("examples/templates/") + name), data, text("-o"), outPath()});
    QCOMPARE(result.errors, QString());
    QCOMPARE(result.exitCode, 0);
    const PdfFile pdf(outPath());
    QVERIFY(pdf.isSound());
    QVERIFY(pdf.pageCount() >= 1);
    const QString all = pdf.pageTexts().join(QString());
    QVERIFY2(!all.contains(QLatin1String("${")), "a keyword was not replaced");
    // Every template shows values, in a table or as a chart with its axes.
    QVERIFY(all.contains(QRegularExpression(QStringLiteral("\\d[.,]\\d"))));
}

STATREPORT_TEST_MAIN(RenderedReportTest)
#include "RenderedReportTest.moc"
