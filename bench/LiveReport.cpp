// SPDX-License-Identifier: MIT
#include "LiveReport.h"

#include "blocks/measurementstable/KvStatisticsMeasurementsTableWidget.h"
#include "data/KvReportKernelData.h"
#include "data/KvStatisticsEngine.h"
#include "report/KvReportNode.h"
#include "report/KvReportPagedView.h"
#include "templates/KvPageSectionsCfg.h"
#include "templates/KvTemplateModel.h"

#include <QCoreApplication>

namespace {
// Pages of 35 rows, header row included.
constexpr int kPageWidth = 860;
} // namespace

LiveReport::LiveReport(Sections sections)
    : m_view(std::make_unique<KvReportPagedView>())
{
    if (sections == Sections::All) {
        m_report.model().header()->setText(QStringLiteral("<p>Report of ${DATE}</p>"));
        m_report.model().footer()->setText(QStringLiteral("<p>The laboratory</p>"));
        m_report.model().setHeaderEnabled(true);
        m_report.model().setFooterEnabled(true);
        m_report.model().setPageNumberingEnabled(true);
    }
    m_report.model().beginLiveUpdates();
    m_view->setModel(&m_report.model());
    m_view->resize(kPageWidth + 54, 900);
    m_view->show();
    QCoreApplication::processEvents();
}

LiveReport::~LiveReport()
{
    m_view.reset();
    m_report.model().endLiveUpdates();
}

void LiveReport::refreshInPlace()
{
    KvBaseDisplayWidget *display = m_report.model().node(0)->displayWidget();
    static_cast<KvStatisticsMeasurementsTableWidget *>(display)->slotUpdateTableContents();
}

void LiveReport::measure()
{
    m_view->slotUpdateSceneWithSizes();
}

void LiveReport::reflow()
{
    m_report.model().notifyListChanged();
}

void LiveReport::takeRecords()
{
    m_report.kernelData().slotDelayedMeasurementsUpdate();
    // The table asks for other pages from the event loop.
    QCoreApplication::processEvents();
}

int LiveReport::pageCount() const
{
    return m_view->pages().size();
}
