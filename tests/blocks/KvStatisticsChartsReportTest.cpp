// SPDX-License-Identifier: MIT
#include "support/StatReportTest.h"

#include "ChartBlocks.h"
#include "ChartMeasurements.h"
#include "blocks/KvReportBlocks.h"
#include "report/KvReportNode.h"
#include "report/KvReportPagedView.h"
#include "report/KvReportPrinter.h"
#include "report/PdfFile.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvTemplateModel.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace {

QJsonObject chartBlock(const QString &name, const QString &theme, int percent, int alignment = 132)
{
    QJsonObject config{{"theme", theme}, {"alignment", alignment}, {"widthPercent", percent}};
    if (ChartBlocks::isGrouped(name))
        config[QStringLiteral("groupBy")] = 1;
    return {{"name", name}, {"config", config}};
}

QJsonArray allCharts(const QString &theme)
{
    QJsonArray nodes;
    for (const QString &name : ChartBlocks::names())
        nodes.append(chartBlock(name, theme, 100));
    return nodes;
}

QString templateFile(const QJsonArray &nodes)
{
    QFile file(StatReportTest::temporaryPath(QStringLiteral("charts.rtp")));
    file.open(QIODevice::WriteOnly);
    file.write(
        QJsonDocument(QJsonObject{{"config", QJsonObject{{"pageWidth", 1000}}}, {"nodes", nodes}}).toJson());
    return file.fileName();
}

QString pdfPath()
{
    return StatReportTest::temporaryPath(QStringLiteral("charts.pdf"));
}

QVector<ChartObject> objects(const QString &prefix)
{
    return {ChartMeasurements::line(prefix + "edge", 11.0), ChartMeasurements::line(prefix + "gap", 13.5),
            ChartMeasurements::line(prefix + "rim", 17.25), ChartMeasurements::counter(prefix + "cells", 3),
            ChartMeasurements::counter(prefix + "pores", 7)};
}

} // namespace

/** Charts on their way from the template's file to the pages and the PDF. */
class KvStatisticsChartsReportTest : public StatReportTest
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void areDrawnWithLinesAndText_data();
    void areDrawnWithLinesAndText();
    void haveTheColoursOfTheirTheme_data();
    void haveTheColoursOfTheirTheme();
    void hiddenPrintsShowCurrentData();
    void standWhereTheyShould_data();
    void standWhereTheyShould();
    void savingAndLoadingGivesTheSame();
    void aRefusedBlockStopsTheLoad_data() { ChartBlocks::addBlockRows(); }
    void aRefusedBlockStopsTheLoad();
    void viewsFollowTheDataAndTheWidth_data() { ChartBlocks::addBlockRows(); }
    void viewsFollowTheDataAndTheWidth();

private:
    bool print()
    {
        m_model->beginLiveUpdates();
        const bool isPrinted = m_model->print(pdfPath()) == 1;
        m_model->endLiveUpdates();
        return isPrinted;
    }

    std::unique_ptr<ChartMeasurements> m_host;
    KvBlockTypeList m_blocks;
    std::unique_ptr<KvTemplateModel> m_model;
};

void KvStatisticsChartsReportTest::init()
{
    StatReportTest::init();
    if (m_blocks.blockTypes().isEmpty())
        registerReportBlocks(m_blocks);
    m_host = std::make_unique<ChartMeasurements>();
    m_model = std::make_unique<KvTemplateModel>(nullptr, m_host->kernelData());
    m_model->setFactories(&m_blocks);
}

void KvStatisticsChartsReportTest::cleanup()
{
    m_model.reset();
    m_host.reset();
    StatReportTest::cleanup();
}

void KvStatisticsChartsReportTest::areDrawnWithLinesAndText_data()
{
    QTest::addColumn<QString>("theme");
    QTest::newRow("Dark") << "Dark";
    QTest::newRow("Light") << "Light";
}

void KvStatisticsChartsReportTest::areDrawnWithLinesAndText()
{
    QFETCH(QString, theme);
    m_host->setHostObjects(objects(QString()));
    QVERIFY(m_model->load(templateFile(allCharts(theme))));
    QVERIFY(print());
    const PdfFile pdf(pdfPath());
    QVERIFY(pdf.isSound());
    QVERIFY(pdf.pictures().isEmpty());
    QVERIFY(!pdf.fonts().isEmpty());
    for (const PdfFont &font : pdf.fonts())
        QVERIFY(font.isEmbedded);
    const QString text = pdf.pageTexts().join(QLatin1Char('\n'));
    // The box's name and values, the trend's numbers of objects, the counters with their counts.
    for (const char *word : {"Line/length", "13.5", "17.25", "cells - 3", "pores - 7"})
        QVERIFY2(text.contains(QLatin1String(word)), qPrintable(text));
}

void KvStatisticsChartsReportTest::haveTheColoursOfTheirTheme_data()
{
    QTest::addColumn<QString>("block");
    QTest::addColumn<QString>("theme");
    QTest::addColumn<QColor>("background");
    for (const QString &block : ChartBlocks::names()) {
        QTest::addRow("%s, Dark", qPrintable(block)) << block << "Dark" << QColor(0x26, 0x26, 0x26);
        QTest::addRow("%s, Light", qPrintable(block)) << block << "Light" << QColor(Qt::white);
    }
}

void KvStatisticsChartsReportTest::haveTheColoursOfTheirTheme()
{
    QFETCH(QString, block);
    QFETCH(QString, theme);
    QFETCH(QColor, background);
    m_host->setHostObjects(objects(QString()));
    QVERIFY(m_model->load(templateFile({chartBlock(block, theme, 50)})));
    QVERIFY(print());
    const QImage page = PdfFile(pdfPath()).rendered(0, 72); // 595 points for 1000 pixels
    const auto at = [&page](double x, double y) { return page.pixelColor(int(x * 0.595), int(y * 0.595)); };
    // 380 of 760 pixels in the middle of the page, from the top of its content.
    QCOMPARE(at(200, 60), QColor(Qt::white));
    QCOMPARE(at(314, 26), background);
    QCOMPARE(at(685, 26), background);
    QCOMPARE(at(800, 60), QColor(Qt::white));
}

void KvStatisticsChartsReportTest::hiddenPrintsShowCurrentData()
{
    m_host->setObjects(objects("old"));
    QVERIFY(m_model->load(templateFile(allCharts(QStringLiteral("Light")))));
    QVERIFY(print());
    QVERIFY(PdfFile(pdfPath()).pageTexts().join(QChar()).contains(QLatin1String("oldcells - 3")));

    // Nothing is shown and nothing tracks the host: the next print has to find out by itself.
    m_host->setHostObjects({ChartMeasurements::circle("new", 2000.0),
                            ChartMeasurements::circle("new", 4000.0),
                            ChartMeasurements::counter("newcells", 9)});
    QVERIFY(print());
    const QString text = PdfFile(pdfPath()).pageTexts().join(QChar());
    QVERIFY(!text.contains(QLatin1String("old")));
    QVERIFY(!text.contains(QLatin1String("Line")));
    QVERIFY(text.contains(QLatin1String("newcells - 9")));
    QVERIFY(text.contains(QLatin1String("Circle/diameter(mm)")));
    for (KvReportNode *node : m_model->nodes()) {
        QWidget *piece = node->displayWidget()->subWidgetAt(0);
        QCOMPARE(piece->size(), piece->sizeHint());
    }
}

void KvStatisticsChartsReportTest::standWhereTheyShould_data()
{
    QTest::addColumn<int>("alignment");
    QTest::addColumn<double>("left"); // of the chart on a page of 1000 pixels
    QTest::newRow("left") << 1 << 120.0;
    QTest::newRow("centre") << 132 << 310.0;
    QTest::newRow("right") << 2 << 500.0;
}

void KvStatisticsChartsReportTest::standWhereTheyShould()
{
    QFETCH(int, alignment);
    QFETCH(double, left);
    m_host->setHostObjects(objects(QString()));
    QVERIFY(m_model->load(templateFile({chartBlock("Trend", "Dark", 50, alignment)})));
    QVERIFY(print());
    const QImage page = PdfFile(pdfPath()).rendered(0, 72);
    const int y = int(30 * 0.595);
    int first = -1;
    int last = -1;
    for (int x = 0; x < page.width(); ++x) {
        if (page.pixelColor(x, y).lightness() > 100)
            continue;
        first = first < 0 ? x : first;
        last = x;
    }
    QVERIFY(qAbs(first - left * 0.595) <= 2);
    QVERIFY(qAbs(last - (left + 380) * 0.595) <= 2);
}

void KvStatisticsChartsReportTest::savingAndLoadingGivesTheSame()
{
    QJsonArray nodes;
    int alignment = 0;
    for (const QString &name : ChartBlocks::names())
        nodes.append(chartBlock(name, QStringLiteral("Light"), 53, ++alignment == 3 ? 132 : alignment));
    QVERIFY(m_model->load(templateFile(nodes)));
    const QString path = temporaryPath(QStringLiteral("saved.rtp"));
    QVERIFY(m_model->save(path));
    QFile file(path);
    QVERIFY(file.open(QIODevice::ReadOnly));
    QCOMPARE(QJsonDocument::fromJson(file.readAll()).object().value(QStringLiteral("nodes")).toArray(),
             nodes);
}

void KvStatisticsChartsReportTest::aRefusedBlockStopsTheLoad()
{
    QFETCH(QString, block);
    QJsonObject config = chartBlock(block, "Light", 50).value(QStringLiteral("config")).toObject();
    config.remove(QStringLiteral("widthPercent"));
    const QJsonArray nodes{chartBlock(block, "Dark", 50), QJsonObject{{"name", block}, {"config", config}}};
    QVERIFY(!m_model->load(templateFile(nodes)));
    QCOMPARE(m_model->nodeCount(), 1);
}

void KvStatisticsChartsReportTest::viewsFollowTheDataAndTheWidth()
{
    QFETCH(QString, block);
    m_host->setObjects(objects(QString()));
    KvReportPagedView view;
    view.setModel(m_model.get());
    QVERIFY(m_model->load(templateFile({chartBlock(block, "Dark", 75)})));
    view.resize(800, 600);
    view.show();
    QVERIFY(QTest::qWaitForWindowExposed(&view));
    auto *widget = dynamic_cast<KvStatisticsChartWidget *>(m_model->nodes().first()->displayWidget());
    QVERIFY(widget);
    const auto fits = [this, widget]() {
        const int usable = m_model->context()->usableWidth();
        return widget->size() == widget->sizeHint() && widget->width() == usable &&
               widget->chartView()->width() == int(float(usable) * 0.75f) &&
               widget->chartView()->height() == widget->height();
    };
    QVERIFY(fits());
    QVector<ChartObject> others = objects("a much longer name of ");
    for (int i = 0; i < 8; ++i)
        others.append(
            {ChartMeasurements::Circle, "Circle", "c", {{QStringLiteral("value %1").arg(i), 2.0 + i, 1}}});
    for (int i = 0; i < 8; ++i)
        others.append(ChartMeasurements::counter(QStringLiteral("something that was counted %1").arg(i), i));
    const int before = widget->height();
    m_host->setObjects(others);
    QVERIFY(widget->height() != before);
    QVERIFY(fits());
    view.resize(1100, 600);
    QTRY_COMPARE(m_model->context()->pageWidth(), view.viewport()->width() - 40);
    QVERIFY(fits());
}

STATREPORT_TEST_MAIN(KvStatisticsChartsReportTest)
#include "KvStatisticsChartsReportTest.moc"
