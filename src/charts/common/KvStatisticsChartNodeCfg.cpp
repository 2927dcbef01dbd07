// SPDX-License-Identifier: MIT
#include "charts/common/KvStatisticsChartNodeCfg.h"

#include "blocks/common/KvJsonRead.h"

namespace {
const QString kAlignmentKey = QStringLiteral("alignment");
const QString kWidthKey = QStringLiteral("widthPercent");
} // namespace

KvStatisticsChartNodeCfg::KvStatisticsChartNodeCfg(KvTemplateContext *context, QObject *parent)
    : KvStatisticsThemedNodeCfg(context, parent)
{}

bool KvStatisticsChartNodeCfg::toJson(QJsonObject &config) const
{
    if (!KvStatisticsThemedNodeCfg::toJson(config))
        return false;
    config[kAlignmentKey] = static_cast<int>(m_alignment);
    config[kWidthKey] = m_widthPercent;
    return true;
}

bool KvStatisticsChartNodeCfg::fromJson(const QJsonObject &config)
{
    if (!KvStatisticsThemedNodeCfg::fromJson(config))
        return false;
    if (!config.contains(kAlignmentKey) || !config.contains(kWidthKey))
        return false;
    m_alignment = Qt::Alignment(KvJsonRead::readInt(config, kAlignmentKey, static_cast<int>(m_alignment)));
    m_widthPercent = KvJsonRead::readInt(config, kWidthKey, m_widthPercent);
    return true;
}
