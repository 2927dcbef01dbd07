// SPDX-License-Identifier: MIT
#include "blocks/cameraimage/KvCameraImageNodeCfg.h"

#include "blocks/common/KvJsonRead.h"

namespace {
const char kRenderMeasurementsKey[] = "renderMeasurements";
}

bool KvCameraImageNodeCfg::Options::operator==(const Options &other) const
{
    return placement == other.placement && renderMeasurements == other.renderMeasurements;
}

KvCameraImageNodeCfg::KvCameraImageNodeCfg(KvTemplateContext *context, QObject *parent)
    : KvBaseEditorNodeCfg(context, parent)
{}

bool KvCameraImageNodeCfg::toJson(QJsonObject &config) const
{
    m_options.placement.toJson(config);
    config[QLatin1String(kRenderMeasurementsKey)] = m_options.renderMeasurements;
    return true;
}

bool KvCameraImageNodeCfg::fromJson(const QJsonObject &config)
{
    if (!KvPicturePlacement::isIn(config) || !config.contains(QLatin1String(kRenderMeasurementsKey)))
        return false;
    if (!m_options.placement.readFrom(config))
        return false;
    m_options.renderMeasurements =
        KvJsonRead::readBool(config, QLatin1String(kRenderMeasurementsKey), m_options.renderMeasurements);
    return true;
}
