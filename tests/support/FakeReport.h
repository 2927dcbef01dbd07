// SPDX-License-Identifier: MIT
#pragma once

#include "blocks/FakeMeasurements.h"
#include "blocks/KvReportBlocks.h"
#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.h"
#include "blocks/textdocument/KvTextDocumentNodeCfg.h"
#include "report/KvReportNode.h"
#include "support/FakeBlock.h"
#include "templates/KvBlockRegistry.h"
#include "templates/KvPageSectionsCfg.h"
#include "templates/KvTemplateModel.h"

#include <QVector>

#include <memory>

/** A template model with all block types, made-up blocks among them, over a host of made-up measurements. */
class FakeReport
{
public:
    FakeReport()
        : m_model(std::make_unique<KvTemplateModel>(nullptr, m_measurements.kernelData()))
    {
        registerReportBlocks(m_blocks);
        auto factory = std::make_unique<FakeBlockFactory>();
        m_fakeFactory = factory.get();
        m_blocks.registerFactory(std::move(factory));
        m_model->setFactories(&m_blocks);
    }

    KvTemplateModel *model() { return m_model.get(); }
    FakeMeasurements &measurements() { return m_measurements; }
    FakeBlockFactory *fakeFactory() { return m_fakeFactory; }
    /** Ends the model before its views. */
    void deleteModel() { m_model.reset(); }

    /** Appends a made-up block with pieces of these heights; negative ones are null pieces. */
    KvReportNode *addFake(const QVector<int> &heights)
    {
        auto *node = new KvReportNode(nullptr, m_fakeFactory, m_model->context(), m_model.get());
        static_cast<FakeBlockCfg *>(node->config())->setHeights(heights);
        m_model->appendNode(node);
        return node;
    }
    KvReportNode *addText(const QString &html)
    {
        KvBaseEditorNodeFactory *factory = m_blocks.find(QStringLiteral("Text Document"));
        auto *node = new KvReportNode(nullptr, factory, m_model->context(), m_model.get());
        static_cast<KvTextDocumentNodeCfg *>(node->config())->setText(html);
        m_model->appendNode(node);
        return node;
    }
    /** Appends a measurements table; its rows are those of setRowCount(). */
    KvReportNode *addTable()
    {
        KvBaseEditorNodeFactory *factory = m_blocks.find(QStringLiteral("Measurement table"));
        auto *node = new KvReportNode(nullptr, factory, m_model->context(), m_model.get());
        m_model->appendNode(node);
        return node;
    }

    /** Measures \a count values "v00000", "v00001" ... */
    void setRowCount(int count)
    {
        QVector<FakeRow> rows;
        rows.reserve(count);
        for (int i = 0; i < count; ++i)
            rows.append({QStringLiteral("o%1").arg(i), QStringLiteral("Line"), QStringLiteral("length"),
                         static_cast<double>(i), rowText(i)});
        m_measurements.setRows(rows);
    }
    static QString rowText(int row) { return QStringLiteral("v%1").arg(row, 5, 10, QLatin1Char('0')); }

    static FakeBlockWidget *fakeWidget(KvReportNode *node)
    {
        return static_cast<FakeBlockWidget *>(node->displayWidget());
    }
    static FakeBlockCfg *fakeCfg(KvReportNode *node) { return static_cast<FakeBlockCfg *>(node->config()); }

private:
    FakeMeasurements m_measurements;
    KvBlockTypeList m_blocks;
    FakeBlockFactory *m_fakeFactory = nullptr;
    std::unique_ptr<KvTemplateModel> m_model;
};
