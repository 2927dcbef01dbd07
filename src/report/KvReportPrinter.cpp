// SPDX-License-Identifier: MIT
#include "report/KvReportPrinter.h"

#include "report/KvBaseDisplayWidget.h"
#include "report/KvPageFlow.h"
#include "report/KvPrintProgress.h"
#include "report/KvReportNode.h"
#include "report/KvReportPage.h"
#include "report/KvReportProxyWidgetItem.h"
#include "templates/KvTemplateModel.h"

#include <QFileInfo>
#include <QGraphicsScene>
#include <QPainter>
#include <QPdfWriter>
#include <QSaveFile>
#include <QScopeGuard>

namespace {
constexpr int kResolution = 600; // dots per inch
}

KvReportPrinter::KvReportPrinter(KvTemplateModel *model)
    : m_model(model)
{}

KvReportPrinter::~KvReportPrinter() = default;

bool KvReportPrinter::print(const QString &fileName)
{
    // A report of that name stays until the new one is complete: a print may be cancelled, and disks are full
    // at times. Nothing can take the place of a pipe or a device.
    const QFileInfo target(fileName);
    QSaveFile file(fileName);
    file.setDirectWriteFallback(true);
    if ((target.exists() && !target.isFile()) || !file.open(QIODevice::WriteOnly)) {
        QPdfWriter writer(fileName);
        return printTo(writer);
    }
    {
        QPdfWriter writer(&file);
        if (!printTo(writer)) {
            file.cancelWriting();
            return false;
        }
    }
    return file.commit();
}

bool KvReportPrinter::printTo(QPdfWriter &writer)
{
    writer.setResolution(kResolution);
    writer.setPageMargins(QMarginsF(0, 0, 0, 0));
    // Until the last page is painted: views of the template keep their hands off the pieces meanwhile.
    KvTemplateContext *context = m_model->context();
    context->setPrinting(true);
    const auto endPrinting = qScopeGuard([context]() { context->setPrinting(false); });
    layOut();
    return render(writer);
}

void KvReportPrinter::layOut()
{
    layOutNodes();
    for (KvReportPage *page : qAsConst(m_pages))
        page->setPageTotal(m_pages.size());
}

QRect KvReportPrinter::startPage()
{
    auto scene = std::make_unique<QGraphicsScene>();
    // A page holds a handful of items that are all painted once: an index would only cost.
    scene->setItemIndexMethod(QGraphicsScene::NoIndex);
    auto *page = new KvReportPage(m_model, m_pages.size(), true);
    m_pages.append(page);
    scene->addItem(page);
    scene->setSceneRect(page->pageRect());
    m_scenes.push_back(std::move(scene));
    return page->contentRect();
}

void KvReportPrinter::layOutNodes()
{
    KvPageFlow flow([this](int) { return startPage(); });
    for (KvReportNode *node : m_model->nodes()) {
        KvBaseDisplayWidget *displayWidget = node->displayWidget();
        const int pieces = displayWidget ? displayWidget->subWidgetCount() : 0;
        for (int i = 0; i < pieces; ++i) {
            KvReportProxyWidgetItem *item = KvReportProxyWidgetItem::createForPiece(node, i);
            if (!item)
                continue;
            const KvPlacedPiece placed = flow.place(item->pieceHeight());
            item->setPos(placed.topLeft);
            m_scenes[static_cast<std::size_t>(placed.page)]->addItem(item);
        }
    }
}

bool KvReportPrinter::render(QPdfWriter &writer)
{
    const QRectF target(QPointF(0, 0), QSizeF(writer.pageLayout().pageSize().sizePixels(kResolution)));
    QPainter painter;
    if (!painter.begin(&writer))
        return false;
    // Pages look alike in every language of the interface.
    painter.setLayoutDirection(Qt::LeftToRight);
    // Pictures would be stored as JPEG otherwise.
    painter.setRenderHint(QPainter::LosslessImageRendering);
    reportProgress(0);
    for (int i = 0; i < m_pages.size(); ++i) {
        if (m_progress && m_progress->isCancelled())
            return false;
        if (i > 0)
            writer.newPage();
        m_scenes[static_cast<std::size_t>(i)]->render(&painter, target, m_pages.at(i)->pageRect(),
                                                      Qt::KeepAspectRatio);
        reportProgress(i + 1);
    }
    return painter.end();
}

void KvReportPrinter::reportProgress(int done) const
{
    if (m_progress)
        m_progress->pageWritten(done, m_pages.size());
}
