// SPDX-License-Identifier: MIT
#include "blocks/statisticstable/KvStatisticsStatsTableNodeCfg.h"

#include "blocks/common/KvColumnsText.h"
#include "blocks/common/KvJsonRead.h"

#include <QCoreApplication>

#include <algorithm>

namespace {

const char kAlignmentKey[] = "alignment";
const char kGroupByKey[] = "groupBy";
const char kWidthKey[] = "widthPercent";
const char kColumnsKey[] = "columns";
const char *const kKeys[] = {kAlignmentKey, kGroupByKey, kWidthKey, kColumnsKey};

const char *const kColumns[] = {QT_TRANSLATE_NOOP("KvStatisticsStatsTableNodeCfg", "Min"),
                                QT_TRANSLATE_NOOP("KvStatisticsStatsTableNodeCfg", "Max"),
                                QT_TRANSLATE_NOOP("KvStatisticsStatsTableNodeCfg", "Average"),
                                QT_TRANSLATE_NOOP("KvStatisticsStatsTableNodeCfg", "Sigma"),
                                QT_TRANSLATE_NOOP("KvStatisticsStatsTableNodeCfg", "3 Sigma"),
                                QT_TRANSLATE_NOOP("KvStatisticsStatsTableNodeCfg", "6 Sigma")};

bool isComplete(const QJsonObject &config)
{
    return std::all_of(std::begin(kKeys), std::end(kKeys),
                       [&config](const char *key) { return config.contains(QLatin1String(key)); });
}

} // namespace

KvStatisticsStatsTableNodeCfg::KvStatisticsStatsTableNodeCfg(KvTemplateContext *context, QObject *parent)
    : KvStatisticsThemedNodeCfg(context, parent)
{
    m_options.columns = QSet<QString>(columnNames().begin(), columnNames().end());
}

bool KvStatisticsStatsTableNodeCfg::Options::operator==(const Options &other) const
{
    return alignment == other.alignment && groupBy == other.groupBy && widthPercent == other.widthPercent &&
           columns == other.columns;
}

const QStringList &KvStatisticsStatsTableNodeCfg::columnNames()
{
    static const QStringList names(std::begin(kColumns), std::end(kColumns));
    return names;
}

QString KvStatisticsStatsTableNodeCfg::columnLabel(const QString &name)
{
    return QCoreApplication::translate("KvStatisticsStatsTableNodeCfg", name.toUtf8().constData());
}

bool KvStatisticsStatsTableNodeCfg::toJson(QJsonObject &config) const
{
    config[QLatin1String(kAlignmentKey)] = static_cast<int>(m_options.alignment);
    config[QLatin1String(kGroupByKey)] = static_cast<int>(m_options.groupBy);
    config[QLatin1String(kWidthKey)] = m_options.widthPercent;
    config[QLatin1String(kColumnsKey)] = KvColumnsText::join(m_options.columns);
    return KvStatisticsThemedNodeCfg::toJson(config);
}

bool KvStatisticsStatsTableNodeCfg::fromJson(const QJsonObject &config)
{
    if (!isComplete(config))
        return false;
    const Options &current = m_options;
    m_options.alignment = Qt::Alignment(
        KvJsonRead::readInt(config, QLatin1String(kAlignmentKey), static_cast<int>(current.alignment)));
    m_options.groupBy =
        static_cast<GroupBy>(KvJsonRead::readInt(config, QLatin1String(kGroupByKey), current.groupBy));
    m_options.widthPercent = KvJsonRead::readInt(config, QLatin1String(kWidthKey), current.widthPercent);
    const QJsonValue columns = config.value(QLatin1String(kColumnsKey));
    if (columns.isString())
        m_options.columns = KvColumnsText::split(columns.toString());
    // The theme comes last: a refused configuration keeps its own, too.
    return KvStatisticsThemedNodeCfg::fromJson(config);
}
