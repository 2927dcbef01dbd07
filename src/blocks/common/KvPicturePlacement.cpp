// SPDX-License-Identifier: MIT
#include "blocks/common/KvPicturePlacement.h"

#include <QJsonObject>

namespace {

const char kAlignmentKey[] = "alignment";
const char kWidthKey[] = "widthPercent";
const char kRotationKey[] = "rotationAngles";

bool readNumber(const QJsonObject &config, const char *key, int &number)
{
    const QJsonValue value = config.value(QLatin1String(key));
    if (!value.isString())
        return true;
    bool isNumber = false;
    number = value.toString().toInt(&isNumber);
    return isNumber;
}

} // namespace

bool KvPicturePlacement::operator==(const KvPicturePlacement &other) const
{
    return alignment == other.alignment && widthPercent == other.widthPercent && rotation == other.rotation;
}

void KvPicturePlacement::toJson(QJsonObject &config) const
{
    config[QLatin1String(kAlignmentKey)] = QString::number(static_cast<int>(alignment));
    config[QLatin1String(kWidthKey)] = QString::number(widthPercent);
    config[QLatin1String(kRotationKey)] = QString::number(rotation);
}

bool KvPicturePlacement::isIn(const QJsonObject &config)
{
    return config.contains(QLatin1String(kAlignmentKey)) && config.contains(QLatin1String(kWidthKey));
}

bool KvPicturePlacement::readFrom(const QJsonObject &config)
{
    int alignmentNumber = static_cast<int>(alignment);
    const bool isAlignment = readNumber(config, kAlignmentKey, alignmentNumber);
    alignment = Qt::Alignment(alignmentNumber);
    if (!isAlignment || !readNumber(config, kWidthKey, widthPercent))
        return false;
    rotation = config.value(QLatin1String(kRotationKey)).toString().toInt();
    return true;
}
