// SPDX-License-Identifier: MIT
#include "ReportCases.h"

#include "blocks/KvReportBlocks.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.h"
#include "blocks/table/KvTableFonts.h"
#include "blocks/table/KvTablePageSplit.h"
#include "charts/KvChartThemes.h"
#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"
#include "report/KvReportNode.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvTemplateModel.h"

#include <QPainter>
#include <QPdfWriter>

TableReport::TableReport()
    : m_kernelData(std::make_unique<KvReportKernelData>())
    , m_blocks(std::make_unique<KvBlockTypeList>())
    , m_model(std::make_unique<KvTemplateModel>(nullptr, m_kernelData.get()))
{
    KvStatisticsEngine::instance().setKernelData(m_kernelData.get());
    registerReportBlocks(*m_blocks);
    m_model->setFactories(m_blocks.get());
    KvReportNode *node = m_model->createNode(QStringLiteral("Measurement table"), -1);
    auto *cfg = static_cast<KvStatisticsMeasurementsTableNodeCfg *>(node->config());
    cfg->setWidthPercent(100);
    cfg->setTheme(kvCharts::KvChartThemes::Light);
}

TableReport::~TableReport()
{
    m_model.reset();
    KvStatisticsEngine::instance().setKernelData(nullptr);
}

bool TableReport::print(const QString &fileName)
{
    m_model->beginLiveUpdates();
    const int result = m_model->print(fileName);
    m_model->endLiveUpdates();
    return result != 0;
}

namespace {

class FloorPrinter
{
public:
    explicit FloorPrinter(QPdfWriter *writer)
        : m_writer(writer)
        , m_painter(writer)
        , m_headerFont(KvTableFonts::header())
        , m_bodyFont(KvTableFonts::body())
    {
        const double scale = writer->pageLayout().pageSize().sizePixels(600).width() / 952.0;
        m_painter.scale(scale, scale);
    }

    void print(const QVector<KvMeasuredValue> &records)
    {
        const KvTablePageSplit split = KvTablePageSplit::compute(1304, 1, records.size());
        for (int page = 0; page < split.pieceCount; ++page) {
            if (page > 0)
                m_writer->newPage();
            printPage(records, split.firstRow(page), split.rowCount(page, records.size()));
        }
    }

private:
    void printPage(const QVector<KvMeasuredValue> &records, int first, int count)
    {
        drawLines(count + 1);
        m_painter.setPen(Qt::black);
        m_painter.setFont(m_headerFont);
        drawRow(0, {QStringLiteral("Object Name"), QStringLiteral("Object Type"),
                    QStringLiteral("Value Name"), QStringLiteral("Value")});
        m_painter.setFont(m_bodyFont);
        for (int i = 0; i < count; ++i) {
            const KvMeasuredValue &record = records.at(first + i);
            drawRow(i + 1, {record.objectName, record.objectTypeName, record.valueName, record.valueText});
        }
    }

    void drawLines(int rows)
    {
        m_painter.setPen(QColor(0xdd, 0xdd, 0xdd));
        for (int row = 0; row < rows; ++row) {
            const int y = kTop + (row + 1) * KvTablePageSplit::RowHeight - 1;
            m_painter.drawLine(kLeft, y, kLeft + 4 * kColumn, y);
        }
    }

    void drawRow(int row, const QStringList &texts)
    {
        for (int column = 0; column < texts.size(); ++column) {
            const QRect cell(kLeft + column * kColumn + 6, kTop + row * KvTablePageSplit::RowHeight,
                             kColumn - 12, KvTablePageSplit::RowHeight);
            m_painter.drawText(cell, Qt::AlignLeft | Qt::AlignVCenter, texts.at(column));
        }
    }

    static constexpr int kLeft = 114;
    static constexpr int kTop = 25;
    static constexpr int kColumn = 181;

    QPdfWriter *m_writer;
    QPainter m_painter;
    QFont m_headerFont;
    QFont m_bodyFont;
};

} // namespace

bool printFloor(const QString &fileName)
{
    KvReportKernelData kernelData;
    kernelData.setActive(true);
    QPdfWriter writer(fileName);
    writer.setResolution(600);
    writer.setPageMargins(QMarginsF(0, 0, 0, 0));
    FloorPrinter printer(&writer);
    printer.print(kernelData.measuredValues());
    kernelData.setActive(false);
    return true;
}
