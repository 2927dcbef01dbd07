// SPDX-License-Identifier: MIT
#include "blocks/measurementstable/KvStatisticsMeasurementsTableNodeCfg.h"

#include "blocks/common/KvColumnsText.h"
#include "blocks/common/KvJsonRead.h"

#include <QCoreApplication>

namespace {

const char kAlignmentKey[] = "alignment";
const char kWidthKey[] = "widthPercent";
const char kColumnsKey[] = "columns";
const char kOrderColumnKey[] = "orderColumn";
const char kOrderAscendingKey[] = "orderAscending";

const char *const kColumns[] = {QT_TRANSLATE_NOOP("KvStatisticsMeasurementsTableNodeCfg", "Object Name"),
                                QT_TRANSLATE_NOOP("KvStatisticsMeasurementsTableNodeCfg", "Object Type"),
                                QT_TRANSLATE_NOOP("KvStatisticsMeasurementsTableNodeCfg", "Value Name"),
                                QT_TRANSLATE_NOOP("KvStatisticsMeasurementsTableNodeCfg", "Value")};

QStringList makeColumnNames()
{
    QStringList names;
    for (const char *name : kColumns)
        names.append(QLatin1String(name));
    return names;
}

} // namespace

KvStatisticsMeasurementsTableNodeCfg::KvStatisticsMeasurementsTableNodeCfg(KvTemplateContext *context,
                                                                           QObject *parent)
    : KvStatisticsThemedNodeCfg(context, parent)
{
    m_options.columns = QSet<QString>(columnNames().begin(), columnNames().end());
}

bool KvStatisticsMeasurementsTableNodeCfg::Options::operator==(const Options &other) const
{
    return alignment == other.alignment && widthPercent == other.widthPercent && columns == other.columns &&
           orderColumn == other.orderColumn && orderAscending == other.orderAscending;
}

const QStringList &KvStatisticsMeasurementsTableNodeCfg::columnNames()
{
    static const QStringList names = makeColumnNames();
    return names;
}

QString KvStatisticsMeasurementsTableNodeCfg::columnLabel(const QString &name)
{
    return QCoreApplication::translate("KvStatisticsMeasurementsTableNodeCfg", name.toUtf8().constData());
}

bool KvStatisticsMeasurementsTableNodeCfg::toJson(QJsonObject &config) const
{
    if (!KvStatisticsThemedNodeCfg::toJson(config))
        return false;
    config[QLatin1String(kAlignmentKey)] = static_cast<int>(m_options.alignment);
    config[QLatin1String(kWidthKey)] = m_options.widthPercent;
    config[QLatin1String(kColumnsKey)] = KvColumnsText::join(m_options.columns);
    config[QLatin1String(kOrderColumnKey)] = m_options.orderColumn;
    config[QLatin1String(kOrderAscendingKey)] = m_options.orderAscending;
    return true;
}

bool KvStatisticsMeasurementsTableNodeCfg::fromJson(const QJsonObject &config)
{
    if (!KvStatisticsThemedNodeCfg::fromJson(config))
        return false;
    const int alignment =
        KvJsonRead::readInt(config, QLatin1String(kAlignmentKey), static_cast<int>(m_options.alignment));
    m_options.alignment = Qt::Alignment(alignment);
    m_options.widthPercent = KvJsonRead::readInt(config, QLatin1String(kWidthKey), m_options.widthPercent);
    const QJsonValue columns = config.value(QLatin1String(kColumnsKey));
    if (columns.isString())
        m_options.columns = KvColumnsText::split(columns.toString());
    m_options.orderColumn =
        KvJsonRead::readString(config, QLatin1String(kOrderColumnKey), m_options.orderColumn);
    m_options.orderAscending =
        KvJsonRead::readBool(config, QLatin1String(kOrderAscendingKey), m_options.orderAscending);
    return true;
}

void KvStatisticsMeasurementsTableNodeCfg::setOrder(const QString &column, bool ascending)
{
    m_options.orderColumn = column;
    m_options.orderAscending = ascending;
}
