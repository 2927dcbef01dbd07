// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "TypedMeasurements.h"
#include "blocks/KvReportBlocks.h"
#include "report/KvReportNode.h"
#include "report/KvReportPrinter.h"
#include "report/PdfFile.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvTemplateModel.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace {

QJsonObject tableBlock(int groupBy, const QString &columns)
{
    const QJsonObject config{{"alignment", 4},
                             {"groupBy", groupBy},
                             {"widthPercent", 100},
                             {"columns", columns},
                             {"theme", "Light"}};
    return {{"name", "Statistics Table"}, {"config", config}};
}

QString templateFile(const QJsonArray &nodes)
{
    QFile file(StatReportTest::temporaryPath(QStringLiteral("statistics.rtp")));
    file.open(QIODevice::WriteOnly);
    file.write(QJsonDocument(QJsonObject{{"nodes", nodes}}).toJson());
    return file.fileName();
}

QString pdfPath()
{
    return StatReportTest::temporaryPath(QStringLiteral("statistics.pdf"));
}

QStringList lines(const QString &pageText)
{
    QStringList lines;
    for (const QString &line : pageText.split(QLatin1Char('\n'))) {
        if (!line.trimmed().isEmpty())
            lines.append(line.simplified());
    }
    return lines;
}

} // namespace

/** Statistics tables on their way from the template's file to the PDF, without any window. */
class KvStatisticsTableReportTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void isPrintedAsText();
    void longTablesRepeatTheirHeader();
    void aSecondPrintShowsTheNewValues();
    void savingAndLoadingGivesTheSame();
    void aRefusedBlockStopsTheLoad_data();
    void aRefusedBlockStopsTheLoad();

private:
    /** Number of printed pages; 0 when printing failed. */
    int print()
    {
        KvReportPrinter printer(m_model.get());
        return printer.print(pdfPath()) ? printer.pageCount() : 0;
    }

    std::unique_ptr<TypedMeasurements> m_host;
    KvBlockTypeList m_blocks;
    std::unique_ptr<KvTemplateModel> m_model;
};

void KvStatisticsTableReportTest::init()
{
    StatReportTest::init();
    if (m_blocks.blockTypes().isEmpty())
        registerReportBlocks(m_blocks);
    m_host = std::make_unique<TypedMeasurements>();
    m_model = std::make_unique<KvTemplateModel>(nullptr, m_host->kernelData());
    m_model->setFactories(&m_blocks);
}

void KvStatisticsTableReportTest::cleanup()
{
    m_model.reset();
    m_host.reset();
    StatReportTest::cleanup();
}

void KvStatisticsTableReportTest::isPrintedAsText()
{
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), {0.5, 5000.0});
    m_host->add(QStringLiteral("Circle"), QStringLiteral("Area"), {1500000.0}, 2);
    QVERIFY(m_model->load(templateFile({tableBlock(1, QStringLiteral("Sigma;Max;Min")),
                                        tableBlock(0, QStringLiteral("6 Sigma;3 Sigma;Sigma;Average"))})));
    QCOMPARE(print(), 1);
    const PdfFile pdf(pdfPath());
    QVERIFY(pdf.isSound());
    QCOMPARE(pdf.pageCount(), 1);
    QVERIFY(pdf.pictures().isEmpty());
    QCOMPARE(lines(pdf.pageTexts().first()),
             QStringList({"Object Type Measurement Type Min Max Sigma",
                          "Circle Area 1.500 mm² 1.500 mm² 0 nm²", "Line Length 500.00 nm 5.000 mm 2.500 mm",
                          "Measurement Type Average Sigma 3 Sigma 6 Sigma",
                          "Area 1.500 mm² 0 nm² 0 nm² 0 nm²", "Length 2.500 mm 2.500 mm 7.499 mm 1.500 cm"}));
    for (const PdfFont &font : pdf.fonts())
        QVERIFY(font.isEmbedded);
}

void KvStatisticsTableReportTest::longTablesRepeatTheirHeader()
{
    for (int i = 0; i < 60; ++i)
        m_host->add(QStringLiteral("Line"), QStringLiteral("v%1").arg(i, 2, 10, QLatin1Char('0')), {1.0});
    QVERIFY(m_model->load(templateFile({tableBlock(1, QStringLiteral("Average"))})));
    QCOMPARE(print(), 2);
    const QStringList texts = PdfFile(pdfPath()).pageTexts();
    QCOMPARE(texts.size(), 2);
    QStringList rows;
    for (const QString &text : texts) {
        const QStringList page = lines(text);
        QCOMPARE(page.first(), QStringLiteral("Object Type Measurement Type Average"));
        rows += page.mid(1);
    }
    QCOMPARE(rows.size(), 60); // none lost between the pages, none twice
    for (int i = 0; i < 60; ++i)
        QCOMPARE(rows.at(i), QStringLiteral("Line v%1 1.000 μm").arg(i, 2, 10, QLatin1Char('0')));
}

void KvStatisticsTableReportTest::aSecondPrintShowsTheNewValues()
{
    QVERIFY(m_model->load(templateFile({tableBlock(0, QStringLiteral("Average"))})));
    QCOMPARE(print(), 1);
    QCOMPARE(lines(PdfFile(pdfPath()).pageTexts().first()), QStringList{"Measurement Type Average"});
    m_host->add(QStringLiteral("Line"), QStringLiteral("Length"), {1.0, 3.0});
    QCOMPARE(print(), 1);
    QCOMPARE(lines(PdfFile(pdfPath()).pageTexts().first()),
             QStringList({"Measurement Type Average", "Length 2.000 μm"}));
}

void KvStatisticsTableReportTest::savingAndLoadingGivesTheSame()
{
    const QJsonArray nodes{tableBlock(0, QStringLiteral("Max")), tableBlock(1, QString())};
    QVERIFY(m_model->load(templateFile(nodes)));
    const QString copy = temporaryPath(QStringLiteral("copy.rtp"));
    QVERIFY(m_model->save(copy));
    QFile file(copy);
    QVERIFY(file.open(QIODevice::ReadOnly));
    QCOMPARE(QJsonDocument::fromJson(file.readAll()).object().value("nodes").toArray(), nodes);
}

void KvStatisticsTableReportTest::aRefusedBlockStopsTheLoad_data()
{
    QTest::addColumn<QString>("missing");
    for (const char *key : {"alignment", "groupBy", "widthPercent", "columns"})
        QTest::newRow(key) << QString::fromLatin1(key);
}

void KvStatisticsTableReportTest::aRefusedBlockStopsTheLoad()
{
    QFETCH(QString, missing);
    const QJsonObject complete = tableBlock(0, QStringLiteral("Max"));
    QJsonObject config = complete.value("config").toObject();
    config.remove(missing);
    const QJsonObject refused{{"name", "Statistics Table"}, {"config", config}};
    QVERIFY(!m_model->load(templateFile({complete, refused, complete})));
    QCOMPARE(m_model->nodeCount(), 1);
}

STATREPORT_TEST_MAIN(KvStatisticsTableReportTest)
#include "KvStatisticsTableReportTest.moc"
